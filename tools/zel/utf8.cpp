#include "utf8.h"

namespace zel_command {
namespace {

constexpr Character kBrokenByte{0, 1, false};

std::size_t sequence_length(unsigned char lead) {
    if (lead < 0x80) return 1;
    if (lead >= 0xC2 && lead < 0xE0) return 2;
    if (lead >= 0xE0 && lead < 0xF0) return 3;
    return lead >= 0xF0 && lead < 0xF5 ? 4 : 0;
}

// Overlong forms and surrogates are no characters.
bool is_shortest(std::uint32_t code, std::size_t bytes) {
    if (bytes == 3) return code >= 0x800 && (code < 0xD800 || code > 0xDFFF);
    if (bytes == 4) return code >= 0x10000 && code <= 0x10FFFF;
    return true;
}

} // namespace

Character first_character(std::string_view text) {
    const auto lead = static_cast<unsigned char>(text[0]);
    const std::size_t bytes = sequence_length(lead);
    if (bytes == 1) return {lead, 1, true};
    if (bytes == 0 || bytes > text.size()) return kBrokenByte;
    std::uint32_t code = lead & (0xFFU >> (bytes + 1));
    for (std::size_t i = 1; i < bytes; ++i) {
        const auto next = static_cast<unsigned char>(text[i]);
        if ((next & 0xC0U) != 0x80U) return kBrokenByte;
        code = (code << 6U) | (next & 0x3FU);
    }
    return is_shortest(code, bytes) ? Character{code, bytes, true} : kBrokenByte;
}

} // namespace zel_command
