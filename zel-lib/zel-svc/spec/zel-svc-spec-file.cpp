#include "spec/zel-svc-spec-file.h"

#include "base/zel-svc-file.h"
#include "base/zel-svc-free.h"
#include "base/zel-svc-observer.h"
#include "spec/zel-svc-element-dispatcher.h"
#include "spec/zel-svc-element-stack.h"
#include "spec/zel-svc-element-table.h"

#include <algorithm>
#include <cerrno>
#include <cstdlib>
#include <cstring>
#include <fcntl.h>
#include <limits>
#include <memory>
#include <string_view>
#include <sys/stat.h>

namespace {

// The byte-order mark that every spec file begins with.
constexpr std::int32_t kMarkSize = 3;

struct SpecBytes {
    ZelSvcOwnedText bytes;
    std::int32_t length = 0;
    const char *missing = nullptr; // why there are none
};

struct ParseEnd {
    std::int32_t result;
    std::int32_t position; // in the parsed bytes
};

struct DestroyParser {
    void operator()(ZelSvcXmlParser *parser) const {
        zel_svc_element_set_source(nullptr, 0);
        zel_svc_xml_parser_destroy(parser);
    }
};

void begin_parse() {
    for (const ZelSvcParseBegin *begin = kZelSvcParseBegins; *begin; ++begin)
        (*begin)();
    zel_svc_element_table_init();
}

ParseEnd parse(const char *buffer, std::int32_t length, std::int32_t first_offset) {
    begin_parse();
    const std::unique_ptr<ZelSvcXmlParser, DestroyParser> parser{
        zel_svc_xml_parser_create(&kZelSvcElementCallbacks, 0)};
    zel_svc_element_set_source(parser.get(), first_offset);
    const ZelSvcXmlResult result = zel_svc_xml_parse(parser.get(), buffer, length);
    return {result, parser && parser->cursor ? parser->cursor->position : 0};
}

// Lines are counted only here, after a parse that somebody watches. The mark takes no column.
ZelSvcTextPosition position_in_file(const char *text, std::int32_t position, std::int32_t first_offset) {
    ZelSvcTextPosition found{first_offset + position, 1, position + 1};
    const char *end = text + position;
    for (const char *line = text; line < end; ++found.line) {
        const void *feed = std::memchr(line, '\n', static_cast<std::size_t>(end - line));
        if (!feed) break;
        line = static_cast<const char *>(feed) + 1;
        found.column = static_cast<std::int32_t>(end - line) + 1;
    }
    return found;
}

SpecBytes read_spec(const char *path) {
    const ZelSvcFd file = zel_svc_file_open(path, O_RDONLY);
    struct stat status = {};
    if (!file || fstat(file.get(), &status) != 0) return {.missing = std::strerror(errno)};
    if (status.st_size <= 0) return {.missing = "the file is empty"};
    if (status.st_size > std::numeric_limits<std::int32_t>::max()) return {.missing = "the file is too large"};
    const auto size = static_cast<std::size_t>(status.st_size);
    SpecBytes spec;
    spec.bytes.reset(static_cast<char *>(std::malloc(size)));
    if (!spec.bytes) return {.missing = "there is no memory for the file"};
    spec.length = static_cast<std::int32_t>(zel_svc_file_read_all(file.get(), spec.bytes.get(), size));
    if (spec.length == 0) return {.missing = "the file cannot be read"};
    // Without a mark the first bytes of the document would be skipped.
    if (*spec.bytes == '<') return {.missing = "the file has no byte-order mark"};
    return spec;
}

} // namespace

void zel_svc_spec_parse_buffer(const char *buffer, std::int32_t length) { parse(buffer, length, 0); }

int zel_svc_spec_parse_file(ZelSvcParseAction action, const char *path, int reset_filter) {
    geZelSvcParseAction = action;
    if (!path) return 0;
    const SpecBytes spec = read_spec(path);
    if (spec.missing) {
        zel_svc_observer().unread_file(path, spec.missing);
        return 0;
    }
    if (reset_filter == 1) zel_svc_element_clear_enabled();
    const std::int32_t skipped = std::min(spec.length, kMarkSize);
    const char *text = spec.bytes.get() + skipped;
    const ParseEnd end = parse(text, spec.length - skipped, skipped);
    if (zel_svc_is_observed())
        zel_svc_observer().parsed_file(path, end.result, position_in_file(text, end.position, skipped));
    return 1;
}
