#include "recorded-options.h"

#include "zel-svc-element-act-active-sync.h"
#include "zel-svc-element-act-email.h"

#include <gmock/gmock.h>

#include <algorithm>
#include <set>

namespace zel_test {

using testing::IsEmpty;

namespace {

constexpr ZelSvcParseMode kModes[] = {ZEL_SVC_PARSE_MODE_FULL,          ZEL_SVC_PARSE_MODE_PARTIAL,
                                      ZEL_SVC_PARSE_MODE_CUSTOMER_LIST, ZEL_SVC_PARSE_MODE_SECURITY_LOCK,
                                      ZEL_SVC_PARSE_MODE_OPERATOR_LIST, ZEL_SVC_PARSE_MODE_OPERATOR,
                                      ZEL_SVC_PARSE_MODE_HEADER};

std::set<ZelSvcElementId> elements_of(std::span<const Setting> settings) {
    std::set<ZelSvcElementId> elements;
    for (const Setting &setting : settings)
        elements.insert(setting.element);
    return elements;
}

std::set<ZelSvcElementId> elements_of(std::span<const ExpectedOption> options) {
    std::set<ZelSvcElementId> elements;
    for (const ExpectedOption &option : options)
        elements.insert(option.element);
    return elements;
}

} // namespace

TEST_P(RecordedOption, EachTextIsRecorded) {
    for (const RecordedText &text : GetParam().texts) {
        const LoadedGroup group{GetParam().group};
        install_spec(spec(text.text));
        EXPECT_EQ(recorded(group), text.recorded) << text.text;
    }
    if (!GetParam().texts.empty()) return;
    for (const std::string text : {"Sent by me", "08:00", "0", "on ", "Grüße"}) {
        const LoadedGroup group{GetParam().group};
        install_spec(spec(text));
        EXPECT_EQ(recorded(group), text);
    }
}

TEST_P(RecordedOption, OtherTextsLeaveNoTrace) {
    const LoadedGroup group{GetParam().group};
    std::vector<std::string> others{""};
    for (const RecordedText &text : GetParam().texts) {
        std::string capital{text.text};
        capital.front() = static_cast<char>(std::toupper(capital.front()));
        if (capital != text.text) others.push_back(capital);
        others.insert(others.end(), {std::string{text.text} + " ", std::string{text.text} + "x", "?"});
    }
    for (const std::string &other : others) {
        install_spec(spec(other));
        EXPECT_EQ(recorded(group), std::nullopt) << other;
    }
}

TEST_P(RecordedOption, OtherTextKeepsWhatIsRecorded) {
    if (GetParam().texts.empty()) return;
    const LoadedGroup group{GetParam().group};
    install_spec(spec(one_text().text));
    install_spec(spec("?") + spec("") + spec(std::string{one_text().text} + " "));
    EXPECT_EQ(recorded(group), one_text().recorded);
}

TEST_P(RecordedOption, LastTextWins) {
    const LoadedGroup group{GetParam().group};
    install_spec(spec("before") + spec(one_text().text));
    for (const RecordedText &text : GetParam().texts) {
        install_spec(spec(one_text().text) + spec(text.text));
        EXPECT_EQ(recorded(group), text.recorded);
    }
    install_spec(spec(one_text().text));
    EXPECT_EQ(recorded(group), one_text().recorded);
}

TEST_P(RecordedOption, ModeDoesNotMatter) {
    for (const ZelSvcParseMode mode : kModes) {
        const LoadedGroup group{GetParam().group};
        install_spec(spec(one_text().text), mode);
        EXPECT_EQ(recorded(group), one_text().recorded) << mode;
    }
}

TEST_P(RecordedOption, VerificationAndExportSayNothing) {
    const LoadedGroup group{GetParam().group};
    EXPECT_THAT(verify_spec(spec(one_text().text)), IsEmpty());
    EXPECT_EQ(recorded(group), std::nullopt);
    install_spec(spec(one_text().text));
    EXPECT_THAT(verify_spec(spec(one_text().text)), IsEmpty());
    EXPECT_EQ(export_value(GetParam().element), "");
    EXPECT_EQ(recorded(group), one_text().recorded);
}

TEST_P(RecordedOption, NoKeyOfThePhoneIsWritten) {
    const nlohmann::json before = call("vconf-list");
    const LoadedGroup group{GetParam().group};
    install_spec(spec(one_text().text));
    EXPECT_EQ(recorded(group), one_text().recorded);
    EXPECT_EQ(call("vconf-list"), before);
}

TEST_P(RecordedOption, WithoutItsGroupNothingHappens) {
    install_spec(spec(one_text().text));
    const LoadedGroup group{GetParam().group};
    EXPECT_EQ(recorded(group), std::nullopt);
}

INSTANTIATE_TEST_SUITE_P(Email, RecordedOption, testing::ValuesIn(kEmailOptions), recorded_option_name);
INSTANTIATE_TEST_SUITE_P(ActiveSync, RecordedOption, testing::ValuesIn(kActiveSyncOptions), recorded_option_name);

TEST(RecordedOptions, EveryRowHasItsTests) {
    EXPECT_EQ(elements_of(zel_svc_email_settings()), elements_of(kEmailOptions));
    std::set<ZelSvcElementId> tested = elements_of(kActiveSyncOptions);
    tested.insert(ZEL_SVC_ELEMENT_ROAMING_SETTING);
    EXPECT_EQ(elements_of(zel_svc_active_sync_settings()), tested);
}

class EmailLimit : public BenchPhone {};

TEST_F(EmailLimit, OtherSizesAreIgnored) {
    const LoadedGroup group{ZEL_SVC_DATA_EMAIL};
    for (const char *text : {"100", "0300", "300k", "30", "3000"}) {
        install_spec("<EmailReceiving><RecLimit>" + std::string{text} + "</RecLimit></EmailReceiving>");
        EXPECT_EQ(group.text("email", "recv_limit_size"), std::nullopt) << text;
    }
}

class ActiveSyncRoaming : public BenchPhone {
  protected:
    static std::string roaming(const std::string &text) {
        return "<ActiveSync><RoamingSetting>" + text + "</RoamingSetting></ActiveSync>";
    }
};

TEST_F(ActiveSyncRoaming, ManualAloneIsZero) {
    const LoadedGroup group{ZEL_SVC_DATA_ACTIVE_SYNC};
    install_spec(roaming("manual"));
    EXPECT_EQ(group.text("general", "roaming"), "0");
    for (const char *text : {"push", "Manual", "manual ", "manua", "manuals", "0", "off"}) {
        install_spec(roaming("manual"));
        install_spec(roaming(text));
        EXPECT_EQ(group.text("general", "roaming"), "1") << text;
    }
}

TEST_F(ActiveSyncRoaming, EmptyElementRecordsNothing) {
    const LoadedGroup group{ZEL_SVC_DATA_ACTIVE_SYNC};
    install_spec(roaming(""));
    EXPECT_EQ(group.text("general", "roaming"), std::nullopt);
}

TEST_F(ActiveSyncRoaming, IsNeitherVerifiedNorExported) {
    const LoadedGroup group{ZEL_SVC_DATA_ACTIVE_SYNC};
    EXPECT_THAT(verify_spec(roaming("push")), IsEmpty());
    EXPECT_EQ(group.text("general", "roaming"), std::nullopt);
    install_spec(roaming("push"));
    EXPECT_EQ(export_value(ZEL_SVC_ELEMENT_ROAMING_SETTING), "");
}

// Elements of the same name belong to different groups by what they stand in.
class SharedTags : public BenchPhone {};

TEST_F(SharedTags, SignatureBelongsToItsParent) {
    const LoadedGroup email{ZEL_SVC_DATA_EMAIL};
    const LoadedGroup active_sync{ZEL_SVC_DATA_ACTIVE_SYNC};
    install_spec("<EmailSending><Signature>mail</Signature></EmailSending>"
                 "<ActiveSync><Signature>sync</Signature></ActiveSync>"
                 "<MMS><Signature>lost</Signature></MMS>");
    EXPECT_EQ(email.text("email", "send_signature"), "mail");
    EXPECT_EQ(active_sync.text("general", "signature"), "sync");
}

TEST_F(SharedTags, PriorityOfMessagesIsNotThatOfMail) {
    const LoadedGroup email{ZEL_SVC_DATA_EMAIL};
    install_spec("<MmsSending><Priority>high</Priority></MmsSending>");
    EXPECT_EQ(email.text("email", "send_priority"), std::nullopt);
}

} // namespace zel_test
