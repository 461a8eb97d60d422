// What each value of a profile becomes in the row of the network database and in its mirror.

#include "connections.h"

#include <gmock/gmock.h>
#include <map>

namespace zel_test {

using testing::IsEmpty;

namespace {

// The columns in the order in which they are written, and what a profile that says nothing gets in them.
struct PlainColumn {
    const char *name;
    const char *value;
    const char *mirror;
};
const std::vector<PlainColumn> kPlainRow{
    {"profile_id", "1", "1"},
    {"profile_name", "", ""},
    {"apn", "", ""},
    {"auth_type", "0", "0"},
    {"auth_id", "", ""},
    {"auth_pwd", "", ""},
    {"pdp_protocol", "2", "2"},
    {"roam_pdp_protocol", "2", "2"},
    {"proxy_ip_addr", "", ""},
    {"home_url", "", ""},
    {"linger_time", "300", "300"},
    {"traffic_class", "0", "0"},
    {"is_static_ip_addr", "0", "0"},
    {"ip_addr", "NULL", ""},
    {"is_static_dns_addr", "0", "0"},
    {"dns_addr1", "NULL", ""},
    {"dns_addr2", "NULL", ""},
    {"network_info_id", "1", "1"},
    {"svc_category_id", "1", "1"},
    {"hidden", "0", "0"},
    {"editable", "1", "1"},
    {"default_internet_con", "0", "0"},
    {"user_defined", "0", "0"},
    {"is_roaming_apn", "0", "0"},
    {"profile_enable", "1", "1"},
};

using Columns = std::map<std::string, std::string>;

struct ExpectedColumns {
    std::string children;
    Columns row; // what differs from the plain row
};

std::string static_ip(const std::string &flag, const std::string &address) {
    return tag("StaticIP", tag("EnableFlag", flag) + tag("IPAddr", address));
}
std::string dns(const std::string &flag, const std::string &addresses) {
    return tag("DNS", tag("EnableFlag", flag) + addresses);
}
std::string proxy(const std::string &address, const std::string &port) {
    return tag("Proxy", tag("ServAddr", address) + tag("Port", port));
}
std::string address(const std::string &text) { return tag("IPAddr", text); }

const std::vector<ExpectedColumns> kExpected{
    {"", {}},
    {tag("ProfileName", "Web"), {{"profile_name", "Web"}}},
    {tag("APN", "internet.one"), {{"apn", "internet.one"}}},
    {tag("PSparam", tag("APN", "in.ps")), {{"apn", "in.ps"}}},
    {tag("Auth", "none"), {}},
    {tag("Auth", "normal"), {{"auth_type", "1"}}},
    {tag("Auth", "secure"), {{"auth_type", "2"}}},
    {tag("Auth", "Secure"), {}},
    {tag("Auth", "secure "), {}},
    {tag("Auth", "2"), {}},
    {tag("PSparam", tag("UserId", "me")), {{"auth_id", "me"}}},
    {tag("PSparam", tag("Password", "secret")), {{"auth_pwd", "secret"}}},
    {tag("UserId", "outside"), {}},
    {tag("Password", "outside"), {}},
    {tag("IpVersion", "ipv4"), {}},
    {tag("IpVersion", "ipv6"), {{"pdp_protocol", "5"}}},
    {tag("IpVersion", "ipv4v6"), {{"pdp_protocol", "6"}}},
    {tag("IpVersion", "IPV6"), {}},
    {tag("IpVersion", "ipv6 "), {}},
    {tag("IpVersion", "5"), {}},
    {tag("RoamingIpVersion", "ipv4"), {}},
    {tag("RoamingIpVersion", "ipv6"), {{"roam_pdp_protocol", "5"}}},
    {tag("RoamingIpVersion", "ipv4v6"), {{"roam_pdp_protocol", "6"}}},
    {tag("RoamingIpVersion", "IPv6"), {}},
    {proxy("10.0.0.1", "8080"), {{"proxy_ip_addr", "10.0.0.1:8080"}}},
    {proxy("10.0.0.1", "0"), {{"proxy_ip_addr", "10.0.0.1"}}},
    {proxy("10.0.0.1", ""), {{"proxy_ip_addr", "10.0.0.1"}}},
    {proxy("10.0.0.1", "00"), {{"proxy_ip_addr", "10.0.0.1:00"}}},
    {proxy("proxy.one", "http"), {{"proxy_ip_addr", "proxy.one:http"}}},
    {proxy("0.0.0.0", "8080"), {}},
    {proxy("0.0.0.0", ""), {}},
    {proxy("", "8080"), {}},
    {proxy("0.0.0.00", "1"), {{"proxy_ip_addr", "0.0.0.00:1"}}},
    {tag("URL", "http://one.example"), {{"home_url", "http://one.example"}}},
    {tag("LingerTime", "5") + tag("TrafficClass", "4") + tag("Protocol", "http") + tag("SecureConn", "on"), {}},
    {tag("PSparam", tag("TrafficClass", "4")), {}},
    {tag("Gateway", tag("ServAddr", "10.0.0.9")), {}},
    {static_ip("on", "10.1.1.1"), {{"is_static_ip_addr", "1"}, {"ip_addr", "10.1.1.1"}, {"is_static_dns_addr", "1"}}},
    {static_ip("on", ""), {{"is_static_ip_addr", "1"}, {"ip_addr", ""}, {"is_static_dns_addr", "1"}}},
    {static_ip("off", "10.1.1.1"), {}},
    {static_ip("", "10.1.1.1"), {}},
    {static_ip("On", "10.1.1.1"), {}},
    {dns("on", address("8.8.8.8")), {{"is_static_dns_addr", "1"}, {"dns_addr1", "8.8.8.8"}, {"dns_addr2", ""}}},
    {dns("on", address("8.8.8.8") + address("9.9.9.9")),
     {{"is_static_dns_addr", "1"}, {"dns_addr1", "8.8.8.8"}, {"dns_addr2", "9.9.9.9"}}},
    {dns("on", address("8.8.8.8") + address("9.9.9.9") + address("7.7.7.7")),
     {{"is_static_dns_addr", "1"}, {"dns_addr1", "8.8.8.8"}, {"dns_addr2", "9.9.9.9"}}},
    {dns("on", address("") + address("9.9.9.9")),
     {{"is_static_dns_addr", "1"}, {"dns_addr1", ""}, {"dns_addr2", "9.9.9.9"}}},
    {dns("off", address("8.8.8.8")), {}},
    {dns("", address("8.8.8.8")), {}},
    {dns("ON", address("8.8.8.8")), {}},
    {static_ip("on", "10.1.1.1") + dns("", address("8.8.8.8")),
     {{"is_static_ip_addr", "1"}, {"ip_addr", "10.1.1.1"}, {"is_static_dns_addr", "1"}}},
    {static_ip("on", "10.1.1.1") + dns("off", address("8.8.8.8")),
     {{"is_static_ip_addr", "1"}, {"ip_addr", "10.1.1.1"}}},
    {static_ip("on", "10.1.1.1") + dns("yes", ""),
     {{"is_static_ip_addr", "1"}, {"ip_addr", "10.1.1.1"}, {"is_static_dns_addr", "1"}}},
    {tag("HiddenStatus", "hidden"), {{"hidden", "1"}}},
    {tag("HiddenStatus", "on"), {{"hidden", "1"}}},
    {tag("HiddenStatus", "show"), {}},
    {tag("HiddenStatus", "off"), {}},
    {tag("HiddenStatus", "Hidden"), {}},
    {tag("Editable", "no"), {{"editable", "0"}}},
    {tag("Editable", "yes"), {}},
    {tag("Editable", "No"), {}},
    {tag("Editable", "no "), {}},
    {tag("RoamingEnableStatus", "enable"), {{"is_roaming_apn", "1"}}},
    {tag("RoamingEnableStatus", "disable"), {}},
    {tag("RoamingEnableStatus", "on"), {}},
    {tag("RoamingEnableStatus", "Enable"), {}},
    {tag("EnableStatus", "disable"), {{"profile_enable", "0"}}},
    {tag("EnableStatus", "enable"), {}},
    {tag("EnableStatus", "Disable"), {}},
    {tag("EnableStatus", "off"), {}},
};

Columns plain_row() {
    Columns row;
    for (const PlainColumn &column : kPlainRow)
        row[column.name] = column.value;
    return row;
}

} // namespace

class ConnectionRow : public ConnectionPhone {
  protected:
    // The columns that are written, of the one row there is.
    [[nodiscard]] Columns row() const {
        std::string names;
        for (const PlainColumn &column : kPlainRow)
            names += (names.empty() ? "" : ", ") + std::string{column.name};
        const SqliteRows found = profiles(names);
        Columns result;
        if (found.size() != 1) return result;
        for (std::size_t i = 0; i < kPlainRow.size(); ++i)
            result[kPlainRow[i].name] = found[0][i];
        return result;
    }
    [[nodiscard]] Columns mirror(int number) const {
        Columns result;
        for (const PlainColumn &column : kPlainRow)
            result[column.name] = mirrored(std::string{column.name} + "_" + std::to_string(number)).value_or("absent");
        return result;
    }
};

TEST_F(ConnectionRow, EveryTextBecomesItsColumnAndNoOther) {
    add_network("One", "26201");
    for (const ExpectedColumns &expected : kExpected) {
        Columns whole = plain_row();
        for (const auto &[name, value] : expected.row)
            whole[name] = value;
        install_connections(tag("Profile", tag("NetworkName", "One") + expected.children));
        EXPECT_EQ(row(), whole) << expected.children;
    }
}

// A null is an empty text there.
TEST_F(ConnectionRow, MirrorHasEveryColumnAsItWasWritten) {
    add_network("One", "26201");
    int number = 0;
    for (const ExpectedColumns &expected : kExpected) {
        Columns whole = plain_row();
        for (const auto &[name, value] : expected.row)
            whole[name] = value;
        for (const PlainColumn &column : kPlainRow)
            if (whole[column.name] == "NULL") whole[column.name] = column.mirror;
        install_connections(tag("Profile", tag("NetworkName", "One") + expected.children));
        EXPECT_EQ(mirror(++number), whole) << expected.children;
    }
    EXPECT_EQ(mirrored("count"), std::to_string(kExpected.size()));
}

TEST_F(ConnectionRow, NumbersAreMirroredAsNumbersAndTextsInQuotes) {
    add_network("One", "26201");
    install_connections(profile("One", "Web", tag("APN", "1234")));
    EXPECT_STREQ(zel_svc_data_get_str(ZEL_SVC_DATA_CONNECTION, "connection", "linger_time_1"), "300");
    EXPECT_STREQ(zel_svc_data_get_str(ZEL_SVC_DATA_CONNECTION, "connection", "apn_1"), "\"1234\"");
    EXPECT_STREQ(zel_svc_data_get_str(ZEL_SVC_DATA_CONNECTION, "connection", "ip_addr_1"), "");
}

TEST_F(ConnectionRow, PlatformsOwnColumnIsLeftToIt) {
    add_network("One", "26201");
    install_connections(profile("One", "Web"));
    EXPECT_EQ(profiles("platform_flag"), (SqliteRows{{"0"}}));
}

TEST_F(ConnectionRow, DnsAddressesAreCountedWithinTheirProfile) {
    add_network("One", "26201");
    const std::string both = dns("on", address("8.8.8.8") + address("9.9.9.9") + address("7.7.7.7"));
    install_connections(profile("One", "A", both) + profile("One", "B", both) +
                        profile("One", "C", dns("on", address("1.1.1.1"))));
    EXPECT_EQ(profiles("dns_addr1, dns_addr2"),
              (SqliteRows{{"8.8.8.8", "9.9.9.9"}, {"8.8.8.8", "9.9.9.9"}, {"1.1.1.1", ""}}));
}

TEST_F(ConnectionRow, TextsAreCutToTheirFields) {
    add_network("One", "26201");
    const std::string text(250, 'x');
    install_connections(profile("One", text,
                                tag("APN", text) + tag("PSparam", tag("UserId", text) + tag("Password", text)) +
                                    tag("URL", text) + proxy(text, "123456789012") + static_ip("on", text) +
                                    dns("on", address(text) + address(text))));
    const std::string cut(199, 'x');
    EXPECT_EQ(profiles("profile_name, apn, auth_id, auth_pwd, home_url, proxy_ip_addr, ip_addr, dns_addr1, dns_addr2"),
              (SqliteRows{{cut, cut, cut, cut, cut, cut, cut, cut, cut}}));
}

TEST_F(ConnectionRow, PortIsCutToNineDigitsAndTheProxyToItsWidth) {
    add_network("One", "26201");
    install_connections(profile("One", "A", proxy("p", "1234567890")) +
                        profile("One", "B", proxy(std::string(195, 'p'), "8080")) +
                        profile("One", "C", proxy(std::string(196, 'p') + "\xC3\xA9", "8080")));
    EXPECT_EQ(profiles("proxy_ip_addr"),
              (SqliteRows{{"p:123456789"}, {std::string(195, 'p') + ":808"}, {std::string(196, 'p') + "\xC3\xA9:"}}));
}

TEST_F(ConnectionRow, WordsAreCutBeforeTheyAreRead) {
    add_network("One", "26201");
    install_connections(profile("One", "A", tag("Editable", "no" + std::string(20, ' '))));
    EXPECT_EQ(profiles("editable"), (SqliteRows{{"1"}}));
}

TEST_F(ConnectionRow, LastOfTwoValuesCounts) {
    add_network("One", "26201");
    install_connections(profile("One", "A", tag("APN", "long.first") + tag("APN", "b")));
    EXPECT_EQ(profiles("apn"), (SqliteRows{{"b"}}));
}

TEST_F(ConnectionRow, NoTextChangesAStatement) {
    const std::string hostile = "it's'); drop table pdp_profile; -- \"?1\" %s\t\xC3\xA9";
    add_network(hostile, "26'201");
    install_connections(profile(hostile, hostile,
                                tag("APN", hostile) + tag("PSparam", tag("UserId", hostile)) + tag("URL", hostile) +
                                    proxy(hostile, "'1") + static_ip("on", hostile) + dns("on", address(hostile))));
    const std::string network = hostile.substr(0, 39);
    EXPECT_EQ(networks(), (SqliteRows{{"1", network, "26'201"}}));
    EXPECT_EQ(profiles("profile_name, apn, auth_id, home_url, proxy_ip_addr, ip_addr, dns_addr1"),
              (SqliteRows{{hostile, hostile, hostile, hostile, hostile + ":'1", hostile, hostile}}));
    install_connections(profile(hostile, "Again"));
    EXPECT_EQ(profiles("profile_name"), (SqliteRows{{"Again"}}));
}

} // namespace zel_test
