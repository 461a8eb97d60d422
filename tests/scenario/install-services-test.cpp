// Bookmarks, quick access, manual and data-sync accounts through the entry points, on the example package:
// installed, verified, exported, upgraded, and installed for the operator of a SIM card.

#include "service-phone.h"
#include "support/source-dir.h"

#include <algorithm>
#include <gmock/gmock.h>
#include <memory>

namespace {

using ::testing::ElementsAre;
using ::testing::HasSubstr;

class InstallServices : public zel_test::ServicePhone {
  protected:
    void SetUp() override {
        ServicePhone::SetUp();
        call("package", {{"folder", zel_test::source_dir() + "/examples/package"}});
    }

    std::vector<std::string> titles() {
        std::vector<std::string> result;
        const nlohmann::json answer = call("bookmarks");
        for (const nlohmann::json &bookmark : answer.at("bookmarks"))
            result.push_back(bookmark.at("title"));
        return result;
    }

    // Lines of a verification of the active customer that are about these groups; "+" for passed ones.
    std::vector<std::string> verified() {
        const auto results = std::make_unique<ZelSvcVerificationResult[]>(ZEL_SVC_MAX_RESULTS);
        int count = 0;
        EXPECT_EQ(zel_svc_config_verification(results.get(), &count), 1);
        std::vector<std::string> lines;
        for (int i = 0; i < count; ++i) {
            const ZelSvcVerificationResult &result = results[static_cast<std::size_t>(i)];
            const std::string_view line = result.text;
            for (const char *label :
                 {"[Spec][Browser", "[Spec][Bookmark", "[Spec][QuickAccess", "[Spec][EManual", "[Spec][SyncML_DS"})
                if (line.starts_with(label)) lines.push_back((result.passed == 1 ? "+" : "-") + std::string{line});
        }
        return lines;
    }

    static void install_operator(const char *customer, const char *network) {
        ZelSvcSimOperator chosen{};
        std::snprintf(chosen.customer_name, sizeof chosen.customer_name, "%s", customer);
        std::snprintf(chosen.network_name, sizeof chosen.network_name, "%s", network);
        zel_svc_sim_auto_setting_install_operator(&chosen, 1);
    }
};

} // namespace

TEST_F(InstallServices, FullInstallIsVerifiedLineByLine) {
    zel_svc_config_set_pre_config_for_config_mode("XFV");
    EXPECT_THAT(
        verified(),
        ElementsAre("+[Spec][Browser/CookieOption] Spec='accept',Phone='accept'",
                    "+[Spec][Bookmark/NbBookmark] Spec='3',Phone='3'",
                    "+[Spec][Bookmark1/Editable] Spec='no',Phone='no'", "+[Spec][Bookmark1/Folder] Spec='',Phone=''",
                    "+[Spec][Bookmark1/BookmarkName] Spec='Operator portal',Phone='Operator portal'",
                    "+[Spec][Bookmark1/URL] Spec='http://portal.example.com/',Phone='http://portal.example.com/'",
                    "+[Spec][Bookmark2/Editable] Spec='yes',Phone='yes'",
                    "+[Spec][Bookmark2/Folder] Spec='News & weather',Phone='News & weather'",
                    "+[Spec][Bookmark2/BookmarkName] Spec='News',Phone='News'",
                    "+[Spec][Bookmark2/URL] Spec='http://news.example.com/?edition=in&size=small',"
                    "Phone='http://news.example.com/?edition=in&size=small'",
                    "+[Spec][Bookmark3/Editable] Spec='yes',Phone='yes'",
                    "+[Spec][Bookmark3/Folder] Spec='News & weather',Phone='News & weather'",
                    "+[Spec][Bookmark3/BookmarkName] Spec='Weather',Phone='Weather'",
                    "+[Spec][Bookmark3/URL] Spec='http://weather.example.com/',Phone='http://weather.example.com/'",
                    "+[Spec][QuickAccess/NbQuickAccess] Spec='2',Phone='2'",
                    "+[Spec][QuickAccess/Editable] Spec='no',Phone='no'",
                    "+[Spec][QuickAccess/QATitle] Spec='Portal',Phone='Portal'",
                    "+[Spec][QuickAccess/QAURL] Spec='http://portal.example.com/',Phone='http://portal.example.com/'",
                    "+[Spec][QuickAccess/Editable] Spec='yes',Phone='yes'",
                    "+[Spec][QuickAccess/QATitle] Spec='Search',Phone='Search'",
                    "+[Spec][QuickAccess/QAURL] Spec='http://search.example.com/',Phone='http://search.example.com/'",
                    "+[Spec][EManual/URL] Spec='http://manual.example.com/q7n0/in/',"
                    "Phone='http://manual.example.com/q7n0/in/'",
                    "+[Spec][SyncML_DS/NbDataSync] Spec='1',Phone='1'",
                    "+[Spec][SyncML_DS1/AccName] Spec='Example backup',Phone='Example backup'",
                    "+[Spec][SyncML_DS1/ServAddr] Spec='http://sync.example.com/ds',Phone='http://sync.example.com/ds'",
                    "+[Spec][SyncML_DS1/UserId] Spec='example',Phone='example'",
                    "+[Spec][SyncML_DS1/Password] Spec='example',Phone='example'",
                    "+[Spec][SyncML_DS1/Contact_EnableFlag] Spec='on',Phone='on'",
                    "+[Spec][SyncML_DS1/Contact_DBName] Spec='contacts',Phone='contacts'",
                    "+[Spec][SyncML_DS1/Contact_DBId] Spec='example',Phone='example'",
                    "+[Spec][SyncML_DS1/Contact_DBPassword] Spec='example',Phone='example'",
                    "+[Spec][SyncML_DS1/Calendar_EnableFlag] Spec='off',Phone='off'",
                    "+[Spec][SyncML_DS1/Calendar_DBName] Spec='calendar',Phone='calendar'",
                    "+[Spec][SyncML_DS1/Calendar_DBId] Spec='example',Phone='example'",
                    "+[Spec][SyncML_DS1/Calendar_DBPassword] Spec='example',Phone='example'"));
}

TEST_F(InstallServices, WhatTheUserChangedFailsItsLines) {
    zel_svc_config_set_pre_config_for_config_mode("XFV");
    call("bookmarks-clear");
    call("bookmarks-manual", {{"url", ""}});
    call("sync-accounts-clear");
    set_int("file/private/com.quorvex.browser/cookie", 0);
    std::vector<std::string> failed = verified();
    std::erase_if(failed, [](const std::string &line) { return line.front() == '+'; });
    EXPECT_THAT(
        failed,
        ElementsAre("-[Spec][Browser/CookieOption] Spec='accept',Phone='reject'",
                    "-[Spec][Bookmark/NbBookmark] Spec='3',Phone='0'", "-[Spec][Bookmark1] Reading phone failed",
                    "-[Spec][Bookmark2] Reading phone failed", "-[Spec][Bookmark3] Reading phone failed",
                    "-[Spec][EManual/URL] Spec='http://manual.example.com/q7n0/in/',Phone='?\?'",
                    "-[Spec][SyncML_DS/NbDataSync] Spec='1',Phone='0'", "-[Spec][SyncML_DS1] Reading phone failed"));
}

TEST_F(InstallServices, ExportHoldsThePhonesItems) {
    zel_svc_config_set_pre_config_for_config_mode("XFV");
    EXPECT_EQ(zel_svc_config_encoding_xml(), 1);
    const std::string document = read("/opt/system/zel-default/output/customer-phone.xml");
    EXPECT_THAT(document, HasSubstr("    <Browser>\n"
                                    "      <CookieOption>accept</CookieOption>\n"
                                    "      <NbBookmark>3</NbBookmark>\n"
                                    "      <Bookmark>\n"
                                    "        <Editable>no</Editable>\n"
                                    "        <Folder></Folder>\n"
                                    "        <BookmarkName>Operator portal</BookmarkName>\n"
                                    "        <URL>http://portal.example.com/</URL>\n"
                                    "      </Bookmark>\n"));
    EXPECT_THAT(document, HasSubstr("        <Folder>News &amp; weather</Folder>\n"
                                    "        <BookmarkName>Weather</BookmarkName>\n"));
    EXPECT_THAT(document, HasSubstr("      <NbQuickAccess>2</NbQuickAccess>\n"
                                    "      <QuickAccess>\n"
                                    "        <Editable>no</Editable>\n"
                                    "        <QATitle>Portal</QATitle>\n"
                                    "        <QAURL>http://portal.example.com/</QAURL>\n"
                                    "      </QuickAccess>\n"));
    EXPECT_THAT(document, HasSubstr("      <eManual>\n"
                                    "        <URL>http://manual.example.com/q7n0/in/</URL>\n"
                                    "      </eManual>\n"));
    EXPECT_THAT(document, HasSubstr("    <SyncML>\n"
                                    "      <NbDataSync>1</NbDataSync>\n"
                                    "      <DataSync>\n"
                                    "        <AccName>Example backup</AccName>\n"
                                    "        <ServAddr>http://sync.example.com/ds</ServAddr>\n"
                                    "        <UserId>example</UserId>\n"
                                    "        <Password>example</Password>\n"
                                    "        <DBList>\n"
                                    "          <ContactDB>\n"
                                    "            <EnableFlag>on</EnableFlag>\n"));
}

TEST_F(InstallServices, UpgradeMakesTheBookmarksAnewAndLeavesTheRest) {
    zel_svc_config_set_pre_config_for_config_mode("XFV");
    call("bookmarks-add", {{"title", "user's"}, {"url", "http://u"}});
    call("bookmarks-manual", {{"url", "http://users"}});
    call("sync-accounts-add", {{"name", "user's"}});
    const std::string quick_access = read(data_path("quick-access"));
    zel_svc_config_upgrade_pre_config_for_normal_booting();
    EXPECT_THAT(titles(), ElementsAre("Operator portal", "News & weather", "News", "Weather"));
    EXPECT_THAT(read(data_path("bookmark")), ::testing::ContainsRegex("count += 3\n"));
    EXPECT_EQ(call("bookmarks").at("manual_url"), "http://users");
    EXPECT_EQ(call("sync-accounts").at("accounts").size(), 2U);
    EXPECT_EQ(read(data_path("quick-access")), quick_access);
}

TEST_F(InstallServices, OperatorsBookmarksComeWithTheSim) {
    zel_svc_config_set_pre_config_for_config_mode("TFG");
    EXPECT_THAT(titles(), ElementsAre());
    call("bookmarks-add", {{"title", "user's"}, {"url", "http://u"}});
    install_operator("TFG", "Tuenti Móvil");
    EXPECT_THAT(titles(), ElementsAre("Ejemplo para todos", "Operador", "Portal Tuenti"));
    EXPECT_THAT(read(data_path("bookmark")), ::testing::ContainsRegex("name_2 += \"Portal Tuenti\"\n"));
    install_operator("TFG", "Movistar (Telefónica)");
    EXPECT_THAT(titles(), ElementsAre("Ejemplo para todos", "Operador", "Portal Movistar"));
    install_operator("TFG", "Euskaltel");
    EXPECT_THAT(titles(), ElementsAre("Ejemplo para todos"));
}

TEST_F(InstallServices, FailuresOfOneItemLeaveTheOthersAndTheRun) {
    call("fault-add", {{"function", "bookmark_zel_create"}, {"text", "News"}});
    call("fault-add", {{"function", "sync_agent_ds_add_profile"}});
    zel_svc_config_set_pre_config_for_config_mode("XFV");
    EXPECT_THAT(titles(), ElementsAre("Operator portal", "News & weather", "Weather"));
    EXPECT_TRUE(logged_in_order({"[Bookmark/Start] Set bookmark.", "[Bookmark/Start] Set bookmark.",
                                 "[Bookmark/Error] Run create().", "[Bookmark/Ended] Set bookmark.",
                                 "[Bookmark/Start] Set bookmark.", "[Bookmark/Ended] Set bookmark.",
                                 "[SyncML_DS/Start] Set info.", "[SyncML_DS/Error] Run add().",
                                 "[SyncML_DS/Ended] Set info.", "[Config/Ended] Install customer.xml (Full)."}));
    EXPECT_THAT(read(data_path("bookmark")), ::testing::ContainsRegex("count += 2\n"));
    EXPECT_THAT(read(data_path("bookmark")), ::testing::ContainsRegex("name_2 += \"Weather\"\n"));
    EXPECT_FALSE(exists(data_path("syncml-ds")) && read(data_path("syncml-ds")).find("account") != std::string::npos);
}
