#pragma once
// Texts of a phone in JSON. A phone may hold any bytes, JSON only UTF-8: bytes that are none show as U+FFFD,
// and then a second member NAME_hex beside NAME holds the exact bytes.

#include <nlohmann/json.hpp>
#include <string>
#include <string_view>

namespace zel_host {

bool is_utf8(std::string_view bytes);

// The text with U+FFFD for each byte that is no UTF-8.
std::string printable(std::string_view bytes);

std::string hex(std::string_view bytes);
// The bytes that hex() gave; false when `text` is none.
bool from_hex(std::string_view text, std::string &bytes);

// Sets object[name], and object[name_hex] where it is needed.
void put_text(nlohmann::json &object, const std::string &name, std::string_view bytes);

} // namespace zel_host
