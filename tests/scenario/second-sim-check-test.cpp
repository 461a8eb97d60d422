// A phone with two SIM slots is verified and exported by what the first SIM has.

#include "service-phone.h"

#include "support/sqlite-file.h"

#include <gmock/gmock.h>

namespace {

using ::testing::Contains;
using ::testing::HasSubstr;
using ::testing::Not;
using ::testing::StartsWith;

constexpr const char *kFile =
    "<GeneralInfo><SalesCode>BTU</SalesCode><NetworkInfo><MCCMNC>00101</MCCMNC><NetworkName>First</NetworkName>"
    "</NetworkInfo></GeneralInfo><Settings><Main><Network>"
    "<NbMaxPDP>1</NbMaxPDP><MaxPDP><NetworkName>First</NetworkName><MaxPDP3G>3</MaxPDP3G></MaxPDP>"
    "<NbFastDormancy>1</NbFastDormancy><FastDormancy><NetworkName>First</NetworkName>"
    "<FastDormancyEnableStatus>on</FastDormancyEnableStatus><TimeoutValue>5</TimeoutValue><LCDStatus>on</LCDStatus>"
    "</FastDormancy></Network></Main><Connections><NbProfile>1</NbProfile><Profile><NetworkName>First</NetworkName>"
    "<ProfileName>Web</ProfileName><PSparam><APN>internet</APN></PSparam></Profile></Connections></Settings>";

struct SecondSim : zel_test::ServicePhone {
    SecondSim() { create_arguments["sims"] = 2; }

    void SetUp() override {
        ServicePhone::SetUp();
        set_string("db/zel/salescode", "BTU");
        write_customer("BTU", kFile);
    }

    // Leaves the second SIM's database chosen.
    void install(ZelSvcInstallKind kind) {
        zel_svc_config_install_customer("BTU", kind);
        const zel_test::SqliteFile networks{root() + "/opt/dbspace/.dnet2.db"};
        ASSERT_EQ(networks.rows("select apn from pdp_profile"), (zel_test::SqliteRows{{"internet"}}));
        for (const char *table : {"pdp_profile", "network_info", "fast_dormancy", "max_pdp"})
            networks.run(std::string{"delete from "} + table);
        for (const char *group : {"connection", "fast-dormancy", "max-pdp"})
            write(data_path(std::string{group} + "-2"), "");
    }
};

} // namespace

TEST_F(SecondSim, IsNotVerifiedBehindItsInstall) {
    install(ZEL_SVC_INSTALL_CONFIG_MODE);
    const std::vector<std::string> lines = verified_lines();
    for (const char *line :
         {"+[Spec][MaxPDP1/MaxPDP3G] Spec='3',Phone='3'", "+[Spec][FastDormancy1/TimeOut] Spec='5',Phone='5'",
          "+[Spec][Profile1/APN] Spec='internet',Phone='internet'"})
        EXPECT_THAT(lines, Contains(line));
    EXPECT_THAT(lines, Not(Contains(StartsWith("-"))));
}

TEST_F(SecondSim, IsNotExportedBehindItsUpgrade) {
    install(ZEL_SVC_INSTALL_NORMAL_BOOTING);
    EXPECT_EQ(zel_svc_config_encoding_xml(), 1);
    const std::string document = read("/opt/system/zel-default/output/customer-phone.xml");
    EXPECT_THAT(document, HasSubstr("<MaxPDP3G>3</MaxPDP3G>\n"));
    EXPECT_THAT(document, HasSubstr("<TimeoutValue>5</TimeoutValue>\n"));
    EXPECT_THAT(document, HasSubstr("<APN>internet</APN>\n"));
}
