#pragma once
// Characters of texts that may hold any bytes.

#include <cstddef>
#include <cstdint>
#include <string_view>

namespace zel_command {

struct Character {
    std::uint32_t code;
    std::size_t bytes;
    bool valid; // false: one byte that is no UTF-8
};

// The first character of a text that is not empty.
Character first_character(std::string_view text);

} // namespace zel_command
