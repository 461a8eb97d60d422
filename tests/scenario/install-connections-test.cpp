// Data connections through the entry points, looked at with the sqlite3 program and in the recorded files.

#include "service-phone.h"
#include "support/lines.h"

#include <array>
#include <cstdio>
#include <gmock/gmock.h>
#include <map>
#include <memory>
#include <sstream>

namespace {

using ::testing::ElementsAre;
using ::testing::IsEmpty;
using ::testing::Not;

constexpr const char *kFirstSim = "/opt/dbspace/.dnet.db";
constexpr const char *kSecondSim = "/opt/dbspace/.dnet2.db";

// Each column of a row is a key of its mirror.
constexpr const char *kColumns = "profile_id, profile_name, apn, auth_type, auth_id, auth_pwd, pdp_protocol, "
                                 "roam_pdp_protocol, proxy_ip_addr, home_url, linger_time, traffic_class, "
                                 "is_static_ip_addr, ip_addr, is_static_dns_addr, dns_addr1, dns_addr2, "
                                 "network_info_id, svc_category_id, hidden, editable, default_internet_con, "
                                 "user_defined, is_roaming_apn, profile_enable";

// The entries of a recorded file, "section:key" to the value without its quotes.
std::map<std::string, std::string> entries_of(const std::string &file) {
    std::map<std::string, std::string> entries;
    std::string section;
    std::istringstream lines{file};
    for (std::string line; std::getline(lines, line);) {
        if (line.starts_with("[")) section = line.substr(1, line.find(']') - 1) + ":";
        const std::size_t equals = line.find('=');
        if (equals == std::string::npos) continue;
        std::string value = line.substr(line.find_first_not_of(' ', equals + 1) == std::string::npos
                                            ? line.size()
                                            : line.find_first_not_of(' ', equals + 1));
        if (value.size() > 1 && (value[0] == '"' || value[0] == '\'')) value = value.substr(1, value.size() - 2);
        entries[section + line.substr(0, line.find(' '))] = value;
    }
    return entries;
}

class InstallConnections : public zel_test::ServicePhone {
  protected:
    // What the sqlite3 program prints for a statement, a line a row, columns between bars.
    std::vector<std::string> sqlite(const std::string &database, const std::string &sql) {
        write("/tmp/statement.sql", sql + ";\n");
        const std::string command = "sqlite3 -batch '" + root() + database + "' < '" + root() + "/tmp/statement.sql'";
        const std::unique_ptr<FILE, int (*)(FILE *)> pipe{popen(command.c_str(), "r"), pclose};
        std::string text;
        std::array<char, 4096> chunk{};
        while (const std::size_t got = fread(chunk.data(), 1, chunk.size(), pipe.get()))
            text.append(chunk.data(), got);
        return zel_test::lines_of(text);
    }

    void write_connections(const std::string &auto_profile = "off") {
        write_customer("BTU", R"(<GeneralInfo><SalesCode>BTU</SalesCode>
<NetworkInfo><MCCMNC>00101</MCCMNC><NetworkName>It's One</NetworkName></NetworkInfo>
<NetworkInfo><MCCMNC>00102</MCCMNC><NetworkName>Two</NetworkName></NetworkInfo></GeneralInfo>
<Settings><Main><Network><AutoProfile>)" +
                                  auto_profile +
                                  R"(</AutoProfile></Network></Main>
<Connections>
<ProfileHandle><NetworkName>It's One</NetworkName><ProfBrowser>Web's</ProfBrowser><ProfMMS>MMS</ProfMMS></ProfileHandle>
<Profile><NetworkName>It's One</NetworkName><ProfileName>Web's</ProfileName><PSparam><APN>"web"</APN></PSparam>
<Proxy><ServAddr>10.0.0.1</ServAddr><Port>80</Port></Proxy></Profile>
<Profile><NetworkName>It's One</NetworkName><ProfileName>MMS</ProfileName><Auth>secure</Auth></Profile>
<Profile><NetworkName>default</NetworkName><ProfileName>Mail</ProfileName></Profile>
</Connections></Settings>)");
    }

    // The mirror of every row is what the database holds.
    void expect_mirrored(const std::string &database, const std::string &group) {
        auto mirror = entries_of(read(data_path(group)));
        std::vector<std::string> rows;
        for (int number = 1; number <= std::stoi("0" + mirror["connection:count"]); ++number) {
            std::string row;
            std::istringstream columns{kColumns};
            for (std::string column; std::getline(columns >> std::ws, column, ',');)
                row += (row.empty() ? "" : "|") + mirror["connection:" + column + "_" + std::to_string(number)];
            rows.push_back(row);
        }
        const std::string select =
            "select " + std::string{kColumns} + " from pdp_profile where user_defined=0 order by 1";
        EXPECT_THAT(rows, Not(IsEmpty()));
        EXPECT_EQ(rows, sqlite(database, select));
    }
};

struct InstallConnectionsOfTwoSims : InstallConnections {
    InstallConnectionsOfTwoSims() { create_arguments["sims"] = 2; }
};

constexpr const char *kShort =
    "select profile_id, profile_name, apn, auth_type, proxy_ip_addr, mccmnc, svc_category_id, "
    "default_internet_con, user_defined from pdp_profile natural join network_info order by 1";

} // namespace

TEST_F(InstallConnections, AreRowsOfTheFirstDatabaseAndTheirMirror) {
    write_connections();
    zel_svc_config_install_customer("BTU", ZEL_SVC_INSTALL_CONFIG_MODE);
    EXPECT_THAT(sqlite(kFirstSim, kShort),
                ElementsAre("1|Web's|\"web\"|0|10.0.0.1:80|00101|1|1|0", "2|MMS||2||00101|2|1|0",
                            "3|Mail||0||00101|1|0|0", "4|Mail||0||00102|1|0|0"));
    EXPECT_THAT(sqlite(kSecondSim, kShort), IsEmpty());
    EXPECT_THAT(sqlite(kFirstSim, "pragma integrity_check"), ElementsAre("ok"));
    expect_mirrored(kFirstSim, "connection");
    EXPECT_FALSE(exists(data_path("connection-2")));
}

TEST_F(InstallConnections, AreReplacedByTheUpgradeButNotTheUsers) {
    write_connections();
    zel_svc_config_install_customer("BTU", ZEL_SVC_INSTALL_CONFIG_MODE);
    sqlite(kFirstSim, "insert into pdp_profile(profile_id, profile_name, apn, auth_type, proxy_ip_addr, "
                      "network_info_id, svc_category_id, default_internet_con, user_defined) "
                      "values(10, 'Mine', '', 0, '', 1, 2, 1, 1)");
    zel_svc_config_install_customer("BTU", ZEL_SVC_INSTALL_NORMAL_BOOTING);
    EXPECT_THAT(sqlite(kFirstSim, kShort),
                ElementsAre("10|Mine||0||00101|2|1|1", "11|Web's|\"web\"|0|10.0.0.1:80|00101|1|1|0",
                            "12|MMS||2||00101|2|0|0", "13|Mail||0||00101|1|0|0", "14|Mail||0||00102|1|0|0"));
    expect_mirrored(kFirstSim, "connection");
}

TEST_F(InstallConnections, OfTheSimAreLeftToIt) {
    write_connections("on");
    for (const int kind : {ZEL_SVC_INSTALL_CONFIG_MODE, ZEL_SVC_INSTALL_NORMAL_BOOTING}) {
        zel_svc_config_install_customer("BTU", kind);
        EXPECT_THAT(sqlite(kFirstSim, kShort), IsEmpty());
        EXPECT_THAT(sqlite(kFirstSim, "select count(*) from network_info"), ElementsAre("2"));
    }
}

TEST_F(InstallConnectionsOfTwoSims, AreRowsOfBothDatabasesWithAMirrorEach) {
    write_connections();
    zel_svc_config_install_customer("BTU", ZEL_SVC_INSTALL_CONFIG_MODE);
    for (const auto &[database, group] : {std::pair{kFirstSim, "connection"}, {kSecondSim, "connection-2"}}) {
        EXPECT_THAT(sqlite(database, kShort),
                    ElementsAre("1|Web's|\"web\"|0|10.0.0.1:80|00101|1|1|0", "2|MMS||2||00101|2|1|0",
                                "3|Mail||0||00101|1|0|0", "4|Mail||0||00102|1|0|0"));
        expect_mirrored(database, group);
    }
    zel_svc_config_install_customer("BTU", ZEL_SVC_INSTALL_NORMAL_BOOTING);
    for (const auto &[database, group] : {std::pair{kFirstSim, "connection"}, {kSecondSim, "connection-2"}}) {
        EXPECT_THAT(sqlite(database, kShort),
                    ElementsAre("5|Web's|\"web\"|0|10.0.0.1:80|00101|1|1|0", "6|MMS||2||00101|2|1|0",
                                "7|Mail||0||00101|1|0|0", "8|Mail||0||00102|1|0|0"));
        expect_mirrored(database, group);
    }
}

TEST_F(InstallConnections, OfAnotherCustomerStandBesideThoseOfTheFirst) {
    write_connections();
    zel_svc_config_install_customer("BTU", ZEL_SVC_INSTALL_CONFIG_MODE);
    write_customer("XEF", "<GeneralInfo><NetworkInfo><MCCMNC>00102</MCCMNC><NetworkName>New</NetworkName></NetworkInfo>"
                          "</GeneralInfo><Settings><Connections><Profile><NetworkName>New</NetworkName>"
                          "<ProfileName>Only</ProfileName></Profile></Connections></Settings>");
    zel_svc_config_install_customer("XEF", ZEL_SVC_INSTALL_CONFIG_MODE);
    EXPECT_THAT(sqlite(kFirstSim, "select profile_id, profile_name, network_name from pdp_profile natural join "
                                  "network_info order by 1"),
                ElementsAre("1|Web's|It's One", "2|MMS|It's One", "3|Mail|It's One", "4|Only|New"));
}
