// What a new phone holds, and what its verbs answer.

#include "support/bench-phone.h"

#include <cerrno>
#include <cstdlib>
#include <db-util.h>
#include <device-power.h>
#include <dlog.h>
#include <filesystem>
#include <gmock/gmock.h>
#include <sys/wait.h>
#include <theme.h>
#include <unistd.h>
#include <vconf.h>
#include <zel-platform.h>

namespace {

namespace fs = std::filesystem;
using nlohmann::json;
using ::testing::ElementsAre;

struct Phone : zel_test::BenchPhone {
    static std::vector<std::string> columns(const char *table) {
        sqlite3 *database = nullptr;
        EXPECT_EQ(db_util_open("/opt/dbspace/.dnet2.db", &database, 0), SQLITE_OK);
        sqlite3_stmt *statement = nullptr;
        const std::string sql = std::string("select * from ") + table;
        EXPECT_EQ(sqlite3_prepare_v2(database, sql.c_str(), -1, &statement, nullptr), SQLITE_OK);
        std::vector<std::string> names;
        for (int column = 0; column < sqlite3_column_count(statement); ++column)
            names.emplace_back(sqlite3_column_name(statement, column));
        sqlite3_finalize(statement);
        db_util_close(database);
        return names;
    }

    int result_of(const char *verb, const char *arguments) {
        zel_host_phone *phone = zel_host_open(root().c_str(), nullptr);
        const int result = zel_host_call(phone, verb, arguments, nullptr);
        zel_host_close(phone);
        return result;
    }
};

struct DualSimPhone : Phone {
    DualSimPhone() { create_arguments["sims"] = 2; }
};

TEST_F(Phone, HasThePlatformsFolders) {
    for (const char *path :
         {"/opt/system/zel", "/opt/system/zel-default/output", "/opt/system/zel-default/data",
          "/opt/system/zel-default/app", "/opt/system/zel-default/preset", "/opt/system/zel-default/fsupdate",
          "/opt/system/zel-default/usr", "/opt/dbspace", "/csa/imei", "/opt/usr/share/settings/Wallpapers",
          "/opt/usr/share/settings/Ringtones", "/opt/usr/share/settings/Alerts", "/opt/usr/share/settings/Alarms",
          "/opt/usr/media/Images", "/opt/usr/media/Sounds", "/opt/usr/media/Videos", "/opt/usr/media/Downloads/Others",
          "/opt/usr/media/DCIM", "/opt/usr/media/Screenshots"})
        EXPECT_TRUE(fs::is_directory(root() + path)) << path;
    EXPECT_FALSE(exists("/csa/imei/prodcode.dat"));
}

TEST_F(Phone, HasNetworkTablesWithThePlatformsColumnPositions) {
    EXPECT_THAT(columns("network_info"), ElementsAre("network_info_id", "network_name", "mccmnc"));
    const std::vector<std::string> profile = columns("pdp_profile");
    ASSERT_EQ(profile.size(), 26U);
    EXPECT_EQ(profile[0], "profile_id");
    EXPECT_EQ(profile[9], "home_url");
    EXPECT_EQ(profile[12], "is_static_ip_addr");
    EXPECT_EQ(profile[17], "network_info_id");
    EXPECT_EQ(profile[19], "hidden");
    EXPECT_EQ(profile[20], "editable");
    EXPECT_EQ(profile[24], "is_roaming_apn");
    EXPECT_EQ(profile[25], "profile_enable");
    EXPECT_EQ(columns("fast_dormancy").size(), 6U);
    EXPECT_THAT(columns("max_pdp"), ElementsAre("max_id", "network_info_id", "max_pdp_3g"));
}

TEST_F(Phone, NeverCreatesADatabase) {
    sqlite3 *database = nullptr;
    EXPECT_NE(db_util_open("/opt/dbspace/none.db", &database, 0), SQLITE_OK);
    EXPECT_EQ(database, nullptr);
    EXPECT_NE(db_util_open("", &database, 0), SQLITE_OK);
    EXPECT_NE(db_util_open("/opt/dbspace", &database, 0), SQLITE_OK);
    EXPECT_FALSE(exists("/opt/dbspace/none.db"));
}

TEST_F(Phone, DatabaseFollowsNoLinkOutOfTheRoot) {
    const std::string outside = zel_test::make_folder();
    fs::copy_file(root() + "/opt/dbspace/.dnet.db", outside + "/db");
    fs::create_symlink(outside + "/db", root() + "/opt/dbspace/link.db");
    fs::create_symlink(outside + "/journal", root() + "/opt/dbspace/.dnet.db-journal");
    sqlite3 *database = nullptr;
    EXPECT_NE(db_util_open("/opt/dbspace/link.db", &database, 0), SQLITE_OK);
    ASSERT_EQ(db_util_open("/opt/dbspace/.dnet.db", &database, 0), SQLITE_OK);
    EXPECT_NE(sqlite3_exec(database, "insert into max_pdp values(1,1,1)", nullptr, nullptr, nullptr), SQLITE_OK);
    db_util_close(database);
    EXPECT_FALSE(fs::exists(outside + "/journal"));
    zel_test::remove_folder(outside);
}

TEST_F(Phone, LogKeepsMessagesExactly) {
    const std::string longest(5000, 'x');
    EXPECT_GT(__dlog_print(DLOG_ID_MAIN, DLOG_PRIORITY_WARN, "ZEL", "a.cpp: f(%d) > line\n", 3), 0);
    EXPECT_EQ(__dlog_print(DLOG_ID_MAIN, DLOG_PRIORITY_WARN, "ZEL", "%s", longest.c_str()), 5000);
    __dlog_print(DLOG_ID_MAIN, DLOG_PRIORITY_WARN, "ZEL", "\"quoted\"\ttab");
    EXPECT_THAT(system_log(), ElementsAre("a.cpp: f(3) > line\n", longest, "\"quoted\"\ttab"));
    EXPECT_EQ(call("log").at("lines").at(0).at("tag"), "ZEL");
    EXPECT_EQ(call("log").at("lines").at(0).at("priority"), 5);
}

TEST_F(Phone, AnyBytesGiveValidJson) {
    vconf_set_str("db/x", "a\xFF\xC3\xA9\xED\xA0\x80");
    __dlog_print(DLOG_ID_MAIN, DLOG_PRIORITY_WARN, "ZEL", "\xC3");
    write("/opt/\xFE", "\x80");
    const json key = call("vconf-get", {{"key", "db/x"}});
    EXPECT_EQ(key.at("value"), "a\xEF\xBF\xBD\xC3\xA9\xEF\xBF\xBD\xEF\xBF\xBD\xEF\xBF\xBD");
    EXPECT_EQ(key.at("value_hex"), "61ffc3a9eda080");
    EXPECT_EQ(call("log").at("lines").at(0).at("message_hex"), "c3");
    EXPECT_EQ(call("tree", {{"path", "/opt"}, {"depth", 1}}).at("entries").back().at("path_hex"), "2f6f70742ffe");
    call("vconf-set", {{"key", "db/y"}, {"value-hex", "ff"}});
    char *text = vconf_get_str("db/y");
    EXPECT_STREQ(text, "\xFF");
    std::free(text);
}

TEST_F(Phone, TreeLeavesTheStateFolderOut) {
    write("/opt/system/zel/a", "abc", 0640);
    std::vector<std::string> top;
    const json level = call("tree", {{"depth", 1}});
    for (const json &entry : level.at("entries"))
        top.push_back(entry.at("path"));
    EXPECT_THAT(top, ElementsAre("/csa", "/opt", "/run", "/tmp", "/usr"));
    const json entry = call("tree", {{"path", "/opt/system/zel/"}}).at("entries").at(0);
    EXPECT_EQ(entry.at("path"), "/opt/system/zel/a");
    EXPECT_EQ(entry.at("size"), 3);
    EXPECT_EQ(entry.at("mode"), "0640");
    const json all = call("tree");
    EXPECT_GT(all.at("entries").size(), 20U);
    for (const json &any : all.at("entries"))
        EXPECT_FALSE(any.at("path").get<std::string>().starts_with("/.platform"));
    EXPECT_EQ(result_of("stat", R"({"path": "/.platform"})"), 1);
    EXPECT_EQ(result_of("read", R"({"path": "/opt/../.platform/phone"})"), 1);
}

TEST_F(Phone, ClockRunsIsSetAndStandsStill) {
    timeval now{};
    call("clock", {{"stop", "1000.25"}});
    ASSERT_EQ(zel_platform_now(&now), 0);
    EXPECT_EQ(now.tv_sec, 1000);
    EXPECT_EQ(now.tv_usec, 250000);
    call("clock", {{"set", "2014-01-01T00:00:00"}});
    ASSERT_EQ(zel_platform_now(&now), 0);
    EXPECT_GE(now.tv_sec, 1388534400);
    EXPECT_LT(now.tv_sec, 1388534400 + 600);
    EXPECT_EQ(call("clock").at("mode"), "set");
    call("clock", {{"run", true}});
    const std::time_t before = std::time(nullptr);
    ASSERT_EQ(zel_platform_now(&now), 0);
    EXPECT_GE(now.tv_sec, before - 1);
    EXPECT_EQ(result_of("clock", R"({"stop": "yesterday"})"), 2);
}

TEST_F(Phone, RestartDropsMemoryKeysOnly) {
    set_int("memory/zel/x", 1);
    set_int("db/x", 1);
    set_int("memory/telephony/sim_slot_count", 9);
    call("sim", {{"slot", 1}, {"state", 1}});
    EXPECT_EQ(call("reboot").at("boots"), 1);
    EXPECT_EQ(get_int("memory/zel/x"), std::nullopt);
    EXPECT_EQ(get_int("db/x"), 1);
    EXPECT_EQ(get_int("memory/telephony/sim_slot_count"), 1);
    EXPECT_EQ(get_int("memory/telephony/sim_slot"), 1);
}

TEST_F(Phone, AskedRestartIsNotedAndReturns) {
    EXPECT_EQ(zel_platform_reboot(0x01234567), 0);
    EXPECT_EQ(call("status").at("restarts_asked"), 1);
    EXPECT_EQ(call("status").at("restart_command"), 0x01234567);
}

TEST_F(DualSimPhone, AnnouncesBothSlots) {
    EXPECT_EQ(get_int("memory/telephony/sim_slot_count"), 2);
    EXPECT_EQ(get_int("memory/telephony/sim_slot2"), 0);
    EXPECT_EQ(call("status").at("sim_states"), json({0, 0}));
}

TEST_F(Phone, DisplayAndThemeAreRecorded) {
    write("/opt/picture.png", "png");
    EXPECT_EQ(device_power_request_lock(1, 0), 0);
    EXPECT_EQ(call("status").at("display_locked"), true);
    EXPECT_EQ(device_power_release_lock(1), 0);
    EXPECT_EQ(call("status").at("display_locked"), false);
    EXPECT_GT(elm_init(0, nullptr), 0);
    EXPECT_EQ(uxt_theme_set_suitable_system_color_info_from_image("/opt/picture.png", 2, nullptr), 0);
    EXPECT_NE(uxt_theme_set_suitable_system_color_info_from_image("/opt/none.png", 2, nullptr), 0);
    int anything = 0;
    EXPECT_NE(uxt_theme_set_suitable_system_color_info_from_image("/opt/picture.png", 1, &anything), 0);
    elm_shutdown();
    EXPECT_EQ(call("status").at("theme_picture"), "/opt/picture.png");
    EXPECT_EQ(call("status").at("theme_kind"), 2);
    EXPECT_EQ(call("status").at("toolkit_users"), 0);
}

TEST_F(Phone, ToolsAnswerCommands) {
    call("tool-add", {{"path", "/usr/bin/pkg"}, {"status", 3}, {"file", "/opt/written"}, {"content", "yes"}});
    EXPECT_EQ(zel_platform_command("  /usr/bin/pkg\t-d x"), 3 << 8);
    EXPECT_EQ(read("/opt/written"), "yes");
    EXPECT_EQ(call("tool-remove", {{"path", "/usr/bin/pkg"}}).at("existed"), true);
    EXPECT_EQ(zel_platform_command("/usr/bin/pkg"), 32512);
    EXPECT_EQ(call("tool-list").at("tools").size(), 2U);
}

TEST_F(Phone, LockNamesItsHolder) {
    zel_host_phone *other = zel_host_open(root().c_str(), nullptr);
    call("lock", {{"holder", "the first"}});
    char *answer = nullptr;
    EXPECT_EQ(zel_host_call(other, "lock", R"({"holder": "the second"})", &answer), 1);
    EXPECT_THAT(answer, ::testing::HasSubstr("the first"));
    zel_host_free(answer);
    zel_host_close(other);
    call("lock", {{"holder", "the first again"}});
}

TEST_F(Phone, LockEndsWithItsHolder) {
    zel_host_phone *other = zel_host_open(root().c_str(), nullptr);
    EXPECT_EQ(zel_host_call(other, "lock", R"({"holder": "gone"})", nullptr), 0);
    zel_host_close(other);
    call("lock", {{"holder", "the next"}});
}

TEST_F(Phone, VerbsDescribeThemselves) {
    const json verbs = call("verbs").at("verbs");
    std::vector<std::string> names;
    for (const json &verb : verbs) {
        names.push_back(verb.at("name"));
        EXPECT_FALSE(verb.at("help").get<std::string>().empty());
        for (const json &argument : verb.at("arguments"))
            EXPECT_FALSE(argument.at("help").get<std::string>().empty());
    }
    EXPECT_THAT(names,
                ::testing::IsSupersetOf(
                    {"create",       "package",      "status",        "stat",       "tree",        "read",
                     "vconf-get",    "vconf-set",    "vconf-unset",   "vconf-list", "log",         "clock",
                     "reboot",       "reset",        "fault-add",     "fault-list", "fault-clear", "journal-start",
                     "journal-stop", "journal-list", "journal-clear", "tool-add",   "tool-list",   "tool-remove",
                     "app-list",     "app-refuse",   "system",        "system-set", "lock",        "verbs"}));
}

TEST_F(Phone, WrongArgumentsAreRefused) {
    EXPECT_EQ(result_of("vconf-get", "{}"), 2);
    EXPECT_EQ(result_of("vconf-get", R"({"key": 1})"), 2);
    EXPECT_EQ(result_of("vconf-get", R"({"key": "db/x", "other": "1"})"), 2);
    EXPECT_EQ(result_of("vconf-get", "no json"), 2);
    EXPECT_EQ(result_of("vconf-get", "[]"), 2);
    EXPECT_EQ(result_of("vconf-get", R"({"key": "db/none"})"), 1);
    EXPECT_EQ(result_of("vconf-set", R"({"key": "db/x", "type": "int", "value": "4294967296"})"), 2);
    EXPECT_EQ(result_of("nothing", "{}"), 2);
    EXPECT_EQ(zel_host_call(nullptr, "status", nullptr, nullptr), 2);
    EXPECT_EQ(zel_host_call(nullptr, nullptr, nullptr, nullptr), 2);
}

TEST_F(Phone, ForkedProcessesWorkOnTheSamePhone) {
    ASSERT_EQ(vconf_set_int("db/parent", 1), 0);
    std::vector<pid_t> children;
    for (int child = 0; child < 4; ++child) {
        const pid_t process = ::fork();
        if (process == 0) {
            int failures = 0;
            for (int step = 0; step < 50; ++step)
                failures += vconf_set_int(("db/" + std::to_string(child)).c_str(), step) == 0 ? 0 : 1;
            ::_exit(failures);
        }
        children.push_back(process);
    }
    for (int step = 0; step < 50; ++step)
        EXPECT_EQ(vconf_set_int("db/parent", step), 0);
    for (const pid_t child : children) {
        int status = -1;
        ASSERT_EQ(::waitpid(child, &status, 0), child);
        EXPECT_EQ(status, 0);
    }
    for (const char *key : {"db/0", "db/1", "db/2", "db/3", "db/parent"})
        EXPECT_EQ(get_int(key), 49) << key;
}

} // namespace
