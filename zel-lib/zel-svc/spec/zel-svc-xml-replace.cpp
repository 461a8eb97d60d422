#include "spec/zel-svc-xml-entities.h"
#include "spec/zel-svc-xml.h"

#include <cstdlib>
#include <cstring>
#include <string_view>

namespace {

std::size_t occurrences(std::string_view text, std::string_view from) {
    std::size_t count = 0;
    for (std::size_t at = text.find(from); at != std::string_view::npos; at = text.find(from, at + from.size()))
        ++count;
    return count;
}

char *append(char *target, std::string_view bytes) {
    std::memcpy(target, bytes.data(), bytes.size());
    return target + bytes.size();
}

} // namespace

char *zel_svc_str_replace_all(const char *text, const char *from, const char *to) {
    if (!text || !from || !to || *from == '\0' || *to == '\0') return nullptr;
    std::string_view rest{text};
    const std::string_view old_part{from};
    const std::string_view new_part{to};
    if (rest.size() > ZEL_SVC_XML_TEXT_MAX) return nullptr;
    const std::size_t count = occurrences(rest, old_part);
    const std::size_t kept = rest.size() - count * old_part.size();
    // Divided rather than multiplied, so that no length can overflow.
    if (count != 0 && new_part.size() > (ZEL_SVC_XML_TEXT_MAX - kept) / count) return nullptr;

    auto *result = static_cast<char *>(std::malloc(kept + count * new_part.size() + 1));
    if (!result) return nullptr;
    char *end = result;
    for (std::size_t left = count; left > 0; --left) {
        const std::size_t plain = rest.find(old_part);
        end = append(append(end, rest.substr(0, plain)), new_part);
        rest.remove_prefix(plain + old_part.size());
    }
    *append(end, rest) = '\0';
    return result;
}
