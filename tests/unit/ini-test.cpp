#include "base/zel-svc-ini.h"

#include "base/zel-svc-file.h"
#include "support/files-phone.h"

#include <csignal>
#include <fcntl.h>
#include <sys/resource.h>

namespace {

using ::testing::ElementsAre;
using ::testing::IsEmpty;
using ::testing::Pair;
using ::testing::StrEq;
using zel_test::FilesPhone;

class Ini : public FilesPhone {
  protected:
    ZelSvcIni loaded(std::string_view text) {
        write("/opt/t/file.ini", text);
        return ZelSvcIni::load("/opt/t/file.ini");
    }
};

TEST_F(Ini, IsReadByThePhonesOwnPath) {
    const ZelSvcIni ini = loaded("[Info]\nAP = \"a;b\"\nCount = 0x10\n");
    ASSERT_TRUE(ini);
    EXPECT_TRUE(ini.has("info"));
    EXPECT_TRUE(ini.has("INFO:ap"));
    EXPECT_STREQ(ini.text("info:ap"), "a;b");
    EXPECT_EQ(ini.number("info:count", 5), 16);
}

TEST_F(Ini, ThatDoesNotOpenIsNone) {
    EXPECT_FALSE(ZelSvcIni::load("/opt/t/none.ini"));
    EXPECT_FALSE(ZelSvcIni::load(nullptr));
    EXPECT_FALSE(ZelSvcIni::load(-1));
    write("/opt/t/file.ini", "[a]\nb = 1\n");
    fail("zel_platform_open", "/opt/t/file.ini");
    EXPECT_FALSE(ZelSvcIni::load("/opt/t/file.ini"));
}

TEST_F(Ini, ThatTheLibraryRefusesIsNone) {
    EXPECT_FALSE(loaded("[broken\n"));
    EXPECT_FALSE(loaded("[a]\nb = " + std::string(2000, 'x') + "\n"));
}

TEST_F(Ini, OfAnEmptyFileIsThereAndEmpty) {
    const ZelSvcIni ini = loaded("");
    ASSERT_TRUE(ini);
    EXPECT_THAT(ini.entries(), IsEmpty());
}

TEST_F(Ini, NoneAnswersEverything) {
    ZelSvcIni none;
    EXPECT_FALSE(none.has("a:b"));
    EXPECT_EQ(none.text("a:b"), nullptr);
    EXPECT_EQ(none.number("a:b", 7), 7);
    EXPECT_EQ(none.boolean("a:b", 1), 1);
    EXPECT_FALSE(none.add_section("a"));
    EXPECT_FALSE(none.set("a:b", "c"));
    EXPECT_FALSE(none.append("a:b", "1"));
    none.clear();
    EXPECT_THAT(none.entries(), IsEmpty());
    EXPECT_FALSE(none.dump(1));
}

TEST_F(Ini, ASectionHasNoNumber) {
    const ZelSvcIni ini = loaded("[a]\nb = 1\n");
    EXPECT_EQ(ini.text("a"), nullptr);
    EXPECT_EQ(ini.number("a", 7), 7);
    EXPECT_EQ(ini.boolean("a", 1), 1);
}

TEST_F(Ini, ReadsTruthByTheFirstLetter) {
    const ZelSvcIni ini = loaded("[a]\nt = true\ny = Yes\none = 1\nf = False\nn = no\nzero = 0\non = on\n");
    for (const char *key : {"a:t", "a:y", "a:one"})
        EXPECT_EQ(ini.boolean(key, 9), 1) << key;
    for (const char *key : {"a:f", "a:n", "a:zero"})
        EXPECT_EQ(ini.boolean(key, 9), 0) << key;
    EXPECT_EQ(ini.boolean("a:on", 9), 9);
    EXPECT_EQ(ini.boolean("a:absent", 9), 9);
}

TEST_F(Ini, ListsEntriesInTheFilesOrder) {
    const ZelSvcIni ini = loaded("[B]\nz = 1\na =\n[A]\nk = \"q\"\n");
    std::vector<std::pair<std::string, std::string>> found;
    for (const auto &[key, value] : ini.entries())
        found.emplace_back(key, value ? value : "(section)");
    EXPECT_THAT(found, ElementsAre(Pair("b", "(section)"), Pair("b:z", "1"), Pair("b:a", ""), Pair("a", "(section)"),
                                   Pair("a:k", "q")));
}

TEST_F(Ini, LoadsBackWhatWasDumped) {
    ZelSvcIni ini = loaded("[a]\nold = 1\n");
    EXPECT_TRUE(ini.add_section("New"));
    EXPECT_TRUE(ini.set("New:Key", "\"a # b\""));
    {
        const ZelSvcFd file = zel_svc_file_open("/opt/t/out.ini", O_RDWR | O_CREAT | O_TRUNC, 0644);
        EXPECT_TRUE(ini.dump(file.get()));
        EXPECT_GE(::fcntl(file.get(), F_GETFD), 0) << "the descriptor stays the caller's";
        EXPECT_STREQ(ZelSvcIni::load(file.get()).text("a:old"), "1");
    }
    const ZelSvcIni again = ZelSvcIni::load("/opt/t/out.ini");
    EXPECT_STREQ(again.text("a:old"), "1");
    EXPECT_STREQ(again.text("new:key"), "a # b");
}

TEST_F(Ini, WrittenAfreshHoldsWhatWasAppendedInItsOrder) {
    ZelSvcIni ini = loaded("[a]\nold = 1\ngone = 2\n[b]\nkey = 3\n");
    ini.clear();
    EXPECT_FALSE(ini.has("a"));
    EXPECT_TRUE(ini.append("Z", nullptr));
    EXPECT_TRUE(ini.append("Z:Key", "\"a # b\""));
    EXPECT_TRUE(ini.append("a", nullptr));
    EXPECT_TRUE(ini.append("a:old", "4"));
    // The library finds them, and takes more by its own ways.
    EXPECT_STREQ(ini.text("a:old"), "4");
    EXPECT_TRUE(ini.set("a:old", "5"));
    EXPECT_TRUE(ini.set("a:new", "6"));
    EXPECT_TRUE(ini.append("a:last", "7"));
    {
        const ZelSvcFd file = zel_svc_file_open("/opt/t/out.ini", O_RDWR | O_CREAT | O_TRUNC, 0644);
        EXPECT_TRUE(ini.dump(file.get()));
    }
    const ZelSvcIni again = ZelSvcIni::load("/opt/t/out.ini");
    std::vector<std::pair<std::string, std::string>> found;
    for (const auto &[key, value] : again.entries())
        found.emplace_back(key, value ? value : "(section)");
    EXPECT_THAT(found, ElementsAre(Pair("z", "(section)"), Pair("z:key", "a # b"), Pair("a", "(section)"),
                                   Pair("a:old", "5"), Pair("a:new", "6"), Pair("a:last", "7")));
}

TEST_F(Ini, TakesAsManyEntriesAsComeAndIsEmptiedAgain) {
    ZelSvcIni ini = loaded("");
    for (int round = 0; round < 2; ++round) {
        ini.clear();
        EXPECT_TRUE(ini.append("s", nullptr));
        for (int i = 0; i < 5000; ++i)
            ASSERT_TRUE(ini.append("s:k" + std::to_string(i), std::to_string(i + round).c_str()));
        EXPECT_EQ(ini.entries().size(), 5001U);
        EXPECT_EQ(ini.number("s:k0", -1), round);
        EXPECT_EQ(ini.number("s:k4999", -1), 4999 + round);
    }
}

TEST_F(Ini, TellsThatADumpFellShort) {
    ZelSvcIni ini = loaded("[a]\n");
    for (int i = 0; i < 500; ++i)
        ASSERT_TRUE(ini.set("a:k" + std::to_string(i), std::string(900, 'x')));
    const ZelSvcFd out = zel_svc_file_open("/opt/t/out.ini", O_RDWR | O_CREAT, 0644);
    const ZelSvcFd read_only = zel_svc_file_open("/opt/t/out.ini", O_RDONLY);
    EXPECT_FALSE(ini.dump(read_only.get()));
    std::signal(SIGXFSZ, SIG_IGN);
    const rlimit limit = {.rlim_cur = 300'000, .rlim_max = RLIM_INFINITY};
    ASSERT_EQ(::setrlimit(RLIMIT_FSIZE, &limit), 0);
    EXPECT_FALSE(ini.dump(out.get()));
}

TEST(IniQuoted, WrapsAValueSoThatItLoadsBack) {
    EXPECT_EQ(zel_svc_ini_quoted("a"), "\"a\"");
    EXPECT_EQ(zel_svc_ini_quoted(" "), "\" \"");
    EXPECT_EQ(zel_svc_ini_quoted("it's"), "\"it's\"");
    EXPECT_EQ(zel_svc_ini_quoted("\\"), "\"\\\"");
}

TEST(IniQuoted, LeavesAnEmptyValueWithoutQuotes) { EXPECT_EQ(zel_svc_ini_quoted(""), ""); }

TEST(IniQuoted, WrapsADoubleQuoteInSingleOnes) { EXPECT_EQ(zel_svc_ini_quoted("5\""), "'5\"'"); }

TEST(IniQuoted, TurnsDoubleQuotesIntoSingleOnesWhereBothStand) {
    EXPECT_EQ(zel_svc_ini_quoted("\"a\" 'b'"), "\"'a' 'b'\"");
}

TEST(IniQuoted, TurnsLineFeedsIntoBlanks) {
    EXPECT_EQ(zel_svc_ini_quoted("a\nb\n"), "\"a b \"");
    EXPECT_EQ(zel_svc_ini_quoted("\n"), "\" \"");
}

// The library's own getter is the measure, on a value that a file can hold.
TEST_F(Ini, NumbersOutsideItAreReadAsInIt) {
    const std::pair<const char *, int> numbers[] = {
        {"7", 7},
        {"-7", -7},
        {"0x10", 16},
        {"010", 8},
        {"08", 0},
        {"", 0},
        {"abc", 0},
        {"12abc", 12},
        {"2147483647", 2147483647},
        {"-2147483648", -2147483647 - 1},
    };
    for (const auto &[text, number] : numbers) {
        EXPECT_EQ(loaded("[a]\nb = " + std::string{text} + "\n").number("a:b", 77), number) << text;
        EXPECT_EQ(zel_svc_ini_number(text), number) << text;
    }
    EXPECT_EQ(zel_svc_ini_number("\"5\""), 0) << "quotes of this run are part of the value";
}

} // namespace
