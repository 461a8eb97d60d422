#pragma once
// Finds the row of each tag and calls its handlers.

#include "spec/zel-svc-element-id.h"
#include "spec/zel-svc-xml.h"

#include <cstdint>

enum ZelSvcDispatchResult : std::int32_t {
    ZEL_SVC_DISPATCH_OK = 0,         // handler called, or the row has none
    ZEL_SVC_DISPATCH_UNKNOWN = 3,    // tag not in the table
    ZEL_SVC_DISPATCH_NO_ELEMENT = 4, // text outside any element
    ZEL_SVC_DISPATCH_DISABLED = 5,   // row not enabled
    ZEL_SVC_DISPATCH_STOP = 6,       // end of the stop element
};

// Forgets open elements and occurrence counts; the enabled rows and the stop element stay.
void zel_svc_element_table_init();

// Which tokenizer the events come from, and the file offset of its first byte: handlers and observers learn
// from them where an item stands. Null for none.
void zel_svc_element_set_source(const ZelSvcXmlParser *parser, std::int32_t first_offset);

// The row of a tag at this place: the first one of that tag whose parent is the enclosing element, or that
// takes any parent. ZEL_SVC_ELEMENT_NONE when there is none.
ZelSvcElementId zel_svc_element_find(const char *tag);

std::int32_t zel_svc_element_on_start(std::uint32_t user, const char *name, std::int32_t size,
                                      const ZelSvcXmlAttribute *attributes);
std::int32_t zel_svc_element_on_value(std::uint32_t user, const char *text, std::int32_t size);
std::int32_t zel_svc_element_on_end(std::uint32_t user, const char *name);

// The tokenizer's callbacks for a spec parse.
extern const ZelSvcXmlCallbacks kZelSvcElementCallbacks;
