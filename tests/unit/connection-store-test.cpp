// Which rows a profile becomes: networks, modes and the operator's earlier profiles.

#include "connections.h"

#include <gmock/gmock.h>

namespace zel_test {

using testing::IsEmpty;

namespace {

constexpr const char *kWhose = "profile_name, (select network_name || '/' || mccmnc from network_info where "
                               "network_info.network_info_id = pdp_profile.network_info_id)";

} // namespace

class ConnectionStore : public ConnectionPhone {
  protected:
    // A profile that is there already.
    void put_profile(int id, const std::string &name, int network, bool is_users) const {
        run("insert into pdp_profile(profile_id, profile_name, network_info_id, svc_category_id, "
            "default_internet_con, user_defined) values(" +
            std::to_string(id) + ", '" + name + "', " + std::to_string(network) + ", 1, 1, " + (is_users ? "1" : "0") +
            ")");
    }
    void use_sim_profiles() const { set_auto_flag(ZEL_SVC_AUTO_PROFILE, 1); }
};

TEST_F(ConnectionStore, OneRowForEachMccMncOfTheNetwork) {
    add_network("One", "26201");
    add_network("Two", "26202");
    add_network("One", "26206");
    install_connections(profile("One", "Web") + profile("Two", "Mail") + profile("Three", "Lost"));
    EXPECT_EQ(profiles(kWhose), (SqliteRows{{"Web", "One/26201"}, {"Web", "One/26206"}, {"Mail", "Two/26202"}}));
    EXPECT_EQ(mirrored("count"), "3");
}

TEST_F(ConnectionStore, DefaultAndNamelessProfilesServeEveryNetwork) {
    add_network("One", "26201");
    add_network("Two", "26202");
    install_connections(profile("default", "Web") + tag("Profile", tag("ProfileName", "Mail")) +
                        profile("Default", "Lost"));
    EXPECT_EQ(profiles(kWhose),
              (SqliteRows{{"Web", "One/26201"}, {"Web", "Two/26202"}, {"Mail", "One/26201"}, {"Mail", "Two/26202"}}));
}

TEST_F(ConnectionStore, EveryProfileOfANetworkTableEntryWithoutAName) {
    add_network("", "26201");
    install_connections(profile("default", "Web"));
    EXPECT_EQ(profiles(kWhose), (SqliteRows{{"Web", "/26201"}}));
}

TEST_F(ConnectionStore, WithoutNetworksThereAreNoRows) {
    install_connections(profile("default", "Web") + profile("One", "Mail"));
    EXPECT_THAT(profiles("*"), IsEmpty());
    EXPECT_THAT(networks(), IsEmpty());
    EXPECT_EQ(mirrored("count"), std::nullopt);
}

TEST_F(ConnectionStore, NamesOfNetworksAreCutAlike) {
    add_network(std::string(60, 'o'), "26201");
    install_connections(profile(std::string(45, 'o'), "Web") + profile(std::string(38, 'o'), "Lost"));
    EXPECT_EQ(profiles("profile_name"), (SqliteRows{{"Web"}}));
}

TEST_F(ConnectionStore, NetworkTakesTheNameOfTheSpec) {
    run("insert into network_info values(7, 'Old', '26201')");
    add_network("One", "26201");
    install_connections(profile("One", "Web"));
    EXPECT_EQ(networks(), (SqliteRows{{"7", "One", "26201"}}));
    EXPECT_EQ(profiles("network_info_id"), (SqliteRows{{"7"}}));
}

TEST_F(ConnectionStore, IdsGoOnBehindTheLargest) {
    run("insert into network_info values(7, 'Other', '20801')");
    put_profile(41, "Old", 7, false);
    add_network("One", "26201");
    install_connections(profile("One", "Web") + profile("One", "Mail"));
    EXPECT_EQ(profiles("profile_id, profile_name"), (SqliteRows{{"41", "Old"}, {"42", "Web"}, {"43", "Mail"}}));
    EXPECT_EQ(mirrored("profile_id_1"), "42");
    EXPECT_EQ(mirrored("profile_id_2"), "43");
}

TEST_F(ConnectionStore, NoIdFollowsTheLargestInteger) {
    run("insert into network_info values(7, 'Other', '20801')");
    put_profile(2147483646, "Old", 7, false);
    add_network("One", "26201");
    install_connections(profile("One", "Web") + profile("One", "Mail"));
    EXPECT_EQ(profiles("profile_id, profile_name"), (SqliteRows{{"2147483646", "Old"}, {"2147483647", "Web"}}));
    run("update pdp_profile set profile_id=4294967296 where profile_id=2147483646");
    install_connections(profile("One", "Mail"));
    EXPECT_EQ(profiles("profile_id, profile_name"), (SqliteRows{{"4294967296", "Old"}}));
}

TEST_F(ConnectionStore, SpecIndexFindsEachSpecProfilesLastRow) {
    add_network("One", "26201");
    add_network("One", "26206");
    install_connections(profile("One", "Web") + profile("Nobody", "Lost") + profile("One", "Mail"));
    EXPECT_EQ(recorded("spec", "profile_id_1"), "2");
    EXPECT_EQ(recorded("spec", "profile_id_2"), std::nullopt);
    EXPECT_EQ(recorded("spec", "profile_id_3"), "4");
    EXPECT_EQ(recorded("spec", "count"), "3");
    EXPECT_EQ(mirrored("count"), "4");
}

TEST_F(ConnectionStore, ConnectionsStartTheSpecIndexAgainButNotTheMirror) {
    add_network("One", "26201");
    install_connections(profile("One", "Web") + profile("One", "Mail"));
    install_connections(profile("One", "Only"));
    EXPECT_EQ(recorded("spec", "count"), "1");
    EXPECT_EQ(recorded("spec", "profile_id_1"), "1");
    EXPECT_EQ(mirrored("count"), "3");
    EXPECT_EQ(mirrored("profile_name_3"), "Only");
}

TEST_F(ConnectionStore, CountOfTheMirrorIsReadAndDoesNotOverflow) {
    add_network("One", "26201");
    zel_svc_data_set_int(ZEL_SVC_DATA_CONNECTION, "connection", "count", 2147483647);
    install_connections(profile("One", "Web"));
    EXPECT_EQ(mirrored("count"), "2147483647");
    EXPECT_EQ(mirrored("profile_name_2147483647"), "Web");
}

TEST_F(ConnectionStore, OperatorsEarlierProfilesAreReplaced) {
    run("insert into network_info values(7, 'One', '26201'), (8, 'Two', '26202'), (9, 'Too', '26201')");
    put_profile(1, "Old", 7, false);
    put_profile(2, "Older", 9, false);
    put_profile(3, "The users", 7, true);
    put_profile(4, "Of Two", 8, false);
    put_profile(5, "Lost", 10, false);
    add_network("One", "26201");
    add_network("Two", "26202");
    install_connections(profile("One", "New") + profile("One", "Newer"));
    EXPECT_EQ(profiles("profile_name"), (SqliteRows{{"The users"}, {"Of Two"}, {"Lost"}, {"New"}, {"Newer"}}));
}

TEST_F(ConnectionStore, TheNextInstallReplacesThemAgain) {
    add_network("One", "26201");
    install_connections(profile("One", "Web") + profile("One", "Mail"));
    install_connections(profile("One", "Other"));
    EXPECT_EQ(profiles("profile_name"), (SqliteRows{{"Other"}}));
    install_connections("");
    EXPECT_EQ(profiles("profile_name"), (SqliteRows{{"Other"}}));
}

TEST_F(ConnectionStore, ProfilesWithoutConnectionsGoOnWhereTheLastOnesEnded) {
    add_network("One", "26201");
    install_spec(profile("One", "First"));
    EXPECT_EQ(recorded("spec", "profile_id_1"), "1");
    install_spec(profile("One", "Second"));
    EXPECT_EQ(profiles("profile_name"), (SqliteRows{{"First"}, {"Second"}}));
    EXPECT_EQ(recorded("spec", "profile_id_2"), "2");
}

TEST_F(ConnectionStore, OnlyAnInstallForgetsWhatItHasCleaned) {
    add_network("One", "26201");
    install_connections(profile("One", "First"));
    verify_spec(connections(""));
    parse_spec(connections(""), ZEL_SVC_PARSE_ACTION_ENCODE, ZEL_SVC_PARSE_MODE_FULL);
    install_spec(profile("One", "Second"));
    EXPECT_EQ(profiles("profile_name"), (SqliteRows{{"First"}, {"Second"}}));
}

TEST_F(ConnectionStore, CleaningThatFailedIsTriedAgain) {
    run("insert into network_info values(7, 'One', '26201')");
    put_profile(1, "Old", 7, false);
    add_network("One", "26201");
    fail("sqlite3_step", "delete from pdp_profile", 1, 1);
    install_connections(profile("One", "New"));
    EXPECT_EQ(profiles("profile_name"), (SqliteRows{{"Old"}, {"New"}}));
    install_spec(profile("One", "Newer") + profile("One", "Newest"));
    EXPECT_EQ(profiles("profile_name"), (SqliteRows{{"Newer"}, {"Newest"}}));
}

TEST_F(ConnectionStore, FullInstallLeavesTheSimsProfilesOut) {
    add_network("One", "26201");
    run("insert into network_info values(7, 'One', '26201')");
    put_profile(1, "Old", 7, false);
    use_sim_profiles();
    install_connections(profile("One", "Web"));
    EXPECT_EQ(profiles("profile_name"), (SqliteRows{{"Old"}}));
    EXPECT_EQ(mirrored("count"), std::nullopt);
    set_auto_flag(ZEL_SVC_AUTO_PROFILE, 0);
    install_spec(profile("One", "Web"));
    EXPECT_EQ(recorded("spec", "count"), "1"); // the dropped one was not counted
}

TEST_F(ConnectionStore, OperatorInstallTakesTheOperatorsProfilesOnly) {
    use_sim_profiles();
    set_operator("One", "26207");
    add_network("One", "26201");
    install_connections(profile("Two", "Two's") + profile("One", "Web") + profile("default", "Any") +
                            profile("", "None") + profile("one", "Small") + profile("One", "Mail"),
                        ZEL_SVC_PARSE_MODE_OPERATOR);
    EXPECT_EQ(profiles(kWhose), (SqliteRows{{"Web", "One/26207"}, {"Mail", "One/26207"}}));
    EXPECT_EQ(recorded("spec", "profile_id_1"), "1");
    EXPECT_EQ(recorded("spec", "profile_id_2"), "2");
    EXPECT_EQ(recorded("spec", "count"), "2");
}

TEST_F(ConnectionStore, OperatorInstallNeedsTheFlagAndAName) {
    set_operator("One", "26201");
    install_connections(profile("One", "Web"), ZEL_SVC_PARSE_MODE_OPERATOR);
    use_sim_profiles();
    set_operator("", "26201");
    install_connections(profile("", "Web") + tag("Profile", tag("ProfileName", "Mail")), ZEL_SVC_PARSE_MODE_OPERATOR);
    set_operator("default", "26201");
    install_connections(profile("Default", "Web"), ZEL_SVC_PARSE_MODE_OPERATOR);
    EXPECT_THAT(profiles("*"), IsEmpty());
    EXPECT_THAT(networks(), IsEmpty());
}

TEST_F(ConnectionStore, OperatorsRefusedRowIsCountedAllTheSame) {
    use_sim_profiles();
    set_operator("One", "26201");
    fail("sqlite3_step", "insert into pdp_profile", 1, 1);
    install_connections(profile("One", "Refused") + profile("One", "Web"), ZEL_SVC_PARSE_MODE_OPERATOR);
    EXPECT_EQ(profiles("profile_name"), (SqliteRows{{"Web"}}));
    EXPECT_EQ(recorded("spec", "profile_id_1"), std::nullopt);
    EXPECT_EQ(recorded("spec", "profile_id_2"), "1");
}

TEST_F(ConnectionStore, OtherModesInstallNone) {
    set_operator("One", "26201");
    add_network("One", "26201");
    for (const int flag : {0, 1})
        for (const ZelSvcParseMode mode : kModesWithoutItems) {
            set_auto_flag(ZEL_SVC_AUTO_PROFILE, flag);
            install_connections(profile("One", "Web"), mode);
            EXPECT_THAT(profiles("*"), IsEmpty()) << mode;
        }
    set_auto_flag(ZEL_SVC_AUTO_PROFILE, 0);
    install_spec(profile("One", "Web"));
    EXPECT_EQ(recorded("spec", "count"), "1"); // nor were they counted
}

TEST_F(ConnectionStore, ProfileLeftOpenIsDroppedByTheNext) {
    add_network("One", "26201");
    install_spec("<Connections><Profile><NetworkName>One</NetworkName><APN>lost</APN><broken");
    install_connections(tag("Profile", tag("NetworkName", "One") + tag("ProfileName", "Web")));
    EXPECT_EQ(profiles("profile_name, apn"), (SqliteRows{{"Web", ""}}));
}

TEST_F(ConnectionStore, ProfileInAProfileTakesItsPlace) {
    add_network("One", "26201");
    install_connections("<Profile><ProfileName>Outer</ProfileName>" + profile("One", "Inner") +
                        "<NetworkName>One</NetworkName></Profile>");
    EXPECT_EQ(profiles("profile_name"), (SqliteRows{{"Inner"}}));
}

TEST_F(ConnectionStore, ValuesOutsideAProfileDoNothing) {
    add_network("One", "26201");
    install_connections(tag("ProfileName", "lost") + tag("APN", "lost") + tag("DNS", tag("IPAddr", "lost")) +
                        tag("Profile", tag("NetworkName", "One")));
    EXPECT_EQ(profiles("profile_name, apn"), (SqliteRows{{"", ""}}));
}

TEST_F(ConnectionStore, CountElementsDoNothingInAnInstall) {
    add_network("One", "26201");
    install_connections(tag("NbProfileHandle", "9") + tag("NbProfile", "9") + profile("One", "Web"));
    EXPECT_EQ(recorded("spec", "count"), "1");
    EXPECT_EQ(mirrored("count"), "1");
}

TEST_F(ConnectionStore, WithoutItsGroupTheRowIsWrittenAllTheSame) {
    zel_svc_data_free(ZEL_SVC_DATA_CONNECTION);
    add_network("One", "26201");
    install_connections(profile("One", "Web"));
    EXPECT_EQ(profiles("profile_name"), (SqliteRows{{"Web"}}));
}

} // namespace zel_test
