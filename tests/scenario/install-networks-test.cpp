// Which network database a run's parses reach.

#include "service-phone.h"

#include <gmock/gmock.h>
#include <sqlite3.h>

namespace {

using ::testing::ElementsAre;
using ::testing::IsEmpty;

class InstallNetworks : public zel_test::ServicePhone {
  protected:
    // "name/MCC+MNC" of every network row.
    std::vector<std::string> networks(const std::string &database_path) {
        std::vector<std::string> rows;
        sqlite3 *database = nullptr;
        EXPECT_EQ(sqlite3_open_v2((root() + database_path).c_str(), &database, SQLITE_OPEN_READONLY, nullptr),
                  SQLITE_OK);
        const auto add = [](void *list, int, char **values, char **) {
            static_cast<std::vector<std::string> *>(list)->push_back(std::string(values[0]) + "/" + values[1]);
            return 0;
        };
        EXPECT_EQ(
            sqlite3_exec(database, "SELECT network_name, mccmnc FROM network_info ORDER BY 1", add, &rows, nullptr),
            SQLITE_OK);
        sqlite3_close(database);
        return rows;
    }

    void write_networks() {
        write_customer("BTU", "<GeneralInfo><SalesCode>BTU</SalesCode>"
                              "<NetworkInfo><MCCMNC>00101</MCCMNC><NetworkName>First</NetworkName></NetworkInfo>"
                              "<NetworkInfo><MCCMNC>00102</MCCMNC><NetworkName>Second</NetworkName></NetworkInfo>"
                              "</GeneralInfo>"
                              "<Settings><Main><Network><AutoProfile>on</AutoProfile></Network></Main></Settings>");
    }

    static constexpr const char *kFirstSim = "/opt/dbspace/.dnet.db";
    static constexpr const char *kSecondSim = "/opt/dbspace/.dnet2.db";
};

struct InstallNetworksOfTwoSims : InstallNetworks {
    InstallNetworksOfTwoSims() { create_arguments["sims"] = 2; }
};

} // namespace

TEST_F(InstallNetworks, AreResolvedByTheFullInstall) {
    write_networks();
    zel_svc_config_install_customer("BTU", ZEL_SVC_INSTALL_CONFIG_MODE);
    EXPECT_THAT(networks(kFirstSim), ElementsAre("First/00101", "Second/00102"));
}

TEST_F(InstallNetworks, AreResolvedByAnUpgradeWhateverTheFlags) {
    write_networks();
    zel_svc_config_install_customer("BTU", ZEL_SVC_INSTALL_NORMAL_BOOTING);
    EXPECT_THAT(networks(kFirstSim), ElementsAre("First/00101", "Second/00102"));
}

TEST_F(InstallNetworks, AreNotReadInFotaMode) {
    write_networks();
    zel_svc_config_install_customer("BTU", ZEL_SVC_INSTALL_FOTA_MODE);
    EXPECT_THAT(networks(kFirstSim), IsEmpty());
}

TEST_F(InstallNetworksOfTwoSims, AreResolvedForTheFirstOnly) {
    write_networks();
    zel_svc_config_install_customer("BTU", ZEL_SVC_INSTALL_CONFIG_MODE);
    EXPECT_THAT(networks(kFirstSim), ElementsAre("First/00101", "Second/00102"));
    EXPECT_THAT(networks(kSecondSim), IsEmpty());
}

TEST_F(InstallNetworksOfTwoSims, AreTheFirstSimsAgainInTheNextRun) {
    zel_svc_config_install_customer("BTU", ZEL_SVC_INSTALL_CONFIG_MODE);
    write_networks();
    zel_svc_config_install_customer("BTU", ZEL_SVC_INSTALL_NORMAL_BOOTING);
    EXPECT_THAT(networks(kFirstSim), ElementsAre("First/00101", "Second/00102"));
    EXPECT_THAT(networks(kSecondSim), IsEmpty());
}

class AutoFlags : public InstallNetworks {};

TEST_F(AutoFlags, AreThoseOfTheFileBeingInstalled) {
    write_networks();
    zel_svc_config_install_customer("BTU", ZEL_SVC_INSTALL_CONFIG_MODE);
    EXPECT_EQ(get_int("db/private/zel/sim_auto_enable"), 1);
    write_customer("XEF", "<Settings><Main><Network><AutoProfile>off</AutoProfile></Network></Main></Settings>");
    mark_group("connection");
    zel_svc_config_install_customer("XEF", ZEL_SVC_INSTALL_NORMAL_BOOTING);
    EXPECT_FALSE(group_is_marked("connection"));
}
