#include "attributes.h"
#include "call.h"
#include "open-file.h"

#include <cstring>
#include <fcntl.h>
#include <zel-platform.h>

namespace zel_host {
namespace {

int open_path(Phone &phone, const char *path, int flags, mode_t mode) {
    errno = EFAULT;
    if (path == nullptr) return -1;
    const bool writes = (flags & O_ACCMODE) != O_RDONLY;
    if (writes && any_faults(phone) && matching_fault(phone, kFunctions[function("disk_full")], path) != nullptr) {
        errno = ENOSPC;
        return -1;
    }
    return open_file(phone, path, flags, mode);
}

int open_parent(Phone &phone, const char *path, char *name) {
    errno = EFAULT;
    if (path == nullptr || name == nullptr) return -1;
    NameInFolder found = resolve_parent(phone.folder(), path);
    if (!found.folder) return -1;
    std::memcpy(name, found.name.c_str(), found.name.size() + 1);
    return found.folder.release();
}

int give(Phone &phone, int fd, uid_t user, gid_t group) {
    errno = set_owner(phone, fd, {.user = user, .group = group});
    return errno == 0 ? 0 : -1;
}

int ask_owner(Phone &phone, int fd, uid_t *user, gid_t *group) {
    const std::optional<Owner> owner = get_owner(phone, fd);
    if (!owner || user == nullptr || group == nullptr) return -1;
    *user = owner->user;
    *group = owner->group;
    return 0;
}

} // namespace
} // namespace zel_host

using namespace zel_host;

ZEL_HOST_EXPORT int zel_platform_open(const char *path, int flags, mode_t mode) {
    return answer<function("zel_platform_open")>([&](Phone &phone) { return open_path(phone, path, flags, mode); },
                                                 path, flags, mode);
}

ZEL_HOST_EXPORT int zel_platform_open_parent(const char *path, char *name) {
    return answer<function("zel_platform_open_parent")>([&](Phone &phone) { return open_parent(phone, path, name); },
                                                        path);
}

ZEL_HOST_EXPORT int zel_platform_set_owner(int fd, uid_t uid, gid_t gid) {
    return answer<function("zel_platform_set_owner")>([&](Phone &phone) { return give(phone, fd, uid, gid); }, fd, uid,
                                                      gid);
}

ZEL_HOST_EXPORT int zel_platform_get_owner(int fd, uid_t *uid, gid_t *gid) {
    return answer<function("zel_platform_get_owner")>([&](Phone &phone) { return ask_owner(phone, fd, uid, gid); }, fd);
}
