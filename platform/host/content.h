#pragma once
// Whole contents of open files.

#include <string>
#include <string_view>

namespace zel_host {

std::string read_content(int fd);
bool write_content(int fd, std::string_view bytes);

} // namespace zel_host
