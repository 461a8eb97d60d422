#pragma once
// Paths of the phone, resolved inside its root folder. Nothing else joins a root and a path.
//
//     Place place = resolve(root_fd, "/opt/usr/media", Follow::Last);
//     if (place.file) ...                       // an O_PATH descriptor of what is there
//     else if (place.missing_in) ...            // may be made as place.name in that folder
//     else errno = place.error;
//
// Symbolic links are followed inside the root: an absolute one starts at the root, and ".." of the root is
// the root. The folder ".platform" of the root holds the bench phone's own state and does not exist for the
// phone, whichever way a path comes to it.

#include "fd.h"

#include <string>
#include <string_view>

namespace zel_host {

inline constexpr const char *kStateFolder = ".platform";

enum class Follow { Last, NotLast };

struct Place {
    Fd file;          // O_PATH: the file, folder, or (Follow::NotLast) the link itself
    Fd missing_in;    // O_PATH: the folder that lacks the last name, when only that is missing
    std::string name; // that last name, links followed
    int error = 0;    // errno when there is no file
};

Place resolve(int root, std::string_view path, Follow follow);

// The folder that holds the last name of `path`, links in the folder's own path followed. The name is plain
// and not the state folder's; otherwise the result is empty and errno is set.
struct NameInFolder {
    Fd folder;
    std::string name;
};
NameInFolder resolve_parent(int root, std::string_view path);

// Where an open file of the workstation really is, for libraries that take only a path.
std::string real_path(int fd);

// Turns the kernel's own resolver off (the environment variable ZEL_HOST_RESOLVER=walk does so from the
// start), so that tests can compare both ways.
void resolve_by_walk_only(bool on);

} // namespace zel_host
