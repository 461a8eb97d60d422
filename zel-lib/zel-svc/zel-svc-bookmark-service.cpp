#include "zel-svc-bookmark-service.h"

#include "base/zel-svc-free.h"
#include "base/zel-svc-text.h"

#include <bookmark.h>

namespace {

std::string string_of(const ZelSvcOwnedText &text) { return std::string{zel_svc_text_view(text.get())}; }

std::vector<int> list_of(const ZelSvcOwned<int> &ids, int count) {
    if (!ids || count <= 0) return {};
    return {ids.get(), ids.get() + count};
}

std::optional<int> create(const bookmark_zel_info &info) {
    int id = 0;
    if (bookmark_zel_create(&info, &id) != 0) return std::nullopt;
    return id;
}

} // namespace

BookmarkService::BookmarkService() : open_{bookmark_zel_initialize() == 0} {}

bool BookmarkService::close() {
    if (!open_) return false;
    open_ = false;
    return bookmark_zel_deinitialize() == 0;
}

std::optional<int> BookmarkService::root() const {
    int id = 0;
    if (bookmark_zel_get_root(&id) != 0) return std::nullopt;
    return id;
}

std::optional<std::vector<int>> BookmarkService::ids() const {
    int *raw = nullptr;
    int count = 0;
    if (bookmark_zel_get_full_ids_p(&raw, &count) != 0) return std::nullopt;
    const ZelSvcOwned<int> owned{raw};
    return list_of(owned, count);
}

std::optional<BookmarkService::Info> BookmarkService::info(int id) const {
    bookmark_zel_info raw{};
    if (bookmark_zel_get_info(id, &raw) != 0) return std::nullopt;
    const ZelSvcOwnedText title{raw.title};
    const ZelSvcOwnedText url{raw.url};
    return Info{.parent = raw.parent, .editable = raw.editable != 0, .title = string_of(title), .url = string_of(url)};
}

std::optional<std::vector<int>> BookmarkService::folders_titled(const char *title, int parent) const {
    int *raw = nullptr;
    int count = 0;
    if (bookmark_zel_get_duplicated_title_ids_p(title, parent, 1, &raw, &count) != 0) return std::nullopt;
    const ZelSvcOwned<int> owned{raw};
    return list_of(owned, count);
}

std::optional<int> BookmarkService::create_folder(std::string title, int parent) const {
    return create({.is_folder = 1, .parent = parent, .editable = 1, .title = title.data(), .url = nullptr});
}

std::optional<int> BookmarkService::create_bookmark(Info bookmark) const {
    return create({.is_folder = 0,
                   .parent = bookmark.parent,
                   .editable = bookmark.editable ? 1 : 0,
                   .title = bookmark.title.data(),
                   .url = bookmark.url.data()});
}

void BookmarkService::reset() const { bookmark_zel_reset(); }

std::optional<std::string> BookmarkService::manual_url() const {
    char *raw = nullptr;
    if (bookmark_zel_get_user_manual_url(&raw) != 0) return std::nullopt;
    return string_of(ZelSvcOwnedText{raw});
}

bool BookmarkService::set_manual_url(const char *url) const { return bookmark_zel_set_user_manual_url(url) == 0; }
