#include "spec/zel-svc-xml-entities.h"
#include "spec/zel-svc-xml.h"

#include <cstdlib>
#include <cstring>
#include <string_view>

namespace {

struct Entity {
    std::string_view name;
    char byte;
};

// In this order, each through the whole text: "&amp;lt;" comes out as "<", and spec files rely on it.
constexpr Entity kEntities[] = {{"&amp;", '&'}, {"&#10;", '\n'}, {"&lt;", '<'}, {"&gt;", '>'}, {"&quot;", '"'}};

// Nothing in front of `from` needs a look: it holds no "&".
std::size_t decode_one(char *text, std::size_t from, std::size_t length, const Entity &entity) {
    std::size_t read = from;
    std::size_t written = from;
    while (read < length) {
        const void *found = std::memchr(text + read, '&', length - read);
        const std::size_t plain = found ? static_cast<std::size_t>(static_cast<const char *>(found) - text) : length;
        std::memmove(text + written, text + read, plain - read);
        written += plain - read;
        read = plain;
        if (read == length) break;
        const bool is_entity = std::string_view{text + read, length - read}.starts_with(entity.name);
        text[written++] = is_entity ? entity.byte : '&';
        read += is_entity ? entity.name.size() : 1;
    }
    text[written] = '\0';
    return written;
}

} // namespace

std::size_t zel_svc_xml_decode_in_place(char *text, std::size_t length) {
    const void *first = length != 0 && length <= ZEL_SVC_XML_TEXT_MAX ? std::memchr(text, '&', length) : nullptr;
    if (!first) return length;
    const auto from = static_cast<std::size_t>(static_cast<const char *>(first) - text);
    for (const Entity &entity : kEntities)
        length = decode_one(text, from, length, entity);
    return length;
}

char *zel_svc_xml_decode_entities(const char *text) {
    if (!text) return nullptr;
    const std::size_t length = std::strlen(text);
    if (length > ZEL_SVC_XML_TEXT_MAX) return nullptr;
    auto *copy = static_cast<char *>(std::malloc(length + 1));
    if (!copy) return nullptr;
    std::memcpy(copy, text, length + 1);
    zel_svc_xml_decode_in_place(copy, length);
    return copy;
}
