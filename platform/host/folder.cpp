#include "folder.h"

#include <algorithm>
#include <array>
#include <cerrno>
#include <climits>
#include <cstring>
#include <dirent.h>
#include <fcntl.h>
#include <system_error>

namespace zel_host {
namespace {

constexpr mode_t kPermissions = 0777; // set-id and sticky bits of a package mean nothing on a bench phone

[[noreturn]] void fail(const std::string &what) { throw std::system_error(errno, std::generic_category(), what); }

void copy_bytes(int source, int target, const std::string &name) {
    std::array<char, 8192> block{};
    while (true) {
        const ssize_t size = ::read(source, block.data(), block.size());
        if (size == 0) return;
        if (size < 0 || ::write(target, block.data(), static_cast<std::size_t>(size)) != size) fail(name);
    }
}

void copy_file(int source, int target, const std::string &name, mode_t mode) {
    const Fd from(::openat(source, name.c_str(), O_RDONLY | O_NOFOLLOW | O_NONBLOCK | O_CLOEXEC));
    if (!from) fail(name);
    const Fd to(::openat(target, name.c_str(), O_WRONLY | O_CREAT | O_EXCL | O_CLOEXEC, 0600));
    if (!to) fail(name);
    copy_bytes(from.get(), to.get(), name);
    if (::fchmod(to.get(), mode & kPermissions) != 0) fail(name);
}

void copy_subfolder(int source, int target, const std::string &name, mode_t mode, Copied &copied) {
    const Fd from = open_subfolder(source, name);
    if (!from || ::mkdirat(target, name.c_str(), 0700) != 0) fail(name);
    const Fd to = open_subfolder(target, name);
    if (!to) fail(name);
    copy_tree(from.get(), to.get(), copied);
    if (::fchmodat(target, name.c_str(), mode & kPermissions, 0) != 0) fail(name);
}

void copy_entry(int source, int target, const std::string &name, Copied &copied) {
    struct stat status {};
    if (::fstatat(source, name.c_str(), &status, AT_SYMLINK_NOFOLLOW) != 0) fail(name);
    if (S_ISREG(status.st_mode)) {
        copy_file(source, target, name, status.st_mode);
        ++copied.files;
    } else if (S_ISDIR(status.st_mode)) {
        copy_subfolder(source, target, name, status.st_mode, copied);
        ++copied.folders;
    } else if (S_ISLNK(status.st_mode)) {
        if (::symlinkat(link_target(source, name).c_str(), target, name.c_str()) != 0) fail(name);
        ++copied.links;
    } else {
        ++copied.skipped;
    }
}

} // namespace

std::vector<std::string> names_in(int folder) {
    std::vector<std::string> names;
    DIR *entries = ::fdopendir(::openat(folder, ".", O_RDONLY | O_DIRECTORY | O_CLOEXEC));
    if (entries == nullptr) return names;
    while (const dirent *entry = ::readdir(entries)) // NOLINT(concurrency-mt-unsafe): this stream is ours
        if (std::strcmp(entry->d_name, ".") != 0 && std::strcmp(entry->d_name, "..") != 0)
            names.emplace_back(entry->d_name);
    ::closedir(entries);
    std::sort(names.begin(), names.end());
    return names;
}

Fd open_subfolder(int folder, const std::string &name) {
    return Fd(::openat(folder, name.c_str(), O_PATH | O_DIRECTORY | O_NOFOLLOW | O_CLOEXEC));
}

std::string link_target(int folder, const std::string &name) {
    std::array<char, PATH_MAX> text{};
    const ssize_t size = ::readlinkat(folder, name.c_str(), text.data(), text.size());
    return size > 0 ? std::string(text.data(), static_cast<std::size_t>(size)) : std::string();
}

bool remove_tree(int folder, const std::string &name) {
    if (::unlinkat(folder, name.c_str(), 0) == 0) return true;
    {
        const Fd inside = open_subfolder(folder, name);
        if (!inside) return errno == ENOENT;
        for (const std::string &entry : names_in(inside.get()))
            if (!remove_tree(inside.get(), entry)) return false;
    }
    return ::unlinkat(folder, name.c_str(), AT_REMOVEDIR) == 0;
}

void copy_tree(int source, int target, Copied &copied) {
    for (const std::string &name : names_in(source))
        copy_entry(source, target, name, copied);
}

} // namespace zel_host
