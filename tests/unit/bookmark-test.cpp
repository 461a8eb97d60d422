// Bookmarks: what an install makes, records and logs.

#include "services-phone.h"

#include <bookmark.h>
#include <gmock/gmock.h>

namespace zel_test {

using testing::ElementsAre;
using testing::IsEmpty;

namespace {

std::string bookmark(const std::string &network, const std::string &editable, const std::string &folder,
                     const std::string &name, const std::string &url) {
    return leaf("Bookmark", leaf("NetworkName", network) + leaf("Editable", editable) + leaf("Folder", folder) +
                                leaf("BookmarkName", name) + leaf("URL", url));
}

std::optional<std::string> recorded(const LoadedGroup &group, const char *key) { return group.text("bookmark", key); }

constexpr int kRoot = 1;

int make_folder(std::string title, int parent) {
    const bookmark_zel_info info{
        .is_folder = 1, .parent = parent, .editable = 1, .title = title.data(), .url = nullptr};
    int id = 0;
    EXPECT_EQ(bookmark_zel_create(&info, &id), 0);
    return id;
}

constexpr const char *kSetLines = "[Bookmark/Start] Set bookmark.\n[Bookmark/Ended] Set bookmark.\n";

} // namespace

class Bookmark : public ServicesPhone {
  protected:
    void SetUp() override {
        ServicesPhone::SetUp();
        set_operator("One");
        start_journal();
    }
    void TearDown() override {
        expect_services_closed();
        ServicesPhone::TearDown();
    }
};

TEST_F(Bookmark, IsMadeInTheServiceAndRecorded) {
    const LoadedGroup group{ZEL_SVC_DATA_BOOKMARK};
    install_spec("<Browser>" + bookmark("One", "no", "", "Portal", "http://portal.example/?a=1&amp;b=2") +
                 "</Browser>");
    const nlohmann::json made = bookmarks();
    ASSERT_EQ(made.size(), 1U);
    EXPECT_EQ(made[0].at("title"), "Portal");
    EXPECT_EQ(made[0].at("url"), "http://portal.example/?a=1&b=2");
    EXPECT_EQ(made[0].at("editable"), false);
    EXPECT_EQ(made[0].at("is_folder"), false);
    EXPECT_EQ(made[0].at("parent"), 1);
    EXPECT_EQ(recorded(group, "count"), "1");
    EXPECT_EQ(group.number("bookmark", "editable_1"), 0);
    EXPECT_EQ(group.number("bookmark", "folder_id_1"), 1);
    EXPECT_EQ(recorded(group, "name_1"), "Portal");
    EXPECT_EQ(recorded(group, "url_1"), "http://portal.example/?a=1&b=2");
    EXPECT_EQ(run_log(), kSetLines);
}

TEST_F(Bookmark, TwoOfTheSameFolderShareIt) {
    const LoadedGroup group{ZEL_SVC_DATA_BOOKMARK};
    install_spec(bookmark("", "yes", "News", "Morning", "http://m") +
                 bookmark("", "yes", "News", "Evening", "http://e"));
    EXPECT_THAT(shown_bookmarks(), ElementsAre("News/", "News/Morning", "News/Evening"));
    const int folder = bookmarks()[0].at("id");
    EXPECT_EQ(group.number("bookmark", "folder_id_1"), folder);
    EXPECT_EQ(group.number("bookmark", "folder_id_2"), folder);
    EXPECT_EQ(recorded(group, "count"), "2");
    EXPECT_EQ(calls_of("bookmark_zel_create"), 3);
}

TEST_F(Bookmark, GoesIntoTheFirstFolderOfItsTitleInTheRoot) {
    const LoadedGroup group{ZEL_SVC_DATA_BOOKMARK};
    call("bookmarks-add", {{"title", "News"}, {"url", "http://no.folder"}});
    ASSERT_EQ(bookmark_zel_initialize(), 0);
    make_folder("News", make_folder("Other", kRoot));
    const int first = make_folder("News", kRoot);
    make_folder("News", kRoot);
    ASSERT_EQ(bookmark_zel_deinitialize(), 0);
    install_spec(bookmark("", "", "News", "new", "http://n"));
    const nlohmann::json all = bookmarks();
    ASSERT_EQ(all.size(), 6U);
    EXPECT_EQ(all[5].at("title"), "new");
    EXPECT_EQ(all[5].at("parent"), first);
    EXPECT_EQ(group.number("bookmark", "folder_id_1"), first);
}

TEST_F(Bookmark, OnlyTheTextNoKeepsItFromBeingEdited) {
    const LoadedGroup group{ZEL_SVC_DATA_BOOKMARK};
    for (const char *text : {"yes", "No", "", "no ", "nope", "maybe", "0"})
        install_spec(bookmark("", text, "", std::string{"of "} + text, "http://x"));
    const nlohmann::json made = bookmarks();
    for (std::size_t i = 0; i < 7; ++i) {
        EXPECT_EQ(made[i].at("editable"), true) << made[i];
        EXPECT_EQ(group.number("bookmark", ("editable_" + std::to_string(i + 1)).c_str()), 1) << made[i];
    }
    install_spec(bookmark("", "no", "", "fixed", "http://x"));
    EXPECT_EQ(bookmarks()[7].at("editable"), false);
    EXPECT_EQ(group.number("bookmark", "editable_8"), 0);
}

TEST_F(Bookmark, WithoutAnyTextIsMadeAllTheSame) {
    const LoadedGroup group{ZEL_SVC_DATA_BOOKMARK};
    install_spec("<Bookmark></Bookmark>");
    ASSERT_EQ(bookmarks().size(), 1U);
    EXPECT_EQ(bookmarks()[0].at("title"), "");
    EXPECT_EQ(recorded(group, "name_1"), "");
    EXPECT_EQ(group.number("bookmark", "editable_1"), 1);
}

TEST_F(Bookmark, StartInsideOfAnotherDropsTheOuter) {
    const LoadedGroup group{ZEL_SVC_DATA_BOOKMARK};
    install_spec(leaf("Bookmark", leaf("BookmarkName", "outer") + leaf("Bookmark", leaf("BookmarkName", "inner")) +
                                      leaf("BookmarkName", "late")));
    EXPECT_THAT(shown_bookmarks(), ElementsAre("inner"));
    EXPECT_EQ(recorded(group, "count"), "1");
}

TEST_F(Bookmark, LeftOpenByABrokenDocumentIsDroppedByTheNext) {
    const LoadedGroup group{ZEL_SVC_DATA_BOOKMARK};
    install_spec("<Bookmark><BookmarkName>half</BookmarkName><URL>http://half</URL><");
    install_spec(leaf("BookmarkName", "outside of any") + bookmark("", "", "", "whole", ""));
    ASSERT_THAT(shown_bookmarks(), ElementsAre("whole"));
    EXPECT_EQ(bookmarks()[0].at("url"), "");
}

TEST_F(Bookmark, TextsAreCutToTheirFields) {
    const LoadedGroup group{ZEL_SVC_DATA_BOOKMARK};
    const std::string text(250, 'x');
    install_spec(bookmark("", "no" + text, text, text, text));
    const nlohmann::json made = bookmarks();
    ASSERT_EQ(made.size(), 2U);
    EXPECT_EQ(made[0].at("title"), text.substr(0, 199));
    EXPECT_EQ(made[1].at("title"), text.substr(0, 199));
    EXPECT_EQ(made[1].at("url"), text.substr(0, 199));
    EXPECT_EQ(recorded(group, "url_1"), text.substr(0, 199));
}

TEST_F(Bookmark, FullInstallLeavesTheSimsBookmarksOut) {
    const LoadedGroup group{ZEL_SVC_DATA_BOOKMARK};
    set_auto_flag(ZEL_SVC_AUTO_BOOKMARK, 1);
    install_spec(bookmark("One", "no", "", "Portal", "http://p"));
    EXPECT_THAT(bookmarks(), IsEmpty());
    EXPECT_EQ(recorded(group, "count"), std::nullopt);
    EXPECT_EQ(run_log(), "");
    EXPECT_EQ(calls_of("bookmark_zel_initialize"), 0);
}

TEST_F(Bookmark, OperatorInstallTakesTheOperatorsAndThoseOfDefault) {
    const LoadedGroup group{ZEL_SVC_DATA_BOOKMARK};
    set_auto_flag(ZEL_SVC_AUTO_BOOKMARK, 1);
    install_spec(bookmark("Two", "", "", "two", "http://2") + bookmark("One", "", "", "one", "http://1") +
                     bookmark("default", "", "", "all", "http://a") + bookmark("", "", "", "none", "http://n") +
                     bookmark("one", "", "", "small", "http://s") + bookmark("Default", "", "", "large", "http://l"),
                 ZEL_SVC_PARSE_MODE_OPERATOR);
    EXPECT_THAT(shown_bookmarks(), ElementsAre("one", "all"));
    EXPECT_EQ(recorded(group, "count"), "2");
    EXPECT_EQ(recorded(group, "name_2"), "all");
}

TEST_F(Bookmark, OfDefaultIsInstalledForEveryOperator) {
    const LoadedGroup group{ZEL_SVC_DATA_BOOKMARK};
    set_auto_flag(ZEL_SVC_AUTO_BOOKMARK, 1);
    for (const char *name : {"Two", "Three", ""}) {
        set_operator(name);
        install_spec(bookmark("default", "", "", std::string{"for "} + name, "http://a"), ZEL_SVC_PARSE_MODE_OPERATOR);
    }
    EXPECT_THAT(shown_bookmarks(), ElementsAre("for Two", "for Three", "for "));
}

TEST_F(Bookmark, OperatorInstallNeedsTheFlag) {
    const LoadedGroup group{ZEL_SVC_DATA_BOOKMARK};
    set_auto_flag(ZEL_SVC_AUTO_BOOKMARK, 0);
    install_spec(bookmark("One", "", "", "one", "http://1") + bookmark("default", "", "", "all", "http://a"),
                 ZEL_SVC_PARSE_MODE_OPERATOR);
    EXPECT_THAT(bookmarks(), IsEmpty());
    EXPECT_EQ(recorded(group, "count"), std::nullopt);
}

TEST_F(Bookmark, NoOtherModeInstallsAny) {
    const LoadedGroup group{ZEL_SVC_DATA_BOOKMARK};
    for (const int flag : {0, 1})
        for (const ZelSvcParseMode mode : kModesWithoutItems) {
            set_auto_flag(ZEL_SVC_AUTO_BOOKMARK, flag);
            install_spec(bookmark("One", "", "", "one", "http://1"), mode);
        }
    EXPECT_THAT(bookmarks(), IsEmpty());
    EXPECT_EQ(recorded(group, "count"), std::nullopt);
    EXPECT_EQ(run_log(), "");
}

TEST_F(Bookmark, CountEmptiesTheServiceInEveryMode) {
    const LoadedGroup group{ZEL_SVC_DATA_BOOKMARK};
    for (const int mode : {0, 1, 2, 3, 4, 5, 7}) {
        call("bookmarks-add", {{"title", "user's"}, {"url", "http://u"}, {"folder", "user's too"}});
        set_auto_flag(ZEL_SVC_AUTO_BOOKMARK, mode % 2);
        install_spec(leaf("NbBookmark", "1"), static_cast<ZelSvcParseMode>(mode));
        EXPECT_THAT(bookmarks(), IsEmpty()) << mode;
    }
}

TEST_F(Bookmark, CountLogsEachStepAndLeavesTheRecordedCount) {
    const LoadedGroup group{ZEL_SVC_DATA_BOOKMARK};
    install_spec(bookmark("", "", "", "Portal", "http://p"));
    install_spec(leaf("NbBookmark", "not even a number"));
    EXPECT_EQ(run_log(), std::string{kSetLines} + "[Bookmark/Start] Clear bookmark.\n"
                                                  "[Bookmark] Run init().\n"
                                                  "[Bookmark] Run reset().\n"
                                                  "[Bookmark] Run deinit().\n"
                                                  "[Bookmark/Ended] Clear bookmark.\n");
    EXPECT_EQ(recorded(group, "count"), "1");
}

TEST_F(Bookmark, CountStopsWhereTheServiceDoesNotOpen) {
    call("bookmarks-add", {{"title", "kept"}, {"url", "http://k"}});
    fail("bookmark_zel_initialize", "", 1, 1);
    install_spec(leaf("NbBookmark", "1"));
    EXPECT_EQ(run_log(), "[Bookmark/Start] Clear bookmark.\n"
                         "[Bookmark] Run init().\n"
                         "[Bookmark/Error] Run init().\n");
    EXPECT_EQ(bookmarks().size(), 1U);
    EXPECT_EQ(calls_of("bookmark_zel_reset"), 0);
    EXPECT_EQ(calls_of("bookmark_zel_deinitialize"), 0);
    call("journal-clear");
}

TEST_F(Bookmark, CountLogsTheSameWhenTheServiceRefusesToReset) {
    call("bookmarks-add", {{"title", "kept"}, {"url", "http://k"}});
    fail("bookmark_zel_reset");
    fail("bookmark_zel_deinitialize");
    install_spec(leaf("NbBookmark", "1"));
    EXPECT_EQ(run_log(), "[Bookmark/Start] Clear bookmark.\n"
                         "[Bookmark] Run init().\n"
                         "[Bookmark] Run reset().\n"
                         "[Bookmark] Run deinit().\n"
                         "[Bookmark/Ended] Clear bookmark.\n");
    EXPECT_EQ(bookmarks().size(), 1U);
}

// Each failure of the service ends one bookmark: nothing of it is recorded, and the next one is made.
struct BookmarkFailure {
    const char *name;
    const char *function;
    int from; // the call that fails, among those of the function in the install below
    const char *log;
    bool closes; // the service was open
};

class FailingBookmark : public ServicesPhone, public testing::WithParamInterface<BookmarkFailure> {};

TEST_P(FailingBookmark, IsLoggedAndNotRecordedAndTheNextIsMade) {
    const LoadedGroup group{ZEL_SVC_DATA_BOOKMARK};
    const BookmarkFailure &failure = GetParam();
    start_journal();
    fail(failure.function, "", failure.from, 1);
    install_spec(bookmark("", "no", "News", "first", "http://1") + bookmark("", "no", "News", "second", "http://2"));
    EXPECT_EQ(run_log(), std::string{"[Bookmark/Start] Set bookmark.\n"} + failure.log +
                             (failure.closes ? "[Bookmark/Ended] Set bookmark.\n" : "") + kSetLines);
    EXPECT_EQ(recorded(group, "count"), "1");
    EXPECT_EQ(recorded(group, "name_1"), "second");
    EXPECT_EQ(recorded(group, "name_2"), std::nullopt);
    EXPECT_THAT(shown_bookmarks(), ElementsAre("News/", "News/second"));
    EXPECT_EQ(calls_of("bookmark_zel_deinitialize"), failure.closes ? 2 : 1);
}

INSTANTIATE_TEST_SUITE_P(
    , FailingBookmark,
    testing::Values(BookmarkFailure{"Initialize", "bookmark_zel_initialize", 1, "[Bookmark/Error] Run init().\n",
                                    false},
                    BookmarkFailure{"Root", "bookmark_zel_get_root", 1, "[Bookmark/Error] Run get root().\n", true},
                    BookmarkFailure{"Search", "bookmark_zel_get_duplicated_title_ids_p", 1,
                                    "[Bookmark/Error] Run get duplicated_title().\n", true},
                    BookmarkFailure{"Folder", "bookmark_zel_create", 1, "[Bookmark/Error] Run create().\n", true},
                    BookmarkFailure{"Creation", "bookmark_zel_create", 2, "[Bookmark/Error] Run create().\n", true}),
    [](const auto &failure) { return failure.param.name; });

TEST_F(Bookmark, ThatTheServiceTookIsRecordedWhateverItsClosingSays) {
    const LoadedGroup group{ZEL_SVC_DATA_BOOKMARK};
    fail("bookmark_zel_deinitialize");
    install_spec(bookmark("", "", "", "Portal", "http://p"));
    EXPECT_EQ(recorded(group, "count"), "1");
    EXPECT_EQ(run_log(), kSetLines);
}

} // namespace zel_test
