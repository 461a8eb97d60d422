// The bench phone's sync agent, through its client functions and through the verbs.

#include "support/bench-phone.h"
#include "support/sqlite-file.h"

#include <gmock/gmock.h>
#include <sync-agent.h>

namespace {

using nlohmann::json;
using ::testing::IsEmpty;

using Profile = sync_agent_ds_profile;

struct SyncAgent : zel_test::BenchPhone {
    static Profile *new_profile(const char *name) {
        Profile *profile = nullptr;
        EXPECT_EQ(sync_agent_ds_create_profile_info(&profile), 0);
        EXPECT_EQ(sync_agent_ds_set_profile_name(profile, name), 0);
        return profile;
    }

    // By every call that reads or fills a profile.
    static void expect_refused(Profile *profile) {
        const char *name = nullptr;
        GList *list = nullptr;
        sync_agent_ds_server_info server{.address = "", .user_id = "", .password = ""};
        const sync_agent_ds_service_info service{};
        EXPECT_NE(sync_agent_ds_get_profile_name(profile, &name), 0);
        EXPECT_NE(sync_agent_ds_get_server_info(profile, &server), 0);
        EXPECT_NE(sync_agent_ds_get_sync_service_info(profile, &list), 0);
        EXPECT_NE(sync_agent_ds_set_profile_name(profile, "x"), 0);
        EXPECT_NE(sync_agent_ds_set_profile_attribute(profile, 1), 0);
        EXPECT_NE(sync_agent_ds_set_server_info(profile, &server), 0);
        EXPECT_NE(sync_agent_ds_set_sync_info(profile, 0, 0, 1), 0);
        EXPECT_NE(sync_agent_ds_set_sync_service_info(profile, &service), 0);
        EXPECT_EQ(name, nullptr);
        EXPECT_EQ(list, nullptr);
    }

    static void free_all(GList *profiles) {
        for (guint i = 0; i < g_list_length(profiles); ++i)
            EXPECT_EQ(sync_agent_ds_free_profile_info(static_cast<Profile *>(g_list_nth_data(profiles, i))), 0);
        g_list_free(profiles);
    }

    json accounts() { return call("sync-accounts").at("accounts"); }
};

TEST_F(SyncAgent, GivesBackWhatAProfileWasAddedWith) {
    ASSERT_EQ(sync_agent_ds_init(), 0);
    Profile *profile = new_profile("Work");
    const sync_agent_ds_server_info server{.address = "http://s", .user_id = "me", .password = "secret"};
    EXPECT_EQ(sync_agent_ds_set_server_info(profile, &server), 0);
    sync_agent_ds_service_info service{.type = 1,
                                       .enabled = 1,
                                       .source = 1,
                                       .database_name = "cal",
                                       .database_id = nullptr,
                                       .database_password = "hidden"};
    EXPECT_EQ(sync_agent_ds_set_sync_service_info(profile, &service), 0);
    service.enabled = 0;
    EXPECT_EQ(sync_agent_ds_set_sync_service_info(profile, &service), 0);
    EXPECT_THAT(accounts(), IsEmpty());
    EXPECT_EQ(sync_agent_ds_add_profile(profile), 0);
    EXPECT_NE(sync_agent_ds_add_profile(profile), 0) << "an account is added once";
    EXPECT_EQ(sync_agent_ds_free_profile_info(profile), 0);

    GList *profiles = nullptr;
    ASSERT_EQ(sync_agent_ds_get_all_profile(&profiles), 0);
    ASSERT_EQ(g_list_length(profiles), 1U);
    profile = static_cast<Profile *>(g_list_nth_data(profiles, 0));
    const char *name = nullptr;
    EXPECT_EQ(sync_agent_ds_get_profile_name(profile, &name), 0);
    EXPECT_STREQ(name, "Work");
    sync_agent_ds_server_info found{};
    EXPECT_EQ(sync_agent_ds_get_server_info(profile, &found), 0);
    EXPECT_STREQ(found.address, "http://s");
    EXPECT_STREQ(found.user_id, "me");
    EXPECT_STREQ(found.password, "secret");
    GList *services = nullptr;
    EXPECT_EQ(sync_agent_ds_get_sync_service_info(profile, &services), 0);
    ASSERT_EQ(g_list_length(services), 1U);
    const auto *entry = static_cast<const sync_agent_ds_service_info *>(g_list_nth_data(services, 0));
    EXPECT_EQ(entry->type, 1);
    EXPECT_EQ(entry->enabled, 0);
    EXPECT_EQ(entry->source, 1);
    EXPECT_STREQ(entry->database_name, "cal");
    EXPECT_EQ(entry->database_id, nullptr);
    EXPECT_STREQ(entry->database_password, "hidden");
    g_list_free(services);
    free_all(profiles);
    EXPECT_EQ(sync_agent_ds_deinit(), 0);
}

TEST_F(SyncAgent, GivesItsProfilesInOrderAndDeletesThem) {
    for (const char *name : {"a", "b", "c"})
        call("sync-accounts-add", {{"name", name}});
    ASSERT_EQ(sync_agent_ds_init(), 0);
    GList *profiles = nullptr;
    ASSERT_EQ(sync_agent_ds_get_all_profile(&profiles), 0);
    ASSERT_EQ(g_list_length(profiles), 3U);
    auto *second = static_cast<Profile *>(g_list_nth_data(profiles, 1));
    EXPECT_EQ(sync_agent_ds_delete_profile(second), 0);
    EXPECT_NE(sync_agent_ds_delete_profile(second), 0);
    const char *name = nullptr;
    EXPECT_EQ(sync_agent_ds_get_profile_name(second, &name), 0) << "its information lives on";
    EXPECT_STREQ(name, "b");
    free_all(profiles);
    EXPECT_EQ(accounts().size(), 2U);
    EXPECT_EQ(accounts().at(1).at("name"), "c");
}

// The data base refuses the second half of a removal.
TEST_F(SyncAgent, KeepsTheServicesOfAnAccountThatItCannotRemove) {
    call("sync-accounts-add", {{"name", "kept"}, {"contacts", true}, {"contacts-name", "con"}});
    const json before = accounts();
    ASSERT_EQ(sync_agent_ds_init(), 0);
    GList *profiles = nullptr;
    ASSERT_EQ(sync_agent_ds_get_all_profile(&profiles), 0);
    ASSERT_EQ(g_list_length(profiles), 1U);
    const zel_test::SqliteFile state{root() + "/.platform/state.db"};
    state.run("CREATE TRIGGER no_removal BEFORE DELETE ON sync_account BEGIN SELECT RAISE(ABORT, 'refused'); END");
    EXPECT_NE(sync_agent_ds_delete_profile(static_cast<Profile *>(g_list_nth_data(profiles, 0))), 0);
    zel_host_phone *phone = zel_host_open(root().c_str(), nullptr);
    EXPECT_EQ(zel_host_call(phone, "sync-accounts-clear", nullptr, nullptr), 1);
    zel_host_close(phone);
    EXPECT_EQ(accounts(), before);
    state.run("DROP TRIGGER no_removal");
    EXPECT_EQ(sync_agent_ds_delete_profile(static_cast<Profile *>(g_list_nth_data(profiles, 0))), 0);
    EXPECT_THAT(accounts(), IsEmpty());
    free_all(profiles);
}

TEST_F(SyncAgent, GivesNoListWithoutProfiles) {
    ASSERT_EQ(sync_agent_ds_init(), 0);
    GList *profiles = nullptr;
    EXPECT_EQ(sync_agent_ds_get_all_profile(&profiles), 0);
    EXPECT_EQ(profiles, nullptr);
}

TEST_F(SyncAgent, ServesItsClientsOnly) {
    ASSERT_EQ(sync_agent_ds_init(), 0);
    Profile *profile = new_profile("Work");
    EXPECT_EQ(sync_agent_ds_deinit(), 0);
    GList *list = nullptr;
    EXPECT_NE(sync_agent_ds_get_all_profile(&list), 0);
    expect_refused(profile);
    EXPECT_NE(sync_agent_ds_add_profile(profile), 0);
    EXPECT_NE(sync_agent_ds_delete_profile(profile), 0);
    EXPECT_NE(sync_agent_ds_deinit(), 0);
    EXPECT_EQ(sync_agent_ds_free_profile_info(profile), 0);
    Profile *second = nullptr;
    EXPECT_NE(sync_agent_ds_create_profile_info(&second), 0);
    EXPECT_EQ(second, nullptr);
    EXPECT_THAT(accounts(), IsEmpty());
}

TEST_F(SyncAgent, FailsAtAnyCall) {
    call("sync-accounts-add", {{"name", "kept"}});
    ASSERT_EQ(sync_agent_ds_init(), 0);
    Profile *profile = new_profile("Work");
    for (const char *function :
         {"sync_agent_ds_init", "sync_agent_ds_deinit", "sync_agent_ds_get_all_profile",
          "sync_agent_ds_free_profile_info", "sync_agent_ds_get_profile_name", "sync_agent_ds_get_server_info",
          "sync_agent_ds_get_sync_service_info", "sync_agent_ds_create_profile_info", "sync_agent_ds_set_profile_name",
          "sync_agent_ds_set_profile_attribute", "sync_agent_ds_set_server_info", "sync_agent_ds_set_sync_info",
          "sync_agent_ds_set_sync_service_info", "sync_agent_ds_add_profile", "sync_agent_ds_delete_profile"})
        fail(function, "", 1, 1, -42);
    const char *name = nullptr;
    GList *list = nullptr;
    Profile *second = nullptr;
    sync_agent_ds_server_info server{.address = "", .user_id = "", .password = ""};
    const sync_agent_ds_service_info service{};
    EXPECT_EQ(sync_agent_ds_init(), -42);
    EXPECT_EQ(sync_agent_ds_deinit(), -42);
    EXPECT_EQ(sync_agent_ds_get_all_profile(&list), -42);
    EXPECT_EQ(sync_agent_ds_get_profile_name(profile, &name), -42);
    EXPECT_EQ(sync_agent_ds_get_server_info(profile, &server), -42);
    EXPECT_EQ(sync_agent_ds_get_sync_service_info(profile, &list), -42);
    EXPECT_EQ(sync_agent_ds_create_profile_info(&second), -42);
    EXPECT_EQ(sync_agent_ds_set_profile_name(profile, "x"), -42);
    EXPECT_EQ(sync_agent_ds_set_profile_attribute(profile, 1), -42);
    EXPECT_EQ(sync_agent_ds_set_server_info(profile, &server), -42);
    EXPECT_EQ(sync_agent_ds_set_sync_info(profile, 0, 0, 1), -42);
    EXPECT_EQ(sync_agent_ds_set_sync_service_info(profile, &service), -42);
    EXPECT_EQ(sync_agent_ds_add_profile(profile), -42);
    EXPECT_EQ(sync_agent_ds_delete_profile(profile), -42);
    EXPECT_EQ(sync_agent_ds_free_profile_info(profile), -42);
    EXPECT_EQ(list, nullptr);
    EXPECT_EQ(name, nullptr);
    EXPECT_EQ(second, nullptr);
    EXPECT_EQ(accounts().size(), 1U);
}

TEST_F(SyncAgent, RefusesNullPointers) {
    ASSERT_EQ(sync_agent_ds_init(), 0);
    Profile *profile = new_profile("Work");
    const sync_agent_ds_server_info server{};
    EXPECT_NE(sync_agent_ds_get_all_profile(nullptr), 0);
    EXPECT_NE(sync_agent_ds_create_profile_info(nullptr), 0);
    EXPECT_NE(sync_agent_ds_get_profile_name(profile, nullptr), 0);
    EXPECT_NE(sync_agent_ds_get_server_info(profile, nullptr), 0);
    EXPECT_NE(sync_agent_ds_get_sync_service_info(profile, nullptr), 0);
    EXPECT_NE(sync_agent_ds_set_profile_name(profile, nullptr), 0);
    EXPECT_NE(sync_agent_ds_set_server_info(profile, nullptr), 0);
    EXPECT_NE(sync_agent_ds_set_server_info(profile, &server), 0) << "its texts are null";
    EXPECT_NE(sync_agent_ds_set_sync_service_info(profile, nullptr), 0);
    EXPECT_NE(sync_agent_ds_add_profile(nullptr), 0);
    EXPECT_NE(sync_agent_ds_delete_profile(nullptr), 0);
    EXPECT_EQ(sync_agent_ds_free_profile_info(nullptr), 0);
    EXPECT_EQ(sync_agent_ds_free_profile_info(profile), 0);
}

TEST_F(SyncAgent, RefusesAProfileThatIsNull) {
    ASSERT_EQ(sync_agent_ds_init(), 0);
    expect_refused(nullptr);
}

TEST_F(SyncAgent, JournalHoldsNoPassword) {
    ASSERT_EQ(sync_agent_ds_init(), 0);
    Profile *profile = new_profile("Work");
    call("journal-start");
    const sync_agent_ds_server_info server{.address = "http://s", .user_id = "me", .password = "secret"};
    EXPECT_EQ(sync_agent_ds_set_server_info(profile, &server), 0);
    const sync_agent_ds_service_info service{.type = 0,
                                             .enabled = 1,
                                             .source = 0,
                                             .database_name = "con",
                                             .database_id = "id",
                                             .database_password = "secret"};
    EXPECT_EQ(sync_agent_ds_set_sync_service_info(profile, &service), 0);
    EXPECT_EQ(sync_agent_ds_free_profile_info(profile), 0);
    const std::string journal = call("journal-list").dump();
    EXPECT_NE(journal.find("http://s"), std::string::npos);
    EXPECT_EQ(journal.find("secret"), std::string::npos);
}

TEST_F(SyncAgent, VerbsFillAndClear) {
    call("sync-accounts-add", {{"name", "bare"}});
    call("sync-accounts-add", {{"name", "full"}, {"password", "p"}, {"calendar", true}, {"contacts-name", "con"}});
    const json all = accounts();
    ASSERT_EQ(all.size(), 2U);
    EXPECT_TRUE(all[0].at("contacts_enabled").is_null());
    EXPECT_TRUE(all[0].at("calendar_name").is_null());
    EXPECT_EQ(all[1].at("password"), "p");
    EXPECT_EQ(all[1].at("calendar_enabled"), true);
    EXPECT_EQ(all[1].at("contacts_enabled"), false);
    EXPECT_EQ(all[1].at("contacts_name"), "con");
    call("sync-accounts-clear");
    EXPECT_THAT(accounts(), IsEmpty());
    call("sync-accounts-add", {{"name", "again"}, {"contacts", true}});
    EXPECT_EQ(accounts().at(0).at("contacts_enabled"), true);
    call("reset");
    EXPECT_THAT(accounts(), IsEmpty());
}

} // namespace
