// A profile's row back in the words of the spec, as the export asks for it.

#include "connections.h"

#include "zel-svc-element-act-connection-profile.h"

#include <gmock/gmock.h>

namespace zel_test {

using testing::Each;
using testing::ElementsAre;
using testing::StrEq;

namespace {

constexpr ZelSvcElementId kLeaves[] = {
    ZEL_SVC_ELEMENT_PROFILE_NETWORK_NAME,
    ZEL_SVC_ELEMENT_PROFILE_NAME,
    ZEL_SVC_ELEMENT_PROFILE_EDITABLE,
    ZEL_SVC_ELEMENT_PROFILE_ENABLE_STATUS,
    ZEL_SVC_ELEMENT_PROFILE_HIDDEN_STATUS,
    ZEL_SVC_ELEMENT_PROFILE_ROAMING_ENABLE_STATUS,
    ZEL_SVC_ELEMENT_IP_VERSION,
    ZEL_SVC_ELEMENT_ROAMING_IP_VERSION,
    ZEL_SVC_ELEMENT_AUTH,
    ZEL_SVC_ELEMENT_APN,
    ZEL_SVC_ELEMENT_PS_PARAM_USER_ID,
    ZEL_SVC_ELEMENT_PS_PARAM_PASSWORD,
    ZEL_SVC_ELEMENT_PROFILE_URL,
    ZEL_SVC_ELEMENT_PROXY_SERV_ADDR,
    ZEL_SVC_ELEMENT_PROXY_PORT,
    ZEL_SVC_ELEMENT_STATIC_IP_ENABLE_FLAG,
    ZEL_SVC_ELEMENT_STATIC_IP_ADDR,
    ZEL_SVC_ELEMENT_DNS_ENABLE_FLAG,
    ZEL_SVC_ELEMENT_DNS_IP_ADDR,
    ZEL_SVC_ELEMENT_DNS_IP_ADDR,
};

// One profile as the writer asks for it, its two name servers one after the other.
std::vector<std::string> export_profile() {
    std::vector<std::string> texts;
    export_start(ZEL_SVC_ELEMENT_PROFILE);
    for (const ZelSvcElementId leaf : kLeaves)
        texts.push_back(export_value(leaf));
    export_end(ZEL_SVC_ELEMENT_PROFILE);
    return texts;
}

void begin_export() {
    zel_svc_element_stack_reset();
    export_start(ZEL_SVC_ELEMENT_CONNECTIONS);
    export_end(ZEL_SVC_ELEMENT_CONNECTIONS);
}

// The column and what the leaf says.
struct ExpectedText {
    const char *update;
    std::size_t leaf; // of kLeaves
    const char *text;
};
constexpr ExpectedText kTexts[] = {
    {"profile_name='Web'", 1, "Web"},
    {"editable=1", 2, "yes"},
    {"editable=0", 2, "no"},
    {"editable=2", 2, "no"},
    {"editable=null", 2, "no"},
    {"profile_enable=1", 3, "enable"},
    {"profile_enable=-1", 3, "enable"},
    {"profile_enable=0", 3, "disable"},
    {"hidden=1", 4, "hidden"},
    {"hidden=0", 4, "show"},
    {"hidden=9", 4, "show"},
    {"is_roaming_apn=1", 5, "enable"},
    {"is_roaming_apn=0", 5, "disable"},
    {"is_roaming_apn=3", 5, "disable"},
    {"pdp_protocol=2", 6, "ipv4"},
    {"pdp_protocol=5", 6, "ipv6"},
    {"pdp_protocol=6", 6, "ipv4v6"},
    {"pdp_protocol=4", 6, ""},
    {"roam_pdp_protocol=2", 7, "ipv4"},
    {"roam_pdp_protocol=5", 7, "ipv6"},
    {"roam_pdp_protocol=6", 7, "ipv4v6"},
    {"roam_pdp_protocol=null", 7, ""},
    {"auth_type=0", 8, "none"},
    {"auth_type=1", 8, "normal"},
    {"auth_type=2", 8, "secure"},
    {"auth_type=3", 8, ""},
    {"auth_type=4294967297", 8, ""},
    {"auth_type=1e19", 8, ""},
    {"auth_type=-1e19", 8, ""},
    {"auth_type=9e999", 8, ""},
    {"auth_type=-9e999", 8, ""},
    {"auth_type=2.0", 8, "secure"},
    {"apn='a.b'", 9, "a.b"},
    {"auth_id='me'", 10, "me"},
    {"auth_pwd='x & y'", 11, "x & y"},
    {"home_url='http://h'", 12, "http://h"},
    {"proxy_ip_addr='10.0.0.1'", 13, "10.0.0.1"},
    {"proxy_ip_addr='10.0.0.1'", 14, ""},
    {"proxy_ip_addr='10.0.0.1:8080'", 13, "10.0.0.1"},
    {"proxy_ip_addr='10.0.0.1:8080'", 14, "8080"},
    {"proxy_ip_addr='http://p:1'", 13, "http://p"},
    {"proxy_ip_addr='p:007'", 14, "007"},
    {"proxy_ip_addr='p:0'", 13, "p:0"},
    {"proxy_ip_addr='p:0'", 14, ""},
    {"proxy_ip_addr='p:'", 13, "p:"},
    {"proxy_ip_addr='p:80x'", 13, "p:80x"},
    {"proxy_ip_addr='p:+80'", 13, "p:+80"},
    {"proxy_ip_addr='p: 80'", 13, "p: 80"},
    {"proxy_ip_addr='a:1:b'", 13, "a:1:b"},
    {"proxy_ip_addr='a:1:2'", 13, "a:1"},
    {"proxy_ip_addr='a:1:2'", 14, "2"},
    {"proxy_ip_addr=':80'", 13, ""},
    {"proxy_ip_addr=':80'", 14, "80"},
    {"proxy_ip_addr='p:99999999999'", 14, "999999999"},
    {"proxy_ip_addr='p:99999999999'", 13, "p"},
    {"is_static_ip_addr=1", 15, "on"},
    {"is_static_ip_addr=2", 15, "off"},
    {"is_static_ip_addr=0.00001", 15, "off"},
    {"ip_addr='1.2.3.4'", 16, "1.2.3.4"},
    {"is_static_dns_addr=1", 17, "on"},
    {"is_static_dns_addr=0", 17, "off"},
    {"dns_addr1='8.8.8.8'", 18, "8.8.8.8"},
    {"dns_addr2='9.9.9.9'", 19, "9.9.9.9"},
};

} // namespace

class ConnectionExport : public ConnectionPhone {
  protected:
    void SetUp() override {
        ConnectionPhone::SetUp();
        run("insert into network_info values(7, 'One', '26201')");
        put_plain_row();
        zel_svc_data_set_int(ZEL_SVC_DATA_CONNECTION, "spec", "profile_id_1", 4);
    }
    void put_plain_row() const {
        run("delete from pdp_profile; insert into pdp_profile values(4, '', '', 0, '', '', 2, 2, '', '', 300, 0, 0, "
            "null, 0, null, null, 7, 1, 0, 1, 0, 0, 0, 0, 1)");
    }
};

TEST_F(ConnectionExport, EveryColumnIsTheSpecsWordForIt) {
    for (const ExpectedText &expected : kTexts) {
        put_plain_row();
        run("update pdp_profile set " + std::string{expected.update});
        begin_export();
        EXPECT_EQ(export_profile()[expected.leaf], expected.text) << expected.update;
    }
}

TEST_F(ConnectionExport, PlainRowAndItsNetwork) {
    begin_export();
    EXPECT_THAT(export_profile(), ElementsAre("One", "", "yes", "enable", "show", "disable", "ipv4", "ipv4", "none", "",
                                              "", "", "", "", "", "off", "", "off", "", ""));
}

TEST_F(ConnectionExport, ProfileIsReadWithItsNetworksMccMnc) {
    ZelSvcApnProfile read;
    ASSERT_TRUE(__zel_svc_connection_read_profile(1, read));
    EXPECT_EQ(read.network_name.view(), "One");
    EXPECT_EQ(read.mccmnc.view(), "26201");
    run("update network_info set mccmnc='123456789012'");
    ASSERT_TRUE(__zel_svc_connection_read_profile(1, read));
    EXPECT_EQ(read.mccmnc.view(), "123456789");
    run("delete from network_info");
    ASSERT_TRUE(__zel_svc_connection_read_profile(1, read));
    EXPECT_EQ(read.mccmnc.view(), "");
}

TEST_F(ConnectionExport, NetworkThatIsGoneLeavesItsNameEmpty) {
    run("delete from network_info");
    begin_export();
    const auto texts = export_profile();
    EXPECT_EQ(texts[0], "");
    EXPECT_EQ(texts[6], "ipv4");
}

TEST_F(ConnectionExport, ProfilesFollowOneAnotherAndEachHasItsNameServers) {
    run("update pdp_profile set dns_addr1='1', dns_addr2='2'");
    run("insert into pdp_profile(profile_id, profile_name, dns_addr1, dns_addr2) values(9, 'Second', '3', '4')");
    zel_svc_data_set_int(ZEL_SVC_DATA_CONNECTION, "spec", "profile_id_2", 9);
    begin_export();
    const auto first = export_profile();
    const auto second = export_profile();
    EXPECT_EQ(first[18] + first[19], "12");
    EXPECT_EQ(second[1], "Second");
    EXPECT_EQ(second[18] + second[19], "34");
}

// A profile without a row has its place all the same.
TEST_F(ConnectionExport, MissingProfileIsEmptyAndNotHalfOfOne) {
    zel_svc_data_set_int(ZEL_SVC_DATA_CONNECTION, "spec", "profile_id_2", 4);
    zel_svc_data_unset(ZEL_SVC_DATA_CONNECTION, "spec", "profile_id_1");
    begin_export();
    EXPECT_THAT(export_profile(), Each(StrEq("")));
    EXPECT_EQ(export_profile()[0], "One");
    zel_svc_data_set_int(ZEL_SVC_DATA_CONNECTION, "spec", "profile_id_1", 4);
    for (const ReadFault &fault : kReadFaults) {
        call("fault-clear");
        fail(fault.function, fault.text, fault.from, 1);
        begin_export();
        EXPECT_THAT(export_profile(), Each(StrEq(""))) << fault.function << " " << fault.text << " " << fault.from;
    }
    call("fault-clear");
    begin_export();
    EXPECT_EQ(export_profile()[0], "One");
    EXPECT_EQ(open_databases(), 0U);
}

// What is not recorded reads as -1.
TEST_F(ConnectionExport, RowOfANegativeIdIsNoProfile) {
    run("insert into pdp_profile(profile_id, profile_name) values(-1, 'Ghost'), (-7, 'Ghost')");
    zel_svc_data_unset(ZEL_SVC_DATA_CONNECTION, "spec", "profile_id_1");
    begin_export();
    EXPECT_THAT(export_profile(), Each(StrEq("")));
    for (const int id : {-1, -7}) {
        zel_svc_data_set_int(ZEL_SVC_DATA_CONNECTION, "spec", "profile_id_1", id);
        begin_export();
        EXPECT_THAT(export_profile(), Each(StrEq(""))) << id;
    }
}

TEST_F(ConnectionExport, CountIsThatOfTheSpecsProfiles) {
    EXPECT_EQ(export_value(ZEL_SVC_ELEMENT_NB_PROFILE), "0");
    for (const int count : {3, 0, -1, 10001}) {
        zel_svc_data_set_int(ZEL_SVC_DATA_CONNECTION, "spec", "count", count);
        EXPECT_EQ(export_value(ZEL_SVC_ELEMENT_NB_PROFILE), std::to_string(count));
    }
    zel_svc_data_free(ZEL_SVC_DATA_CONNECTION);
    EXPECT_EQ(export_value(ZEL_SVC_ELEMENT_NB_PROFILE), "0");
}

TEST_F(ConnectionExport, LeavesOutsideAProfileAreEmpty) {
    for (const ZelSvcElementId leaf : kLeaves)
        EXPECT_EQ(export_value(leaf), "");
}

TEST_F(ConnectionExport, LongTextsOfThePhoneAreCut) {
    run("update pdp_profile set apn='" + std::string(250, 'a') + "'");
    begin_export();
    EXPECT_EQ(export_profile()[9], std::string(199, 'a'));
}

TEST_F(ConnectionExport, WhatWasInstalledComesBack) {
    add_network("Two", "26202");
    install_connections(
        profile("Two", "Web",
                tag("Editable", "no") + tag("EnableStatus", "disable") + tag("HiddenStatus", "hidden") +
                    tag("RoamingEnableStatus", "enable") + tag("IpVersion", "ipv6") +
                    tag("RoamingIpVersion", "ipv4v6") + tag("Auth", "normal") + tag("URL", "http://h") +
                    tag("PSparam", tag("APN", "a.b") + tag("UserId", "me") + tag("Password", "secret")) +
                    tag("Proxy", tag("ServAddr", "10.0.0.1") + tag("Port", "80")) +
                    tag("StaticIP", tag("EnableFlag", "on") + tag("IPAddr", "1.2.3.4")) +
                    tag("DNS", tag("EnableFlag", "on") + tag("IPAddr", "8.8.8.8") + tag("IPAddr", "9.9.9.9"))));
    begin_export();
    EXPECT_THAT(export_profile(),
                ElementsAre("Two", "Web", "no", "disable", "hidden", "enable", "ipv6", "ipv4v6", "normal", "a.b", "me",
                            "secret", "http://h", "10.0.0.1", "80", "on", "1.2.3.4", "on", "8.8.8.8", "9.9.9.9"));
}

} // namespace zel_test
