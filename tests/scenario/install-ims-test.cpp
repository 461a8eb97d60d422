// The IMS settings, which every install that reads the customer's file records, once for each SIM.

#include "service-phone.h"

#include <gmock/gmock.h>

namespace {

using ::testing::ContainsRegex;

class InstallIms : public zel_test::ServicePhone {
  protected:
    void write_ims(const std::string &joyn) {
        write_customer("BTU",
                       "<Settings><Main><Network><AutoProfile>on</AutoProfile><AutoVoicemail>on</AutoVoicemail>"
                       "<AutoEmailAccount>on</AutoEmailAccount><AutoBookmark>on</AutoBookmark>"
                       "<AutoFastDormancy>on</AutoFastDormancy><AutoWbAmr>on</AutoWbAmr><AutoMaxPDP>on</AutoMaxPDP>"
                       "</Network></Main><IMSSetting><Setting><NetworkName>default</NetworkName><RCS><Joyn>" +
                           joyn + "</Joyn></RCS></Setting></IMSSetting></Settings>");
    }

    void expect_recorded(const std::string &group, const std::string &joyn) {
        EXPECT_THAT(read(data_path(group)), ContainsRegex("joyn += \"" + joyn + "\"\n")) << group;
    }
};

struct InstallImsOfTwoSims : InstallIms {
    InstallImsOfTwoSims() { create_arguments["sims"] = 2; }
};

} // namespace

TEST_F(InstallIms, IsRecordedByAnUpgradeWhateverTheFlags) {
    write_ims("first");
    zel_svc_config_install_customer("BTU", ZEL_SVC_INSTALL_CONFIG_MODE);
    expect_recorded("ims", "first");
    write_ims("second");
    zel_svc_config_install_customer("BTU", ZEL_SVC_INSTALL_NORMAL_BOOTING);
    expect_recorded("ims", "second");
    EXPECT_FALSE(exists(data_path("ims-2")));
}

TEST_F(InstallImsOfTwoSims, IsRecordedForTheSecondFromTheSameCustomersFile) {
    write_ims("first");
    zel_svc_config_install_customer("BTU", ZEL_SVC_INSTALL_CONFIG_MODE);
    expect_recorded("ims", "first");
    expect_recorded("ims-2", "first");
    write_ims("second");
    zel_svc_config_install_customer("BTU", ZEL_SVC_INSTALL_NORMAL_BOOTING);
    expect_recorded("ims", "second");
    expect_recorded("ims-2", "second");
}
