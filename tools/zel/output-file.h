#pragma once
// Files of this workstation that the user names: the page, the exported document.

#include <string>
#include <string_view>

namespace zel_command {

// A file's new content, whole or not at all: what stood there before stays when something fails. Devices and pipes
// are written as they are. Returns why it failed, an empty text when it is done.
std::string write_file(const std::string &path, std::string_view content);

} // namespace zel_command
