#pragma once
// The XML tokenizer: one pass over a buffer, no tree, no recursion. Each item found is handed to a record of
// callbacks, in strings that live until the callback returns.

#include "spec/zel-svc-xml-attribute.h"

#include <cstdint>

enum ZelSvcXmlResult : std::int32_t {
    ZEL_SVC_XML_OK = 0,
    ZEL_SVC_XML_ERR_SYNTAX = 1, // unexpected character, name or value too long, allocation failure
    ZEL_SVC_XML_ERR_EOF = 2,    // the input ended in the middle of a construct
    ZEL_SVC_XML_STOP = 6,       // an end-of-element callback asked to stop
};

struct ZelSvcXmlCursor {
    const char *buffer; // not owned, not necessarily terminated, never modified
    std::int32_t length;
    std::int32_t position; // of the next byte to read
};

// Only the result of end_element is looked at: ZEL_SVC_XML_STOP ends the parse. Items without a callback (a
// null slot) are read and dropped.
struct ZelSvcXmlCallbacks {
    std::int32_t (*start_document)(std::uint32_t user, const char *buffer, std::int32_t length);
    std::int32_t (*end_document)(std::uint32_t user);
    std::int32_t (*declaration)(std::uint32_t user, const char *version, const char *encoding, const char *standalone);
    std::int32_t (*document_type)(std::uint32_t user, const char *name, const char *rest); // rest may be null
    std::int32_t (*instruction)(std::uint32_t user, const char *target, const char *data); // data may be null
    std::int32_t (*start_element)(std::uint32_t user, const char *name, std::int32_t name_size,
                                  const ZelSvcXmlAttribute *attributes);
    std::int32_t (*end_element)(std::uint32_t user, const char *name);
    std::int32_t (*text)(std::uint32_t user, const char *text, std::int32_t size);
    std::int32_t (*cdata)(std::uint32_t user, const char *text);
    std::int32_t (*comment)(std::uint32_t user, const char *text);
};

struct ZelSvcXmlParser {
    ZelSvcXmlCursor *cursor; // owned
    const ZelSvcXmlCallbacks *callbacks;
    std::uint32_t user;
    std::int32_t item; // during a callback: index of the first byte of its item
};

ZelSvcXmlParser *zel_svc_xml_parser_create(const ZelSvcXmlCallbacks *callbacks, std::uint32_t user);
void zel_svc_xml_parser_destroy(ZelSvcXmlParser *parser);
// Afterwards the cursor's position is where reading ended.
ZelSvcXmlResult zel_svc_xml_parse(ZelSvcXmlParser *parser, const char *buffer, std::int32_t length);

// New strings that the caller releases with free(3); null on failure, and for texts or results of more than
// 65,535 bytes. An empty `from` or `to` is a failure too.
char *zel_svc_xml_decode_entities(const char *text);
char *zel_svc_str_replace_all(const char *text, const char *from, const char *to);
