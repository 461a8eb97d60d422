#include "sim-phone.h"

namespace {

constexpr const char *kEnabled = "db/private/zel/sim_auto_enable";
constexpr const char *kSelection = "db/private/zel/sim_selection_show";
constexpr const char *kSelection2 = "db/private/zel/sim2/sim_selection_show";

using SimFeature = zel_test::SimPhone;

} // namespace

TEST_F(SimFeature, IsOnWhenTheSwitchIsNot0) {
    for (const int value : {1, 5, -1}) {
        set_int(kEnabled, value);
        EXPECT_EQ(zel_svc_sim_auto_setting_chk_feature_enable(), 1) << value;
    }
}

TEST_F(SimFeature, IsOffWhenTheSwitchIs0OrUnreadable) {
    set_int(kEnabled, 0);
    EXPECT_EQ(zel_svc_sim_auto_setting_chk_feature_enable(), 0);
    set_int(kSelection, 1);
    EXPECT_EQ(zel_svc_sim_auto_setting_chk_feature_enable(), 0);
    set_string(kEnabled, "1");
    EXPECT_EQ(zel_svc_sim_auto_setting_chk_feature_enable(), 0);
    call("vconf-unset", {{"key", kEnabled}});
    EXPECT_EQ(zel_svc_sim_auto_setting_chk_feature_enable(), 0);
}

TEST_F(SimFeature, IsOffWithoutAnActiveCustomer) {
    for (const char *customer : {"", "DEF"}) {
        set_string("db/zel/salescode", customer);
        EXPECT_EQ(zel_svc_sim_auto_setting_chk_feature_enable(), 0) << customer;
    }
}

TEST_F(SimFeature, TellsWhenASelectionIsAwaitedForEitherSlot) {
    set_int(kSelection, 1);
    EXPECT_EQ(zel_svc_sim_auto_setting_chk_feature_enable(), 2);
    set_int(kSelection, 0);
    set_int(kSelection2, 1);
    EXPECT_EQ(zel_svc_sim_auto_setting_chk_feature_enable(), 2);
    set_int(kSelection2, 2);
    EXPECT_EQ(zel_svc_sim_auto_setting_chk_feature_enable(), 1);
}

TEST_F(SimFeature, AnUnreadableSelectionIsNone) {
    set_int(kSelection, 1);
    fail("vconf_get_int", kSelection);
    EXPECT_EQ(zel_svc_sim_auto_setting_chk_feature_enable(), 1);
}

TEST_F(SimFeature, ReinstallingTheConnectionIsAnEcho) {
    call("journal-start");
    for (const int value : {0, 1, -5, 2147483647})
        EXPECT_EQ(zel_svc_reinstall_connection(value), value);
    EXPECT_TRUE(journal().empty());
}
