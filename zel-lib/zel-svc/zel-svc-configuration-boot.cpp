// What the platform calls at the moments of a phone's life: first start, update, IMEI, factory reset.

#include "base/zel-svc-active-customer.h"
#include "base/zel-svc-file.h"
#include "base/zel-svc-guard.h"
#include "base/zel-svc-log.h"
#include "base/zel-svc-run-log.h"
#include "base/zel-svc-text.h"
#include "spec/zel-svc-data.h"
#include "zel-svc.h"

#include <device-power.h>
#include <vconf.h>
#include <zel-platform.h>

#include <string>

namespace {

using SalesCode = FixedText<ZEL_SVC_SALES_CODE_SIZE>;

constexpr int kDisplayOn = 1;
constexpr int kNoTimeout = 0;
constexpr int kPlainRestart = 0x01234567;
constexpr const char *kInstalledHeaderPath = "/opt/system/zel-default/SW_Configuration.xml";

// A run-log line on its own: where memory runs out, the line is lost and nothing else.
void log_line(const char *line) {
    zel_svc_guarded([line] { zel_svc_run_log("%s", line); });
}

// The folder to install for a sales code, with a line when it has another name.
SalesCode internal_customer(const char *customer) {
    SalesCode internal;
    const int differs =
        zel_svc_config_get_internal_customer_name(customer, internal.data(), static_cast<int>(internal.width));
    if (differs == 1)
        zel_svc_guarded(
            [&] { zel_svc_run_log("[Config] Install customer changed '%s'->'%s'.\n", customer, internal.c_str()); });
    return internal;
}

void keep_display_on() {
    const int result = device_power_request_lock(kDisplayOn, kNoTimeout);
    if (result >= 0) return log_line("[Config] LCD sleep lock succeed.\n");
    ZEL_SVC_LOG("[Config] LCD sleep lock failed(%d).", result);
    log_line("[Config] LCD sleep lock failed.\n");
}

void let_display_sleep() {
    const int result = device_power_release_lock(kDisplayOn);
    log_line(result < 0 ? "[Config] LCD sleep unlock failed.\n" : "[Config] LCD sleep unlock succeed.\n");
}

// A long install must not be slowed down by a display that goes to sleep; a failed lock does not stop it.
void install_with_display_on(const char *customer, int kind) {
    const SalesCode internal = internal_customer(customer);
    keep_display_on();
    zel_svc_config_install_customer(internal.c_str(), kind);
    let_display_sleep();
}

void restore_language() {
    zel_svc_data_load(ZEL_SVC_DATA_MAIN, ZEL_SVC_DATA_SIM1, 0);
    zel_svc_guarded([] {
        const std::string language{zel_svc_data_get_text(ZEL_SVC_DATA_MAIN, "phone", "lang")};
        if (!language.empty()) vconf_set_str("db/menu_widget/language", language.c_str());
    });
    zel_svc_data_free(ZEL_SVC_DATA_MAIN);
}

void remove_installed_header() {
    const int result = zel_svc_file_remove(kInstalledHeaderPath);
    log_line(result == 0 ? "[FactoryReset/Success] SW_Configuration file removed.\n"
                         : "[FactoryReset/Error!!] SW_Configuration file not removed.\n");
}

} // namespace

void zel_svc_config_set_pre_config_for_config_mode(const char *customer) {
    if (!customer) return;
    log_line("[Config/Start] * Set pre-config for configuration mode *\n");
    zel_svc_config_set_active_customer_name(customer);
    zel_svc_config_install_header();
    install_with_display_on(customer, ZEL_SVC_INSTALL_CONFIG_MODE);
    vconf_set_int("db/private/telephony/zel_config", 1);
    log_line("[Config/Ended] * Set pre-config for configuration mode *\n");
}

void zel_svc_config_upgrade_pre_config_for_fota_mode(const char *customer) {
    if (!customer) return;
    ZEL_SVC_LOG("API() started.");
    log_line("[Config/Start] * Upgrade pre-config for FOTA mode *\n");
    zel_svc_config_set_active_customer_name(customer);
    zel_svc_config_install_header();
    const SalesCode internal = internal_customer(customer);
    zel_svc_config_install_customer(internal.c_str(), ZEL_SVC_INSTALL_FOTA_MODE);
    ZEL_SVC_LOG("API() ended.");
    log_line("[Config/Ended] * Upgrade pre-config for FOTA mode *\n");
}

void zel_svc_config_upgrade_pre_config_for_normal_booting() {
    log_line("[Config/Start] * Upgrade pre-config for Normal booting *\n");
    SalesCode customer;
    if (zel_svc_config_get_active_customer_name(customer.data(), static_cast<int>(customer.width)) == 0) {
        log_line("[Config/Error!!] Active customer unknown.\n");
        return;
    }
    install_with_display_on(customer.c_str(), ZEL_SVC_INSTALL_NORMAL_BOOTING);
    log_line("[Config/Ended] * Upgrade pre-config for Normal booting *\n");
}

int zel_svc_config_set_pre_config_for_imei(const char *customer) {
    if (!customer) return 0;
    log_line("[Config/Start] Set pre-config for IMEI.\n");
    zel_svc_config_set_active_customer_name(customer);
    log_line("[Config/Ended] Set pre-config for IMEI.\n");
    return 1;
}

int zel_svc_config_set_pre_config_for_factory_reset() {
    zel_svc_guarded([] { zel_svc_file_remove(ZEL_SVC_RUN_LOG_PATH); });
    log_line("[FactoryReset] Pre-config started.\n");
    zel_svc_guarded([] { restore_language(); });
    zel_svc_guarded([] { remove_installed_header(); });
    log_line("[FactoryReset] Pre-config ended.\n");
    return 1;
}

void zel_svc_config_reboot() {
    zel_platform_sync();
    zel_platform_reboot(kPlainRestart);
}
