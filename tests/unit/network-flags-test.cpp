#include "support/bench-phone.h"
#include "support/spec-text.h"

#include <gmock/gmock.h>

#include <array>

namespace zel_test {

using testing::ElementsAre;
using testing::IsEmpty;

namespace {

constexpr const char *kEnabled = "db/private/zel/sim_auto_enable";
using Flags = std::array<std::int32_t, 10>;

// In the order of the flags.
constexpr const char *kFlagTags[] = {"AutoProfile", "AutoVoicemail", "AutoEmailAccount", "AutoBookmark", "AutoLink",
                                     "AutoSyncML",  "AutoFOTA",      "AutoFastDormancy", "AutoWbAmr",    "AutoMaxPDP"};

std::string leaf(const std::string &tag, const std::string &text) { return "<" + tag + ">" + text + "</" + tag + ">"; }
std::string network(const std::string &children) { return "<Network>" + children + "</Network>"; }

Flags all(std::int32_t value) {
    Flags flags;
    flags.fill(value);
    return flags;
}

} // namespace

class AutoFlags : public BenchPhone {};

TEST_F(AutoFlags, EachElementSetsItsOwnFlag) {
    for (std::size_t i = 0; i < std::size(kFlagTags); ++i) {
        gbZelSvcNetworkAutoFlags.fill(0);
        install_spec(network(leaf(kFlagTags[i], "on")));
        Flags expected{};
        expected.at(i) = 1;
        EXPECT_EQ(gbZelSvcNetworkAutoFlags, expected) << kFlagTags[i];
        install_spec(network(leaf(kFlagTags[i], "off")));
        EXPECT_EQ(gbZelSvcNetworkAutoFlags, all(0)) << kFlagTags[i];
    }
}

TEST_F(AutoFlags, VerificationReadsThemToo) {
    EXPECT_THAT(verify_spec(network(leaf("AutoBookmark", "on"))), IsEmpty());
    EXPECT_EQ(gbZelSvcNetworkAutoFlags[3], 1);
    verify_spec(network(leaf("AutoBookmark", "off")));
    EXPECT_EQ(gbZelSvcNetworkAutoFlags[3], 0);
}

TEST_F(AutoFlags, OtherTextsKeepTheFlag) {
    for (const char *text : {"On", "ON", "on ", "1", "yes"}) {
        gbZelSvcNetworkAutoFlags.fill(0);
        install_spec(network(leaf("AutoProfile", text)));
        EXPECT_EQ(gbZelSvcNetworkAutoFlags[0], 0) << text;
    }
    gbZelSvcNetworkAutoFlags.fill(1);
    install_spec(network(leaf("AutoProfile", "OFF") + leaf("AutoLink", "")));
    EXPECT_EQ(gbZelSvcNetworkAutoFlags, all(1));
}

TEST_F(AutoFlags, AreClearedAtTheStartInModesThatOnlyRead) {
    for (const auto mode : {ZEL_SVC_PARSE_MODE_CUSTOMER_LIST, ZEL_SVC_PARSE_MODE_SECURITY_LOCK,
                            ZEL_SVC_PARSE_MODE_OPERATOR_LIST, ZEL_SVC_PARSE_MODE_OPERATOR, ZEL_SVC_PARSE_MODE_HEADER}) {
        gbZelSvcNetworkAutoFlags.fill(1);
        install_spec(network(leaf("AutoLink", "on")), mode);
        EXPECT_EQ(gbZelSvcNetworkAutoFlags, (Flags{0, 0, 0, 0, 1, 0, 0, 0, 0, 0})) << mode;
        gbZelSvcNetworkAutoFlags.fill(1);
        verify_spec(network(""), mode);
        EXPECT_EQ(gbZelSvcNetworkAutoFlags, all(0)) << mode;
    }
}

TEST_F(AutoFlags, StayInFullInstallAndVerification) {
    for (const auto mode : {ZEL_SVC_PARSE_MODE_FULL, ZEL_SVC_PARSE_MODE_PARTIAL}) {
        gbZelSvcNetworkAutoFlags.fill(1);
        install_spec(network(leaf("AutoLink", "off")), mode);
        EXPECT_EQ(gbZelSvcNetworkAutoFlags, (Flags{1, 1, 1, 1, 0, 1, 1, 1, 1, 1})) << mode;
    }
}

TEST_F(AutoFlags, StayOverADocumentWithoutNetwork) {
    gbZelSvcNetworkAutoFlags.fill(1);
    install_spec("<Settings></Settings>", ZEL_SVC_PARSE_MODE_HEADER);
    EXPECT_EQ(gbZelSvcNetworkAutoFlags, all(1));
}

TEST_F(AutoFlags, ExportLeavesThem) {
    gbZelSvcNetworkAutoFlags.fill(1);
    export_start(ZEL_SVC_ELEMENT_NETWORK);
    EXPECT_EQ(export_value(ZEL_SVC_ELEMENT_AUTO_PROFILE), "");
    export_end(ZEL_SVC_ELEMENT_NETWORK);
    EXPECT_EQ(gbZelSvcNetworkAutoFlags, all(1));
    EXPECT_EQ(get_int(kEnabled), std::nullopt);
}

TEST_F(AutoFlags, AnyOneTurnsSimAutoSettingOnExceptEmailAccounts) {
    for (std::size_t i = 0; i < std::size(kFlagTags); ++i) {
        gbZelSvcNetworkAutoFlags.fill(0);
        install_spec(network(leaf(kFlagTags[i], "on")));
        EXPECT_EQ(get_int(kEnabled), i == 2 ? 0 : 1) << kFlagTags[i];
    }
}

TEST_F(AutoFlags, NoneTurnsSimAutoSettingOff) {
    set_int(kEnabled, 1);
    install_spec(network(""));
    EXPECT_EQ(get_int(kEnabled), 0);
}

TEST_F(AutoFlags, OnlyAFullInstallDecidesSimAutoSetting) {
    for (const auto mode : {ZEL_SVC_PARSE_MODE_PARTIAL, ZEL_SVC_PARSE_MODE_OPERATOR, ZEL_SVC_PARSE_MODE_HEADER})
        install_spec(network(leaf("AutoProfile", "on")), mode);
    verify_spec(network(leaf("AutoProfile", "on")), ZEL_SVC_PARSE_MODE_FULL);
    EXPECT_EQ(get_int(kEnabled), std::nullopt);
}

TEST_F(AutoFlags, PacketSwitchOfFiveFails) {
    set_int("db/zel/network/ps_auto_attach", 5);
    EXPECT_THAT(verify_spec(network(leaf("AutoAttach", "on"))),
                ElementsAre(failed("[Network/AutoAttach] Spec='on',Phone='?\?'")));
}

} // namespace zel_test
