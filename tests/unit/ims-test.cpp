#include "operator-items.h"
#include "support/bench-phone.h"
#include "support/spec-text.h"

#include <gmock/gmock.h>

namespace zel_test {

using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;
using testing::StartsWith;

namespace {

std::string element(const std::string &tag, const std::string &content) {
    return "<" + tag + ">" + content + "</" + tag + ">";
}
std::string setting(const std::string &network, const std::string &children) {
    return element("Setting", element("NetworkName", network) + children);
}
std::string ims(const std::string &settings) { return element("IMSSetting", settings); }

// The one value by which entries are told from each other.
std::string joyn(const std::string &text) { return element("RCS", element("Joyn", text)); }

constexpr const char *kFreedEntry = "<WARN>[Mem] free(gpZelSvcElementActImsInfoTemp) call.";
constexpr const char *kFreedDefault = "<WARN>[Mem] free(gpZelSvcElementActImsInfoDefaultForAutoSim) call.";
constexpr const char *kPreConfiguration = "[PreConfig] IMS setting / NetworkName='default' information found.";
constexpr const char *kDefaultFound = "[AutoSIM] IMS setting / NetworkName='default' information found.";
constexpr const char *kOperatorFound = "[AutoSIM] IMS setting / NetworkName='One' information found.";
constexpr const char *kDefaultSaved =
    "[AutoSIM] IMS setting / Operator not found. NetworkName='default' information existed and saved.";
// What saving an entry of nothing but "Joyn" logs before and after it.
const std::vector<std::string> kBeforeJoyn{"<Warning>[IMS/EnableIMS] Spec='' unknown, skip.",
                                           "<Warning>[IMS/EnableVoLTE] Spec='' unknown, skip.",
                                           "<Warning>[IMS/EnableVoiceoverWIFI] Spec='' unknown, skip.",
                                           "<Warning>[IMS/EnableVideocall] Spec='' unknown, skip.",
                                           "<Warning>[IMS/EnableVoLTEindicator] Spec='' unknown, skip.",
                                           "<Warning>[IMS/SS_CSFBwithIMSerror] Spec='' unknown, skip.",
                                           "<Warning>[IMS/EnableSMSoverIP] Spec='' unknown, skip.",
                                           "<Warning>[IMS/EnableRCS] Spec='' unknown, skip."};
constexpr const char *kAfterJoyn = "<Warning>[IMS/EnableRCSchat] Spec='' unknown, skip.";

std::vector<std::string> saved_joyn(const std::string &text) {
    std::vector<std::string> lines = kBeforeJoyn;
    lines.push_back("[IMS/Joyn] rcs/joyn='" + text + "' set.");
    lines.emplace_back(kAfterJoyn);
    return lines;
}

std::vector<std::string> joined(std::vector<std::string> lines, const std::vector<std::string> &more) {
    lines.insert(lines.end(), more.begin(), more.end());
    return lines;
}

} // namespace

class Ims : public BenchPhone {
  protected:
    void SetUp() override {
        BenchPhone::SetUp();
        set_operator("One");
    }

    // The lines of this group since the last call, without the place in the source.
    std::vector<std::string> new_lines() {
        std::vector<std::string> lines;
        const std::vector<std::string> all = system_log();
        for (std::size_t i = seen_; i < all.size(); ++i) {
            EXPECT_THAT(all[i], StartsWith("zel-svc-element-act-ims.cpp: "));
            const std::size_t end_of_prefix = all[i].find(") > ");
            EXPECT_NE(end_of_prefix, std::string::npos) << all[i];
            lines.push_back(end_of_prefix == std::string::npos ? all[i] : all[i].substr(end_of_prefix + 4));
        }
        seen_ = all.size();
        return lines;
    }

    static void install_for_operator(const std::string &spec) { install_spec(spec, ZEL_SVC_PARSE_MODE_OPERATOR); }
    static std::optional<std::string> recorded_joyn(const LoadedGroup &group) { return group.text("rcs", "joyn"); }

  private:
    std::size_t seen_ = 0;
};

TEST_F(Ims, WholeEntryIsWrittenAndLoggedInTheOrderOfTheTable) {
    const LoadedGroup group{ZEL_SVC_DATA_IMS};
    install_spec(ims(element("NbSetting", "1") +
                     setting("default", "<RCS><EnableRCSchat>true</EnableRCSchat><Joyn>blackbird</Joyn>"
                                        "<EnableRCS>false</EnableRCS></RCS>"
                                        "<EnableSMSoverIP>true</EnableSMSoverIP><SMSoIP_Domain>ps</SMSoIP_Domain>"
                                        "<VoLTE><USSD_Domain_Preference>cs</USSD_Domain_Preference>"
                                        "<SS_CSFBwithIMSerror>true</SS_CSFBwithIMSerror>"
                                        "<SS_PS_Control_Preference>xcap</SS_PS_Control_Preference>"
                                        "<SS_Domain_Preference>psfirst</SS_Domain_Preference>"
                                        "<SRVCCversion>10</SRVCCversion>"
                                        "<Emregencycall_Domain>csonly</Emregencycall_Domain>"
                                        "<Voice_Domain_Preference_EUTRAN>imsps</Voice_Domain_Preference_EUTRAN>"
                                        "<EnableVoLTEindicator>false</EnableVoLTEindicator>"
                                        "<EnableVideocall>true</EnableVideocall>"
                                        "<EnableVoiceoverWIFI>false</EnableVoiceoverWIFI>"
                                        "<EnableVoLTE>true</EnableVoLTE></VoLTE>"
                                        "<EnableIMS>true</EnableIMS>")));
    EXPECT_EQ(group.text("attr", "enable_ims"), "1");
    EXPECT_EQ(group.text("volte", "enable_volte"), "1");
    EXPECT_EQ(group.text("volte", "enable_vowifi"), "0");
    EXPECT_EQ(group.text("volte", "enable_video_call"), "1");
    EXPECT_EQ(group.text("volte", "enable_indicator"), "0");
    EXPECT_EQ(group.text("volte", "voice_domain_preference"), "imsps");
    EXPECT_EQ(group.text("volte", "emergency_call_domain"), "csonly");
    EXPECT_EQ(group.text("volte", "srvcc_version"), "10");
    EXPECT_EQ(group.text("volte", "ss_domain_preference"), "psfirst");
    EXPECT_EQ(group.text("volte", "ss_ps_control_preference"), "xcap");
    EXPECT_EQ(group.text("volte", "ss_cs_fallback"), "1");
    EXPECT_EQ(group.text("volte", "ussd_domain_preference"), "cs");
    EXPECT_EQ(group.text("smsoip", "smsoip_domain"), "ps");
    EXPECT_EQ(group.text("smsoip", "enable_smsoip"), "1");
    EXPECT_EQ(group.text("rcs", "enable_rcs"), "0");
    EXPECT_EQ(group.text("rcs", "joyn"), "blackbird");
    EXPECT_EQ(group.text("rcs", "enable_rcs_chat"), "1");
    EXPECT_THAT(new_lines(),
                ElementsAre(kPreConfiguration, "[IMS/EnableIMS] attr/enable_ims=1 set.",
                            "[IMS/EnableVoLTE] volte/enable_volte=1 set.",
                            "[IMS/EnableVoiceoverWIFI] volte/enable_vowifi=0 set.",
                            "[IMS/EnableVideocall] volte/enable_video_call=1 set.",
                            "[IMS/EnableVoLTEindicator] volte/enable_indicator=0 set.",
                            "[IMS/Voice_Domain_Preference_EUTRAN] volte/voice_domain_preference='imsps' set.",
                            "[IMS/Emregencycall_Domain] volte/emergency_call_domain='csonly' set.",
                            "[IMS/SRVCCversion] volte/srvcc_version=10 set.",
                            "[IMS/SS_Domain_Preference] volte/ss_domain_preference='psfirst' set.",
                            "[IMS/SS_PS_Control_Preference] volte/ss_ps_control_preference='xcap' set.",
                            "[IMS/SS_CSFBwithIMSerror] volte/ss_cs_fallback=1 set.",
                            "[IMS/USSD_Domain_Preference] volte/ussd_domain_preference='cs' set.",
                            "[IMS/SMSoIP_Domain] smsoip/smsoip_domain='ps' set.",
                            "[IMS/EnableSMSoverIP] smsoip/enable_smsoip=1 set.",
                            "[IMS/EnableRCS] rcs/enable_rcs=0 set.", "[IMS/Joyn] rcs/joyn='blackbird' set.",
                            "[IMS/EnableRCSchat] rcs/enable_rcs_chat=1 set."));
}

TEST_F(Ims, EmptyEntryWarnsOfEachBooleanAndWritesNothing) {
    const LoadedGroup group{ZEL_SVC_DATA_IMS};
    install_spec(ims(setting("default", "")));
    EXPECT_EQ(new_lines(), joined(joined({kPreConfiguration}, kBeforeJoyn), {kAfterJoyn}));
    for (const char *section : {"attr", "volte", "smsoip", "rcs"})
        EXPECT_EQ(zel_svc_data_find(ZEL_SVC_DATA_IMS, section, nullptr), 0) << section;
}

TEST_F(Ims, BooleansAreExactWords) {
    const std::pair<const char *, std::pair<const char *, const char *>> booleans[] = {
        {"EnableIMS", {"attr", "enable_ims"}},
        {"EnableVoLTE", {"volte", "enable_volte"}},
        {"EnableVoiceoverWIFI", {"volte", "enable_vowifi"}},
        {"EnableVideocall", {"volte", "enable_video_call"}},
        {"EnableVoLTEindicator", {"volte", "enable_indicator"}},
        {"SS_CSFBwithIMSerror", {"volte", "ss_cs_fallback"}},
        {"EnableSMSoverIP", {"smsoip", "enable_smsoip"}},
        {"EnableRCS", {"rcs", "enable_rcs"}},
        {"EnableRCSchat", {"rcs", "enable_rcs_chat"}},
    };
    const LoadedGroup group{ZEL_SVC_DATA_IMS};
    for (const auto &[tag, entry] : booleans) {
        install_spec(ims(setting("default", element(tag, "true"))));
        for (const char *text : {"True", "FALSE", "false ", "0", "on", "truee"}) {
            new_lines();
            install_spec(ims(setting("default", element(tag, text))));
            EXPECT_EQ(group.text(entry.first, entry.second), "1") << tag << " " << text;
            EXPECT_THAT(new_lines(), testing::Contains("<Warning>[IMS/" + std::string{tag} + "] Spec='" + text +
                                                       "' unknown, skip."));
        }
        install_spec(ims(setting("default", element(tag, "false"))));
        EXPECT_EQ(group.text(entry.first, entry.second), "0") << tag;
    }
}

TEST_F(Ims, VersionIsADecimalNumber) {
    const LoadedGroup group{ZEL_SVC_DATA_IMS};
    const auto version = [](const char *text) { return ims(setting("default", element("SRVCCversion", text))); };
    install_spec(version("011x"));
    EXPECT_EQ(group.text("volte", "srvcc_version"), "11");
    install_spec(version("none"));
    EXPECT_EQ(group.text("volte", "srvcc_version"), "0");
    EXPECT_THAT(new_lines(), testing::Contains("[IMS/SRVCCversion] volte/srvcc_version=0 set."));
    install_spec(version("99999999999"));
    EXPECT_EQ(group.text("volte", "srvcc_version"), "2147483647");
    new_lines();
    install_spec(version(""));
    EXPECT_EQ(group.text("volte", "srvcc_version"), "2147483647");
    EXPECT_THAT(new_lines(), testing::Not(testing::Contains(HasSubstr("SRVCCversion"))));
}

TEST_F(Ims, AbsentTextsLeaveWhatIsRecorded) {
    const LoadedGroup group{ZEL_SVC_DATA_IMS};
    install_spec(ims(setting("default", joyn("old"))));
    install_spec(ims(setting("default", joyn(""))));
    EXPECT_EQ(recorded_joyn(group), "old");
}

TEST_F(Ims, LongTextsAreCut) {
    const LoadedGroup group{ZEL_SVC_DATA_IMS};
    install_spec(ims(setting("default", joyn(std::string(198, 'j') + "é"))));
    EXPECT_EQ(recorded_joyn(group), std::string(198, 'j'));
}

TEST_F(Ims, PreConfigurationTakesTheDefaultOnly) {
    const LoadedGroup group{ZEL_SVC_DATA_IMS};
    install_spec(ims(setting("One", joyn("one")) + setting("Default", joyn("capital")) + setting("", joyn("none"))));
    EXPECT_EQ(recorded_joyn(group), std::nullopt);
    EXPECT_THAT(new_lines(), IsEmpty());
    install_spec(ims(setting("One", joyn("one")) + setting("default", joyn("any")) + setting("Two", joyn("two"))));
    EXPECT_EQ(recorded_joyn(group), "any");
    EXPECT_EQ(new_lines(), joined({kPreConfiguration}, saved_joyn("any")));
}

TEST_F(Ims, OperatorsEntryWinsBehindTheDefault) {
    const LoadedGroup group{ZEL_SVC_DATA_IMS};
    install_for_operator(ims(setting("default", joyn("any")) + setting("One", joyn("one"))));
    EXPECT_EQ(recorded_joyn(group), "one");
    EXPECT_EQ(new_lines(), joined({kDefaultFound, kOperatorFound}, saved_joyn("one")));
}

TEST_F(Ims, OperatorsEntryWinsBeforeTheDefault) {
    const LoadedGroup group{ZEL_SVC_DATA_IMS};
    install_for_operator(ims(setting("One", joyn("one")) + setting("default", joyn("any"))));
    EXPECT_EQ(recorded_joyn(group), "one");
    EXPECT_EQ(new_lines(), joined(joined({kOperatorFound}, saved_joyn("one")), {kDefaultFound}));
}

TEST_F(Ims, DefaultIsSavedOnceForAnOperatorWithoutEntry) {
    const LoadedGroup group{ZEL_SVC_DATA_IMS};
    install_for_operator(ims(setting("Two", joyn("two")) + setting("default", joyn("any")) + setting("", joyn("no"))));
    EXPECT_EQ(recorded_joyn(group), "any");
    EXPECT_EQ(new_lines(), joined({kDefaultFound, kDefaultSaved}, saved_joyn("any")));
}

TEST_F(Ims, WithoutEitherNothingIsSaved) {
    const LoadedGroup group{ZEL_SVC_DATA_IMS};
    install_for_operator(ims(setting("Two", joyn("two"))));
    EXPECT_EQ(recorded_joyn(group), std::nullopt);
    EXPECT_THAT(new_lines(), IsEmpty());
}

TEST_F(Ims, SecondDefaultTakesThePlaceOfTheFirst) {
    const LoadedGroup group{ZEL_SVC_DATA_IMS};
    install_for_operator(ims(setting("default", joyn("first")) + setting("default", joyn("second"))));
    EXPECT_EQ(recorded_joyn(group), "second");
    EXPECT_EQ(new_lines(), joined({kDefaultFound, kDefaultFound, kFreedDefault, kDefaultSaved}, saved_joyn("second")));
}

TEST_F(Ims, OperatorOfOneGroupIsForgottenInTheNext) {
    const LoadedGroup group{ZEL_SVC_DATA_IMS};
    install_for_operator(ims(setting("One", joyn("one"))) + ims(setting("default", joyn("any"))));
    EXPECT_EQ(recorded_joyn(group), "any");
}

TEST_F(Ims, AutoFlagsDoNotMatter) {
    const LoadedGroup group{ZEL_SVC_DATA_IMS};
    gbZelSvcNetworkAutoFlags.fill(1);
    install_spec(ims(setting("default", joyn("any"))));
    EXPECT_EQ(recorded_joyn(group), "any");
    install_for_operator(ims(setting("One", joyn("one"))));
    EXPECT_EQ(recorded_joyn(group), "one");
}

TEST_F(Ims, OperatorWithoutNameGetsTheDefault) {
    const LoadedGroup group{ZEL_SVC_DATA_IMS};
    set_operator("");
    install_for_operator(ims(setting("", joyn("nobody")) + setting("default", joyn("any"))));
    EXPECT_EQ(recorded_joyn(group), "any");
}

TEST_F(Ims, OtherModesSaveNothing) {
    const LoadedGroup group{ZEL_SVC_DATA_IMS};
    for (const ZelSvcParseMode mode : kModesWithoutItems) {
        install_spec(ims(setting("default", joyn("any")) + setting("One", joyn("one"))), mode);
        EXPECT_EQ(recorded_joyn(group), std::nullopt) << mode;
    }
    EXPECT_THAT(new_lines(), IsEmpty());
}

TEST_F(Ims, EntryLeftOpenIsFreedByTheNext) {
    const LoadedGroup group{ZEL_SVC_DATA_IMS};
    install_spec("<IMSSetting><Setting><NetworkName>default</NetworkName><EnableIMS>true</EnableIMS><broken");
    EXPECT_THAT(new_lines(), IsEmpty());
    install_spec(ims(setting("default", joyn("any"))));
    EXPECT_EQ(group.text("attr", "enable_ims"), std::nullopt);
    EXPECT_EQ(new_lines(), joined({kFreedEntry, kPreConfiguration}, saved_joyn("any")));
}

TEST_F(Ims, DefaultLeftBehindIsFreedByTheNextOperatorInstall) {
    const LoadedGroup group{ZEL_SVC_DATA_IMS};
    install_for_operator("<IMSSetting>" + setting("default", joyn("old")) + "<broken");
    EXPECT_THAT(new_lines(), ElementsAre(kDefaultFound));
    install_spec(ims(setting("default", "")));
    EXPECT_THAT(new_lines(), testing::Not(testing::Contains(kFreedDefault)));
    install_for_operator(ims(setting("Two", joyn("two"))));
    EXPECT_THAT(new_lines(), ElementsAre(kFreedDefault));
    EXPECT_EQ(recorded_joyn(group), std::nullopt);
}

TEST_F(Ims, ValuesOutsideAnEntryDoNothing) {
    const LoadedGroup group{ZEL_SVC_DATA_IMS};
    install_spec(ims(joyn("lost") + setting("default", "")));
    EXPECT_EQ(recorded_joyn(group), std::nullopt);
}

TEST_F(Ims, VerificationAndExportDoNothing) {
    const LoadedGroup group{ZEL_SVC_DATA_IMS};
    const std::string spec = ims(setting("default", joyn("any")) + setting("One", joyn("one")));
    for (const ZelSvcParseMode mode :
         {ZEL_SVC_PARSE_MODE_PARTIAL, ZEL_SVC_PARSE_MODE_FULL, ZEL_SVC_PARSE_MODE_OPERATOR})
        EXPECT_THAT(verify_spec(spec, mode), IsEmpty());
    export_start(ZEL_SVC_ELEMENT_IMS_SETTING);
    export_start(ZEL_SVC_ELEMENT_IMS_SETTING_SETTING);
    EXPECT_EQ(export_value(ZEL_SVC_ELEMENT_JOYN), "");
    export_end(ZEL_SVC_ELEMENT_IMS_SETTING_SETTING);
    export_end(ZEL_SVC_ELEMENT_IMS_SETTING);
    EXPECT_THAT(new_lines(), IsEmpty());
    EXPECT_EQ(recorded_joyn(group), std::nullopt);
}

} // namespace zel_test
