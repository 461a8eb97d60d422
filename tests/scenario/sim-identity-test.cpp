#include "sim-phone.h"

#include <gmock/gmock.h>

#include <cstring>

namespace {

using ::testing::Contains;
using ::testing::Each;
using ::testing::ElementsAre;
using ::testing::HasSubstr;
using ::testing::Not;

constexpr const char *kSlotCount = "memory/telephony/sim_slot_count";

ZelSvcSimInfo full_record() {
    ZelSvcSimInfo info;
    std::memset(&info, 'x', sizeof info);
    return info;
}

bool is_empty(const ZelSvcSimInfo &info) {
    const ZelSvcSimInfo empty = {};
    return std::memcmp(&info, &empty, sizeof info) == 0;
}

class SimIdentity : public zel_test::SimPhone {
  protected:
    int read(int slot) { return zel_svc_sim_auto_setting_get_sim_info(&info_, slot); }
    ZelSvcSimInfo info_ = full_record();
};

struct SimIdentityOfTwoSlots : SimIdentity {
    SimIdentityOfTwoSlots() { create_arguments["sims"] = 2; }
};

} // namespace

TEST_F(SimIdentity, OfAPhoneWithOneSlotIsReadFromTheModemWithoutAName) {
    call("sim-insert",
         {{"slot", 1}, {"mcc", "655"}, {"mnc", "01"}, {"msin", "1234567890"}, {"gid", "FF"}, {"spn", "N"}});
    call("journal-start");
    EXPECT_EQ(read(1), 1);
    EXPECT_STREQ(info_.mccmnc, "65501");
    EXPECT_STREQ(info_.msin, "1234567890");
    EXPECT_STREQ(info_.gid, "");
    EXPECT_STREQ(info_.spn, "");
    EXPECT_THAT(messages(), ElementsAre("vconf_get_int(SimSlotCount,1)=0 run.", "tel_init() succeeded.",
                                        "[SIM1] SIM(655_01_123) read.", "tel_deinit() run."));
    EXPECT_THAT(journal(), Not(Contains(HasSubstr("tel_get_cp_name_list"))));
}

TEST_F(SimIdentity, TheRecordIsZeroedToItsLastByte) {
    insert(1, "655", "01", "12");
    EXPECT_EQ(read(1), 1);
    ZelSvcSimInfo expected = {};
    std::strcpy(expected.mccmnc, "65501");
    std::strcpy(expected.msin, "12");
    EXPECT_EQ(std::memcmp(&info_, &expected, sizeof expected), 0);
}

TEST_F(SimIdentity, AThreeDigitNetworkCodeIsKept) {
    insert(1, "310", "410", "0000000001");
    EXPECT_EQ(read(1), 1);
    EXPECT_STREQ(info_.mccmnc, "310410");
}

TEST_F(SimIdentity, AShortMsinIsLoggedWithTheDigitsThereAre) {
    insert(1, "655", "01", "12");
    read(1);
    insert(1, "655", "01", "");
    read(1);
    EXPECT_TRUE(system_logged("[SIM1] SIM(655_01_12) read."));
    EXPECT_TRUE(system_logged("[SIM1] SIM(655_01_) read."));
}

TEST_F(SimIdentity, NoLogHoldsMoreThanThreeDigitsOfTheMsin) {
    insert(1, "655", "01", "1234567890");
    read(1);
    EXPECT_THAT(system_log(), Each(Not(HasSubstr("1234"))));
}

TEST_F(SimIdentity, WithoutASlotCountThePhoneHasOneSlot) {
    insert(1, "655", "01", "1234567890");
    fail("vconf_get_int", kSlotCount);
    EXPECT_EQ(read(2), 1);
    EXPECT_THAT(messages(), ElementsAre("vconf_get_int(SimSlotCount,-1)=-1 run.", "tel_init() succeeded.",
                                        "[SIM2] SIM(655_01_123) read.", "tel_deinit() run."));
}

TEST_F(SimIdentity, ASlotCountOfAnotherTypeCountsAsNone) {
    insert(1, "655", "01", "1234567890");
    set_string(kSlotCount, "2");
    EXPECT_EQ(read(1), 1);
    EXPECT_TRUE(system_logged("vconf_get_int(SimSlotCount,-1)=-1 run."));
}

TEST_F(SimIdentity, WithoutAConnectionThereIsNone) {
    insert(1, "655", "01", "1234567890");
    fail("tel_init");
    EXPECT_EQ(read(1), 0);
    EXPECT_TRUE(is_empty(info_));
    EXPECT_THAT(messages(), ElementsAre("vconf_get_int(SimSlotCount,1)=0 run.", "tapi init() failed."));
}

TEST_F(SimIdentity, OfAnUnreadableCardIsEmptyAndTheErrorIsLogged) {
    insert(1, "655", "01", "1234567890", 5);
    EXPECT_EQ(read(1), 0);
    EXPECT_TRUE(is_empty(info_));
    EXPECT_THAT(messages(), ElementsAre("vconf_get_int(SimSlotCount,1)=0 run.", "tel_init() succeeded.",
                                        "tel_get_sim()=5 failed.", "tel_deinit() run."));
}

TEST_F(SimIdentity, ARefusedReadEndsTheConnectionToo) {
    insert(1, "655", "01", "1234567890");
    fail("tel_get_sim_imsi", "", 1, -1, -7);
    EXPECT_EQ(read(1), 0);
    EXPECT_TRUE(is_empty(info_));
    EXPECT_TRUE(system_logged("tel_get_sim()=-7 failed."));
    EXPECT_TRUE(system_logged("tel_deinit() run."));
}

TEST_F(SimIdentity, AConnectionThatDoesNotEndChangesNothing) {
    insert(1, "655", "01", "1234567890");
    fail("tel_deinit");
    EXPECT_EQ(read(1), 1);
    EXPECT_STREQ(info_.mccmnc, "65501");
    EXPECT_TRUE(system_logged("tel_deinit() run."));
}

TEST_F(SimIdentity, WithoutARecordNothingIsRead) {
    EXPECT_EQ(zel_svc_sim_auto_setting_get_sim_info(nullptr, 1), 0);
    EXPECT_TRUE(system_log().empty());
}

TEST_F(SimIdentity, AModemThatTheListLacksHasAnEmptyName) {
    insert(1, "655", "01", "1234567890");
    set_int(kSlotCount, 2);
    call("journal-start");
    EXPECT_EQ(read(2), 0);
    EXPECT_TRUE(system_logged("tapi init() failed."));
    EXPECT_EQ(read(1), 1);
}

TEST_F(SimIdentityOfTwoSlots, IsReadFromTheSlotsModem) {
    insert(1, "655", "01", "1111111111");
    insert(2, "655", "10", "2222222222");
    EXPECT_EQ(read(2), 1);
    EXPECT_STREQ(info_.mccmnc, "65510");
    EXPECT_STREQ(info_.msin, "2222222222");
    for (const int slot : {1, 0, 7, -1}) {
        EXPECT_EQ(read(slot), 1);
        EXPECT_STREQ(info_.msin, "1111111111") << slot;
    }
}

TEST_F(SimIdentityOfTwoSlots, TheModemNamesAreReadOncePerProcess) {
    insert(1, "655", "01", "1111111111");
    insert(2, "655", "10", "2222222222");
    call("journal-start");
    read(1);
    read(2);
    EXPECT_THAT(messages(), ElementsAre("vconf_get_int(SimSlotCount,2)=0 run.", "tel_get_cp_name_list() succeeded.",
                                        "tel_init() succeeded.", "[SIM1] SIM(655_01_111) read.", "tel_deinit() run.",
                                        "vconf_get_int(SimSlotCount,2)=0 run.", "gbZelSvcSimAutoSettingSimCpRead=TRUE.",
                                        "tel_init() succeeded.", "[SIM2] SIM(655_10_222) read.", "tel_deinit() run."));
}

TEST_F(SimIdentityOfTwoSlots, WithoutModemNamesNothingIsReadAndTheNextCallAsksAgain) {
    insert(1, "655", "01", "1111111111");
    fail("tel_get_cp_name_list", "", 1, 1);
    EXPECT_EQ(read(1), 0);
    EXPECT_TRUE(is_empty(info_));
    EXPECT_THAT(messages(),
                ElementsAre("vconf_get_int(SimSlotCount,2)=0 run.", "tel_get_cp_name_list() failed, return."));
    EXPECT_EQ(read(1), 1);
}

TEST_F(SimIdentityOfTwoSlots, ALongModemNameIsCutTo99Bytes) {
    insert(2, "655", "10", "2222222222");
    call("sim", {{"slot", 2}, {"modem", std::string(99, 'm')}});
    EXPECT_EQ(read(2), 1);
}

TEST_F(SimIdentityOfTwoSlots, OfALongerModemNameTheFirst99BytesAreAskedFor) {
    insert(2, "655", "10", "2222222222");
    call("sim", {{"slot", 2}, {"modem", std::string(98, 'm') + "\xC3\xA9"}});
    call("journal-start");
    EXPECT_EQ(read(2), 0);
    EXPECT_THAT(journal(), Contains("tel_init " + std::string(98, 'm'))); // no half character
}
