// Applications: the lists that the package tool installs, and what becomes of the operator applications.

#include "service-phone.h"
#include "support/operator-apps.h"

#include <filesystem>
#include <gmock/gmock.h>

namespace {

using ::testing::ElementsAre;
using ::testing::IsEmpty;
using zel_test::kOperatorApps;

constexpr const char *kAppFolder = "/opt/system/zel-default/app";

class Apps : public zel_test::ServicePhone {
  protected:
    void write_list(const std::string &package, const std::string &name, const std::string &application) {
        write("/opt/system/zel/preconfig/" + package + "/app/" + name,
              "[zel packages]\nname_001 = " + application + "\ntype_001 = tpk\n");
    }
    // The commands that the phone was asked to run, in order.
    std::vector<std::string> commands() {
        const nlohmann::json journal = call("journal-list");
        std::vector<std::string> found;
        for (const auto &entry : journal.at("calls"))
            if (entry.at("function") == "zel_platform_command") found.push_back(entry.at("text"));
        return found;
    }
    std::vector<std::string> lines_with(const std::string &word) {
        std::vector<std::string> found;
        for (const std::string &line : run_log_lines())
            if (line.find(word) != std::string::npos) found.push_back(line);
        return found;
    }
};

TEST_F(Apps, BothListsAreInstalled) {
    write_list("DEF", "applist_def.ini", "com.example.notes");
    write_list("BTU", "applist.ini", "com.example.map");
    write(std::string{kAppFolder} + "/old/file", "old");
    call("journal-start");
    zel_svc_config_install_customer("BTU", ZEL_SVC_INSTALL_CONFIG_MODE);
    EXPECT_THAT(commands(), ElementsAre("/usr/bin/pkgcmd -S /opt/system/zel-default/app/applist_def.ini -p "
                                        "/opt/system/zel-default/app/appresult_def.ini",
                                        "/usr/bin/pkgcmd -S /opt/system/zel-default/app/applist.ini -p "
                                        "/opt/system/zel-default/app/appresult.ini"));
    EXPECT_THAT(lines_with("App"),
                ElementsAre("[Config/Start] Install default App.", "[Config/Ended] Install default App.",
                            "[Config/Start] Install customer App.", "[Config/Ended] Install customer App.",
                            "[Config] No need to disable App as default."));
    EXPECT_FALSE(exists(std::string{kAppFolder} + "/old"));
    EXPECT_NE(read(std::string{kAppFolder} + "/appresult_def.ini").find("success"), std::string::npos);
    EXPECT_NE(read(std::string{kAppFolder} + "/appresult.ini").find("com.example.map"), std::string::npos);
    EXPECT_EQ(call("app-list").at("applications").size(), 2U);
}

TEST_F(Apps, WithoutListsNothingIsInstalled) {
    write(std::string{kAppFolder} + "/applist.ini", "of an earlier install");
    call("journal-start");
    zel_svc_config_install_customer("BTU", ZEL_SVC_INSTALL_NORMAL_BOOTING);
    EXPECT_THAT(commands(), IsEmpty());
    EXPECT_TRUE(logged_in_order({"[Config] Default applist not existed.", "[Config] Customer applist not existed."}));
    EXPECT_TRUE(exists(kAppFolder));
    EXPECT_FALSE(exists(std::string{kAppFolder} + "/applist.ini"));
    EXPECT_EQ(laps().at(4), "App");
}

TEST_F(Apps, AListThatCannotBeCopiedCountsAsNone) {
    write_list("DEF", "applist_def.ini", "com.example.notes");
    write_list("BTU", "applist.ini", "com.example.map");
    fail("disk_full", std::string{kAppFolder} + "/applist_def.ini");
    fail("disk_full", std::string{kAppFolder} + "/applist.ini");
    call("journal-start");
    zel_svc_config_install_customer("BTU", ZEL_SVC_INSTALL_CONFIG_MODE);
    const auto none = {"[Config] Default applist not existed.", "[Config] Customer applist not existed.",
                       "[Config] No need to disable App as default."};
    EXPECT_THAT(lines_with("pp"), ::testing::IsSupersetOf(none));
    EXPECT_THAT(lines_with("Install default App"), IsEmpty());
    EXPECT_THAT(commands(), IsEmpty());
}

TEST_F(Apps, WithoutTheirFolderNothingIsInstalled) {
    write_list("DEF", "applist_def.ini", "com.example.notes");
    write_list("BTU", "applist.ini", "com.example.map");
    std::filesystem::remove_all(root() + kAppFolder);
    call("journal-start");
    zel_svc_config_install_customer("BTU", ZEL_SVC_INSTALL_CONFIG_MODE);
    EXPECT_TRUE(logged_in_order({"[Config] Default applist not existed.", "[Config] Customer applist not existed."}));
    EXPECT_THAT(commands(), IsEmpty());
}

TEST_F(Apps, AFailedToolIsIgnored) {
    write_list("DEF", "applist_def.ini", "com.example.notes");
    write_list("BTU", "applist.ini", "com.example.map");
    call("tool-remove", {{"path", "/usr/bin/pkgcmd"}});
    zel_svc_config_install_customer("BTU", ZEL_SVC_INSTALL_CONFIG_MODE);
    EXPECT_TRUE(logged_in_order({"[Config/Ended] Install default App.", "[Config/Ended] Install customer App."}));
    EXPECT_FALSE(exists(std::string{kAppFolder} + "/appresult_def.ini"));
}

TEST_F(Apps, AFotaUpgradeTouchesNone) {
    write_list("DEF", "applist_def.ini", "com.example.notes");
    write(std::string{kAppFolder} + "/kept", "kept");
    zel_svc_config_install_customer("INS", ZEL_SVC_INSTALL_FOTA_MODE);
    EXPECT_THAT(lines_with("App"), IsEmpty());
    EXPECT_EQ(read(std::string{kAppFolder} + "/kept"), "kept");
}

TEST_F(Apps, OtherCustomersHaveNoOperatorApps) {
    write("/opt/usr/apps/com.skatamfa.beats/bin/jiobeats", "app");
    write("/opt/usr/apps/com.skatamfa.apptray/bin/jioapps", "app");
    zel_svc_config_install_customer("BTU", ZEL_SVC_INSTALL_NORMAL_BOOTING);
    EXPECT_TRUE(logged_in_order({"[Config] No need to check App existence.", "[Config] Default applist not existed.",
                                 "[Config] No need to disable App as default.",
                                 "[Config] No need to remove App manually(FOTA)."}));
    EXPECT_TRUE(call("app-list").at("applications").empty());
    EXPECT_TRUE(exists("/opt/usr/apps/com.skatamfa.apptray/bin/jioapps"));
}

// Which of the four are there before the upgrade, bit by bit. The package tool's result file stands for an
// application that the upgrade brings: the tool writes it where the application's executable lies.
class OperatorApps : public Apps {
  protected:
    void prepare(unsigned before) {
        for (unsigned i = 0; i < 4; ++i)
            if (zel_test::holds(before, i)) write(kOperatorApps[i].executable, "old");
    }
    // What a normal start is expected to log.
    static std::vector<std::string> expected_lines(unsigned before, unsigned after) {
        std::vector<std::string> lines = zel_test::lines_of_check(before);
        for (const char *line : {"[Config/Start] Install default App.", "[Config/Ended] Install default App."})
            lines.emplace_back(line);
        const std::vector<std::string> disable = zel_test::lines_of_disable(before, after);
        lines.insert(lines.end(), disable.begin(), disable.end());
        for (const char *line : {"[Config/Start] Remove App manually(FOTA).", "[Config] SkatamfaApps App NOT existed.",
                                 "[Config/Ended] Remove App manually(FOTA)."})
            lines.emplace_back(line);
        return lines;
    }
    void write_default_list() { write_list("DEF", "applist_def.ini", "com.example.notes"); }
};

// One application comes or goes with the upgrade; the other three were there or not throughout.
struct OneChanges : OperatorApps, ::testing::WithParamInterface<unsigned> {};

TEST_P(OneChanges, WithAnyOfTheOthersThere) {
    const unsigned changing = GetParam();
    write_default_list();
    const unsigned others = zel_test::kEveryOperatorApp & ~(1U << changing);
    for (const unsigned before : {0U, others})
        for (const bool comes : {false, true}) {
            call("reset");
            prepare(before);
            if (comes)
                call("tool-add",
                     {{"path", "/usr/bin/pkgcmd"}, {"file", kOperatorApps[changing].executable}, {"content", "new"}});
            if (comes) write(std::string{kOperatorApps[changing].executable} + ".parent", "");
            zel_svc_config_install_customer("INS", ZEL_SVC_INSTALL_NORMAL_BOOTING);
            const unsigned after = before | (comes ? 1U << changing : 0U);
            EXPECT_TRUE(logged_in_order(expected_lines(before, after))) << before << ' ' << after;
            const nlohmann::json list = call("app-list");
            const std::string handled = comes ? kOperatorApps[changing].package : "com.example.notes";
            for (const auto &one : list.at("applications"))
                EXPECT_EQ(one.at("name"), handled);
            EXPECT_EQ(lines_with("is disabled").size(), comes ? 1U : 0U);
        }
}

INSTANTIATE_TEST_SUITE_P(Index, OneChanges, ::testing::Range(0U, 4U));

// A full install knows of no time before: whatever is there is disabled.
TEST_F(OperatorApps, AFullInstallDisablesWhateverIsThere) {
    for (unsigned there = 0; there <= zel_test::kEveryOperatorApp; ++there) {
        call("reset");
        prepare(there);
        call("journal-start");
        zel_svc_config_install_customer("INS", ZEL_SVC_INSTALL_CONFIG_MODE);
        std::vector<std::string> expected;
        for (unsigned i = 0; i < 4; ++i)
            if (zel_test::holds(there, i))
                expected.push_back(std::string{"/usr/bin/pkg -d "} + kOperatorApps[i].package);
        EXPECT_EQ(commands(), expected) << there;
        EXPECT_TRUE(lines_with("App existence").empty());
        EXPECT_TRUE(lines_with("manually").empty());
    }
}

TEST_F(OperatorApps, AreDisabledBehindTheLapOfTheLists) {
    prepare(1);
    write_default_list();
    call("journal-start");
    zel_svc_config_install_customer("INS", ZEL_SVC_INSTALL_CONFIG_MODE);
    const nlohmann::json journal = call("journal-list");
    std::vector<std::string> found; // the commands and the written laps between them
    for (const auto &entry : journal.at("calls")) {
        const bool command = entry.at("function") == "zel_platform_command";
        const bool lap = entry.at("text") == kLapLog && !found.empty() && found.back() != "lap";
        if (command || lap) found.push_back(lap ? "lap" : entry.at("text").get<std::string>());
    }
    ASSERT_GE(found.size(), 3U);
    EXPECT_TRUE(found[0].starts_with("/usr/bin/pkgcmd ")) << found[0];
    EXPECT_EQ(found[1], "lap");
    EXPECT_EQ(found[2], "/usr/bin/pkg -d com.skatamfa.beats");
}

TEST_F(OperatorApps, ARefusedDisableShowsItsStatus) {
    prepare(0b1001);
    call("app-refuse", {{"name", "com.skatamfa.beats"}, {"answer", "fail"}});
    zel_svc_config_install_customer("INS", ZEL_SVC_INSTALL_CONFIG_MODE);
    EXPECT_TRUE(
        logged_in_order({"[Config] SkatamfaBeats App is disabled(result=256).",
                         "[Config] MySkatamfa App is disabled(result=0).", "[Config/Ended] Disable App as default."}));
}

TEST_F(OperatorApps, WithoutTheToolTheShellsStatusIsShown) {
    prepare(0b0100);
    call("tool-remove", {{"path", "/usr/bin/pkg"}});
    zel_svc_config_install_customer("INS", ZEL_SVC_INSTALL_CONFIG_MODE);
    EXPECT_TRUE(logged("[Config] SkatamfaXPressNews App is disabled(result=32512)."));
}

TEST_F(OperatorApps, TheTrayIsRemovedOnTheFirstNormalStart) {
    write("/opt/usr/apps/com.skatamfa.apptray/bin/jioapps", "app");
    call("journal-start");
    zel_svc_config_install_customer("INS", ZEL_SVC_INSTALL_NORMAL_BOOTING);
    EXPECT_TRUE(logged_in_order({"[Config/Start] Remove App manually(FOTA).", "[Config] SkatamfaApps App existed.",
                                 "[Config] SkatamfaApps App is removed(result=0).",
                                 "[Config/Ended] Remove App manually(FOTA)."}));
    EXPECT_THAT(commands(),
                ElementsAre("/usr/bin/rpm-backend -c path=com.skatamfa.apptray:op=uninstall:removable=true"));
    EXPECT_FALSE(exists("/opt/usr/apps/com.skatamfa.apptray"));
}

TEST_F(OperatorApps, ARefusedRemovalShowsItsStatus) {
    write("/opt/usr/apps/com.skatamfa.apptray/bin/jioapps", "app");
    call("tool-add", {{"path", "/usr/bin/rpm-backend"}, {"status", 9}, {"does", "uninstall"}});
    zel_svc_config_install_customer("INS", ZEL_SVC_INSTALL_NORMAL_BOOTING);
    EXPECT_TRUE(logged_in_order(
        {"[Config] SkatamfaApps App is removed(result=2304).", "[Config/Ended] Remove App manually(FOTA)."}));
    EXPECT_TRUE(exists("/opt/usr/apps/com.skatamfa.apptray/bin/jioapps"));
}

} // namespace
