#pragma once
// Files of the phone: attributes, copies, emptied folders. Every path is the phone's own. All failures are
// silent (a result of 0); callers log.

#include <cstddef>
#include <string>
#include <string_view>
#include <sys/types.h>

inline constexpr uid_t ZEL_SVC_FILE_OWNER = 200;
inline constexpr gid_t ZEL_SVC_FILE_GROUP = 5000;

// An open file descriptor that closes itself. Closed (-1) by default.
class ZelSvcFd {
  public:
    ZelSvcFd() = default;
    explicit ZelSvcFd(int fd) : fd_(fd) {}
    ZelSvcFd(ZelSvcFd &&other) noexcept : fd_(other.release()) {}
    ZelSvcFd &operator=(ZelSvcFd &&other) noexcept;
    ZelSvcFd(const ZelSvcFd &) = delete;
    ZelSvcFd &operator=(const ZelSvcFd &) = delete;
    ~ZelSvcFd();

    [[nodiscard]] int get() const { return fd_; }
    explicit operator bool() const { return fd_ >= 0; }
    int release();
    void close();

  private:
    int fd_ = -1;
};

// Opens a regular file or, with O_DIRECTORY, a folder of the phone.
ZelSvcFd zel_svc_file_open(const char *path, int flags, mode_t mode = 0);

// Writes or reads everything, interrupted calls included. Writing returns false when it fell short; reading
// returns the bytes read, less than `size` at the end of the file or after a failure.
bool zel_svc_file_write_all(int fd, std::string_view bytes);
std::size_t zel_svc_file_read_all(int fd, char *bytes, std::size_t size);

// Unlinks a file (or link) of the phone; 0 on success, -1 otherwise, as remove(3).
int zel_svc_file_remove(const char *path);

// Mode (unless negative), owner (unless either id is negative) and security label (unless null) of a file.
void __zel_svc_config_set_file_attr(const char *path, int mode, int uid, int gid, const char *label);

// The attributes that logs, reports, state files and status files share: 0644, 200, 5000 and the label.
void zel_svc_file_set_output_attr(const char *path, const char *label);

// Empties such a file, or makes it, and opens it for reading and writing.
ZelSvcFd zel_svc_file_open_output(const char *path, const char *label);

// 1 when the path opens for reading, a folder included, else 0.
int __zel_svc_config_file_exists(const char *path);

// Copies one regular file, a link to one included, with the source's permissions, owner and label; the
// target's times become 2014-01-01 00:00:01 local time. 0 when both names are one file, when the source is
// no regular file, or when reading or writing fails; a target that this copy created is then removed.
int __zel_svc_config_copy_file(const char *source, const char *target);

// Copies what is inside a folder into another, recursively; created subfolders get the source's attributes.
// Links to folders and special files are skipped. 0 when both are one folder or the source does not open.
int __zel_svc_config_copy_dir(const char *source, const char *target);
// The same for the files directly in the folder.
int __zel_svc_config_copy_files(const char *source, const char *target);

// Creates `target` with the source folder's attributes; 1 when done.
int __zel_svc_config_create_dir_like(const char *source, const char *target);
// The same with the content behind it; a folder that was there keeps its attributes.
int zel_svc_file_copy_dir_like(const char *source, const char *target);

// Removes everything inside a folder, links unfollowed, and with remove_too the folder itself.
int __zel_svc_config_clear_dir(const char *path, int remove_too);

// The text after the last "/" that stands at index 1 or later; the whole path when there is none.
std::string_view zel_svc_file_name_part(std::string_view path);
