// The section store's files: created, dumped, loaded back.
#include "spec/zel-svc-data.h"

#include "base/zel-svc-file.h"
#include "support/files-phone.h"

namespace {

using ::testing::HasSubstr;
using ::testing::Not;
using zel_test::Attributes;
using zel_test::FilesPhone;

constexpr int kGps = 20;
constexpr int kIms = 21;
constexpr const char *kGpsFile = "/opt/system/zel-default/data/zel-default-data-gps.ini";
constexpr const char *kImsFile = "/opt/system/zel-default/data/zel-default-data-ims.ini";
constexpr const char *kImsFile2 = "/opt/system/zel-default/data/zel-default-data-ims-2.ini";

class DataFile : public FilesPhone {
  protected:
    static void dump_and_load() {
        zel_svc_data_dump(kGps, 0);
        zel_svc_data_free(kGps);
        zel_svc_data_load(kGps, 0, 0);
    }

    static std::string text(const char *section, const char *key) {
        const char *found = zel_svc_data_get_str(kGps, section, key);
        return found ? found : "(absent)";
    }
};

TEST_F(DataFile, IsCreatedEmptyWithItsAttributes) {
    write(kGpsFile, "[gps]\nold = 1\n", 0600);
    zel_svc_data_load(kGps, 0, 1);
    EXPECT_EQ(read(kGpsFile), "");
    EXPECT_EQ(attributes(kGpsFile), (Attributes{.mode = 0755, .uid = 200, .gid = 5000, .label = "*"}));
    EXPECT_EQ(zel_svc_data_find(kGps, "gps", "old"), 0);
}

TEST_F(DataFile, IsCreatedForOneOnly) {
    write(kGpsFile, "[gps]\nold = 1\n");
    for (const int create : {0, 2, -1}) {
        zel_svc_data_load(kGps, 0, create);
        EXPECT_EQ(zel_svc_data_get_int(kGps, "gps", "old", 7), 1) << create;
    }
}

TEST_F(DataFile, ReplacesALinkAndLeavesWhatItNames) {
    write("/opt/t/file", "kept");
    link_to("/opt/t/file", kGpsFile);
    zel_svc_data_load(kGps, 0, 1);
    EXPECT_TRUE(S_ISREG(status_of(kGpsFile).st_mode));
    EXPECT_EQ(read("/opt/t/file"), "kept");
}

TEST_F(DataFile, ThatCannotBeCreatedLeavesItsGroupUnloaded) {
    fail("zel_platform_open", kGpsFile);
    zel_svc_data_load(kGps, 0, 1);
    zel_svc_data_set_int(kGps, "gps", "k", 1);
    EXPECT_EQ(zel_svc_data_find(kGps, "gps", "k"), 0);
    zel_svc_data_dump(kGps, 0);
    EXPECT_FALSE(exists(kGpsFile));
}

TEST_F(DataFile, ThatIsMissingLeavesItsGroupUnloadedAndIsNotMade) {
    zel_svc_data_load(kGps, 0, 0);
    zel_svc_data_set_int(kGps, "gps", "k", 1);
    EXPECT_EQ(zel_svc_data_find(kGps, "gps", "k"), 0);
    zel_svc_data_dump(kGps, 0);
    EXPECT_FALSE(exists(kGpsFile));
}

TEST_F(DataFile, ThatTheLibraryRefusesLeavesItsGroupUnloaded) {
    write(kGpsFile, "[gps\n");
    zel_svc_data_load(kGps, 0, 0);
    zel_svc_data_set_int(kGps, "gps", "k", 1);
    zel_svc_data_dump(kGps, 0);
    EXPECT_EQ(zel_svc_data_find(kGps, "gps", "k"), 0);
    EXPECT_EQ(read(kGpsFile), "[gps\n");
}

TEST_F(DataFile, ASecondLoadDropsTheFirst) {
    zel_svc_data_load(kGps, 0, 1);
    zel_svc_data_set_int(kGps, "gps", "k", 1);
    zel_svc_data_load(kGps, 0, 0);
    EXPECT_EQ(zel_svc_data_find(kGps, "gps", "k"), 0);
    ASSERT_EQ(zel_svc_file_remove(kGpsFile), 0);
    zel_svc_data_load(kGps, 0, 0);
    zel_svc_data_set_int(kGps, "gps", "k", 1);
    EXPECT_EQ(zel_svc_data_find(kGps, "gps", "k"), 0) << "the failed load left nothing behind";
}

TEST_F(DataFile, HasASectionHeaderForItsKeys) {
    zel_svc_data_load(kGps, 0, 1);
    zel_svc_data_set_int(kGps, "gps", "k", 1);
    zel_svc_data_set_str(kGps, "Other", "S", "x");
    zel_svc_data_dump(kGps, 0);
    EXPECT_THAT(read(kGpsFile), HasSubstr("[gps]"));
    EXPECT_THAT(read(kGpsFile), HasSubstr("[other]"));
    EXPECT_THAT(read(kGpsFile), HasSubstr("= \"x\"\n"));
    EXPECT_THAT(read(kGpsFile), HasSubstr("= 1\n"));
}

TEST_F(DataFile, HasNoQuotesForAnEmptyString) {
    zel_svc_data_load(kGps, 0, 1);
    zel_svc_data_set_str(kGps, "gps", "empty", "");
    zel_svc_data_dump(kGps, 0);
    EXPECT_THAT(read(kGpsFile), Not(HasSubstr("\"")));
    EXPECT_THAT(read(kGpsFile), HasSubstr("empty "));
    dump_and_load();
    EXPECT_EQ(text("gps", "empty"), "");
}

TEST_F(DataFile, KeepsItsAttributesOverADump) {
    zel_svc_data_load(kGps, 0, 1);
    __zel_svc_config_set_file_attr(kGpsFile, 0700, 1, 2, "changed");
    zel_svc_data_set_int(kGps, "gps", "k", 1);
    zel_svc_data_dump(kGps, 0);
    EXPECT_EQ(attributes(kGpsFile), (Attributes{.mode = 0700, .uid = 1, .gid = 2, .label = "changed"}));
}

TEST_F(DataFile, CanBeDumpedAgainAndAgain) {
    zel_svc_data_load(kGps, 0, 1);
    zel_svc_data_set_str(kGps, "gps", "a", "long enough to be seen if it were left at the end");
    zel_svc_data_set_int(kGps, "gone", "b", 1);
    zel_svc_data_dump(kGps, 0);
    zel_svc_data_unset(kGps, "gone", nullptr);
    zel_svc_data_set_str(kGps, "gps", "a", "s");
    zel_svc_data_set_int(kGps, "gps", "c", 3);
    dump_and_load();
    EXPECT_EQ(text("gps", "a"), "s");
    EXPECT_EQ(text("gps", "c"), "3");
    EXPECT_EQ(zel_svc_data_find(kGps, "gone", "b"), 0);
    EXPECT_THAT(read(kGpsFile), Not(HasSubstr("gone")));
}

TEST_F(DataFile, IsLostWithoutADump) {
    zel_svc_data_load(kGps, 0, 1);
    zel_svc_data_set_int(kGps, "gps", "k", 1);
    zel_svc_data_free(kGps);
    EXPECT_EQ(read(kGpsFile), "");
    zel_svc_data_dump(kGps, 0);
    EXPECT_EQ(read(kGpsFile), "");
}

TEST_F(DataFile, IsLeftAsItWasWhenADumpCannotOpenIt) {
    write(kGpsFile, "[gps]\nold = 1\n");
    zel_svc_data_load(kGps, 0, 0);
    zel_svc_data_set_int(kGps, "gps", "k", 1);
    fail("zel_platform_open", kGpsFile);
    zel_svc_data_dump(kGps, 0);
    EXPECT_EQ(read(kGpsFile), "[gps]\nold = 1\n");
    EXPECT_EQ(zel_svc_data_get_int(kGps, "gps", "k", 7), 1) << "the group stays loaded";
}

TEST_F(DataFile, OfTheSecondSimTakesTheGroupsPlace) {
    zel_svc_data_load(kIms, 0, 1);
    zel_svc_data_set_int(kIms, "ims", "k", 1);
    zel_svc_data_dump(kIms, 0);
    zel_svc_data_load(kIms, 2, 1);
    EXPECT_EQ(zel_svc_data_find(kIms, "ims", "k"), 0);
    zel_svc_data_set_int(kIms, "ims", "k", 2);
    zel_svc_data_dump(kIms, 2);
    zel_svc_data_free(kIms);
    EXPECT_THAT(read(kImsFile), HasSubstr("= 1\n"));
    EXPECT_THAT(read(kImsFile2), HasSubstr("= 2\n"));
}

TEST_F(DataFile, OfEveryGroupIsLoadedBack) {
    for (const unsigned variant : {0U, 2U}) {
        for (int group = 0; group < 22; ++group) {
            zel_svc_data_load(group, variant, 1);
            zel_svc_data_set_int(group, "s", "k", group + 100 * static_cast<int>(variant));
            zel_svc_data_dump(group, variant);
            zel_svc_data_free(group);
        }
        for (int group = 0; group < 22; ++group) {
            zel_svc_data_load(group, variant, 0);
            EXPECT_EQ(zel_svc_data_get_int(group, "s", "k", -1), group + 100 * static_cast<int>(variant));
            zel_svc_data_free(group);
        }
    }
    EXPECT_EQ(tree("/opt/system/zel-default/data").size(), 27U);
}

struct StoredString {
    const char *name; // of the test
    std::string value;
    std::string loaded;

    // The test's name in lists; without it they would show addresses.
    friend void PrintTo(const StoredString &stored, std::ostream *out) { *out << stored.name; }
};

class LoadedBack : public DataFile, public ::testing::WithParamInterface<StoredString> {};

TEST_P(LoadedBack, AStringIsWhatItWasAlsoAfterMoreDumps) {
    const StoredString &stored = GetParam();
    zel_svc_data_load(kGps, 0, 1);
    zel_svc_data_set_str(kGps, "gps", "k", stored.value);
    zel_svc_data_set_int(kGps, "gps", "next", 5);
    EXPECT_EQ(zel_svc_data_get_text(kGps, "gps", "k"), stored.loaded);
    for (int i = 0; i < 3; ++i) {
        dump_and_load();
        EXPECT_EQ(text("gps", "k"), stored.loaded) << "dump " << i;
        EXPECT_EQ(zel_svc_data_get_text(kGps, "gps", "k"), stored.loaded);
        EXPECT_EQ(zel_svc_data_get_int(kGps, "gps", "next", 7), 5);
    }
}

const StoredString kStoredStrings[] = {
    {"Plain", "plain", "plain"},
    {"Empty", "", ""},
    {"BlanksAtBothEnds", "  a ", "  a "},
    {"CommentSigns", "a # b ; c = d", "a # b ; c = d"},
    {"SectionHeader", "[section]", "[section]"},
    {"TrailingBackslash", "back\\", "back\\"},
    {"Apostrophe", "it's", "it's"},
    {"OnlyASingleQuote", "'", "'"},
    {"OnlyADoubleQuote", "\"", "\""},
    {"TwoSingleQuotes", "''", "''"},
    {"TwoDoubleQuotes", "\"\"", "\"\""},
    {"DoubleQuotesInside", "say \"yes\"", "say \"yes\""},
    {"DoubleQuotesAround", "\"all\"", "\"all\""},
    {"SingleQuotesAround", "'all'", "'all'"},
    {"BothKindsOfQuotes", "\"it's\"", "'it's'"},
    {"LineFeed", "a\nb", "a b"},
    {"LineFeedsThatWouldBeEntries", "\n[x]\ny = 1\n", " [x] y = 1 "},
    {"ControlBytes", "\r\t\x01\x7f", "\r\t\x01\x7f"},
    {"NoUtf8", "\xff\xfe\xc3", "\xff\xfe\xc3"},
    {"Utf8", "\xe2\x82\xac \xf0\x9f\x93\xb1", "\xe2\x82\xac \xf0\x9f\x93\xb1"},
    {"LeadingZeros", "007", "007"},
    {"Negative", "-5", "-5"},
    {"FormatLetters", "%s%n", "%s%n"},
    {"TooLong", std::string(300, ';'), std::string(255, ';')},
    {"TooManyQuotes", std::string(300, '"'), std::string(255, '"')},
};

INSTANTIATE_TEST_SUITE_P(String, LoadedBack, ::testing::ValuesIn(kStoredStrings),
                         [](const auto &test) { return std::string{test.param.name}; });

TEST_F(DataFile, LoadsBackTheLongestNamesAndValues) {
    const std::string section(50, 's');
    const std::string key(49, 'k');
    zel_svc_data_load(kGps, 0, 1);
    zel_svc_data_set_str(kGps, section.c_str(), key.c_str(), std::string(255, 'v'));
    zel_svc_data_set_str(kGps, std::string(120, 'x').c_str(), "key", "lost");
    zel_svc_data_set_str(kGps, std::string(99, 'y').c_str(), "key", "lost");
    zel_svc_data_set_str(kGps, "", "key", "lost");
    zel_svc_data_set_str(kGps, "z", "", "lost");
    dump_and_load();
    EXPECT_EQ(text(section.c_str(), key.c_str()), std::string(255, 'v'));
    EXPECT_THAT(read(kGpsFile), Not(HasSubstr("lost")));
}

// Another program's file: unquoted values, a key without section, names with a colon.
TEST_F(DataFile, OfAnotherWriterIsReadAndRewritten) {
    write(kGpsFile, "[gps]\nMixed = a\"b'c\nhex = 0x1f\nquoted = 'a;b'\nempty =\n[a:b]\nk = 1\n");
    zel_svc_data_load(kGps, 0, 0);
    for (int i = 0; i < 2; ++i) {
        EXPECT_EQ(text("gps", "mixed"), "a\"b'c");
        EXPECT_EQ(zel_svc_data_get_int(kGps, "gps", "hex", 7), 31);
        EXPECT_EQ(text("gps", "quoted"), "a;b");
        EXPECT_EQ(text("gps", "empty"), "");
        dump_and_load();
    }
}

TEST_F(DataFile, ASectionWithAColonIsNoInteger) {
    write(kGpsFile, "[a:b]\nk = 1\n");
    zel_svc_data_load(kGps, 0, 0);
    EXPECT_EQ(zel_svc_data_get_int(kGps, "a", "b", 7), 7);
    EXPECT_EQ(zel_svc_data_get_str(kGps, "a", "b"), nullptr);
    EXPECT_EQ(zel_svc_data_find(kGps, "a", "b"), 1);
}

TEST_F(DataFile, OfAFormerRunWithAnOverlongValueStaysLoadable) {
    write(kGpsFile, "[gps]\nk=" + std::string(1000, 'v') + "\n");
    zel_svc_data_load(kGps, 0, 0);
    EXPECT_EQ(text("gps", "k"), std::string(1000, 'v'));
    dump_and_load();
    EXPECT_EQ(text("gps", "k"), std::string(255, 'v'));
}

TEST_F(DataFile, HoldsManyEntriesInManySections) {
    zel_svc_data_load(kGps, 0, 1);
    for (int i = 0; i < 3000; ++i)
        zel_svc_data_set_int(kGps, ("s" + std::to_string(i % 50)).c_str(), ("k" + std::to_string(i)).c_str(), i);
    dump_and_load();
    for (int i = 0; i < 3000; ++i)
        ASSERT_EQ(
            zel_svc_data_get_int(kGps, ("s" + std::to_string(i % 50)).c_str(), ("k" + std::to_string(i)).c_str(), -1),
            i);
}

} // namespace
