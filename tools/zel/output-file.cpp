#include "output-file.h"

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <cerrno>
#include <cstdio>
#include <cstdlib>
#include <memory>
#include <system_error>

namespace zel_command {
namespace {

constexpr mode_t kNewMode = 0666; // what the user's mask leaves of it
constexpr mode_t kModeBits = 07777;

std::string reason(int error) { return std::generic_category().message(error); }

// 0, or the error. Of a full disk some file systems tell only when the file is closed.
int write_and_close(int fd, std::string_view content) {
    int error = 0;
    while (!content.empty() && error == 0) {
        const ssize_t written = write(fd, content.data(), content.size());
        if (written < 0 && errno != EINTR) error = errno;
        if (written > 0) content.remove_prefix(static_cast<std::size_t>(written));
    }
    if (close(fd) != 0 && error == 0) error = errno;
    return error;
}

int write_in_place(const std::string &path, std::string_view content) {
    const int fd = open(path.c_str(), O_WRONLY | O_CREAT | O_TRUNC | O_CLOEXEC, kNewMode);
    return fd < 0 ? errno : write_and_close(fd, content);
}

// The file behind links; of a new one the path itself.
std::string resolved(const std::string &path) {
    const std::unique_ptr<char, decltype(&std::free)> real{realpath(path.c_str(), nullptr), &std::free};
    return real ? real.get() : path;
}

// In the same folder, so that it can take the file's place.
std::string name_beside(const std::string &path) {
    const std::size_t slash = path.rfind('/');
    return path.substr(0, slash == std::string::npos ? 0 : slash + 1) + ".zel-" + std::to_string(getpid());
}

int write_beside(const std::string &path, std::string_view content, const struct stat *old) {
    const std::string beside = name_beside(path);
    const int fd = open(beside.c_str(), O_WRONLY | O_CREAT | O_EXCL | O_CLOEXEC, kNewMode);
    if (fd < 0) return errno;
    if (old != nullptr) fchmod(fd, old->st_mode & kModeBits);
    int error = write_and_close(fd, content);
    if (error == 0 && rename(beside.c_str(), path.c_str()) != 0) error = errno;
    if (error != 0) unlink(beside.c_str());
    return error;
}

} // namespace

std::string write_file(const std::string &path, std::string_view content) {
    const std::string target = resolved(path);
    struct stat old {};
    const bool exists = stat(target.c_str(), &old) == 0;
    int error = 0;
    if (exists && !S_ISREG(old.st_mode)) {
        error = write_in_place(target, content);
    } else if (exists && access(target.c_str(), W_OK) != 0) {
        error = errno;
    } else {
        error = write_beside(target, content, exists ? &old : nullptr);
        // A folder that takes no new file may still hold one that can be written.
        if (error == EACCES && exists) error = write_in_place(target, content);
    }
    return error == 0 ? std::string{} : reason(error);
}

} // namespace zel_command
