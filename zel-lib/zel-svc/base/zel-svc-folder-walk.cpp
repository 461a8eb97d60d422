#include "base/zel-svc-folder-walk.h"

#include <cstring>
#include <dirent.h>
#include <fcntl.h>
#include <memory>
#include <string_view>
#include <utility>

namespace {

struct CloseFolder {
    void operator()(DIR *folder) const { ::closedir(folder); }
};

bool is_self_or_parent(std::string_view name) { return name == "." || name == ".."; }

// All names are read before anything is done with them: callers add to and remove from the folder.
std::vector<std::string> names_in(int folder) {
    ZelSvcFd copy{::fcntl(folder, F_DUPFD_CLOEXEC, 0)};
    const std::unique_ptr<DIR, CloseFolder> listing{copy ? ::fdopendir(copy.get()) : nullptr};
    if (!listing) return {};
    copy.release(); // the listing closes it
    std::vector<std::string> names;
    while (const dirent *entry = ::readdir(listing.get())) // NOLINT(concurrency-mt-unsafe)
        if (!is_self_or_parent(entry->d_name)) names.emplace_back(entry->d_name);
    return names;
}

} // namespace

ZelSvcFolderWalk::ZelSvcFolderWalk(const char *path) { open_level(zel_svc_file_open(path, O_RDONLY | O_DIRECTORY)); }

bool ZelSvcFolderWalk::open_level(ZelSvcFd folder) {
    struct stat status = {};
    if (!folder || ::fstat(folder.get(), &status) != 0 || !S_ISDIR(status.st_mode)) return false;
    levels_.push_back({.names = names_in(folder.get()),
                       .name = name_,
                       .below_size = below_.size(),
                       .device = status.st_dev,
                       .inode = status.st_ino});
    folder_ = std::move(folder);
    return true;
}

void ZelSvcFolderWalk::set_name(std::string name) {
    name_ = std::move(name);
    below_.resize(levels_.back().below_size);
    if (!below_.empty()) below_ += '/';
    below_ += name_;
}

ZelSvcFolderWalk::Step ZelSvcFolderWalk::next() {
    if (levels_.empty()) return Step::End;
    Level &level = levels_.back();
    if (level.read == level.names.size()) return go_up() ? Step::Leave : Step::End;
    set_name(std::move(level.names[level.read++]));
    if (::fstatat(folder_.get(), name_.c_str(), &status_, AT_SYMLINK_NOFOLLOW) != 0) status_ = {};
    return Step::Entry;
}

bool ZelSvcFolderWalk::enter() {
    constexpr int kFlags = O_RDONLY | O_DIRECTORY | O_NOFOLLOW | O_CLOEXEC;
    return open_level(ZelSvcFd{::openat(folder_.get(), name_.c_str(), kFlags)});
}

// Descriptors of the folders above are not kept. ".." leads back, and only if it is the folder that the
// walk came from: one that was moved meanwhile must not lead it elsewhere.
bool ZelSvcFolderWalk::go_up() {
    std::string left = std::move(levels_.back().name);
    levels_.pop_back();
    if (levels_.empty()) return false;
    ZelSvcFd above{::openat(folder_.get(), "..", O_PATH | O_DIRECTORY | O_CLOEXEC)};
    struct stat status = {};
    const bool is_above = above && ::fstat(above.get(), &status) == 0 && status.st_dev == levels_.back().device &&
                          status.st_ino == levels_.back().inode;
    if (!is_above) {
        levels_.clear();
        return false;
    }
    folder_ = std::move(above);
    set_name(std::move(left));
    return true;
}
