// Every line of a profile's verification, and what passes.

#include "connections.h"

#include <gmock/gmock.h>

namespace zel_test {

using testing::Contains;
using testing::ElementsAre;
using testing::IsEmpty;

namespace {

std::string proxy(const std::string &address, const std::string &port) {
    return tag("Proxy", tag("ServAddr", address) + tag("Port", port));
}

// What the phone has in one column, what the spec says, and the line.
struct ExpectedLine {
    const char *update; // of the row
    std::string spec;
    ResultLine line;
};

const std::vector<ExpectedLine> kLines{
    {"profile_name='Web'", tag("ProfileName", "Web"), passed("[Profile1/ProfileName] Spec='Web',Phone='Web'")},
    {"profile_name='web'", tag("ProfileName", "Web"), failed("[Profile1/ProfileName] Spec='Web',Phone='web'")},
    {"profile_name=null", "", passed("[Profile1/ProfileName] Spec='',Phone=''")},
    {"profile_name='Web'", "", failed("[Profile1/ProfileName] Spec='',Phone='Web'")},
    {"editable=1", tag("Editable", "yes"), passed("[Profile1/Editable] Spec='yes',Phone='yes'")},
    {"editable=0", tag("Editable", "yes"), failed("[Profile1/Editable] Spec='yes',Phone='no'")},
    {"editable=0", tag("Editable", "no"), passed("[Profile1/Editable] Spec='no',Phone='no'")},
    {"editable=2", tag("Editable", "no"), passed("[Profile1/Editable] Spec='no',Phone='no'")},
    {"editable=1", tag("Editable", "Yes"), failed("[Profile1/Editable] Spec='Yes',Phone='yes'")},
    {"profile_enable=1", tag("EnableStatus", "enable"), passed("[Profile1/EnableStatus] Spec='enable',Phone='enable'")},
    {"profile_enable=7", tag("EnableStatus", "enable"), passed("[Profile1/EnableStatus] Spec='enable',Phone='enable'")},
    {"profile_enable=0", tag("EnableStatus", "enable"),
     failed("[Profile1/EnableStatus] Spec='enable',Phone='disable'")},
    {"profile_enable=1", tag("EnableStatus", "disable"),
     failed("[Profile1/EnableStatus] Spec='disable',Phone='enable'")},
    {"profile_enable=0", tag("EnableStatus", "disable"),
     passed("[Profile1/EnableStatus] Spec='disable',Phone='disable'")},
    {"hidden=1", tag("HiddenStatus", "hidden"), passed("[Profile1/HiddenStatus] Spec='hidden',Phone='hidden'")},
    {"hidden=0", tag("HiddenStatus", "hidden"), failed("[Profile1/HiddenStatus] Spec='hidden',Phone='show'")},
    {"hidden=0", tag("HiddenStatus", "show"), passed("[Profile1/HiddenStatus] Spec='show',Phone='show'")},
    {"hidden=2", tag("HiddenStatus", "show"), passed("[Profile1/HiddenStatus] Spec='show',Phone='show'")},
    {"hidden=1", tag("HiddenStatus", "on"), passed("[Profile1/HiddenStatus] Spec='on',Phone='hidden'")},
    {"hidden=0", tag("HiddenStatus", "on"), failed("[Profile1/HiddenStatus] Spec='on',Phone='show'")},
    {"hidden=0", tag("HiddenStatus", "off"), passed("[Profile1/HiddenStatus] Spec='off',Phone='show'")},
    {"hidden=1", tag("HiddenStatus", "off"), failed("[Profile1/HiddenStatus] Spec='off',Phone='hidden'")},
    {"is_roaming_apn=1", tag("RoamingEnableStatus", "enable"),
     passed("[Profile1/RoamingEnableStatus] Spec='enable',Phone='enable'")},
    {"is_roaming_apn=0", tag("RoamingEnableStatus", "enable"),
     failed("[Profile1/RoamingEnableStatus] Spec='enable',Phone='disable'")},
    {"is_roaming_apn=2", tag("RoamingEnableStatus", "disable"),
     passed("[Profile1/RoamingEnableStatus] Spec='disable',Phone='disable'")},
    {"pdp_protocol=2", tag("IpVersion", "ipv4"), passed("[Profile1/IpVersion] Spec='ipv4',Phone='ipv4'")},
    {"pdp_protocol=5", tag("IpVersion", "ipv6"), passed("[Profile1/IpVersion] Spec='ipv6',Phone='ipv6'")},
    {"pdp_protocol=6", tag("IpVersion", "ipv4v6"), passed("[Profile1/IpVersion] Spec='ipv4v6',Phone='ipv4v6'")},
    {"pdp_protocol=3", tag("IpVersion", "ipv4"), failed("[Profile1/IpVersion] Spec='ipv4',Phone=''")},
    {"pdp_protocol=2", tag("IpVersion", "x25"), failed("[Profile1/IpVersion] Spec='x25',Phone='ipv4'")},
    {"roam_pdp_protocol=6", tag("RoamingIpVersion", "ipv4v6"),
     passed("[Profile1/IpVerRoaming] Spec='ipv4v6',Phone='ipv4v6'")},
    {"roam_pdp_protocol=0", tag("RoamingIpVersion", "ipv6"), failed("[Profile1/IpVerRoaming] Spec='ipv6',Phone=''")},
    {"auth_type=0", tag("Auth", "none"), passed("[Profile1/Auth] Spec='none',Phone='none'")},
    {"auth_type=1", tag("Auth", "normal"), passed("[Profile1/Auth] Spec='normal',Phone='normal'")},
    {"auth_type=2", tag("Auth", "secure"), passed("[Profile1/Auth] Spec='secure',Phone='secure'")},
    {"auth_type=2", tag("Auth", "normal"), failed("[Profile1/Auth] Spec='normal',Phone='secure'")},
    {"auth_type=3", tag("Auth", "secure"), failed("[Profile1/Auth] Spec='secure',Phone=''")},
    {"auth_id='me'", tag("PSparam", tag("UserId", "me")), passed("[Profile1/UserId] Spec='me',Phone='me'")},
    {"auth_id='me'", "", failed("[Profile1/UserId] Spec='',Phone='me'")},
    {"auth_id=''", tag("PSparam", tag("UserId", "me")), failed("[Profile1/UserId] Spec='me',Phone=''")},
    {"auth_id=''", "", passed("[Profile1/UserId] Spec='',Phone=''")},
    {"auth_pwd='x'", tag("PSparam", tag("Password", "x")), passed("[Profile1/Password] Spec='x',Phone='x'")},
    {"auth_pwd='y'", tag("PSparam", tag("Password", "x")), failed("[Profile1/Password] Spec='x',Phone='y'")},
    {"apn='a.b'", tag("APN", "a.b"), passed("[Profile1/APN] Spec='a.b',Phone='a.b'")},
    {"apn='a.c'", tag("APN", "a.b"), failed("[Profile1/APN] Spec='a.b',Phone='a.c'")},
    {"home_url='http://h'", tag("URL", "http://h"), passed("[Profile1/URL] Spec='http://h',Phone='http://h'")},
    {"home_url=null", tag("URL", "http://h"), failed("[Profile1/URL] Spec='http://h',Phone=''")},
    {"proxy_ip_addr='10.0.0.1:80'", proxy("10.0.0.1", "80"),
     passed("[Profile1/Proxy/ServAddr] Spec='10.0.0.1',Phone='10.0.0.1'")},
    {"proxy_ip_addr='10.0.0.2:80'", proxy("10.0.0.1", "80"),
     failed("[Profile1/Proxy/ServAddr] Spec='10.0.0.1',Phone='10.0.0.2'")},
    {"proxy_ip_addr='0.0.0.0:80'", "", passed("[Profile1/Proxy/ServAddr] Spec='',Phone='0.0.0.0'")},
    {"proxy_ip_addr=''", proxy("0.0.0.0", "80"), passed("[Profile1/Proxy/ServAddr] Spec='0.0.0.0',Phone=''")},
    {"proxy_ip_addr='10.0.0.1'", "", failed("[Profile1/Proxy/ServAddr] Spec='',Phone='10.0.0.1'")},
    {"proxy_ip_addr='10.0.0.1'", proxy("0.0.0.0", ""),
     failed("[Profile1/Proxy/ServAddr] Spec='0.0.0.0',Phone='10.0.0.1'")},
    {"proxy_ip_addr=''", proxy("10.0.0.1", ""), failed("[Profile1/Proxy/ServAddr] Spec='10.0.0.1',Phone=''")},
    {"proxy_ip_addr='10.0.0.1:80'", proxy("10.0.0.1", "80"), passed("[Profile1/Proxy/Port] Spec='80',Phone='80'")},
    {"proxy_ip_addr='10.0.0.1:81'", proxy("10.0.0.1", "80"), failed("[Profile1/Proxy/Port] Spec='80',Phone='81'")},
    {"proxy_ip_addr='10.0.0.1:080'", proxy("10.0.0.1", "80"), failed("[Profile1/Proxy/Port] Spec='80',Phone='080'")},
    {"proxy_ip_addr='10.0.0.1'", proxy("10.0.0.1", "0"), passed("[Profile1/Proxy/Port] Spec='0',Phone=''")},
    {"proxy_ip_addr='10.0.0.1:80'", proxy("10.0.0.1", "0"), failed("[Profile1/Proxy/Port] Spec='0',Phone='80'")},
    {"proxy_ip_addr='10.0.0.1'", proxy("10.0.0.1", ""), passed("[Profile1/Proxy/Port] Spec='',Phone=''")},
    {"proxy_ip_addr='10.0.0.1'", proxy("10.0.0.1", "80"), failed("[Profile1/Proxy/Port] Spec='80',Phone=''")},
    {"proxy_ip_addr='10.0.0.1:80'", proxy("10.0.0.1", ""), failed("[Profile1/Proxy/Port] Spec='',Phone='80'")},
    {"proxy_ip_addr=''", proxy("0.0.0.0", "80"), passed("[Profile1/Proxy/Port] Spec='80',Phone=''")},
    {"proxy_ip_addr=''", proxy("", "80"), passed("[Profile1/Proxy/Port] Spec='80',Phone=''")},
    {"proxy_ip_addr='0.0.0.0:80'", proxy("0.0.0.0", "81"), failed("[Profile1/Proxy/Port] Spec='81',Phone='80'")},
    {"is_static_ip_addr=1", tag("StaticIP", tag("EnableFlag", "on")),
     passed("[Profile1/StaticIP/EnableFlag] Spec='on',Phone='on'")},
    {"is_static_ip_addr=0", tag("StaticIP", tag("EnableFlag", "on")),
     failed("[Profile1/StaticIP/EnableFlag] Spec='on',Phone='off'")},
    {"is_static_ip_addr=2", tag("StaticIP", tag("EnableFlag", "off")),
     passed("[Profile1/StaticIP/EnableFlag] Spec='off',Phone='off'")},
    {"is_static_ip_addr=0", "", passed("[Profile1/StaticIP/EnableFlag] Spec='',Phone='off'")},
    {"is_static_ip_addr=1", "", failed("[Profile1/StaticIP/EnableFlag] Spec='',Phone='on'")},
    {"ip_addr='1.2.3.4'", tag("StaticIP", tag("IPAddr", "1.2.3.4")),
     passed("[Profile1/StaticIP/IPAddr] Spec='1.2.3.4',Phone='1.2.3.4'")},
    {"ip_addr=null", tag("StaticIP", tag("IPAddr", "1.2.3.4")),
     failed("[Profile1/StaticIP/IPAddr] Spec='1.2.3.4',Phone=''")},
    {"ip_addr='0.0.0.0'", "", passed("[Profile1/StaticIP/IPAddr] Spec='',Phone='0.0.0.0'")},
    {"ip_addr='1.2.3.4'", "", failed("[Profile1/StaticIP/IPAddr] Spec='',Phone='1.2.3.4'")},
    {"ip_addr=null", tag("StaticIP", tag("IPAddr", "0.0.0.0")),
     failed("[Profile1/StaticIP/IPAddr] Spec='0.0.0.0',Phone=''")},
    {"is_static_dns_addr=1", tag("DNS", tag("EnableFlag", "on")),
     passed("[Profile1/DNS/EnableFlag] Spec='on',Phone='on'")},
    {"is_static_dns_addr=1", tag("DNS", tag("EnableFlag", "off")),
     failed("[Profile1/DNS/EnableFlag] Spec='off',Phone='on'")},
    {"is_static_dns_addr=0", "", passed("[Profile1/DNS/EnableFlag] Spec='',Phone='off'")},
    {"is_static_dns_addr=1", "", failed("[Profile1/DNS/EnableFlag] Spec='',Phone='on'")},
    {"dns_addr1='8.8.8.8'", tag("DNS", tag("IPAddr", "8.8.8.8")),
     passed("[Profile1/DNS/IPAddr1] Spec='8.8.8.8',Phone='8.8.8.8'")},
    {"dns_addr1='8.8.8.8'", tag("DNS", tag("IPAddr", "9.9.9.9")),
     failed("[Profile1/DNS/IPAddr1] Spec='9.9.9.9',Phone='8.8.8.8'")},
    {"dns_addr1='0.0.0.0'", "", passed("[Profile1/DNS/IPAddr1] Spec='',Phone='0.0.0.0'")},
    {"dns_addr1=null", tag("DNS", tag("IPAddr", "0.0.0.0")), failed("[Profile1/DNS/IPAddr1] Spec='0.0.0.0',Phone=''")},
    {"dns_addr2=null", tag("DNS", tag("IPAddr", "8.8.8.8") + tag("IPAddr", "0.0.0.0")),
     failed("[Profile1/DNS/IPAddr2] Spec='0.0.0.0',Phone=''")},
    {"dns_addr1='8.8.8.8'", "", failed("[Profile1/DNS/IPAddr1] Spec='',Phone='8.8.8.8'")},
    {"dns_addr2='9.9.9.9'", tag("DNS", tag("IPAddr", "8.8.8.8") + tag("IPAddr", "9.9.9.9")),
     passed("[Profile1/DNS/IPAddr2] Spec='9.9.9.9',Phone='9.9.9.9'")},
    {"dns_addr2='8.8.8.8'", tag("DNS", tag("IPAddr", "8.8.8.8") + tag("IPAddr", "9.9.9.9")),
     failed("[Profile1/DNS/IPAddr2] Spec='9.9.9.9',Phone='8.8.8.8'")},
    {"dns_addr2='0.0.0.0'", "", passed("[Profile1/DNS/IPAddr2] Spec='',Phone='0.0.0.0'")},
    {"dns_addr2='9.9.9.9'", "", failed("[Profile1/DNS/IPAddr2] Spec='',Phone='9.9.9.9'")},
};

} // namespace

class ConnectionVerify : public ConnectionPhone {
  protected:
    // One profile without values, known as the spec's first, and one of the next id that is not.
    void SetUp() override {
        ConnectionPhone::SetUp();
        run("insert into network_info values(7, 'One', '26201')");
        put_plain_row();
        know(1, 4);
    }
    void put_plain_row() const {
        run("delete from pdp_profile; insert into pdp_profile values(4, '', '', 0, '', '', 2, 2, '', '', 300, 0, 0, "
            "null, 0, null, null, 7, 1, 0, 1, 0, 0, 0, 0, 1)");
    }
    static void know(int spec_index, int profile_id) {
        const std::string key = "profile_id_" + std::to_string(spec_index);
        zel_svc_data_set_int(ZEL_SVC_DATA_CONNECTION, "spec", key.c_str(), profile_id);
    }
    static std::vector<ResultLine> verify(const std::string &children,
                                          ZelSvcParseMode mode = ZEL_SVC_PARSE_MODE_PARTIAL) {
        return verify_spec(connections(tag("Profile", children)), mode);
    }
};

TEST_F(ConnectionVerify, EveryLinePassesAndFailsByItsRule) {
    for (const ExpectedLine &expected : kLines) {
        put_plain_row();
        run("update pdp_profile set " + std::string{expected.update});
        EXPECT_THAT(verify(expected.spec), Contains(expected.line)) << expected.update << " " << expected.spec;
    }
}

TEST_F(ConnectionVerify, LinesStandInTheirOrderAndOnlyWhereTheSpecSaysSomething) {
    EXPECT_THAT(
        verify(""),
        ElementsAre(passed("[Profile1/ProfileName] Spec='',Phone=''"), //
                    passed("[Profile1/Auth] Spec='',Phone='none'"), passed("[Profile1/UserId] Spec='',Phone=''"),
                    passed("[Profile1/Password] Spec='',Phone=''"), passed("[Profile1/APN] Spec='',Phone=''"),
                    passed("[Profile1/URL] Spec='',Phone=''"), passed("[Profile1/Proxy/ServAddr] Spec='',Phone=''"),
                    passed("[Profile1/Proxy/Port] Spec='',Phone=''"),
                    passed("[Profile1/StaticIP/EnableFlag] Spec='',Phone='off'"),
                    passed("[Profile1/StaticIP/IPAddr] Spec='',Phone=''"),
                    passed("[Profile1/DNS/EnableFlag] Spec='',Phone='off'"),
                    passed("[Profile1/DNS/IPAddr1] Spec='',Phone=''"),
                    passed("[Profile1/DNS/IPAddr2] Spec='',Phone=''")));
}

TEST_F(ConnectionVerify, OfAWholeProfile) {
    run("update pdp_profile set profile_name='Web', apn='a.b', auth_type=2, auth_id='me', auth_pwd='x', "
        "pdp_protocol=6, "
        "roam_pdp_protocol=5, proxy_ip_addr='10.0.0.1:80', home_url='http://h', is_static_ip_addr=1, "
        "ip_addr='1.2.3.4', is_static_dns_addr=1, dns_addr1='8.8.8.8', dns_addr2='9.9.9.9', hidden=1, editable=0, "
        "is_roaming_apn=1, profile_enable=0");
    const auto lines = verify(
        tag("NetworkName", "One") + tag("ProfileName", "Web") + tag("Editable", "no") + tag("EnableStatus", "disable") +
        tag("HiddenStatus", "on") + tag("RoamingEnableStatus", "enable") + tag("IpVersion", "ipv4v6") +
        tag("RoamingIpVersion", "ipv6") + tag("Auth", "secure") +
        tag("PSparam", tag("APN", "a.b") + tag("UserId", "me") + tag("Password", "x")) + tag("URL", "http://h") +
        proxy("10.0.0.1", "80") + tag("Gateway", tag("ServAddr", "10.0.0.9")) +
        tag("StaticIP", tag("EnableFlag", "on") + tag("IPAddr", "1.2.3.4")) +
        tag("DNS", tag("EnableFlag", "on") + tag("IPAddr", "8.8.8.8") + tag("IPAddr", "9.9.9.9") + tag("IPAddr", "7")));
    EXPECT_THAT(lines, ElementsAre(passed("[Profile1/ProfileName] Spec='Web',Phone='Web'"),
                                   passed("[Profile1/Editable] Spec='no',Phone='no'"),
                                   passed("[Profile1/EnableStatus] Spec='disable',Phone='disable'"),
                                   passed("[Profile1/HiddenStatus] Spec='on',Phone='hidden'"),
                                   passed("[Profile1/RoamingEnableStatus] Spec='enable',Phone='enable'"),
                                   passed("[Profile1/IpVersion] Spec='ipv4v6',Phone='ipv4v6'"),
                                   passed("[Profile1/IpVerRoaming] Spec='ipv6',Phone='ipv6'"),
                                   passed("[Profile1/Auth] Spec='secure',Phone='secure'"),
                                   passed("[Profile1/UserId] Spec='me',Phone='me'"),
                                   passed("[Profile1/Password] Spec='x',Phone='x'"),
                                   passed("[Profile1/APN] Spec='a.b',Phone='a.b'"),
                                   passed("[Profile1/URL] Spec='http://h',Phone='http://h'"),
                                   passed("[Profile1/Proxy/ServAddr] Spec='10.0.0.1',Phone='10.0.0.1'"),
                                   passed("[Profile1/Proxy/Port] Spec='80',Phone='80'"),
                                   passed("[Profile1/StaticIP/EnableFlag] Spec='on',Phone='on'"),
                                   passed("[Profile1/StaticIP/IPAddr] Spec='1.2.3.4',Phone='1.2.3.4'"),
                                   passed("[Profile1/DNS/EnableFlag] Spec='on',Phone='on'"),
                                   passed("[Profile1/DNS/IPAddr1] Spec='8.8.8.8',Phone='8.8.8.8'"),
                                   passed("[Profile1/DNS/IPAddr2] Spec='9.9.9.9',Phone='9.9.9.9'")));
}

TEST_F(ConnectionVerify, EmptyAuthRepeatsTheLineBeforeIt) {
    run("update pdp_profile set profile_name='Other', auth_type=2, pdp_protocol=6");
    EXPECT_THAT(verify(""), Contains(failed("[Profile1/Auth] Spec='',Phone='secure'")));
    EXPECT_THAT(verify(tag("ProfileName", "Other")), Contains(passed("[Profile1/Auth] Spec='',Phone='secure'")));
    EXPECT_THAT(verify(tag("IpVersion", "ipv4v6")), Contains(passed("[Profile1/Auth] Spec='',Phone='secure'")));
    EXPECT_THAT(verify(tag("ProfileName", "Other") + tag("RoamingIpVersion", "ipv6")),
                Contains(failed("[Profile1/Auth] Spec='',Phone='secure'")));
    run("update pdp_profile set auth_type=3"); // equal, and failed all the same
    EXPECT_THAT(verify(""), Contains(failed("[Profile1/Auth] Spec='',Phone=''")));
}

TEST_F(ConnectionVerify, ProfilesAreFoundByTheirPlaceInTheSpec) {
    run("insert into pdp_profile(profile_id, profile_name) values(9, 'Third')");
    know(3, 9);
    const auto lines = verify_spec(
        connections(tag("Profile", "") + tag("Profile", tag("ProfileName", "Second")) + tag("Profile", "")));
    EXPECT_THAT(lines, Contains(passed("[Profile1/ProfileName] Spec='',Phone=''")));
    EXPECT_THAT(lines, Contains(failed("[Profile3/ProfileName] Spec='',Phone='Third'")));
    EXPECT_EQ(lines.size(), 26U);
    EXPECT_EQ(verify_spec(connections(tag("Profile", ""))).size(), 13U); // counted afresh
}

TEST_F(ConnectionVerify, OnlyInThePartialModeAndWithoutTheFlag) {
    for (const ZelSvcParseMode mode :
         {ZEL_SVC_PARSE_MODE_FULL, ZEL_SVC_PARSE_MODE_CUSTOMER_LIST, ZEL_SVC_PARSE_MODE_SECURITY_LOCK,
          ZEL_SVC_PARSE_MODE_OPERATOR_LIST, ZEL_SVC_PARSE_MODE_OPERATOR, ZEL_SVC_PARSE_MODE_HEADER})
        EXPECT_THAT(verify("", mode), IsEmpty()) << mode;
    set_auto_flag(ZEL_SVC_AUTO_PROFILE, 1);
    EXPECT_THAT(verify(""), IsEmpty());
    set_auto_flag(ZEL_SVC_AUTO_PROFILE, 0);
    zel_svc_verification_clear_results();
    parse_spec(tag("Profile", ""), ZEL_SVC_PARSE_ACTION_VERIFY, ZEL_SVC_PARSE_MODE_PARTIAL);
    EXPECT_EQ(result_lines().size(), 13U); // the skipped one was not counted: this is the first
}

TEST_F(ConnectionVerify, NothingIsSaidOfAProfileThatCannotBeRead) {
    know(1, 5); // no such row
    EXPECT_THAT(verify(""), IsEmpty());
    know(1, -4);
    EXPECT_THAT(verify(""), IsEmpty());
    know(1, 4);
    for (const ReadFault &fault : kReadFaults) {
        call("fault-clear");
        fail(fault.function, fault.text, fault.from, 1);
        EXPECT_THAT(verify(""), IsEmpty()) << fault.function << " " << fault.text << " " << fault.from;
    }
    call("fault-clear");
    EXPECT_EQ(verify("").size(), 13U);
    run("drop table network_info");
    EXPECT_THAT(verify(""), IsEmpty());
    run("drop table pdp_profile");
    EXPECT_THAT(verify(""), IsEmpty());
    zel_svc_data_unset(ZEL_SVC_DATA_CONNECTION, "spec", "profile_id_1");
    EXPECT_THAT(verify(""), IsEmpty());
    EXPECT_EQ(open_databases(), 0U);
}

TEST_F(ConnectionVerify, ProfileOfANetworkThatIsGoneIsVerifiedAllTheSame) {
    run("delete from network_info");
    EXPECT_EQ(verify("").size(), 13U);
}

TEST_F(ConnectionVerify, RowOfIdZeroIsARow) {
    run("update pdp_profile set profile_id=0");
    know(1, 0);
    EXPECT_EQ(verify("").size(), 13U);
}

TEST_F(ConnectionVerify, LongLinesAreCut) {
    const std::string name(199, 'n');
    const auto lines = verify(tag("ProfileName", name + "more") + tag("APN", name));
    EXPECT_THAT(lines, Contains(failed("[Profile1/ProfileName] Spec='" + name + "',Phone=''")));
    run("update pdp_profile set apn='" + std::string(250, 'a') + "'");
    const std::string cut = "[Profile1/APN] Spec='" + name + "',Phone='" + std::string(76, 'a');
    ASSERT_EQ(cut.size(), 305U);
    EXPECT_THAT(verify(tag("APN", name)), Contains(failed(cut)));
}

TEST_F(ConnectionVerify, NothingIsWritten) {
    const SqliteRows before = profiles("*");
    verify(tag("NetworkName", "default") + tag("ProfileName", "Web"));
    EXPECT_EQ(profiles("*"), before);
    EXPECT_EQ(networks(), (SqliteRows{{"7", "One", "26201"}}));
    EXPECT_EQ(mirrored("count"), std::nullopt);
}

TEST_F(ConnectionVerify, WhatWasInstalledIsFound) {
    add_network("It's", "26'201");
    const std::string content =
        profile("It's", "O'Web", tag("Auth", "secure") + tag("APN", "a\"b") + proxy("0.0.0.0", "80"));
    install_connections(content);
    for (const ResultLine &line : verify_spec(connections(content)))
        EXPECT_TRUE(line.passed) << line.text;
}

} // namespace zel_test
