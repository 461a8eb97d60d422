#include "tool-behaviour.h"

#include "applications.h"
#include "content.h"
#include "folder.h"
#include "open-file.h"

#include <algorithm>
#include <array>
#include <cstdio>
#include <fcntl.h>
#include <iniparser/iniparser.h>
#include <memory>

namespace zel_host {
namespace {

constexpr int kDone = 0;
constexpr int kFailed = 1;
constexpr std::string_view kSuccess = "success";

struct FreeList {
    void operator()(dictionary *list) const { iniparser_freedict(list); }
};
using List = std::unique_ptr<dictionary, FreeList>;

List load_list(Phone &phone, std::string_view path) {
    const Fd file(open_file(phone, path, O_RDONLY, 0));
    return List(file ? iniparser_load(("/proc/self/fd/" + std::to_string(file.get())).c_str()) : nullptr);
}

// "name_007"
std::string numbered(const char *word, int number) {
    std::array<char, 16> digits{};
    std::snprintf(digits.data(), digits.size(), "_%03d", number);
    return word + std::string(digits.data());
}

const char *listed(const List &list, const char *word, int number) {
    return iniparser_getstring(list.get(), ("zel packages:" + numbered(word, number)).c_str(), nullptr);
}

std::string install(Phone &phone, const char *name, const char *type) {
    Application found = application(phone, name);
    if (!found.refusal.empty()) return found.refusal;
    found.type = type == nullptr ? "" : type;
    found.state = "installed";
    keep_application(phone, found);
    return std::string(kSuccess);
}

// A file of results holds lines of 1,022 bytes and texts between quotes: other names are refused, and not told.
bool is_name(std::string_view name) {
    return !name.empty() && name.size() <= kLongestInResult && name.find('"') == std::string_view::npos;
}

// What is said about one application of a list.
std::string result_of(Phone &phone, const char *name, const char *type, int number) {
    const bool named = is_name(name);
    const std::string answer = named ? install(phone, name, type) : "wrong name";
    return numbered("description", number) + " = \"path=" + (named ? name : "") + ":op=install\"\n" +
           numbered("result", number) + " = \"" + answer + "\"\n";
}

// pkgcmd -S LIST -p RESULTS: every application of the list, and what became of it.
int install_list(Phone &phone, const Words &words) {
    const List list = load_list(phone, word_after(words, "-S"));
    if (list == nullptr) return kFailed;
    std::string results;
    int count = 0;
    while (const char *name = listed(list, "name", count + 1)) {
        ++count;
        results += result_of(phone, name, listed(list, "type", count), count);
    }
    const Fd file(open_file(phone, word_after(words, "-p"), O_WRONLY | O_CREAT | O_TRUNC, 0644));
    const std::string head = "[result]\ncount = " + std::to_string(count) + "\n";
    return file && write_content(file.get(), head + results) ? kDone : kFailed;
}

// pkg -d NAME
int disable(Phone &phone, const Words &words) {
    Application found = application(phone, word_after(words, "-d"));
    if (found.name.empty() || !found.refusal.empty()) return kFailed;
    found.state = "disabled";
    keep_application(phone, found);
    return kDone;
}

// The NAME of "path=NAME:op=uninstall:removable=true"
std::string_view name_to_uninstall(std::string_view request) {
    constexpr std::string_view kPath = "path=";
    if (!request.starts_with(kPath) || request.find(":op=uninstall") == std::string_view::npos) return {};
    request.remove_prefix(kPath.size());
    return request.substr(0, request.find(':'));
}

void remove_files(Phone &phone, std::string_view name) {
    if (name.find('/') != std::string_view::npos) return;
    const NameInFolder place = resolve_parent(phone.folder(), "/opt/usr/apps/" + std::string(name));
    if (place.folder) remove_tree(place.folder.get(), place.name);
}

// rpm-backend -c path=NAME:op=uninstall:removable=true
int uninstall(Phone &phone, const Words &words) {
    Application found = application(phone, name_to_uninstall(word_after(words, "-c")));
    if (found.name.empty() || !found.refusal.empty()) return kFailed;
    remove_files(phone, found.name);
    found.state = "removed";
    keep_application(phone, found);
    return kDone;
}

constexpr Behaviour kBehaviours[] = {
    {.name = "install-list", .run = install_list},
    {.name = "disable", .run = disable},
    {.name = "uninstall", .run = uninstall},
};

} // namespace

std::string_view word_after(const Words &words, std::string_view option) {
    const auto found = std::find(words.begin(), words.end(), option);
    return words.end() - found < 2 ? std::string_view() : *(found + 1);
}

const Behaviour *find_behaviour(std::string_view name) {
    const auto *row = std::find_if(std::begin(kBehaviours), std::end(kBehaviours),
                                   [name](const Behaviour &behaviour) { return behaviour.name == name; });
    return row == std::end(kBehaviours) ? nullptr : row;
}

} // namespace zel_host
