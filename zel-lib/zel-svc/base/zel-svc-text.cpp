#include "base/zel-svc-text.h"

#include <algorithm>

namespace {

constexpr bool is_continuation(char byte) { return (static_cast<unsigned char>(byte) & 0xC0U) == 0x80U; }

// Bytes that a character with this first byte takes; 1 for what cannot begin one.
constexpr std::size_t announced_length(char first) {
    const auto byte = static_cast<unsigned char>(first);
    if (byte >= 0xF0U && byte <= 0xF4U) return 4;
    if (byte >= 0xE0U && byte < 0xF0U) return 3;
    if (byte >= 0xC2U && byte < 0xE0U) return 2;
    return 1;
}

} // namespace

std::size_t zel_svc_text_cut(std::string_view text, std::size_t limit) {
    if (text.size() <= limit) return text.size();
    // The character that crosses the limit begins at most three bytes in front of it.
    for (std::size_t back = 1; back <= std::min<std::size_t>(3, limit); ++back) {
        const std::size_t first = limit - back;
        if (is_continuation(text[first])) continue;
        const std::size_t length = announced_length(text[first]);
        if (length <= back || first + length > text.size()) return limit;
        const bool whole = std::all_of(text.begin() + static_cast<std::ptrdiff_t>(first) + 1,
                                       text.begin() + static_cast<std::ptrdiff_t>(first + length), is_continuation);
        return whole ? first : limit;
    }
    return limit;
}

void zel_svc_text_copy(char *target, std::size_t size, std::string_view text) {
    if (size == 0) return;
    text = text.substr(0, std::min(text.find('\0'), text.size()));
    const std::size_t length = zel_svc_text_cut(text, size - 1);
    // The text may be part of the target: a field cut into itself. An empty one may have no address.
    if (length != 0) std::memmove(target, text.data(), length);
    std::memset(target + length, 0, size - length);
}
