#include "base/zel-svc-file-attr.h"

#include <zel-platform.h>

#include <array>
#include <cerrno>
#include <ctime>
#include <fcntl.h>
#include <string>
#include <sys/stat.h>
#include <unistd.h>
#include <utility>

namespace {

constexpr std::size_t kBlock = 8192; // callers' stacks are small

// A file that is being written, and where this copy made it; an empty path when it was there before.
struct Target {
    ZelSvcFd fd;
    std::string created;
};

// Leaves what the file holds alone: it may turn out to be the source under another name.
Target open_target(const char *path) {
    if (ZelSvcFd existing = zel_svc_file_open(path, O_WRONLY)) return {.fd = std::move(existing), .created = {}};
    if (errno != ENOENT) return {};
    // A link that names nothing yet is no reason to fail: the file appears where the link says.
    std::string created = zel_svc_file_behind_links(path);
    ZelSvcFd fresh = zel_svc_file_open(created.c_str(), O_WRONLY | O_CREAT | O_EXCL, 0644);
    return {.fd = std::move(fresh), .created = std::move(created)};
}

bool is_same_file(const struct stat &one, const struct stat &other) {
    return one.st_dev == other.st_dev && one.st_ino == other.st_ino;
}

bool copy_content(int source, int target) {
    std::array<char, kBlock> block;
    for (;;) {
        const ssize_t got = ::read(source, block.data(), block.size());
        if (got < 0 && errno == EINTR) continue;
        if (got <= 0) return got == 0;
        if (!zel_svc_file_write_all(target, {block.data(), static_cast<std::size_t>(got)})) return false;
    }
}

// Copies carry one fixed date, so that the media library sees the same files on every phone.
void set_fixed_times(int fd) {
    std::tm date = {};
    date.tm_year = 2014 - 1900;
    date.tm_mday = 1;
    date.tm_sec = 1;
    date.tm_isdst = -1;
    const std::time_t fixed = std::mktime(&date);
    const std::array<timespec, 2> times = {timespec{.tv_sec = fixed, .tv_nsec = 0}, {.tv_sec = fixed, .tv_nsec = 0}};
    ::futimens(fd, times.data());
}

} // namespace

int __zel_svc_config_copy_file(const char *source, const char *target) {
    if (!source || !target) return 0;
    const ZelSvcFd from = zel_svc_file_open(source, O_RDONLY);
    struct stat from_status = {};
    if (!from || ::fstat(from.get(), &from_status) != 0 || !S_ISREG(from_status.st_mode)) return 0;

    const Target to = open_target(target);
    struct stat to_status = {};
    if (!to.fd || ::fstat(to.fd.get(), &to_status) != 0 || !S_ISREG(to_status.st_mode)) return 0;
    if (is_same_file(from_status, to_status)) return 0;

    if (::ftruncate(to.fd.get(), 0) != 0 || !copy_content(from.get(), to.fd.get())) {
        if (!to.created.empty()) zel_svc_file_remove(to.created.c_str());
        return 0;
    }
    zel_svc_file_copy_attr(from.get(), source, to.fd.get(), target);
    set_fixed_times(to.fd.get());
    return 1;
}
