#include "support/bench-phone.h"
#include "support/sqlite-file.h"

#include "spec/zel-svc-parse-context.h"
#include "zel-svc-network-info.h"

#include <gmock/gmock.h>

#include <filesystem>

namespace zel_test {

using testing::IsEmpty;

namespace {

constexpr int kLookUp = 0;
constexpr int kCreate = 1;
constexpr const char *kAll = "select network_info_id, network_name, mccmnc from network_info order by network_info_id";

struct Answer {
    int result = -1;
    std::int32_t id = -7;

    friend bool operator==(const Answer &, const Answer &) = default;
    friend void PrintTo(const Answer &answer, std::ostream *out) {
        *out << "result " << answer.result << ", id " << answer.id;
    }
};

constexpr Answer kFailed{0, 0};

Answer get_id(const char *name, const char *mccmnc, int create) {
    Answer answer;
    answer.result = __zel_svc_network_info_get_id(name, mccmnc, create, &answer.id);
    return answer;
}

Answer count(const char *mccmnc) {
    Answer answer;
    answer.result = __zel_svc_network_info_count(mccmnc, &answer.id);
    return answer;
}

} // namespace

class NetworkInfo : public BenchPhone {
  protected:
    void SetUp() override {
        BenchPhone::SetUp();
        zel_svc_set_network_db_path(ZEL_SVC_NETWORK_DB_PATH_SIM1);
    }

    [[nodiscard]] std::string file(const char *path = ZEL_SVC_NETWORK_DB_PATH_SIM1) const { return root() + path; }
    void run(const std::string &sql) const { SqliteFile{file()}.run(sql); }
    [[nodiscard]] SqliteRows rows() const { return SqliteFile{file()}.rows(kAll); }
};

TEST_F(NetworkInfo, FirstNetworkGetsIdOne) {
    EXPECT_EQ(get_id("One", "26201", kCreate), (Answer{1, 1}));
    EXPECT_EQ(rows(), (SqliteRows{{"1", "One", "26201"}}));
}

TEST_F(NetworkInfo, NextNetworkGetsTheMaximumPlusOne) {
    run("insert into network_info values(41, 'Old', '20801'), (7, 'Older', '20810')");
    EXPECT_EQ(get_id("One", "26201", kCreate), (Answer{1, 42}));
    EXPECT_EQ(get_id("Two", "26202", kCreate), (Answer{1, 43}));
}

TEST_F(NetworkInfo, KnownMccMncTakesTheNewName) {
    run("insert into network_info values(5, 'Old', '26201')");
    EXPECT_EQ(get_id("New", "26201", kCreate), (Answer{1, 5}));
    EXPECT_EQ(rows(), (SqliteRows{{"5", "New", "26201"}}));
}

TEST_F(NetworkInfo, LookUpWantsNameAndMccMnc) {
    run("insert into network_info values(5, 'One', '26201')");
    EXPECT_EQ(get_id("One", "26201", kLookUp), (Answer{1, 5}));
    EXPECT_EQ(get_id("Two", "26201", kLookUp), (Answer{1, 0}));
    EXPECT_EQ(get_id("One", "26202", kLookUp), (Answer{1, 0}));
    EXPECT_EQ(get_id("one", "26201", kLookUp), (Answer{1, 0}));
    EXPECT_EQ(rows(), (SqliteRows{{"5", "One", "26201"}}));
}

TEST_F(NetworkInfo, AnyOtherModeIsALookUp) {
    EXPECT_EQ(get_id("One", "26201", 2), (Answer{1, 0}));
    EXPECT_EQ(get_id("One", "26201", -1), (Answer{1, 0}));
    EXPECT_THAT(rows(), IsEmpty());
}

TEST_F(NetworkInfo, FirstOfSeveralRowsIsTaken) {
    run("insert into network_info values(5, 'A', '26201'), (3, 'B', '26201')");
    EXPECT_EQ(get_id("C", "26201", kCreate), (Answer{1, 3}));
    EXPECT_EQ(rows(), (SqliteRows{{"3", "C", "26201"}, {"5", "A", "26201"}}));
}

TEST_F(NetworkInfo, QuotesAreTextLikeAny) {
    const char *name = "L'Op'; drop table network_info; --";
    EXPECT_EQ(get_id(name, "208'01", kCreate), (Answer{1, 1}));
    EXPECT_EQ(rows(), (SqliteRows{{"1", name, "208'01"}}));
    EXPECT_EQ(get_id(name, "208'01", kLookUp), (Answer{1, 1}));
    EXPECT_EQ(get_id("It's", "208'01", kCreate), (Answer{1, 1}));
    EXPECT_EQ(rows(), (SqliteRows{{"1", "It's", "208'01"}}));
    EXPECT_EQ(count("208'01"), (Answer{1, 1}));
}

TEST_F(NetworkInfo, EmptyTextsAreTextsAndNoNulls) {
    EXPECT_EQ(get_id("", "", kCreate), (Answer{1, 1}));
    EXPECT_EQ(get_id("", "", kCreate), (Answer{1, 1}));
    EXPECT_EQ(get_id("", "", kLookUp), (Answer{1, 1}));
    EXPECT_EQ(rows(), (SqliteRows{{"1", "", ""}}));
}

TEST_F(NetworkInfo, LongNamesAreKeptWhole) {
    const std::string name(500, '\'');
    EXPECT_EQ(get_id(name.c_str(), "26201", kCreate), (Answer{1, 1}));
    EXPECT_EQ(rows(), (SqliteRows{{"1", name, "26201"}}));
}

TEST_F(NetworkInfo, NullTextsLeaveTheIdAlone) {
    EXPECT_EQ(get_id(nullptr, "26201", kCreate), (Answer{0, -7}));
    EXPECT_EQ(get_id("One", nullptr, kLookUp), (Answer{0, -7}));
    EXPECT_EQ(__zel_svc_network_info_get_id("One", "26201", kCreate, nullptr), 0);
    EXPECT_THAT(rows(), IsEmpty());
}

TEST_F(NetworkInfo, PathOfTheMomentIsOpened) {
    zel_svc_set_network_db_path(ZEL_SVC_NETWORK_DB_PATH_SIM2);
    EXPECT_EQ(get_id("One", "26201", kCreate), (Answer{1, 1}));
    EXPECT_THAT(rows(), IsEmpty());
    EXPECT_EQ(SqliteFile{file(ZEL_SVC_NETWORK_DB_PATH_SIM2)}.rows(kAll), (SqliteRows{{"1", "One", "26201"}}));
}

TEST_F(NetworkInfo, MissingDatabaseFailsAndIsNotCreated) {
    std::filesystem::remove(file());
    EXPECT_EQ(get_id("One", "26201", kCreate), kFailed);
    EXPECT_EQ(get_id("One", "26201", kLookUp), kFailed);
    EXPECT_EQ(count("26201"), kFailed);
    EXPECT_EQ(__zel_svc_network_info_delete_all(), 0);
    EXPECT_FALSE(exists(ZEL_SVC_NETWORK_DB_PATH_SIM1));
}

TEST_F(NetworkInfo, EmptyPathFails) {
    zel_svc_set_network_db_path("");
    EXPECT_EQ(get_id("One", "26201", kCreate), kFailed);
    EXPECT_EQ(count("26201"), kFailed);
}

TEST_F(NetworkInfo, RefusedOpenFails) {
    fail("db_util_open", ZEL_SVC_NETWORK_DB_PATH_SIM1);
    EXPECT_EQ(get_id("One", "26201", kCreate), kFailed);
    EXPECT_EQ(get_id("One", "26201", kLookUp), kFailed);
    EXPECT_EQ(count("26201"), kFailed);
    EXPECT_EQ(__zel_svc_network_info_delete_all(), 0);
}

TEST_F(NetworkInfo, FileThatIsNoDatabaseFails) {
    write(ZEL_SVC_NETWORK_DB_PATH_SIM1, std::string(4096, 'x'));
    EXPECT_EQ(get_id("One", "26201", kCreate), kFailed);
    EXPECT_EQ(count("26201"), kFailed);
}

TEST_F(NetworkInfo, MissingTableFails) {
    run("drop table network_info");
    EXPECT_EQ(get_id("One", "26201", kCreate), kFailed);
    EXPECT_EQ(get_id("One", "26201", kLookUp), kFailed);
    EXPECT_EQ(count("26201"), kFailed);
    EXPECT_EQ(__zel_svc_network_info_delete_all(), 0);
}

TEST_F(NetworkInfo, LockedDatabaseFailsAndGrowsNoRow) {
    run("insert into network_info values(5, 'Old', '26201')");
    {
        const SqliteFile other{file()};
        other.run("begin exclusive");
        EXPECT_EQ(get_id("New", "26201", kCreate), kFailed);
        EXPECT_EQ(get_id("New", "26202", kCreate), kFailed);
        EXPECT_EQ(get_id("Old", "26201", kLookUp), kFailed);
        EXPECT_EQ(__zel_svc_network_info_delete_all(), 0);
        other.run("rollback");
    }
    EXPECT_EQ(rows(), (SqliteRows{{"5", "Old", "26201"}}));
}

TEST_F(NetworkInfo, DatabaseThatAnotherOneWritesCanBeReadButNotWritten) {
    run("insert into network_info values(5, 'Old', '26201')");
    {
        const SqliteFile other{file()};
        other.run("begin immediate");
        EXPECT_EQ(get_id("Old", "26201", kLookUp), (Answer{1, 5}));
        EXPECT_EQ(get_id("New", "26201", kCreate), kFailed);
        EXPECT_EQ(get_id("Two", "26202", kCreate), kFailed);
        other.run("rollback");
    }
    EXPECT_EQ(rows(), (SqliteRows{{"5", "Old", "26201"}}));
}

// A view in place of the table prepares every select and fails when the row is computed.
TEST_F(NetworkInfo, SelectThatFailsWhileItRunsIsNotTakenForNoRow) {
    run("alter table network_info rename to kept");
    run("create view network_info as select json('{') as network_info_id, network_name, mccmnc from kept");
    run("insert into kept values(5, 'One', '26201')");
    EXPECT_EQ(get_id("One", "26201", kLookUp), kFailed);
    EXPECT_EQ(get_id("One", "26201", kCreate), kFailed);
    EXPECT_EQ(SqliteFile{file()}.rows("select count(*) from kept"), (SqliteRows{{"1"}}));
}

TEST_F(NetworkInfo, RefusedInsertFails) {
    run("create trigger no_insert before insert on network_info begin select raise(abort, 'no'); end");
    EXPECT_EQ(get_id("One", "26201", kCreate), kFailed);
    EXPECT_THAT(rows(), IsEmpty());
}

TEST_F(NetworkInfo, RefusedRenameFails) {
    run("insert into network_info values(5, 'Old', '26201')");
    run("create trigger no_update before update on network_info begin select raise(abort, 'no'); end");
    EXPECT_EQ(get_id("New", "26201", kCreate), kFailed);
    EXPECT_EQ(rows(), (SqliteRows{{"5", "Old", "26201"}}));
}

TEST_F(NetworkInfo, RefusedBindFails) {
    run("insert into network_info values(5, 'Old', '26201')");
    fail("sqlite3_bind_text");
    EXPECT_EQ(get_id("New", "26201", kCreate), kFailed);
    EXPECT_EQ(get_id("Two", "26202", kCreate), kFailed);
    EXPECT_EQ(get_id("Old", "26201", kLookUp), kFailed);
    EXPECT_EQ(rows(), (SqliteRows{{"5", "Old", "26201"}}));
}

TEST_F(NetworkInfo, MaximumThatFailsWhileItRunsInsertsNothing) {
    fail("sqlite3_step", "select max(network_info_id)");
    EXPECT_EQ(get_id("One", "26201", kCreate), kFailed);
    EXPECT_THAT(rows(), IsEmpty());
}

// An unknown collation refuses the maximum alone; the insert is attempted all the same.
TEST_F(NetworkInfo, MaximumThatCannotBePreparedFailsButLeavesARow) {
    run("drop table network_info");
    run("create table network_info(network_info_id integer, network_name text, mccmnc text)");
    run("pragma writable_schema=on; update sqlite_master set sql='create table network_info(network_info_id integer "
        "collate none_such, network_name text, mccmnc text)' where name='network_info'");
    EXPECT_EQ(get_id("One", "26201", kCreate), kFailed);
    EXPECT_EQ(SqliteFile{file()}.rows("select * from network_info"), (SqliteRows{{"0", "One", "26201"}}));
    run("update network_info set network_info_id=-3");
    EXPECT_EQ(get_id("One", "26201", kCreate), kFailed);
    EXPECT_EQ(SqliteFile{file()}.rows("select * from network_info"),
              (SqliteRows{{"-3", "One", "26201"}, {"-3", "One", "26201"}}));
}

TEST_F(NetworkInfo, NoIdFollowsTheLargestInteger) {
    run("insert into network_info values(2147483646, 'Old', '20801')");
    EXPECT_EQ(get_id("One", "26201", kCreate), (Answer{1, 2147483647}));
    EXPECT_EQ(get_id("Two", "26202", kCreate), kFailed);
    EXPECT_EQ(rows().size(), 2U);
}

TEST_F(NetworkInfo, MaximumBeyond32BitsIsNotCut) {
    run("insert into network_info values(4294967296, 'Old', '20801')");
    EXPECT_EQ(get_id("One", "26201", kCreate), kFailed);
    EXPECT_EQ(rows().size(), 1U);
}

TEST_F(NetworkInfo, RowOfAnIdBelowOneIsNotFound) {
    run("insert into network_info values(0, 'Zero', '26201')");
    EXPECT_EQ(get_id("One", "26201", kCreate), (Answer{1, 1}));
    EXPECT_EQ(rows(), (SqliteRows{{"0", "Zero", "26201"}, {"1", "One", "26201"}}));
}

TEST_F(NetworkInfo, MaximumOfMinusOneGivesZero) {
    run("insert into network_info values(-1, 'Minus', '20801')");
    EXPECT_EQ(get_id("One", "26201", kCreate), (Answer{1, 0}));
    EXPECT_EQ(rows(), (SqliteRows{{"-1", "Minus", "20801"}, {"0", "One", "26201"}}));
}

TEST_F(NetworkInfo, MaximumBelowMinusOneGoesOnBelowZero) {
    run("insert into network_info values(-5, 'Minus', '20801')");
    EXPECT_EQ(get_id("One", "26201", kCreate), (Answer{1, -4}));
    EXPECT_EQ(rows(), (SqliteRows{{"-5", "Minus", "20801"}, {"-4", "One", "26201"}}));
}

TEST_F(NetworkInfo, DeleteAllEmptiesTheTable) {
    EXPECT_EQ(__zel_svc_network_info_delete_all(), 1);
    run("insert into network_info values(1, 'One', '26201'), (2, 'Two', '26202')");
    EXPECT_EQ(__zel_svc_network_info_delete_all(), 1);
    EXPECT_THAT(rows(), IsEmpty());
}

TEST_F(NetworkInfo, CountIsOfOneMccMnc) {
    run("insert into network_info values(1, 'A', '26201'), (2, 'B', '26202'), (3, 'C', '26201')");
    EXPECT_EQ(count("26201"), (Answer{1, 2}));
    EXPECT_EQ(count("26202"), (Answer{1, 1}));
    EXPECT_EQ(count("26203"), (Answer{1, 0}));
    EXPECT_EQ(count(nullptr), (Answer{0, -7}));
    EXPECT_EQ(__zel_svc_network_info_count("26201", nullptr), 0);
}

TEST_F(NetworkInfo, CountThatYieldsNoRowIsZero) {
    run("alter table network_info rename to kept");
    run("create view network_info as select network_info_id, network_name, mccmnc from kept where json('{') = mccmnc");
    run("insert into kept values(5, 'One', '26201')");
    EXPECT_EQ(count("26201"), (Answer{1, 0}));
}

TEST_F(NetworkInfo, NothingIsLeftOpen) {
    get_id("One", "26201", kCreate);
    get_id("Two", "26201", kCreate);
    get_id("Two", "26201", kLookUp);
    count("26201");
    // Works only when no other connection holds a lock.
    const SqliteFile other{file()};
    other.run("begin exclusive");
    other.run("delete from network_info");
    other.run("commit");
    EXPECT_THAT(rows(), IsEmpty());
}

TEST_F(NetworkInfo, NothingIsLogged) {
    run("drop table network_info");
    get_id("One", "26201", kCreate);
    EXPECT_EQ(run_log(), "");
    EXPECT_THAT(system_log(), IsEmpty());
}

} // namespace zel_test
