// Bookmarks: verification against the service, and what the export says of it.

#include "services-phone.h"

#include <gmock/gmock.h>

namespace zel_test {

using testing::ElementsAre;
using testing::IsEmpty;

namespace {

std::string bookmark(const std::string &children) { return leaf("Bookmark", children); }

constexpr ZelSvcElementId kChildren[] = {ZEL_SVC_ELEMENT_BOOKMARK_EDITABLE, ZEL_SVC_ELEMENT_BOOKMARK_FOLDER,
                                         ZEL_SVC_ELEMENT_BOOKMARK_NAME, ZEL_SVC_ELEMENT_BOOKMARK_URL};

std::vector<std::string> exported_bookmark() {
    std::vector<std::string> texts;
    export_start(ZEL_SVC_ELEMENT_BOOKMARK);
    for (const ZelSvcElementId child : kChildren)
        texts.push_back(export_value(child));
    export_end(ZEL_SVC_ELEMENT_BOOKMARK);
    return texts;
}

} // namespace

class CheckedBookmark : public ServicesPhone {
  protected:
    void SetUp() override {
        ServicesPhone::SetUp();
        call("bookmarks-add", {{"title", "Portal"}, {"url", "http://p"}, {"fixed", true}});
        call("bookmarks-add", {{"title", "Morning"}, {"url", "http://m"}, {"folder", "News"}});
        start_journal();
    }
};

constexpr const char *kTwo =
    "<NbBookmark>2</NbBookmark>"
    "<Bookmark><NetworkName>One</NetworkName><Editable>no</Editable><BookmarkName>Portal</BookmarkName>"
    "<URL>http://p</URL></Bookmark>"
    "<Bookmark><Editable>yes</Editable><Folder>News</Folder><BookmarkName>Morning</BookmarkName>"
    "<URL>http://m</URL></Bookmark>";

TEST_F(CheckedBookmark, EqualsTheSpec) {
    EXPECT_THAT(verify_spec(kTwo), ElementsAre(passed("[Bookmark/NbBookmark] Spec='2',Phone='2'"),
                                               passed("[Bookmark1/Editable] Spec='no',Phone='no'"),
                                               passed("[Bookmark1/Folder] Spec='',Phone=''"),
                                               passed("[Bookmark1/BookmarkName] Spec='Portal',Phone='Portal'"),
                                               passed("[Bookmark1/URL] Spec='http://p',Phone='http://p'"),
                                               passed("[Bookmark2/Editable] Spec='yes',Phone='yes'"),
                                               passed("[Bookmark2/Folder] Spec='News',Phone='News'"),
                                               passed("[Bookmark2/BookmarkName] Spec='Morning',Phone='Morning'"),
                                               passed("[Bookmark2/URL] Spec='http://m',Phone='http://m'")));
    expect_services_closed();
}

TEST_F(CheckedBookmark, DiffersLineByLine) {
    EXPECT_THAT(
        verify_spec("<NbBookmark>02</NbBookmark>" + bookmark(leaf("Editable", "yes") + leaf("Folder", "Other") +
                                                             leaf("BookmarkName", "portal") + leaf("URL", "http://q"))),
        ElementsAre(failed("[Bookmark/NbBookmark] Spec='02',Phone='2'"),
                    failed("[Bookmark1/Editable] Spec='yes',Phone='no'"),
                    failed("[Bookmark1/Folder] Spec='Other',Phone=''"),
                    failed("[Bookmark1/BookmarkName] Spec='portal',Phone='Portal'"),
                    failed("[Bookmark1/URL] Spec='http://q',Phone='http://p'")));
}

TEST_F(CheckedBookmark, HasNoLineForAnEditableThatTheSpecLeavesOut) {
    EXPECT_THAT(verify_spec("<NbBookmark>2</NbBookmark>" + bookmark(leaf("BookmarkName", "Portal"))),
                ElementsAre(passed("[Bookmark/NbBookmark] Spec='2',Phone='2'"),
                            passed("[Bookmark1/Folder] Spec='',Phone=''"),
                            passed("[Bookmark1/BookmarkName] Spec='Portal',Phone='Portal'"),
                            failed("[Bookmark1/URL] Spec='',Phone='http://p'")));
}

TEST_F(CheckedBookmark, IndexGoesOnUntilTheNextCount) {
    const std::string one = bookmark(leaf("BookmarkName", "Morning"));
    verify_spec("<NbBookmark>2</NbBookmark>" + one);
    // A document without count goes on where the one before stopped.
    EXPECT_THAT(verify_spec(one), ElementsAre(failed("[Bookmark2/Folder] Spec='',Phone='News'"),
                                              passed("[Bookmark2/BookmarkName] Spec='Morning',Phone='Morning'"),
                                              failed("[Bookmark2/URL] Spec='',Phone='http://m'")));
    EXPECT_THAT(verify_spec(one), ElementsAre(failed("[Bookmark3] Reading phone failed")));
    EXPECT_EQ(verify_spec("<NbBookmark>2</NbBookmark>" + one).at(2).text,
              "[Bookmark1/BookmarkName] Spec='Morning',Phone='Portal'");
}

TEST_F(CheckedBookmark, CountInAnInstallLeavesTheIndex) {
    const LoadedGroup group{ZEL_SVC_DATA_BOOKMARK};
    const std::string one = bookmark(leaf("BookmarkName", "Portal"));
    verify_spec(one);
    install_spec("<NbBookmark>1</NbBookmark>" + one);
    ASSERT_EQ(bookmarks().size(), 1U);
    EXPECT_THAT(verify_spec(one), ElementsAre(failed("[Bookmark2] Reading phone failed")));
}

TEST_F(CheckedBookmark, CountThatIsNotCheckedTakesTheIndexBackAllTheSame) {
    const std::string count = leaf("NbBookmark", "2");
    const std::string one = bookmark(leaf("BookmarkName", "Portal"));
    verify_spec(one);
    EXPECT_THAT(verify_spec(count, ZEL_SVC_PARSE_MODE_FULL), IsEmpty());
    EXPECT_EQ(verify_spec(one).at(0), passed("[Bookmark1/Folder] Spec='',Phone=''"));
    set_auto_flag(ZEL_SVC_AUTO_BOOKMARK, 1);
    EXPECT_THAT(verify_spec(count), IsEmpty());
    set_auto_flag(ZEL_SVC_AUTO_BOOKMARK, 0);
    EXPECT_EQ(verify_spec(one).at(0), passed("[Bookmark1/Folder] Spec='',Phone=''"));
}

TEST_F(CheckedBookmark, ThatIsNotCheckedLeavesTheIndex) {
    const std::string one = bookmark(leaf("BookmarkName", "Portal"));
    EXPECT_THAT(verify_spec(one, ZEL_SVC_PARSE_MODE_FULL), IsEmpty());
    set_auto_flag(ZEL_SVC_AUTO_BOOKMARK, 1);
    EXPECT_THAT(verify_spec(one), IsEmpty());
    set_auto_flag(ZEL_SVC_AUTO_BOOKMARK, 0);
    EXPECT_EQ(verify_spec(one).at(0), passed("[Bookmark1/Folder] Spec='',Phone=''"));
}

TEST_F(CheckedBookmark, IndexStartsAtZeroInAFreshProcess) {
    EXPECT_EQ(verify_spec(bookmark(leaf("BookmarkName", "Portal"))).at(1),
              passed("[Bookmark1/BookmarkName] Spec='Portal',Phone='Portal'"));
}

TEST_F(CheckedBookmark, IsNotCheckedWhenItComesFromTheSimOrInOtherModes) {
    for (const ZelSvcParseMode mode : {ZEL_SVC_PARSE_MODE_FULL, ZEL_SVC_PARSE_MODE_OPERATOR, ZEL_SVC_PARSE_MODE_HEADER})
        EXPECT_THAT(verify_spec(kTwo, mode), IsEmpty());
    set_auto_flag(ZEL_SVC_AUTO_BOOKMARK, 1);
    EXPECT_THAT(verify_spec(kTwo), IsEmpty());
    EXPECT_EQ(calls_of("bookmark_zel_initialize"), 0);
}

TEST_F(CheckedBookmark, LongTextsAreComparedCut) {
    const std::string text(250, 'x');
    call("bookmarks-clear");
    call("bookmarks-add", {{"title", text.substr(0, 199)}, {"url", "http://p"}});
    EXPECT_EQ(verify_spec(bookmark(leaf("BookmarkName", text))).at(1).passed, true);
}

TEST_F(CheckedBookmark, LongEditableIsShownCut) {
    EXPECT_EQ(verify_spec(bookmark(leaf("Editable", "a word of thirty characters..."))).at(0),
              failed("[Bookmark1/Editable] Spec='a word of thirty ch',Phone='no'"));
}

TEST_F(CheckedBookmark, LongTextsOfThePhoneAreExportedCut) {
    const std::string text(250, 'x');
    call("bookmarks-clear");
    call("bookmarks-add", {{"title", text}, {"url", text}, {"folder", text}});
    EXPECT_THAT(exported_bookmark(), ElementsAre("yes", text.substr(0, 199), text.substr(0, 199), text.substr(0, 199)));
}

TEST_F(CheckedBookmark, FailsWhereTheServiceCannotBeAsked) {
    for (const char *function : {"bookmark_zel_initialize", "bookmark_zel_get_full_ids_p", "bookmark_zel_get_info",
                                 "bookmark_zel_get_root", "bookmark_zel_deinitialize"}) {
        call("journal-clear");
        fail(function);
        const std::vector<ResultLine> lines = verify_spec(kTwo);
        const bool counts = std::string_view{function} == "bookmark_zel_get_info" ||
                            std::string_view{function} == "bookmark_zel_get_root";
        ASSERT_EQ(lines.size(), 3U) << function;
        EXPECT_EQ(lines[0], counts ? passed("[Bookmark/NbBookmark] Spec='2',Phone='2'")
                                   : failed("[Bookmark/NbBookmark] Spec='2',Phone='?\?'"));
        EXPECT_EQ(lines[1], failed("[Bookmark1] Reading phone failed")) << function;
        EXPECT_EQ(lines[2], failed("[Bookmark2] Reading phone failed")) << function;
        const bool opened = std::string_view{function} != "bookmark_zel_initialize";
        EXPECT_EQ(calls_of("bookmark_zel_deinitialize"), opened ? 3 : 0) << function;
        call("fault-clear");
    }
}

TEST_F(CheckedBookmark, FailsWhereItsFolderCannotBeRead) {
    fail("bookmark_zel_get_info", "", 3, 1);
    EXPECT_EQ(verify_spec(kTwo).back(), failed("[Bookmark2] Reading phone failed"));
    expect_services_closed();
}

TEST_F(CheckedBookmark, IsExported) {
    EXPECT_EQ(export_value(ZEL_SVC_ELEMENT_NB_BOOKMARK), "2");
    EXPECT_THAT(exported_bookmark(), ElementsAre("no", "", "Portal", "http://p"));
    EXPECT_THAT(exported_bookmark(), ElementsAre("yes", "News", "Morning", "http://m"));
    EXPECT_THAT(exported_bookmark(), ElementsAre("", "", "", ""));
    EXPECT_EQ(export_value(ZEL_SVC_ELEMENT_NB_BOOKMARK), "2");
    EXPECT_THAT(exported_bookmark(), ElementsAre("no", "", "Portal", "http://p"));
    expect_services_closed();
}

TEST_F(CheckedBookmark, IsExportedEmptyWhenAnyCallFails) {
    for (const char *function : {"bookmark_zel_initialize", "bookmark_zel_get_full_ids_p", "bookmark_zel_get_info",
                                 "bookmark_zel_get_root", "bookmark_zel_deinitialize"}) {
        export_value(ZEL_SVC_ELEMENT_NB_BOOKMARK);
        fail(function, "", 1, 1);
        EXPECT_THAT(exported_bookmark(), ElementsAre("", "", "", "")) << function;
        EXPECT_THAT(exported_bookmark(), ElementsAre("yes", "News", "Morning", "http://m")) << function;
    }
}

TEST_F(CheckedBookmark, CountIsExportedAsUnknownWhenTheServiceFails) {
    for (const char *function :
         {"bookmark_zel_initialize", "bookmark_zel_get_full_ids_p", "bookmark_zel_deinitialize"}) {
        fail(function, "", 1, 1);
        EXPECT_EQ(export_value(ZEL_SVC_ELEMENT_NB_BOOKMARK), "??") << function;
    }
    call("bookmarks-clear");
    EXPECT_EQ(export_value(ZEL_SVC_ELEMENT_NB_BOOKMARK), "0");
}

} // namespace zel_test
