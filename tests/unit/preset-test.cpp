// Presets: two files merged into one, and what each row sets.

#include "preset/zel-svc-preset-merge.h"
#include "preset/zel-svc-preset.h"
#include "support/files-phone.h"

#include <gmock/gmock.h>

#include <csignal>
#include <sys/resource.h>

namespace {

constexpr const char *kMerged = "/opt/system/zel-default/preset/zel-default-preset.ini";

struct Preset : zel_test::FilesPhone {
    void write_presets(const std::string &package, const std::string &text) {
        write("/opt/system/zel/preconfig/" + package + "/preset/zel-preset.ini", text);
    }
    bool system_logged(const std::string &text) {
        const std::vector<std::string> log = system_log();
        return std::any_of(log.begin(), log.end(), [&](const std::string &line) { return line.ends_with(text); });
    }
    // The merged file without the blanks and empty lines in which the INI library lays it out.
    std::string merged() {
        std::string text;
        for (const char c : read(kMerged))
            if (c != ' ' && !(c == '\n' && (text.empty() || text.back() == '\n'))) text += c;
        return text;
    }
};

struct Expected {
    const char *key;
    const char *store;
};

constexpr Expected kStrings[] = {
    {"keyboard_lang", "db/isf/input_language"},
    {"keyboard_preinstalled_lang", "db/ise/swiftkey/lpm/preinstalled_lang"},
    {"web_homepage_url", "file/private/com.quorvex.browser/homepage_uri"},
    {"velaro_pkg_name", "db/velaro/package_name"},
    {"ua_prof_2g", "db/browser/user_agent_profile_2G"},
    {"ua_prof_3g", "db/browser/user_agent_profile_3G"},
    {"ua_prof_4g", "db/browser/user_agent_profile_4G"},
    {"lockscreen_short_cut_2", "file/lockscreen/shortcut2"},
    {"setting_ring_tone_default", "db/setting/sound/call/ringtone_default_path"},
    {"setting_ring_tone", "db/setting/sound/call/ringtone_path"},
    {"setting_noti_tone", "db/setting/sound/noti/msg_ringtone_path"},
    {"font_style", "db/zel/font_default_style"},
    {"setting_region_format", "db/menu_widget/regionformat"},
};
constexpr Expected kIntegers[] = {
    {"fota_max_size_on_data_net", "db/SyncML/oma-dm-service/MaxSizeOnDataNetwork"},
    {"lockscreen_theme", "db/lockscreen/style"},
    {"lbs_use_my_location", "db/location/setting/Usemylocation"},
    {"lbs_net_activation", "db/location/setting/NetworkEnabled"},
    {"wifi_smart_net_switch", "file/private/wifi/smart_switching"},
    {"setting_lcd_brightness", "db/setting/Brightness"},
    {"setting_lcd_backlight_time", "db/setting/lcd_backlight_normal"},
    {"tel_voice_preferred_sim", "db/telephony/dualsim/preferred_voice_subscription"},
};
constexpr Expected kBooleans[] = {
    {"nfc_activation", "db/nfc/enable"},
    {"setting_net_mobile_data", "db/setting/3gEnabled"},
    {"setting_net_data_roaming", "db/setting/data_roaming"},
};

TEST_F(Preset, EveryStringRowSetsItsKey) {
    std::string text = "[default]\n";
    for (const Expected &row : kStrings)
        text += std::string{row.key} + " = \"value of " + row.key + "\"\n";
    write_presets("XFV", text);
    zel_svc_preset_install("XFV", 0);
    for (const Expected &row : kStrings)
        EXPECT_EQ(get_string(row.store), std::string{"value of "} + row.key) << row.key;
    EXPECT_EQ(call("vconf-list").at("keys").size(), std::size(kStrings) + 2); // and the slots' two
}

TEST_F(Preset, EveryIntegerRowSetsItsKey) {
    std::string text = "[default]\n";
    int value = 100;
    for (const Expected &row : kIntegers)
        text += std::string{row.key} + " = " + std::to_string(value++) + "\n";
    write_presets("DEF", text);
    zel_svc_preset_install("XFV", 0);
    value = 100;
    for (const Expected &row : kIntegers)
        EXPECT_EQ(get_int(row.store), value++) << row.key;
}

TEST_F(Preset, EveryBooleanRowSetsItsKey) {
    for (const bool value : {true, false}) {
        std::string text = "[default]\n";
        for (const Expected &row : kBooleans)
            text += std::string{row.key} + (value ? " = 1\n" : " = no\n");
        write_presets("DEF", text);
        zel_svc_preset_install("XFV", 0);
        for (const Expected &row : kBooleans)
            EXPECT_EQ(get_bool(row.store), value) << row.key;
    }
}

TEST_F(Preset, NumbersAreReadAsTheIniLibraryReadsThem) {
    write_presets("DEF", "[default]\nlockscreen_theme = 0x10\nlbs_use_my_location = abc\nlbs_net_activation = \n"
                         "setting_lcd_brightness = -1\nwifi_smart_net_switch = \"12\" # twelve\n"
                         "nfc_activation = maybe\nsetting_net_mobile_data = \nsetting_net_data_roaming = True\n");
    zel_svc_preset_install("XFV", 0);
    EXPECT_EQ(get_int("db/lockscreen/style"), 16);
    EXPECT_EQ(get_int("db/location/setting/Usemylocation"), 0);
    EXPECT_EQ(get_int("db/location/setting/NetworkEnabled"), 0);
    EXPECT_EQ(get_int("db/setting/Brightness"), std::nullopt); // what stands for no number is not set
    EXPECT_EQ(get_int("file/private/wifi/smart_switching"), 12);
    EXPECT_EQ(get_bool("db/nfc/enable"), std::nullopt);
    EXPECT_EQ(get_bool("db/setting/3gEnabled"), std::nullopt);
    EXPECT_EQ(get_bool("db/setting/data_roaming"), true);
}

TEST_F(Preset, AKeyboardBecomesTheInitialAndTheActiveOne) {
    write_presets("DEF", "[default]\nkeyboard_uuid = \"12aa3425-f88e\"\n");
    zel_svc_preset_install("XFV", 0);
    EXPECT_EQ(call("status").at("initial_keyboard"), "12aa3425-f88e");
    EXPECT_EQ(call("status").at("active_keyboard"), "12aa3425-f88e");
    EXPECT_EQ(run_log(), "[Preset] Keyboard isf API() called.\n");
}

TEST_F(Preset, TheKeyboardsSecondCallFollowsAFailedFirst) {
    fail("isf_control_set_initial_ise_by_uuid");
    write_presets("DEF", "[default]\nkeyboard_uuid = \"12aa3425-f88e\"\n");
    zel_svc_preset_install("XFV", 0);
    EXPECT_EQ(call("status").at("initial_keyboard"), "");
    EXPECT_EQ(call("status").at("active_keyboard"), "12aa3425-f88e");
    EXPECT_EQ(run_log(), "[Preset] Keyboard isf API() called.\n");
}

TEST_F(Preset, ATimeZoneIsAPathBelowTheZones) {
    write_presets("DEF", "[default]\nsetting_time_zone_path = \"Asia/Kolkata\"\n");
    zel_svc_preset_install("XFV", 0);
    EXPECT_EQ(call("status").at("time_zone"), "/usr/share/zoneinfo/Asia/Kolkata");
    EXPECT_EQ(run_log(), "[Preset] Time zone('Asia/Kolkata')=0 set.\n");
}

TEST_F(Preset, ARefusedTimeZoneShowsItsResult) {
    fail("alarmmgr_set_timezone", "", 1, -1, -3);
    write_presets("DEF", "[default]\nsetting_time_zone_path = Asia/Kolkata\n");
    zel_svc_preset_install("XFV", 0);
    EXPECT_EQ(run_log(), "[Preset] Time zone('Asia/Kolkata')=-3 set.\n");
}

TEST_F(Preset, AnEmptyKeyboardAndTimeZoneLeaveThePhones) {
    write_presets("DEF", "[default]\nkeyboard_uuid = \"\"\nsetting_time_zone_path =\n");
    zel_svc_preset_install("XFV", 0);
    EXPECT_EQ(call("status").at("initial_keyboard"), "");
    EXPECT_EQ(call("status").at("time_zone"), "");
    EXPECT_EQ(run_log(), "");
}

TEST_F(Preset, TheCustomersFileOverridesTheDefaultsRowByRow) {
    write_presets("DEF", "[default]\nfont_style = \"Default\"\nkeyboard_lang = \"en_US\"\n");
    write_presets("XFV", "[default]\nkeyboard_lang = \"hi_IN\"\n");
    zel_svc_preset_install("XFV", 0);
    EXPECT_EQ(get_string("db/zel/font_default_style"), "Default");
    EXPECT_EQ(get_string("db/isf/input_language"), "hi_IN");
    EXPECT_EQ(merged(), "[default]\nkeyboard_lang=\"hi_IN\"\nfont_style=\"Default\"\n");
}

TEST_F(Preset, TheUserAgentIsTheCustomersWhereTheDefaultsHaveNone) {
    write_presets("DEF", "[default]\nfont_style = \"Default\"\n");
    write_presets("XFV", "[default]\nua = \"Mozilla $(MODEL) $(FOO)\"\n");
    zel_svc_preset_install("XFV", 0);
    EXPECT_EQ(get_string("db/browser/user_agent"), "Mozilla Q7N0 ");
}

TEST_F(Preset, AnEmptyStringIsStoredAndSet) {
    set_string("db/zel/font_default_style", "before");
    set_string("db/browser/user_agent", "before");
    write_presets("XFV", "[default]\nfont_style = \"\"\nua = \"\"\n");
    zel_svc_preset_install("XFV", 0);
    EXPECT_EQ(merged(), "[default]\nua=\nfont_style=\n");
    EXPECT_EQ(get_string("db/zel/font_default_style"), "");
    EXPECT_EQ(get_string("db/browser/user_agent"), "");
}

TEST_F(Preset, AStringThatDoesNotSortBehindTwoQuotesIsStoredEmpty) {
    write_presets("XFV", "[default]\nfont_style = '\"\"'\nkeyboard_lang = \"!x\"\nvelaro_pkg_name = ' blank'\n"
                         "web_homepage_url = '\"\"x'\nua_prof_2g = \"#x\"\n");
    zel_svc_preset_install("XFV", 0);
    EXPECT_EQ(get_string("db/zel/font_default_style"), "");
    EXPECT_EQ(get_string("db/isf/input_language"), "");
    EXPECT_EQ(get_string("db/velaro/package_name"), "");
    EXPECT_EQ(get_string("file/private/com.quorvex.browser/homepage_uri"), "\"\"x");
    EXPECT_EQ(get_string("db/browser/user_agent_profile_2G"), "#x");
}

TEST_F(Preset, AStringIsSetAsItStoodWhateverItHolds) {
    write_presets("XFV", "[default]\nfont_style = \"a;b#c=d\\\"\nkeyboard_lang = 'say \"x\"'\n"
                         "velaro_pkg_name = it's \"both\"\nweb_homepage_url = \"h\xC3\xA9  \"\n");
    zel_svc_preset_install("XFV", 0);
    EXPECT_EQ(get_string("db/zel/font_default_style"), "a;b#c=d\\");
    EXPECT_EQ(get_string("db/isf/input_language"), "say \"x\"");
    EXPECT_EQ(get_string("db/velaro/package_name"), "it's 'both'");
    EXPECT_EQ(get_string("file/private/com.quorvex.browser/homepage_uri"), "h\xC3\xA9  ");
}

TEST_F(Preset, UnknownKeysAndOtherSectionsAreNotMerged) {
    write_presets("XFV", "[default]\nunknown = 1\nfont_style = \"a\"\n[other]\nkeyboard_lang = \"x\"\n");
    zel_svc_preset_install("XFV", 0);
    EXPECT_EQ(merged(), "[default]\nfont_style=\"a\"\n");
    EXPECT_EQ(get_string("db/isf/input_language"), std::nullopt);
}

TEST_F(Preset, AnUpgradeAppliesWhatIsMarked) {
    write_presets("DEF", "[default]\nfont_style = \"a\"\nkeyboard_lang = \"b\"\nvelaro_pkg_name = \"c\"\n"
                         "[upgrade_update]\nfont_style = 1\nkeyboard_lang = 0\n");
    zel_svc_preset_install("XFV", 1);
    EXPECT_EQ(get_string("db/zel/font_default_style"), "a");
    EXPECT_EQ(get_string("db/isf/input_language"), std::nullopt);
    EXPECT_EQ(get_string("db/velaro/package_name"), std::nullopt);
    EXPECT_EQ(merged(), "[default]\nkeyboard_lang=\"b\"\nvelaro_pkg_name=\"c\"\nfont_style=\"a\"\n");
}

TEST_F(Preset, InAnUpgradeTheLaterFileDecides) {
    write_presets("DEF", "[default]\nfont_style = \"a\"\nkeyboard_lang = \"b\"\nvelaro_pkg_name = \"c\"\n"
                         "ua_prof_2g = \"d\"\n"
                         "[upgrade_update]\nfont_style = 1\nkeyboard_lang = 0\nvelaro_pkg_name = 1\nua_prof_2g = 1\n");
    write_presets("XFV", "[default]\nfont_style = \"A\"\nkeyboard_lang = \"B\"\nvelaro_pkg_name = \"C\"\n"
                         "[upgrade_update]\nfont_style = 0\nkeyboard_lang = 1\nua_prof_2g = 0\n");
    zel_svc_preset_install("XFV", 5); // every kind but 0 upgrades
    EXPECT_EQ(get_string("db/zel/font_default_style"), std::nullopt);
    EXPECT_EQ(get_string("db/isf/input_language"), "B");
    EXPECT_EQ(get_string("db/velaro/package_name"), "C");           // unmarked there: the flag stays
    EXPECT_EQ(get_string("db/browser/user_agent_profile_2G"), "d"); // a row that the file lacks is left alone
}

TEST_F(Preset, AMarkCountsOnlyAsOne) {
    write_presets("DEF", "[default]\nfont_style = \"a\"\nkeyboard_lang = \"b\"\nvelaro_pkg_name = \"c\"\n"
                         "[upgrade_update]\nfont_style = 2\nkeyboard_lang = yes\nvelaro_pkg_name = 0x1\n");
    zel_svc_preset_install("XFV", 1);
    EXPECT_EQ(get_string("db/zel/font_default_style"), std::nullopt);
    EXPECT_EQ(get_string("db/isf/input_language"), std::nullopt);
    EXPECT_EQ(get_string("db/velaro/package_name"), "c");
}

TEST_F(Preset, TheMergedFileIsMadeAfreshWithItsAttributes) {
    write(kMerged, "[default]\nfont_style = \"old\"\n", 0600);
    zel_svc_preset_install("XFV", 0);
    EXPECT_EQ(merged(), "[default]\n");
    EXPECT_EQ(attributes(kMerged), (zel_test::Attributes{0644, 200, 5000, "zel-manager"}));
    EXPECT_EQ(get_string("db/zel/font_default_style"), std::nullopt);
}

TEST_F(Preset, AFileThatDoesNotLoadIsPassedOver) {
    write_presets("DEF", "[default\nfont_style = \"a\"\n");
    write_presets("XFV", "[default]\nkeyboard_lang = \"b\"\n");
    zel_svc_preset_install("XFV", 0);
    EXPECT_EQ(get_string("db/zel/font_default_style"), std::nullopt);
    EXPECT_EQ(get_string("db/isf/input_language"), "b");
}

struct FailedMerge : Preset, ::testing::WithParamInterface<const char *> {};

TEST_P(FailedMerge, AppliesNothing) {
    write_presets("XFV", "[default]\nfont_style = \"a\"\n");
    const std::string function = GetParam();
    // It is opened to be written, for its attributes, and to be applied.
    fail(function, kMerged, function == "zel_platform_open" ? 3 : 1);
    zel_svc_preset_install("XFV", 0);
    EXPECT_EQ(get_string("db/zel/font_default_style"), std::nullopt);
}

INSTANTIATE_TEST_SUITE_P(By, FailedMerge, ::testing::Values("zel_platform_open", "disk_full"));

TEST_F(Preset, AMergedFileThatFallsShortIsNotMerged) {
    std::string text = "[default]\n";
    for (const Expected &row : kStrings)
        text += std::string{row.key} + " = \"" + std::string(900, 'x') + "\"\n";
    write_presets("XFV", text);
    ZelSvcPresetFlags chosen = {};
    EXPECT_TRUE(zel_svc_preset_merge("XFV", 0, chosen));
    std::signal(SIGXFSZ, SIG_IGN);
    const rlimit limit = {.rlim_cur = 8192, .rlim_max = RLIM_INFINITY};
    ASSERT_EQ(::setrlimit(RLIMIT_FSIZE, &limit), 0);
    EXPECT_FALSE(zel_svc_preset_merge("XFV", 0, chosen));
    EXPECT_EQ(status_of(kMerged).st_size, 8192);
}

TEST_F(Preset, WithoutItsFolderNothingIsApplied) {
    std::filesystem::remove_all(on_disk("/opt/system/zel-default/preset"));
    write_presets("XFV", "[default]\nfont_style = \"a\"\n");
    zel_svc_preset_install("XFV", 0);
    EXPECT_EQ(get_string("db/zel/font_default_style"), std::nullopt);
}

TEST_F(Preset, AFailedKeyKeepsNoOtherFromBeingSet) {
    fail("vconf_set_str", "db/isf/input_language");
    write_presets("XFV", "[default]\nkeyboard_lang = \"a\"\nfont_style = \"b\"\n");
    zel_svc_preset_install("XFV", 0);
    EXPECT_EQ(get_string("db/isf/input_language"), std::nullopt);
    EXPECT_EQ(get_string("db/zel/font_default_style"), "b");
}

// The INI library reads lines of up to 1,022 bytes; it writes a key in 30 columns and " = " behind it.
TEST_F(Preset, AValueThatFillsTheLongestLineIsSet) {
    const std::string longest(1022 - 30 - 3 - 2, 'x');
    write_presets("XFV", "[default]\nfont_style=\"" + longest + "\"\n");
    zel_svc_preset_install("XFV", 0);
    EXPECT_EQ(get_string("db/zel/font_default_style"), longest);
}

TEST_F(Preset, ARowWhoseLineWouldNotLoadAgainIsIgnored) {
    const std::string too_long(1022 - 30 - 3 - 2 + 1, 'x');
    write_presets("DEF", "[default]\nfont_style=\"short\"\nkeyboard_lang=\"a\"\n[upgrade_update]\nfont_style=1\n");
    write_presets("XFV", "[default]\nfont_style=\"" + too_long +
                             "\"\nkeyboard_lang=\"b\"\n[upgrade_update]\n"
                             "font_style=0\nkeyboard_lang=1\n");
    zel_svc_preset_install("XFV", 1);
    EXPECT_EQ(get_string("db/zel/font_default_style"), "short"); // the defaults' value and mark stay
    EXPECT_EQ(get_string("db/isf/input_language"), "b");
    EXPECT_TRUE(system_logged("> <Warning> Preset('font_style') cannot be kept in a file, ignored.\n"));
}

TEST_F(Preset, ANumberThatWouldJoinTheNextLineIsIgnored) {
    write_presets("XFV", "[default]\nnfc_activation = \"1\\\"\nvelaro_pkg_name = \"a\"\n"
                         "lockscreen_theme = \"5\\ \"\nlbs_use_my_location = 7\n");
    zel_svc_preset_install("XFV", 0);
    EXPECT_EQ(get_bool("db/nfc/enable"), std::nullopt);
    EXPECT_EQ(get_string("db/velaro/package_name"), "a");
    EXPECT_EQ(get_int("db/lockscreen/style"), std::nullopt);
    EXPECT_EQ(get_int("db/location/setting/Usemylocation"), 7);
}

} // namespace
