#include "bookmarks.h"

#include "record.h"

namespace zel_host {
namespace {

constexpr const char *kManual = "user_manual_url";

Bookmark read(const Query &query) {
    return {.id = query.integer(0),
            .parent = query.integer(1),
            .folder = query.integer(2) != 0,
            .editable = query.integer(3) != 0,
            .title = query.text(4),
            .url = query.text(5)};
}

std::vector<std::int64_t> ids_of(Query &query) {
    std::vector<std::int64_t> ids;
    while (query.row())
        ids.push_back(query.integer(0));
    return ids;
}

} // namespace

std::optional<Bookmark> get_bookmark(Phone &phone, std::int64_t id) {
    Query query = phone.store().query("SELECT id, parent, folder, editable, title, url FROM bookmark WHERE id = ?");
    if (!query.bind(id).row()) return std::nullopt;
    return read(query);
}

std::optional<std::int64_t> add_bookmark(Phone &phone, const Bookmark &bookmark) {
    const std::optional<Bookmark> parent = get_bookmark(phone, bookmark.parent);
    if (!parent || !parent->folder) return std::nullopt;
    Query query = phone.store().query(
        "INSERT INTO bookmark (parent, folder, editable, title, url) VALUES (?, ?, ?, ?, ?) RETURNING id");
    query.bind(bookmark.parent).bind(std::int64_t{bookmark.folder}).bind(std::int64_t{bookmark.editable});
    query.bind(bookmark.title).bind(bookmark.url).row();
    const std::int64_t id = query.integer(0);
    query.run();
    return id;
}

std::int64_t folder_titled(Phone &phone, std::string_view title) {
    const std::vector<std::int64_t> found = ids_titled(phone, title, kRootFolder, true);
    if (!found.empty()) return found.front();
    return add_bookmark(phone, {.folder = true, .title = std::string(title), .url = {}}).value_or(kRootFolder);
}

void clear_bookmarks(Phone &phone) {
    phone.store().query("DELETE FROM bookmark WHERE id <> ?").bind(kRootFolder).run();
}

void each_bookmark(Phone &phone, const std::function<void(const Bookmark &bookmark)> &use) {
    Query query =
        phone.store().query("SELECT id, parent, folder, editable, title, url FROM bookmark WHERE id <> ? ORDER BY id");
    query.bind(kRootFolder);
    while (query.row())
        use(read(query));
}

std::vector<std::int64_t> bookmark_ids(Phone &phone) {
    Query query = phone.store().query("SELECT id FROM bookmark WHERE folder = 0 ORDER BY id");
    return ids_of(query);
}

std::vector<std::int64_t> ids_titled(Phone &phone, std::string_view title, std::int64_t parent, bool folder) {
    Query query =
        phone.store().query("SELECT id FROM bookmark WHERE parent = ? AND folder = ? AND title = ? ORDER BY id");
    query.bind(parent).bind(std::int64_t{folder}).bind(title);
    return ids_of(query);
}

std::string user_manual_url(Phone &phone) { return recorded_text(phone, kManual); }

void set_user_manual_url(Phone &phone, std::string_view url) { record(phone, kManual, url); }

} // namespace zel_host
