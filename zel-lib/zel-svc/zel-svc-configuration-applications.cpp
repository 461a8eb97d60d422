// The operator applications of the one customer that has them.

#include "zel-svc-configuration-phase.h"
#include "zel-svc-configuration-phases.h"

namespace {

constexpr std::string_view kCustomerWithApps = "INS";

} // namespace

void zel_svc_config_check_apps_before_upgrade(std::string_view customer, ZelSvcAppsBefore & /*before*/) {
    if (customer != kCustomerWithApps) {
        zel_svc_run_log("[Config] No need to check App existence.\n");
        return;
    }
    zel_svc_run_log("[Config/Start] Check App existence before App upgrade (FOTA).\n");
    zel_svc_run_log("[Config/End] Check App existence before App upgrade (FOTA).\n");
}

void zel_svc_config_install_apps(std::string_view /*customer*/) {
    zel_svc_timed(ZEL_TIME_LAP_APP, [] {});
}

void zel_svc_config_disable_apps(std::string_view customer, const ZelSvcAppsBefore & /*before*/) {
    if (customer != kCustomerWithApps) {
        zel_svc_run_log("[Config] No need to disable App as default.\n");
        return;
    }
    zel_svc_run_log("[Config/Start] Disable App as default.\n");
    zel_svc_run_log("[Config/Ended] Disable App as default.\n");
}

void zel_svc_config_remove_apps(std::string_view customer) {
    if (customer != kCustomerWithApps) {
        zel_svc_run_log("[Config] No need to remove App manually(FOTA).\n");
        return;
    }
    zel_svc_run_log("[Config/Start] Remove App manually(FOTA).\n");
    zel_svc_run_log("[Config/Ended] Remove App manually(FOTA).\n");
}
