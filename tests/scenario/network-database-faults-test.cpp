// A full install whose network database cannot be used as it should: the run goes on, nothing stays open, and
// the section store tells no more than was written.

#include "service-phone.h"
#include "support/sqlite-file.h"
#include "support/sqlite-program.h"

#include <gmock/gmock.h>

#include <algorithm>
#include <filesystem>
#include <fstream>

namespace {

namespace fs = std::filesystem;

using ::testing::IsEmpty;
using zel_test::SqliteFile;
using zel_test::SqliteRows;

constexpr const char *kDatabase = "/opt/dbspace/.dnet.db";
constexpr const char *kRunLog = "/opt/system/zel-default/output/zel-config.log";
constexpr const char *kLastKey = "db/contacts-svc/phonenumber_min_match_digit"; // of the last setting in the file

constexpr const char *kCustomer = R"(
<GeneralInfo><SalesCode>BTU</SalesCode>
  <NetworkInfo><MCCMNC>00101</MCCMNC><NetworkName>North</NetworkName></NetworkInfo>
  <NetworkInfo><MCCMNC>00102</MCCMNC><NetworkName>South</NetworkName></NetworkInfo>
</GeneralInfo>
<Settings>
  <Main><Network>
    <NbMaxPDP>2</NbMaxPDP>
    <MaxPDP><NetworkName>South</NetworkName><MaxPDP2G>1</MaxPDP2G><MaxPDP3G>2</MaxPDP3G></MaxPDP>
    <MaxPDP><NetworkName>default</NetworkName><MaxPDP3G>3</MaxPDP3G></MaxPDP>
    <NbFastDormancy>2</NbFastDormancy>
    <FastDormancy><NetworkName>default</NetworkName><FastDormancyEnableStatus>on</FastDormancyEnableStatus>
      <TimeoutValue>2.5</TimeoutValue><LCDStatus>on</LCDStatus></FastDormancy>
    <FastDormancy><NetworkName>North</NetworkName><FastDormancyEnableStatus>off</FastDormancyEnableStatus>
      <LCDStatus>off</LCDStatus><Version>rel8</Version></FastDormancy>
  </Network></Main>
  <Connections>
    <NbProfileHandle>1</NbProfileHandle>
    <ProfileHandle><NetworkName>North</NetworkName><ProfBrowser>Web</ProfBrowser></ProfileHandle>
    <NbProfile>2</NbProfile>
    <Profile><NetworkName>default</NetworkName><ProfileName>Web</ProfileName></Profile>
    <Profile><NetworkName>North</NetworkName><ProfileName>Own</ProfileName></Profile>
  </Connections>
  <Contact><CLIDigits>8</CLIDigits></Contact>
</Settings>
)";

// What an install left behind.
const SqliteRows kNetworks = {{"1", "North", "00101"}, {"2", "South", "00102"}};
const SqliteRows kDormancy = {{"0", "1", "2500", "-1", "-1", "-1"}, {"1", "2", "2500", "-1", "-1", "-1"}};
const SqliteRows kLimits = {{"1", "2", "2"}, {"2", "1", "3"}};
const SqliteRows kProfiles = {{"1", "Web", "1", "1", "1"}, {"2", "Web", "2", "1", "0"}, {"3", "Own", "1", "1", "0"}};
constexpr const char *kProfileColumns =
    "(select profile_id, profile_name, network_info_id, svc_category_id, default_internet_con from pdp_profile)";

class NetworkDatabaseFaults : public zel_test::ServicePhone {
  protected:
    void SetUp() override {
        ServicePhone::SetUp();
        write_customer("BTU", kCustomer);
        call("journal-start");
    }

    [[nodiscard]] std::string file() const { return root() + kDatabase; }
    void run(const std::string &sql) const { SqliteFile{file()}.run(sql); }
    [[nodiscard]] SqliteRows rows(const std::string &table) const {
        return SqliteFile{file()}.rows("select * from " + table + " order by 1");
    }

    void install() {
        set_int(kLastKey, 0);
        fs::remove(root() + kRunLog);
        const std::size_t messages_before = system_log().size();
        const std::size_t open_before = open_files();
        zel_svc_config_install_customer("BTU", ZEL_SVC_INSTALL_CONFIG_MODE);
        EXPECT_EQ(open_files(), open_before) << "a database stays open";
        EXPECT_EQ(get_int(kLastKey), 8) << "the run did not go on";
        EXPECT_TRUE(logged("[Config/Ended] Install customer.xml (Full)."));
        EXPECT_TRUE(told_behind(messages_before, ") > Installation ended.\n"));
    }

    // Whether one of the system-log messages behind the first `skipped` ones ends so.
    bool told_behind(std::size_t skipped, std::string_view end) {
        const std::vector<std::string> messages = system_log();
        return std::any_of(messages.begin() + static_cast<std::ptrdiff_t>(std::min(skipped, messages.size())),
                           messages.end(), [&](const std::string &message) { return message.ends_with(end); });
    }

    // Descriptors of the network databases and their journals that this process holds.
    static std::size_t open_files() {
        std::size_t count = 0;
        for (const auto &entry : fs::directory_iterator{"/proc/self/fd"}) {
            std::error_code gone;
            if (fs::read_symlink(entry.path(), gone).string().find(".dnet") != std::string::npos) ++count;
        }
        return count;
    }

    // Calls of a platform function in the journal.
    std::size_t calls(const std::string &function) {
        std::size_t count = 0;
        const nlohmann::json journal = call("journal-list");
        for (const auto &entry : journal.at("calls"))
            if (entry.at("function") == function) ++count;
        return count;
    }
    void expect_every_open_is_closed() {
        EXPECT_GE(calls("db_util_open"), 2U); // one for each network at least
        EXPECT_EQ(calls("db_util_close"), calls("db_util_open"));
    }

    // An integer or text of a group, as an INI reader sees it; nothing when the file has no such key.
    std::optional<std::string> recorded(const std::string &group, const std::string &key) {
        std::istringstream lines{read(data_path(group))};
        for (std::string line; std::getline(lines, line);) {
            const std::size_t end = line.find(' ');
            if (line.substr(0, end) == key) return line.substr(line.find("= ") + 2);
        }
        return std::nullopt;
    }
    void expect_limits_recorded(const std::optional<std::string> &first, const std::optional<std::string> &second) {
        EXPECT_EQ(recorded("max-pdp", "count"), "2");
        EXPECT_EQ(recorded("max-pdp", "network_name_1"), "\"South\"");
        EXPECT_EQ(recorded("max-pdp", "max_pdp_2g_1"), "1");
        EXPECT_EQ(recorded("max-pdp", "max_pdp_3g_1"), first);
        EXPECT_EQ(recorded("max-pdp", "max_pdp_3g_2"), second);
    }
    void expect_dormancy_recorded(const std::optional<std::string> &count) {
        EXPECT_EQ(recorded("fast-dormancy", "count"), count);
    }
    void expect_profiles_recorded(const std::optional<std::string> &count) {
        EXPECT_EQ(recorded("connection", "count"), count);
    }
    void expect_every_row() {
        EXPECT_EQ(rows("network_info"), kNetworks);
        EXPECT_EQ(rows("fast_dormancy"), kDormancy);
        EXPECT_EQ(rows("max_pdp"), kLimits);
        EXPECT_EQ(rows(kProfileColumns), kProfiles);
    }
    // What an install of no known network records.
    void expect_items_of_no_network() {
        expect_dormancy_recorded("2");
        expect_limits_recorded("2", "3");
        expect_profiles_recorded(std::nullopt);
    }
};

TEST_F(NetworkDatabaseFaults, NoneOfThem) {
    install();
    expect_every_row();
    expect_dormancy_recorded("2");
    expect_limits_recorded("2", "3");
    expect_profiles_recorded("3");
    expect_every_open_is_closed();
}

// Without the database no network is known: items stand for none, so they are recorded but write nothing.
TEST_F(NetworkDatabaseFaults, MissingFileIsNotCreated) {
    fs::remove(file());
    install();
    EXPECT_FALSE(exists(kDatabase));
    expect_items_of_no_network();
    EXPECT_EQ(calls("db_util_close"), 0U); // nothing was opened
}

TEST_F(NetworkDatabaseFaults, FileThatIsNoDatabaseIsLeftAlone) {
    const std::string bytes(8192, 'x');
    write(kDatabase, bytes);
    install();
    EXPECT_EQ(read(kDatabase), bytes);
    expect_items_of_no_network();
    expect_every_open_is_closed();
}

TEST_F(NetworkDatabaseFaults, EmptyFileStaysEmpty) {
    write(kDatabase, "");
    install();
    EXPECT_EQ(read(kDatabase), "");
    expect_items_of_no_network();
    expect_every_open_is_closed();
}

TEST_F(NetworkDatabaseFaults, DamagedPagesEndInErrors) {
    std::string bytes = read(kDatabase);
    std::fill(bytes.begin() + 100, bytes.end(), '\x7f');
    write(kDatabase, bytes);
    install();
    EXPECT_EQ(read(kDatabase), bytes);
    expect_items_of_no_network();
    expect_every_open_is_closed();
}

TEST_F(NetworkDatabaseFaults, CutFileEndsInErrors) {
    const std::string bytes = read(kDatabase).substr(0, 5000);
    write(kDatabase, bytes);
    install();
    EXPECT_EQ(read(kDatabase), bytes);
    expect_items_of_no_network();
    expect_every_open_is_closed();
}

// A file whose format asks for a newer writer can be read, by anyone, and written by nobody.
TEST_F(NetworkDatabaseFaults, ReadOnlyDatabaseKeepsWhatItHolds) {
    run("insert into network_info values(7, 'Old', '00101')");
    run("insert into max_pdp values(1, 7, 9)");
    constexpr std::size_t kWriteVersion = 18;
    std::string bytes = read(kDatabase);
    bytes.at(kWriteVersion) = '\x03';
    write(kDatabase, bytes);
    install();
    EXPECT_EQ(read(kDatabase), bytes);
    expect_items_of_no_network();
    expect_every_open_is_closed();
}

TEST_F(NetworkDatabaseFaults, RefusedOpensAreNotClosed) {
    fail("db_util_open", kDatabase);
    install();
    EXPECT_THAT(rows("network_info"), IsEmpty());
    EXPECT_EQ(calls("db_util_close"), 0U);
    expect_items_of_no_network();
}

// Locks of another program

TEST_F(NetworkDatabaseFaults, LockFromTheStartGrowsNoRow) {
    {
        const zel_test::SqliteProgram other{file()};
        other.run("begin exclusive;");
        other.wait_until_locked("select 1 from sqlite_master");
        install();
    }
    for (const char *table : {"network_info", "fast_dormancy", "max_pdp", "pdp_profile"})
        EXPECT_THAT(rows(table), IsEmpty()) << table;
    expect_items_of_no_network();
    expect_every_open_is_closed();
}

TEST_F(NetworkDatabaseFaults, LockForWritingKeepsEveryRowAsItWas) {
    install();
    {
        const zel_test::SqliteProgram other{file()};
        other.run("begin immediate;");
        other.wait_until_locked();
        install();
    }
    expect_every_row();
    expect_every_open_is_closed();
}

// Tables that are not as they should be

TEST_F(NetworkDatabaseFaults, MissingTableFailsItsOwnItemsOnly) {
    run("drop table fast_dormancy");
    install();
    EXPECT_EQ(rows("network_info"), kNetworks);
    EXPECT_EQ(rows("max_pdp"), kLimits);
    EXPECT_EQ(rows(kProfileColumns), kProfiles);
    expect_dormancy_recorded(std::nullopt);
    expect_limits_recorded("2", "3");
    expect_every_open_is_closed();
}

TEST_F(NetworkDatabaseFaults, MissingLimitsLeaveTheRest) {
    run("drop table max_pdp");
    install();
    EXPECT_EQ(rows("fast_dormancy"), kDormancy);
    expect_dormancy_recorded("2");
    expect_limits_recorded(std::nullopt, std::nullopt);
    expect_every_open_is_closed();
}

TEST_F(NetworkDatabaseFaults, MissingProfilesLeaveTheRest) {
    run("drop table pdp_profile");
    install();
    EXPECT_EQ(rows("fast_dormancy"), kDormancy);
    EXPECT_EQ(rows("max_pdp"), kLimits);
    expect_profiles_recorded(std::nullopt);
    expect_every_open_is_closed();
}

TEST_F(NetworkDatabaseFaults, MissingNetworksLeaveTheOtherTablesEmpty) {
    run("drop table network_info");
    install();
    EXPECT_THAT(rows("fast_dormancy"), IsEmpty());
    EXPECT_THAT(rows("max_pdp"), IsEmpty());
    expect_every_open_is_closed();
}

TEST_F(NetworkDatabaseFaults, OtherColumnsFailTheirOwnItemsOnly) {
    run("alter table fast_dormancy rename column lcd_off_timeout_rel8 to off8");
    run("alter table max_pdp rename column max_pdp_3g to three");
    run("alter table pdp_profile rename column profile_enable to enabled");
    install();
    EXPECT_EQ(rows("network_info"), kNetworks);
    EXPECT_THAT(rows("fast_dormancy"), IsEmpty()); // the insert names the column
    EXPECT_THAT(rows("max_pdp"), IsEmpty());
    EXPECT_THAT(rows("pdp_profile"), IsEmpty());
    expect_dormancy_recorded(std::nullopt);
    expect_limits_recorded(std::nullopt, std::nullopt);
    expect_profiles_recorded(std::nullopt);
    expect_every_open_is_closed();
}

TEST_F(NetworkDatabaseFaults, MoreColumnsAreLeftToThemselves) {
    for (const char *table : {"network_info", "fast_dormancy", "max_pdp"})
        run("alter table " + std::string{table} + " add column extra text default 'kept'");
    install();
    EXPECT_EQ(rows("network_info"), (SqliteRows{{"1", "North", "00101", "kept"}, {"2", "South", "00102", "kept"}}));
    EXPECT_EQ(rows("max_pdp"), (SqliteRows{{"1", "2", "2", "kept"}, {"2", "1", "3", "kept"}}));
    expect_limits_recorded("2", "3");
}

TEST_F(NetworkDatabaseFaults, ItemsOfKnownNetworksThatFailAreNotRecorded) {
    install();
    run("create trigger no_dormancy before update on fast_dormancy begin select raise(abort, 'no'); end");
    run("create trigger no_limits before insert on max_pdp begin select raise(abort, 'no'); end");
    run("create trigger no_profiles before insert on pdp_profile begin select raise(abort, 'no'); end");
    install();
    EXPECT_EQ(rows("network_info"), kNetworks);
    expect_dormancy_recorded(std::nullopt);
    expect_limits_recorded(std::nullopt, std::nullopt);
    expect_profiles_recorded(std::nullopt);
    EXPECT_THAT(rows("pdp_profile"), IsEmpty()); // the earlier ones were replaced
    expect_every_open_is_closed();
}

// A view cannot be written; it can be read.
TEST_F(NetworkDatabaseFaults, ViewInPlaceOfATableIsRead) {
    run("insert into network_info values(1, 'North', '00101'), (2, 'South', '00102')");
    run("alter table network_info rename to kept; create view network_info as select * from kept");
    install();
    EXPECT_EQ(rows("kept"), kNetworks);
    EXPECT_THAT(rows("fast_dormancy"), IsEmpty()); // no network could be renamed, so none is known
    expect_every_open_is_closed();
}

// Storage

// Rows of one size until the next one would need another page of the file; the last one's id.
int fill(const SqliteFile &database, const std::string &table, const std::string &values) {
    const SqliteRows pages = database.rows("pragma page_count");
    database.run("begin");
    for (int id = 1;; ++id) {
        database.run("savepoint row; insert into " + table + " values(" + std::to_string(id) + values + ")");
        const bool grew = database.rows("pragma page_count") != pages;
        database.run(grew ? "rollback to row; commit" : "release row");
        if (grew) return id - 1;
    }
}

TEST_F(NetworkDatabaseFaults, FullDiskTakesNoNewRow) {
    run("insert into network_info values(8, 'Old', '00101'), (9, 'Older', '00102')");
    int dormancy = 0;
    int limits = 0;
    int profiles = 0;
    {
        const SqliteFile database{file()};
        dormancy = fill(database, "fast_dormancy", ", 77, -1, -1, -1, -1");
        limits = fill(database, "max_pdp", ", 77, 3");
        std::string nulls; // a row of nulls is smaller than any profile's
        for (int column = 1; column < 26; ++column)
            nulls += ", null";
        profiles = fill(database, "pdp_profile", nulls);
    }
    fail("disk_full", kDatabase);
    install();
    // Renaming takes no page.
    EXPECT_EQ(rows("network_info"), (SqliteRows{{"8", "North", "00101"}, {"9", "South", "00102"}}));
    EXPECT_EQ(rows("fast_dormancy").size(), static_cast<std::size_t>(dormancy));
    EXPECT_EQ(rows("max_pdp").size(), static_cast<std::size_t>(limits));
    EXPECT_EQ(rows("pdp_profile").size(), static_cast<std::size_t>(profiles));
    expect_dormancy_recorded(std::nullopt);
    expect_limits_recorded(std::nullopt, std::nullopt);
    expect_profiles_recorded(std::nullopt);
    expect_every_open_is_closed();
}

TEST_F(NetworkDatabaseFaults, CloseThatFailsChangesNothing) {
    fail("db_util_close");
    install();
    expect_every_row();
    expect_every_open_is_closed();
}

TEST_F(NetworkDatabaseFaults, StatementsThatCannotBePrepared) {
    fail("sqlite3_prepare_v2", kDatabase);
    install();
    EXPECT_THAT(rows("network_info"), IsEmpty());
    EXPECT_THAT(rows("fast_dormancy"), IsEmpty());
    expect_every_open_is_closed();
}

TEST_F(NetworkDatabaseFaults, TextsThatCannotBeBound) {
    fail("sqlite3_bind_text", kDatabase);
    install();
    EXPECT_THAT(rows("network_info"), IsEmpty());
    expect_every_open_is_closed();
}

} // namespace
