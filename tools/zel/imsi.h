#pragma once
// Shape of the digits that name a subscriber (ITU-T E.212): MCC, MNC and MSIN, together at most 15.

#include <algorithm>
#include <cstddef>
#include <string_view>

namespace zel_command {

constexpr std::size_t kMccDigits = 3;
constexpr std::size_t kImsiDigits = 15;

inline bool is_digits(std::string_view text) {
    return std::all_of(text.begin(), text.end(), [](char byte) { return byte >= '0' && byte <= '9'; });
}

// Three digits of the MCC, two or three of the MNC.
inline bool is_mccmnc(std::string_view text) {
    return is_digits(text) && (text.size() == kMccDigits + 2 || text.size() == kMccDigits + 3);
}

} // namespace zel_command
