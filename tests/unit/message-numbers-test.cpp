// The settings of messages that take any number.

#include "support/bench-phone.h"
#include "support/spec-text.h"

#include <gmock/gmock.h>

namespace zel_test {

using testing::ElementsAre;
using testing::IsEmpty;

namespace {

struct ExpectedNumber {
    ZelSvcElementId element;
    const char *tag;
    const char *key;
    const char *section;
    const char *record;
    const char *label;

    friend void PrintTo(const ExpectedNumber &setting, std::ostream *out) { *out << setting.tag; }
};

constexpr ExpectedNumber kExpectedNumbers[] = {
    {ZEL_SVC_ELEMENT_PAGE_LIMIT, "PageLimit", "db/private/com.quorvex.message-lite/sms_page_limit", "sms", "page_limit",
     "[SMS/PageLimit]"},
    {ZEL_SVC_ELEMENT_THRESHOLD_VALUE, "ThresholdValue", "db/private/com.quorvex.message-lite/sms_mms_threshold", "sms",
     "threshold_value", "[SMS/ThresholdValue]"},
    {ZEL_SVC_ELEMENT_MAX_RECIPIENT, "MaxRecipient", "db/private/com.quorvex.message-lite/sms_recipient_count_limit",
     "sms", "max_recipient", "[SMS/MaxRecipient]"},
    {ZEL_SVC_ELEMENT_DELIVERY_CUST_TIME, "DeliveryCustTime", "db/private/msg-service/mms_send/custom_delivery", "mms",
     "send_delivery_cust_time", "[MMS/DeliveryCustTime]"},
    {ZEL_SVC_ELEMENT_MAX_RECIPIENT_MMS, "MaxRecipientMMS",
     "db/private/com.quorvex.message-lite/mms_recipient_count_limit", "mms", "send_max_recipient",
     "[MMS/MaxRecipientMMS]"},
};

} // namespace

class MessageNumber : public BenchPhone, public testing::WithParamInterface<ExpectedNumber> {
  protected:
    [[nodiscard]] static std::string spec(const std::string &text) {
        const std::string tag = GetParam().tag;
        return "<" + tag + ">" + text + "</" + tag + ">";
    }

    [[nodiscard]] static std::string line(const std::string &in_spec, const std::string &on_phone) {
        return std::string{GetParam().label} + " Spec='" + in_spec + "',Phone='" + on_phone + "'";
    }

    std::optional<int> stored() { return get_int(GetParam().key); }
    void store(int number) { set_int(GetParam().key, number); }
    static std::optional<std::string> recorded(const LoadedGroup &group) {
        return group.text(GetParam().section, GetParam().record);
    }
};

TEST_P(MessageNumber, TextsAreReadAsDecimalNumbers) {
    for (const auto &[text, number] : {std::pair{"5", 5},
                                       {"0", 0},
                                       {"05", 5},
                                       {"-3", -3},
                                       {" 7 pages", 7},
                                       {"many", 0},
                                       {"2147483648", 2147483647},
                                       {"-99999999999", -2147483647 - 1}}) {
        const LoadedGroup group{ZEL_SVC_DATA_MESSAGE};
        install_spec(spec(text));
        EXPECT_EQ(stored(), number) << text;
        EXPECT_EQ(recorded(group), std::to_string(number)) << text;
    }
}

TEST_P(MessageNumber, EmptyTextChangesNothing) {
    const LoadedGroup group{ZEL_SVC_DATA_MESSAGE};
    install_spec(spec(""));
    EXPECT_EQ(stored(), std::nullopt);
    EXPECT_EQ(recorded(group), std::nullopt);
    EXPECT_THAT(verify_spec(spec("")), IsEmpty());
}

TEST_P(MessageNumber, TextsAreComparedNotNumbers) {
    store(5);
    EXPECT_THAT(verify_spec(spec("5")), ElementsAre(passed(line("5", "5"))));
    EXPECT_THAT(verify_spec(spec("05")), ElementsAre(failed(line("05", "5"))));
    EXPECT_THAT(verify_spec(spec("5 ")), ElementsAre(failed(line("5 ", "5"))));
    EXPECT_THAT(verify_spec(spec("6")), ElementsAre(failed(line("6", "5"))));
}

TEST_P(MessageNumber, UnreadableKeyIsUnknown) {
    EXPECT_THAT(verify_spec(spec("5")), ElementsAre(failed(line("5", "??"))));
    set_string(GetParam().key, "5");
    EXPECT_THAT(verify_spec(spec("5")), ElementsAre(failed(line("5", "??"))));
}

TEST_P(MessageNumber, RefusedKeyIsNotRecorded) {
    const LoadedGroup group{ZEL_SVC_DATA_MESSAGE};
    fail("vconf_set_int", GetParam().key);
    install_spec(spec("5"));
    EXPECT_EQ(recorded(group), std::nullopt);
}

TEST_P(MessageNumber, ExportWritesThePhonesNumberWhereOneIsRecorded) {
    const LoadedGroup group{ZEL_SVC_DATA_MESSAGE};
    store(5);
    EXPECT_EQ(export_value(GetParam().element), "");
    install_spec(spec("6"));
    EXPECT_EQ(export_value(GetParam().element), "6");
    store(-7);
    EXPECT_EQ(export_value(GetParam().element), "-7");
    set_string(GetParam().key, "5");
    EXPECT_EQ(export_value(GetParam().element), "??");
}

INSTANTIATE_TEST_SUITE_P(Messages, MessageNumber, testing::ValuesIn(kExpectedNumbers),
                         [](const auto &setting) { return std::string{setting.param.tag}; });

// Edges of the settings of words.
class MessageWords : public BenchPhone {};

TEST_F(MessageWords, CharacterSetOfOneHasNoText) {
    const LoadedGroup group{ZEL_SVC_DATA_MESSAGE};
    install_spec("<CharSupport>unicode</CharSupport>");
    EXPECT_EQ(get_int("db/private/msg-service/sms_send/dcs"), 2);
    set_int("db/private/msg-service/sms_send/dcs", 1);
    EXPECT_THAT(verify_spec("<CharSupport>unicode</CharSupport>"),
                ElementsAre(failed("[SMS/CharSupport] Spec='unicode',Phone='?\?'")));
    EXPECT_EQ(export_value(ZEL_SVC_ELEMENT_CHAR_SUPPORT), "??");
}

TEST_F(MessageWords, NothingIsRestrictedAtHome) {
    install_spec("<MmsReceiving><Home>restricted</Home><Roaming>restricted</Roaming></MmsReceiving>");
    EXPECT_EQ(get_int("db/private/msg-service/mms_recv/home_network"), std::nullopt);
    EXPECT_EQ(get_int("db/private/msg-service/mms_recv/abroad_network"), 2);
    set_int("db/private/msg-service/mms_recv/home_network", 2);
    EXPECT_THAT(verify_spec("<MmsReceiving><Home>reject</Home></MmsReceiving>"),
                ElementsAre(failed("[MMS/Home] Spec='reject',Phone='?\?'")));
}

TEST_F(MessageWords, CopiesOfSmsAndMmsAreKeptApart) {
    install_spec("<SMS><KeepCopy>on</KeepCopy></SMS>");
    EXPECT_EQ(get_bool("db/private/msg-service/general/keep_copy"), true);
    EXPECT_EQ(get_bool("db/private/msg-service/mms_send/keep_copy"), std::nullopt);
    install_spec("<MMS><MmsSending><KeepCopy>off</KeepCopy></MmsSending></MMS>");
    EXPECT_EQ(get_bool("db/private/msg-service/general/keep_copy"), true);
    EXPECT_EQ(get_bool("db/private/msg-service/mms_send/keep_copy"), false);
}

TEST_F(MessageWords, ThreeWeeksAreNoExpiry) {
    install_spec("<MmsSending><Expiry>3w</Expiry></MmsSending>");
    EXPECT_EQ(get_int("db/private/msg-service/mms_send/expiry_time"), std::nullopt);
}

} // namespace zel_test
