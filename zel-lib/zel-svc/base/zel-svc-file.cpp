#include "base/zel-svc-file.h"

#include "base/zel-svc-file-attr.h"

#include <zel-platform.h>

#include <array>
#include <cerrno>
#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>
#include <utility>

ZelSvcFd &ZelSvcFd::operator=(ZelSvcFd &&other) noexcept {
    if (this == &other) return *this;
    close();
    fd_ = other.release();
    return *this;
}

ZelSvcFd::~ZelSvcFd() { close(); }

int ZelSvcFd::release() { return std::exchange(fd_, -1); }

void ZelSvcFd::close() {
    if (fd_ >= 0) ::close(release());
}

ZelSvcFd zel_svc_file_open(const char *path, int flags, mode_t mode) {
    if (!path) return {};
    return ZelSvcFd{zel_platform_open(path, flags | O_CLOEXEC, mode)};
}

ZelSvcFd zel_svc_file_open_any(const char *path) {
    ZelSvcFd file = zel_svc_file_open(path, O_RDONLY);
    return file ? std::move(file) : zel_svc_file_open(path, O_RDONLY | O_DIRECTORY);
}

bool zel_svc_file_write_all(int fd, std::string_view bytes) {
    while (!bytes.empty()) {
        const ssize_t written = ::write(fd, bytes.data(), bytes.size());
        if (written < 0 && errno == EINTR) continue;
        if (written <= 0) return false;
        bytes.remove_prefix(static_cast<std::size_t>(written));
    }
    return true;
}

std::size_t zel_svc_file_read_all(int fd, char *bytes, std::size_t size) {
    std::size_t filled = 0;
    while (filled < size) {
        const ssize_t got = ::read(fd, bytes + filled, size - filled);
        if (got < 0 && errno == EINTR) continue;
        if (got <= 0) break;
        filled += static_cast<std::size_t>(got);
    }
    return filled;
}

int zel_svc_file_remove(const char *path) {
    if (!path) return -1;
    char name[ZEL_PLATFORM_NAME_MAX];
    const ZelSvcFd folder{zel_platform_open_parent(path, name)};
    return folder ? ::unlinkat(folder.get(), name, 0) : -1;
}

std::string zel_svc_file_behind_links(std::string path) {
    constexpr int kMostLinks = 40;
    for (int i = 0; i < kMostLinks; ++i) {
        char name[ZEL_PLATFORM_NAME_MAX];
        std::array<char, 4096> link;
        const ZelSvcFd folder{zel_platform_open_parent(path.c_str(), name)};
        const ssize_t size = folder ? ::readlinkat(folder.get(), name, link.data(), link.size()) : -1;
        if (size <= 0) break;
        const std::string_view text{link.data(), static_cast<std::size_t>(size)};
        if (text.front() == '/') path.clear();
        path.resize(path.rfind('/') + 1); // from the end of an empty path to its start
        path.append(text);
    }
    return path;
}

int __zel_svc_config_file_exists(const char *path) { return zel_svc_file_open_any(path) ? 1 : 0; }

std::string_view zel_svc_file_name_part(std::string_view path) {
    const std::size_t slash = path.rfind('/');
    // A path whose only "/" is its first character is a name of its own.
    return slash == std::string_view::npos || slash == 0 ? path : path.substr(slash + 1);
}
