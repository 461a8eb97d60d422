#pragma once
// A root folder: the folder of the workstation that holds one whole phone.

#include "fd.h"

#include <string>

namespace zel_host {

inline constexpr const char *kMarkerName = "phone"; // in the state folder

struct Root {
    std::string path; // absolute, links resolved
    Fd folder;        // O_PATH
    Fd state;         // O_PATH, its state folder
};

// Opens a marked root. On failure the descriptors are closed and `error` says what is wrong.
Root open_root(const std::string &path, std::string &error);

// True for the folders that are never a root, marked or not: "/" and the user's home.
bool is_forbidden_root(int folder);

} // namespace zel_host
