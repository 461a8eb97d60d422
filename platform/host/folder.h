#pragma once
// Trees of folders by descriptor, links never followed.

#include "fd.h"

#include <functional>
#include <string>
#include <string_view>
#include <sys/stat.h>
#include <vector>

namespace zel_host {

// Names in a folder but "." and "..", in byte order. `folder` may be an O_PATH descriptor.
std::vector<std::string> names_in(int folder);

// A subfolder, never through a link.
Fd open_subfolder(int folder, const std::string &name);

std::string link_target(int folder, const std::string &name);

// Removes an entry with everything below it; false when something stayed.
bool remove_tree(int folder, const std::string &name);

struct Copied {
    int files = 0;
    int folders = 0;
    int links = 0;
    int skipped = 0; // devices, sockets, FIFOs
};

// Copies what is in one folder into another, empty one: files with their permissions, links as links.
// Throws std::system_error.
void copy_tree(int source, int target, Copied &copied);

} // namespace zel_host
