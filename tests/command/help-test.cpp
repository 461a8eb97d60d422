#include "program.h"
#include "support/lines.h"
#include "support/source-dir.h"

#include <algorithm>
#include <fstream>
#include <iterator>
#include <regex>
#include <sstream>

using namespace zel_test;

namespace {

std::vector<std::string> words_of(const std::string &text) {
    std::istringstream stream{text};
    return {std::istream_iterator<std::string>{stream}, {}};
}

std::size_t longest_line(const std::string &text) {
    std::size_t longest = 0;
    for (const std::string &line : lines_of(text))
        longest = std::max(longest, line.size());
    return longest;
}

std::string manual_page() {
    std::ifstream file{zel_test::source_dir() + "/docs/man/zel.1"};
    return std::regex_replace(std::string{std::istreambuf_iterator<char>{file}, {}}, std::regex{R"(\\-)"}, "-");
}

} // namespace

TEST(ZelHelp, FitsEightyColumnsForEveryCommand) {
    const auto commands = known_commands();
    ASSERT_GE(commands.size(), 20U);
    EXPECT_LE(longest_line(run_zel({"--help"}).out), 80U);
    for (const KnownCommand &command : commands) {
        std::vector<std::string> words = words_of(command.name);
        words.emplace_back("--help");
        const Outcome outcome = run_zel(words);
        EXPECT_EQ(outcome.code, 0) << command.name;
        EXPECT_NE(outcome.out.find("usage: zel " + command.name), std::string::npos) << outcome.out;
        EXPECT_LE(longest_line(outcome.out), 80U) << outcome.out;
    }
}

TEST(ZelHelp, NamesEveryExitCode) {
    const std::string help = run_zel({"--help"}).out;
    EXPECT_NE(help.find("0 done, 1 failed, 2 wrong usage, 3 no phone, 4 verification found differences"),
              std::string::npos);
}

TEST(ZelHelp, OfAGroupListsItsVerbs) {
    const Outcome outcome = run_zel({"vconf", "--help"});
    EXPECT_EQ(outcome.code, 0);
    for (const char *verb : {"get KEY", "set KEY VALUE", "unset KEY", "list [PREFIX]"})
        EXPECT_NE(outcome.out.find(verb), std::string::npos) << verb;
}

TEST(ZelHelp, SaysThatTheVersionQueryWrites) {
    const std::string help = run_zel({"version", "--help"}).out;
    EXPECT_NE(help.find("Writes: "), std::string::npos) << help;
    EXPECT_NE(help.find("\"db/private/zel/bin_name\""), std::string::npos) << help;
}

TEST(ZelHelp, OfNothingGoesToStandardErrorAsWrongUsage) {
    const Outcome outcome = run_zel({});
    EXPECT_EQ(outcome.code, 2);
    EXPECT_EQ(outcome.out, "");
    EXPECT_NE(outcome.err.find("usage: zel"), std::string::npos);
}

TEST(ZelManual, HoldsEveryCommandAndOption) {
    const std::string page = manual_page();
    ASSERT_FALSE(page.empty());
    for (const KnownCommand &command : known_commands()) {
        const std::size_t section = page.find(".SS zel " + command.name);
        ASSERT_NE(section, std::string::npos)
            << command.name << " is missing; make the page anew with: zel manual > docs/man/zel.1";
        for (const std::string &option : command.options)
            EXPECT_TRUE(option == "--help" || page.find(option) != std::string::npos) << command.name << " " << option;
    }
}

TEST(ZelManual, IsWhatTheCommandPrints) {
    std::ifstream file{zel_test::source_dir() + "/docs/man/zel.1"};
    const std::string page{std::istreambuf_iterator<char>{file}, {}};
    EXPECT_EQ(run_zel({"manual"}).out, page) << "make the page anew with: zel manual > docs/man/zel.1";
}

TEST(ZelUsage, NamesTheWordThatIsNoCommand) {
    const Outcome outcome = run_zel({"instal", "XFV"});
    EXPECT_EQ(outcome.code, 2);
    EXPECT_EQ(outcome.out, "");
    EXPECT_EQ(outcome.err, "zel: there is no command 'instal'\nSee 'zel --help'.\n");
}

TEST(ZelUsage, NamesTheWordThatIsNoVerb) {
    const Outcome outcome = run_zel({"vconf", "fetch"});
    EXPECT_EQ(outcome.code, 2);
    EXPECT_EQ(outcome.err, "zel: there is no command 'vconf fetch'\nSee 'zel vconf --help'.\n");
}

TEST(ZelUsage, MissesAnArgument) {
    const Outcome outcome = run_zel({"vconf", "get"});
    EXPECT_EQ(outcome.code, 2);
    EXPECT_EQ(outcome.err, "zel: KEY is required\nSee 'zel vconf get --help'.\n");
}

TEST(ZelUsage, RefusesAnUnknownOption) {
    const Outcome outcome = run_zel({"log", "--sytem"});
    EXPECT_EQ(outcome.code, 2);
    EXPECT_NE(outcome.err.find("--sytem"), std::string::npos);
}

TEST(ZelUsage, PrintsItsVersion) {
    const Outcome outcome = run_zel({"--version"});
    EXPECT_EQ(outcome.code, 0);
    EXPECT_TRUE(std::regex_match(outcome.out, std::regex{"zel [0-9]+\\.[0-9]+\\.[0-9]+\n"})) << outcome.out;
}
