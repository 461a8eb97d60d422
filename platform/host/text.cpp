#include "text.h"

#include <cstdint>

namespace zel_host {
namespace {

constexpr std::string_view kReplacement = "\xEF\xBF\xBD";
constexpr std::string_view kDigits = "0123456789abcdef";

unsigned byte_at(std::string_view bytes, std::size_t at) { return static_cast<unsigned char>(bytes[at]); }

struct Form {
    std::size_t size;
    std::uint32_t least; // a smaller code point is written too long
    std::uint32_t bits;  // of the first byte
};

Form form_of(unsigned first) {
    if (first < 0x80) return {1, 0, first};
    if (first >= 0xC0 && first < 0xE0) return {2, 0x80, first & 0x1F};
    if (first >= 0xE0 && first < 0xF0) return {3, 0x800, first & 0x0F};
    if (first >= 0xF0 && first < 0xF8) return {4, 0x10000, first & 0x07};
    return {0, 0, 0};
}

// Bytes of the whole character at the start; 0 when there is none.
std::size_t character_size(std::string_view bytes) {
    const Form form = form_of(byte_at(bytes, 0));
    if (form.size == 0 || form.size > bytes.size()) return 0;
    std::uint32_t code = form.bits;
    for (std::size_t at = 1; at < form.size; ++at) {
        if ((byte_at(bytes, at) & 0xC0) != 0x80) return 0;
        code = (code << 6) | (byte_at(bytes, at) & 0x3F);
    }
    const bool surrogate = code >= 0xD800 && code < 0xE000;
    return code < form.least || code > 0x10FFFF || surrogate ? 0 : form.size;
}

} // namespace

bool is_utf8(std::string_view bytes) {
    while (!bytes.empty()) {
        const std::size_t size = character_size(bytes);
        if (size == 0) return false;
        bytes.remove_prefix(size);
    }
    return true;
}

std::string printable(std::string_view bytes) {
    std::string result;
    while (!bytes.empty()) {
        const std::size_t size = character_size(bytes);
        result += size == 0 ? kReplacement : bytes.substr(0, size);
        bytes.remove_prefix(size == 0 ? 1 : size);
    }
    return result;
}

std::string hex(std::string_view bytes) {
    std::string result;
    for (std::size_t at = 0; at < bytes.size(); ++at) {
        result += kDigits[byte_at(bytes, at) >> 4];
        result += kDigits[byte_at(bytes, at) & 15];
    }
    return result;
}

bool from_hex(std::string_view text, std::string &bytes) {
    if (text.size() % 2 != 0) return false;
    bytes.clear();
    for (std::size_t at = 0; at < text.size(); at += 2) {
        const std::size_t high = kDigits.find(text[at]);
        const std::size_t low = kDigits.find(text[at + 1]);
        if (high == std::string_view::npos || low == std::string_view::npos) return false;
        bytes += static_cast<char>(high * 16 + low);
    }
    return true;
}

void put_text(nlohmann::json &object, const std::string &name, std::string_view bytes) {
    object[name] = printable(bytes);
    if (!is_utf8(bytes)) object[name + "_hex"] = hex(bytes);
}

} // namespace zel_host
