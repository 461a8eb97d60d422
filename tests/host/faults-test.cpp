#include "support/bench-phone.h"

#include <array>
#include <cerrno>
#include <cstdlib>
#include <db-util.h>
#include <device-power.h>
#include <dlog.h>
#include <fcntl.h>
#include <gmock/gmock.h>
#include <security-server.h>
#include <smack.h>
#include <sys/wait.h>
#include <theme.h>
#include <unistd.h>
#include <vconf.h>
#include <zel-platform.h>

namespace {

using nlohmann::json;
using ::testing::ElementsAre;

struct Faults : zel_test::BenchPhone {
    static std::string run(sqlite3 *database, const char *sql, const char *text = nullptr) {
        sqlite3_stmt *statement = nullptr;
        if (sqlite3_prepare_v2(database, sql, -1, &statement, nullptr) != SQLITE_OK) return "prepare";
        const bool bound = text == nullptr || sqlite3_bind_text(statement, 1, text, -1, SQLITE_STATIC) == SQLITE_OK;
        const int result = bound ? sqlite3_step(statement) : 0;
        sqlite3_finalize(statement);
        if (!bound) return "bind";
        return result == SQLITE_DONE || result == SQLITE_ROW ? "done" : "step";
    }

    static constexpr const char *kDatabase = "/opt/dbspace/.dnet.db";
    static constexpr const char *kInsert = "insert into network_info(network_name) values(?)";
};

TEST_F(Faults, FailEveryFunctionOfTheTable) {
    struct Case {
        const char *function;
        int (*call)();
    };
    constexpr Case kCases[] = {
        {"vconf_get_int",
         [] {
             int v = 0;
             return vconf_get_int("db/i", &v);
         }},
        {"vconf_get_bool",
         [] {
             int v = 0;
             return vconf_get_bool("db/b", &v);
         }},
        {"vconf_set_int", [] { return vconf_set_int("db/i", 1); }},
        {"vconf_set_bool", [] { return vconf_set_bool("db/b", 1); }},
        {"vconf_set_str", [] { return vconf_set_str("db/s", "x"); }},
        {"__dlog_print", [] { return __dlog_print(0, 5, "ZEL", "x") < 0 ? -1 : 0; }},
        {"security_server_label_access", [] { return security_server_label_access("/opt", "*"); }},
        {"device_power_request_lock", [] { return device_power_request_lock(1, 0); }},
        {"device_power_release_lock", [] { return device_power_release_lock(1); }},
        {"zel_platform_command", [] { return zel_platform_command("/usr/bin/pkg -d app"); }},
        {"zel_platform_reboot", [] { return zel_platform_reboot(1); }},
        {"zel_platform_now",
         [] {
             timeval now{};
             return zel_platform_now(&now);
         }},
    };
    set_int("db/i", 1);
    set_bool("db/b", true);
    for (const Case &row : kCases) {
        EXPECT_EQ(row.call(), 0) << row.function;
        fail(row.function);
        EXPECT_EQ(row.call(), -1) << row.function;
        call("fault-clear");
        EXPECT_EQ(row.call(), 0) << row.function;
    }
}

TEST_F(Faults, LeaveOutputsUntouched) {
    set_int("db/i", 1);
    set_string("db/s", "x");
    fail("vconf_get_int");
    fail("vconf_get_str");
    fail("zel_platform_now");
    int value = 77;
    timeval now{.tv_sec = 77, .tv_usec = 77};
    EXPECT_LT(vconf_get_int("db/i", &value), 0);
    EXPECT_EQ(vconf_get_str("db/s"), nullptr);
    EXPECT_LT(zel_platform_now(&now), 0);
    EXPECT_EQ(value, 77);
    EXPECT_EQ(now.tv_sec, 77);
}

TEST_F(Faults, GiveTheErrnoOfAFailedOpen) {
    write("/opt/a", "a");
    call("fault-add", {{"function", "zel_platform_open"}, {"text", "/opt/a"}, {"errno", ENOSPC}});
    EXPECT_LT(zel_platform_open("/opt/a", O_RDONLY, 0), 0);
    EXPECT_EQ(errno, ENOSPC);
    const int fd = zel_platform_open("/opt", O_RDONLY | O_DIRECTORY, 0);
    EXPECT_GE(fd, 0);
    ::close(fd);
}

TEST_F(Faults, CountCallsOfAllProcesses) {
    fail("vconf_set_int", "db/a", 3, 1);
    EXPECT_EQ(vconf_set_int("db/a", 1), 0);
    const pid_t child = ::fork();
    if (child == 0) ::_exit(vconf_set_int("db/a", 2) == 0 ? 0 : 1);
    int status = -1;
    ASSERT_EQ(::waitpid(child, &status, 0), child);
    EXPECT_EQ(status, 0);
    EXPECT_LT(vconf_set_int("db/a", 3), 0);
    EXPECT_EQ(vconf_set_int("db/a", 4), 0);
    EXPECT_EQ(call("fault-list").at("faults").at(0).at("seen"), 4);
    EXPECT_EQ(get_int("db/a"), 4);
}

TEST_F(Faults, NeverFailTheInspection) {
    for (const char *function : {"vconf_get_int", "vconf_set_int", "zel_platform_open", "disk_full", "__dlog_print"})
        fail(function);
    set_int("db/a", 5);
    EXPECT_EQ(get_int("db/a"), 5);
    write("/opt/a", "a");
    EXPECT_EQ(call("read", {{"path", "/opt/a"}}).at("content"), "a");
}

TEST_F(Faults, OfUnknownFunctionsAreRefused) {
    zel_host_phone *phone = zel_host_open(root().c_str(), nullptr);
    EXPECT_EQ(zel_host_call(phone, "fault-add", R"({"function": "vconf_get_nothing"})", nullptr), 2);
    zel_host_close(phone);
}

TEST_F(Faults, CanFailAStatement) {
    fail("sqlite3_step", "insert into network_info");
    sqlite3 *database = nullptr;
    ASSERT_EQ(db_util_open(kDatabase, &database, 0), SQLITE_OK);
    EXPECT_EQ(run(database, "select * from network_info"), "done");
    EXPECT_EQ(run(database, kInsert, "name"), "step");
    EXPECT_EQ(run(database, "select max(network_info_id) from network_info"), "done");
    EXPECT_EQ(db_util_close(database), SQLITE_OK);
}

TEST_F(Faults, CanFailOneOfManyStatements) {
    fail("sqlite3_step", "insert", 2, 1);
    sqlite3 *database = nullptr;
    ASSERT_EQ(db_util_open(kDatabase, &database, 0), SQLITE_OK);
    EXPECT_EQ(run(database, kInsert, "a"), "done");
    EXPECT_EQ(run(database, kInsert, "b"), "step");
    EXPECT_EQ(run(database, kInsert, "c"), "done");
    EXPECT_EQ(db_util_close(database), SQLITE_OK);
}

TEST_F(Faults, CanFailPreparing) {
    fail("sqlite3_prepare_v2", kDatabase, 2, 1);
    sqlite3 *database = nullptr;
    ASSERT_EQ(db_util_open(kDatabase, &database, 0), SQLITE_OK);
    EXPECT_EQ(run(database, kInsert, "name"), "done");
    EXPECT_EQ(db_util_close(database), SQLITE_OK);
    ASSERT_EQ(db_util_open(kDatabase, &database, 0), SQLITE_OK);
    EXPECT_EQ(run(database, kInsert, "name"), "prepare");
    EXPECT_EQ(db_util_close(database), SQLITE_OK);
}

TEST_F(Faults, CanFailBinding) {
    fail("sqlite3_bind_text", kDatabase);
    sqlite3 *database = nullptr;
    ASSERT_EQ(db_util_open(kDatabase, &database, 0), SQLITE_OK);
    EXPECT_EQ(run(database, kInsert, "name"), "bind");
    EXPECT_EQ(db_util_close(database), SQLITE_OK);
}

TEST_F(Faults, CanFillTheDisk) {
    fail("disk_full");
    EXPECT_LT(zel_platform_open("/opt/new", O_WRONLY | O_CREAT, 0644), 0);
    EXPECT_EQ(errno, ENOSPC);
    EXPECT_FALSE(exists("/opt/new"));
    sqlite3 *database = nullptr;
    ASSERT_EQ(db_util_open(kDatabase, &database, 0), SQLITE_OK);
    EXPECT_EQ(run(database, kInsert, std::string(100000, 'x').c_str()), "step");
    EXPECT_EQ(db_util_close(database), SQLITE_OK);
}

TEST_F(Faults, CanFailOpeningADatabase) {
    fail("db_util_open", kDatabase, 1, 1, SQLITE_NOTADB);
    int other = 0;
    auto *database = reinterpret_cast<sqlite3 *>(&other);
    EXPECT_EQ(db_util_open(kDatabase, &database, 0), SQLITE_NOTADB);
    EXPECT_EQ(database, nullptr);
}

TEST_F(Faults, JournalNotesCallsInOrderWithTheirText) {
    int value = 0;
    vconf_get_int("db/before", &value);
    call("journal-start");
    vconf_get_int("db/a", &value);
    vconf_set_str("db/b", "text");
    zel_platform_sync();
    sqlite3 *database = nullptr;
    ASSERT_EQ(db_util_open(kDatabase, &database, 0), SQLITE_OK);
    run(database, "select * from max_pdp");
    db_util_close(database);
    call("journal-stop");
    vconf_get_int("db/after", &value);
    std::vector<std::string> seen;
    const json journal = call("journal-list");
    for (const json &entry : journal.at("calls"))
        seen.push_back(entry.at("function").get<std::string>() + " " + entry.at("arguments").dump() + " " +
                       entry.at("text").dump());
    EXPECT_THAT(seen, ElementsAre("vconf_get_int [\"db/a\"] \"db/a\"", "vconf_set_str [\"db/b\",\"text\"] \"db/b\"",
                                  "zel_platform_sync [] null",
                                  "db_util_open [\"/opt/dbspace/.dnet.db\",0] \"/opt/dbspace/.dnet.db\"",
                                  "sqlite3_step [\"select * from max_pdp\"] \"select * from max_pdp\"",
                                  "db_util_close [] null"));
    call("journal-clear");
    EXPECT_TRUE(call("journal-list").at("calls").empty());
}

} // namespace
