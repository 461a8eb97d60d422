// The frame of the install run: lines, laps, kinds, groups. What the elements do is tested with them.

#include "service-phone.h"

#include <gmock/gmock.h>

namespace {

using ::testing::ElementsAre;
using ::testing::MatchesRegex;

constexpr const char *kHomeWallpaper = "/opt/usr/share/settings/Wallpapers/Home_default.png";

class InstallRun : public zel_test::ServicePhone {};

struct TwoSlots : InstallRun {
    TwoSlots() { create_arguments["sims"] = 2; }
};

constexpr const char *kAllFlagsOn =
    "<Settings><Main><Network><AutoProfile>on</AutoProfile><AutoVoicemail>on</AutoVoicemail>"
    "<AutoEmailAccount>on</AutoEmailAccount><AutoBookmark>on</AutoBookmark><AutoFastDormancy>on</AutoFastDormancy>"
    "<AutoWbAmr>on</AutoWbAmr><AutoMaxPDP>on</AutoMaxPDP></Network></Main></Settings>";

const std::vector<std::string> kUpgradedGroups = {"connection", "bookmark",      "voice-mail", "email-account",
                                                  "wb-amr",     "fast-dormancy", "max-pdp",    "ims"};
const std::vector<std::string> kOtherGroups = {"security",     "network",   "contact", "calendar",    "multimedia",
                                               "connectivity", "message",   "email",   "active-sync", "browser",
                                               "quick-access", "syncml-ds", "gps"};
const std::vector<std::string> kSecondSimGroups = {"connection-2", "fast-dormancy-2", "max-pdp-2", "voice-mail-2",
                                                   "ims-2"};

} // namespace

TEST_F(InstallRun, ConfigModeHasItsPhasesInOrder) {
    zel_svc_config_install_customer("BTU", ZEL_SVC_INSTALL_CONFIG_MODE);
    EXPECT_TRUE(logged_in_order({
        "[Config/Start] Install customer('BTU') to install full configuration on Config mode.",
        "[Config/Start] Install customer.xml (Full).",
        "[Config/Ended] Install customer.xml (Full).",
        "[Config] SIM slot count=1.",
        "[Config/Success] Clear information for SIM Auto Setting.",
        "[Config/Start] Install ZEL Preset.",
        "[Config/Ended] Install ZEL Preset.",
        "[Config/Start] Copy user folder.",
        "[Config/Ended] Copy user folder.",
        "[Config/Start] Install ZEL FS.",
        "[Config/Ended] Install ZEL FS.",
        "[Config/Start] Set power animation.",
        "[Config/Ended] Set power animation.",
        "[Config/Start] Install default wallpapar by H/W color.",
        "[Config/Ended] Install default wallpapar by H/W color",
        "[Config] No need to disable App as default.",
        "[Config/Ended] Install customer('BTU') to install full configuration on Config mode.",
    }));
    EXPECT_FALSE(logged("[Config/Start] Install customer.xml for dual SIM device."));
    EXPECT_FALSE(logged("[Config] No need to check App existence."));
    EXPECT_FALSE(logged("[Config] No need to remove App manually(FOTA)."));
    EXPECT_THAT(laps(), ElementsAre("Spec", "Preset", "Usr", "FS update", "App", "Collect", "All on Config mode"));
    EXPECT_TRUE(exists("/opt/system/zel-default/output/zel-fs-status-config.ini"));
}

TEST_F(InstallRun, FotaModeHasItsPhasesInOrder) {
    zel_svc_config_install_customer("BTU", ZEL_SVC_INSTALL_FOTA_MODE);
    EXPECT_TRUE(logged_in_order({
        "[Config/Start] Install customer('BTU') to upgrade configuration on FOTA mode.",
        "[Config/Success] Clear information for SIM Auto Setting.",
        "[Config/Start] Upgrade ZEL Preset.",
        "[Config/Ended] Upgrade ZEL Preset.",
        "[Config/Start] Copy user folder.",
        "[Config/Ended] Copy user folder.",
        "[Config/Start] Upgrade ZEL FS.",
        "[Config/Ended] Upgrade ZEL FS.",
        "[Config/Start] Set power animation.",
        "[Config/Ended] Set power animation.",
        "[Config/Start] Install default wallpapar by H/W color.",
        "[Config/Ended] Install default wallpapar by H/W color",
        "[Config/Ended] Install customer('BTU') to upgrade configuration on FOTA mode.",
    }));
    for (const std::string &line : run_log_lines())
        EXPECT_TRUE(line.find("customer.xml") == std::string::npos && line.find("App") == std::string::npos) << line;
    EXPECT_THAT(laps(), ElementsAre("Preset", "Usr", "FS update", "All on FOTA mode"));
    EXPECT_FALSE(exists("/opt/system/zel-default/output/zel-fs-status-config.ini"));
}

TEST_F(InstallRun, NormalBootingHasItsPhasesInOrder) {
    zel_svc_config_install_customer("BTU", ZEL_SVC_INSTALL_NORMAL_BOOTING);
    EXPECT_TRUE(logged_in_order({
        "[Config/Start] Install customer('BTU') to upgrade configuration on Normal booting.",
        "[Config/Start] Install customer.xml (Upgrade).",
        "[Config/Ended] Install customer.xml (Upgrade).",
        "[Config] SIM slot count=1.",
        "[Config] No need to check App existence.",
        "[Config] No need to disable App as default.",
        "[Config] No need to remove App manually(FOTA).",
        "[Config/Ended] Install customer('BTU') to upgrade configuration on Normal booting.",
    }));
    for (const std::string &line : run_log_lines())
        for (const char *absent : {"SIM Auto Setting", "Preset", "user folder", "FS", "animation", "wallpa"})
            EXPECT_EQ(line.find(absent), std::string::npos) << line;
    EXPECT_THAT(laps(),
                ElementsAre("Spec/NetworkInfo", "Spec/APN", "Spec/Bookmark", "Spec", "App", "All on Normal booting"));
    EXPECT_FALSE(exists("/opt/system/zel-default/output/zel-fs-status-config.ini"));
}

TEST_F(InstallRun, AnyOtherKindWritesTheConfigModesFrame) {
    for (const int kind : {3, -1, 100}) {
        write("/opt/system/zel-default/output/zel-config.log", "");
        zel_svc_config_install_customer("BTU", kind);
        EXPECT_EQ(run_log(), "[Config/Start] Install customer('BTU') to install full configuration on Config mode.\n"
                             "[Config/Ended] Install customer('BTU') to install full configuration on Config mode.\n");
        EXPECT_THAT(laps(), ElementsAre("All on Config mode"));
    }
    EXPECT_FALSE(exists(data_path("gps")));
}

TEST_F(InstallRun, NormalBootingKeepsTheLapsOfTheFotaMode) {
    zel_svc_config_install_customer("BTU", ZEL_SVC_INSTALL_FOTA_MODE);
    zel_svc_config_install_customer("BTU", ZEL_SVC_INSTALL_NORMAL_BOOTING);
    EXPECT_THAT(laps(), ElementsAre("Preset", "Usr", "FS update", "All on FOTA mode", "Spec/NetworkInfo", "Spec/APN",
                                    "Spec/Bookmark", "Spec", "App", "All on Normal booting"));
    zel_svc_config_install_customer("BTU", 3);
    EXPECT_THAT(laps(), ElementsAre("All on Config mode"));
}

TEST_F(InstallRun, TheSystemLogFramesTheRun) {
    zel_svc_config_install_customer("BTU", 3);
    const std::vector<std::string> log = system_log();
    ASSERT_EQ(log.size(), 3U);
    EXPECT_THAT(log[0], MatchesRegex("zel-svc-configuration-install.cpp: zel_svc_config_install_customer.[0-9]+. > "
                                     "API.customer='BTU'. entered.\n"));
    EXPECT_THAT(log[1], MatchesRegex(".*> remove.ZelTimeLap.=-1 run.\n"));
    EXPECT_THAT(log[2], MatchesRegex("zel-svc-configuration-install.cpp: zel_svc_config_install_customer.[0-9]+. > "
                                     "Installation ended.\n"));
}

TEST_F(InstallRun, TheCodeIsCutTo9Bytes) {
    write("/opt/system/zel/preconfig/ABCDEFGHI/power-ani/poweron.edj", "");
    zel_svc_config_install_customer("ABCDEFGHIJKL", ZEL_SVC_INSTALL_FOTA_MODE);
    EXPECT_TRUE(logged("[Config/Start] Install customer('ABCDEFGHI') to upgrade configuration on FOTA mode."));
    EXPECT_EQ(get_string("db/zel/power_ani_file_path"), "/opt/system/zel/preconfig/ABCDEFGHI/power-ani");
}

TEST_F(InstallRun, TheCodeIsNotMappedToAnotherFolder) {
    write("/opt/system/zel/preconfig/UFN/power-ani/poweron.edj", "");
    write("/opt/system/zel/preconfig/TFG/power-ani/poweron.edj", "");
    zel_svc_config_install_customer("UFN", ZEL_SVC_INSTALL_FOTA_MODE);
    EXPECT_EQ(get_string("db/zel/power_ani_file_path"), "/opt/system/zel/preconfig/UFN/power-ani");
}

TEST_F(InstallRun, NullDoesNothing) {
    zel_svc_config_install_customer(nullptr, ZEL_SVC_INSTALL_CONFIG_MODE);
    EXPECT_EQ(run_log(), "");
    EXPECT_TRUE(system_log().empty());
}

TEST_F(InstallRun, TheFullInstallStartsEveryGroupAfresh) {
    write("/opt/system/zel-default/data/zel-default-data.ini", "[mark]\n\nmark:kept = 1\n\n");
    for (const auto &groups : {kUpgradedGroups, kOtherGroups})
        for (const std::string &group : groups)
            mark_group(group);
    zel_svc_config_install_customer("BTU", ZEL_SVC_INSTALL_CONFIG_MODE);
    EXPECT_EQ(read("/opt/system/zel-default/data/zel-default-data.ini").find("kept"), std::string::npos);
    for (const auto &groups : {kUpgradedGroups, kOtherGroups})
        for (const std::string &group : groups)
            EXPECT_FALSE(group_is_marked(group)) << group;
}

TEST_F(InstallRun, AnUpgradeStartsTheGroupsOfItsPassesAfresh) {
    for (const auto &groups : {kUpgradedGroups, kOtherGroups, kSecondSimGroups})
        for (const std::string &group : groups)
            mark_group(group);
    zel_svc_config_install_customer("BTU", ZEL_SVC_INSTALL_NORMAL_BOOTING);
    for (const std::string &group : kUpgradedGroups)
        EXPECT_FALSE(group_is_marked(group)) << group;
    for (const auto &groups : {kOtherGroups, kSecondSimGroups})
        for (const std::string &group : groups)
            EXPECT_TRUE(group_is_marked(group)) << group;
}

TEST_F(InstallRun, WithEveryAutoFlagAnUpgradeReadsNetworksAndImsOnly) {
    write_customer("BTU", kAllFlagsOn);
    for (const std::string &group : kUpgradedGroups)
        mark_group(group);
    zel_svc_config_install_customer("BTU", ZEL_SVC_INSTALL_NORMAL_BOOTING);
    for (const std::string &group : kUpgradedGroups)
        EXPECT_EQ(group_is_marked(group), group != "ims") << group;
    EXPECT_THAT(laps(), ElementsAre("Spec/NetworkInfo", "Spec", "App", "All on Normal booting"));
}

TEST_F(InstallRun, FotaModeReadsNoCustomerFile) {
    write_customer("BTU", "<GeneralInfo><CountryISO>ZA</CountryISO></GeneralInfo>");
    for (const auto &groups : {kUpgradedGroups, kOtherGroups})
        for (const std::string &group : groups)
            mark_group(group);
    zel_svc_config_install_customer("BTU", ZEL_SVC_INSTALL_FOTA_MODE);
    EXPECT_EQ(get_string("db/zel/country_iso"), std::nullopt);
    for (const auto &groups : {kUpgradedGroups, kOtherGroups})
        for (const std::string &group : groups)
            EXPECT_TRUE(group_is_marked(group)) << group;
}

TEST_F(InstallRun, TheFullInstallReadsTheCustomersFile) {
    write_customer("BTU", "<GeneralInfo><CountryISO>ZA</CountryISO></GeneralInfo>");
    zel_svc_config_install_customer("BTU", ZEL_SVC_INSTALL_CONFIG_MODE);
    EXPECT_EQ(get_string("db/zel/country_iso"), "ZA");
    EXPECT_EQ(get_string("db/zel/text_string_country"), "ZA");
}

TEST_F(InstallRun, AnUpgradeLeavesTheCountryAlone) {
    write_customer("BTU", "<GeneralInfo><CountryISO>ZA</CountryISO></GeneralInfo>");
    zel_svc_config_install_customer("BTU", ZEL_SVC_INSTALL_NORMAL_BOOTING);
    EXPECT_EQ(get_string("db/zel/country_iso"), std::nullopt);
}

class CodeWithoutFolder : public InstallRun, public ::testing::WithParamInterface<const char *> {};

TEST_P(CodeWithoutFolder, InstallsNothingAndWritesAllLines) {
    const std::string document =
        "\xEF\xBB\xBF<CustomerData><GeneralInfo><CountryISO>ZA</CountryISO></GeneralInfo></CustomerData>";
    for (const char *folder : {"", "Customer/", "Customer/a/b/"})
        write("/opt/system/zel/mps/ZEL/" + std::string(folder) + "customer.xml", document);
    for (const char *folder : {"", "preconfig/", "preconfig/a/b/"}) {
        write("/opt/system/zel/" + std::string(folder) + "power-ani/poweron.edj", "");
        write("/opt/system/zel/" + std::string(folder) + "usr/file", "");
        write("/opt/system/zel/" + std::string(folder) + "preset/zel-preset.ini", "[default]\nlockscreen_theme = 1\n");
        write("/opt/system/zel/" + std::string(folder) + "fsupdate/fs/opt/copied", "");
        write("/opt/system/zel/" + std::string(folder) + "fsupdate/zel-fsupdate.ini",
              "[rel]\nversion = 3\n1_rm = /opt/kept\n");
        write("/opt/system/zel/" + std::string(folder) + "app/applist.ini", "[zel packages]\nname_001 = a\n");
    }
    write("/opt/kept", "");
    write("/poweron.edj", "");
    zel_svc_config_install_customer(GetParam(), ZEL_SVC_INSTALL_CONFIG_MODE);
    EXPECT_EQ(get_string("db/zel/country_iso"), std::nullopt);
    EXPECT_EQ(get_string("db/zel/power_ani_file_path"), std::nullopt);
    EXPECT_FALSE(exists("/opt/system/zel-default/usr/file"));
    EXPECT_EQ(get_int("db/lockscreen/style"), std::nullopt);
    EXPECT_FALSE(exists("/opt/copied"));
    EXPECT_TRUE(exists("/opt/kept"));
    EXPECT_TRUE(logged("[Config] Customer applist not existed."));
    const std::string name = GetParam();
    EXPECT_TRUE(logged_in_order({
        "[Config/Start] Install customer('" + name + "') to install full configuration on Config mode.",
        "[Config/Start] Install customer.xml (Full).",
        "[Config/Ended] Install customer.xml (Full).",
        "[Config/Ended] Copy user folder.",
        "[Config/Ended] Set power animation.",
        "[Config/Ended] Install customer('" + name + "') to install full configuration on Config mode.",
    }));
}

INSTANTIATE_TEST_SUITE_P(Codes, CodeWithoutFolder, ::testing::Values("", ".", "..", "a/b"));

TEST_F(InstallRun, AnUnreadableSlotCountIsASingleSim) {
    fail("vconf_get_int", "memory/telephony/sim_slot_count");
    zel_svc_config_install_customer("BTU", ZEL_SVC_INSTALL_CONFIG_MODE);
    EXPECT_TRUE(logged("[Config/Error!!] SIM slot count unknown!"));
    EXPECT_TRUE(logged("[Config] No need to disable App as default."));
    EXPECT_FALSE(exists(data_path("ims-2")));
}

TEST_F(InstallRun, ARefusedClearOfSimAutoSettingIsLogged) {
    fail("vconf_set_str", "db/private/zel/sim_msin");
    zel_svc_config_install_customer("BTU", ZEL_SVC_INSTALL_FOTA_MODE);
    EXPECT_TRUE(logged_in_order(
        {"[Config/Error!!(0)] Clear information for SIM Auto Setting.", "[Config/Start] Upgrade ZEL Preset."}));
}

TEST_F(InstallRun, TheOperatorOfTheSimIsForgotten) {
    set_string("db/private/zel/sim_auto_op_network_name", "Vodacom");
    zel_svc_config_install_customer("BTU", ZEL_SVC_INSTALL_NORMAL_BOOTING);
    EXPECT_EQ(get_string("db/private/zel/sim_auto_op_network_name"), "Vodacom");
    zel_svc_config_install_customer("BTU", ZEL_SVC_INSTALL_FOTA_MODE);
    EXPECT_EQ(get_string("db/private/zel/sim_auto_op_network_name"), "");
}

TEST_F(TwoSlots, TheSecondSimsPassesFillItsFiles) {
    zel_svc_config_install_customer("BTU", ZEL_SVC_INSTALL_CONFIG_MODE);
    EXPECT_TRUE(logged_in_order({
        "[Config/Ended] Install customer.xml (Full).",
        "[Config] SIM slot count=2.",
        "[Config/Start] Install customer.xml for dual SIM device.",
        "[Config/Ended] Install customer.xml for dual SIM device.",
        "[Config/Success] Clear information for SIM Auto Setting.",
    }));
    for (const std::string &group : kSecondSimGroups)
        EXPECT_TRUE(exists(data_path(group))) << group;
    EXPECT_THAT(laps(), ElementsAre("Spec", "Spec(SIM2)/APN", "Spec(SIM2)", "Preset", "Usr", "FS update", "App",
                                    "Collect", "All on Config mode"));
}

TEST_F(TwoSlots, AnUpgradeRepeatsTheSecondSimsPasses) {
    for (const std::string &group : kSecondSimGroups)
        mark_group(group);
    zel_svc_config_install_customer("BTU", ZEL_SVC_INSTALL_NORMAL_BOOTING);
    for (const std::string &group : kSecondSimGroups)
        EXPECT_FALSE(group_is_marked(group)) << group;
    EXPECT_THAT(laps(), ElementsAre("Spec/NetworkInfo", "Spec/APN", "Spec/Bookmark", "Spec", "Spec(SIM2)/APN",
                                    "Spec(SIM2)", "App", "All on Normal booting"));
}

TEST_F(TwoSlots, WithEveryAutoFlagTheSecondSimReadsImsOnly) {
    write_customer("BTU", kAllFlagsOn);
    for (const std::string &group : kSecondSimGroups)
        mark_group(group);
    zel_svc_config_install_customer("BTU", ZEL_SVC_INSTALL_CONFIG_MODE);
    for (const std::string &group : kSecondSimGroups)
        EXPECT_EQ(group_is_marked(group), group != "ims-2") << group;
    EXPECT_THAT(laps(), ElementsAre("Spec", "Spec(SIM2)", "Preset", "Usr", "FS update", "App", "Collect",
                                    "All on Config mode"));
}

TEST_F(InstallRun, TheUserFolderIsFilledAnew) {
    write("/opt/system/zel-default/usr/old", "old");
    write("/opt/system/zel-default/usr/folder/old", "old");
    write("/opt/system/zel/preconfig/DEF/usr/every", "DEF");
    write("/opt/system/zel/preconfig/DEF/usr/zel/both", "DEF");
    write("/opt/system/zel/preconfig/BTU/usr/zel/both", "BTU");
    write("/opt/system/zel/preconfig/BTU/usr/own", "BTU");
    zel_svc_config_install_customer("BTU", ZEL_SVC_INSTALL_FOTA_MODE);
    EXPECT_FALSE(exists("/opt/system/zel-default/usr/old"));
    EXPECT_FALSE(exists("/opt/system/zel-default/usr/folder"));
    EXPECT_EQ(read("/opt/system/zel-default/usr/every"), "DEF");
    EXPECT_EQ(read("/opt/system/zel-default/usr/zel/both"), "BTU");
    EXPECT_EQ(read("/opt/system/zel-default/usr/own"), "BTU");
}

TEST_F(InstallRun, WithoutUserFilesTheFolderIsEmptiedAndStays) {
    write("/opt/system/zel-default/usr/old", "old");
    zel_svc_config_install_customer("BTU", ZEL_SVC_INSTALL_CONFIG_MODE);
    EXPECT_FALSE(exists("/opt/system/zel-default/usr/old"));
    EXPECT_TRUE(exists("/opt/system/zel-default/usr"));
}

TEST_F(InstallRun, ThePowerAnimationIsItsFolder) {
    write("/opt/system/zel/preconfig/BTU/power-ani/poweron.edj", "");
    zel_svc_config_install_customer("BTU", ZEL_SVC_INSTALL_CONFIG_MODE);
    EXPECT_EQ(get_string("db/zel/power_ani_file_path"), "/opt/system/zel/preconfig/BTU/power-ani");
}

TEST_F(InstallRun, WithoutAPowerOnFileTheAnimationKeyIsLeft) {
    set_string("db/zel/power_ani_file_path", "/before");
    write("/opt/system/zel/preconfig/BTU/power-ani/poweroff.edj", "");
    zel_svc_config_install_customer("BTU", ZEL_SVC_INSTALL_CONFIG_MODE);
    EXPECT_EQ(get_string("db/zel/power_ani_file_path"), "/before");
}

TEST_F(InstallRun, TheCustomersStringsAreThoseOfTheActiveCustomer) {
    set_string("db/zel/salescode", "UFN");
    set_string("db/zel/country_iso", "DE");
    zel_svc_config_install_customer("TFG", ZEL_SVC_INSTALL_CONFIG_MODE);
    EXPECT_EQ(get_string("db/zel/text_string_customer"), "UFN");
    EXPECT_EQ(get_string("db/zel/text_string_country"), "DE");
}

TEST_F(InstallRun, WithoutAnActiveCustomerItsStringIsEmpty) {
    set_string("db/zel/country_iso", "");
    zel_svc_config_install_customer("BTU", ZEL_SVC_INSTALL_CONFIG_MODE);
    EXPECT_EQ(get_string("db/zel/text_string_customer"), "");
    EXPECT_EQ(get_string("db/zel/text_string_country"), std::nullopt);
}

TEST_F(InstallRun, UpgradesLeaveTheCustomersStrings) {
    set_string("db/zel/salescode", "BTU");
    zel_svc_config_install_customer("BTU", ZEL_SVC_INSTALL_FOTA_MODE);
    zel_svc_config_install_customer("BTU", ZEL_SVC_INSTALL_NORMAL_BOOTING);
    EXPECT_EQ(get_string("db/zel/text_string_customer"), std::nullopt);
}

TEST_F(InstallRun, TheOperatorWithItsOwnWallpaperGetsItsColours) {
    write(kHomeWallpaper, "picture");
    zel_svc_config_install_customer("XFV", ZEL_SVC_INSTALL_CONFIG_MODE);
    EXPECT_TRUE(logged_in_order({
        "[Config/Ended] Set power animation.",
        "[Config][DefaultOpWallpaper] Skip default wallpaper by H/W color. (Vodacom Operator)",
        "[Config][DefaultOpWallpaper] Home wallpaper's color setting succeeded.",
    }));
    EXPECT_FALSE(logged("[Config/Start] Install default wallpapar by H/W color."));
    const nlohmann::json status = call("status");
    EXPECT_EQ(status.at("theme_picture"), kHomeWallpaper);
    EXPECT_EQ(status.at("theme_kind"), 2);
    EXPECT_EQ(status.at("toolkit_users"), 0);
}

TEST_F(InstallRun, AFailedColourSettingShowsItsNumber) {
    fail("uxt_theme_set_suitable_system_color_info_from_image", "", 1, -1, 7);
    zel_svc_config_install_customer("XFV", ZEL_SVC_INSTALL_CONFIG_MODE);
    EXPECT_TRUE(logged("[Config][DefaultOpWallpaper] Home wallpaper's color setting failed(7)."));
    EXPECT_EQ(call("status").at("toolkit_users"), 0);
}

TEST_F(InstallRun, TheColoursAreSetWhateverTheToolkitsStartAnswers) {
    write(kHomeWallpaper, "picture");
    fail("elm_init", "", 1, -1, 0);
    zel_svc_config_install_customer("XFV", ZEL_SVC_INSTALL_CONFIG_MODE);
    EXPECT_TRUE(logged("[Config][DefaultOpWallpaper] Home wallpaper's color setting succeeded."));
}

TEST_F(InstallRun, AnUpgradeOfThatOperatorTakesTheWallpaperPhase) {
    write(kHomeWallpaper, "picture");
    zel_svc_config_install_customer("XFV", ZEL_SVC_INSTALL_FOTA_MODE);
    EXPECT_TRUE(logged("[Config/Start] Install default wallpapar by H/W color."));
    EXPECT_EQ(call("status").at("theme_picture"), "");
}

TEST_F(InstallRun, TheWallpaperPhaseIsInBothLogs) {
    zel_svc_config_install_customer("BTU", ZEL_SVC_INSTALL_FOTA_MODE);
    EXPECT_TRUE(system_logged("[Config/Start] Install default wallpapar by H/W color.\n"));
    EXPECT_TRUE(system_logged("[Config/Ended] Install default wallpapar by H/W color\n"));
}

TEST_F(InstallRun, TheCustomerWithOperatorAppsHasItsPhases) {
    zel_svc_config_install_customer("INS", ZEL_SVC_INSTALL_NORMAL_BOOTING);
    EXPECT_TRUE(logged_in_order({
        "[Config/Start] Check App existence before App upgrade (FOTA).",
        "[Config/End] Check App existence before App upgrade (FOTA).",
        "[Config/Start] Disable App as default.",
        "[Config/Ended] Disable App as default.",
        "[Config/Start] Remove App manually(FOTA).",
        "[Config/Ended] Remove App manually(FOTA).",
    }));
}
