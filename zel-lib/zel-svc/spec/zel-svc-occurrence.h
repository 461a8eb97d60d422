#pragma once
// One event of one element, as its handler sees it. Every handler of the element table has the one type
// `void handler(Occurrence &)`, whatever the action; what a handler must newly know becomes a member here.
//
// A handler acts only when the element on top of the open elements is its own: with tags that do not nest
// as they should, another one may be.

#include "spec/zel-svc-element-id.h"
#include "spec/zel-svc-parse-context.h"
#include "spec/zel-svc-xml-attribute.h"

#include "base/zel-svc-text.h"

#include <cstdint>
#include <string_view>

enum class OccurrenceKind { Start, Value, End };

// Receives the phone's value in an export. Starts empty.
using ZelSvcExportText = FixedText<200>;

struct Occurrence {
    OccurrenceKind kind;
    ZelSvcElementId element; // on top of the open elements
    std::string_view tag;    // of that element
    ZelSvcParseAction action;
    ZelSvcParseMode mode;
    std::int32_t index;                   // how many occurrences of the element have ended in this parse
    std::int32_t offset;                  // bytes from the start of the file; -1 in an export
    std::string_view text;                // a value's decoded text, terminated; empty otherwise
    const ZelSvcXmlAttribute *attributes; // of a start tag; null when it has none
    ZelSvcExportText *out;                // in an export, where start and value handlers write; null otherwise

    [[nodiscard]] bool installs() const { return action == ZEL_SVC_PARSE_ACTION_INSTALL; }
    [[nodiscard]] bool verifies() const { return action == ZEL_SVC_PARSE_ACTION_VERIFY; }
    [[nodiscard]] bool exports() const { return action == ZEL_SVC_PARSE_ACTION_ENCODE; }
};

using Handler = void (*)(Occurrence &);
