#pragma once
// "/" as the phone lists it: without the state folder. A descriptor of the real root would show that folder,
// so one that is opened for reading shows a folder beside it that has the same entries: files under the same
// inode, links with the same text, folders by name, mode and kind only. What a caller makes or removes through
// it does not touch the phone; zel_platform_open_parent() gives the real one.

#include "phone.h"

namespace zel_host {

bool is_root(Phone &phone, int fd);
// A descriptor, or -1 and errno.
int open_listing(Phone &phone, int flags);

} // namespace zel_host
