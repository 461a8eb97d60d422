#include "listing.h"

#include "folder.h"

#include <cerrno>
#include <fcntl.h>

namespace zel_host {
namespace {

constexpr const char *kListing = "listing";

void show(int root, int listing, const std::string &name) {
    struct stat status {};
    if (name == kStateFolder || ::fstatat(root, name.c_str(), &status, AT_SYMLINK_NOFOLLOW) != 0) return;
    int result = 0;
    if (S_ISDIR(status.st_mode)) result = ::mkdirat(listing, name.c_str(), status.st_mode & 07777);
    if (S_ISREG(status.st_mode)) result = ::linkat(root, name.c_str(), listing, name.c_str(), 0);
    if (S_ISLNK(status.st_mode)) result = ::symlinkat(link_target(root, name).c_str(), listing, name.c_str());
    static_cast<void>(result); // an entry that vanished meanwhile is not there
}

} // namespace

bool is_root(Phone &phone, int fd) {
    struct stat root {};
    struct stat file {};
    return ::fstat(phone.folder(), &root) == 0 && ::fstat(fd, &file) == 0 && root.st_dev == file.st_dev &&
           root.st_ino == file.st_ino;
}

int open_listing(Phone &phone, int flags) {
    remove_tree(phone.state_folder(), kListing);
    if (::mkdirat(phone.state_folder(), kListing, 0755) != 0) return -1;
    const int listing = ::openat(phone.state_folder(), kListing, flags | O_NOFOLLOW | O_CLOEXEC);
    if (listing < 0) return -1;
    for (const std::string &name : names_in(phone.folder()))
        show(phone.folder(), listing, name);
    return listing;
}

} // namespace zel_host
