#include "root.h"

#include "failure.h"

#include <fcntl.h>
#include <sys/file.h>
#include <sys/stat.h>
#include <sys/sysmacros.h>
#include <unistd.h>

#include <cerrno>
#include <climits>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <fstream>
#include <iterator>
#include <utility>

namespace zel_command {
namespace {

std::string absolute(const std::string &path) {
    if (path.front() == '/') return path;
    char folder[PATH_MAX];
    if (getcwd(folder, sizeof folder) == nullptr) return path;
    return std::string{folder} + "/" + path;
}

// The words of a process's command line, separated by blanks.
std::string command_line_of(const std::string &pid) {
    std::ifstream file{"/proc/" + pid + "/cmdline", std::ios::binary};
    std::string line{std::istreambuf_iterator<char>{file}, {}};
    while (!line.empty() && line.back() == '\0')
        line.pop_back();
    for (char &byte : line)
        if (byte == '\0') byte = ' ';
    return line;
}

// The kernel lists locks as "1: FLOCK  ADVISORY  WRITE 1234 fe:00:5678 0 EOF"; the one with "->" waits.
std::string holder_of(int fd) {
    struct stat info {};
    if (fstat(fd, &info) != 0) return {};
    char place[64];
    std::snprintf(place, sizeof place, "%02x:%02x:%lu", major(info.st_dev), minor(info.st_dev),
                  static_cast<unsigned long>(info.st_ino));
    std::ifstream locks{"/proc/locks"};
    std::string number, kind, how, what, pid, where, rest;
    while (locks >> number >> kind >> how >> what >> pid >> where && std::getline(locks, rest))
        if (kind == "FLOCK" && where == place) return pid;
    return {};
}

std::string holder_text(int fd) {
    const std::string pid = holder_of(fd);
    if (pid.empty() || pid == "0") return "another process";
    const std::string line = command_line_of(pid);
    return "process " + pid + (line.empty() ? "" : " (" + line + ")");
}

} // namespace

std::string choose_root(const std::string &from_option) {
    const char *from_environment = std::getenv("ZEL_ROOT");
    std::string root = from_option;
    if (root.empty() && from_environment != nullptr) root = from_environment;
    if (root.empty())
        throw Failure{kNoRoot, "no phone is named: neither --root nor $ZEL_ROOT is set",
                      "Name the phone's folder with 'zel --root DIR ...' or 'export ZEL_ROOT=DIR'."};
    root = absolute(root);
    setenv("ZEL_ROOT", root.c_str(), 1);
    return root;
}

RootLock::RootLock(const std::string &root, Access access)
    : fd_{open(root.c_str(), O_RDONLY | O_DIRECTORY | O_CLOEXEC)} {
    if (fd_ < 0) throw Failure{kNoRoot, "cannot open the folder '" + root + "': " + std::strerror(errno)};
    const int operation = access == Access::kWrites ? LOCK_EX : LOCK_SH;
    if (flock(fd_, operation | LOCK_NB) == 0) return;
    const int error = errno;
    const std::string why = error == EWOULDBLOCK ? "it is in use by " + holder_text(fd_) : std::strerror(error);
    close(fd_);
    throw Failure{kFailed, "cannot lock the phone in '" + root + "': " + why,
                  "Wait until it has finished, or work on another phone."};
}

RootLock::RootLock(RootLock &&other) noexcept : fd_{std::exchange(other.fd_, -1)} {}

RootLock &RootLock::operator=(RootLock &&other) noexcept {
    std::swap(fd_, other.fd_);
    return *this;
}

RootLock::~RootLock() {
    if (fd_ >= 0) close(fd_);
}

} // namespace zel_command
