#include "zel-svc-sim-auto-setting-apn-reset.h"

#include "zel-svc-sim-auto-setting-modem.h"

#include "libdbus.h"
#include "support/bench-phone.h"
#include "zel-svc.h"

#include <gmock/gmock.h>

namespace {

using ::testing::Contains;
using ::testing::ElementsAre;
using ::testing::HasSubstr;
using ::testing::IsEmpty;

constexpr const char *kRead = "tel_get_cp_name_list() succeeded.";

class ApnReset : public zel_test::BenchPhone {
  protected:
    void SetUp() override {
        BenchPhone::SetUp();
        bus_.connects = true;
        zel_test::use_libdbus(&bus_);
    }
    void TearDown() override {
        zel_test::use_libdbus(nullptr);
        BenchPhone::TearDown();
    }
    static void reset(int slot) { __zel_svc_sim_auto_setting_reset_apn_with_dbus(slot); }
    void rename_modem(int slot, const std::string &name) { call("sim", {{"slot", slot}, {"modem", name}}); }

    // The system log's texts, without the place in the source.
    std::vector<std::string> messages() {
        std::vector<std::string> texts;
        for (const std::string &message : system_log())
            texts.push_back(message.substr(message.find(") > ") + 4));
        return texts;
    }

    zel_test::Libdbus bus_;
};

struct ApnResetOfTwoSlots : ApnReset {
    ApnResetOfTwoSlots() { create_arguments["sims"] = 2; }
};

std::string called(int slot, const std::string &path, const std::string &end) {
    return "[SIM" + std::to_string(slot) + "] dbus_message_new_method_call(path='" + path +
           "',interface='com.tcore.ps.modem') " + end;
}

} // namespace

TEST_F(ApnReset, CallsTheModemsResetWithOne) {
    reset(1);
    EXPECT_THAT(bus_.sent, ElementsAre("com.tcore.ps /modem1 com.tcore.ps.modem ResetProfile(i)"));
    EXPECT_THAT(bus_.arguments, ElementsAre(1));
    EXPECT_THAT(bus_.time_outs, ElementsAre(-1));
    EXPECT_EQ(bus_.exits_on_disconnect, false);
    EXPECT_THAT(messages(),
                ElementsAre("vconf_get_int(SimSlotCount,1)=0 run.", kRead, "[SIM1] dbus_bus_get() succeeded.",
                            called(1, "/modem1", "succeeded."), "[SIM1] dbus_message_append_args() succeeded.",
                            "[SIM1] dbus_connection_send_with_reply_and_block() run.", "[SIM1] ==> succeeded.",
                            "[SIM1] dbus_message_unref(Msg) run.", "[SIM1] dbus_message_unref(MsgReply) run."));
}

TEST_F(ApnReset, AnErrorIsLoggedWithItsNameAndText) {
    bus_.replies = false;
    bus_.error_name = "com.tcore.ps.Busy";
    bus_.error_text = "not now";
    reset(1);
    EXPECT_THAT(messages(),
                ElementsAre("vconf_get_int(SimSlotCount,1)=0 run.", kRead, "[SIM1] dbus_bus_get() succeeded.",
                            called(1, "/modem1", "succeeded."), "[SIM1] dbus_message_append_args() succeeded.",
                            "[SIM1] dbus_connection_send_with_reply_and_block() run.",
                            "[SIM1] ==> failed(err.name='com.tcore.ps.Busy',err.msg='not now').",
                            "[SIM1] dbus_message_unref(Msg) run."));
}

TEST_F(ApnReset, AMissingReplyWithoutAnErrorIsLoggedWithoutTexts) {
    bus_.replies = false;
    reset(1);
    EXPECT_THAT(messages(), Contains("[SIM1] ==> failed(err.name='',err.msg='')."));
}

TEST_F(ApnReset, WithoutRoomForTheArgumentNothingIsSent) {
    bus_.appends = false;
    reset(1);
    EXPECT_THAT(bus_.sent, IsEmpty());
    EXPECT_THAT(messages(),
                ElementsAre("vconf_get_int(SimSlotCount,1)=0 run.", kRead, "[SIM1] dbus_bus_get() succeeded.",
                            called(1, "/modem1", "succeeded."), "[SIM1] dbus_message_append_args() failed.",
                            "[SIM1] dbus_message_unref(Msg) run."));
}

TEST_F(ApnReset, WithoutABusNothingIsSent) {
    bus_.connects = false;
    reset(1);
    EXPECT_THAT(messages(),
                ElementsAre("vconf_get_int(SimSlotCount,1)=0 run.", kRead, "[SIM1] dbus_bus_get() failed, return."));
}

TEST_F(ApnReset, OfAPhoneWithoutABusNothingIsSent) {
    zel_test::use_libdbus(nullptr);
    reset(1);
    EXPECT_THAT(messages(),
                ElementsAre("vconf_get_int(SimSlotCount,1)=0 run.", kRead, "[SIM1] dbus_bus_get() failed, return."));
}

TEST_F(ApnReset, WithoutModemNamesTheBusIsNotAsked) {
    fail("tel_get_cp_name_list");
    reset(1);
    EXPECT_THAT(messages(),
                ElementsAre("vconf_get_int(SimSlotCount,1)=0 run.", "tel_get_cp_name_list() failed, return."));
    EXPECT_FALSE(gbZelSvcSimAutoSettingSimCpRead);
}

TEST_F(ApnReset, OfAPhoneWithOneSlotIsTheFirstModemsWhateverTheSlot) {
    reset(2);
    EXPECT_THAT(bus_.sent, ElementsAre(HasSubstr(" /modem1 ")));
    EXPECT_THAT(messages(), Contains("[SIM2] ==> succeeded."));
}

TEST_F(ApnReset, WithoutASlotCountThePhoneHasOneSlot) {
    fail("vconf_get_int", "memory/telephony/sim_slot_count");
    reset(2);
    EXPECT_THAT(messages(), Contains("vconf_get_int(SimSlotCount,-1)=-1 run."));
    EXPECT_THAT(bus_.sent, ElementsAre(HasSubstr(" /modem1 ")));
}

TEST_F(ApnReset, ANameThatMakesNoPathGetsNoCall) {
    for (const char *name : {"mod em", "modem/",
                             "m\xC3\xB6"
                             "dem",
                             "a//b"}) {
        rename_modem(1, name);
        gbZelSvcSimAutoSettingSimCpRead = false;
        reset(1);
        EXPECT_EQ(messages().back(), called(1, std::string{"/"} + name, "failed, return.")) << name;
    }
    EXPECT_THAT(bus_.sent, IsEmpty());
}

TEST_F(ApnReset, ALongPathIsCutTo49Bytes) {
    rename_modem(1, std::string(60, 'm'));
    reset(1);
    EXPECT_THAT(messages(), Contains(called(1, "/" + std::string(48, 'm'), "succeeded.")));
}

TEST_F(ApnResetOfTwoSlots, IsTheSlotsModems) {
    reset(2);
    reset(1);
    reset(7);
    EXPECT_THAT(bus_.sent, ElementsAre(HasSubstr(" /modem2 "), HasSubstr(" /modem1 "), HasSubstr(" /modem1 ")));
    EXPECT_THAT(messages(), Contains("[SIM2] dbus_message_unref(MsgReply) run."));
}

TEST_F(ApnResetOfTwoSlots, SharesTheModemNamesThatTheIdentityRead) {
    ZelSvcSimInfo info;
    call("sim-insert", {{"slot", 1}, {"mcc", "262"}, {"mnc", "01"}, {"msin", "1234567890"}});
    EXPECT_EQ(zel_svc_sim_auto_setting_get_sim_info(&info, 1), 1);
    EXPECT_TRUE(gbZelSvcSimAutoSettingSimCpRead);
    rename_modem(2, "other");
    reset(2);
    EXPECT_THAT(messages(), Contains("gbZelSvcSimAutoSettingSimCpRead=TRUE."));
    EXPECT_THAT(bus_.sent, ElementsAre(HasSubstr(" /modem2 ")));
}

// The first reset may come before a SIM was read: both names must be kept then, or a phone whose second slot
// is announced later would have none.
TEST_F(ApnResetOfTwoSlots, KeepsBothModemNamesAlsoWhileThePhoneTellsOneSlot) {
    set_int("memory/telephony/sim_slot_count", 1);
    reset(1);
    set_int("memory/telephony/sim_slot_count", 2);
    reset(2);
    EXPECT_THAT(bus_.sent, ElementsAre(HasSubstr(" /modem1 "), HasSubstr(" /modem2 ")));
}
