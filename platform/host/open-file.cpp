#include "open-file.h"

#include "listing.h"

#include <cerrno>
#include <fcntl.h>
#include <sys/stat.h>

namespace zel_host {
namespace {

int refuse(int error) {
    errno = error;
    return -1;
}

bool makes(int flags) { return (flags & O_CREAT) != 0 && (flags & O_PATH) == 0; }

int make(const Place &place, int flags, mode_t mode) {
    if (!place.missing_in || !makes(flags)) return refuse(place.error);
    return ::openat(place.missing_in.get(), place.name.c_str(), flags | O_NOFOLLOW | O_NONBLOCK | O_CLOEXEC, mode);
}

} // namespace

int open_file(Phone &phone, std::string_view path, int flags, mode_t mode) {
    const bool exclusive = makes(flags) && (flags & O_EXCL) != 0;
    const Follow follow = exclusive || (flags & O_NOFOLLOW) != 0 ? Follow::NotLast : Follow::Last;
    const Place place = resolve(phone.folder(), path, follow);
    if (!place.file) return make(place, flags, mode);
    if (exclusive) return refuse(EEXIST);
    struct stat status {};
    if (::fstat(place.file.get(), &status) != 0) return -1;
    if (S_ISLNK(status.st_mode)) return refuse(ELOOP);
    // Told before the real open: opening a FIFO or a device can block, or act.
    if (!S_ISREG(status.st_mode) && !S_ISDIR(status.st_mode)) return refuse(EINVAL);
    if (makes(flags) && S_ISDIR(status.st_mode)) return refuse(EISDIR);
    if (S_ISDIR(status.st_mode) && (flags & O_PATH) == 0 && is_root(phone, place.file.get()))
        return open_listing(phone, flags);
    const std::string name = "/proc/self/fd/" + std::to_string(place.file.get());
    return ::open(name.c_str(), (flags & ~(O_CREAT | O_EXCL | O_NOFOLLOW)) | O_NONBLOCK | O_CLOEXEC);
}

} // namespace zel_host
