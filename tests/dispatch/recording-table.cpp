#include "dispatch/recording-table.h"

#include "spec/zel-svc-element-table.h"
#include "unit/element-rows.h"

#include <new>
#include <utility>

namespace zel_test {
namespace {

int gBegunParses = 0;

constexpr std::string_view kNoMemory = "no memory"; // the text that a handler has none for

std::string attributes_of(const ZelSvcXmlAttribute *attribute) {
    std::string text;
    for (; attribute; attribute = attribute->next)
        text += std::string(" ") + attribute->name + "=" + attribute->value;
    return text;
}

void record(const char *kind, std::size_t row, Occurrence &occurrence) {
    const std::string_view tag = kElementRows[row].tag;
    std::string text = std::string(kind) + " " + std::string(tag) + attributes_of(occurrence.attributes);
    if (!occurrence.text.empty()) text += " " + std::string(occurrence.text);
    if (static_cast<std::size_t>(occurrence.element) != row) text += " in " + std::string(occurrence.tag);
    calls().push_back({text, occurrence});
    const auto given = export_texts().find(text);
    const bool gives = given != export_texts().end();
    if (occurrence.out && gives) occurrence.out->assign(given->second);
    if (occurrence.text == kNoMemory || (gives && given->second == kNoMemory)) throw std::bad_alloc();
}

template <std::size_t Row> constexpr ZelSvcElement recording_row() {
    return {static_cast<ZelSvcElementId>(Row),
            kElementRows[Row].tag,
            kElementRows[Row].parent,
            [](Occurrence &occurrence) { record("start", Row, occurrence); },
            [](Occurrence &occurrence) { record("value", Row, occurrence); },
            [](Occurrence &occurrence) { record("end", Row, occurrence); },
            kElementRows[Row].repeats,
            Row == 0 ? 0 : 1};
}

template <std::size_t... Rows>
constexpr std::array<ZelSvcElement, ZEL_SVC_ELEMENT_COUNT> recording_rows(std::index_sequence<Rows...> /*rows*/) {
    return {recording_row<Rows>()...};
}

} // namespace

std::vector<Call> &calls() {
    static std::vector<Call> all;
    return all;
}

std::vector<std::string> call_texts() {
    std::vector<std::string> texts;
    for (const Call &call : calls())
        texts.push_back(call.text);
    return texts;
}

std::map<std::string, std::string> &export_texts() {
    static std::map<std::string, std::string> texts;
    return texts;
}

int begun_parses() { return gBegunParses; }

namespace {

void parse_begins() { ++gBegunParses; }

} // namespace
} // namespace zel_test

extern constexpr std::array<ZelSvcElement, ZEL_SVC_ELEMENT_COUNT> kZelSvcElementTable =
    zel_test::recording_rows(std::make_index_sequence<ZEL_SVC_ELEMENT_COUNT>());
extern constexpr ZelSvcParseBegin kZelSvcParseBegins[] = {zel_test::parse_begins, zel_test::parse_begins, nullptr};
