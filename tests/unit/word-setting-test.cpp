#include "setting-groups.h"
#include "word-setting.h"

#include <gmock/gmock.h>

#include <algorithm>

namespace zel_test {

using testing::ElementsAre;
using testing::IsEmpty;

namespace {

// Texts that are near a word and none: other letters, longer, shorter.
std::vector<std::string> texts_near(const ExpectedWord &word) {
    std::string capital{word.text};
    std::transform(capital.begin(), capital.end(), capital.begin(), ::toupper);
    std::vector<std::string> texts{capital + "X", std::string{word.text} + " ", std::string{word.text} + "x",
                                   std::string{word.text.substr(0, 1)}};
    if (capital != word.text) texts.push_back(capital);
    return texts;
}

} // namespace

TEST_P(WordSetting, EachWordIsStoredAndRecorded) {
    for (const ExpectedWord &word : GetParam().words) {
        const LoadedGroup group{GetParam().group};
        install_spec(spec(word.text));
        for (const char *key : GetParam().keys)
            if (key) {
                EXPECT_EQ(stored(key), word.number) << key << " of " << word.text;
            }
        for (const ExpectedRecord &record : GetParam().records)
            if (record.key) {
                EXPECT_EQ(group.text(record.section, record.key), std::to_string(word.number));
            }
    }
}

TEST_P(WordSetting, OtherTextsChangeNothing) {
    const LoadedGroup group{GetParam().group};
    for (const ExpectedWord &word : GetParam().words)
        for (const std::string &text : texts_near(word))
            install_spec(spec(text));
    install_spec(spec(""));
    install_spec(spec("1"));
    expect_nothing_written(group);
}

TEST_P(WordSetting, OtherTextsAreNotVerified) {
    store(1);
    for (const char *text : {"", "1", "On", "ON", "on ", "Enable", "24H", "YYYYMMDD"})
        EXPECT_THAT(verify_spec(spec(text)), IsEmpty()) << text;
    for (const ExpectedWord &word : GetParam().words)
        for (const std::string &text : texts_near(word))
            EXPECT_THAT(verify_spec(spec(text)), IsEmpty()) << text;
}

TEST_P(WordSetting, EqualValuePassesAndOthersFail) {
    for (const ExpectedWord &in_spec : GetParam().words)
        for (const ExpectedWord &on_phone : GetParam().words) {
            store(on_phone.number);
            EXPECT_THAT(verify_spec(spec(in_spec.text)),
                        ElementsAre(ResultLine{line(in_spec.text, on_phone.text), in_spec.text == on_phone.text}));
        }
}

TEST_P(WordSetting, UnreadableValueFailsOrIsLeftOut) {
    make_unreadable();
    const std::string_view text = GetParam().words[0].text;
    const std::vector<ResultLine> line_of_unknown{failed(line(text, "??"))};
    EXPECT_EQ(verify_spec(spec(text)), GetParam().unreadable_adds_line ? line_of_unknown : std::vector<ResultLine>{});
}

TEST_P(WordSetting, AbsentValueIsUnreadable) {
    const std::string_view text = GetParam().words[0].text;
    EXPECT_EQ(verify_spec(spec(text)).size(), GetParam().unreadable_adds_line ? 1U : 0U);
}

TEST_P(WordSetting, ValueOutsideTheWordsFails) {
    if (GetParam().is_boolean) {
        // A boolean key holds 0 or 1 only; the nearest foreign value is a number.
        set_int(GetParam().keys[0], 5);
        EXPECT_EQ(verify_spec(spec(GetParam().words[0].text)).size(), GetParam().unreadable_adds_line ? 1U : 0U);
        return;
    }
    store(5);
    const std::string_view text = GetParam().words[0].text;
    EXPECT_THAT(verify_spec(spec(text)), ElementsAre(failed(line(text, "??"))));
}

TEST_P(WordSetting, VerificationWritesNothing) {
    const LoadedGroup group{GetParam().group};
    verify_spec(spec(GetParam().words[0].text));
    expect_nothing_written(group);
}

TEST_P(WordSetting, RefusedFirstKeyStopsTheSetting) {
    const LoadedGroup group{GetParam().group};
    fail(setter(), GetParam().keys[0]);
    install_spec(spec(GetParam().words[0].text));
    expect_nothing_written(group);
}

TEST_P(WordSetting, RefusedSecondKeyKeepsItOffTheRecord) {
    const LoadedGroup group{GetParam().group};
    const char *second = GetParam().keys[1] ? GetParam().keys[1] : GetParam().keys[0];
    fail(setter(), second);
    install_spec(spec(GetParam().words[0].text));
    if (GetParam().keys[1]) {
        EXPECT_EQ(stored(GetParam().keys[0]), GetParam().words[0].number);
    }
    EXPECT_EQ(stored(second), std::nullopt);
    if (!GetParam().recorded_after_first_key) expect_nothing_recorded(group);
}

TEST_P(WordSetting, EachStoredValueIsExported) {
    for (const ExpectedWord &word : GetParam().words) {
        const LoadedGroup group{GetParam().group};
        install_spec(spec(word.text));
        EXPECT_EQ(export_value(GetParam().element), word.text);
    }
}

TEST_P(WordSetting, ExportFollowsThePhoneNotTheRecord) {
    const LoadedGroup group{GetParam().group};
    install_spec(spec(GetParam().words[0].text));
    store(GetParam().words[1].number);
    EXPECT_EQ(export_value(GetParam().element), GetParam().words[1].text);
}

TEST_P(WordSetting, UnrecordedSettingIsExportedOnlyWhereNoRecordIsKept) {
    const LoadedGroup group{GetParam().group};
    store(GetParam().words[0].number);
    const std::string_view expected = GetParam().exported_when_recorded_only ? "" : GetParam().words[0].text;
    EXPECT_EQ(export_value(GetParam().element), expected);
}

TEST_P(WordSetting, UnreadableValueIsExportedAsUnknownWhereRecorded) {
    const LoadedGroup group{GetParam().group};
    install_spec(spec(GetParam().words[0].text));
    make_unreadable();
    EXPECT_EQ(export_value(GetParam().element), GetParam().exported_when_recorded_only ? "??" : "");
}

TEST_P(WordSetting, ModeDoesNotMatter) {
    for (const ZelSvcParseMode mode : {ZEL_SVC_PARSE_MODE_PARTIAL, ZEL_SVC_PARSE_MODE_OPERATOR}) {
        store(GetParam().words[1].number);
        install_spec(spec(GetParam().words[0].text), mode);
        EXPECT_EQ(stored(GetParam().keys[0]), GetParam().words[0].number);
        EXPECT_EQ(verify_spec(spec(GetParam().words[0].text), mode).size(), 1U);
    }
}

TEST_P(WordSetting, RowNamesTheAcceptedWords) {
    const Setting *row = setting_row(GetParam().element);
    ASSERT_NE(row, nullptr);
    ASSERT_EQ(row->accepts.words.size(), GetParam().words.size());
    for (std::size_t i = 0; i < row->accepts.words.size(); ++i) {
        EXPECT_EQ(row->accepts.words[i].text, GetParam().words[i].text);
        EXPECT_EQ(row->accepts.words[i].value, GetParam().words[i].number);
    }
}

} // namespace zel_test
