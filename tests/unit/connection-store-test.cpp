// Which rows a profile becomes: networks, modes, the operator's earlier profiles, services and defaults.

#include "connections.h"

#include <gmock/gmock.h>

namespace zel_test {

using testing::IsEmpty;

namespace {

const std::string kWeb = tag("ProfBrowser", "Web");
constexpr const char *kWhose = "profile_name, (select network_name || '/' || mccmnc from network_info where "
                               "network_info.network_info_id = pdp_profile.network_info_id)";
constexpr const char *kService = "profile_name, svc_category_id, default_internet_con";

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
    run("update pdp_profile set profile_id=4294967296 where profile_id=2147483647");
    install_connections(profile("One", "Mail"));
    EXPECT_EQ(profiles("profile_id"), (SqliteRows{{"2147483646"}}));
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
    put_profile(3, "The user's", 7, true);
    put_profile(4, "Two's", 8, false);
    put_profile(5, "Nobody's", 10, false);
    add_network("One", "26201");
    add_network("Two", "26202");
    install_connections(profile("One", "New") + profile("One", "Newer"));
    EXPECT_EQ(profiles("profile_name"), (SqliteRows{{"The user's"}, {"Two's"}, {"Nobody's"}, {"New"}, {"Newer"}}));
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

TEST_F(ConnectionStore, HandlesGiveEachProfileItsService) {
    add_network("One", "26201");
    install_connections(handle("One", tag("ProfBrowser", "Web") + tag("ProfMMS", "Pictures") +
                                          tag("ProfIntSharing", "Share") + tag("ProfIMS", "Calls") +
                                          tag("ProfXCAP", "Services") + tag("ProfEmergencyIMSCall", "Emergency")) +
                        profile("One", "Emergency") + profile("One", "Services") + profile("One", "Calls") +
                        profile("One", "Share") + profile("One", "Pictures") + profile("One", "Web") +
                        profile("One", "Other") + profile("One", "web"));
    EXPECT_EQ(profiles(kService), (SqliteRows{{"Emergency", "6", "1"},
                                              {"Services", "7", "1"},
                                              {"Calls", "0", "1"},
                                              {"Share", "5", "1"},
                                              {"Pictures", "2", "1"},
                                              {"Web", "1", "1"},
                                              {"Other", "1", "0"},
                                              {"web", "1", "0"}}));
}

TEST_F(ConnectionStore, FirstServiceOfAHandleDecides) {
    add_network("One", "26201");
    const std::vector<std::pair<std::string, std::string>> services{
        {"ProfBrowser", "1"}, {"ProfMMS", "2"},  {"ProfIntSharing", "5"},
        {"ProfIMS", "0"},     {"ProfXCAP", "7"}, {"ProfEmergencyIMSCall", "6"}};
    for (std::size_t first = 0; first < services.size(); ++first) {
        std::string names;
        for (std::size_t i = services.size(); i-- > first;)
            names += tag(services[i].first, "Web");
        install_connections(handle("One", names) + profile("One", "Web"));
        EXPECT_EQ(profiles("svc_category_id, default_internet_con"), (SqliteRows{{services[first].second, "1"}}));
    }
}

TEST_F(ConnectionStore, FirstProfileOfAServiceIsItsDefault) {
    add_network("One", "26201");
    add_network("Two", "26202");
    install_connections(handle("One", kWeb) + handle("Two", kWeb) + profile("One", "Other") + profile("One", "Web") +
                        profile("One", "Web") + profile("Two", "Web"));
    EXPECT_EQ(profiles(kService),
              (SqliteRows{{"Other", "1", "0"}, {"Web", "1", "1"}, {"Web", "1", "0"}, {"Web", "1", "1"}}));
}

TEST_F(ConnectionStore, UsersDefaultIsKept) {
    run("insert into network_info values(7, 'One', '26201')");
    put_profile(1, "Mine", 7, true);
    add_network("One", "26201");
    install_connections(handle("One", kWeb + tag("ProfMMS", "Pictures")) + profile("One", "Web") +
                        profile("One", "Pictures"));
    EXPECT_EQ(profiles(kService), (SqliteRows{{"Mine", "1", "1"}, {"Web", "1", "0"}, {"Pictures", "2", "1"}}));
}

TEST_F(ConnectionStore, DefaultsBelowOneAndNullsAreNone) {
    run("insert into network_info values(7, 'One', '26201')");
    put_profile(1, "Mine", 7, true);
    add_network("One", "26201");
    for (const char *held : {"0", "-3", "null"}) {
        run("update pdp_profile set default_internet_con=" + std::string{held} + " where profile_id=1");
        install_connections(handle("One", kWeb) + profile("One", "Web"));
        EXPECT_EQ(rows("select default_internet_con from pdp_profile where profile_name='Web'"), (SqliteRows{{"1"}}))
            << held;
    }
}

TEST_F(ConnectionStore, SimsProfilesAreDefaultsAtOnce) {
    use_sim_profiles();
    set_operator("One", "26201");
    install_connections(handle("One", kWeb) + profile("One", "Web") + profile("One", "Web") + profile("One", "Other"),
                        ZEL_SVC_PARSE_MODE_OPERATOR);
    EXPECT_EQ(profiles(kService), (SqliteRows{{"Web", "1", "1"}, {"Web", "1", "1"}, {"Other", "1", "0"}}));
}

TEST_F(ConnectionStore, NamelessProfileIsNobodysDefault) {
    add_network("One", "26201");
    install_connections(handle("One", kWeb) + tag("Profile", tag("NetworkName", "One") + tag("APN", "web")));
    EXPECT_EQ(profiles(kService), (SqliteRows{{"", "1", "0"}}));
}

TEST_F(ConnectionStore, HandlesServeTheirOwnNetworkOnly) {
    add_network("One", "26201");
    add_network("Two", "26202");
    install_connections(handle("Two", kWeb) + handle("default", tag("ProfMMS", "Web")) +
                        handle("", tag("ProfIMS", "Web")) + profile("default", "Web"));
    EXPECT_EQ(profiles(kService), (SqliteRows{{"Web", "1", "0"}, {"Web", "1", "1"}}));
}

TEST_F(ConnectionStore, HandleWithoutANameServesTheNetworkWithoutAName) {
    add_network("", "26201");
    add_network("default", "26202");
    install_connections(tag("ProfileHandle", tag("ProfMMS", "Web")) + handle("default", tag("ProfIMS", "Web")) +
                        profile("default", "Web"));
    EXPECT_EQ(profiles(kService), (SqliteRows{{"Web", "2", "1"}, {"Web", "0", "1"}}));
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
