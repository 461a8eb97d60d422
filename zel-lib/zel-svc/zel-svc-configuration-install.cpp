// The install run: which phases a kind of install has, and their order.
//
//     phase                          configuration mode   FOTA mode   normal booting
//     customer's file                       all               -          upgrade
//     second SIM's groups           with several slots        -      with several slots
//     clear SIM auto setting                yes              yes            -
//     presets                             install          upgrade          -
//     user folder                           yes              yes            -
//     file system                         install          upgrade          -
//     power animation                       yes              yes            -
//     customer strings                      yes               -             -
//     wallpaper                             yes              yes            -
//     check applications                     -                -            yes
//     install, disable applications         yes               -            yes
//     collect file-system status            yes               -             -
//     remove applications                    -                -            yes
//
// No phase's failure stops the next one.

#include "base/zel-svc-fs-status.h"
#include "base/zel-svc-guard.h"
#include "base/zel-svc-log.h"
#include "base/zel-svc-run-log.h"
#include "base/zel-svc-text.h"
#include "preset/zel-svc-fs-update.h"
#include "preset/zel-svc-preset.h"
#include "zel-svc-configuration-phase.h"
#include "zel-svc-configuration-phases.h"

namespace {

struct RunKind {
    const char *purpose;
    int lap;
    bool continues_lap_log; // the laps of the FOTA mode stay in front of those of the first normal start
};

constexpr RunKind kConfigMode = {"install full configuration on Config mode", ZEL_TIME_LAP_CONFIG_MODE, false};
constexpr RunKind kFotaMode = {"upgrade configuration on FOTA mode", ZEL_TIME_LAP_FOTA_MODE, false};
constexpr RunKind kNormalBooting = {"upgrade configuration on Normal booting", ZEL_TIME_LAP_NORMAL_BOOTING, true};

const RunKind &kind_of_run(int kind) {
    switch (kind) {
    case ZEL_SVC_INSTALL_FOTA_MODE:
        return kFotaMode;
    case ZEL_SVC_INSTALL_NORMAL_BOOTING:
        return kNormalBooting;
    default:
        return kConfigMode;
    }
}

void start_run(const RunKind &run, const char *customer) {
    zel_svc_time_lap_begin(run.lap);
    if (!run.continues_lap_log) zel_svc_guarded([] { __zel_svc_config_time_lap_start(); });
    zel_svc_guarded([&] { zel_svc_run_log("[Config/Start] Install customer('%s') to %s.\n", customer, run.purpose); });
}

void end_run(const RunKind &run, const char *customer) {
    zel_svc_guarded([&] { __zel_svc_config_time_lap_end(run.lap); });
    zel_svc_guarded([&] { zel_svc_run_log("[Config/Ended] Install customer('%s') to %s.\n", customer, run.purpose); });
}

void clear_sim_auto_setting() {
    const int result = zel_svc_sim_auto_setting_clear_active_operator();
    if (result == 1)
        zel_svc_run_log("[Config/Success] Clear information for SIM Auto Setting.\n");
    else
        zel_svc_run_log("[Config/Error!!(%d)] Clear information for SIM Auto Setting.\n", result);
}

void install_preconfiguration(std::string_view customer, bool full) {
    const int kind = full ? ZEL_SVC_INSTALL_CONFIG_MODE : ZEL_SVC_INSTALL_FOTA_MODE;
    zel_svc_phase(full ? "Install ZEL Preset" : "Upgrade ZEL Preset", ZEL_TIME_LAP_PRESET,
                  [=] { zel_svc_preset_install(customer, kind); });
    zel_svc_config_copy_user_folder(customer);
    zel_svc_phase(full ? "Install ZEL FS" : "Upgrade ZEL FS", ZEL_TIME_LAP_FS_UPDATE,
                  [=] { zel_svc_fs_update(customer, kind); });
    zel_svc_config_set_power_animation(customer);
}

void install_and_disable_apps(std::string_view customer, const ZelSvcAppsBefore &before) {
    zel_svc_guarded([=] { zel_svc_config_install_apps(customer); });
    zel_svc_guarded([&] { zel_svc_config_disable_apps(customer, before); });
}

void collect_fs_status() {
    zel_svc_timed(ZEL_TIME_LAP_COLLECT, [] { __zel_svc_config_fs_status_write(1); });
}

void run_config_mode(std::string_view customer) {
    zel_svc_guarded([=] { zel_svc_config_install_spec(customer, ZEL_SVC_INSTALL_CONFIG_MODE); });
    zel_svc_guarded([] { clear_sim_auto_setting(); });
    zel_svc_guarded([=] { install_preconfiguration(customer, true); });
    zel_svc_guarded([] { zel_svc_config_set_customer_strings(); });
    zel_svc_guarded([=] { zel_svc_config_install_wallpaper(customer, ZEL_SVC_INSTALL_CONFIG_MODE); });
    install_and_disable_apps(customer, {});
    collect_fs_status();
}

void run_fota_mode(std::string_view customer) {
    zel_svc_guarded([] { clear_sim_auto_setting(); });
    zel_svc_guarded([=] { install_preconfiguration(customer, false); });
    zel_svc_guarded([=] { zel_svc_config_install_wallpaper(customer, ZEL_SVC_INSTALL_FOTA_MODE); });
}

void run_normal_booting(std::string_view customer) {
    zel_svc_guarded([=] { zel_svc_config_install_spec(customer, ZEL_SVC_INSTALL_NORMAL_BOOTING); });
    ZelSvcAppsBefore before = {};
    zel_svc_guarded([&] { zel_svc_config_check_apps_before_upgrade(customer, before); });
    install_and_disable_apps(customer, before);
    zel_svc_guarded([=] { zel_svc_config_remove_apps(customer); });
}

void run_phases(std::string_view customer, int kind) {
    switch (kind) {
    case ZEL_SVC_INSTALL_CONFIG_MODE:
        return run_config_mode(customer);
    case ZEL_SVC_INSTALL_FOTA_MODE:
        return run_fota_mode(customer);
    case ZEL_SVC_INSTALL_NORMAL_BOOTING:
        return run_normal_booting(customer);
    default:
        return;
    }
}

} // namespace

void zel_svc_config_install_customer(const char *customer, int kind) {
    if (!customer) return;
    const FixedText<10> code{customer};
    ZEL_SVC_LOG("API(customer='%s') entered.\n", code.c_str());
    const RunKind &run = kind_of_run(kind);
    start_run(run, code.c_str());
    run_phases(code.view(), kind);
    end_run(run, code.c_str());
    ZEL_SVC_LOG("Installation ended.\n");
}
