// The section store in memory: what is set, read, found and removed.
#include "spec/zel-svc-data.h"

#include "support/files-phone.h"

namespace {

using ::testing::HasSubstr;
using zel_test::FilesPhone;

class Data : public FilesPhone {
  protected:
    void SetUp() override {
        FilesPhone::SetUp();
        zel_svc_data_load(kGroup, 0, 1);
    }
    static constexpr int kGroup = 20;
};

TEST_F(Data, IntegersAreReadBack) {
    for (const int value : {0, 1, -1, 2147483647, -2147483647 - 1}) {
        zel_svc_data_set_int(kGroup, "gps", "n", value);
        EXPECT_EQ(zel_svc_data_get_int(kGroup, "gps", "n", 99), value);
        EXPECT_EQ(zel_svc_data_get_str(kGroup, "gps", "n"), std::to_string(value));
    }
}

TEST_F(Data, StringsOfThisRunStillHaveTheirQuotes) {
    zel_svc_data_set_str(kGroup, "gps", "plain", "on");
    zel_svc_data_set_str(kGroup, "gps", "double", "5\" wide");
    zel_svc_data_set_str(kGroup, "gps", "both", "\"it's\"");
    EXPECT_STREQ(zel_svc_data_get_str(kGroup, "gps", "plain"), "\"on\"");
    EXPECT_STREQ(zel_svc_data_get_str(kGroup, "gps", "double"), "'5\" wide'");
    EXPECT_STREQ(zel_svc_data_get_str(kGroup, "gps", "both"), "\"'it's'\"");
    EXPECT_EQ(zel_svc_data_get_text(kGroup, "gps", "plain"), "on");
    EXPECT_EQ(zel_svc_data_get_text(kGroup, "gps", "double"), "5\" wide");
    EXPECT_EQ(zel_svc_data_get_text(kGroup, "gps", "both"), "'it's'");
}

TEST_F(Data, AnEmptyStringHasNoQuotes) {
    zel_svc_data_set_str(kGroup, "gps", "empty", "");
    EXPECT_STREQ(zel_svc_data_get_str(kGroup, "gps", "empty"), "");
    EXPECT_EQ(zel_svc_data_get_text(kGroup, "gps", "empty"), "");
    EXPECT_NE(zel_svc_data_find(kGroup, "gps", "empty"), 0);
    EXPECT_EQ(zel_svc_data_get_int(kGroup, "gps", "empty", 7), 0);
}

TEST_F(Data, AStringIsNoInteger) {
    zel_svc_data_set_str(kGroup, "gps", "n", "12");
    EXPECT_EQ(zel_svc_data_get_int(kGroup, "gps", "n", 7), 0) << "it begins with a quote";
}

TEST_F(Data, AbsentEntriesReadAsTheDefault) {
    zel_svc_data_set_int(kGroup, "gps", "n", 1);
    EXPECT_EQ(zel_svc_data_get_int(kGroup, "gps", "other", 7), 7);
    EXPECT_EQ(zel_svc_data_get_int(kGroup, "other", "n", 7), 7);
    EXPECT_EQ(zel_svc_data_get_str(kGroup, "gps", "other"), nullptr);
    EXPECT_EQ(zel_svc_data_get_text(kGroup, "gps", "other"), "");
    EXPECT_EQ(zel_svc_data_find(kGroup, "gps", "other"), 0);
    EXPECT_EQ(zel_svc_data_find(kGroup, "gps", "n"), 1);
}

TEST_F(Data, NamesDoNotTellCase) {
    zel_svc_data_set_int(kGroup, "Gps", "Key", 1);
    zel_svc_data_set_int(kGroup, "GPS", "KEY", 2);
    EXPECT_EQ(zel_svc_data_get_int(kGroup, "gps", "key", 7), 2);
    zel_svc_data_unset(kGroup, "gPS", "kEY");
    EXPECT_EQ(zel_svc_data_find(kGroup, "Gps", "Key"), 0);
}

TEST_F(Data, ALaterValueReplacesAnEarlierOfAnyKind) {
    zel_svc_data_set_str(kGroup, "gps", "k", "text");
    zel_svc_data_set_int(kGroup, "gps", "k", 5);
    EXPECT_EQ(zel_svc_data_get_text(kGroup, "gps", "k"), "5");
    zel_svc_data_set_str(kGroup, "gps", "k", "'x'");
    EXPECT_EQ(zel_svc_data_get_text(kGroup, "gps", "k"), "'x'");
}

TEST_F(Data, UnsetRemovesOneKey) {
    zel_svc_data_set_int(kGroup, "gps", "a", 1);
    zel_svc_data_set_int(kGroup, "gps", "ab", 2);
    zel_svc_data_unset(kGroup, "gps", "a");
    zel_svc_data_unset(kGroup, "gps", "absent");
    EXPECT_EQ(zel_svc_data_find(kGroup, "gps", "a"), 0);
    EXPECT_EQ(zel_svc_data_get_int(kGroup, "gps", "ab", 7), 2);
}

TEST_F(Data, UnsetWithoutAKeyRemovesTheWholeSectionAndNoOther) {
    zel_svc_data_set_int(kGroup, "gps", "a", 1);
    zel_svc_data_set_int(kGroup, "gps2", "a", 2);
    zel_svc_data_set_int(kGroup, "GPS", "b", 3);
    zel_svc_data_unset(kGroup, "gps", nullptr);
    EXPECT_EQ(zel_svc_data_find(kGroup, "gps", "a"), 0);
    EXPECT_EQ(zel_svc_data_find(kGroup, "gps", "b"), 0);
    EXPECT_EQ(zel_svc_data_get_int(kGroup, "gps2", "a", 7), 2);
    zel_svc_data_set_int(kGroup, "gps", "c", 4);
    EXPECT_EQ(zel_svc_data_get_int(kGroup, "gps", "c", 7), 4);
    EXPECT_EQ(zel_svc_data_find(kGroup, "gps", "a"), 0);
}

TEST_F(Data, AnUnloadedGroupLosesWritesAndReadsTheDefault) {
    zel_svc_data_set_int(kGroup, "gps", "n", 1);
    zel_svc_data_free(kGroup);
    EXPECT_EQ(zel_svc_data_get_int(kGroup, "gps", "n", 7), 7);
    zel_svc_data_set_int(kGroup, "gps", "n", 2);
    zel_svc_data_set_str(kGroup, "gps", "s", "x\ny");
    zel_svc_data_unset(kGroup, "gps", "n");
    zel_svc_data_unset(kGroup, "gps", nullptr);
    EXPECT_EQ(zel_svc_data_get_int(kGroup, "gps", "n", 7), 7);
    EXPECT_EQ(zel_svc_data_get_str(kGroup, "gps", "s"), nullptr);
    EXPECT_EQ(zel_svc_data_get_text(kGroup, "gps", "s"), "");
    EXPECT_EQ(zel_svc_data_find(kGroup, "gps", "n"), 0);
    zel_svc_data_free(kGroup);
    EXPECT_TRUE(system_log().empty()) << "a string that is lost anyway is no reason to warn";
}

TEST_F(Data, GroupsDoNotShareEntries) {
    for (int group = 0; group < 22; ++group)
        zel_svc_data_load(group, 0, 1);
    for (int group = 0; group < 22; ++group)
        zel_svc_data_set_int(group, "s", "k", group);
    for (int group = 0; group < 22; ++group)
        EXPECT_EQ(zel_svc_data_get_int(group, "s", "k", 99), group);
}

TEST_F(Data, OtherIndexesAreTheMainGroup) {
    zel_svc_data_load(22, 0, 1);
    zel_svc_data_set_int(-1, "s", "k", 5);
    EXPECT_EQ(zel_svc_data_get_int(0, "s", "k", 99), 5);
    zel_svc_data_free(1000);
    EXPECT_EQ(zel_svc_data_get_int(0, "s", "k", 99), 99);
}

TEST_F(Data, NullAndEmptyNamesAreNobodys) {
    zel_svc_data_set_int(kGroup, nullptr, "k", 1);
    zel_svc_data_set_int(kGroup, "s", nullptr, 1);
    zel_svc_data_set_int(kGroup, "", "k", 1);
    zel_svc_data_set_int(kGroup, "s", "", 1);
    zel_svc_data_set_str(kGroup, nullptr, "k", "x");
    zel_svc_data_set_str(kGroup, "s", nullptr, "x");
    EXPECT_EQ(zel_svc_data_find(kGroup, nullptr, "k"), 0);
    EXPECT_EQ(zel_svc_data_find(kGroup, "s", nullptr), 0);
    EXPECT_EQ(zel_svc_data_find(kGroup, "", "k"), 0);
    EXPECT_EQ(zel_svc_data_find(kGroup, "s", ""), 0);
    EXPECT_EQ(zel_svc_data_get_int(kGroup, nullptr, nullptr, 7), 7);
    EXPECT_EQ(zel_svc_data_get_str(kGroup, nullptr, nullptr), nullptr);
    zel_svc_data_unset(kGroup, nullptr, nullptr);
    zel_svc_data_unset(kGroup, "", nullptr);
    zel_svc_data_unset(kGroup, "s", "");
}

TEST_F(Data, StringsAreCutAt255BytesAndAWholeCharacter) {
    zel_svc_data_set_str(kGroup, "s", "fits", std::string(255, 'a'));
    zel_svc_data_set_str(kGroup, "s", "long", std::string(256, 'a'));
    zel_svc_data_set_str(kGroup, "s", "umlaut", std::string(254, 'a') + "\xc3\xa4");
    zel_svc_data_set_str(kGroup, "s", "zero", std::string_view{"ab\0cd", 5});
    EXPECT_EQ(zel_svc_data_get_str(kGroup, "s", "fits"), "\"" + std::string(255, 'a') + "\"");
    EXPECT_EQ(zel_svc_data_get_text(kGroup, "s", "long"), std::string(255, 'a'));
    EXPECT_EQ(zel_svc_data_get_text(kGroup, "s", "umlaut"), std::string(254, 'a'));
    EXPECT_EQ(zel_svc_data_get_text(kGroup, "s", "zero"), "ab");
}

TEST_F(Data, NamesAreCutAt100Bytes) {
    const std::string key(98, 'k'); // with "s:" 100 bytes
    zel_svc_data_set_int(kGroup, "s", key.c_str(), 1);
    EXPECT_EQ(zel_svc_data_get_int(kGroup, "s", (key + "1").c_str(), 7), 1);
    zel_svc_data_set_int(kGroup, "s", (key + "2").c_str(), 2);
    EXPECT_EQ(zel_svc_data_get_int(kGroup, "s", key.c_str(), 7), 2) << "names that are cut alike are one entry";
    EXPECT_EQ(zel_svc_data_find(kGroup, "s", key.substr(1).c_str()), 0);
    zel_svc_data_set_int(kGroup, "s", (std::string(97, 'u') + "\xc3\xa4").c_str(), 3);
    EXPECT_EQ(zel_svc_data_get_int(kGroup, "s", std::string(97, 'u').c_str(), 7), 3);
}

TEST_F(Data, ASectionThatLeavesNoRoomForAKeyHasNone) {
    for (const std::size_t size : {99U, 100U, 101U, 5000U}) {
        const std::string section(size, 's');
        zel_svc_data_set_int(kGroup, section.c_str(), "k", 1);
        zel_svc_data_set_str(kGroup, section.c_str(), "k", "x");
        EXPECT_EQ(zel_svc_data_get_int(kGroup, section.c_str(), "k", 7), 7) << size;
        EXPECT_EQ(zel_svc_data_get_str(kGroup, section.c_str(), "k"), nullptr) << size;
        EXPECT_EQ(zel_svc_data_find(kGroup, section.c_str(), "k"), 0) << size;
        zel_svc_data_unset(kGroup, section.c_str(), "k");
        zel_svc_data_unset(kGroup, section.c_str(), nullptr);
    }
    const std::string section(98, 's');
    zel_svc_data_set_int(kGroup, section.c_str(), "k", 1);
    EXPECT_EQ(zel_svc_data_get_int(kGroup, section.c_str(), "key", 7), 1);
}

TEST_F(Data, ALineFeedBecomesABlankWithOneWarningForEachValue) {
    zel_svc_data_set_str(kGroup, "gps", "note", "a\nb\n\nc");
    EXPECT_EQ(zel_svc_data_get_text(kGroup, "gps", "note"), "a b  c");
    zel_svc_data_set_str(kGroup, "gps", "fine", "no line feed");
    zel_svc_data_set_str(kGroup, "other", "end", std::string(255, 'x') + "\n");
    const std::vector<std::string> log = system_log();
    ASSERT_EQ(log.size(), 1U);
    EXPECT_THAT(log[0],
                ::testing::MatchesRegex("zel-svc-data\\.cpp: zel_svc_data_set_str\\([0-9]+\\) > <Warning>.*\n"));
    EXPECT_THAT(log[0], HasSubstr("'gps'"));
    EXPECT_THAT(log[0], HasSubstr("'note'"));
}

TEST_F(Data, TextsStayWhereTheyAreWhileOthersComeAndGo) {
    zel_svc_data_set_str(kGroup, "s", "kept", "value");
    const char *text = zel_svc_data_get_str(kGroup, "s", "kept");
    for (int i = 0; i < 5000; ++i)
        zel_svc_data_set_int(kGroup, "s", std::to_string(i).c_str(), i);
    for (int i = 0; i < 5000; i += 2)
        zel_svc_data_unset(kGroup, "s", std::to_string(i).c_str());
    EXPECT_STREQ(text, "\"value\"");
    EXPECT_EQ(zel_svc_data_get_int(kGroup, "s", "4999", 7), 4999);
    EXPECT_EQ(zel_svc_data_get_int(kGroup, "s", "4998", 7), 7);
}

} // namespace
