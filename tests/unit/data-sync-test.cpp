// Data-sync accounts: what an install makes, records and logs.

#include "data-sync-spec.h"

#include <gmock/gmock.h>

namespace zel_test {

using testing::ElementsAre;
using testing::IsEmpty;

namespace {

std::optional<std::string> recorded(const LoadedGroup &group, const char *key) { return group.text("ds", key); }

constexpr const char *kSetLines = "[SyncML_DS/Start] Set info.\n[SyncML_DS/Ended] Set info.\n";
constexpr const char *kClearLines = "[SyncML_DS/Start] Clear info.\n"
                                    "[SyncML_DS] Run get all().\n"
                                    "[SyncML_DS/Ended] Clear info.\n";

} // namespace

class DataSync : public ServicesPhone {
  protected:
    void SetUp() override {
        ServicesPhone::SetUp();
        set_operator("One");
        start_journal();
    }
};

TEST_F(DataSync, IsAddedToTheAgentAndRecorded) {
    const LoadedGroup group{ZEL_SVC_DATA_SYNCML_DS};
    install_spec(syncml(account("One", "Work")));
    const nlohmann::json made = accounts();
    ASSERT_EQ(made.size(), 1U);
    const nlohmann::json expected = {
        {"id", 1},
        {"attribute", 1},
        {"sync_mode", 0},
        {"sync_type", 0},
        {"sync_interval", 1},
        {"name", "Work"},
        {"address", "http://Work"},
        {"user_id", "Work-user"},
        {"password", "Work-secret"},
        {"contacts_enabled", true},
        {"contacts_source", 0},
        {"contacts_name", "con-name"},
        {"contacts_id", "con-id"},
        {"contacts_password", "con-secret"},
        {"calendar_enabled", false},
        {"calendar_source", 1},
        {"calendar_name", "cal-name"},
        {"calendar_id", "cal-id"},
        {"calendar_password", "cal-secret"},
    };
    EXPECT_EQ(made[0], expected);
    constexpr const char *kRecorded[][2] = {
        {"count", "1"},
        {"account_name_1", "Work"},
        {"server_addr_1", "http://Work"},
        {"user_id_1", "Work-user"},
        {"pwd_1", "Work-secret"},
        {"contact_db_enable_1", "1"},
        {"contact_db_name_1", "con-name"},
        {"contact_db_id_1", "con-id"},
        {"contact_db_pwd_1", "con-secret"},
        {"calendar_db_enable_1", "0"},
        {"calendar_db_name_1", "cal-name"},
        {"calendar_db_id_1", "cal-id"},
        {"calendar_db_pwd_1", "cal-secret"},
    };
    for (const auto &[key, text] : kRecorded)
        EXPECT_EQ(recorded(group, key), text) << key;
    EXPECT_EQ(run_log(), kSetLines);
    expect_services_closed();
}

TEST_F(DataSync, OnlyOnEnablesAService) {
    const LoadedGroup group{ZEL_SVC_DATA_SYNCML_DS};
    install_spec(syncml(account("", "a", "ON", "on") + account("", "b", "1", "On") + account("", "c", "", "on ")));
    const nlohmann::json made = accounts();
    ASSERT_EQ(made.size(), 3U);
    for (const nlohmann::json &each : made)
        EXPECT_EQ(each.at("contacts_enabled"), false) << each;
    EXPECT_EQ(made[0].at("calendar_enabled"), true);
    EXPECT_EQ(made[1].at("calendar_enabled"), false);
    EXPECT_EQ(made[2].at("calendar_enabled"), false);
    EXPECT_EQ(group.number("ds", "contact_db_enable_1"), 0);
    EXPECT_EQ(group.number("ds", "calendar_db_enable_1"), 1);
    EXPECT_EQ(group.number("ds", "calendar_db_enable_2"), 0);
    EXPECT_EQ(group.number("ds", "contact_db_enable_3"), 0);
}

TEST_F(DataSync, EmptyTextsOfAServiceAreAbsentForTheAgentAndRecordedEmpty) {
    const LoadedGroup group{ZEL_SVC_DATA_SYNCML_DS};
    install_spec(syncml(leaf("DataSync", leaf("AccName", "bare"))));
    const nlohmann::json made = accounts();
    ASSERT_EQ(made.size(), 1U);
    EXPECT_EQ(made[0].at("address"), "");
    EXPECT_EQ(made[0].at("password"), "");
    for (const char *name :
         {"contacts_name", "contacts_id", "contacts_password", "calendar_name", "calendar_id", "calendar_password"})
        EXPECT_TRUE(made[0].at(name).is_null()) << name;
    EXPECT_EQ(made[0].at("contacts_enabled"), false);
    for (const char *key : {"server_addr_1", "user_id_1", "pwd_1", "contact_db_name_1", "contact_db_id_1",
                            "contact_db_pwd_1", "calendar_db_name_1", "calendar_db_id_1", "calendar_db_pwd_1"})
        EXPECT_EQ(recorded(group, key), "") << key;
    EXPECT_EQ(group.number("ds", "contact_db_enable_1"), 0);
    EXPECT_EQ(group.number("ds", "calendar_db_enable_1"), 0);
}

TEST_F(DataSync, TextsAreCutToTheirFields) {
    const LoadedGroup group{ZEL_SVC_DATA_SYNCML_DS};
    const std::string text(250, 'x');
    install_spec(syncml(leaf(
        "DataSync", leaf("AccName", text) + leaf("ServAddr", text) + leaf("UserId", text) + leaf("Password", text) +
                        leaf("DBList", database("ContactDB", "on", text) + database("CalendarDB", "on", text)))));
    const nlohmann::json made = accounts();
    ASSERT_EQ(made.size(), 1U);
    for (const char *name : {"name", "address", "user_id", "password", "contacts_name", "contacts_id",
                             "contacts_password", "calendar_name", "calendar_id", "calendar_password"})
        EXPECT_EQ(made[0].at(name), text.substr(0, 199)) << name;
}

TEST_F(DataSync, NumbersGoOnFromAccountToAccount) {
    const LoadedGroup group{ZEL_SVC_DATA_SYNCML_DS};
    install_spec(syncml(account("", "a") + account("", "b")));
    install_spec(syncml(account("", "c")));
    EXPECT_EQ(recorded(group, "count"), "3");
    EXPECT_EQ(recorded(group, "account_name_3"), "c");
    EXPECT_THAT(account_names(), ElementsAre("a", "b", "c"));
}

TEST_F(DataSync, InstallMovesThePositionOnWhetherTheAccountWasTakenOrNot) {
    const LoadedGroup group{ZEL_SVC_DATA_SYNCML_DS};
    const std::string one = syncml(account("", "Work"));
    install_spec(one);
    EXPECT_THAT(verify_spec(one), ElementsAre(failed("[SyncML_DS2] Reading phone failed")));
    fail("sync_agent_ds_add_profile", "", 1, 1);
    install_spec(one);
    EXPECT_EQ(account_names().size(), 1U);
    EXPECT_THAT(verify_spec(one), ElementsAre(failed("[SyncML_DS4] Reading phone failed")));
}

TEST_F(DataSync, InstallThatTriesNoneLeavesThePosition) {
    const LoadedGroup group{ZEL_SVC_DATA_SYNCML_DS};
    const std::string one = syncml(account("One", "Work"));
    fail("sync_agent_ds_init", "", 1, 1);
    install_spec(one);
    set_auto_flag(ZEL_SVC_AUTO_SYNCML, 1);
    install_spec(one);
    set_auto_flag(ZEL_SVC_AUTO_SYNCML, 0);
    install_spec(one, ZEL_SVC_PARSE_MODE_OPERATOR);
    EXPECT_THAT(verify_spec(one), ElementsAre(failed("[SyncML_DS1] Reading phone failed")));
}

TEST_F(DataSync, FullInstallLeavesTheSimsAccountsOut) {
    const LoadedGroup group{ZEL_SVC_DATA_SYNCML_DS};
    set_auto_flag(ZEL_SVC_AUTO_SYNCML, 1);
    install_spec(syncml(account("One", "Work")));
    EXPECT_THAT(accounts(), IsEmpty());
    EXPECT_EQ(recorded(group, "count"), std::nullopt);
    EXPECT_EQ(run_log(), "");
}

TEST_F(DataSync, OperatorInstallTakesTheOperatorsOwnAccountsOnly) {
    const LoadedGroup group{ZEL_SVC_DATA_SYNCML_DS};
    set_auto_flag(ZEL_SVC_AUTO_SYNCML, 1);
    install_spec(syncml(account("Two", "two") + account("One", "one") + account("default", "all") +
                        account("", "none") + account("one", "small")),
                 ZEL_SVC_PARSE_MODE_OPERATOR);
    EXPECT_THAT(account_names(), ElementsAre("one"));
    EXPECT_EQ(recorded(group, "count"), "1");
    set_auto_flag(ZEL_SVC_AUTO_SYNCML, 0);
    install_spec(syncml(account("One", "late")), ZEL_SVC_PARSE_MODE_OPERATOR);
    EXPECT_THAT(account_names(), ElementsAre("one"));
}

TEST_F(DataSync, AccountOfDefaultIsNotInstalledForAnOperator) {
    const LoadedGroup group{ZEL_SVC_DATA_SYNCML_DS};
    set_auto_flag(ZEL_SVC_AUTO_SYNCML, 1);
    install_spec(syncml(account("default", "all")), ZEL_SVC_PARSE_MODE_OPERATOR);
    EXPECT_THAT(accounts(), IsEmpty());
    EXPECT_EQ(recorded(group, "count"), std::nullopt);
}

TEST_F(DataSync, NoOtherModeInstallsAny) {
    const LoadedGroup group{ZEL_SVC_DATA_SYNCML_DS};
    for (const int flag : {0, 1})
        for (const ZelSvcParseMode mode : kModesWithoutItems) {
            set_auto_flag(ZEL_SVC_AUTO_SYNCML, flag);
            install_spec(syncml(account("One", "one")), mode);
        }
    EXPECT_THAT(accounts(), IsEmpty());
    EXPECT_EQ(recorded(group, "count"), std::nullopt);
    EXPECT_EQ(run_log(), "");
    expect_services_closed();
}

TEST_F(DataSync, CountDeletesEveryProfileBeforeAnyIsAdded) {
    const LoadedGroup group{ZEL_SVC_DATA_SYNCML_DS};
    call("sync-accounts-add", {{"name", "user's"}});
    call("sync-accounts-add", {{"name", "user's second"}});
    install_spec(syncml(leaf("NbDataSync", "1") + account("", "Work")));
    EXPECT_THAT(account_names(), ElementsAre("Work"));
    EXPECT_EQ(run_log(), std::string{kClearLines} + kSetLines);
    EXPECT_EQ(calls_of("sync_agent_ds_delete_profile"), 2);
    EXPECT_EQ(calls_of("sync_agent_ds_free_profile_info"), 3);
    expect_services_closed();
}

TEST_F(DataSync, CountClearsInEveryMode) {
    for (const int mode : {0, 1, 2, 3, 4, 5, 7}) {
        call("sync-accounts-add", {{"name", "user's"}});
        set_auto_flag(ZEL_SVC_AUTO_SYNCML, mode % 2);
        install_spec(syncml(leaf("NbDataSync", "x")), static_cast<ZelSvcParseMode>(mode));
        EXPECT_THAT(accounts(), IsEmpty()) << mode;
    }
}

TEST_F(DataSync, CountWithoutAgentClearsNothing) {
    call("sync-accounts-add", {{"name", "user's"}});
    fail("sync_agent_ds_init");
    install_spec(syncml(leaf("NbDataSync", "1")));
    EXPECT_EQ(run_log(), "[SyncML_DS/Error] sync_agent_ds_init() failed.\n");
    EXPECT_EQ(accounts().size(), 1U);
    install_spec(leaf("NbDataSync", "1"));
    EXPECT_EQ(accounts().size(), 1U);
    EXPECT_EQ(calls_of("sync_agent_ds_get_all_profile"), 0);
}

TEST_F(DataSync, CountLogsTheSameWhenTheProfilesCannotBeRead) {
    call("sync-accounts-add", {{"name", "user's"}});
    fail("sync_agent_ds_get_all_profile");
    install_spec(syncml(leaf("NbDataSync", "1")));
    EXPECT_EQ(run_log(), kClearLines);
    EXPECT_EQ(accounts().size(), 1U);
}

TEST_F(DataSync, RefusedDeleteIsSilentAndTheOthersGo) {
    for (const char *name : {"a", "b", "c"})
        call("sync-accounts-add", {{"name", name}});
    fail("sync_agent_ds_delete_profile", "", 2, 1);
    install_spec(syncml(leaf("NbDataSync", "0")));
    EXPECT_EQ(run_log(), kClearLines);
    EXPECT_THAT(account_names(), ElementsAre("b"));
    EXPECT_EQ(calls_of("sync_agent_ds_free_profile_info"), 3);
}

// Each failure of the agent ends one account: nothing of it is recorded, and the next one is added.
struct SyncFailure {
    const char *name;
    const char *function;
    const char *log;
    int freed; // information of profiles, of both accounts
};

class FailingDataSync : public ServicesPhone, public testing::WithParamInterface<SyncFailure> {};

TEST_P(FailingDataSync, IsLoggedAndNotRecordedAndTheNextIsAdded) {
    const LoadedGroup group{ZEL_SVC_DATA_SYNCML_DS};
    start_journal();
    fail(GetParam().function, "", 1, 1);
    install_spec(syncml(account("", "first") + account("", "second")));
    EXPECT_EQ(run_log(), std::string{"[SyncML_DS/Start] Set info.\n"} + GetParam().log +
                             "[SyncML_DS/Ended] Set info.\n" + kSetLines);
    EXPECT_THAT(account_names(), ElementsAre("second"));
    EXPECT_EQ(recorded(group, "count"), "1");
    EXPECT_EQ(recorded(group, "account_name_1"), "second");
    EXPECT_EQ(recorded(group, "account_name_2"), std::nullopt);
    EXPECT_EQ(calls_of("sync_agent_ds_free_profile_info"), GetParam().freed);
    expect_services_closed();
}

INSTANTIATE_TEST_SUITE_P(
    , FailingDataSync,
    testing::Values(
        SyncFailure{"Create", "sync_agent_ds_create_profile_info", "[SyncML_DS/Error] Run create().\n", 1},
        SyncFailure{"Name", "sync_agent_ds_set_profile_name", "[SyncML_DS/Error] Run set prof name().\n", 2},
        SyncFailure{"Attribute", "sync_agent_ds_set_profile_attribute", "[SyncML_DS/Error] Run set prof attr().\n", 2},
        SyncFailure{"Add", "sync_agent_ds_add_profile", "[SyncML_DS/Error] Run add().\n", 2}),
    [](const auto &failure) { return failure.param.name; });

TEST_F(DataSync, IsAddedWhateverTheAgentSaysOfItsParts) {
    const LoadedGroup group{ZEL_SVC_DATA_SYNCML_DS};
    for (const char *function : {"sync_agent_ds_set_server_info", "sync_agent_ds_set_sync_info",
                                 "sync_agent_ds_set_sync_service_info", "sync_agent_ds_free_profile_info"})
        fail(function);
    install_spec(syncml(account("", "Work")));
    EXPECT_EQ(run_log(), kSetLines);
    EXPECT_EQ(recorded(group, "count"), "1");
    const nlohmann::json made = accounts();
    ASSERT_EQ(made.size(), 1U);
    EXPECT_EQ(made[0].at("address"), "");
    EXPECT_TRUE(made[0].at("contacts_enabled").is_null());
}

TEST_F(DataSync, NothingIsAddedWithoutAgent) {
    const LoadedGroup group{ZEL_SVC_DATA_SYNCML_DS};
    fail("sync_agent_ds_init", "", 1, 1);
    install_spec(syncml(leaf("NbDataSync", "2") + account("", "a") + account("", "b")));
    EXPECT_EQ(run_log(), "[SyncML_DS/Error] sync_agent_ds_init() failed.\n");
    EXPECT_THAT(accounts(), IsEmpty());
    EXPECT_EQ(recorded(group, "count"), std::nullopt);
    EXPECT_EQ(calls_of("sync_agent_ds_deinit"), 0);
    EXPECT_EQ(calls_of("sync_agent_ds_create_profile_info"), 0);
}

TEST_F(DataSync, AccountOutsideOfSyncMlIsNotAdded) {
    const LoadedGroup group{ZEL_SVC_DATA_SYNCML_DS};
    install_spec(syncml("") + account("", "outside"));
    EXPECT_THAT(accounts(), IsEmpty());
    EXPECT_EQ(run_log(), "");
}

TEST_F(DataSync, AgentIsLetGoWhenTheDocumentEndedInside) {
    const LoadedGroup group{ZEL_SVC_DATA_SYNCML_DS};
    install_spec("<SyncML><DataSync><AccName>half</AccName><");
    EXPECT_EQ(calls_of("sync_agent_ds_deinit"), 0);
    install_spec(account("", "outside"));
    EXPECT_THAT(accounts(), IsEmpty());
    expect_services_closed();
}

TEST_F(DataSync, StartInsideOfAnotherDropsTheOuter) {
    const LoadedGroup group{ZEL_SVC_DATA_SYNCML_DS};
    install_spec(syncml(leaf("DataSync", leaf("AccName", "outer") + leaf("ServAddr", "http://outer") +
                                             leaf("DataSync", leaf("AccName", "inner")))));
    EXPECT_THAT(account_names(), ElementsAre("inner"));
    EXPECT_EQ(accounts()[0].at("address"), "");
    EXPECT_EQ(recorded(group, "count"), "1");
}

TEST_F(DataSync, AgentIsUsedOnceAtATime) {
    install_spec(syncml(syncml("")));
    EXPECT_EQ(calls_of("sync_agent_ds_init"), 2);
    expect_services_closed();
}

} // namespace zel_test
