#include "base/zel-svc-file-attr.h"

#include "base/zel-svc-free.h"

#include <security-server.h>
#include <smack.h>
#include <zel-platform.h>

#include <fcntl.h>
#include <sys/stat.h>

namespace {

void copy_label(const char *source, const char *target) {
    char *label = nullptr;
    // The label call does not follow links, but what is copied is the file behind them.
    if (smack_lgetlabel(zel_svc_file_behind_links(source).c_str(), &label) != 0) return;
    const ZelSvcOwnedText owned{label};
    if (owned) security_server_label_access(target, owned.get());
}

} // namespace

void __zel_svc_config_set_file_attr(const char *path, int mode, int uid, int gid, const char *label) {
    if (!path) return;
    const bool has_owner = uid >= 0 && gid >= 0;
    if (const ZelSvcFd file = mode >= 0 || has_owner ? zel_svc_file_open_any(path) : ZelSvcFd{}) {
        // A change of owner drops the set-id bits, so the mode comes behind it.
        if (has_owner) zel_platform_set_owner(file.get(), static_cast<uid_t>(uid), static_cast<gid_t>(gid));
        if (mode >= 0) ::fchmod(file.get(), static_cast<mode_t>(mode));
    }
    if (label) security_server_label_access(path, label);
}

void zel_svc_file_set_output_attr(const char *path, const char *label) {
    __zel_svc_config_set_file_attr(path, 0644, ZEL_SVC_FILE_OWNER, ZEL_SVC_FILE_GROUP, label);
}

ZelSvcFd zel_svc_file_open_output(const char *path, const char *label) {
    ZelSvcFd file = zel_svc_file_open(path, O_RDWR | O_CREAT | O_TRUNC, 0644);
    if (file) zel_svc_file_set_output_attr(path, label);
    return file;
}

void zel_svc_file_copy_attr(int source_fd, const char *source, int target_fd, const char *target) {
    uid_t uid = 0;
    gid_t gid = 0;
    if (zel_platform_get_owner(source_fd, &uid, &gid) == 0) zel_platform_set_owner(target_fd, uid, gid);
    copy_label(source, target);
    // The mode comes last: a change of owner drops set-id bits, and a read-only file takes no label.
    struct stat status = {};
    if (::fstat(source_fd, &status) == 0) ::fchmod(target_fd, status.st_mode & 07777U);
}
