#pragma once
// What belongs to a file besides its content: owner, group, mode and security label.

#include "base/zel-svc-file.h"

#include <string>

// Opens a regular file or a folder for reading, whichever stands at the path.
ZelSvcFd zel_svc_file_open_any(const char *path);

// Gives an open file or folder the owner, permission bits and label of another. Labels are kept by path.
void zel_svc_file_copy_attr(int source_fd, const char *source, int target_fd, const char *target);

// Where a link, or a chain of them, leads; the path itself when no link stands there.
std::string zel_svc_file_behind_links(std::string path);
