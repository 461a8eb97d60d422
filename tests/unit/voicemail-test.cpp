#include "operator-items.h"
#include "support/bench-phone.h"
#include "support/spec-text.h"

#include <gmock/gmock.h>

namespace zel_test {

using testing::IsEmpty;

namespace {

std::string voicemail(const std::string &network, const std::string &name, const std::string &number) {
    return "<Voicemail><NetworkName>" + network + "</NetworkName><VoicemailName>" + name + "</VoicemailName><TelNum>" +
           number + "</TelNum></Voicemail>";
}

std::optional<std::string> recorded(const LoadedGroup &group, const char *key) { return group.text("voice_mail", key); }

} // namespace

class Voicemail : public BenchPhone {
  protected:
    void SetUp() override {
        BenchPhone::SetUp();
        set_operator("One");
    }
};

TEST_F(Voicemail, EntriesAreNumberedFromOne) {
    const LoadedGroup group{ZEL_SVC_DATA_VOICE_MAIL};
    install_spec("<Messages>" + voicemail("One", "Mailbox", "3311") + voicemail("Two", "Box", "+49171") +
                 "</Messages>");
    EXPECT_EQ(recorded(group, "count"), "2");
    EXPECT_EQ(recorded(group, "name_1"), "Mailbox");
    EXPECT_EQ(recorded(group, "tel_num_1"), "3311");
    EXPECT_EQ(recorded(group, "name_2"), "Box");
    EXPECT_EQ(recorded(group, "tel_num_2"), "+49171");
    EXPECT_EQ(recorded(group, "name_3"), std::nullopt);
}

TEST_F(Voicemail, LaterParseGoesOnBehindTheRecordedCount) {
    const LoadedGroup group{ZEL_SVC_DATA_VOICE_MAIL};
    install_spec(voicemail("One", "First", "1"));
    install_spec(voicemail("One", "Second", "2"));
    EXPECT_EQ(recorded(group, "count"), "2");
    EXPECT_EQ(recorded(group, "name_1"), "First");
    EXPECT_EQ(recorded(group, "name_2"), "Second");
}

TEST_F(Voicemail, FullInstallLeavesTheSimsEntriesOut) {
    const LoadedGroup group{ZEL_SVC_DATA_VOICE_MAIL};
    set_auto_flag(ZEL_SVC_AUTO_VOICEMAIL, 1);
    install_spec(voicemail("One", "Mailbox", "3311"));
    EXPECT_EQ(recorded(group, "count"), std::nullopt);
    EXPECT_EQ(recorded(group, "name_1"), std::nullopt);
}

TEST_F(Voicemail, OperatorInstallTakesTheOperatorsEntriesOnly) {
    const LoadedGroup group{ZEL_SVC_DATA_VOICE_MAIL};
    set_auto_flag(ZEL_SVC_AUTO_VOICEMAIL, 1);
    install_spec(voicemail("Two", "two", "2") + voicemail("One", "one", "1") + voicemail("default", "any", "3") +
                     voicemail("", "none", "4") + voicemail("one", "small", "5"),
                 ZEL_SVC_PARSE_MODE_OPERATOR);
    EXPECT_EQ(recorded(group, "count"), "1");
    EXPECT_EQ(recorded(group, "name_1"), "one");
    EXPECT_EQ(recorded(group, "tel_num_1"), "1");
}

TEST_F(Voicemail, OperatorInstallNeedsTheFlag) {
    const LoadedGroup group{ZEL_SVC_DATA_VOICE_MAIL};
    install_spec(voicemail("One", "one", "1"), ZEL_SVC_PARSE_MODE_OPERATOR);
    EXPECT_EQ(recorded(group, "count"), std::nullopt);
}

TEST_F(Voicemail, OperatorWithoutNameHasNoEntries) {
    const LoadedGroup group{ZEL_SVC_DATA_VOICE_MAIL};
    set_operator("");
    set_auto_flag(ZEL_SVC_AUTO_VOICEMAIL, 1);
    install_spec(voicemail("", "one", "1"), ZEL_SVC_PARSE_MODE_OPERATOR);
    EXPECT_EQ(recorded(group, "count"), std::nullopt);
}

TEST_F(Voicemail, OtherModesInstallNone) {
    const LoadedGroup group{ZEL_SVC_DATA_VOICE_MAIL};
    for (const int flag : {0, 1})
        for (const ZelSvcParseMode mode : kModesWithoutItems) {
            set_auto_flag(ZEL_SVC_AUTO_VOICEMAIL, flag);
            install_spec(voicemail("One", "one", "1"), mode);
            EXPECT_EQ(recorded(group, "count"), std::nullopt) << mode;
        }
}

TEST_F(Voicemail, AbsentValuesAreStoredEmpty) {
    const LoadedGroup group{ZEL_SVC_DATA_VOICE_MAIL};
    install_spec(voicemail("One", "Mailbox", "3311") + voicemail("One", "Box", "") + "<Voicemail></Voicemail>");
    EXPECT_EQ(recorded(group, "count"), "3");
    EXPECT_EQ(recorded(group, "name_2"), "Box");
    EXPECT_EQ(recorded(group, "tel_num_2"), "");
    EXPECT_EQ(recorded(group, "name_3"), "");
    EXPECT_EQ(recorded(group, "tel_num_3"), "");
}

TEST_F(Voicemail, LongTextsAreCut) {
    const LoadedGroup group{ZEL_SVC_DATA_VOICE_MAIL};
    install_spec(voicemail("One", std::string(250, 'n'), std::string(198, '1') + "é"));
    EXPECT_EQ(recorded(group, "name_1"), std::string(199, 'n'));
    EXPECT_EQ(recorded(group, "tel_num_1"), std::string(198, '1'));
}

TEST_F(Voicemail, NetworkNamesAreCutAlike) {
    const LoadedGroup group{ZEL_SVC_DATA_VOICE_MAIL};
    set_operator(std::string(45, 'o'));
    set_auto_flag(ZEL_SVC_AUTO_VOICEMAIL, 1);
    install_spec(voicemail(std::string(45, 'o'), "one", "1"), ZEL_SVC_PARSE_MODE_OPERATOR);
    install_spec(voicemail(std::string(38, 'o'), "short", "1"), ZEL_SVC_PARSE_MODE_OPERATOR);
    EXPECT_EQ(recorded(group, "count"), "1");
}

TEST_F(Voicemail, EntryLeftOpenIsDroppedByTheNext) {
    const LoadedGroup group{ZEL_SVC_DATA_VOICE_MAIL};
    install_spec("<Voicemail><VoicemailName>lost</VoicemailName><TelNum>1</TelNum><broken");
    install_spec("<Voicemail><TelNum>2</TelNum></Voicemail>");
    EXPECT_EQ(recorded(group, "count"), "1");
    EXPECT_EQ(recorded(group, "name_1"), "");
    EXPECT_EQ(recorded(group, "tel_num_1"), "2");
}

TEST_F(Voicemail, ValuesOutsideAnEntryDoNothing) {
    const LoadedGroup group{ZEL_SVC_DATA_VOICE_MAIL};
    install_spec("<VoicemailName>lost</VoicemailName>" + voicemail("One", "", "1"));
    EXPECT_EQ(recorded(group, "count"), "1");
    EXPECT_EQ(recorded(group, "name_1"), "");
}

TEST_F(Voicemail, VerificationAndExportDoNothing) {
    const LoadedGroup group{ZEL_SVC_DATA_VOICE_MAIL};
    EXPECT_THAT(verify_spec(voicemail("One", "one", "1")), IsEmpty());
    EXPECT_EQ(recorded(group, "count"), std::nullopt);
    install_spec(voicemail("One", "one", "1"));
    export_start(ZEL_SVC_ELEMENT_VOICEMAIL);
    EXPECT_EQ(export_value(ZEL_SVC_ELEMENT_VOICEMAIL_NAME), "");
    EXPECT_EQ(export_value(ZEL_SVC_ELEMENT_VOICEMAIL_TEL_NUM), "");
    export_end(ZEL_SVC_ELEMENT_VOICEMAIL);
    EXPECT_EQ(recorded(group, "count"), "1");
}

} // namespace zel_test
