#include "attributes.h"
#include "content.h"
#include "folder.h"
#include "listing.h"
#include "open-file.h"
#include "text.h"
#include "verb.h"

#include <array>
#include <cerrno>
#include <climits>
#include <cstring>
#include <fcntl.h>
#include <sys/stat.h>

namespace zel_host {
namespace {

const char *kind_of(mode_t mode) {
    if (S_ISREG(mode)) return "file";
    if (S_ISDIR(mode)) return "folder";
    if (S_ISLNK(mode)) return "link";
    return "special";
}

[[noreturn]] void fail(const std::string &path, int error) {
    throw VerbFailed("'" + path + "': " + std::strerror(error));
}

std::string octal(mode_t mode) {
    std::array<char, 8> text{};
    std::snprintf(text.data(), text.size(), "%04o", mode & 07777U);
    return text.data();
}

// One entry by its O_PATH descriptor.
Json shown(Phone &phone, const std::string &path, int fd) {
    struct stat status {};
    if (::fstat(fd, &status) != 0) fail(path, errno);
    const std::optional<Owner> owner = get_owner(phone, fd);
    const std::optional<std::string> label = get_label(phone, fd);
    Json result{{"kind", kind_of(status.st_mode)},
                {"mode", octal(status.st_mode)},
                {"size", status.st_size},
                {"mtime", status.st_mtime},
                {"owner", owner ? Json(owner->user) : Json()},
                {"group", owner ? Json(owner->group) : Json()},
                {"label", nullptr}};
    put_text(result, "path", path);
    if (label) put_text(result, "label", *label);
    if (S_ISLNK(status.st_mode)) put_text(result, "target", link_target(fd, ""));
    return result;
}

Place found(Phone &phone, const std::string &path, Follow follow) {
    Place place = resolve(phone.folder(), path, follow);
    if (!place.file) fail(path, place.error);
    return place;
}

Json show_entry(Phone &phone, const Json &arguments) {
    const std::string path = text_of(arguments, "path");
    return shown(phone, path, found(phone, path, Follow::NotLast).file.get());
}

class Tree {
  public:
    Tree(Phone &phone, std::int64_t depth) : phone_(phone), deepest_(depth) {}

    void add_below(const std::string &path, int folder, std::int64_t depth) {
        if (depth > deepest_) return;
        const std::string prefix = path + "/";
        const bool root = is_root(phone_, folder);
        for (const std::string &name : names_in(folder))
            if (!root || name != kStateFolder) add(std::string(prefix).append(name), folder, name, depth);
    }

    Json entries = Json::array();

  private:
    void add(const std::string &path, int folder, const std::string &name, std::int64_t depth) {
        const Fd entry(::openat(folder, name.c_str(), O_PATH | O_NOFOLLOW | O_CLOEXEC));
        if (!entry) return; // gone meanwhile
        entries.push_back(shown(phone_, path, entry.get()));
        if (entries.back().at("kind") == "folder") add_below(path, entry.get(), depth + 1);
    }

    Phone &phone_;
    std::int64_t deepest_;
};

Json show_tree(Phone &phone, const Json &arguments) {
    std::string path = text_of(arguments, "path", "/");
    const Place place = found(phone, path, Follow::Last);
    while (path.ends_with('/'))
        path.pop_back();
    Tree tree(phone, number_of(arguments, "depth", INT_MAX));
    tree.add_below(path, place.file.get(), 1);
    return {{"entries", std::move(tree.entries)}};
}

Json read_file(Phone &phone, const Json &arguments) {
    const std::string path = text_of(arguments, "path");
    const Fd file(open_file(phone, path, O_RDONLY, 0));
    if (!file) fail(path, errno);
    struct stat status {};
    if (::fstat(file.get(), &status) == 0 && S_ISDIR(status.st_mode)) fail(path, EISDIR);
    Json result;
    put_text(result, "path", path);
    put_text(result, "content", read_content(file.get()));
    return result;
}

constexpr Argument kPathArguments[] = {{.name = "path", .required = true, .help = "Path on the phone"}};
constexpr Argument kTreeArguments[] = {
    {.name = "path", .help = "Folder on the phone; all of it without one"},
    {.name = "depth", .type = ArgumentType::Integer, .help = "How many levels; all without it"},
};

constexpr Verb kVerbs[] = {
    {.name = "stat",
     .help = "Show a file's kind, mode, owner and label",
     .arguments = kPathArguments,
     .run = show_entry},
    {.name = "tree", .help = "Show what is in a folder", .arguments = kTreeArguments, .run = show_tree},
    {.name = "read", .help = "Show the content of a file", .arguments = kPathArguments, .run = read_file},
};

} // namespace

std::span<const Verb> file_verbs() { return kVerbs; }

} // namespace zel_host
