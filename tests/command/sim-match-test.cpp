// zel sim operators, match, matrix: which SIM gets which operator, and why.

#include "sim-phone.h"

#include <gmock/gmock.h>

using namespace zel_test;
using nlohmann::json;
using ::testing::ElementsAre;
using ::testing::HasSubstr;

namespace {

struct ZelSimMatch : SimCommand {
    json match(std::vector<std::string> more) {
        std::vector<std::string> arguments{"sim", "match"};
        arguments.insert(arguments.end(), more.begin(), more.end());
        return json_of(arguments);
    }
    static std::vector<std::string> all(const json &answer, const char *member) {
        std::vector<std::string> result;
        for (const json &entry : answer.at("entries"))
            result.push_back(entry.at(member));
        return result;
    }
    json matrix(const std::string &customer) { return json_of({"sim", "matrix", customer}).at(0); }
};

} // namespace

TEST_F(ZelSimMatch, OperatorsAreThoseOfTheActiveCustomer) {
    const json list = json_of({"sim", "operators"});
    ASSERT_EQ(list.size(), 6U);
    EXPECT_EQ(list.at(1), json::parse(R"({"number": 2, "customer": "AAA", "network": "Young", "mccmnc": "21405",
        "subset_code": "98", "gid": "", "sp_name": ""})"));
    EXPECT_THAT(run({"sim", "operators"}), HasSubstr("MSIN 98..."));
    EXPECT_EQ(json_of({"sim", "operators", "--all"}).back().at("network"), "Elsewhere");
}

TEST_F(ZelSimMatch, TellsTheReasonForEachEntry) {
    const json answer = match({"--mccmnc", "21405", "--msin", "9870000000"});
    EXPECT_EQ(answer.at("result"), "one");
    EXPECT_EQ(answer.at("chosen"), json({2}));
    EXPECT_THAT(all(answer, "verdict"),
                ElementsAre("plain", "decisive", "decisive", "other_network", "other_network", "other_network"));
    EXPECT_THAT(all(answer, "reason"),
                ElementsAre("fits by MCC+MNC alone, but Young (2) fits by more", "the MSIN begins with 98",
                            "the MSIN begins with 987, but Young (2) comes first", "the SIM's MCC+MNC is not 21401",
                            "the SIM's MCC+MNC is not 21401", "the SIM's MCC+MNC is not 21401"));
}

TEST_F(ZelSimMatch, TellsWhatTheSimLacks) {
    EXPECT_THAT(all(match({"--mccmnc", "21405", "--msin", "1"}), "reason"),
                ElementsAre("fits by MCC+MNC, and nothing else is asked for",
                            "asks for an MSIN of 98..., not the SIM's", "asks for an MSIN of 987..., not the SIM's",
                            "the SIM's MCC+MNC is not 21401", "the SIM's MCC+MNC is not 21401",
                            "the SIM's MCC+MNC is not 21401"));
    EXPECT_EQ(all(match({"--mccmnc", "21401"}), "reason").at(5), "asks for SPN Brand, and the SIM states none");
    EXPECT_EQ(all(match({"--mccmnc", "21401", "--spn", "Brant"}), "reason").at(5), "asks for SPN Brand, not the SIM's");
    EXPECT_EQ(all(match({"--mccmnc", "21401", "--spn", "bRAND"}), "reason").at(5), "the SPN is Brand");
    write_networks("BBB", network("Group", "26201", one("SubsetCode", "A3")));
    EXPECT_EQ(all(match({"--mccmnc", "26201", "--gid", "A3", "--customer", "BBB"}), "reason").at(0), "the GID is A3");
    EXPECT_EQ(all(match({"--mccmnc", "26201", "--gid", "a3", "--customer", "BBB"}), "reason").at(0),
              "asks for GID A3, not the SIM's");
}

TEST_F(ZelSimMatch, SaysWhenTheUserIsAskedAndWhenNobodyFits) {
    EXPECT_EQ(match({"--mccmnc", "21401"}).at("result"), "user_chooses");
    const std::string asked = run({"sim", "match", "--mccmnc", "21401"});
    EXPECT_THAT(asked, HasSubstr("The user is asked: North (4), South (5).\n"));
    EXPECT_THAT(asked, HasSubstr("fits by MCC+MNC, as others do: the user chooses"));
    EXPECT_EQ(match({"--mccmnc", "26202"}).at("result"), "none");
    EXPECT_THAT(run({"sim", "match", "--mccmnc", "26202"}), HasSubstr("No operator of AAA fits"));
    EXPECT_THAT(run({"sim", "match", "--mccmnc", "26201", "--customer", "BBB"}), HasSubstr("Gets Elsewhere (1).\n"));
}

TEST_F(ZelSimMatch, TakesTheSimInTheSlotWithoutADescription) {
    EXPECT_EQ(run_zel({"sim", "match"}).code, 1);
    call("sim-insert", {{"slot", 1}, {"mcc", "214"}, {"mnc", "01"}, {"msin", "555"}, {"spn", "Brand"}});
    const json answer = match({});
    EXPECT_EQ(answer.at("sim"), json({{"mccmnc", "21401"}, {"msin", "555***"}, {"gid", ""}, {"spn", ""}}));
    EXPECT_EQ(answer.at("result"), "user_chooses"); // the library reads no SPN
    EXPECT_EQ(run_zel({"sim", "match", "--msin", "98"}).code, 2);
}

TEST_F(ZelSimMatch, OfACardWithoutNetworkNoEntryIsItsOwn) {
    write_networks("AAA", network("Home", "21405") + network("Nowhere", ""));
    call("sim-insert", {{"slot", 1}, {"mcc", ""}, {"mnc", ""}, {"msin", "555"}});
    EXPECT_THAT(all(match({}), "reason"),
                ElementsAre("the SIM's MCC+MNC is not 21405", "it names no MCC+MNC, so no SIM is its own"));
    const std::string page = run({"sim", "match"});
    EXPECT_THAT(page, HasSubstr("PASSED OVER"));
    EXPECT_THAT(page, ::testing::Not(HasSubstr("VERDICT")));
}

// The command explains what the library does: both are asked about the same cards.
TEST_F(ZelSimMatch, SaysWhatARunDoes) {
    for (const auto &[mnc, msin] : {std::pair{"05", "9870000000"}, {"05", "1000000000"}, {"01", "9870000000"}}) {
        call("sim-insert", {{"slot", 1}, {"mcc", "214"}, {"mnc", mnc}, {"msin", msin}});
        const json explained = match({});
        const json done = json_of({"sim", "run"});
        const std::size_t first = explained.at("chosen").at(0);
        const std::string network = explained.at("entries").at(first - 1).at("network");
        const bool one = explained.at("result") == "one";
        EXPECT_EQ(done.at("meaning"), one ? "installed" : "user_chooses");
        EXPECT_EQ(get_string("db/private/zel/sim_auto_op_network_name"), one ? network : "");
    }
}

TEST_F(ZelSimMatch, MatrixTellsWhichSimsReachWhom) {
    const json answer = matrix("AAA");
    EXPECT_THAT(all(answer, "reached_by"),
                ElementsAre("alone", "alone", "nothing", "user_chooses", "user_chooses", "caller_only"));
    EXPECT_THAT(all(answer, "sims"), ElementsAre("every SIM but MSIN 98...", "MSIN 98...", "",
                                                 "every SIM but SPN Brand", "every SIM but SPN Brand", "SPN Brand"));
    EXPECT_EQ(answer.at("entries").at(0).at("but_for"), json({2}));
    EXPECT_EQ(answer.at("entries").at(2).at("instead"), json({2}));
    EXPECT_EQ(answer.at("entries").at(2).at("why"), "entries before it take every SIM that it asks for");
    EXPECT_EQ(answer.at("user_is_asked"),
              json::parse(R"([{"mccmnc": "21401", "sims": "every SIM but SPN Brand", "entries": [4, 5]}])"));
}

TEST_F(ZelSimMatch, MatrixIsForPeopleToo) {
    const std::string page = run({"sim", "matrix"});
    for (const char *text : {"AAA, 6 entries\n", "BBB, 1 entry\n", "The user is asked:", "North (4), South (5)",
                             "Reached by nothing:", "Late (3)", "such as Young (2)", "only when a caller states it",
                             "The phone reads neither GID nor SPN"})
        EXPECT_THAT(page, HasSubstr(text));
}

TEST_F(ZelSimMatch, SaysWhenThereAreMoreEntriesThanAreRead) {
    std::string networks;
    for (int number = 0; number < 271; ++number)
        networks += network("N" + std::to_string(number), "21401");
    write_networks("AAA", networks);
    for (const char *command : {"operators", "matrix"}) {
        const Outcome outcome = run_zel({"sim", command});
        EXPECT_EQ(outcome.code, 0);
        EXPECT_THAT(outcome.err, HasSubstr("only the first 270 entries are read")) << command;
    }
}

TEST_F(ZelSimMatch, CustomersThatAreCountedButNotDescribedHaveNoOperators) {
    write_header(4);
    const Outcome outcome = run_zel({"sim", "operators", "--all", "--json"});
    EXPECT_EQ(outcome.code, 0);
    EXPECT_EQ(json::parse(outcome.out).size(), 7U);
    EXPECT_EQ(outcome.err, "zel: sim operators: /opt/system/zel/mps/ZEL/SW_Configuration.xml counts more customers "
                           "than it describes\n");
}

TEST_F(ZelSimMatch, NeedsACustomerWithAReadableFile) {
    EXPECT_THAT(run_zel({"sim", "matrix", "CCC"}).err, HasSubstr("/Customer/CCC/customer.xml"));
    EXPECT_EQ(run_zel({"sim", "match", "--mccmnc", "21401", "--customer", "CCC"}).code, 1);
    EXPECT_THAT(run_zel({"sim", "matrix", "../AAA"}).err, HasSubstr("'../AAA' is no customer's code"));
    write("/opt/system/zel/mps/ZEL/Customer/AAA/customer.xml",
          "\xEF\xBB\xBF<?xml version=\"1.0\"?>\n<CustomerData><Gen");
    EXPECT_THAT(run_zel({"sim", "operators"}).err, HasSubstr("/Customer/AAA/customer.xml:2:"));
    call("vconf-unset", {{"key", "db/zel/salescode"}});
    for (const char *command : {"operators", "match"}) {
        const Outcome outcome =
            run_zel({"sim", command, command == std::string{"match"} ? "--mccmnc=21401" : "--json"});
        EXPECT_EQ(outcome.code, 1) << command;
        EXPECT_THAT(outcome.err, HasSubstr("has no active customer")) << command;
    }
}
