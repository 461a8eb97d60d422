// The run of SIM auto setting: what each slot's SIM comes to, and what stands in the logs and keys then.

#include "sim-phone.h"

#include <gmock/gmock.h>

namespace {

using ::testing::ElementsAre;
using ::testing::HasSubstr;
using ::testing::IsEmpty;
using ::testing::Not;

constexpr const char *kStart = "***** ZEL SIM auto settings / Start *****";
constexpr const char *kEnd = "***** ZEL SIM auto settings / End *****";
constexpr const char *kNetworkName = "db/private/zel/sim_auto_op_network_name";
constexpr const char *kNetworkName2 = "db/private/zel/sim2/sim_auto_op_network_name";
constexpr const char *kMccMnc = "db/private/zel/sim_mcc_mnc";
constexpr const char *kMsin = "db/private/zel/sim_msin";
constexpr const char *kMccMnc2 = "db/private/zel/sim2/sim_mcc_mnc";
constexpr const char *kMsin2 = "db/private/zel/sim2/sim_msin";
constexpr const char *kSelection = "db/private/zel/sim_selection_show";
constexpr const char *kSelection2 = "db/private/zel/sim2/sim_selection_show";
constexpr const char *kChanged = "memory/private/zel/sim_changed";
constexpr const char *kChanged2 = "memory/private/zel/sim2/sim_changed";
constexpr const char *kSlotCount = "memory/telephony/sim_slot_count";
constexpr const char *kState = "memory/telephony/sim_slot";

int run() { return zel_svc_sim_auto_setting_execute_by_sim(); }

template <class Phone> class Run : public Phone {
  protected:
    // One plain operator of 26201, two of 26202.
    void SetUp() override {
        Phone::SetUp();
        this->write_networks("TST", "TST", {{"One", "26201"}, {"Two", "26202"}, {"Twin", "26202"}});
    }
};
using SimRun = Run<zel_test::SimPhone>;
using SimRunOfTwoSlots = Run<zel_test::TwoSimPhone>;

} // namespace

TEST_F(SimRun, WithoutAnActiveCustomerEndsAtOnce) {
    set_string("db/zel/salescode", "");
    insert(1, "262", "01", "1234567890");
    EXPECT_EQ(run(), 3);
    EXPECT_THAT(messages(), ElementsAre(kStart, "Pre-configuration needed."));
    EXPECT_EQ(read(kCheckLog), "Pre-configuration needed.\n");
    EXPECT_FALSE(exists(kSettingLog));
    EXPECT_EQ(get_bool(kChanged), std::nullopt);
}

TEST_F(SimRun, WithTheFeatureOffEndsAtOnce) {
    set_int("db/private/zel/sim_auto_enable", 0);
    insert(1, "262", "01", "1234567890");
    EXPECT_EQ(run(), 4);
    EXPECT_THAT(messages(), ElementsAre(kStart, "SIM auto setting disabled."));
    EXPECT_EQ(read(kCheckLog), "SIM auto setting disabled.\n");
    EXPECT_EQ(get_bool(kChanged), std::nullopt);
}

TEST_F(SimRunOfTwoSlots, WhatEndsItAtOnceStandsInTheFirstCheckLogAlone) {
    set_string("db/zel/salescode", "DEF");
    EXPECT_EQ(run(), 3);
    EXPECT_TRUE(exists(kCheckLog));
    EXPECT_FALSE(exists(kCheckLog2));
}

TEST_F(SimRun, ASelectionThatIsAwaitedDoesNotStopIt) {
    set_int(kSelection, 1);
    insert(1, "262", "01", "1234567890");
    EXPECT_EQ(run(), 0);
    EXPECT_EQ(get_int(kSelection), 0);
}

TEST_F(SimRun, BeginsWithNewCheckLogsAndLeavesTheSettingLogs) {
    for (const char *log : {kCheckLog, kCheckLog2, kSettingLog, kSettingLog2})
        write(log, "earlier\n");
    EXPECT_EQ(run(), 2);
    EXPECT_EQ(read(kCheckLog), "SIM1 not inserted(0).\n");
    EXPECT_FALSE(exists(kCheckLog2));
    EXPECT_EQ(read(kSettingLog), "earlier\n");
    EXPECT_EQ(read(kSettingLog2), "earlier\n");
    set_string("db/zel/salescode", "");
    write(kCheckLog2, "earlier\n");
    run();
    EXPECT_FALSE(exists(kCheckLog2));
}

TEST_F(SimRun, ASlotCountsAsInsertedOnlyInStateOne) {
    insert(1, "262", "01", "1234567890");
    for (const int state : {0, 2, -1, 11}) {
        call("sim", {{"slot", 1}, {"state", state}});
        EXPECT_EQ(run(), 2);
        EXPECT_EQ(read(kCheckLog), "SIM1 not inserted(" + std::to_string(state) + ").\n");
        EXPECT_TRUE(system_logged("[SIM1] SIM1 not inserted(" + std::to_string(state) + ")."));
    }
    EXPECT_EQ(get_bool(kChanged), std::nullopt);
}

TEST_F(SimRun, AStateThatCannotBeReadShowsAsMinusOne) {
    insert(1, "262", "01", "1234567890");
    fail("vconf_get_int", kState);
    EXPECT_EQ(run(), 2);
    EXPECT_EQ(read(kCheckLog), "SIM1 not inserted(-1).\n");
}

TEST_F(SimRun, AnUnreadableSimIsSkipped) {
    insert(1, "262", "01", "1234567890", 3);
    EXPECT_EQ(run(), 2);
    EXPECT_THAT(lines_in(kCheckLog), ElementsAre("SIM1 normally inserted.", "SIM recognition failed."));
    EXPECT_THAT(messages(),
                ElementsAre(kStart, "[SIM1] SIM1 normally inserted.", "vconf_get_int(SimSlotCount,1)=0 run.",
                            "tel_init() succeeded.", "tel_get_sim()=3 failed.", "tel_deinit() run.",
                            "[SIM1] SIM recognition failed.", kEnd));
    EXPECT_EQ(get_bool(kChanged), std::nullopt);
    EXPECT_EQ(get_string(kMsin), std::nullopt);
    EXPECT_FALSE(exists(kSettingLog));
}

TEST_F(SimRun, TheFirstSimsOnlyOperatorIsInstalled) {
    insert(1, "262", "01", "1234567890");
    EXPECT_EQ(run(), 0);
    EXPECT_THAT(lines_in(kCheckLog),
                ElementsAre("SIM1 normally inserted.", "Phone(MCCMNC='',MSIN='').",
                            "SIM(MCCMNC='26201',MSIN(3)='123',GID='',SPN='') inserted.", "SIM changed."));
    EXPECT_THAT(lines_in(kSettingLog), ElementsAre("SIM(MCCMNC='26201',MSIN(3)='123',GID='',SPN='') inserted.",
                                                   "[Op0] TST_One('26201',(Subset)'',(GID)'',(SPName)'') found.",
                                                   "TST_One('26201',(Subset)'',(GID)'',(SPName)'') installed."));
    EXPECT_THAT(
        messages(),
        ElementsAre(
            kStart, "[SIM1] SIM1 normally inserted.", "vconf_get_int(SimSlotCount,1)=0 run.", "tel_init() succeeded.",
            "[SIM1] SIM(262_01_123) read.", "tel_deinit() run.", "[SIM1] Phone(MCCMNC='',MSIN='').",
            "[SIM1] SIM changed.", "[SIM1] vconf_set_bool(ZelSimChanged,1)=0 run.",
            "vconf_set_str(ZelSimAutoOpNetName,'') succeeded.", "Setting active operator(vconf) succeeded.",
            "[SIM1][Op0] TST_One found!", "[SIM1] opCount=1.", "***** ZEL SIM auto settings / Install operator *****",
            "[SIM1] API(pszCustomerName='TST',pszNetworkName='One') run.",
            "vconf_set_str(ZelSimAutoOpCustomerName,'TST') succeeded.",
            "vconf_set_str(ZelSimAutoOpNetName,'One') succeeded.", "Setting active operator(vconf) succeeded.", kEnd));
    EXPECT_EQ(get_string(kMccMnc), "26201");
    EXPECT_EQ(get_string(kMsin), "1234567890");
    EXPECT_EQ(get_bool(kChanged), true);
    EXPECT_EQ(get_int(kSelection), 0);
    EXPECT_EQ(get_string(kNetworkName), "One");
    EXPECT_EQ(get_string("db/private/zel/sim_auto_op_customer_name"), "TST");
    EXPECT_EQ(get_string("db/private/zel/sim_auto_op_mcc_mnc"), "26201");
    EXPECT_EQ(get_int("memory/zel/sim_auto_setting_updated"), 1);
    for (const char *key : {kMccMnc2, kMsin2, kNetworkName2})
        EXPECT_EQ(get_string(key), std::nullopt) << key;
    EXPECT_EQ(get_int(kSelection2), std::nullopt);
    EXPECT_EQ(get_bool(kChanged2), std::nullopt);
}

TEST_F(SimRun, LogsHaveTheAttributesOfEveryLog) {
    insert(1, "262", "01", "1234567890");
    run();
    for (const char *log : {kCheckLog, kSettingLog}) {
        const nlohmann::json stat = call("stat", {{"path", log}});
        EXPECT_EQ(stat.at("mode"), "0644");
        EXPECT_EQ(stat.at("owner"), 200);
        EXPECT_EQ(stat.at("group"), 5000);
        EXPECT_EQ(stat.at("label"), "*");
    }
}

TEST_F(SimRun, TheSameSimAgainIsLeftAlone) {
    insert(1, "262", "01", "1234567890");
    run();
    const std::string setting_log = read(kSettingLog);
    set_string(kNetworkName, "kept");
    set_bool(kChanged, false);
    set_int(kSelection, 5);
    const std::size_t told = messages().size();
    EXPECT_EQ(run(), 2);
    EXPECT_THAT(lines_in(kCheckLog),
                ElementsAre("SIM1 normally inserted.", "Phone(MCCMNC='26201',MSIN(3)='123').",
                            "SIM(MCCMNC='26201',MSIN(3)='123',GID='',SPN='') inserted.", "SIM not changed."));
    EXPECT_EQ(read(kSettingLog), setting_log);
    EXPECT_EQ(get_string(kNetworkName), "kept");
    EXPECT_EQ(get_bool(kChanged), false);
    EXPECT_EQ(get_int(kSelection), 5);
    const std::vector<std::string> all = messages();
    EXPECT_THAT(std::vector<std::string>(all.begin() + static_cast<std::ptrdiff_t>(told), all.end()),
                ElementsAre(kStart, "[SIM1] SIM1 normally inserted.", "vconf_get_int(SimSlotCount,1)=0 run.",
                            "tel_init() succeeded.", "[SIM1] SIM(262_01_123) read.", "tel_deinit() run.",
                            "[SIM1] Phone(MCCMNC='26201',MSIN(3)='123').", "[SIM1] SIM not changed.", kEnd));
}

TEST_F(SimRun, AnMsinThatDiffersBehindItsThirdDigitIsAnotherSim) {
    insert(1, "262", "01", "1234567890");
    run();
    insert(1, "262", "01", "1234567891");
    EXPECT_EQ(run(), 0);
    EXPECT_THAT(lines_in(kCheckLog),
                ElementsAre("SIM1 normally inserted.", "Phone(MCCMNC='26201',MSIN(3)='123').",
                            "SIM(MCCMNC='26201',MSIN(3)='123',GID='',SPN='') inserted.", "SIM changed."));
    EXPECT_EQ(get_string(kMsin), "1234567891");
}

TEST_F(SimRun, AnotherNetworkCodeIsAnotherSimAndStartsANewSettingLog) {
    write(kSettingLog, "earlier\n");
    insert(1, "262", "01", "1234567890");
    run();
    write_networks("TST", "TST", {{"One", "26201"}, {"Three", "26203"}});
    insert(1, "262", "03", "1234567890");
    EXPECT_EQ(run(), 0);
    EXPECT_THAT(lines_in(kSettingLog), ElementsAre("SIM(MCCMNC='26203',MSIN(3)='123',GID='',SPN='') inserted.",
                                                   "[Op0] TST_Three('26203',(Subset)'',(GID)'',(SPName)'') found.",
                                                   "TST_Three('26203',(Subset)'',(GID)'',(SPName)'') installed."));
    EXPECT_EQ(get_string(kNetworkName), "Three");
    EXPECT_EQ(get_string(kMccMnc), "26203");
}

TEST_F(SimRun, AnAmbiguousSimAsksTheUserAgainAndAgain) {
    set_string(kNetworkName, "before");
    set_string("db/private/zel/sim_auto_op_customer_name", "OLD");
    insert(1, "262", "02", "1234567890");
    for (int start = 0; start < 2; ++start) {
        EXPECT_EQ(run(), 1);
        EXPECT_THAT(lines_in(kCheckLog),
                    ElementsAre("SIM1 normally inserted.", "Phone(MCCMNC='',MSIN='').",
                                "SIM(MCCMNC='26202',MSIN(3)='123',GID='',SPN='') inserted.", "SIM changed."));
        EXPECT_THAT(lines_in(kSettingLog), ElementsAre("SIM(MCCMNC='26202',MSIN(3)='123',GID='',SPN='') inserted.",
                                                       "[Op0] TST_Two('26202',(Subset)'',(GID)'',(SPName)'') found.",
                                                       "[Op1] TST_Twin('26202',(Subset)'',(GID)'',(SPName)'') found.",
                                                       "Selection UI needed!"));
        EXPECT_EQ(get_int(kSelection), 1);
        EXPECT_EQ(get_string(kMccMnc), std::nullopt);
        EXPECT_EQ(get_string(kMsin), std::nullopt);
        EXPECT_EQ(get_string(kNetworkName), "");
        EXPECT_EQ(get_string("db/private/zel/sim_auto_op_customer_name"), "OLD");
        EXPECT_EQ(get_int("memory/zel/sim_auto_setting_updated"), std::nullopt);
    }
    EXPECT_TRUE(system_logged("[SIM1][Op0] TST_Two found!"));
    EXPECT_TRUE(system_logged("[SIM1][Op1] TST_Twin found!"));
    EXPECT_TRUE(system_logged("[SIM1] opCount=2."));
    EXPECT_TRUE(system_logged("[SIM1] Selection UI needed!"));
}

TEST_F(SimRun, AfterTheUsersChoiceTheSimIsNotLookedAtAgain) {
    insert(1, "262", "02", "1234567890");
    run();
    ZelSvcSimInfo sim;
    ASSERT_EQ(zel_svc_sim_auto_setting_get_sim_info(&sim, 1), 1);
    std::vector<ZelSvcSimOperator> choice(ZEL_SVC_MAX_OPERATORS);
    int32_t count = 0;
    zel_svc_sim_auto_setting_get_operator_list_by_sim(&sim, choice.data(), &count);
    ASSERT_EQ(count, 2);
    zel_svc_sim_auto_setting_install_operator(&choice[1], 1);
    EXPECT_EQ(zel_svc_sim_auto_setting_set_active_operator(&choice[1], 1), 1);
    set_string(kMccMnc, sim.mccmnc);
    set_string(kMsin, sim.msin);
    set_int(kSelection, 0);
    EXPECT_EQ(run(), 2);
    EXPECT_EQ(zel_svc_sim_auto_setting_chk_feature_enable(), 1);
    EXPECT_EQ(get_string(kNetworkName), "Twin");
    EXPECT_EQ(lines_in(kSettingLog).back(), "TST_Twin('26202',(Subset)'',(GID)'',(SPName)'') installed.");
}

TEST_F(SimRun, WithoutAnOperatorTheSimIsKeptAndSkipped) {
    insert(1, "262", "09", "1234567890");
    EXPECT_EQ(run(), 2);
    EXPECT_THAT(lines_in(kSettingLog), ElementsAre("SIM(MCCMNC='26209',MSIN(3)='123',GID='',SPN='') inserted.",
                                                   "Operator in TST spec not found, skip."));
    EXPECT_TRUE(system_logged("[SIM1] opCount=0."));
    EXPECT_TRUE(system_logged("[SIM1] Operator in TST spec not found, skip."));
    EXPECT_EQ(get_string(kMccMnc), "26209");
    EXPECT_EQ(get_string(kMsin), "1234567890");
    EXPECT_EQ(get_int(kSelection), 0);
    EXPECT_EQ(get_bool(kChanged), true);
    EXPECT_EQ(get_string(kNetworkName), "");
    EXPECT_EQ(run(), 2);
    EXPECT_EQ(lines_in(kCheckLog).back(), "SIM not changed.");
}

TEST_F(SimRun, WithoutAnOperatorTheFolderThatServesTheCustomerIsNamed) {
    set_string("db/zel/salescode", "UFN");
    insert(1, "262", "09", "1234567890");
    EXPECT_EQ(run(), 2);
    EXPECT_EQ(lines_in(kSettingLog).back(), "Operator in TFG spec(active:UFN) not found, skip.");
}

TEST_F(SimRun, AShortMsinShowsTheDigitsThereAre) {
    insert(1, "262", "01", "12");
    run();
    EXPECT_THAT(lines_in(kSettingLog).front(), "SIM(MCCMNC='26201',MSIN(3)='12',GID='',SPN='') inserted.");
    run();
    EXPECT_THAT(lines_in(kCheckLog),
                ElementsAre("SIM1 normally inserted.", "Phone(MCCMNC='26201',MSIN(3)='12').",
                            "SIM(MCCMNC='26201',MSIN(3)='12',GID='',SPN='') inserted.", "SIM not changed."));
}

TEST_F(SimRun, NoLogHoldsMoreThanThreeDigitsOfAnMsin) {
    write_networks("TST", "TST", {{"One", "26201", "777"}, {"Two", "26202"}, {"Twin", "26202"}},
                   "<Network><AutoProfile>on</AutoProfile></Network>");
    insert(1, "262", "01", "7778889990");
    run();
    insert(1, "262", "02", "5556667770");
    run();
    set_string(kMsin, "4443332220");
    fail("vconf_set_str");
    run();
    std::vector<std::string> all = system_log();
    for (const char *log : {kCheckLog, kSettingLog})
        all.push_back(read(log));
    all.push_back(run_log());
    for (const std::string &text : all)
        for (const char *digits : {"7778", "5556", "4443"})
            EXPECT_THAT(text, Not(HasSubstr(digits)));
}

TEST_F(SimRun, FailedWritesOfKeysAreNotActedOn) {
    fail("vconf_set_bool");
    fail("vconf_set_str");
    fail("vconf_set_int");
    insert(1, "262", "01", "1234567890");
    EXPECT_EQ(run(), 0);
    EXPECT_TRUE(system_logged("[SIM1] vconf_set_bool(ZelSimChanged,1)=-1 run."));
    EXPECT_TRUE(system_logged("Setting active operator(vconf) failed."));
    EXPECT_EQ(lines_in(kSettingLog).back(), "TST_One('26201',(Subset)'',(GID)'',(SPName)'') installed.");
}

TEST_F(SimRun, LogsThatCannotBeOpenedArePassedOver) {
    fail("zel_platform_open", kCheckLog);
    fail("zel_platform_open", kSettingLog);
    insert(1, "262", "01", "1234567890");
    EXPECT_EQ(run(), 0);
    EXPECT_FALSE(exists(kCheckLog));
    EXPECT_FALSE(exists(kSettingLog));
    EXPECT_EQ(get_string(kNetworkName), "One");
}

TEST_F(SimRun, StoredIdentitiesAreReadAsFarAsTheirFieldsHold) {
    set_string(kMccMnc, "2620112345678");
    set_string(kMsin, "12345678901234567890123");
    insert(1, "262", "01", "1234567890");
    EXPECT_EQ(run(), 0);
    EXPECT_EQ(lines_in(kCheckLog)[1], "Phone(MCCMNC='262011234',MSIN(3)='123').");
    set_int(kMsin, 5);
    run();
    EXPECT_EQ(lines_in(kCheckLog)[1], "Phone(MCCMNC='26201',MSIN='').");
}

TEST_F(SimRun, ClearingTheOperatorsMakesEverySimAnotherOne) {
    insert(1, "262", "01", "1234567890");
    run();
    EXPECT_EQ(run(), 2);
    EXPECT_EQ(zel_svc_sim_auto_setting_clear_active_operator(), 1);
    EXPECT_EQ(run(), 0);
}

TEST_F(SimRun, ARemovedSimKeepsItsOperator) {
    insert(1, "262", "01", "1234567890");
    run();
    remove_sim(1);
    EXPECT_EQ(run(), 2);
    EXPECT_EQ(read(kCheckLog), "SIM1 not inserted(0).\n");
    EXPECT_EQ(get_string(kNetworkName), "One");
    insert(1, "262", "01", "1234567890");
    EXPECT_EQ(run(), 2);
    EXPECT_EQ(lines_in(kCheckLog).back(), "SIM not changed.");
}

TEST_F(SimRun, WithoutASlotCountThePhoneHasOneSlot) {
    insert(1, "262", "01", "1234567890");
    set_int("memory/telephony/sim_slot2", 1);
    fail("vconf_get_int", kSlotCount);
    EXPECT_EQ(run(), 0);
    EXPECT_FALSE(exists(kCheckLog2));
    EXPECT_TRUE(system_logged("vconf_get_int(SimSlotCount,-1)=-1 run."));
}

TEST_F(SimRun, ThePhoneHasTwoSlotsFromACountOfTwoOn) {
    for (const int count : {-1, 0, 1}) {
        set_int(kSlotCount, count);
        run();
        EXPECT_FALSE(exists(kCheckLog2)) << count;
    }
    for (const int count : {2, 3}) {
        set_int(kSlotCount, count);
        run();
        EXPECT_THAT(lines_in(kCheckLog2), ElementsAre("SIM2 not inserted(-1).")) << count;
    }
}

TEST_F(SimRunOfTwoSlots, EachSlotsSimIsInstalledIntoItsOwnKeysAndLogs) {
    write_networks("TST", "TST", {{"One", "26201"}, {"Two", "26202"}});
    insert(1, "262", "01", "1112223334");
    insert(2, "262", "02", "2223334445");
    EXPECT_EQ(run(), 0);
    EXPECT_EQ(get_string(kNetworkName), "One");
    EXPECT_EQ(get_string(kNetworkName2), "Two");
    EXPECT_EQ(get_string(kMsin), "1112223334");
    EXPECT_EQ(get_string(kMccMnc2), "26202");
    EXPECT_EQ(get_string(kMsin2), "2223334445");
    EXPECT_EQ(get_int(kSelection2), 0);
    EXPECT_EQ(get_bool(kChanged2), true);
    EXPECT_THAT(lines_in(kCheckLog2),
                ElementsAre("SIM2 normally inserted.", "Phone(MCCMNC='',MSIN='').",
                            "SIM(MCCMNC='26202',MSIN(3)='222',GID='',SPN='') inserted.", "SIM changed."));
    EXPECT_THAT(lines_in(kSettingLog2), ElementsAre("SIM(MCCMNC='26202',MSIN(3)='222',GID='',SPN='') inserted.",
                                                    "[Op0] TST_Two('26202',(Subset)'',(GID)'',(SPName)'') found.",
                                                    "TST_Two('26202',(Subset)'',(GID)'',(SPName)'') installed."));
    EXPECT_EQ(lines_in(kSettingLog).back(), "TST_One('26201',(Subset)'',(GID)'',(SPName)'') installed.");
    EXPECT_TRUE(system_logged("[SIM2] vconf_set_bool(ZelSim2Changed,1)=0 run."));
    EXPECT_TRUE(system_logged("vconf_set_str(ZelSim2AutoOpNetName,'Two') succeeded."));
    EXPECT_EQ(run(), 2);
}

TEST_F(SimRunOfTwoSlots, ASelectionForOneSlotOutweighsAnInstallForTheOther) {
    insert(1, "262", "02", "1112223334");
    insert(2, "262", "01", "2223334445");
    EXPECT_EQ(run(), 1);
    EXPECT_EQ(get_int(kSelection), 1);
    EXPECT_EQ(get_int(kSelection2), 0);
    EXPECT_EQ(get_string(kNetworkName2), "One");
    insert(1, "262", "01", "1112223334");
    insert(2, "262", "02", "2223334445");
    EXPECT_EQ(run(), 1);
    EXPECT_EQ(get_string(kNetworkName), "One");
    EXPECT_EQ(get_int(kSelection2), 1);
}

TEST_F(SimRunOfTwoSlots, ASlotThatIsSkippedDoesNotKeepTheOtherFromBeingHandled) {
    insert(2, "262", "01", "2223334445");
    EXPECT_EQ(run(), 0);
    EXPECT_THAT(lines_in(kCheckLog), ElementsAre("SIM1 not inserted(0)."));
    EXPECT_EQ(get_string(kNetworkName2), "One");
    insert(1, "262", "01", "1112223334", 9);
    insert(2, "262", "01", "5556667778");
    EXPECT_EQ(run(), 0);
    EXPECT_EQ(lines_in(kCheckLog).back(), "SIM recognition failed.");
    EXPECT_EQ(get_string(kMsin2), "5556667778");
}

TEST_F(SimRunOfTwoSlots, AnOperatorOfOneSlotAndNoneOfTheOtherIsAnInstall) {
    insert(1, "262", "01", "1112223334");
    insert(2, "262", "09", "2223334445");
    EXPECT_EQ(run(), 0);
    EXPECT_EQ(lines_in(kSettingLog2).back(), "Operator in TST spec not found, skip.");
    EXPECT_EQ(get_string(kMsin2), "2223334445");
}

TEST_F(SimRunOfTwoSlots, WithoutModemNamesNeitherSimIsRead) {
    insert(1, "262", "01", "1112223334");
    insert(2, "262", "01", "2223334445");
    fail("tel_get_cp_name_list");
    EXPECT_EQ(run(), 2);
    EXPECT_EQ(lines_in(kCheckLog).back(), "SIM recognition failed.");
    EXPECT_EQ(lines_in(kCheckLog2).back(), "SIM recognition failed.");
}
