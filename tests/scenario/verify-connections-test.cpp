// The network settings of a phone under verification: which row or record each line of the report is about.

#include "service-phone.h"
#include "support/sqlite-file.h"

#include <gmock/gmock.h>

namespace {

using ::testing::ElementsAre;
using ::testing::IsEmpty;

constexpr const char *kCustomer = R"(<GeneralInfo><SalesCode>BTU</SalesCode>
<NetworkInfo><MCCMNC>00101</MCCMNC><NetworkName>North</NetworkName></NetworkInfo></GeneralInfo>
<Settings><Main><Network>
<NbMaxPDP>1</NbMaxPDP>
<MaxPDP><NetworkName>North</NetworkName><MaxPDP2G>1</MaxPDP2G><MaxPDP3G>2</MaxPDP3G></MaxPDP>
<NbFastDormancy>1</NbFastDormancy>
<FastDormancy><NetworkName>North</NetworkName><FastDormancyEnableStatus>on</FastDormancyEnableStatus>
<TimeoutValue>2.5</TimeoutValue><LCDStatus>on</LCDStatus><Version>rel8</Version></FastDormancy>
</Network></Main><Connections>
<ProfileHandle><NetworkName>North</NetworkName><ProfBrowser>Web</ProfBrowser><ProfMMS>MMS</ProfMMS>
<ProfIntSharing>Share</ProfIntSharing><ProfIMS>IMS</ProfIMS><ProfXCAP>XCAP</ProfXCAP>
<ProfEmergencyIMSCall>SOS</ProfEmergencyIMSCall></ProfileHandle>
<Profile><NetworkName>North</NetworkName><ProfileName>Web</ProfileName></Profile>
</Connections></Settings>)";

class VerifyConnections : public zel_test::ServicePhone {
  protected:
    void SetUp() override {
        ServicePhone::SetUp();
        write_customer("BTU", kCustomer);
        set_string("db/zel/salescode", "BTU");
        zel_svc_config_install_customer("BTU", ZEL_SVC_INSTALL_CONFIG_MODE);
    }

    void run(const std::string &sql) { zel_test::SqliteFile{root() + "/opt/dbspace/.dnet.db"}.run(sql); }
    void replace_in(const std::string &group, const std::string &from, const std::string &to) {
        std::string text = read(data_path(group));
        const std::size_t place = text.find(from);
        ASSERT_NE(place, std::string::npos) << group << " has no " << from;
        write(data_path(group), text.replace(place, from.size(), to));
    }
};

} // namespace

TEST_F(VerifyConnections, HandlesHaveLinesOnlyForANetworkWithoutMccAndMnc) {
    for (const char *service : {"Browser]", "MMS]", "IntSharing]", "IMS]", "XCAP]", "Emergency"})
        EXPECT_THAT(verified_lines(std::string{"[Spec][Prof"} + service), IsEmpty());

    run("insert into network_info values(9, 'North', '')");
    const std::string columns = "insert into pdp_profile(profile_id, profile_name, network_info_id, svc_category_id, "
                                "default_internet_con) values";
    run(columns + "(91, 'Web', 9, 1, 1), (92, 'MMS', 9, 2, 1), (93, 'Share', 9, 5, 1), (94, 'IMS', 9, 0, 1), "
                  "(95, 'XCAP', 9, 7, 1), (96, 'SOS', 9, 6, 1)");
    EXPECT_THAT(verified_lines("[Spec][ProfBrowser]"), ElementsAre("+[Spec][ProfBrowser] Spec='Web',Phone='Web'"));
    EXPECT_THAT(verified_lines("[Spec][ProfMMS]"), ElementsAre("+[Spec][ProfMMS] Spec='MMS',Phone='MMS'"));
    EXPECT_THAT(verified_lines("[Spec][ProfIntSharing]"),
                ElementsAre("+[Spec][ProfIntSharing] Spec='Share',Phone='Share'"));
    EXPECT_THAT(verified_lines("[Spec][ProfIMS]"), ElementsAre("+[Spec][ProfIMS] Spec='IMS',Phone='IMS'"));
    EXPECT_THAT(verified_lines("[Spec][ProfXCAP]"), ElementsAre("+[Spec][ProfXCAP] Spec='XCAP',Phone='XCAP'"));
    EXPECT_THAT(verified_lines("[Spec][ProfEmergencyImsCall]"),
                ElementsAre("+[Spec][ProfEmergencyImsCall] Spec='SOS',Phone='SOS'"));

    // Only a profile that is the default of its category serves it.
    run("update pdp_profile set default_internet_con=0 where profile_id in (91, 96)");
    run("update pdp_profile set profile_name='Other' where profile_id=94");
    EXPECT_THAT(verified_lines("[Spec][ProfBrowser]"), ElementsAre("-[Spec][ProfBrowser] Spec='Web',Phone=''"));
    EXPECT_THAT(verified_lines("[Spec][ProfIMS]"), ElementsAre("-[Spec][ProfIMS] Spec='IMS',Phone='Other'"));
    EXPECT_THAT(verified_lines("[Spec][ProfMMS]"), ElementsAre("+[Spec][ProfMMS] Spec='MMS',Phone='MMS'"));
    EXPECT_THAT(verified_lines("[Spec][ProfEmergencyImsCall]"),
                ElementsAre("-[Spec][ProfEmergencyImsCall] Spec='SOS',Phone=''"));
}

TEST_F(VerifyConnections, ProfileIsComparedWithItsRow) {
    run("update pdp_profile set profile_name='Net', auth_type=2, apn='own', is_static_ip_addr=1, dns_addr2='10.0.0.1'");
    EXPECT_THAT(
        verified_lines("[Spec][Profile1"),
        ElementsAre(
            "-[Spec][Profile1/ProfileName] Spec='Web',Phone='Net'", "-[Spec][Profile1/Auth] Spec='',Phone='secure'",
            "+[Spec][Profile1/UserId] Spec='',Phone=''", "+[Spec][Profile1/Password] Spec='',Phone=''",
            "-[Spec][Profile1/APN] Spec='',Phone='own'", "+[Spec][Profile1/URL] Spec='',Phone=''",
            "+[Spec][Profile1/Proxy/ServAddr] Spec='',Phone=''", "+[Spec][Profile1/Proxy/Port] Spec='',Phone=''",
            "-[Spec][Profile1/StaticIP/EnableFlag] Spec='',Phone='on'",
            "+[Spec][Profile1/StaticIP/IPAddr] Spec='',Phone=''",
            "+[Spec][Profile1/DNS/EnableFlag] Spec='',Phone='off'", "+[Spec][Profile1/DNS/IPAddr1] Spec='',Phone=''",
            "-[Spec][Profile1/DNS/IPAddr2] Spec='',Phone='10.0.0.1'"));
}

// Both keep what was installed in records of their own; their rows are not looked at.
TEST_F(VerifyConnections, DormancyAndLimitsAreComparedWithTheirRecords) {
    run("delete from fast_dormancy");
    run("delete from max_pdp");
    EXPECT_THAT(verified_lines("[Spec][FastDormancy"),
                ElementsAre("+[Spec][FastDormancy/NbFastDormancy] Spec='1',Phone='1'",
                            "+[Spec][FastDormancy1/EnableStatus] Spec='on',Phone='on'",
                            "+[Spec][FastDormancy1/LCDStatus] Spec='on',Phone='on'",
                            "+[Spec][FastDormancy1/TimeOut] Spec='2.5',Phone='2.5'",
                            "+[Spec][FastDormancy1/Version] Spec='rel8',Phone='rel8'"));
    EXPECT_THAT(verified_lines("[Spec][MaxPDP"), ElementsAre("+[Spec][MaxPDP1/MaxPDP2G] Spec='1',Phone='1'",
                                                             "+[Spec][MaxPDP1/MaxPDP3G] Spec='2',Phone='2'"));

    replace_in("fast-dormancy", "enable_1                       = 1", "enable_1 = 0");
    replace_in("fast-dormancy", "time_out_1", "time_out_8");
    replace_in("max-pdp", "max_pdp_2g_1                   = 1", "max_pdp_2g_1 = 4");
    replace_in("max-pdp", "max_pdp_3g_1", "max_pdp_3g_8");
    EXPECT_THAT(verified_lines("[Spec][FastDormancy"),
                ElementsAre("+[Spec][FastDormancy/NbFastDormancy] Spec='1',Phone='1'",
                            "-[Spec][FastDormancy1/EnableStatus] Spec='on',Phone='off'",
                            "+[Spec][FastDormancy1/LCDStatus] Spec='on',Phone='on'",
                            "-[Spec][FastDormancy1/TimeOut] Spec='2.5',Phone=''",
                            "+[Spec][FastDormancy1/Version] Spec='rel8',Phone='rel8'"));
    EXPECT_THAT(verified_lines("[Spec][MaxPDP"), ElementsAre("-[Spec][MaxPDP1/MaxPDP2G] Spec='1',Phone='4'",
                                                             "-[Spec][MaxPDP1/MaxPDP3G] Spec='2',Phone=''"));
}
