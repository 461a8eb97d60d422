#pragma once
// The bookmark service's own data: bookmarks and folders under one numbering, and the user manual's address.

#include "phone.h"

#include <cstdint>
#include <functional>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace zel_host {

inline constexpr std::int64_t kRootFolder = 1; // there from the phone's making on

struct Bookmark {
    std::int64_t id = 0;
    std::int64_t parent = kRootFolder;
    bool folder = false;
    bool editable = true;
    std::string title;
    std::string url;
};

std::optional<Bookmark> get_bookmark(Phone &phone, std::int64_t id);
// The id of the new one; nothing when its parent is no folder.
std::optional<std::int64_t> add_bookmark(Phone &phone, const Bookmark &bookmark);
// The folder of this title directly in the root, made when there is none.
std::int64_t folder_titled(Phone &phone, std::string_view title);
void clear_bookmarks(Phone &phone); // all but the root
// All of them but the root, in the order of their making.
void each_bookmark(Phone &phone, const std::function<void(const Bookmark &bookmark)> &use);

std::vector<std::int64_t> bookmark_ids(Phone &phone); // without folders
std::vector<std::int64_t> ids_titled(Phone &phone, std::string_view title, std::int64_t parent, bool folder);

std::string user_manual_url(Phone &phone); // empty when none was set
void set_user_manual_url(Phone &phone, std::string_view url);

} // namespace zel_host
