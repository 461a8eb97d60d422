// Which service each profile gets from the handles, and which one becomes the phone's default.

#include "connections.h"

#include <gmock/gmock.h>

namespace zel_test {

namespace {

const std::string kWeb = tag("ProfBrowser", "Web");
constexpr const char *kService = "profile_name, svc_category_id, default_internet_con";

} // namespace

class ConnectionService : public ConnectionPhone {
  protected:
    // A profile of network 7 that the user made the internet's default.
    void put_users_default() const {
        run("insert into network_info values(7, 'One', '26201')");
        run("insert into pdp_profile(profile_id, profile_name, network_info_id, svc_category_id, "
            "default_internet_con, user_defined) values(1, 'Mine', 7, 1, 1, 1)");
    }
};

TEST_F(ConnectionService, HandlesGiveEachProfileItsService) {
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

TEST_F(ConnectionService, FirstServiceOfAHandleDecides) {
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

TEST_F(ConnectionService, FirstProfileOfAServiceIsItsDefault) {
    add_network("One", "26201");
    add_network("Two", "26202");
    install_connections(handle("One", kWeb) + handle("Two", kWeb) + profile("One", "Other") + profile("One", "Web") +
                        profile("One", "Web") + profile("Two", "Web"));
    EXPECT_EQ(profiles(kService),
              (SqliteRows{{"Other", "1", "0"}, {"Web", "1", "1"}, {"Web", "1", "0"}, {"Web", "1", "1"}}));
}

TEST_F(ConnectionService, UsersDefaultIsKept) {
    put_users_default();
    add_network("One", "26201");
    install_connections(handle("One", kWeb + tag("ProfMMS", "Pictures")) + profile("One", "Web") +
                        profile("One", "Pictures"));
    EXPECT_EQ(profiles(kService), (SqliteRows{{"Mine", "1", "1"}, {"Web", "1", "0"}, {"Pictures", "2", "1"}}));
}

// The users' default counts also under another network of the MCC+MNC.
TEST_F(ConnectionService, DefaultOfAnotherNetworkOfTheMccMncIsOne) {
    put_users_default();
    run("insert into network_info values(9, 'Too', '26201'); update pdp_profile set network_info_id=9");
    add_network("One", "26201");
    install_connections(handle("One", kWeb) + profile("One", "Web"));
    EXPECT_EQ(profiles("profile_name, network_info_id, default_internet_con"),
              (SqliteRows{{"Mine", "9", "1"}, {"Web", "7", "0"}}));
}

TEST_F(ConnectionService, DefaultsBelowOneAndNullsAreNone) {
    put_users_default();
    add_network("One", "26201");
    for (const char *held : {"0", "-3", "null"}) {
        run("update pdp_profile set default_internet_con=" + std::string{held} + " where profile_id=1");
        install_connections(handle("One", kWeb) + profile("One", "Web"));
        EXPECT_EQ(rows("select default_internet_con from pdp_profile where profile_name='Web'"), (SqliteRows{{"1"}}))
            << held;
    }
}

TEST_F(ConnectionService, SimsProfilesAreDefaultsAtOnce) {
    set_auto_flag(ZEL_SVC_AUTO_PROFILE, 1);
    set_operator("One", "26201");
    install_connections(handle("One", kWeb) + profile("One", "Web") + profile("One", "Web") + profile("One", "Other"),
                        ZEL_SVC_PARSE_MODE_OPERATOR);
    EXPECT_EQ(profiles(kService), (SqliteRows{{"Web", "1", "1"}, {"Web", "1", "1"}, {"Other", "1", "0"}}));
}

TEST_F(ConnectionService, NamelessProfileIsNobodysDefault) {
    add_network("One", "26201");
    install_connections(handle("One", kWeb) + tag("Profile", tag("NetworkName", "One") + tag("APN", "web")));
    EXPECT_EQ(profiles(kService), (SqliteRows{{"", "1", "0"}}));
}

TEST_F(ConnectionService, HandlesServeTheirOwnNetworkOnly) {
    add_network("One", "26201");
    add_network("Two", "26202");
    install_connections(handle("Two", kWeb) + handle("default", tag("ProfMMS", "Web")) +
                        handle("", tag("ProfIMS", "Web")) + profile("default", "Web"));
    EXPECT_EQ(profiles(kService), (SqliteRows{{"Web", "1", "0"}, {"Web", "1", "1"}}));
}

TEST_F(ConnectionService, HandleWithoutANameServesTheNetworkWithoutAName) {
    add_network("", "26201");
    add_network("default", "26202");
    install_connections(tag("ProfileHandle", tag("ProfMMS", "Web")) + handle("default", tag("ProfIMS", "Web")) +
                        profile("default", "Web"));
    EXPECT_EQ(profiles(kService), (SqliteRows{{"Web", "2", "1"}, {"Web", "0", "1"}}));
}

} // namespace zel_test
