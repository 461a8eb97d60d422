// The telephony daemon is told of new APN profiles over the phone's real system bus, and whatever becomes of
// daemon and bus, the install goes on and the caller's process lives.

#include "service-phone.h"
#include "support/phone-bus.h"

#include <algorithm>
#include <chrono>
#include <cstring>
#include <dbus/dbus.h>
#include <gmock/gmock.h>
#include <memory>

namespace {

using ::testing::Contains;
using ::testing::ElementsAre;
using ::testing::IsEmpty;
using ::testing::Not;
using ::testing::StartsWith;
using zel_test::PhoneBus;
using zel_test::Telephony;

constexpr const char *kSettingLog = "/opt/system/zel-default/output/zel-sim-setting.log";
constexpr const char *kSettingLog2 = "/opt/system/zel-default/output/zel-sim2-setting.log";
constexpr const char *kUpdated = "memory/zel/sim_auto_setting_updated";

struct SimBus : zel_test::ServicePhone {
    void SetUp() override {
        ServicePhone::SetUp();
        set_string("db/zel/salescode", "TST");
        set_int("db/private/zel/sim_auto_enable", 1);
        leave_profiles_to_sim("on");
    }

    void leave_profiles_to_sim(const std::string &flag) {
        write_customer("TST", "<GeneralInfo><SalesCode>TST</SalesCode><NetworkInfo><NetworkName>One</NetworkName>"
                              "<MCCMNC>26201</MCCMNC></NetworkInfo></GeneralInfo><Settings><Main><Network>"
                              "<AutoProfile>" +
                                  flag + "</AutoProfile></Network></Main></Settings>");
    }

    void insert(int slot) {
        call("sim-insert", {{"slot", slot}, {"mcc", "262"}, {"mnc", "01"}, {"msin", "1234567890"}});
    }

    static void install(int slot = 1) {
        ZelSvcSimOperator entry = {};
        std::strcpy(entry.customer_name, "TST");
        std::strcpy(entry.network_name, "One");
        std::strcpy(entry.mccmnc, "26201");
        zel_svc_sim_auto_setting_install_operator(&entry, slot);
    }

    // What an install does last.
    bool is_installed(const char *log) {
        return exists(log) && read(log) == "TST_One('26201',(Subset)'',(GID)'',(SPName)'') installed.\n" &&
               get_int(kUpdated) == 1;
    }

    // The system log's texts about the bus, without the place in the source.
    std::vector<std::string> bus_messages() {
        std::vector<std::string> texts;
        for (const std::string &message : system_log())
            if (const std::string text = message.substr(message.find(") > ") + 4);
                text.starts_with("[SIM") && (text.find("dbus_") != text.npos || text.find("==>") != text.npos))
                texts.push_back(text);
        return texts;
    }
    // The one that says how the call ended.
    std::string end_of_call() {
        const std::vector<std::string> texts = bus_messages();
        const auto end = std::find_if(texts.rbegin(), texts.rend(),
                                      [](const std::string &text) { return text.find("==>") != text.npos; });
        return end == texts.rend() ? "no end" : *end;
    }
};

struct SimBusOfTwoSlots : SimBus {
    SimBusOfTwoSlots() { create_arguments["sims"] = 2; }
};

TEST_F(SimBus, TheDaemonIsToldOfNewProfiles) {
    PhoneBus bus(root());
    bus.start_telephony(Telephony::Answers);
    install();
    EXPECT_THAT(bus.calls(), ElementsAre("/modem1 com.tcore.ps.modem ResetProfile(int32 1)"));
    EXPECT_THAT(bus_messages(),
                ElementsAre("[SIM1] dbus_bus_get() succeeded.",
                            "[SIM1] dbus_message_new_method_call(path='/modem1',interface='com.tcore.ps.modem') "
                            "succeeded.",
                            "[SIM1] dbus_message_append_args() succeeded.",
                            "[SIM1] dbus_connection_send_with_reply_and_block() run.", "[SIM1] ==> succeeded.",
                            "[SIM1] dbus_message_unref(Msg) run.", "[SIM1] dbus_message_unref(MsgReply) run."));
    EXPECT_TRUE(is_installed(kSettingLog));
}

TEST_F(SimBusOfTwoSlots, TheModemOfTheSlotIsTold) {
    call("sim", {{"slot", 2}, {"modem", "other_modem"}});
    PhoneBus bus(root());
    bus.start_telephony(Telephony::Answers);
    install(2);
    install(1);
    EXPECT_THAT(bus.calls(), ElementsAre("/other_modem com.tcore.ps.modem ResetProfile(int32 1)",
                                         "/modem1 com.tcore.ps.modem ResetProfile(int32 1)"));
    EXPECT_TRUE(is_installed(kSettingLog));
    EXPECT_TRUE(is_installed(kSettingLog2));
}

TEST_F(SimBusOfTwoSlots, ARunTellsTheModemOfEachNewSim) {
    insert(1);
    insert(2);
    PhoneBus bus(root());
    bus.start_telephony(Telephony::Answers);
    EXPECT_EQ(zel_svc_sim_auto_setting_execute_by_sim(), 0);
    EXPECT_THAT(bus.calls(), ElementsAre("/modem1 com.tcore.ps.modem ResetProfile(int32 1)",
                                         "/modem2 com.tcore.ps.modem ResetProfile(int32 1)"));
    EXPECT_EQ(zel_svc_sim_auto_setting_execute_by_sim(), 2);
    EXPECT_EQ(bus.calls().size(), 2U); // the same SIMs: nothing is installed, and nobody told
}

TEST_F(SimBus, NobodyIsToldWhenProfilesAreNotTheSims) {
    leave_profiles_to_sim("off");
    PhoneBus bus(root());
    bus.start_telephony(Telephony::Answers);
    install();
    EXPECT_THAT(bus.calls(), IsEmpty());
    EXPECT_THAT(bus_messages(), IsEmpty());
    EXPECT_TRUE(is_installed(kSettingLog));
}

TEST_F(SimBus, WithoutBusTheInstallGoesOn) {
    install();
    EXPECT_THAT(bus_messages(), ElementsAre("[SIM1] dbus_bus_get() failed, return."));
    EXPECT_TRUE(is_installed(kSettingLog));
}

TEST_F(SimBus, WithoutDaemonTheInstallGoesOn) {
    PhoneBus bus(root());
    install();
    EXPECT_THAT(end_of_call(), StartsWith("[SIM1] ==> failed(err.name='org.freedesktop.DBus.Error.ServiceUnknown',"));
    EXPECT_EQ(bus_messages().back(), "[SIM1] dbus_message_unref(Msg) run.");
    EXPECT_TRUE(is_installed(kSettingLog));
}

TEST_F(SimBus, AnErrorIsNoAnswer) {
    PhoneBus bus(root());
    bus.start_telephony(Telephony::AnswersAnError);
    install();
    EXPECT_EQ(end_of_call(), "[SIM1] ==> failed(err.name='com.tcore.ps.Error',err.msg='no profile to reset').");
    EXPECT_THAT(bus_messages(), Not(Contains("[SIM1] dbus_message_unref(MsgReply) run.")));
    EXPECT_TRUE(is_installed(kSettingLog));
}

TEST_F(SimBus, ADaemonThatNeverAnswersIsGivenUp) {
    PhoneBus bus(root(), 150);
    bus.start_telephony(Telephony::NeverAnswers);
    const auto begin = std::chrono::steady_clock::now();
    install();
    EXPECT_LT(std::chrono::steady_clock::now() - begin, std::chrono::seconds(20)); // the bus library's own is 25
    EXPECT_EQ(bus.calls().size(), 1U);
    EXPECT_THAT(end_of_call(), StartsWith("[SIM1] ==> failed(err.name='org.freedesktop.DBus.Error.NoReply',"));
    EXPECT_TRUE(is_installed(kSettingLog));
}

TEST_F(SimBus, ADaemonThatDiesIsGivenUp) {
    PhoneBus bus(root(), 60'000);
    bus.start_telephony(Telephony::Dies);
    install();
    EXPECT_EQ(bus.calls().size(), 1U);
    EXPECT_THAT(end_of_call(), StartsWith("[SIM1] ==> failed(err.name='org.freedesktop.DBus.Error.NoReply',"));
    EXPECT_TRUE(is_installed(kSettingLog));
}

TEST_F(SimBus, ADaemonThatComesLaterIsTold) {
    PhoneBus bus(root());
    install();
    bus.start_telephony(Telephony::Answers);
    install();
    EXPECT_THAT(bus.calls(), ElementsAre("/modem1 com.tcore.ps.modem ResetProfile(int32 1)"));
}

TEST_F(SimBus, ABusThatDiesDuringTheCallIsGivenUp) {
    PhoneBus bus(root(), 60'000);
    bus.start_telephony(Telephony::EndsTheBus);
    install();
    EXPECT_THAT(end_of_call(), StartsWith("[SIM1] ==> failed(err.name='org.freedesktop.DBus.Error."));
    EXPECT_TRUE(is_installed(kSettingLog));
}

TEST_F(SimBus, ABusThatWentAwayIsNoObstacleToTheNextInstall) {
    PhoneBus bus(root());
    bus.start_telephony(Telephony::Answers);
    install();
    bus.stop();
    call("vconf-unset", {{"key", kUpdated}});
    install();
    EXPECT_EQ(get_int(kUpdated), 1);
    EXPECT_THAT(end_of_call(), StartsWith("[SIM1] ==> failed(err.name='org.freedesktop.DBus.Error."));
}

// Gives back a connection whose bus has gone: the test's own reference and those of the resets, which each take one
// and keep it for the life of the process. The bus library no longer holds such a connection, so a leak check would
// find them.
void give_back(DBusConnection *ended, int resets) {
    for (int reference = 0; reference <= resets; ++reference)
        dbus_connection_unref(ended);
}

// The process keeps its one connection, which ended with the bus, until somebody who listens to it is told so.
TEST_F(SimBus, ABusThatComesBackIsFoundOnceTheProcessHasHeardOfItsEnd) {
    auto bus = std::make_unique<PhoneBus>(root());
    bus->start_telephony(Telephony::Answers);
    install();
    EXPECT_EQ(end_of_call(), "[SIM1] ==> succeeded.");
    bus.reset();
    bus = std::make_unique<PhoneBus>(root());
    bus->start_telephony(Telephony::Answers);
    for (int attempt = 0; attempt < 2; ++attempt) {
        install();
        EXPECT_THAT(end_of_call(), StartsWith("[SIM1] ==> failed(err.name='org.freedesktop.DBus.Error.Disconnected',"));
    }
    EXPECT_THAT(bus->calls(), IsEmpty());
    DBusConnection *ended = dbus_bus_get(DBUS_BUS_SYSTEM, nullptr);
    ASSERT_NE(ended, nullptr);
    while (dbus_connection_dispatch(ended) == DBUS_DISPATCH_DATA_REMAINS) {
    }
    give_back(ended, 3);
    install();
    EXPECT_THAT(bus->calls(), ElementsAre("/modem1 com.tcore.ps.modem ResetProfile(int32 1)"));
}

TEST_F(SimBus, AModemThatTheListLacksIsTheRootPath) {
    set_int("memory/telephony/sim_slot_count", 2);
    PhoneBus bus(root());
    bus.start_telephony(Telephony::Answers);
    install(2);
    EXPECT_THAT(bus_messages(), Contains("[SIM2] dbus_message_new_method_call(path='/',interface='com.tcore.ps.modem') "
                                         "succeeded."));
    EXPECT_THAT(bus.calls(), ElementsAre("/ com.tcore.ps.modem ResetProfile(int32 1)"));
}

// A process that listens to its shared connection is ended by the bus library when the bus goes away, unless it
// said that it does not want to be.
TEST_F(SimBus, ABusThatGoesAwayDoesNotEndTheCallersProcess) {
    PhoneBus bus(root());
    install();
    DBusConnection *shared = dbus_bus_get(DBUS_BUS_SYSTEM, nullptr);
    ASSERT_NE(shared, nullptr);
    bus.stop();
    while (dbus_connection_read_write_dispatch(shared, 1000) != 0) {
    }
    EXPECT_EQ(dbus_connection_get_is_connected(shared), 0U);
    give_back(shared, 1);
}

} // namespace
