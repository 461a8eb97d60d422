#pragma once
// Opening files of the phone.

#include "phone.h"

#include <string_view>
#include <sys/types.h>

namespace zel_host {

// As zel_platform_open(), for any phone: a descriptor, or -1 and errno.
int open_file(Phone &phone, std::string_view path, int flags, mode_t mode);

} // namespace zel_host
