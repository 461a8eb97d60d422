// The guide for operator engineers shows what the command really prints.

#include "program.h"
#include "support/lines.h"
#include "support/source-dir.h"

#include <fstream>
#include <iterator>
#include <regex>

using namespace zel_test;

namespace {

struct Shown {
    std::string command; // without "$ zel "
    std::vector<std::string> lines;
};

// The commands of the guide's console blocks, each with what it is shown to print.
std::vector<Shown> shown_in_guide() {
    std::ifstream file{source_dir() + "/docs/sim.md"};
    std::vector<Shown> result;
    bool inside = false;
    for (std::string line; std::getline(file, line);) {
        if (line.starts_with("```")) inside = line == "```console";
        if (!inside || line.starts_with("```")) continue;
        if (line.starts_with("$ zel "))
            result.push_back({line.substr(6), {}});
        else
            result.back().lines.push_back(line);
    }
    return result;
}

std::vector<std::string> words_of(const std::string &command) {
    static const std::regex word{R"re("([^"]*)"|(\S+))re"};
    std::vector<std::string> words;
    for (std::sregex_iterator at{command.begin(), command.end(), word}, end; at != end; ++at)
        words.push_back((*at)[1].matched ? (*at)[1].str() : (*at)[2].str());
    return words;
}

// Whether the lines are those, "..." standing for any number of lines.
bool agree(const std::vector<std::string> &shown, const std::vector<std::string> &real) {
    std::size_t at = 0;
    bool any = false;
    for (const std::string &line : shown) {
        if (line == "...") {
            any = true;
            continue;
        }
        while (any && at < real.size() && real[at] != line)
            ++at;
        if (at == real.size() || real[at] != line) return false;
        any = false;
        ++at;
    }
    return any || at == real.size();
}

struct SimGuide : ZelCommand {
    SimGuide() {
        create_arguments["sims"] = 2;
        create_arguments["package"] = source_dir() + "/examples/package";
    }
};

} // namespace

TEST_F(SimGuide, ShowsWhatTheCommandPrints) {
    ASSERT_EQ(run_zel({"install", "TFG"}).code, 0);
    const std::vector<Shown> all = shown_in_guide();
    ASSERT_GE(all.size(), 10U);
    for (const Shown &shown : all) {
        const Outcome outcome = run_zel(words_of(shown.command));
        EXPECT_TRUE(agree(shown.lines, lines_of(outcome.out + outcome.err))) << "zel " << shown.command << "\n"
                                                                             << outcome.out << outcome.err;
    }
}
