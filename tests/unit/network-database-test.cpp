// The connection to the network database and how it reads numbers.

#include "connections.h"

#include "zel-svc-network-database.h"

#include <db-util.h>
#include <dlfcn.h>

namespace {

bool gFailsAfterOpening = false;

} // namespace

// The platform's own, behind the one of this program.
int db_util_open(const char *path, sqlite3 **database, int option) {
    const auto real = reinterpret_cast<decltype(&db_util_open)>(dlsym(RTLD_NEXT, "db_util_open"));
    const int result = real(path, database, option);
    return gFailsAfterOpening ? SQLITE_CANTOPEN : result;
}

namespace zel_test {

class NetworkDatabaseAccess : public ConnectionPhone {};

TEST_F(NetworkDatabaseAccess, HasNoBusyTimeout) {
    NetworkDatabase database;
    NetworkStatement timeout = database.prepare("pragma busy_timeout");
    ASSERT_EQ(timeout.step(), NetworkStep::Row);
    EXPECT_EQ(timeout.text(0), "0");
}

TEST_F(NetworkDatabaseAccess, HandleOfAFailedOpeningIsClosed) {
    gFailsAfterOpening = true;
    {
        const NetworkDatabase database;
        EXPECT_FALSE(database);
        EXPECT_EQ(open_databases(), 0U);
    }
    gFailsAfterOpening = false;
    const NetworkDatabase database;
    EXPECT_TRUE(database);
    EXPECT_EQ(open_databases(), 1U); // what is counted is there while it is open
}

TEST_F(NetworkDatabaseAccess, NumbersSaturateAndFractionsAreCut) {
    struct Number {
        const char *sql;
        std::int32_t read;
    };
    const Number numbers[] = {
        {"select 1", 1},
        {"select null", 0},
        {"select 'word'", 0},
        {"select '12'", 12},
        {"select 0.00001", 0},
        {"select -1.9", -1},
        {"select 3e3", 3000},
        {"select 4294967297", INT32_MAX},
        {"select 1e19", INT32_MAX},
        {"select -1e19", INT32_MIN},
        {"select 9e999", INT32_MAX},
        {"select -9e999", INT32_MIN},
    };
    NetworkDatabase database;
    for (const Number &number : numbers) {
        NetworkStatement statement = database.prepare(number.sql);
        ASSERT_EQ(statement.step(), NetworkStep::Row) << number.sql;
        EXPECT_EQ(statement.integer(0), number.read) << number.sql;
    }
}

TEST_F(NetworkDatabaseAccess, NoIdFollowsTheLargestInteger) {
    EXPECT_EQ(zel_svc_network_id_after(INT32_MAX - 1), INT32_MAX);
    EXPECT_EQ(zel_svc_network_id_after(INT32_MAX), std::nullopt);
    EXPECT_EQ(zel_svc_network_id_after(INT32_MIN), INT32_MIN + 1);
}

} // namespace zel_test
