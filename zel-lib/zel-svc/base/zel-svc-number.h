#pragma once
// Numbers in texts, read the same way whatever the caller's locale.

#include <cstdint>
#include <string>
#include <string_view>

// Leading blanks, an optional sign and the digits that follow; 0 when there are none. What lies outside a
// signed 32-bit integer saturates at its limits.
std::int32_t zel_svc_number_from_text(std::string_view text);

// The same for unsigned 32-bit numbers such as folder sizes: a negative text is 0, a larger one saturates.
std::uint32_t zel_svc_unsigned_from_text(std::string_view text);

inline std::string zel_svc_number_text(std::int32_t value) { return std::to_string(value); }
