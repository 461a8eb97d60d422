#include "base/zel-svc-file-attr.h"
#include "base/zel-svc-folder-walk.h"

#include <zel-platform.h>

#include <cerrno>
#include <fcntl.h>
#include <set>
#include <string>
#include <sys/stat.h>
#include <unistd.h>
#include <utility>

namespace {

using Step = ZelSvcFolderWalk::Step;
enum class Subfolders { Copied, Skipped };
enum class Content { Copied, Left };
using Identity = std::pair<dev_t, ino_t>;

Identity identity(const struct stat &status) { return {status.st_dev, status.st_ino}; }

ZelSvcFd open_folder(const char *path) { return zel_svc_file_open(path, O_RDONLY | O_DIRECTORY); }

// All zero for a folder that did not open.
Identity identity_of(int folder) {
    struct stat status = {};
    if (folder >= 0) ::fstat(folder, &status);
    return identity(status);
}

bool make_folder(const char *path) {
    char name[ZEL_PLATFORM_NAME_MAX];
    const ZelSvcFd parent{zel_platform_open_parent(path, name)};
    return parent && ::mkdirat(parent.get(), name, 0755) == 0;
}

void copy_folder_attr(const char *source, const char *target) {
    const ZelSvcFd from = open_folder(source);
    const ZelSvcFd to = open_folder(target);
    if (from && to) zel_svc_file_copy_attr(from.get(), source, to.get(), target);
}

std::string join(std::string_view folder, std::string_view below) {
    std::string path{folder};
    if (!path.ends_with('/')) path += '/';
    return path.append(below);
}

// One copy of a folder's content. Folders that it made are never entered: a folder that is copied into
// itself, directly or through a link in the target, would have no end.
class FolderCopy {
  public:
    FolderCopy(const char *source, const char *target) : source_(source), target_(target), walk_(source) {}

    // 0 when there is nothing to read or both are one folder.
    int run(Subfolders subfolders) {
        const Identity target = identity_of(open_folder(target_.c_str()).get());
        if (!walk_ || source_ == target_ || target == identity_of(walk_.folder())) return 0;
        made_.insert(target);
        for (Step step = walk_.next(); step != Step::End; step = walk_.next()) {
            if (step == Step::Leave) leave();
            if (step == Step::Entry && !walk_.is_folder()) copy_entry();
            if (step == Step::Entry && walk_.is_folder() && subfolders == Subfolders::Copied) copy_folder();
        }
        return 1;
    }

  private:
    // A link is copied as the file that it names; one to a folder fails in the copy.
    void copy_entry() {
        const mode_t mode = walk_.status().st_mode;
        if (S_ISREG(mode) || S_ISLNK(mode))
            __zel_svc_config_copy_file(join(source_, walk_.below()).c_str(), join(target_, walk_.below()).c_str());
    }

    void copy_folder() {
        if (made_.contains(identity(walk_.status()))) return;
        const std::string target = join(target_, walk_.below());
        if (make_folder(target.c_str())) made_.insert(identity_of(open_folder(target.c_str()).get()));
        if (!walk_.enter()) leave();
    }

    // Attributes come last: a folder that its owner may not write could not be filled behind them.
    void leave() {
        const std::string target = join(target_, walk_.below());
        if (made_.contains(identity_of(open_folder(target.c_str()).get())))
            copy_folder_attr(join(source_, walk_.below()).c_str(), target.c_str());
    }

    std::string source_;
    std::string target_;
    ZelSvcFolderWalk walk_;
    std::set<Identity> made_;
};

int copy_content(const char *source, const char *target, Subfolders subfolders) {
    if (!source || !target) return 0;
    return FolderCopy{source, target}.run(subfolders);
}

// As for the folders below, a new folder's attributes come behind its content.
int make_like(const char *source, const char *target, Content content) {
    if (!source || !target || !open_folder(source)) return 0;
    const bool made = make_folder(target);
    if (!made && !open_folder(target)) return 0;
    if (content == Content::Copied) copy_content(source, target, Subfolders::Copied);
    if (made) copy_folder_attr(source, target);
    return 1;
}

// Removes an entry that is no folder, or an empty folder.
bool remove_entry(int folder, const char *name, bool is_folder) {
    return ::unlinkat(folder, name, is_folder ? AT_REMOVEDIR : 0) == 0;
}

bool clear_content(const char *path) {
    ZelSvcFolderWalk walk{path};
    if (!walk || identity_of(walk.folder()) == identity_of(open_folder("/").get())) return false;
    bool all = true;
    for (Step step = walk.next(); step != Step::End; step = walk.next()) {
        // A folder that cannot be read may still be empty.
        const bool entered = step == Step::Entry && walk.is_folder() && walk.enter();
        if (!entered) all &= remove_entry(walk.folder(), walk.name().c_str(), step == Step::Leave || walk.is_folder());
    }
    return all;
}

bool remove_folder(const char *path) {
    char name[ZEL_PLATFORM_NAME_MAX];
    const ZelSvcFd parent{zel_platform_open_parent(path, name)};
    struct stat status = {};
    if (!parent || ::fstatat(parent.get(), name, &status, AT_SYMLINK_NOFOLLOW) != 0) return false;
    // A link in the folder's place is removed as a link: what it names belongs to someone else.
    if (S_ISLNK(status.st_mode)) return remove_entry(parent.get(), name, false);
    clear_content(path);
    return remove_entry(parent.get(), name, true);
}

} // namespace

int __zel_svc_config_copy_dir(const char *source, const char *target) {
    return copy_content(source, target, Subfolders::Copied);
}

int __zel_svc_config_copy_files(const char *source, const char *target) {
    return copy_content(source, target, Subfolders::Skipped);
}

int __zel_svc_config_create_dir_like(const char *source, const char *target) {
    return make_like(source, target, Content::Left);
}

int zel_svc_file_copy_dir_like(const char *source, const char *target) {
    return make_like(source, target, Content::Copied);
}

int __zel_svc_config_clear_dir(const char *path, int remove_too) {
    if (!path) return 0;
    if (remove_too == 1) return remove_folder(path) ? 1 : 0;
    return clear_content(path) ? 1 : 0;
}
