#pragma once
// Files that are written as a whole or not at all.

#include <string_view>

// Puts `bytes` into a file of the phone, mode 0644 less the umask, owner and label not set. Until everything
// is written an earlier file stays as it was: the bytes go to a file of their own beside it, which then takes
// its name and is gone on every other path. False when the folder is missing or the writing failed.
bool zel_svc_file_replace(const char *path, std::string_view bytes);
