#pragma once
// Owner and security label of a file. They belong to the file, not to its path: they are extended attributes
// (user.zel.*), or where the file system or the kind of file takes none, rows by device, inode and birth time.

#include "phone.h"

#include <optional>
#include <string>
#include <string_view>
#include <sys/types.h>

namespace zel_host {

struct Owner {
    uid_t user = 0;
    gid_t group = 0;
};

// `fd` may be an O_PATH descriptor. Setting returns an errno, or 0.
int set_label(Phone &phone, int fd, std::string_view label);
std::optional<std::string> get_label(Phone &phone, int fd);

// Recorded always; changed for real where this user may.
int set_owner(Phone &phone, int fd, Owner owner);
// What was recorded, else the real owner; nothing when the descriptor is bad.
std::optional<Owner> get_owner(Phone &phone, int fd);

// Makes the bench phone act as on a file system without extended attributes (tests; the environment variable
// ZEL_HOST_ATTRIBUTES=table does so from the start).
void keep_attributes_in_table(bool on);

} // namespace zel_host
