// A network database that refuses: what is left out, what is mirrored, and that nothing stays open.

#include "connections.h"
#include "failing-binds.h"

#include "zel-svc-element-act-connection-profile.h"

#include <filesystem>
#include <gmock/gmock.h>
#include <regex>

namespace zel_test {

using testing::IsEmpty;

namespace {

constexpr const char *kPath = ZEL_SVC_NETWORK_DB_PATH_SIM1;

// In the order in which they are bound.
const std::vector<std::string> kColumns{"profile_id",
                                        "profile_name",
                                        "apn",
                                        "auth_type",
                                        "auth_id",
                                        "auth_pwd",
                                        "pdp_protocol",
                                        "roam_pdp_protocol",
                                        "proxy_ip_addr",
                                        "home_url",
                                        "linger_time",
                                        "traffic_class",
                                        "is_static_ip_addr",
                                        "ip_addr",
                                        "is_static_dns_addr",
                                        "dns_addr1",
                                        "dns_addr2",
                                        "network_info_id",
                                        "svc_category_id",
                                        "hidden",
                                        "editable",
                                        "default_internet_con",
                                        "user_defined",
                                        "is_roaming_apn",
                                        "profile_enable"};

} // namespace

class ConnectionFaults : public ConnectionPhone {
  protected:
    void SetUp() override {
        ConnectionPhone::SetUp();
        add_network("One", "26201");
    }
    static void install_two() {
        install_connections(handle("One", tag("ProfBrowser", "Web")) + profile("One", "Web") + profile("One", "Mail"));
    }
    // Neither a mirror that counts nor a row that verification would look for.
    void expect_nothing_counted() const {
        EXPECT_EQ(mirrored("count"), std::nullopt);
        EXPECT_EQ(recorded("spec", "count"), std::nullopt);
        EXPECT_EQ(recorded("spec", "profile_id_1"), std::nullopt);
        EXPECT_EQ(open_databases(), 0U);
    }
    void expect_nothing_mirrored() const {
        expect_nothing_counted();
        for (const std::string &column : kColumns)
            EXPECT_EQ(mirrored(column + "_1"), std::nullopt) << column;
    }
};

TEST_F(ConnectionFaults, RefusedColumnLeavesTheRowOutAndTheMirrorBeforeIt) {
    for (int column = 1; column <= 25; ++column) {
        const LoadedGroup fresh{ZEL_SVC_DATA_CONNECTION};
        const FailingBind failing{"insert into pdp_profile", column, SQLITE_NOMEM};
        install_connections(profile("One", "Web"));
        EXPECT_EQ(failing.strikes(), 1) << column;
        EXPECT_THAT(profiles("*"), IsEmpty()) << column;
        for (std::size_t i = 0; i < kColumns.size(); ++i)
            EXPECT_EQ(mirrored(kColumns[i] + "_1").has_value(), static_cast<int>(i) + 1 < column)
                << column << " " << kColumns[i];
        expect_nothing_counted();
    }
}

TEST_F(ConnectionFaults, OnlyTheLastColumnsRefusalIsLogged) {
    for (int column = 1; column <= 24; ++column) {
        const FailingBind failing{"insert into pdp_profile", column, SQLITE_NOMEM};
        install_connections(profile("One", "Web"));
    }
    EXPECT_THAT(system_log(), IsEmpty());
    const FailingBind failing{"insert into pdp_profile", 25, SQLITE_NOMEM};
    install_connections(profile("One", "Web") + profile("One", "Web", tag("EnableStatus", "disable")));
    ASSERT_EQ(system_log().size(), 2U);
    const std::string prefix = "zel-svc-element-act-connection\\.cpp: __zel_svc_element_act_connection_set_profile\\("
                               "[0-9]+\\) > <Warning>\\[Connection\\]\\[DB\\] ";
    EXPECT_TRUE(std::regex_match(system_log()[0], std::regex(prefix + "sqlite3_bind_int\\(25\\(profile_enable\\),1\\)=7"
                                                                      "\\(Not SQLITE_OK\\) failed\\.\n")))
        << system_log()[0];
    EXPECT_TRUE(std::regex_match(system_log()[1], std::regex(prefix + "sqlite3_bind_int\\(25\\(profile_enable\\),0\\)=7"
                                                                      "\\(Not SQLITE_OK\\) failed\\.\n")))
        << system_log()[1];
    EXPECT_EQ(run_log(), "");
}

TEST_F(ConnectionFaults, NextProfileTakesTheNumberOfARefusedOne) {
    {
        const FailingBind failing{"insert into pdp_profile", 25, SQLITE_NOMEM};
        install_connections(profile("One", "Refused"));
    }
    install_spec(profile("One", "Web"));
    EXPECT_EQ(profiles("profile_id, profile_name"), (SqliteRows{{"1", "Web"}}));
    EXPECT_EQ(mirrored("count"), "1");
    EXPECT_EQ(mirrored("profile_name_1"), "Web");
    EXPECT_EQ(recorded("spec", "profile_id_1"), std::nullopt);
    EXPECT_EQ(recorded("spec", "profile_id_2"), "1");
}

TEST_F(ConnectionFaults, RefusedInsertIsNotCounted) {
    run("create trigger no_insert before insert on pdp_profile begin select raise(abort, 'no'); end");
    install_two();
    EXPECT_THAT(profiles("*"), IsEmpty());
    EXPECT_EQ(mirrored("profile_name_1"), "Mail");
    expect_nothing_counted();
}

TEST_F(ConnectionFaults, MissingDatabaseIsNotCreated) {
    std::filesystem::remove(file());
    install_two();
    EXPECT_FALSE(exists(kPath));
    expect_nothing_mirrored();
}

TEST_F(ConnectionFaults, RefusedOpenWritesNothing) {
    fail("db_util_open", kPath);
    install_two();
    EXPECT_THAT(profiles("*"), IsEmpty());
    expect_nothing_mirrored();
}

TEST_F(ConnectionFaults, EmptyPathWritesNothing) {
    zel_svc_set_network_db_path("");
    install_two();
    expect_nothing_mirrored();
}

TEST_F(ConnectionFaults, FileThatIsNoDatabaseStaysAsItIs) {
    const std::string garbage(8192, 'x');
    write(kPath, garbage);
    install_two();
    EXPECT_EQ(read(kPath), garbage);
    expect_nothing_mirrored();
}

TEST_F(ConnectionFaults, LockedDatabaseGrowsNoRow) {
    {
        const SqliteFile other{file()};
        other.run("begin exclusive");
        install_two();
        other.run("rollback");
    }
    expect_nothing_mirrored();
    EXPECT_THAT(profiles("*"), IsEmpty());
    EXPECT_THAT(networks(), IsEmpty());
}

// SQLite opens a file of a newer write format for reading only.
TEST_F(ConnectionFaults, ReadOnlyDatabaseIsLeftAsItIs) {
    std::string bytes = read(kPath);
    bytes[18] = 3;
    write(kPath, bytes);
    install_two();
    EXPECT_EQ(read(kPath), bytes);
    expect_nothing_mirrored();
}

TEST_F(ConnectionFaults, MissingProfileTableLeavesTheNetworkOnly) {
    run("drop table pdp_profile");
    install_two();
    EXPECT_EQ(networks(), (SqliteRows{{"1", "One", "26201"}}));
    expect_nothing_mirrored();
}

TEST_F(ConnectionFaults, TableOfOtherColumnsTakesNoRow) {
    run("alter table pdp_profile drop column profile_enable");
    install_two();
    EXPECT_THAT(profiles("*"), IsEmpty());
    expect_nothing_mirrored();
}

TEST_F(ConnectionFaults, MissingNetworkTableWritesNothing) {
    run("drop table network_info");
    install_two();
    EXPECT_THAT(profiles("*"), IsEmpty());
    expect_nothing_mirrored();
}

TEST_F(ConnectionFaults, NetworkOfAnIdBelowOneIsAFailure) {
    run("insert into network_info values(-1, 'Minus', '20801')");
    install_connections(profile("One", "Web"));
    EXPECT_EQ(networks(), (SqliteRows{{"-1", "Minus", "20801"}, {"0", "One", "26201"}}));
    EXPECT_THAT(profiles("*"), IsEmpty());
    expect_nothing_mirrored();
}

TEST_F(ConnectionFaults, FailedNetworkLeavesTheOthersTheirProfiles) {
    add_network("Two", "26202");
    fail("sqlite3_step", "insert into network_info", 1, 1);
    install_connections(profile("default", "Web"));
    EXPECT_EQ(networks(), (SqliteRows{{"1", "Two", "26202"}}));
    EXPECT_EQ(profiles("profile_name, network_info_id"), (SqliteRows{{"Web", "1"}}));
    EXPECT_EQ(recorded("spec", "profile_id_1"), "1");
    EXPECT_EQ(open_databases(), 0U);
}

TEST_F(ConnectionFaults, MaximumThatFailsWhileItRunsGrowsNoProfileOfIdZero) {
    fail("sqlite3_step", "select max(profile_id)");
    install_two();
    EXPECT_THAT(profiles("*"), IsEmpty());
    expect_nothing_mirrored();
}

// An unknown collation refuses the maximum alone.
TEST_F(ConnectionFaults, MaximumThatCannotBePreparedGivesIdZero) {
    run("pragma writable_schema=on; update sqlite_master set sql=replace(sql, 'profile_id INTEGER PRIMARY KEY', "
        "'profile_id INTEGER COLLATE none_such') where name='pdp_profile'");
    install_connections(profile("One", "Web"));
    EXPECT_EQ(rows("select profile_id, profile_name from pdp_profile"), (SqliteRows{{"0", "Web"}}));
    EXPECT_EQ(mirrored("profile_id_1"), "0");
    EXPECT_EQ(recorded("spec", "profile_id_1"), "0");
}

TEST_F(ConnectionFaults, DefaultThatCannotBeAskedForIsNone) {
    const char *count = "select profile_name, default_internet_con from pdp_profile";
    fail("sqlite3_step", "select count(default_internet_con)", 1, 1);
    install_two();
    EXPECT_EQ(rows(count), (SqliteRows{{"Web", "0"}, {"Mail", "0"}}));
    {
        const FailingBind failing{"select count(default_internet_con)", 2, SQLITE_NOMEM};
        install_two();
        EXPECT_EQ(failing.strikes(), 1);
        EXPECT_EQ(rows(count), (SqliteRows{{"Web", "0"}, {"Mail", "0"}}));
    }
    install_two();
    EXPECT_EQ(rows(count), (SqliteRows{{"Web", "1"}, {"Mail", "0"}}));
}

// Opened are: for the cleaning, for the insert, for the network, for the default.
TEST_F(ConnectionFaults, DefaultOfADatabaseThatDoesNotOpenAgainIsNone) {
    for (const char *function : {"db_util_open", "sqlite3_prepare_v2"}) {
        call("fault-clear");
        fail(function, kPath, 4, 1);
        install_two();
        EXPECT_EQ(profiles("profile_name, default_internet_con"), (SqliteRows{{"Web", "0"}, {"Mail", "0"}}))
            << function;
        EXPECT_EQ(open_databases(), 0U);
    }
}

// The insert's connection and the network's: the profile is left out, the next one is not.
TEST_F(ConnectionFaults, ConnectionThatFailsOnceCostsOneProfile) {
    for (const char *function : {"db_util_open", "sqlite3_prepare_v2"})
        for (const int from : {2, 3}) {
            const LoadedGroup fresh{ZEL_SVC_DATA_CONNECTION};
            run("delete from pdp_profile; delete from network_info");
            call("fault-clear");
            fail(function, kPath, from, 1);
            install_two();
            EXPECT_EQ(profiles("profile_name"), (SqliteRows{{"Mail"}})) << function << from;
            EXPECT_EQ(mirrored("count"), "1") << function << from;
            EXPECT_EQ(recorded("spec", "profile_id_1"), std::nullopt);
            EXPECT_EQ(recorded("spec", "profile_id_2"), "1");
            EXPECT_EQ(open_databases(), 0U);
        }
}

TEST_F(ConnectionFaults, FullDiskLeavesOnlyWhatIsWhole) {
    run("insert into network_info values(7, 'One', '26201')");
    run("create table filler(text); insert into filler values(zeroblob(20000))");
    fail("disk_full", kPath);
    std::string many;
    for (int i = 0; i < 60; ++i)
        many += profile("One", std::string(150, 'n'), tag("APN", std::string(190, 'a')));
    install_connections(many);
    const auto written = static_cast<int>(profiles("*").size());
    EXPECT_LT(written, 60);
    EXPECT_EQ(mirrored("count").value_or("0"), std::to_string(written));
    EXPECT_EQ(rows("pragma integrity_check"), (SqliteRows{{"ok"}}));
    EXPECT_EQ(open_databases(), 0U);
}

// The second try drops what the first profile has become in the meantime.
TEST_F(ConnectionFaults, CleaningThatIsTriedAgainDropsTheProfileBeforeIt) {
    fail("db_util_open", kPath, 1, 1);
    install_two();
    EXPECT_EQ(profiles("profile_name"), (SqliteRows{{"Mail"}}));
    EXPECT_EQ(mirrored("count"), "2");
}

TEST_F(ConnectionFaults, CleaningGivesItsResult) {
    run("insert into network_info values(7, 'One', '26201')");
    run("insert into pdp_profile(profile_id, network_info_id, user_defined) values(1, 7, 0), (2, 7, 1)");
    fail("sqlite3_step", "delete from pdp_profile", 1, 1);
    install_connections(profile("One", "Web"));
    EXPECT_EQ(profiles("profile_id"), (SqliteRows{{"1"}, {"2"}, {"3"}}));
    install_connections(profile("One", "Web"));
    EXPECT_EQ(profiles("profile_id"), (SqliteRows{{"2"}, {"3"}}));
    call("fault-clear");
    EXPECT_TRUE(__zel_svc_connection_delete_operator_profiles("26201"));
    EXPECT_EQ(profiles("profile_id"), (SqliteRows{{"2"}}));
    EXPECT_TRUE(__zel_svc_connection_delete_operator_profiles("no such"));
    run("drop table pdp_profile");
    EXPECT_FALSE(__zel_svc_connection_delete_operator_profiles("26201"));
}

TEST_F(ConnectionFaults, NothingElseIsLogged) {
    run("drop table pdp_profile");
    install_two();
    EXPECT_EQ(run_log(), "");
    EXPECT_THAT(system_log(), IsEmpty());
}

} // namespace zel_test
