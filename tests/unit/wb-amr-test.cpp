#include "operator-items.h"
#include "support/bench-phone.h"
#include "support/spec-text.h"

#include <gmock/gmock.h>

namespace zel_test {

using testing::ElementsAre;
using testing::IsEmpty;

namespace {

constexpr const char *kSwitch = "db/zel/network/wb_amr_codec";

std::string codec(const std::string &text) { return "<WbAmrCodec>" + text + "</WbAmrCodec>"; }
std::string wb_amr(const std::string &network, const std::string &text) {
    return "<WbAmr><NetworkName>" + network + "</NetworkName>" + codec(text) + "</WbAmr>";
}
std::string count(const std::string &text) { return "<NbWbAmr>" + text + "</NbWbAmr>"; }

std::optional<std::string> mirror(const LoadedGroup &group) { return group.text("wb_amr", "codec"); }

} // namespace

class WbAmr : public BenchPhone {
  protected:
    void SetUp() override {
        BenchPhone::SetUp();
        set_operator("One");
    }
};

TEST_F(WbAmr, OnAndOffAreStoredAndMirrored) {
    const LoadedGroup group{ZEL_SVC_DATA_WB_AMR};
    install_spec(wb_amr("One", "on"));
    EXPECT_EQ(get_int(kSwitch), 1);
    EXPECT_EQ(mirror(group), "1");
    install_spec(wb_amr("One", "off"));
    EXPECT_EQ(get_int(kSwitch), 0);
    EXPECT_EQ(mirror(group), "0");
}

TEST_F(WbAmr, CountSwitchesOffAndMirrorsNothing) {
    const LoadedGroup group{ZEL_SVC_DATA_WB_AMR};
    for (const char *text : {"2", "0", "on", "many"}) {
        set_int(kSwitch, 1);
        install_spec(count(text));
        EXPECT_EQ(get_int(kSwitch), 0) << text;
        EXPECT_EQ(mirror(group), std::nullopt);
    }
}

TEST_F(WbAmr, CountSwitchesOffWhateverModeAndFlag) {
    for (const ZelSvcParseMode mode : {ZEL_SVC_PARSE_MODE_FULL, ZEL_SVC_PARSE_MODE_OPERATOR})
        for (const int flag : {0, 1}) {
            set_auto_flag(ZEL_SVC_AUTO_WB_AMR, flag);
            set_int(kSwitch, 1);
            install_spec(count("1"), mode);
            EXPECT_EQ(get_int(kSwitch), 0);
        }
}

TEST_F(WbAmr, LastOneOfAFullInstallWinsWhateverItsNetwork) {
    const LoadedGroup group{ZEL_SVC_DATA_WB_AMR};
    install_spec(count("2") + wb_amr("One", "on") + wb_amr("Two", "off"));
    EXPECT_EQ(get_int(kSwitch), 0);
    EXPECT_EQ(mirror(group), "0");
    install_spec(count("2") + wb_amr("One", "off") + wb_amr("", "on"));
    EXPECT_EQ(get_int(kSwitch), 1);
    EXPECT_EQ(mirror(group), "1");
}

TEST_F(WbAmr, OtherTextsAreNeitherAppliedNorVerified) {
    const LoadedGroup group{ZEL_SVC_DATA_WB_AMR};
    for (const char *text : {"ON", "On", "on ", "Off", "1", ""}) {
        install_spec(wb_amr("One", text));
        EXPECT_EQ(get_int(kSwitch), std::nullopt) << text;
        EXPECT_EQ(mirror(group), std::nullopt) << text;
        EXPECT_THAT(verify_spec(wb_amr("One", text)), IsEmpty()) << text;
    }
}

TEST_F(WbAmr, OtherTextTakesThePlaceOfAnEarlierOne) {
    install_spec("<WbAmr>" + codec("on") + codec("ON") + "</WbAmr>");
    EXPECT_EQ(get_int(kSwitch), std::nullopt);
    install_spec("<WbAmr>" + codec("ON") + codec("on") + "</WbAmr>");
    EXPECT_EQ(get_int(kSwitch), 1);
}

TEST_F(WbAmr, IsDecidedAtTheEndOfTheElement) {
    install_spec("<WbAmr>" + codec("on") + "<broken");
    EXPECT_EQ(get_int(kSwitch), std::nullopt);
    install_spec("<WbAmr><NetworkName>One</NetworkName></WbAmr>");
    EXPECT_EQ(get_int(kSwitch), std::nullopt);
    install_spec(codec("on"));
    EXPECT_EQ(get_int(kSwitch), std::nullopt);
}

TEST_F(WbAmr, RefusedKeyLeavesTheMirror) {
    const LoadedGroup group{ZEL_SVC_DATA_WB_AMR};
    install_spec(wb_amr("One", "off"));
    fail("vconf_set_int", kSwitch);
    install_spec(wb_amr("One", "on"));
    EXPECT_EQ(get_int(kSwitch), 0);
    EXPECT_EQ(mirror(group), "0");
}

TEST_F(WbAmr, FullInstallLeavesTheSimsOut) {
    const LoadedGroup group{ZEL_SVC_DATA_WB_AMR};
    set_auto_flag(ZEL_SVC_AUTO_WB_AMR, 1);
    install_spec(wb_amr("One", "on"));
    EXPECT_EQ(get_int(kSwitch), std::nullopt);
    EXPECT_EQ(mirror(group), std::nullopt);
}

TEST_F(WbAmr, OperatorInstallTakesTheOperatorsOnly) {
    const LoadedGroup group{ZEL_SVC_DATA_WB_AMR};
    set_auto_flag(ZEL_SVC_AUTO_WB_AMR, 1);
    install_spec(wb_amr("Two", "on") + wb_amr("default", "on") + wb_amr("", "on"), ZEL_SVC_PARSE_MODE_OPERATOR);
    EXPECT_EQ(get_int(kSwitch), std::nullopt);
    install_spec(wb_amr("One", "on") + wb_amr("Two", "off"), ZEL_SVC_PARSE_MODE_OPERATOR);
    EXPECT_EQ(get_int(kSwitch), 1);
    EXPECT_EQ(mirror(group), "1");
}

TEST_F(WbAmr, OperatorInstallNeedsTheFlag) {
    install_spec(wb_amr("One", "on"), ZEL_SVC_PARSE_MODE_OPERATOR);
    EXPECT_EQ(get_int(kSwitch), std::nullopt);
}

TEST_F(WbAmr, OtherModesInstallNone) {
    for (const int flag : {0, 1})
        for (const ZelSvcParseMode mode : kModesWithoutItems) {
            set_auto_flag(ZEL_SVC_AUTO_WB_AMR, flag);
            install_spec(wb_amr("One", "on"), mode);
            EXPECT_EQ(get_int(kSwitch), std::nullopt) << mode;
        }
}

TEST_F(WbAmr, VerificationComparesEachCodecWithTheSwitch) {
    set_int(kSwitch, 1);
    EXPECT_THAT(verify_spec(wb_amr("One", "on") + wb_amr("Two", "off")),
                ElementsAre(passed("[Network/WbAmrCodec] Spec='on',Phone='on'"),
                            failed("[Network/WbAmrCodec] Spec='off',Phone='on'")));
    set_int(kSwitch, 0);
    EXPECT_THAT(verify_spec(count("1") + wb_amr("One", "off")),
                ElementsAre(passed("[Network/WbAmrCodec] Spec='off',Phone='off'")));
    EXPECT_EQ(get_int(kSwitch), 0);
}

TEST_F(WbAmr, OtherValuesOfTheSwitchAreUnknown) {
    const auto unknown = ElementsAre(failed("[Network/WbAmrCodec] Spec='on',Phone='?\?'"));
    EXPECT_THAT(verify_spec(wb_amr("One", "on")), unknown);
    set_int(kSwitch, 2);
    EXPECT_THAT(verify_spec(wb_amr("One", "on")), unknown);
    set_string(kSwitch, "on");
    EXPECT_THAT(verify_spec(wb_amr("One", "on")), unknown);
}

TEST_F(WbAmr, TheSimsCodecIsNotVerified) {
    set_int(kSwitch, 1);
    set_auto_flag(ZEL_SVC_AUTO_WB_AMR, 1);
    EXPECT_THAT(verify_spec(wb_amr("One", "on")), IsEmpty());
}

TEST_F(WbAmr, VerificationWritesNothing) {
    const LoadedGroup group{ZEL_SVC_DATA_WB_AMR};
    verify_spec(count("1") + wb_amr("One", "on"));
    EXPECT_EQ(get_int(kSwitch), std::nullopt);
    EXPECT_EQ(mirror(group), std::nullopt);
}

TEST_F(WbAmr, ExportFollowsThePhoneWhereMirrored) {
    const LoadedGroup group{ZEL_SVC_DATA_WB_AMR};
    set_int(kSwitch, 1);
    EXPECT_EQ(export_value(ZEL_SVC_ELEMENT_WB_AMR_CODEC), "");
    install_spec(wb_amr("One", "on"));
    EXPECT_EQ(export_value(ZEL_SVC_ELEMENT_WB_AMR_CODEC), "on");
    set_int(kSwitch, 0);
    EXPECT_EQ(export_value(ZEL_SVC_ELEMENT_WB_AMR_CODEC), "off");
    set_int(kSwitch, 7);
    EXPECT_EQ(export_value(ZEL_SVC_ELEMENT_WB_AMR_CODEC), "??");
    EXPECT_EQ(export_value(ZEL_SVC_ELEMENT_NB_WB_AMR), "");
}

} // namespace zel_test
