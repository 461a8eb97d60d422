#pragma once
// The bytes that the tokenizer reads, and its primitive readers. Each returns the result of the reading and
// leaves the position where reading stopped.

#include "spec/zel-svc-xml-block.h"
#include "spec/zel-svc-xml.h"

#include <array>
#include <bit>
#include <cstddef>
#include <cstdint>
#include <cstring>
#include <string_view>

// What may end a name; the bits are tested together by one look into a table.
enum ZelSvcXmlByteClass : std::uint8_t {
    ZEL_SVC_XML_SPACE = 0x01,
    ZEL_SVC_XML_NUL = 0x02,
    ZEL_SVC_XML_ENDS_ELEMENT = 0x04,   // space, ">" or "/"
    ZEL_SVC_XML_ENDS_END_TAG = 0x08,   // space or ">"
    ZEL_SVC_XML_ENDS_ATTRIBUTE = 0x10, // space or "="
    ZEL_SVC_XML_ENDS_TARGET = 0x20,    // space or "?"
};

constexpr std::array<std::uint8_t, 256> zel_svc_xml_byte_classes() {
    std::array<std::uint8_t, 256> classes = {};
    for (const char space : {' ', '\t', '\n', '\r'})
        classes[static_cast<unsigned char>(space)] = ZEL_SVC_XML_SPACE | ZEL_SVC_XML_ENDS_ELEMENT |
                                                     ZEL_SVC_XML_ENDS_END_TAG | ZEL_SVC_XML_ENDS_ATTRIBUTE |
                                                     ZEL_SVC_XML_ENDS_TARGET;
    classes['\0'] = ZEL_SVC_XML_NUL;
    classes['>'] = ZEL_SVC_XML_ENDS_ELEMENT | ZEL_SVC_XML_ENDS_END_TAG;
    classes['/'] = ZEL_SVC_XML_ENDS_ELEMENT;
    classes['='] = ZEL_SVC_XML_ENDS_ATTRIBUTE;
    classes['?'] = ZEL_SVC_XML_ENDS_TARGET;
    return classes;
}

inline constexpr std::array<std::uint8_t, 256> kZelSvcXmlByteClasses = zel_svc_xml_byte_classes();

struct ZelSvcXmlInput {
    const char *at;
    const char *end;

    [[nodiscard]] std::size_t left() const { return static_cast<std::size_t>(end - at); }
    [[nodiscard]] bool is(std::uint8_t classes) const {
        return (kZelSvcXmlByteClasses[static_cast<unsigned char>(*at)] & classes) != 0;
    }

    // To the first byte that is no white space; EOF when there is none.
    ZelSvcXmlResult skip_space() {
        while (left() >= ZEL_SVC_XML_BLOCK_SIZE) {
            const ZelSvcXmlBlock block{at};
            const std::uint32_t others =
                ~zel_svc_xml_mask(block.equal(' ') | block.equal('\n') | block.equal('\t') | block.equal('\r'));
            at += std::countr_zero(others);
            if (others != 0) return ZEL_SVC_XML_OK;
        }
        while (at < end && is(ZEL_SVC_XML_SPACE))
            ++at;
        return at < end ? ZEL_SVC_XML_OK : ZEL_SVC_XML_ERR_EOF;
    }

    // Past the literal. The position stays when a byte differs.
    ZelSvcXmlResult match(std::string_view literal) {
        const std::size_t length = literal.size() < left() ? literal.size() : left();
        if (std::memcmp(at, literal.data(), length) != 0) return ZEL_SVC_XML_ERR_SYNTAX;
        at += length;
        return length == literal.size() ? ZEL_SVC_XML_OK : ZEL_SVC_XML_ERR_EOF;
    }

    ZelSvcXmlResult match(char byte) {
        if (at == end) return ZEL_SVC_XML_ERR_EOF;
        if (*at != byte) return ZEL_SVC_XML_ERR_SYNTAX;
        ++at;
        return ZEL_SVC_XML_OK;
    }

    // The bytes up to a delimiter, which is consumed.
    ZelSvcXmlResult read_through(std::string_view delimiter, std::string_view &bytes) {
        const std::string_view rest{at, left()};
        const std::size_t length = rest.find(delimiter);
        if (length == std::string_view::npos) return to_end();
        bytes = rest.substr(0, length);
        at += length + delimiter.size();
        return ZEL_SVC_XML_OK;
    }

    // The bytes up to one of a class, which is not consumed. A NUL is a byte like any other.
    ZelSvcXmlResult read_until(std::uint8_t classes, std::string_view &bytes) {
        const char *first = at;
        while (at < end && !is(classes))
            ++at;
        bytes = {first, static_cast<std::size_t>(at - first)};
        return at < end ? ZEL_SVC_XML_OK : ZEL_SVC_XML_ERR_EOF;
    }

    // A quoted value. Whichever quote opens it, a double quote closes it; at the end of the input the last
    // byte may be either.
    ZelSvcXmlResult read_quoted(std::string_view &value);

    ZelSvcXmlResult to_end() {
        at = end;
        return ZEL_SVC_XML_ERR_EOF;
    }
};

inline bool zel_svc_xml_is_quote(char byte) { return byte == '"' || byte == '\''; }

// Text ends at its first NUL byte.
inline std::string_view zel_svc_xml_to_nul(std::string_view bytes) {
    if (bytes.empty()) return bytes;
    const void *nul = std::memchr(bytes.data(), '\0', bytes.size());
    if (!nul) return bytes;
    return {bytes.data(), static_cast<std::size_t>(static_cast<const char *>(nul) - bytes.data())};
}
