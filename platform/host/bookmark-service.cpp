#include "bookmarks.h"
#include "call.h"

#include <bookmark.h>
#include <cstdlib>
#include <cstring>
#include <memory>

namespace zel_host {
namespace {

constexpr int kRefused = -1;

struct Free {
    void operator()(char *text) const { std::free(text); }
};
using OwnedText = std::unique_ptr<char, Free>;

bool &is_client() {
    static bool initialized = false;
    return initialized;
}

// A list for the caller to free; null for an empty one.
int give_ids(const std::vector<std::int64_t> &found, int **ids, int *count) {
    int *list = nullptr;
    if (!found.empty()) {
        list = static_cast<int *>(std::calloc(found.size(), sizeof(int)));
        if (list == nullptr) return kRefused;
    }
    for (std::size_t i = 0; i < found.size(); ++i)
        list[i] = static_cast<int>(found[i]);
    *ids = list;
    *count = static_cast<int>(found.size());
    return 0;
}

int give_info(Phone &phone, int id, bookmark_zel_info *info) {
    const std::optional<Bookmark> found = get_bookmark(phone, id);
    if (!found || info == nullptr) return kRefused;
    OwnedText title{::strdup(found->title.c_str())};
    OwnedText url{found->folder ? nullptr : ::strdup(found->url.c_str())};
    if (!title || (!found->folder && !url)) return kRefused;
    *info = {.is_folder = found->folder ? 1 : 0,
             .parent = static_cast<int>(found->parent),
             .editable = found->editable ? 1 : 0,
             .title = title.release(),
             .url = url.release()};
    return 0;
}

int create(Phone &phone, const bookmark_zel_info *info, int *id) {
    if (info == nullptr || info->title == nullptr || id == nullptr) return kRefused;
    const std::optional<std::int64_t> made = add_bookmark(phone, {.parent = info->parent,
                                                                  .folder = info->is_folder != 0,
                                                                  .editable = info->editable != 0,
                                                                  .title = info->title,
                                                                  .url = info->url == nullptr ? "" : info->url});
    if (!made) return kRefused;
    *id = static_cast<int>(*made);
    return 0;
}

int give_manual(Phone &phone, char **url) {
    if (url == nullptr) return kRefused;
    const std::string set = user_manual_url(phone);
    OwnedText copy{set.empty() ? nullptr : ::strdup(set.c_str())};
    if (!set.empty() && !copy) return kRefused;
    *url = copy.release();
    return 0;
}

int take_manual(Phone &phone, const char *url) {
    if (url == nullptr) return kRefused;
    set_user_manual_url(phone, url);
    return 0;
}

} // namespace
} // namespace zel_host

using namespace zel_host;

ZEL_HOST_EXPORT int bookmark_zel_initialize(void) {
    return answer<function("bookmark_zel_initialize")>([](Phone & /*phone*/) {
        is_client() = true;
        return 0;
    });
}

ZEL_HOST_EXPORT int bookmark_zel_deinitialize(void) {
    return answer<function("bookmark_zel_deinitialize")>([](Phone & /*phone*/) {
        if (!is_client()) return kRefused;
        is_client() = false;
        return 0;
    });
}

ZEL_HOST_EXPORT int bookmark_zel_get_root(int *id) {
    return answer<function("bookmark_zel_get_root")>([id](Phone & /*phone*/) {
        if (!is_client() || id == nullptr) return kRefused;
        *id = static_cast<int>(kRootFolder);
        return 0;
    });
}

ZEL_HOST_EXPORT int bookmark_zel_get_full_ids_p(int **ids, int *count) {
    return answer<function("bookmark_zel_get_full_ids_p")>([&](Phone &phone) {
        if (!is_client() || ids == nullptr || count == nullptr) return kRefused;
        return give_ids(bookmark_ids(phone), ids, count);
    });
}

ZEL_HOST_EXPORT int bookmark_zel_get_info(int id, struct bookmark_zel_info *info) {
    return answer<function("bookmark_zel_get_info")>(
        [&](Phone &phone) { return is_client() ? give_info(phone, id, info) : kRefused; }, id);
}

ZEL_HOST_EXPORT int bookmark_zel_get_duplicated_title_ids_p(const char *title, int parent, int is_folder, int **ids,
                                                            int *count) {
    return answer<function("bookmark_zel_get_duplicated_title_ids_p")>(
        [&](Phone &phone) {
            if (!is_client() || title == nullptr || ids == nullptr || count == nullptr) return kRefused;
            return give_ids(ids_titled(phone, title, parent, is_folder != 0), ids, count);
        },
        title, parent, is_folder);
}

ZEL_HOST_EXPORT int bookmark_zel_create(const struct bookmark_zel_info *info, int *id) {
    const char *title = info == nullptr ? nullptr : info->title;
    const int parent = info == nullptr ? 0 : info->parent;
    return answer<function("bookmark_zel_create")>(
        [&](Phone &phone) { return is_client() ? create(phone, info, id) : kRefused; }, title, parent);
}

ZEL_HOST_EXPORT int bookmark_zel_reset(void) {
    return answer<function("bookmark_zel_reset")>([](Phone &phone) {
        if (!is_client()) return kRefused;
        clear_bookmarks(phone);
        return 0;
    });
}

ZEL_HOST_EXPORT int bookmark_zel_get_user_manual_url(char **url) {
    return answer<function("bookmark_zel_get_user_manual_url")>(
        [url](Phone &phone) { return is_client() ? give_manual(phone, url) : kRefused; });
}

ZEL_HOST_EXPORT int bookmark_zel_set_user_manual_url(const char *url) {
    return answer<function("bookmark_zel_set_user_manual_url")>(
        [url](Phone &phone) { return is_client() ? take_manual(phone, url) : kRefused; }, url);
}
