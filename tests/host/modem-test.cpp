// The phone's modems and SIM cards: how they are put in, and what the telephony client answers of them.

#include "support/bench-phone.h"

#include <cstdlib>
#include <gmock/gmock.h>
#include <memory>
#include <telephony.h>

namespace {

using nlohmann::json;
using ::testing::ElementsAre;

constexpr const char *kCount = "memory/telephony/sim_slot_count";
constexpr const char *kState1 = "memory/telephony/sim_slot";
constexpr const char *kState2 = "memory/telephony/sim_slot2";

struct Modems : zel_test::BenchPhone {
    Modems() { create_arguments["sims"] = 2; }

    void insert(int slot, const json &card = json::object()) {
        json arguments{{"slot", slot}, {"mcc", "214"}, {"mnc", "05"}, {"msin", "9876543210"}};
        arguments.update(card);
        call("sim-insert", arguments);
    }

    int result_of(const char *verb, const json &arguments) {
        zel_host_phone *phone = zel_host_open(root().c_str(), nullptr);
        const int result = zel_host_call(phone, verb, arguments.dump().c_str(), nullptr);
        zel_host_close(phone);
        return result;
    }

    static std::vector<std::string> names() {
        std::vector<std::string> result;
        char **list = tel_get_cp_name_list();
        for (char **name = list; name != nullptr && *name != nullptr; ++name) {
            result.emplace_back(*name);
            std::free(*name);
        }
        std::free(list);
        return result;
    }

    // "MCC MNC MSIN", or the error number of the first call that fails.
    static std::string read_card(const char *modem) {
        tel_handle *handle = tel_init(modem);
        if (handle == nullptr) return "no modem";
        tel_sim_imsi imsi{};
        const int result = tel_get_sim_imsi(handle, &imsi);
        EXPECT_EQ(tel_deinit(handle), 0);
        if (result != 0) return std::to_string(result);
        return std::string(imsi.mcc) + " " + imsi.mnc + " " + imsi.msin;
    }
};

struct OneModem : Modems {
    OneModem() { create_arguments["sims"] = 1; }
};

struct NoSlot : Modems {
    NoSlot() { create_arguments["sims"] = 0; }
};

TEST_F(Modems, AreListedInTheOrderOfTheirSlots) {
    EXPECT_THAT(names(), ElementsAre("modem1", "modem2"));
    call("sim", {{"slot", 1}, {"modem", "z"}});
    call("sim", {{"slot", 2}, {"modem", ""}});
    EXPECT_THAT(names(), ElementsAre("z", ""));
}

TEST_F(OneModem, IsListedAlone) { EXPECT_THAT(names(), ElementsAre("modem1")); }

TEST_F(NoSlot, HasNoModem) {
    EXPECT_THAT(names(), ElementsAre());
    EXPECT_EQ(read_card(nullptr), "no modem");
    EXPECT_EQ(get_int(kCount), 0);
    EXPECT_EQ(get_int(kState1), 0);
}

TEST_F(Modems, GiveTheImsiOfTheirOwnCard) {
    insert(1, {{"msin", "1234567890"}});
    insert(2, {{"mcc", "310"}, {"mnc", "410"}, {"msin", "555"}});
    EXPECT_EQ(read_card("modem1"), "214 05 1234567890");
    EXPECT_EQ(read_card("modem2"), "310 410 555");
    EXPECT_EQ(read_card(nullptr), "214 05 1234567890");
    EXPECT_EQ(read_card("modem3"), "no modem");
}

TEST_F(Modems, WithoutCardGiveAnErrorAndNoDigits) {
    EXPECT_EQ(read_card("modem1"), "-3");
    call("sim", {{"slot", 1}, {"state", 1}});
    EXPECT_EQ(read_card("modem1"), "-3");
}

TEST_F(Modems, GiveTheErrorOfAnUnreadableCard) {
    insert(1, {{"result", 7}});
    EXPECT_EQ(read_card("modem1"), "7");
    insert(1);
    EXPECT_EQ(read_card("modem1"), "214 05 9876543210");
}

TEST_F(Modems, RefuseWhatIsNoConnection) {
    tel_sim_imsi imsi{};
    EXPECT_NE(tel_get_sim_imsi(nullptr, &imsi), 0);
    EXPECT_NE(tel_deinit(nullptr), 0);
    tel_handle *handle = tel_init("modem1");
    ASSERT_NE(handle, nullptr);
    EXPECT_NE(tel_get_sim_imsi(handle, nullptr), 0);
    EXPECT_EQ(tel_deinit(handle), 0);
}

TEST_F(Modems, AnnounceACardThatComesAndGoes) {
    EXPECT_EQ(get_int(kCount), 2);
    EXPECT_EQ(get_int(kState1), 0);
    insert(2, {{"result", -1}});
    EXPECT_EQ(get_int(kState1), 0);
    EXPECT_EQ(get_int(kState2), 1);
    call("sim-remove", {{"slot", 2}});
    EXPECT_EQ(get_int(kState2), 0);
    EXPECT_EQ(read_card("modem2"), "-3");
}

TEST_F(Modems, LeaveTheOtherKeysToTheTestThatSetThem) {
    set_int(kCount, 9);
    set_int(kState1, 5);
    insert(2);
    EXPECT_EQ(get_int(kCount), 9);
    EXPECT_EQ(get_int(kState1), 5);
}

TEST_F(Modems, KeepTheirCardsThroughARestartAndAReset) {
    insert(1);
    call("sim", {{"slot", 2}, {"state", 4}, {"modem", "other"}});
    for (const char *verb : {"reboot", "reset"}) {
        call("vconf-unset", {{"key", kCount}});
        call("vconf-unset", {{"key", kState1}});
        call("vconf-unset", {{"key", kState2}});
        call(verb);
        EXPECT_EQ(get_int(kCount), 2) << verb;
        EXPECT_EQ(get_int(kState1), 1) << verb;
        EXPECT_EQ(get_int(kState2), 4) << verb;
        EXPECT_EQ(read_card("modem1"), "214 05 9876543210") << verb;
        EXPECT_THAT(names(), ElementsAre("modem1", "other")) << verb;
    }
    EXPECT_EQ(call("status").at("sim_states"), json({1, 4}));
}

TEST_F(Modems, AreShownWithTheirCards) {
    EXPECT_EQ(call("sim", {{"slot", 2}}), json::parse(R"({"slot": 2, "state": 0, "modem": "modem2", "card": false})"));
    insert(2, {{"gid", "A3"}, {"spn", "Móvil"}, {"result", 3}});
    EXPECT_EQ(call("sim", {{"slot", 2}}), json::parse(R"({"slot": 2, "state": 1, "modem": "modem2", "card": true,
        "mcc": "214", "mnc": "05", "msin": "9876543210", "gid": "A3", "spn": "Móvil", "read_result": 3})"));
}

TEST_F(Modems, TakeNoMoreDigitsThanAnImsiHas) {
    EXPECT_EQ(result_of("sim-insert", {{"slot", 1}, {"mcc", "2140"}, {"mnc", "05"}, {"msin", "1"}}), 2);
    EXPECT_EQ(result_of("sim-insert", {{"slot", 1}, {"mcc", "214"}, {"mnc", "0555"}, {"msin", "1"}}), 2);
    EXPECT_EQ(result_of("sim-insert", {{"slot", 1}, {"mcc", "214"}, {"mnc", "05"}, {"msin", "12345678901"}}), 2);
    EXPECT_EQ(result_of("sim-insert", {{"slot", 1}, {"mcc", "214"}, {"mnc", "05"}}), 2);
    EXPECT_EQ(result_of("sim-insert", {{"slot", 3}, {"mcc", "214"}, {"mnc", "05"}, {"msin", "1"}}), 2);
    EXPECT_EQ(result_of("sim", {{"slot", 0}}), 2);
    EXPECT_EQ(call("sim", {{"slot", 1}}).at("card"), false);
}

TEST_F(OneModem, HasNoSecondSlot) {
    for (const char *verb : {"sim", "sim-remove"})
        EXPECT_EQ(result_of(verb, {{"slot", 2}}), 1) << verb;
    EXPECT_EQ(get_int(kState2), std::nullopt);
}

TEST_F(Modems, FailWhenToldTo) {
    insert(1);
    insert(2);
    fail("tel_get_sim_imsi", "modem2", 1, -1, 42);
    EXPECT_EQ(read_card("modem1"), "214 05 9876543210");
    EXPECT_EQ(read_card("modem2"), "42");
    fail("tel_init", "modem1");
    EXPECT_EQ(read_card("modem1"), "no modem");
    fail("tel_get_cp_name_list");
    EXPECT_EQ(tel_get_cp_name_list(), nullptr);
    fail("tel_deinit", "modem2", 1, 1, -9);
    EXPECT_EQ(tel_deinit(tel_init("modem2")), -9);
}

TEST_F(Modems, AreJournalledByName) {
    insert(1);
    call("journal-start");
    read_card(nullptr);
    names();
    call("journal-stop");
    std::vector<std::string> calls;
    const json journal = call("journal-list");
    for (const json &entry : journal.at("calls"))
        calls.push_back(entry.at("function").get<std::string>() + entry.at("arguments").dump());
    EXPECT_THAT(calls, ElementsAre("tel_init[null]", "tel_get_sim_imsi[\"modem1\"]", "tel_deinit[\"modem1\"]",
                                   "tel_get_cp_name_list[]"));
}

} // namespace
