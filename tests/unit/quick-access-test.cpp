#include "services-phone.h"

#include <gmock/gmock.h>

namespace zel_test {

using testing::ElementsAre;
using testing::IsEmpty;

namespace {

std::string entry(const std::string &editable, const std::string &title, const std::string &url) {
    return leaf("QuickAccess", leaf("Editable", editable) + leaf("QATitle", title) + leaf("QAURL", url));
}

std::optional<std::string> recorded(const LoadedGroup &group, const char *key) {
    return group.text("quickaccess", key);
}

std::vector<std::string> exported_entry() {
    std::vector<std::string> texts;
    export_start(ZEL_SVC_ELEMENT_QUICK_ACCESS);
    for (const ZelSvcElementId child :
         {ZEL_SVC_ELEMENT_QUICK_ACCESS_EDITABLE, ZEL_SVC_ELEMENT_QA_TITLE, ZEL_SVC_ELEMENT_QA_URL})
        texts.push_back(export_value(child));
    export_end(ZEL_SVC_ELEMENT_QUICK_ACCESS);
    return texts;
}

} // namespace

class QuickAccess : public ServicesPhone {};

TEST_F(QuickAccess, EntriesAreRecordedFromOne) {
    const LoadedGroup group{ZEL_SVC_DATA_QUICK_ACCESS};
    install_spec("<Browser>" + leaf("NbQuickAccess", "7") + entry("yes", "Portal", "http://p") +
                 entry("no", "News", "http://n") + "</Browser>");
    EXPECT_EQ(recorded(group, "count"), "2");
    EXPECT_EQ(group.number("quickaccess", "editable_1"), 1);
    EXPECT_EQ(recorded(group, "title_1"), "Portal");
    EXPECT_EQ(recorded(group, "url_1"), "http://p");
    EXPECT_EQ(group.number("quickaccess", "editable_2"), 0);
    EXPECT_EQ(recorded(group, "title_2"), "News");
    EXPECT_EQ(recorded(group, "url_2"), "http://n");
    EXPECT_THAT(bookmarks(), IsEmpty());
}

TEST_F(QuickAccess, EditableIsRecordedForTheTwoWordsOnly) {
    const LoadedGroup group{ZEL_SVC_DATA_QUICK_ACCESS};
    install_spec(entry("maybe", "a", "b") + entry("", "c", "d") + entry("Yes", "e", "f") + entry("no ", "g", "h") +
                 entry("NO", "i", "j"));
    EXPECT_EQ(recorded(group, "count"), "5");
    for (const char *key : {"editable_1", "editable_2", "editable_3", "editable_4", "editable_5"})
        EXPECT_EQ(recorded(group, key), std::nullopt) << key;
    EXPECT_EQ(recorded(group, "title_5"), "i");
}

TEST_F(QuickAccess, TitleAndUrlAreRecordedEmptyToo) {
    const LoadedGroup group{ZEL_SVC_DATA_QUICK_ACCESS};
    install_spec("<QuickAccess></QuickAccess>");
    EXPECT_EQ(recorded(group, "count"), "1");
    EXPECT_EQ(recorded(group, "title_1"), "");
    EXPECT_EQ(recorded(group, "url_1"), "");
}

TEST_F(QuickAccess, EveryModeRecordsWhateverTheFlags) {
    const LoadedGroup group{ZEL_SVC_DATA_QUICK_ACCESS};
    for (const int mode : {0, 1, 2, 3, 4, 5, 7}) {
        set_auto_flag(ZEL_SVC_AUTO_BOOKMARK, mode % 2);
        install_spec(entry("yes", "Portal", "http://p"), static_cast<ZelSvcParseMode>(mode));
    }
    EXPECT_EQ(recorded(group, "count"), "7");
}

TEST_F(QuickAccess, LongTextsAreCut) {
    const LoadedGroup group{ZEL_SVC_DATA_QUICK_ACCESS};
    install_spec(entry("no", std::string(250, 't'), std::string(250, 'u')));
    EXPECT_EQ(recorded(group, "title_1"), std::string(199, 't'));
    EXPECT_EQ(recorded(group, "url_1"), std::string(199, 'u'));
}

TEST_F(QuickAccess, IsVerifiedAgainstTheRecord) {
    const LoadedGroup group{ZEL_SVC_DATA_QUICK_ACCESS};
    install_spec(entry("yes", "Portal", "http://p") + entry("no", "News", "http://n") + entry("maybe", "x", "y"));
    EXPECT_THAT(
        verify_spec(leaf("NbQuickAccess", "2") + entry("yes", "Portal", "http://p") + entry("yes", "news", "http://o") +
                    entry("maybe", "x", "y") + entry("no", "z", "z")),
        ElementsAre(
            failed("[QuickAccess/NbQuickAccess] Spec='2',Phone='3'"),
            passed("[QuickAccess/Editable] Spec='yes',Phone='yes'"),
            passed("[QuickAccess/QATitle] Spec='Portal',Phone='Portal'"),
            passed("[QuickAccess/QAURL] Spec='http://p',Phone='http://p'"),
            failed("[QuickAccess/Editable] Spec='yes',Phone='no'"),
            failed("[QuickAccess/QATitle] Spec='news',Phone='News'"),
            failed("[QuickAccess/QAURL] Spec='http://o',Phone='http://n'"),
            failed("[QuickAccess/Editable] Spec='maybe',Phone=''"), passed("[QuickAccess/QATitle] Spec='x',Phone='x'"),
            passed("[QuickAccess/QAURL] Spec='y',Phone='y'"), failed("[QuickAccess/Editable] Spec='no',Phone=''"),
            failed("[QuickAccess/QATitle] Spec='z',Phone=''"), failed("[QuickAccess/QAURL] Spec='z',Phone=''")));
}

TEST_F(QuickAccess, CountIsVerifiedAsTextAndIsZeroWithoutRecord) {
    const LoadedGroup group{ZEL_SVC_DATA_QUICK_ACCESS};
    EXPECT_THAT(verify_spec(leaf("NbQuickAccess", "0")),
                ElementsAre(passed("[QuickAccess/NbQuickAccess] Spec='0',Phone='0'")));
    EXPECT_THAT(verify_spec(leaf("NbQuickAccess", "00")),
                ElementsAre(failed("[QuickAccess/NbQuickAccess] Spec='00',Phone='0'")));
}

TEST_F(QuickAccess, VerificationCutsTheSpecsTexts) {
    const LoadedGroup group{ZEL_SVC_DATA_QUICK_ACCESS};
    const std::string title(250, 't');
    const std::string spec = entry("a word of thirty characters...", title, "http://p");
    install_spec(spec);
    const std::string cut = title.substr(0, 199);
    EXPECT_THAT(
        verify_spec(spec),
        ElementsAre(failed("[QuickAccess/Editable] Spec='a word of thirty ch',Phone=''"),
                    ResultLine{("[QuickAccess/QATitle] Spec='" + cut + "',Phone='" + cut + "'").substr(0, 305), true},
                    passed("[QuickAccess/QAURL] Spec='http://p',Phone='http://p'")));
}

TEST_F(QuickAccess, NumberStartsAtOneAndGoesBackToOneWithTheCount) {
    const LoadedGroup group{ZEL_SVC_DATA_QUICK_ACCESS};
    install_spec(entry("yes", "first", "1") + entry("no", "second", "2"));
    EXPECT_THAT(exported_entry(), ElementsAre("yes", "first", "1"));
    EXPECT_THAT(exported_entry(), ElementsAre("no", "second", "2"));
    EXPECT_THAT(exported_entry(), ElementsAre("", "", ""));
    EXPECT_EQ(export_value(ZEL_SVC_ELEMENT_NB_QUICK_ACCESS), "2");
    EXPECT_THAT(exported_entry(), ElementsAre("yes", "first", "1"));
    verify_spec(leaf("NbQuickAccess", "2"));
    EXPECT_THAT(verify_spec(leaf("QuickAccess", leaf("QATitle", "first"))),
                ElementsAre(passed("[QuickAccess/QATitle] Spec='first',Phone='first'")));
}

TEST_F(QuickAccess, CountInAnInstallLeavesTheNumber) {
    const LoadedGroup group{ZEL_SVC_DATA_QUICK_ACCESS};
    install_spec(entry("yes", "first", "1") + entry("no", "second", "2"));
    EXPECT_THAT(exported_entry(), ElementsAre("yes", "first", "1"));
    install_spec(leaf("NbQuickAccess", "2"));
    EXPECT_THAT(exported_entry(), ElementsAre("no", "second", "2"));
}

TEST_F(QuickAccess, EveryModeVerifiesWhateverTheFlags) {
    const LoadedGroup group{ZEL_SVC_DATA_QUICK_ACCESS};
    install_spec(entry("yes", "Portal", "http://p"));
    for (const int mode : {0, 1, 2, 3, 4, 5, 7}) {
        set_auto_flag(ZEL_SVC_AUTO_BOOKMARK, mode % 2);
        EXPECT_THAT(verify_spec(leaf("NbQuickAccess", "1") + entry("yes", "Portal", "http://p"),
                                static_cast<ZelSvcParseMode>(mode)),
                    ElementsAre(passed("[QuickAccess/NbQuickAccess] Spec='1',Phone='1'"),
                                passed("[QuickAccess/Editable] Spec='yes',Phone='yes'"),
                                passed("[QuickAccess/QATitle] Spec='Portal',Phone='Portal'"),
                                passed("[QuickAccess/QAURL] Spec='http://p',Phone='http://p'")))
            << mode;
    }
}

TEST_F(QuickAccess, ExportShowsOtherNumbersAsNothing) {
    const LoadedGroup group{ZEL_SVC_DATA_QUICK_ACCESS};
    zel_svc_data_set_int(ZEL_SVC_DATA_QUICK_ACCESS, "quickaccess", "editable_1", 2);
    EXPECT_THAT(exported_entry(), ElementsAre("", "", ""));
    EXPECT_EQ(export_value(ZEL_SVC_ELEMENT_NB_QUICK_ACCESS), "0");
}

TEST_F(QuickAccess, StartInsideOfAnotherDropsTheOuter) {
    const LoadedGroup group{ZEL_SVC_DATA_QUICK_ACCESS};
    install_spec(leaf("QuickAccess", leaf("QATitle", "outer") + leaf("QuickAccess", leaf("QAURL", "http://inner"))));
    EXPECT_EQ(recorded(group, "count"), "1");
    EXPECT_EQ(recorded(group, "title_1"), "");
    EXPECT_EQ(recorded(group, "url_1"), "http://inner");
}

TEST_F(QuickAccess, ValueOutsideOfAnEntryIsIgnored) {
    const LoadedGroup group{ZEL_SVC_DATA_QUICK_ACCESS};
    install_spec(leaf("QATitle", "lost"));
    EXPECT_THAT(verify_spec(leaf("QATitle", "lost")), IsEmpty());
    EXPECT_EQ(recorded(group, "count"), std::nullopt);
}

TEST_F(QuickAccess, LeftOpenByABrokenDocumentHasNoLineInTheNext) {
    const LoadedGroup group{ZEL_SVC_DATA_QUICK_ACCESS};
    install_spec(entry("yes", "Portal", "http://p"));
    verify_spec("<QuickAccess><QATitle>Portal</QATitle><");
    EXPECT_THAT(verify_spec(leaf("QATitle", "Portal") + leaf("QAURL", "http://p")), IsEmpty());
}

class EManual : public ServicesPhone {
  protected:
    static std::string spec(const std::string &url) { return leaf("eManual", leaf("URL", url)); }
    std::string manual_url() { return call("bookmarks").at("manual_url"); }
};

TEST_F(EManual, UrlGoesToTheServiceAndIsRecorded) {
    const LoadedGroup group{ZEL_SVC_DATA_BROWSER};
    start_journal();
    install_spec(spec("http://manual/?a=1&amp;b=2"));
    EXPECT_EQ(manual_url(), "http://manual/?a=1&b=2");
    EXPECT_EQ(group.text("emanual", "url"), "http://manual/?a=1&b=2");
    EXPECT_EQ(run_log(), "");
    expect_services_closed();
}

TEST_F(EManual, IsNotRecordedWhenTheServiceRefuses) {
    const LoadedGroup group{ZEL_SVC_DATA_BROWSER};
    start_journal();
    for (const char *function : {"bookmark_zel_initialize", "bookmark_zel_set_user_manual_url"}) {
        fail(function, "", 1, 1);
        install_spec(spec("http://manual"));
        EXPECT_EQ(manual_url(), "") << function;
        EXPECT_EQ(group.text("emanual", "url"), std::nullopt) << function;
    }
    EXPECT_EQ(run_log(), "");
    EXPECT_EQ(calls_of("bookmark_zel_deinitialize"), 1);
}

TEST_F(EManual, IsVerified) {
    EXPECT_THAT(verify_spec(spec("http://a")), ElementsAre(failed("[EManual/URL] Spec='http://a',Phone='?\?'")));
    call("bookmarks-manual", {{"url", "http://a"}});
    EXPECT_THAT(verify_spec(spec("http://a")), ElementsAre(passed("[EManual/URL] Spec='http://a',Phone='http://a'")));
    EXPECT_THAT(verify_spec(spec("http://b")), ElementsAre(failed("[EManual/URL] Spec='http://b',Phone='http://a'")));
    call("bookmarks-manual", {{"url", ""}});
    EXPECT_THAT(verify_spec(spec("??")), ElementsAre(passed("[EManual/URL] Spec='?\?',Phone='?\?'")));
}

TEST_F(EManual, IsUnknownWhenTheServiceFails) {
    const LoadedGroup group{ZEL_SVC_DATA_BROWSER};
    install_spec(spec("http://a"));
    start_journal();
    for (const char *function : {"bookmark_zel_initialize", "bookmark_zel_get_user_manual_url"}) {
        fail(function, "", 1, 2);
        EXPECT_THAT(verify_spec(spec("http://a")), ElementsAre(failed("[EManual/URL] Spec='http://a',Phone='?\?'")));
        EXPECT_EQ(export_value(ZEL_SVC_ELEMENT_E_MANUAL_URL), "??") << function;
    }
    EXPECT_EQ(calls_of("bookmark_zel_deinitialize"), 2);
    EXPECT_EQ(run_log(), "");
}

TEST_F(EManual, IsExportedWhereItIsRecorded) {
    const LoadedGroup group{ZEL_SVC_DATA_BROWSER};
    call("bookmarks-manual", {{"url", "http://users.own"}});
    EXPECT_EQ(export_value(ZEL_SVC_ELEMENT_E_MANUAL_URL), "");
    install_spec(spec("http://a"));
    call("bookmarks-manual", {{"url", "http://users.own"}});
    EXPECT_EQ(export_value(ZEL_SVC_ELEMENT_E_MANUAL_URL), "http://users.own");
    call("bookmarks-manual", {{"url", ""}});
    EXPECT_EQ(export_value(ZEL_SVC_ELEMENT_E_MANUAL_URL), "??");
}

TEST_F(EManual, EmptyUrlChangesNothing) {
    const LoadedGroup group{ZEL_SVC_DATA_BROWSER};
    start_journal();
    Occurrence empty{.kind = OccurrenceKind::Value,
                     .element = ZEL_SVC_ELEMENT_E_MANUAL_URL,
                     .tag = "URL",
                     .action = ZEL_SVC_PARSE_ACTION_INSTALL,
                     .mode = ZEL_SVC_PARSE_MODE_FULL};
    kZelSvcElementTable.at(ZEL_SVC_ELEMENT_E_MANUAL_URL).value(empty);
    EXPECT_EQ(group.text("emanual", "url"), std::nullopt);
    EXPECT_EQ(calls_of("bookmark_zel_set_user_manual_url"), 0);
}

TEST_F(EManual, EveryModeInstallsAndVerifiesItWhateverTheFlags) {
    const LoadedGroup group{ZEL_SVC_DATA_BROWSER};
    for (const int mode : {0, 1, 2, 3, 4, 5, 7}) {
        set_auto_flag(ZEL_SVC_AUTO_BOOKMARK, mode % 2);
        const std::string url = "http://mode" + std::to_string(mode);
        install_spec(spec(url), static_cast<ZelSvcParseMode>(mode));
        EXPECT_EQ(manual_url(), url);
        EXPECT_EQ(group.text("emanual", "url"), url);
        EXPECT_THAT(verify_spec(spec(url), static_cast<ZelSvcParseMode>(mode)),
                    ElementsAre(passed("[EManual/URL] Spec='" + url + "',Phone='" + url + "'")));
    }
}

TEST_F(EManual, IsUnknownWhenTheServiceDoesNotCloseButIsInstalled) {
    const LoadedGroup group{ZEL_SVC_DATA_BROWSER};
    fail("bookmark_zel_deinitialize");
    install_spec(spec("http://a"));
    EXPECT_EQ(group.text("emanual", "url"), "http://a");
    EXPECT_THAT(verify_spec(spec("http://a")), ElementsAre(failed("[EManual/URL] Spec='http://a',Phone='?\?'")));
    EXPECT_EQ(export_value(ZEL_SVC_ELEMENT_E_MANUAL_URL), "??");
}

TEST_F(EManual, LongUrlReachesTheServiceWholeAndIsCutInTheRecordAndTheExport) {
    const LoadedGroup group{ZEL_SVC_DATA_BROWSER};
    const std::string url = "http://" + std::string(273, 'u');
    install_spec(spec(url));
    EXPECT_EQ(manual_url(), url);
    EXPECT_EQ(group.text("emanual", "url"), url.substr(0, 255));
    const std::vector<ResultLine> lines = verify_spec(spec(url));
    ASSERT_EQ(lines.size(), 1U);
    EXPECT_TRUE(lines[0].passed) << lines[0];
    EXPECT_FALSE(verify_spec(spec(url.substr(0, 279))).at(0).passed) << "the end counts too";
    EXPECT_EQ(export_value(ZEL_SVC_ELEMENT_E_MANUAL_URL), url.substr(0, 199));
}

} // namespace zel_test
