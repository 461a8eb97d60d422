#include "service-phone.h"

#include <zel-platform.h>

namespace {

constexpr const char *kDisplayLockFailed = "[Config] LCD sleep lock failed.";

class BootMode : public zel_test::ServicePhone {};

} // namespace

TEST_F(BootMode, ConfigModeRunsItsStepsInOrder) {
    zel_svc_config_set_pre_config_for_config_mode("BTU");
    EXPECT_TRUE(logged_in_order({
        "[Config/Start] * Set pre-config for configuration mode *",
        "[SetActCustomerName/Success] Active customer('BTU') set into csa.",
        "[Config/Start] Install header.",
        "[Config/Ended] Install header.",
        "[Config] LCD sleep lock succeed.",
        "[Config/Start] Install customer('BTU') to install full configuration on Config mode.",
        "[Config/Ended] Install customer('BTU') to install full configuration on Config mode.",
        "[Config] LCD sleep unlock succeed.",
        "[Config/Ended] * Set pre-config for configuration mode *",
    }));
    EXPECT_EQ(run_log_lines().front(), "[Config/Start] * Set pre-config for configuration mode *");
    EXPECT_EQ(run_log_lines().back(), "[Config/Ended] * Set pre-config for configuration mode *");
    EXPECT_EQ(get_string("db/zel/salescode"), "BTU");
    EXPECT_EQ(get_int("db/private/telephony/zel_config"), 1);
    EXPECT_EQ(call("status").at("display_locked"), false);
}

TEST_F(BootMode, ConfigModeInstallsTheSharedFolder) {
    write("/opt/system/zel/preconfig/TFG/power-ani/poweron.edj", "");
    zel_svc_config_set_pre_config_for_config_mode("UFN");
    EXPECT_TRUE(logged_in_order({
        "[Config/Ended] Install header.",
        "[Config] Install customer changed 'UFN'->'TFG'.",
        "[Config] LCD sleep lock succeed.",
        "[Config/Start] Install customer('TFG') to install full configuration on Config mode.",
    }));
    EXPECT_EQ(get_string("db/zel/salescode"), "UFN");
    EXPECT_EQ(get_string("db/zel/power_ani_file_path"), "/opt/system/zel/preconfig/TFG/power-ani");
}

TEST_F(BootMode, AFailedSleepLockDoesNotStopTheInstall) {
    fail("device_power_request_lock", "", 1, -1, -4);
    zel_svc_config_set_pre_config_for_config_mode("BTU");
    EXPECT_TRUE(logged_in_order({
        kDisplayLockFailed,
        "[Config/Start] Install customer('BTU') to install full configuration on Config mode.",
        "[Config] LCD sleep unlock succeed.",
    }));
    EXPECT_TRUE(system_logged("[Config] LCD sleep lock failed(-4)."));
    EXPECT_EQ(get_int("db/private/telephony/zel_config"), 1);
}

TEST_F(BootMode, AFailedUnlockIsInTheRunLogOnly) {
    fail("device_power_release_lock", "", 1, -1, -4);
    zel_svc_config_set_pre_config_for_config_mode("BTU");
    EXPECT_TRUE(logged_in_order(
        {"[Config] LCD sleep unlock failed.", "[Config/Ended] * Set pre-config for configuration mode *"}));
    for (const std::string &message : system_log())
        EXPECT_EQ(message.find("unlock"), std::string::npos) << message;
}

TEST_F(BootMode, FotaModeUpgradesWithoutLockAndKey) {
    zel_svc_config_upgrade_pre_config_for_fota_mode("UFN");
    EXPECT_TRUE(logged_in_order({
        "[Config/Start] * Upgrade pre-config for FOTA mode *",
        "[SetActCustomerName/Success] Active customer('UFN') set into csa.",
        "[Config/Start] Install header.",
        "[Config/Ended] Install header.",
        "[Config] Install customer changed 'UFN'->'TFG'.",
        "[Config/Start] Install customer('TFG') to upgrade configuration on FOTA mode.",
        "[Config/Ended] Install customer('TFG') to upgrade configuration on FOTA mode.",
        "[Config/Ended] * Upgrade pre-config for FOTA mode *",
    }));
    for (const std::string &line : run_log_lines())
        EXPECT_EQ(line.find("LCD"), std::string::npos) << line;
    EXPECT_EQ(get_int("db/private/telephony/zel_config"), std::nullopt);
    EXPECT_TRUE(system_logged("API() started."));
    EXPECT_TRUE(system_logged("API() ended."));
}

TEST_F(BootMode, NormalBootingUpgradesTheActiveCustomer) {
    set_string("db/zel/salescode", "UFN");
    zel_svc_config_upgrade_pre_config_for_normal_booting();
    EXPECT_TRUE(logged_in_order({
        "[Config/Start] * Upgrade pre-config for Normal booting *",
        "[Config] Install customer changed 'UFN'->'TFG'.",
        "[Config] LCD sleep lock succeed.",
        "[Config/Start] Install customer('TFG') to upgrade configuration on Normal booting.",
        "[Config/Ended] Install customer('TFG') to upgrade configuration on Normal booting.",
        "[Config] LCD sleep unlock succeed.",
        "[Config/Ended] * Upgrade pre-config for Normal booting *",
    }));
    EXPECT_FALSE(logged("[Config/Start] Install header."));
    EXPECT_FALSE(exists("/csa/zel/zel-active-customer.inf"));
    EXPECT_EQ(get_int("db/private/telephony/zel_config"), std::nullopt);
    EXPECT_EQ(call("status").at("display_locked"), false);
}

TEST_F(BootMode, NormalBootingWithoutAnActiveCustomerDoesNothing) {
    for (const char *code : {"", "DEF"}) {
        write("/opt/system/zel-default/output/zel-config.log", "");
        set_string("db/zel/salescode", code);
        zel_svc_config_upgrade_pre_config_for_normal_booting();
        EXPECT_EQ(run_log(), "[Config/Start] * Upgrade pre-config for Normal booting *\n"
                             "[Config/Error!!] Active customer unknown.\n");
    }
    EXPECT_FALSE(exists(data_path("ims")));
}

TEST_F(BootMode, NormalBootingGoesOnAfterAFailedSleepLock) {
    set_string("db/zel/salescode", "BTU");
    fail("device_power_request_lock", "", 1, -1, -4);
    zel_svc_config_upgrade_pre_config_for_normal_booting();
    EXPECT_TRUE(logged_in_order(
        {kDisplayLockFailed, "[Config/Ended] Install customer('BTU') to upgrade configuration on Normal booting."}));
}

TEST_F(BootMode, ForTheImeiOnlyTheActiveCustomerIsSet) {
    EXPECT_EQ(zel_svc_config_set_pre_config_for_imei("BTU"), 1);
    EXPECT_EQ(run_log(), "[Config/Start] Set pre-config for IMEI.\n"
                         "[SetActCustomerName/Success] zel dir in csa created.\n"
                         "[SetActCustomerName/Success] Active customer('BTU') set into csa.\n"
                         "[SetActCustomerName] Product code in csa not existed.\n"
                         "[Config/Ended] Set pre-config for IMEI.\n");
    EXPECT_EQ(get_string("db/zel/salescode"), "BTU");
    EXPECT_FALSE(exists(data_path("ims")));
}

TEST_F(BootMode, NullDoesNothing) {
    zel_svc_config_set_pre_config_for_config_mode(nullptr);
    zel_svc_config_upgrade_pre_config_for_fota_mode(nullptr);
    EXPECT_EQ(zel_svc_config_set_pre_config_for_imei(nullptr), 0);
    EXPECT_EQ(run_log(), "");
    EXPECT_TRUE(system_log().empty());
}

TEST_F(BootMode, RebootRestartsThePhone) {
    zel_svc_config_reboot();
    const nlohmann::json status = call("status");
    EXPECT_EQ(status.at("restarts_asked"), 1);
    EXPECT_EQ(status.at("restart_command"), 0x01234567);
}

class FactoryReset : public zel_test::ServicePhone {
  protected:
    static constexpr const char *kInstalledHeader = "/opt/system/zel-default/SW_Configuration.xml";
    static constexpr const char *kMainGroup = "/opt/system/zel-default/data/zel-default-data.ini";
    static constexpr const char *kLanguage = "db/menu_widget/language";
};

TEST_F(FactoryReset, StartsANewRunLogAndRemovesTheHeader) {
    write("/opt/system/zel-default/output/zel-config.log", "earlier\n");
    write(kInstalledHeader, "<x/>");
    EXPECT_EQ(zel_svc_config_set_pre_config_for_factory_reset(), 1);
    EXPECT_FALSE(exists(kInstalledHeader));
    EXPECT_EQ(run_log(), "[FactoryReset] Pre-config started.\n"
                         "[FactoryReset/Success] SW_Configuration file removed.\n"
                         "[FactoryReset] Pre-config ended.\n");
}

TEST_F(FactoryReset, AHeaderThatIsNotThereIsLogged) {
    EXPECT_EQ(zel_svc_config_set_pre_config_for_factory_reset(), 1);
    EXPECT_EQ(run_log(), "[FactoryReset] Pre-config started.\n"
                         "[FactoryReset/Error!!] SW_Configuration file not removed.\n"
                         "[FactoryReset] Pre-config ended.\n");
}

TEST_F(FactoryReset, TheLanguageIsTheSpecifications) {
    write(kMainGroup, "[phone]\n\nlang = \"en_US.UTF-8\"\n\n");
    set_string(kLanguage, "de_DE.UTF-8");
    zel_svc_config_set_pre_config_for_factory_reset();
    EXPECT_EQ(get_string(kLanguage), "en_US.UTF-8");
    EXPECT_NE(read(kMainGroup).find("en_US"), std::string::npos);
}

TEST_F(FactoryReset, WithoutARecordedLanguageTheKeyIsLeft) {
    set_string(kLanguage, "de_DE.UTF-8");
    zel_svc_config_set_pre_config_for_factory_reset();
    EXPECT_EQ(get_string(kLanguage), "de_DE.UTF-8");
    EXPECT_FALSE(exists(kMainGroup));
    write(kMainGroup, "[phone]\n\nlang = \"\"\n\n");
    zel_svc_config_set_pre_config_for_factory_reset();
    EXPECT_EQ(get_string(kLanguage), "de_DE.UTF-8");
}
