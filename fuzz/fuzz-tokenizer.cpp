// Any bytes through the tokenizer: it ends with a result, stays inside its input, and hands on strings that
// are terminated and as long as it says.

#include "spec/zel-svc-xml.h"

#include <cstdlib>
#include <cstring>

namespace {

// The first byte of the input says after how many end tags the parse is stopped.
int gEndsLeft = 0;

void expect(bool holds) {
    if (!holds) std::abort();
}

std::int32_t on_start(std::uint32_t, const char *name, std::int32_t size, const ZelSvcXmlAttribute *attributes) {
    expect(size >= 2 && size <= 32 && std::strlen(name) + 1 == static_cast<std::size_t>(size));
    for (; attributes; attributes = attributes->next)
        expect(*attributes->name != '\0' && std::strlen(attributes->value) < 0x7FFFFFFF);
    return 0;
}

std::int32_t on_end(std::uint32_t, const char *name) {
    expect(*name != '\0' && std::strlen(name) < 32);
    return --gEndsLeft == 0 ? ZEL_SVC_XML_STOP : 0;
}

std::int32_t on_text(std::uint32_t, const char *text, std::int32_t size) {
    expect(size >= 2 && std::strlen(text) + 1 == static_cast<std::size_t>(size));
    return 0;
}

std::int32_t on_bytes(std::uint32_t, const char *text) { return static_cast<std::int32_t>(std::strlen(text)); }

constexpr ZelSvcXmlCallbacks kCallbacks{
    .declaration =
        [](std::uint32_t, const char *version, const char *encoding, const char *standalone) {
            expect(std::strlen(version) < 10 && std::strlen(encoding) < 10 && std::strlen(standalone) < 10);
            return 0;
        },
    .document_type =
        [](std::uint32_t, const char *name, const char *rest) {
            expect(std::strlen(name) < 32);
            return rest ? on_bytes(0, rest) : 0;
        },
    .instruction =
        [](std::uint32_t, const char *target, const char *data) {
            expect(std::strlen(target) < 32);
            return data ? on_bytes(0, data) : 0;
        },
    .start_element = on_start,
    .end_element = on_end,
    .text = on_text,
    .cdata = on_bytes,
    .comment = on_bytes,
};

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const unsigned char *bytes, std::size_t size) {
    if (size == 0) return 0;
    gEndsLeft = bytes[0];
    const auto length = static_cast<std::int32_t>(size - 1);
    ZelSvcXmlParser *parser = zel_svc_xml_parser_create(&kCallbacks, 0);
    const auto result = zel_svc_xml_parse(parser, reinterpret_cast<const char *>(bytes + 1), length);
    expect(result == ZEL_SVC_XML_OK || result == ZEL_SVC_XML_ERR_SYNTAX || result == ZEL_SVC_XML_ERR_EOF ||
           result == ZEL_SVC_XML_STOP);
    expect(parser->cursor->position >= 0 && parser->cursor->position <= length);
    zel_svc_xml_parser_destroy(parser);
    return 0;
}
