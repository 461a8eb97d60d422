// The bench phone's bookmark service, through its client functions and through the verbs.

#include "support/bench-phone.h"

#include <bookmark.h>
#include <cstdlib>
#include <gmock/gmock.h>

namespace {

using nlohmann::json;
using ::testing::ElementsAre;
using ::testing::IsEmpty;

struct BookmarkService : zel_test::BenchPhone {
    static int make(const char *title, int parent = 1, bool folder = false, const char *url = "http://x") {
        std::string text = title;
        std::string address = url;
        const bookmark_zel_info info{.is_folder = folder ? 1 : 0,
                                     .parent = parent,
                                     .editable = 1,
                                     .title = text.data(),
                                     .url = folder ? nullptr : address.data()};
        int id = -1;
        return bookmark_zel_create(&info, &id) == 0 ? id : -1;
    }

    static std::vector<int> taken(int *ids, int count) {
        const std::vector<int> list(ids, ids + count);
        std::free(ids);
        return list;
    }

    static std::vector<int> all_ids() {
        int *ids = nullptr;
        int count = -1;
        EXPECT_EQ(bookmark_zel_get_full_ids_p(&ids, &count), 0);
        return taken(ids, count);
    }

    static std::vector<int> titled(const char *title, int parent, int is_folder) {
        int *ids = nullptr;
        int count = -1;
        EXPECT_EQ(bookmark_zel_get_duplicated_title_ids_p(title, parent, is_folder, &ids, &count), 0);
        return taken(ids, count);
    }
};

TEST_F(BookmarkService, ListsBookmarksWithoutFoldersInOrder) {
    ASSERT_EQ(bookmark_zel_initialize(), 0);
    EXPECT_THAT(all_ids(), IsEmpty());
    const int folder = make("News", 1, true);
    const int inside = make("Morning", folder);
    const int outside = make("Portal");
    EXPECT_THAT(all_ids(), ElementsAre(inside, outside));
    EXPECT_EQ(bookmark_zel_deinitialize(), 0);
}

TEST_F(BookmarkService, FindsTitlesDirectlyInAFolder) {
    ASSERT_EQ(bookmark_zel_initialize(), 0);
    const int folder = make("News", 1, true);
    const int bookmark = make("News");
    const int second = make("News", 1, true);
    const int below = make("News", folder, true);
    EXPECT_THAT(titled("News", 1, 1), ElementsAre(folder, second));
    EXPECT_THAT(titled("News", 1, 0), ElementsAre(bookmark));
    EXPECT_THAT(titled("News", folder, 1), ElementsAre(below));
    EXPECT_THAT(titled("news", 1, 1), IsEmpty());
}

TEST_F(BookmarkService, TellsWhatItKnows) {
    call("bookmarks-add", {{"title", "Portal"}, {"url", "http://p"}, {"folder", "News"}, {"fixed", true}});
    ASSERT_EQ(bookmark_zel_initialize(), 0);
    const int id = all_ids().at(0);
    bookmark_zel_info info{};
    ASSERT_EQ(bookmark_zel_get_info(id, &info), 0);
    EXPECT_EQ(info.is_folder, 0);
    EXPECT_EQ(info.editable, 0);
    EXPECT_STREQ(info.title, "Portal");
    EXPECT_STREQ(info.url, "http://p");
    const int parent = info.parent;
    std::free(info.title);
    std::free(info.url);
    ASSERT_EQ(bookmark_zel_get_info(parent, &info), 0);
    EXPECT_EQ(info.is_folder, 1);
    EXPECT_EQ(info.parent, 1);
    EXPECT_STREQ(info.title, "News");
    EXPECT_EQ(info.url, nullptr);
    std::free(info.title);
    EXPECT_NE(bookmark_zel_get_info(12345, &info), 0);
}

TEST_F(BookmarkService, RefusesParentsThatAreNoFolder) {
    ASSERT_EQ(bookmark_zel_initialize(), 0);
    const int bookmark = make("Portal");
    EXPECT_EQ(make("below", bookmark), -1);
    EXPECT_EQ(make("nowhere", 77), -1);
}

TEST_F(BookmarkService, ResetLeavesTheRootAndTheManual) {
    call("bookmarks-add", {{"title", "Portal"}, {"url", "http://p"}, {"folder", "News"}});
    call("bookmarks-manual", {{"url", "http://m"}});
    ASSERT_EQ(bookmark_zel_initialize(), 0);
    EXPECT_EQ(bookmark_zel_reset(), 0);
    EXPECT_THAT(call("bookmarks").at("bookmarks"), IsEmpty());
    EXPECT_EQ(call("bookmarks").at("manual_url"), "http://m");
    EXPECT_EQ(make("again"), 2);
}

TEST_F(BookmarkService, KeepsTheManualsAddress) {
    ASSERT_EQ(bookmark_zel_initialize(), 0);
    char *url = nullptr;
    EXPECT_EQ(bookmark_zel_get_user_manual_url(&url), 0);
    EXPECT_EQ(url, nullptr);
    EXPECT_EQ(bookmark_zel_set_user_manual_url("http://m"), 0);
    EXPECT_EQ(bookmark_zel_get_user_manual_url(&url), 0);
    EXPECT_STREQ(url, "http://m");
    std::free(url);
}

TEST_F(BookmarkService, ServesItsClientsOnly) {
    int number = -5;
    int *ids = nullptr;
    char *url = nullptr;
    bookmark_zel_info info{};
    const auto all_refuse = [&] {
        EXPECT_NE(bookmark_zel_get_root(&number), 0);
        EXPECT_NE(bookmark_zel_get_full_ids_p(&ids, &number), 0);
        EXPECT_NE(bookmark_zel_get_info(1, &info), 0);
        EXPECT_NE(bookmark_zel_get_duplicated_title_ids_p("x", 1, 1, &ids, &number), 0);
        EXPECT_EQ(make("x"), -1);
        EXPECT_NE(bookmark_zel_reset(), 0);
        EXPECT_NE(bookmark_zel_get_user_manual_url(&url), 0);
        EXPECT_NE(bookmark_zel_set_user_manual_url("x"), 0);
        EXPECT_NE(bookmark_zel_deinitialize(), 0);
        EXPECT_EQ(number, -5);
    };
    all_refuse();
    EXPECT_EQ(bookmark_zel_initialize(), 0);
    EXPECT_EQ(bookmark_zel_get_root(&number), 0);
    EXPECT_EQ(number, 1);
    EXPECT_EQ(bookmark_zel_deinitialize(), 0);
    number = -5;
    all_refuse();
}

TEST_F(BookmarkService, FailsAtAnyCallAndTouchesNothingThen) {
    call("bookmarks-add", {{"title", "Portal"}, {"url", "http://p"}});
    call("bookmarks-manual", {{"url", "http://m"}});
    ASSERT_EQ(bookmark_zel_initialize(), 0);
    for (const char *function : {"bookmark_zel_initialize", "bookmark_zel_deinitialize", "bookmark_zel_get_root",
                                 "bookmark_zel_get_full_ids_p", "bookmark_zel_get_info",
                                 "bookmark_zel_get_duplicated_title_ids_p", "bookmark_zel_create", "bookmark_zel_reset",
                                 "bookmark_zel_get_user_manual_url", "bookmark_zel_set_user_manual_url"})
        fail(function, "", 1, 1, -42);
    int number = -5;
    int *ids = nullptr;
    char *url = nullptr;
    bookmark_zel_info info{};
    EXPECT_EQ(bookmark_zel_initialize(), -42);
    EXPECT_EQ(bookmark_zel_deinitialize(), -42);
    EXPECT_EQ(bookmark_zel_get_root(&number), -42);
    EXPECT_EQ(bookmark_zel_get_full_ids_p(&ids, &number), -42);
    EXPECT_EQ(bookmark_zel_get_info(2, &info), -42);
    EXPECT_EQ(bookmark_zel_get_duplicated_title_ids_p("Portal", 1, 0, &ids, &number), -42);
    EXPECT_EQ(make("x"), -1);
    EXPECT_EQ(bookmark_zel_reset(), -42);
    EXPECT_EQ(bookmark_zel_get_user_manual_url(&url), -42);
    EXPECT_EQ(bookmark_zel_set_user_manual_url("x"), -42);
    EXPECT_EQ(number, -5);
    EXPECT_EQ(ids, nullptr);
    EXPECT_EQ(url, nullptr);
    EXPECT_EQ(info.title, nullptr);
    EXPECT_EQ(call("bookmarks").at("bookmarks").size(), 1U);
    EXPECT_EQ(call("bookmarks").at("manual_url"), "http://m");
}

TEST_F(BookmarkService, FaultsPickCallsByTitle) {
    fail("bookmark_zel_create", "bad");
    ASSERT_EQ(bookmark_zel_initialize(), 0);
    EXPECT_EQ(make("good"), 2);
    EXPECT_EQ(make("bad"), -1);
}

TEST_F(BookmarkService, RefusesNullPointers) {
    ASSERT_EQ(bookmark_zel_initialize(), 0);
    int number = 0;
    int *ids = nullptr;
    const bookmark_zel_info untitled{};
    EXPECT_NE(bookmark_zel_get_root(nullptr), 0);
    EXPECT_NE(bookmark_zel_get_full_ids_p(nullptr, &number), 0);
    EXPECT_NE(bookmark_zel_get_full_ids_p(&ids, nullptr), 0);
    EXPECT_NE(bookmark_zel_get_info(1, nullptr), 0);
    EXPECT_NE(bookmark_zel_get_duplicated_title_ids_p(nullptr, 1, 1, &ids, &number), 0);
    EXPECT_NE(bookmark_zel_create(nullptr, &number), 0);
    EXPECT_NE(bookmark_zel_create(&untitled, &number), 0);
    EXPECT_NE(bookmark_zel_get_user_manual_url(nullptr), 0);
    EXPECT_NE(bookmark_zel_set_user_manual_url(nullptr), 0);
}

TEST_F(BookmarkService, ResetOfThePhoneForgetsBookmarksAndManual) {
    call("bookmarks-add", {{"title", "Portal"}, {"url", "http://p"}});
    call("bookmarks-manual", {{"url", "http://m"}});
    call("reset");
    EXPECT_EQ(call("bookmarks"), (json{{"bookmarks", json::array()}, {"manual_url", ""}}));
    ASSERT_EQ(bookmark_zel_initialize(), 0);
    EXPECT_EQ(make("first"), 2);
}

TEST_F(BookmarkService, OutlivesARestart) {
    call("bookmarks-add", {{"title", "Portal"}, {"url", "http://p"}});
    call("reboot");
    EXPECT_EQ(call("bookmarks").at("bookmarks").size(), 1U);
}

TEST_F(BookmarkService, AnyBytesCanBeATitle) {
    ASSERT_EQ(bookmark_zel_initialize(), 0);
    make("caf\xE9");
    EXPECT_EQ(call("bookmarks").at("bookmarks").at(0).at("title_hex"), "636166e9");
}

} // namespace
