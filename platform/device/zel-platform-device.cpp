// The platform of a real phone: its paths are the machine's own, and everything is a plain system call.
#include "zel-platform.h"

#include <cerrno>
#include <climits>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <fcntl.h>
#include <string_view>
#include <sys/reboot.h>
#include <sys/stat.h>
#include <unistd.h>

namespace {

int fail(int error) {
    errno = error;
    return -1;
}

// Closes a descriptor and keeps errno for the caller's answer.
int close_and_fail(int fd, int error) {
    close(fd);
    return fail(error);
}

// 0 for what may be opened with these flags, else the error that says why not.
int refusal(const struct stat &status, int flags) {
    if (S_ISDIR(status.st_mode)) return (flags & O_DIRECTORY) != 0 ? 0 : EISDIR;
    if ((flags & O_DIRECTORY) != 0) return ENOTDIR;
    return S_ISREG(status.st_mode) ? 0 : EINVAL;
}

// Opens what an O_PATH descriptor names. The kind of file is known by then, so a FIFO or a device is never
// opened at all: opening can block, and for some devices it already does something.
int reopen(int path_fd, int flags) {
    struct stat status {};
    if (fstat(path_fd, &status) != 0) return -1;
    if (const int error = refusal(status, flags); error != 0) return fail(error);
    char link[] = "/proc/self/fd/2147483647";
    char *digit = link + sizeof "/proc/self/fd/" - 1;
    std::snprintf(digit, sizeof "2147483647", "%d", path_fd);
    return open(link, (flags & ~(O_CREAT | O_EXCL | O_NOFOLLOW)) | O_CLOEXEC);
}

int create(const char *path, int flags, mode_t mode) {
    const int fd = open(path, flags | O_CLOEXEC | O_NONBLOCK | O_NOCTTY, mode);
    if (fd < 0) return -1;
    struct stat status {};
    if (fstat(fd, &status) != 0) return close_and_fail(fd, errno);
    // Another process may have put something else there in between.
    if (const int error = refusal(status, flags); error != 0) return close_and_fail(fd, error);
    return fd;
}

bool is_absolute(const char *path) { return path != nullptr && path[0] == '/'; }

} // namespace

int zel_platform_open(const char *path, int flags, mode_t mode) {
    if (!is_absolute(path)) return fail(EINVAL);
    const int path_fd = open(path, O_PATH | O_CLOEXEC | (flags & O_NOFOLLOW));
    if (path_fd < 0) {
        return errno == ENOENT && (flags & O_CREAT) != 0 ? create(path, flags, mode) : -1;
    }
    if ((flags & O_CREAT) != 0 && (flags & O_EXCL) != 0) return close_and_fail(path_fd, EEXIST);
    const int fd = reopen(path_fd, flags);
    const int error = errno;
    close(path_fd);
    errno = error;
    return fd;
}

int zel_platform_open_parent(const char *path, char *name) {
    if (!is_absolute(path)) return fail(EINVAL);
    const std::string_view text{path};
    const std::size_t slash = text.rfind('/');
    const std::string_view last = text.substr(slash + 1);
    if (last.empty() || last == "." || last == "..") return fail(EINVAL);
    if (last.size() >= ZEL_PLATFORM_NAME_MAX || slash >= PATH_MAX) return fail(ENAMETOOLONG);
    char folder[PATH_MAX] = "/";
    std::memcpy(folder, path, slash);
    const int fd = open(folder, O_PATH | O_DIRECTORY | O_CLOEXEC);
    if (fd >= 0) std::memcpy(name, last.data(), last.size() + 1);
    return fd;
}

int zel_platform_set_owner(int fd, uid_t uid, gid_t gid) { return fchownat(fd, "", uid, gid, AT_EMPTY_PATH); }

int zel_platform_get_owner(int fd, uid_t *uid, gid_t *gid) {
    struct stat status {};
    if (fstat(fd, &status) != 0) return -1;
    *uid = status.st_uid;
    *gid = status.st_gid;
    return 0;
}

int zel_platform_command(const char *command) { return std::system(command); } // NOLINT(cert-env33-c): its purpose

void zel_platform_sync() { sync(); }

int zel_platform_reboot(int command) { return reboot(command); }

int zel_platform_now(struct timeval *now) { return gettimeofday(now, nullptr); }
