#pragma once
// Text for HTML pages, safe whatever bytes a phone or a package holds.

#include <string>
#include <string_view>

namespace zel_command {

// Control bytes, direction marks and bytes that are no UTF-8 as on a terminal; the characters that mean
// something to HTML as references, so that the text is nothing but text in an element and in a quoted attribute.
std::string html_text(std::string_view text);

} // namespace zel_command
