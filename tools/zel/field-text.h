#pragma once
// Texts of fixed width in records of the library.

#include <string>
#include <string_view>

namespace zel_command {

template <std::size_t N> std::string field_text(const char (&field)[N]) {
    const std::string_view bytes{field, N};
    return std::string{bytes.substr(0, bytes.find('\0'))};
}

} // namespace zel_command
