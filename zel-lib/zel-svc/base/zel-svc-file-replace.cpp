#include "base/zel-svc-file-replace.h"

#include "base/zel-svc-file.h"

#include <zel-platform.h>

#include <cstdio>
#include <fcntl.h>
#include <string>
#include <unistd.h>

bool zel_svc_file_replace(const char *path, std::string_view bytes) {
    char name[ZEL_PLATFORM_NAME_MAX];
    const ZelSvcFd folder{zel_platform_open_parent(path, name)};
    if (!folder) return false;
    const std::string pending = std::string{name} + ".new";
    ::unlinkat(folder.get(), pending.c_str(), 0); // left by a run that was cut off
    const std::string pending_path = std::string{path} + ".new";
    ZelSvcFd file = zel_svc_file_open(pending_path.c_str(), O_WRONLY | O_CREAT | O_EXCL, 0644);
    if (!file) return false;
    const bool written = zel_svc_file_write_all(file.get(), bytes);
    file.close();
    if (written && ::renameat(folder.get(), pending.c_str(), folder.get(), name) == 0) return true;
    ::unlinkat(folder.get(), pending.c_str(), 0);
    return false;
}
