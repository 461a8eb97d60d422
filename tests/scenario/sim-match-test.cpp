// Which operators a SIM belongs to: tables of entries, SIMs and the entries that must come out.

#include "sim-phone.h"

#include <cstring>
#include <gmock/gmock.h>

namespace {

struct Sim {
    const char *mccmnc;
    const char *msin;
    const char *gid = "";
    const char *spn = "";
};

struct Case {
    const char *what;
    Sim sim;
    std::vector<std::string> expected; // network names
};

class SimMatch : public zel_test::SimPhone {
  protected:
    std::vector<std::string> matches(const Sim &sim) {
        ZelSvcSimInfo info = {};
        std::strncpy(info.mccmnc, sim.mccmnc, sizeof info.mccmnc - 1);
        std::strncpy(info.msin, sim.msin, sizeof info.msin - 1);
        std::strncpy(info.gid, sim.gid, sizeof info.gid - 1);
        std::strncpy(info.spn, sim.spn, sizeof info.spn - 1);
        std::vector<ZelSvcSimOperator> list(ZEL_SVC_MAX_OPERATORS);
        int32_t count = -1;
        zel_svc_sim_auto_setting_get_operator_list_by_sim(&info, list.data(), &count);
        std::vector<std::string> names;
        for (std::size_t i = 0; i < static_cast<std::size_t>(count); ++i)
            names.emplace_back(list[i].network_name);
        return names;
    }
    void expect(const std::vector<Case> &cases) {
        for (const Case &one : cases)
            EXPECT_EQ(matches(one.sim), one.expected) << one.what;
    }
};

} // namespace

TEST_F(SimMatch, TheNetworkCodeIsTheSimsExactly) {
    write_networks("TST", "TST",
                   {{"A", "26201"}, {"B", "262010"}, {"C", "2620"}, {"D", "26202"}, {"E", "26201"}, {"F", ""}});
    expect({
        {"plain matches in the file's order", {"26201", "123"}, {"A", "E"}},
        {"one plain match", {"26202", "123"}, {"D"}},
        {"three digits of network code", {"262010", "123"}, {"B"}},
        {"no match", {"26209", "123"}, {}},
        {"a SIM without a code matches nothing, an entry without one included", {"", "123"}, {}},
    });
}

TEST_F(SimMatch, TheSubsetCodeIsTheBeginningOfTheMsin) {
    write_networks("TST", "TST",
                   {{"P", "26201"},
                    {"S", "26201", "123"},
                    {"T", "26201", "45"},
                    {"U", "26201", "12"},
                    {"V", "26202", "123456789"}});
    expect({
        {"decisive alone, the plain match before it is dropped", {"26201", "1234567890"}, {"S"}},
        {"the first decisive entry wins over a later one", {"26201", "123"}, {"S"}},
        {"a shorter MSIN than the code is none", {"26201", "4"}, {"P"}},
        {"a later entry", {"26201", "129"}, {"U"}},
        {"no subset: the plain ones", {"26201", "999"}, {"P"}},
        {"an empty MSIN", {"26201", ""}, {"P"}},
        {"nine digits", {"26202", "1234567890"}, {"V"}},
        {"eight of nine digits", {"26202", "12345678"}, {}},
    });
}

TEST_F(SimMatch, TheGidIsTheSimsExactly) {
    write_networks("TST", "TST", {{"P", "26201"}, {"G", "26201", "", "A1"}, {"H", "26201", "", "a1"}});
    expect({
        {"decisive", {"26201", "123", "A1"}, {"G"}},
        {"case counts", {"26201", "123", "a1"}, {"H"}},
        {"another GID", {"26201", "123", "A"}, {"P"}},
        {"a SIM without GID", {"26201", "123"}, {"P"}},
    });
}

TEST_F(SimMatch, TheSpNameIsTheSimsButForTheCaseOfAsciiLetters) {
    write_networks("TST", "TST",
                   {{"P", "26201"}, {"N", "26201", "", "", "One Mobil\xC3\x89"}, {"M", "26202", "", "", "Two"}});
    expect({
        {"case of ASCII letters does not count", {"26201", "123", "", "ONE mobil\xC3\x89"}, {"N"}},
        {"case of other letters counts", {"26201", "123", "", "one mobil\xC3\xA9"}, {"P"}},
        {"a longer name", {"26201", "123", "", "One Mobil\xC3\x89s"}, {"P"}},
        {"a SIM without name never matches", {"26202", "123"}, {}},
        {"decisive without plain ones", {"26202", "123", "", "two"}, {"M"}},
    });
}

TEST_F(SimMatch, TheFirstThingThatAnEntryAsksForDecides) {
    write_networks(
        "TST", "TST",
        {{"S", "26201", "12", "A1", "Name"}, {"G", "26201", "", "A1", "Name"}, {"N", "26201", "", "", "Name"}});
    expect({
        {"subset before GID and name", {"26201", "123", "B2", "Other"}, {"S"}},
        {"a subset that fails is skipped though its GID would match", {"26201", "993", "A1", "Name"}, {"G"}},
        {"a GID that fails is skipped though its name would match", {"26201", "993", "B2", "name"}, {"N"}},
        {"none", {"26201", "993", "B2", "Other"}, {}},
    });
}

TEST_F(SimMatch, EntriesThatNeedMoreThanTheCardTellsAreNoPlainMatches) {
    write_networks("TST", "TST", {{"G", "26201", "", "A1"}, {"N", "26201", "", "", "Name"}});
    EXPECT_EQ(matches({"26201", "1234567890"}), std::vector<std::string>{});
}

TEST_F(SimMatch, ListsTheActiveCustomersOperatorsOnly) {
    write_networks("TST", "TST", {{"Own", "26201"}});
    write_networks("AAA", "AAA", {{"Other", "26201"}});
    write_header("<CustomerDataSet><NbCustomer>1</NbCustomer><CustomerData src=\"/Customer/AAA/customer.xml\"/>"
                 "</CustomerDataSet>");
    EXPECT_EQ(matches({"26201", "123"}), std::vector<std::string>{"Own"});
    set_string("db/zel/salescode", "");
    EXPECT_EQ(matches({"26201", "123"}), std::vector<std::string>{});
}

TEST_F(SimMatch, TheWholeListCanMatch) {
    write_networks("TST", "TST", std::vector<zel_test::Network>(271, {"N", "26201"}));
    EXPECT_EQ(matches({"26201", "123"}).size(), 270U);
}

TEST_F(SimMatch, FieldsWithoutATerminatorAreReadToTheirEnd) {
    write_networks("TST", "TST", {{"P", "999999999"}, {"S", "26201", "12345"}});
    ZelSvcSimInfo info;
    std::memset(&info, '9', sizeof info);
    ZelSvcSimOperator list[ZEL_SVC_MAX_OPERATORS / 10];
    int32_t count = -1;
    zel_svc_sim_auto_setting_get_operator_list_by_sim(&info, list, &count);
    EXPECT_EQ(count, 0);
}

TEST_F(SimMatch, WithoutSimListOrCountNothingHappens) {
    write_networks("TST", "TST", {{"One", "26201"}});
    ZelSvcSimInfo info = {};
    std::strcpy(info.mccmnc, "26201");
    ZelSvcSimOperator list[2] = {};
    int32_t count = 7;
    zel_svc_sim_auto_setting_get_operator_list_by_sim(nullptr, list, &count);
    zel_svc_sim_auto_setting_get_operator_list_by_sim(&info, nullptr, &count);
    zel_svc_sim_auto_setting_get_operator_list_by_sim(&info, list, nullptr);
    EXPECT_EQ(count, 7);
    EXPECT_STREQ(list[0].network_name, "");
}
