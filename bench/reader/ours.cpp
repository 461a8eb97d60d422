#include "reader/contestants.h"

#include "spec/zel-svc-element-dispatcher.h"
#include "spec/zel-svc-element-stack.h"
#include "spec/zel-svc-element-table.h"
#include "unit/element-walk.h"

#include <cstdio>
#include <cstdlib>
#include <memory>

namespace zel_bench {
namespace {

Seen gSeen;

struct DestroyParser {
    void operator()(ZelSvcXmlParser *parser) const { zel_svc_xml_parser_destroy(parser); }
};

Seen read_with(const ZelSvcXmlCallbacks &callbacks, std::span<char> bytes) {
    gSeen = {};
    zel_svc_element_table_init();
    const std::unique_ptr<ZelSvcXmlParser, DestroyParser> parser{zel_svc_xml_parser_create(&callbacks, 0)};
    const auto result = zel_svc_xml_parse(parser.get(), bytes.data(), static_cast<std::int32_t>(bytes.size()));
    if (result == ZEL_SVC_XML_OK) return gSeen;
    std::fprintf(stderr, "the tokenizer ended with %d at byte %d\n", result, parser->cursor->position);
    std::exit(1);
}

std::int32_t count_start(std::uint32_t, const char *, std::int32_t, const ZelSvcXmlAttribute *) {
    ++gSeen.elements;
    return 0;
}

std::int32_t count_end(std::uint32_t, const char *) { return 0; }

std::int32_t count_text(std::uint32_t, const char *, std::int32_t) {
    ++gSeen.texts;
    return 0;
}

std::int32_t dispatch_start(std::uint32_t user, const char *name, std::int32_t size,
                            const ZelSvcXmlAttribute *attributes) {
    ++gSeen.elements;
    return zel_svc_element_on_start(user, name, size, attributes);
}

std::int32_t dispatch_text(std::uint32_t user, const char *text, std::int32_t size) {
    ++gSeen.texts;
    return zel_svc_element_on_value(user, text, size);
}

// What dispatch would cost with a walk over the rows for each tag.
ZelSvcElementId walk(const char *name) {
    const auto current = static_cast<std::size_t>(zel_svc_element_get_current_id());
    const auto enclosing = static_cast<std::size_t>(zel_svc_element_get_enclosing_id());
    return static_cast<ZelSvcElementId>(zel_test::walk_rows(kZelSvcElementTable, name, current, enclosing));
}

std::int32_t walk_start(std::uint32_t, const char *name, std::int32_t, const ZelSvcXmlAttribute *) {
    ++gSeen.elements;
    const ZelSvcElementId id = walk(name);
    if (id == ZEL_SVC_ELEMENT_NONE) return ZEL_SVC_DISPATCH_UNKNOWN;
    if (zel_svc_element_is_enabled(id) == 0) return ZEL_SVC_DISPATCH_DISABLED;
    zel_svc_element_push(id);
    return ZEL_SVC_DISPATCH_OK;
}

std::int32_t walk_end(std::uint32_t, const char *name) {
    const ZelSvcElementId id = walk(name);
    if (id == ZEL_SVC_ELEMENT_NONE) return ZEL_SVC_DISPATCH_UNKNOWN;
    if (zel_svc_element_is_enabled(id) == 0) return ZEL_SVC_DISPATCH_DISABLED;
    if (kZelSvcElementTable[static_cast<std::size_t>(id)].repeats) zel_svc_element_count_up(id);
    if (zel_svc_element_get_current_id() == id) zel_svc_element_pop();
    return zel_svc_element_is_stop(id) != 0 ? ZEL_SVC_DISPATCH_STOP : ZEL_SVC_DISPATCH_OK;
}

} // namespace

Seen read_with_tokenizer(std::span<char> bytes) {
    static constexpr ZelSvcXmlCallbacks callbacks{
        .start_element = count_start, .end_element = count_end, .text = count_text};
    return read_with(callbacks, bytes);
}

Seen read_with_dispatch(std::span<char> bytes) {
    static constexpr ZelSvcXmlCallbacks callbacks{
        .start_element = dispatch_start, .end_element = zel_svc_element_on_end, .text = dispatch_text};
    return read_with(callbacks, bytes);
}

Seen read_with_walk(std::span<char> bytes) {
    static constexpr ZelSvcXmlCallbacks callbacks{
        .start_element = walk_start, .end_element = walk_end, .text = dispatch_text};
    return read_with(callbacks, bytes);
}

} // namespace zel_bench
