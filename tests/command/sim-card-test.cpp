// zel sim insert, remove, info: cards and slots.

#include "sim-phone.h"

#include <gmock/gmock.h>

using namespace zel_test;
using nlohmann::json;
using ::testing::HasSubstr;
using ::testing::Not;

namespace {

struct ZelSimCard : TwoSimCommand {
    static Outcome insert(std::vector<std::string> more) {
        std::vector<std::string> arguments{"sim", "insert", "--mccmnc", "21405", "--msin", "9812345678"};
        arguments.insert(arguments.end(), more.begin(), more.end());
        return run_zel(arguments);
    }
    json slot(int number) { return json_of({"sim", "info"}).at("slots").at(static_cast<std::size_t>(number - 1)); }
};

struct ZelSimCardOfOneSlot : SimCommand {};

} // namespace

TEST_F(ZelSimCard, IsPutIntoItsSlot) {
    EXPECT_EQ(insert({}).out, "SIM 1: 21405, MSIN 981***\n");
    EXPECT_EQ(insert({"--slot", "2", "--gid", "A3", "--spn", "Móvil"}).out,
              "SIM 2: 21405, MSIN 981***, GID A3, SPN Móvil\n");
    EXPECT_EQ(get_int("memory/telephony/sim_slot"), 1);
    EXPECT_EQ(get_int("memory/telephony/sim_slot2"), 1);
    EXPECT_EQ(call("sim", {{"slot", 1}}).at("msin"), "9812345678");
    EXPECT_EQ(call("sim", {{"slot", 2}}).at("mnc"), "05");
    EXPECT_EQ(run({"sim", "remove", "--slot", "2"}), "SIM 2: no card\n");
    EXPECT_EQ(get_int("memory/telephony/sim_slot2"), 0);
}

TEST_F(ZelSimCard, ShowsThreeDigitsOfItsMsinUnlessRevealed) {
    const std::string shown = insert({"--json"}).out;
    EXPECT_EQ(json::parse(shown).at("msin"), "981***");
    EXPECT_THAT(shown, Not(HasSubstr("9812")));
    EXPECT_EQ(json::parse(insert({"--json", "--reveal"}).out).at("msin"), "9812345678");
    set_string("db/private/zel/sim_msin", "5551234567");
    for (const char *command : {"info", "match"}) {
        const std::string page = run({"sim", command});
        EXPECT_THAT(page, HasSubstr("981***")) << command;
        EXPECT_THAT(page, Not(HasSubstr("9812"))) << command;
        EXPECT_THAT(page, Not(HasSubstr("5551"))) << command;
        EXPECT_THAT(run({"sim", command, "--json"}), Not(HasSubstr("9812"))) << command;
        EXPECT_THAT(run({"sim", command, "--reveal"}), HasSubstr("9812345678")) << command;
    }
    EXPECT_THAT(run({"sim", "info", "--reveal"}), HasSubstr("5551234567"));
}

TEST_F(ZelSimCard, HasTheDigitsOfAnImsi) {
    for (const std::vector<std::string> &wrong : {std::vector<std::string>{"--mccmnc", "2140"},
                                                  {"--mccmnc", "2140555"},
                                                  {"--mccmnc", "2140x"},
                                                  {"--mccmnc", ""},
                                                  {"--mccmnc", "21405", "--msin", "12345678901"},
                                                  {"--mccmnc", "310410", "--msin", "1234567890"},
                                                  {"--mccmnc", "21405", "--msin", "12 4"},
                                                  {"--mccmnc", "21405", "--slot", "3"},
                                                  {}}) {
        std::vector<std::string> arguments{"sim", "insert"};
        arguments.insert(arguments.end(), wrong.begin(), wrong.end());
        const Outcome outcome = run_zel(arguments);
        EXPECT_EQ(outcome.code, 2) << testing::PrintToString(wrong);
        EXPECT_EQ(outcome.out, "");
        EXPECT_NE(outcome.err, "");
    }
    EXPECT_EQ(call("sim", {{"slot", 1}}).at("card"), false);
}

TEST_F(ZelSimCardOfOneSlot, HasNoSecondSlot) {
    const Outcome outcome = run_zel({"sim", "remove", "--slot", "2"});
    EXPECT_EQ(outcome.code, 2);
    EXPECT_THAT(outcome.err, HasSubstr("--slot is 1"));
    EXPECT_EQ(json_of({"sim", "info"}).at("slots").size(), 1U);
}

TEST_F(ZelSimCard, IsShownAsTheLibraryReadsIt) {
    EXPECT_EQ(insert({"--gid", "A3", "--spn", "Móvil"}).code, 0);
    EXPECT_EQ(insert({"--slot", "2", "--unreadable"}).out, "SIM 2: an unreadable card\n");
    set_string("db/private/zel/sim_mcc_mnc", "21401");
    set_string("db/private/zel/sim_msin", "55");
    set_bool("memory/private/zel/sim_changed", true);
    set_int("db/private/zel/sim2/sim_selection_show", 1);
    const json info = json_of({"sim", "info"});
    EXPECT_EQ(info.at("feature"), 2);
    EXPECT_EQ(info.at("slots").at(0).at("sim"),
              json({{"mccmnc", "21405"}, {"msin", "981***"}, {"gid", "A3"}, {"spn", "Móvil"}}));
    EXPECT_EQ(info.at("slots").at(0).at("seen_last_time"), json({{"mccmnc", "21401"}, {"msin", "55***"}}));
    EXPECT_EQ(info.at("slots").at(0).at("changed"), true);
    EXPECT_EQ(info.at("slots").at(1).at("readable"), false);
    EXPECT_EQ(info.at("slots").at(1).at("user_is_asked"), true);
    const std::string page = run({"sim", "info"});
    EXPECT_THAT(page, HasSubstr("SIM auto setting is on, and waits for the user's choice."));
    EXPECT_THAT(page, HasSubstr("cannot be read"));
    EXPECT_EQ(json_of({"sim", "info", "--slot", "2"}).at("slots").size(), 1U);
}
