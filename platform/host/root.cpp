#include "root.h"

#include "resolve.h"

#include <cstdlib>
#include <cstring>
#include <fcntl.h>
#include <pwd.h>
#include <sys/stat.h>

namespace zel_host {
namespace {

bool same_as_path(int folder, const char *path) {
    struct stat here {};
    struct stat there {};
    return path != nullptr && ::fstat(folder, &here) == 0 && ::stat(path, &there) == 0 && here.st_dev == there.st_dev &&
           here.st_ino == there.st_ino;
}

const char *home_of_user() {
    const passwd *user = ::getpwuid(::getuid()); // NOLINT(concurrency-mt-unsafe): the bench phone has one thread
    return user == nullptr ? nullptr : user->pw_dir;
}

bool has_marker(int state) {
    struct stat status {};
    return ::fstatat(state, kMarkerName, &status, AT_SYMLINK_NOFOLLOW) == 0 && S_ISREG(status.st_mode);
}

} // namespace

bool is_forbidden_root(int folder) {
    return same_as_path(folder, "/") || same_as_path(folder, std::getenv("HOME")) ||
           same_as_path(folder, home_of_user());
}

Root open_root(const std::string &path, std::string &error) {
    Root root;
    Fd folder(::open(path.c_str(), O_PATH | O_DIRECTORY | O_CLOEXEC));
    if (!folder) {
        error = "'" + path + "' is no phone: " + std::strerror(errno);
        return root;
    }
    if (is_forbidden_root(folder.get())) {
        error = "'" + path + "' is never a phone: it is the root or home folder of this machine";
        return root;
    }
    Fd state(::openat(folder.get(), kStateFolder, O_PATH | O_DIRECTORY | O_NOFOLLOW | O_CLOEXEC));
    if (!state || !has_marker(state.get())) {
        error = "'" + path + "' is no phone: it has no file " + kStateFolder + "/" + kMarkerName +
                " (make a phone with: zel phone create --root DIR)";
        return root;
    }
    root.path = real_path(folder.get());
    root.folder = std::move(folder);
    root.state = std::move(state);
    return root;
}

} // namespace zel_host
