#include "resolve.h"

#include <array>
#include <cerrno>
#include <climits>
#include <cstdlib>
#include <cstring>
#include <fcntl.h>
#include <linux/openat2.h>
#include <sys/stat.h>
#include <sys/syscall.h>
#include <vector>

namespace zel_host {
namespace {

constexpr int kMaxLinks = 40; // as the kernel's own limit

bool walk_by_environment() {
    const char *resolver = std::getenv("ZEL_HOST_RESOLVER");
    return resolver != nullptr && std::strcmp(resolver, "walk") == 0;
}

bool &walk_only() {
    static bool on = walk_by_environment();
    return on;
}

// The next component of a path; empty at its end. Slashes around it are taken off.
std::string_view take_component(std::string_view &path) {
    while (path.starts_with('/'))
        path.remove_prefix(1);
    const std::string_view component = path.substr(0, path.find('/'));
    path.remove_prefix(component.size());
    return component;
}

bool has_more(std::string_view rest) { return rest.find_first_not_of('/') != std::string_view::npos; }

// True when a path without links steps into the state folder, be it only to leave it again.
bool steps_into_state(std::string_view path) {
    int depth = 0;
    while (true) {
        const std::string_view component = take_component(path);
        if (component.empty()) return false;
        if (component == ".") continue;
        if (component == "..") {
            depth -= depth > 0 ? 1 : 0;
            continue;
        }
        if (depth == 0 && component == kStateFolder) return true;
        ++depth;
    }
}

// Most paths hold no link: the kernel takes them in one call, and the text alone says whether the state
// folder is met.
int open_without_links(int root, const std::string &path) {
    open_how how{};
    how.flags = O_PATH | O_CLOEXEC;
    how.resolve = RESOLVE_IN_ROOT | RESOLVE_NO_MAGICLINKS | RESOLVE_NO_SYMLINKS;
    return static_cast<int>(::syscall(SYS_openat2, root, path.c_str(), &how, sizeof how));
}

// Reads a link that is open as an O_PATH descriptor.
bool read_link(int fd, std::string &target) {
    std::array<char, PATH_MAX> text{};
    const ssize_t size = ::readlinkat(fd, "", text.data(), text.size());
    if (size <= 0 || size == static_cast<ssize_t>(text.size())) return false;
    target.assign(text.data(), static_cast<std::size_t>(size));
    return true;
}

bool is_link(int fd) {
    struct stat status {};
    return ::fstat(fd, &status) == 0 && S_ISLNK(status.st_mode);
}

bool is_folder(int fd) {
    struct stat status {};
    return ::fstat(fd, &status) == 0 && S_ISDIR(status.st_mode);
}

// Walks a path by its components. The open folders from the root down are kept, so ".." can never be
// answered by the workstation.
class Walk {
  public:
    Walk(int root, std::string_view path, Follow follow) : root_(root), rest_(path), follow_(follow) {}

    Place run() {
        while (place_.error == 0 && !place_.file) {
            const std::string_view component = next();
            if (component.empty()) return arrive();
            step(std::string(component));
        }
        return std::move(place_);
    }

  private:
    [[nodiscard]] int here() const { return folders_.empty() ? root_ : folders_.back().get(); }

    std::string_view next() {
        std::string_view path = rest_;
        const std::string_view component = take_component(path);
        left_ = path;
        return component;
    }

    Place arrive() {
        place_.file = Fd(::openat(here(), ".", O_PATH | O_CLOEXEC));
        if (!place_.file) place_.error = errno;
        return std::move(place_);
    }

    void step(const std::string &component) {
        const bool last = !has_more(left_);
        const bool slash_follows = !left_.empty();
        std::string left(left_);
        if (component == ".") return continue_with(std::move(left));
        if (component == "..") {
            if (!folders_.empty()) folders_.pop_back();
            return continue_with(std::move(left));
        }
        Fd entry = open_entry(component);
        if (!entry) return miss(component, last && !slash_follows);
        const bool follow = !last || slash_follows || follow_ == Follow::Last;
        if (is_link(entry.get()) && follow) return follow_link(entry.get(), left);
        if (!is_folder(entry.get()) && (!last || slash_follows)) return fail(ENOTDIR);
        if (last && !is_folder(entry.get())) {
            place_.file = std::move(entry);
            return;
        }
        folders_.push_back(std::move(entry));
        continue_with(std::move(left));
    }

    Fd open_entry(const std::string &component) {
        if (folders_.empty() && component == kStateFolder) {
            errno = ENOENT;
            state_folder_met_ = true;
            return {};
        }
        return Fd(::openat(here(), component.c_str(), O_PATH | O_NOFOLLOW | O_CLOEXEC));
    }

    void miss(const std::string &component, bool last) {
        const int error = errno;
        if (error == ENOENT && last && !state_folder_met_) {
            place_.missing_in = Fd(::openat(here(), ".", O_PATH | O_DIRECTORY | O_CLOEXEC));
            place_.name = component;
        }
        fail(error);
    }

    void follow_link(int link, const std::string &left) {
        std::string target;
        if (++links_ > kMaxLinks || !read_link(link, target)) return fail(ELOOP);
        if (target.starts_with('/')) folders_.clear();
        continue_with(target + left);
    }

    void continue_with(std::string rest) {
        text_ = std::move(rest);
        rest_ = text_;
    }

    void fail(int error) { place_.error = error; }

    int root_;
    std::string text_;
    std::string_view rest_;
    std::string_view left_;
    Follow follow_;
    int links_ = 0;
    bool state_folder_met_ = false;
    std::vector<Fd> folders_;
    Place place_;
};

bool plain_name(std::string_view name) { return !name.empty() && name != "." && name != ".."; }

int parent_error(std::string_view path, std::string_view name) {
    if (!path.starts_with('/') || !plain_name(name)) return EINVAL;
    return name.size() > NAME_MAX ? ENAMETOOLONG : 0;
}

bool same_file(int a, int b) {
    struct stat first {};
    struct stat second {};
    return ::fstat(a, &first) == 0 && ::fstat(b, &second) == 0 && first.st_dev == second.st_dev &&
           first.st_ino == second.st_ino;
}

// Resolves a path without links. False when there is one, or anything else that only the walk can tell.
bool resolve_at_once(int root, std::string_view path, Place &place) {
    place.file = Fd(open_without_links(root, std::string(path)));
    if (place.file) return true;
    const std::size_t cut = path.rfind('/') + 1;
    if (errno != ENOENT || !plain_name(path.substr(cut))) return false;
    place.missing_in = Fd(open_without_links(root, std::string(path.substr(0, cut))));
    if (place.missing_in && !is_folder(place.missing_in.get())) return false;
    if (place.missing_in) place.name = path.substr(cut);
    place.error = ENOENT;
    return true;
}

} // namespace

Place resolve(int root, std::string_view path, Follow follow) {
    Place place;
    if (!path.starts_with('/')) place.error = path.empty() ? ENOENT : EINVAL;
    if (path.size() >= PATH_MAX) place.error = ENAMETOOLONG;
    if (place.error != 0) return place;
    if (!walk_only() && !steps_into_state(path) && resolve_at_once(root, path, place)) return place;
    return Walk(root, path, follow).run();
}

NameInFolder resolve_parent(int root, std::string_view path) {
    const std::string_view whole = path.substr(0, path.find_last_not_of('/') + 1);
    const std::size_t cut = whole.rfind('/') + 1;
    NameInFolder result{.folder = {}, .name = std::string(whole.substr(cut))};
    errno = parent_error(path, result.name);
    if (errno != 0) return result;
    Place place = resolve(root, path.substr(0, cut), Follow::Last);
    errno = place.error;
    if (!place.file) return result;
    if (!is_folder(place.file.get())) errno = ENOTDIR;
    if (result.name == kStateFolder && same_file(place.file.get(), root)) errno = ENOENT;
    if (errno == 0) result.folder = std::move(place.file);
    return result;
}

std::string real_path(int fd) {
    std::array<char, PATH_MAX> text{};
    const std::string link = "/proc/self/fd/" + std::to_string(fd);
    const ssize_t size = ::readlink(link.c_str(), text.data(), text.size());
    return size > 0 ? std::string(text.data(), static_cast<std::size_t>(size)) : std::string();
}

void resolve_by_walk_only(bool on) { walk_only() = on; }

} // namespace zel_host
