#include "spec/zel-svc-encode-writer.h"

#include "base/zel-svc-free.h"
#include "base/zel-svc-guard.h"
#include "spec/zel-svc-element-stack.h"
#include "spec/zel-svc-element-table.h"
#include "spec/zel-svc-xml.h"

#include <algorithm>
#include <new>

namespace {

constexpr std::string_view kHeader = "\xEF\xBB\xBF<?xml version=\"1.0\" encoding=\"UTF-8\" ?>\n";
constexpr std::size_t kIndentation = 2;

const ZelSvcElement &row_of(ZelSvcElementId id) { return kZelSvcElementTable.at(static_cast<std::size_t>(id)); }

// What a handler gives out for the element that is open. False when it had no memory.
bool call(Handler handler, OccurrenceKind kind, ZelSvcElementId id, ZelSvcExportText *out) {
    if (!handler) return true;
    Occurrence occurrence{
        .kind = kind,
        .element = id,
        .tag = row_of(id).tag,
        .action = geZelSvcParseAction,
        .mode = geZelSvcParseMode,
        .index = zel_svc_element_get_count(id),
        .offset = -1,
        .text = {},
        .attributes = nullptr,
        .out = out,
    };
    return zel_svc_guarded_or(false, [&] {
        handler(occurrence);
        return true;
    });
}

} // namespace

void ZelSvcEncodeWriter::header() { text_.put(kHeader); }

void ZelSvcEncodeWriter::indent() {
    constexpr std::string_view kBlanks = "                                ";
    for (std::size_t left = indentation_; left > 0; left -= std::min(left, kBlanks.size()))
        text_.put(kBlanks.substr(0, left));
}

void ZelSvcEncodeWriter::start_element(ZelSvcElementId id) {
    zel_svc_element_push(id);
    ZelSvcExportText attributes;
    if (!call(row_of(id).start, OccurrenceKind::Start, id, &attributes)) text_.drop_rest();
    text_.put("<");
    text_.put(row_of(id).tag);
    if (!attributes.empty()) text_.put(" ");
    text_.put(attributes.view());
    text_.put(">");
}

// Only "&" is escaped: the reader of these documents knows no other character that must be.
void ZelSvcEncodeWriter::value(ZelSvcElementId id) {
    ZelSvcExportText text;
    if (!call(row_of(id).value, OccurrenceKind::Value, id, &text)) text_.drop_rest();
    const ZelSvcOwnedText escaped{zel_svc_str_replace_all(text.c_str(), "&", "&amp;")};
    text_.put(escaped ? std::string_view{escaped.get()} : text.view());
}

void ZelSvcEncodeWriter::end_element(ZelSvcElementId id) {
    if (!call(row_of(id).end, OccurrenceKind::End, id, nullptr)) text_.drop_rest();
    // A second address finds its place by the number of those that have ended.
    if (row_of(id).repeats) zel_svc_element_count_up(id);
    const ZelSvcElementId top = zel_svc_element_pop();
    if (top != id) {
        zel_svc_element_push(top);
        return;
    }
    text_.put("</");
    text_.put(row_of(id).tag);
    text_.put(">\n");
}

void ZelSvcEncodeWriter::open(ZelSvcElementId id) {
    indent();
    start_element(id);
    text_.put("\n");
    indentation_ += kIndentation;
}

void ZelSvcEncodeWriter::close(ZelSvcElementId id) {
    indentation_ -= std::min(indentation_, kIndentation);
    indent();
    end_element(id);
}

void ZelSvcEncodeWriter::leaf(ZelSvcElementId id) {
    indent();
    start_element(id);
    value(id);
    end_element(id);
}

void ZelSvcEncodeWriter::empty_leaf(ZelSvcElementId id) {
    indent();
    start_element(id);
    end_element(id);
}

ZelSvcExportText zel_svc_encode_query(ZelSvcElementId id) {
    ZelSvcExportText text;
    const bool pushed = zel_svc_element_push(id) == 1;
    const bool asked = call(row_of(id).value, OccurrenceKind::Value, id, &text);
    if (pushed) zel_svc_element_pop();
    if (!asked) throw std::bad_alloc{};
    return text;
}
