#include "base/zel-svc-number.h"

#include <algorithm>
#include <limits>

namespace {

constexpr bool is_blank(char c) { return c == ' ' || (c >= '\t' && c <= '\r'); }

// The number as a 64-bit one, saturated far outside 32 bits so that any count of digits is safe.
std::int64_t leading_number(std::string_view text) {
    constexpr std::int64_t kFarOutside = std::int64_t{1} << 40;
    std::size_t at = 0;
    while (at < text.size() && is_blank(text[at]))
        ++at;
    const bool negative = at < text.size() && text[at] == '-';
    if (at < text.size() && (text[at] == '-' || text[at] == '+')) ++at;
    std::int64_t value = 0;
    for (; at < text.size() && text[at] >= '0' && text[at] <= '9'; ++at)
        value = std::min(value * 10 + (text[at] - '0'), kFarOutside);
    return negative ? -value : value;
}

template <typename Integer> Integer saturated(std::int64_t value) {
    using Limits = std::numeric_limits<Integer>;
    return static_cast<Integer>(std::clamp<std::int64_t>(value, Limits::min(), Limits::max()));
}

} // namespace

std::int32_t zel_svc_number_from_text(std::string_view text) { return saturated<std::int32_t>(leading_number(text)); }

std::uint32_t zel_svc_unsigned_from_text(std::string_view text) {
    return saturated<std::uint32_t>(leading_number(text));
}
