// Data-sync accounts: verification against the sync agent, and what the export says of it.

#include "counted-lists.h"
#include "data-sync-spec.h"

#include <gmock/gmock.h>
#include <sync-agent.h>

namespace zel_test {

using testing::Contains;
using testing::ElementsAre;
using testing::IsEmpty;

namespace {

constexpr const char *kReading[] = {"sync_agent_ds_get_all_profile", "sync_agent_ds_get_profile_name",
                                    "sync_agent_ds_get_server_info", "sync_agent_ds_get_sync_service_info",
                                    "sync_agent_ds_free_profile_info"};

constexpr ZelSvcElementId kChildren[] = {
    ZEL_SVC_ELEMENT_DATA_SYNC_ACC_NAME, ZEL_SVC_ELEMENT_DATA_SYNC_SERV_ADDR,    ZEL_SVC_ELEMENT_DATA_SYNC_USER_ID,
    ZEL_SVC_ELEMENT_DATA_SYNC_PASSWORD, ZEL_SVC_ELEMENT_CONTACT_DB_ENABLE_FLAG, ZEL_SVC_ELEMENT_CONTACT_DB_NAME,
    ZEL_SVC_ELEMENT_CONTACT_DB_ID,      ZEL_SVC_ELEMENT_CONTACT_DB_PASSWORD,    ZEL_SVC_ELEMENT_CALENDAR_DB_ENABLE_FLAG,
    ZEL_SVC_ELEMENT_CALENDAR_DB_NAME,   ZEL_SVC_ELEMENT_CALENDAR_DB_ID,         ZEL_SVC_ELEMENT_CALENDAR_DB_PASSWORD};

std::vector<std::string> exported_account() {
    std::vector<std::string> texts;
    export_start(ZEL_SVC_ELEMENT_DATA_SYNC);
    for (const ZelSvcElementId child : kChildren)
        texts.push_back(export_value(child));
    export_end(ZEL_SVC_ELEMENT_DATA_SYNC);
    return texts;
}

const std::vector<std::string> kFirst = {"Work",   "http://Work", "Work-user", "Work-secret", "on",     "con-name",
                                         "con-id", "con-secret",  "off",       "cal-name",    "cal-id", "cal-secret"};
const std::vector<std::string> kSecond = {"Home", "", "", "", "off", "book", "", "", "", "", "", ""};
const std::vector<std::string> kNothing(12);

// The item that the next verification reads.
std::string next_item() {
    const std::vector<ResultLine> lines = verify_spec(syncml(leaf("DataSync", "")));
    return lines.empty() ? "" : lines.front().text.substr(0, std::string_view{"[SyncML_DS1"}.size());
}

} // namespace

class CheckedDataSync : public ServicesPhone {
  protected:
    void SetUp() override {
        ServicesPhone::SetUp();
        call("sync-accounts-add", {{"name", "Work"},
                                   {"address", "http://Work"},
                                   {"user-id", "Work-user"},
                                   {"password", "Work-secret"},
                                   {"contacts", true},
                                   {"contacts-name", "con-name"},
                                   {"contacts-id", "con-id"},
                                   {"contacts-password", "con-secret"},
                                   {"calendar", false},
                                   {"calendar-name", "cal-name"},
                                   {"calendar-id", "cal-id"},
                                   {"calendar-password", "cal-secret"}});
        call("sync-accounts-add", {{"name", "Home"}, {"contacts-name", "book"}});
        start_journal();
    }
};

TEST_F(CheckedDataSync, EqualsTheSpec) {
    EXPECT_THAT(verify_spec(syncml(leaf("NbDataSync", "2") + account("One", "Work"))),
                ElementsAre(passed("[SyncML_DS/NbDataSync] Spec='2',Phone='2'"),
                            passed("[SyncML_DS1/AccName] Spec='Work',Phone='Work'"),
                            passed("[SyncML_DS1/ServAddr] Spec='http://Work',Phone='http://Work'"),
                            passed("[SyncML_DS1/UserId] Spec='Work-user',Phone='Work-user'"),
                            passed("[SyncML_DS1/Password] Spec='Work-secret',Phone='Work-secret'"),
                            passed("[SyncML_DS1/Contact_EnableFlag] Spec='on',Phone='on'"),
                            passed("[SyncML_DS1/Contact_DBName] Spec='con-name',Phone='con-name'"),
                            passed("[SyncML_DS1/Contact_DBId] Spec='con-id',Phone='con-id'"),
                            passed("[SyncML_DS1/Contact_DBPassword] Spec='con-secret',Phone='con-secret'"),
                            passed("[SyncML_DS1/Calendar_EnableFlag] Spec='off',Phone='off'"),
                            passed("[SyncML_DS1/Calendar_DBName] Spec='cal-name',Phone='cal-name'"),
                            passed("[SyncML_DS1/Calendar_DBId] Spec='cal-id',Phone='cal-id'"),
                            passed("[SyncML_DS1/Calendar_DBPassword] Spec='cal-secret',Phone='cal-secret'")));
    EXPECT_EQ(calls_of("sync_agent_ds_free_profile_info"), 4);
    expect_services_closed();
}

TEST_F(CheckedDataSync, DiffersLineByLine) {
    const std::vector<ResultLine> lines =
        verify_spec(syncml(leaf("NbDataSync", "3") + account("", "Work") + account("", "Home", "ON", "on")));
    ASSERT_EQ(lines.size(), 25U);
    EXPECT_EQ(lines[0], failed("[SyncML_DS/NbDataSync] Spec='3',Phone='2'"));
    EXPECT_EQ(lines[13], passed("[SyncML_DS2/AccName] Spec='Home',Phone='Home'"));
    const std::vector<ResultLine> rest{lines.begin() + 14, lines.end()};
    EXPECT_THAT(rest, ElementsAre(failed("[SyncML_DS2/ServAddr] Spec='http://Home',Phone=''"),
                                  failed("[SyncML_DS2/UserId] Spec='Home-user',Phone=''"),
                                  failed("[SyncML_DS2/Password] Spec='Home-secret',Phone=''"),
                                  failed("[SyncML_DS2/Contact_EnableFlag] Spec='ON',Phone='off'"),
                                  failed("[SyncML_DS2/Contact_DBName] Spec='con-name',Phone='book'"),
                                  failed("[SyncML_DS2/Contact_DBId] Spec='con-id',Phone=''"),
                                  failed("[SyncML_DS2/Contact_DBPassword] Spec='con-secret',Phone=''"),
                                  failed("[SyncML_DS2/Calendar_EnableFlag] Spec='on',Phone=''"),
                                  failed("[SyncML_DS2/Calendar_DBName] Spec='cal-name',Phone=''"),
                                  failed("[SyncML_DS2/Calendar_DBId] Spec='cal-id',Phone=''"),
                                  failed("[SyncML_DS2/Calendar_DBPassword] Spec='cal-secret',Phone=''")));
}

TEST_F(CheckedDataSync, PositionGoesBackWithTheCount) {
    const std::string one = leaf("DataSync", leaf("AccName", "Work"));
    EXPECT_EQ(verify_spec(syncml(one + one + one)).back(), failed("[SyncML_DS3] Reading phone failed"));
    EXPECT_THAT(verify_spec(syncml(one)), ElementsAre(failed("[SyncML_DS4] Reading phone failed")));
    EXPECT_EQ(verify_spec(syncml(leaf("NbDataSync", "2") + one)).at(1),
              passed("[SyncML_DS1/AccName] Spec='Work',Phone='Work'"));
}

TEST_F(CheckedDataSync, CountTakesThePositionBackInEveryCase) {
    const std::string count = syncml(leaf("NbDataSync", "2"));
    EXPECT_EQ(next_item(), "[SyncML_DS1");
    EXPECT_EQ(next_item(), "[SyncML_DS2");
    EXPECT_THAT(verify_spec(count, ZEL_SVC_PARSE_MODE_FULL), IsEmpty());
    EXPECT_EQ(next_item(), "[SyncML_DS1") << "in another mode";
    set_auto_flag(ZEL_SVC_AUTO_SYNCML, 1);
    EXPECT_THAT(verify_spec(count), IsEmpty());
    set_auto_flag(ZEL_SVC_AUTO_SYNCML, 0);
    EXPECT_EQ(next_item(), "[SyncML_DS1") << "where the SIM has the say";
    fail("sync_agent_ds_init", "", 1, 1);
    install_spec(count);
    EXPECT_EQ(next_item(), "[SyncML_DS1") << "in an install without agent";
    install_spec(count);
    EXPECT_EQ(next_item(), "[SyncML_DS1") << "in an install";
}

TEST_F(CheckedDataSync, ThatIsNotCheckedLeavesThePosition) {
    const std::string one = syncml(account("", "Work"));
    EXPECT_THAT(verify_spec(one, ZEL_SVC_PARSE_MODE_FULL), IsEmpty());
    set_auto_flag(ZEL_SVC_AUTO_SYNCML, 1);
    EXPECT_THAT(verify_spec(one), IsEmpty());
    set_auto_flag(ZEL_SVC_AUTO_SYNCML, 0);
    EXPECT_EQ(next_item(), "[SyncML_DS1");
}

TEST_F(CheckedDataSync, OutsideOfSyncMlNothingCanBeRead) {
    EXPECT_THAT(verify_spec(leaf("NbDataSync", "2") + account("", "Work")),
                ElementsAre(failed("[SyncML_DS/NbDataSync] Spec='2',Phone='?\?'"),
                            failed("[SyncML_DS1] Reading phone failed")));
    EXPECT_EQ(calls_of("sync_agent_ds_init"), 0);
    EXPECT_EQ(calls_of("sync_agent_ds_get_all_profile"), 0) << "an agent that is not in use is not asked";
}

TEST_F(CheckedDataSync, LongEnableTextIsShownCut) {
    const std::vector<ResultLine> lines =
        verify_spec(syncml(leaf("DataSync", leaf("ContactDB", leaf("EnableFlag", "on and on and on and on")))));
    EXPECT_THAT(lines, Contains(failed("[SyncML_DS1/Contact_EnableFlag] Spec='on and on and on an',Phone='on'")));
}

TEST_F(CheckedDataSync, ServiceOfAnotherTypeIsNeitherContactsNorCalendar) {
    call("sync-accounts-clear");
    ASSERT_EQ(sync_agent_ds_init(), 0);
    sync_agent_ds_profile *profile = nullptr;
    ASSERT_EQ(sync_agent_ds_create_profile_info(&profile), 0);
    ASSERT_EQ(sync_agent_ds_set_profile_name(profile, "Notes"), 0);
    const sync_agent_ds_service_info service{
        .type = 2, .enabled = 1, .source = 2, .database_name = "notes", .database_id = "id", .database_password = "p"};
    ASSERT_EQ(sync_agent_ds_set_sync_service_info(profile, &service), 0);
    ASSERT_EQ(sync_agent_ds_add_profile(profile), 0);
    ASSERT_EQ(sync_agent_ds_free_profile_info(profile), 0);
    ASSERT_EQ(sync_agent_ds_deinit(), 0);
    export_start(ZEL_SVC_ELEMENT_SYNCML);
    std::vector<std::string> expected(12);
    expected[0] = "Notes";
    EXPECT_EQ(exported_account(), expected);
    export_end(ZEL_SVC_ELEMENT_SYNCML);
}

TEST_F(CheckedDataSync, IsNotCheckedWhenItComesFromTheSimOrInOtherModes) {
    const std::string spec = syncml(leaf("NbDataSync", "2") + account("", "Work"));
    for (const ZelSvcParseMode mode : {ZEL_SVC_PARSE_MODE_FULL, ZEL_SVC_PARSE_MODE_OPERATOR, ZEL_SVC_PARSE_MODE_HEADER})
        EXPECT_THAT(verify_spec(spec, mode), IsEmpty());
    set_auto_flag(ZEL_SVC_AUTO_SYNCML, 1);
    EXPECT_THAT(verify_spec(spec), IsEmpty());
    EXPECT_EQ(calls_of("sync_agent_ds_get_all_profile"), 0);
    expect_services_closed();
}

TEST_F(CheckedDataSync, WithoutAgentTheCountIsUnknownAndEachAccountFails) {
    fail("sync_agent_ds_init");
    EXPECT_THAT(verify_spec(syncml(leaf("NbDataSync", "2") + account("", "Work") + account("", "Home"))),
                ElementsAre(failed("[SyncML_DS/NbDataSync] Spec='2',Phone='?\?'"),
                            failed("[SyncML_DS1] Reading phone failed"), failed("[SyncML_DS2] Reading phone failed")));
    EXPECT_EQ(run_log(), "[SyncML_DS/Error] sync_agent_ds_init() failed.\n");
    EXPECT_EQ(calls_of("sync_agent_ds_deinit"), 0);
    EXPECT_EQ(calls_of("sync_agent_ds_get_all_profile"), 0);
}

TEST_F(CheckedDataSync, FailsWhereTheAgentCannotBeAsked) {
    for (const std::string function : kReading) {
        fail(function);
        const std::vector<ResultLine> lines = verify_spec(syncml(leaf("NbDataSync", "2") + account("", "Work")));
        ASSERT_EQ(lines.size(), 2U) << function;
        EXPECT_EQ(lines[0], function == "sync_agent_ds_get_all_profile"
                                ? failed("[SyncML_DS/NbDataSync] Spec='2',Phone='?\?'")
                                : passed("[SyncML_DS/NbDataSync] Spec='2',Phone='2'"));
        EXPECT_EQ(lines[1], failed("[SyncML_DS1] Reading phone failed")) << function;
        call("fault-clear");
    }
    expect_services_closed();
}

TEST_F(CheckedDataSync, IsExported) {
    export_start(ZEL_SVC_ELEMENT_SYNCML);
    EXPECT_EQ(export_value(ZEL_SVC_ELEMENT_NB_DATA_SYNC), "2");
    EXPECT_EQ(exported_account(), kFirst);
    EXPECT_EQ(exported_account(), kSecond);
    EXPECT_EQ(exported_account(), kNothing);
    EXPECT_EQ(export_value(ZEL_SVC_ELEMENT_NB_DATA_SYNC), "2");
    EXPECT_EQ(exported_account(), kFirst);
    export_end(ZEL_SVC_ELEMENT_SYNCML);
    expect_services_closed();
}

TEST_F(CheckedDataSync, IsExportedEmptyWhenAnyCallFails) {
    export_start(ZEL_SVC_ELEMENT_SYNCML);
    for (const char *function : kReading) {
        export_value(ZEL_SVC_ELEMENT_NB_DATA_SYNC);
        fail(function, "", 1, 1);
        EXPECT_EQ(exported_account(), kNothing) << function;
        EXPECT_EQ(exported_account(), kSecond) << function;
    }
    export_end(ZEL_SVC_ELEMENT_SYNCML);
}

TEST_F(CheckedDataSync, CountIsExportedAsUnknownWithoutAgentOrList) {
    export_start(ZEL_SVC_ELEMENT_SYNCML);
    fail("sync_agent_ds_get_all_profile", "", 1, 1);
    EXPECT_EQ(export_value(ZEL_SVC_ELEMENT_NB_DATA_SYNC), "??");
    export_end(ZEL_SVC_ELEMENT_SYNCML);
    fail("sync_agent_ds_init");
    export_start(ZEL_SVC_ELEMENT_SYNCML);
    EXPECT_EQ(export_value(ZEL_SVC_ELEMENT_NB_DATA_SYNC), "??");
    EXPECT_EQ(exported_account(), kNothing);
    export_end(ZEL_SVC_ELEMENT_SYNCML);
    EXPECT_EQ(calls_of("sync_agent_ds_get_all_profile"), 1) << "the one of the agent that was in use";
}

TEST_F(CheckedDataSync, EveryListOfTheAgentIsReleasedAndEveryProfileToo) {
    const std::string spec = syncml(leaf("NbDataSync", "2") + account("", "Work") + account("", "Home"));
    // Two accounts: the count takes one list, each account a list of profiles and one of its services.
    EXPECT_EQ(released_lists(), 0);
    verify_spec(spec);
    EXPECT_EQ(released_lists(), 5);
    EXPECT_EQ(calls_of("sync_agent_ds_free_profile_info"), 6);
    // A profile that cannot be read to its end.
    fail("sync_agent_ds_get_sync_service_info", "", 1, 1);
    verify_spec(spec);
    EXPECT_EQ(released_lists(), 9);
    EXPECT_EQ(calls_of("sync_agent_ds_free_profile_info"), 12);
    // The clearing takes one, and the new accounts none.
    install_spec(spec);
    EXPECT_EQ(released_lists(), 10);
    EXPECT_EQ(calls_of("sync_agent_ds_free_profile_info"), 16);
}

} // namespace zel_test
