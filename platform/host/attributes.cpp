#include "attributes.h"

#include <array>
#include <cerrno>
#include <charconv>
#include <cstdlib>
#include <cstring>
#include <fcntl.h>
#include <sys/stat.h>
#include <sys/xattr.h>

namespace zel_host {
namespace {

constexpr const char *kLabel = "user.zel.label";
constexpr const char *kOwner = "user.zel.owner";
constexpr std::size_t kMaxSize = 4096;

bool table_by_environment() {
    const char *place = std::getenv("ZEL_HOST_ATTRIBUTES");
    return place != nullptr && std::strcmp(place, "table") == 0;
}

bool &table_only() {
    static bool on = table_by_environment();
    return on;
}

// The attribute calls for open files refuse O_PATH descriptors; their /proc name serves every kind.
std::string name_of(int fd) { return "/proc/self/fd/" + std::to_string(fd); }

struct Identity {
    std::int64_t device = 0;
    std::int64_t inode = 0;
    std::int64_t birth = 0; // tells a new file from a deleted one with the same inode; 0 where unknown
};

bool identify(int fd, Identity &identity) {
    struct statx status {};
    if (::statx(fd, "", AT_EMPTY_PATH, STATX_INO | STATX_BTIME, &status) != 0) return false;
    identity.device = static_cast<std::int64_t>(status.stx_dev_major) << 32 | status.stx_dev_minor;
    identity.inode = static_cast<std::int64_t>(status.stx_ino);
    if ((status.stx_mask & STATX_BTIME) != 0)
        identity.birth = status.stx_btime.tv_sec * 1'000'000'000 + status.stx_btime.tv_nsec;
    return true;
}

int put_in_table(Phone &phone, int fd, const char *name, std::string_view value) {
    Identity file;
    if (!identify(fd, file)) return errno;
    Query query = phone.store().query(
        "INSERT OR REPLACE INTO attribute (device, inode, birth, name, value) VALUES (?, ?, ?, ?, ?)");
    query.bind(file.device).bind(file.inode).bind(file.birth).bind(name).bind(value).run();
    return 0;
}

std::optional<std::string> get_from_table(Phone &phone, int fd, const char *name) {
    Identity file;
    if (!identify(fd, file)) return std::nullopt;
    Query query =
        phone.store().query("SELECT value FROM attribute WHERE device = ? AND inode = ? AND birth = ? AND name = ?");
    if (!query.bind(file.device).bind(file.inode).bind(file.birth).bind(name).row()) return std::nullopt;
    return query.text(0);
}

int put(Phone &phone, int fd, const char *name, std::string_view value) {
    if (::fcntl(fd, F_GETFD) < 0) return errno;
    if (!table_only() && ::setxattr(name_of(fd).c_str(), name, value.data(), value.size(), 0) == 0) return 0;
    return put_in_table(phone, fd, name, value);
}

std::optional<std::string> get(Phone &phone, int fd, const char *name) {
    std::array<char, kMaxSize> value{};
    if (!table_only()) {
        const ssize_t size = ::getxattr(name_of(fd).c_str(), name, value.data(), value.size());
        if (size >= 0) return std::string(value.data(), static_cast<std::size_t>(size));
    }
    return get_from_table(phone, fd, name);
}

std::optional<Owner> parse_owner(std::string_view text) {
    Owner owner;
    const std::size_t colon = text.find(':');
    if (colon == std::string_view::npos) return std::nullopt;
    const std::string_view group = text.substr(colon + 1);
    const auto user_end = std::from_chars(text.data(), text.data() + colon, owner.user);
    const auto group_end = std::from_chars(group.data(), group.data() + group.size(), owner.group);
    if (user_end.ec != std::errc{} || group_end.ec != std::errc{}) return std::nullopt;
    return owner;
}

} // namespace

int set_label(Phone &phone, int fd, std::string_view label) {
    if (label.size() > kMaxSize) return E2BIG;
    return put(phone, fd, kLabel, label);
}

std::optional<std::string> get_label(Phone &phone, int fd) { return get(phone, fd, kLabel); }

int set_owner(Phone &phone, int fd, Owner owner) {
    // A plain user may not give files away: the record below stands for it.
    static_cast<void>(::fchownat(fd, "", owner.user, owner.group, AT_EMPTY_PATH) == 0);
    return put(phone, fd, kOwner, std::to_string(owner.user) + ":" + std::to_string(owner.group));
}

std::optional<Owner> get_owner(Phone &phone, int fd) {
    const std::optional<std::string> recorded = get(phone, fd, kOwner);
    if (recorded) return parse_owner(*recorded);
    struct stat status {};
    if (::fstatat(fd, "", &status, AT_EMPTY_PATH) != 0) return std::nullopt;
    return Owner{.user = status.st_uid, .group = status.st_gid};
}

void keep_attributes_in_table(bool on) { table_only() = on; }

} // namespace zel_host
