// Applications: the lists that the package tool installs, and the operator applications of the one customer
// that has them.

#include "base/zel-svc-file.h"
#include "zel-svc-configuration-customer-path.h"
#include "zel-svc-configuration-phase.h"
#include "zel-svc-configuration-phases.h"

#include <zel-platform.h>

namespace {

constexpr std::string_view kCustomerWithApps = "INS";
constexpr const char *kAppFolder = "/opt/system/zel-default/app";

struct OperatorApp {
    const char *name;
    const char *package;
    const char *executable;

    [[nodiscard]] bool exists() const { return __zel_svc_config_file_exists(executable) == 1; }
};

constexpr std::array<OperatorApp, ZEL_SVC_OPERATOR_APP_COUNT> kOperatorApps = {{
    {"SkatamfaBeats", "com.skatamfa.beats", "/opt/usr/apps/com.skatamfa.beats/bin/jiobeats"},
    {"SkatamfaOnDemand", "com.skatamfa.ondemand", "/opt/usr/apps/com.skatamfa.ondemand/bin/jioondemand"},
    {"SkatamfaXPressNews", "ZFQ9uYrIPH", "/opt/usr/apps/ZFQ9uYrIPH/bin/ZFQ9uYrIPH.SkatamfaNews"},
    {"MySkatamfa", "AOzuftR6Ou", "/opt/usr/apps/AOzuftR6Ou/bin/AOzuftR6Ou.MySkatamfa"},
}};

constexpr OperatorApp kRemovedApp = {"SkatamfaApps", "com.skatamfa.apptray",
                                     "/opt/usr/apps/com.skatamfa.apptray/bin/jioapps"};

// A list of applications, and the file in which the tool tells what became of each.
struct AppList {
    const char *kind; // in "Install default App."
    const char *none; // the line without a list
    const char *list;
    const char *results;
};

constexpr AppList kDefaultApps = {"default", "[Config] Default applist not existed.\n", "applist_def.ini",
                                  "appresult_def.ini"};
constexpr AppList kCustomerApps = {"customer", "[Config] Customer applist not existed.\n", "applist.ini",
                                   "appresult.ini"};

std::string in_app_folder(const char *name) { return std::string{kAppFolder} + '/' + name; }

void install_list(const AppList &apps, std::string_view package) {
    const std::string list = in_app_folder(apps.list);
    const std::string source = zel_svc_customer_preconfig_path(package, std::string{"app/"} + apps.list);
    __zel_svc_config_copy_file(source.c_str(), list.c_str());
    if (__zel_svc_config_file_exists(list.c_str()) == 0) {
        zel_svc_run_log("%s", apps.none);
        return;
    }
    zel_svc_run_log("[Config/Start] Install %s App.\n", apps.kind);
    zel_platform_command(("/usr/bin/pkgcmd -S " + list + " -p " + in_app_folder(apps.results)).c_str());
    zel_svc_run_log("[Config/Ended] Install %s App.\n", apps.kind);
}

void disable(const OperatorApp &app, bool existed_before) {
    if (existed_before) {
        zel_svc_run_log("[Config] %s App is NOT NEW, skip.\n", app.name);
        return;
    }
    if (!app.exists()) {
        zel_svc_run_log("[Config] %s App NOT existed.\n", app.name);
        return;
    }
    zel_svc_run_log("[Config] %s App normally existed.\n", app.name);
    const int result = zel_platform_command((std::string{"/usr/bin/pkg -d "} + app.package).c_str());
    zel_svc_run_log("[Config] %s App is disabled(result=%d).\n", app.name, result);
}

void remove(const OperatorApp &app) {
    if (!app.exists()) {
        zel_svc_run_log("[Config] %s App NOT existed.\n", app.name);
        return;
    }
    zel_svc_run_log("[Config] %s App existed.\n", app.name);
    const std::string request = std::string{"path="} + app.package + ":op=uninstall:removable=true";
    const int result = zel_platform_command(("/usr/bin/rpm-backend -c " + request).c_str());
    zel_svc_run_log("[Config] %s App is removed(result=%d).\n", app.name, result);
}

} // namespace

void zel_svc_config_check_apps_before_upgrade(std::string_view customer, ZelSvcAppsBefore &before) {
    if (customer != kCustomerWithApps) {
        zel_svc_run_log("[Config] No need to check App existence.\n");
        return;
    }
    zel_svc_run_log("[Config/Start] Check App existence before App upgrade (FOTA).\n");
    for (std::size_t i = 0; i < kOperatorApps.size(); ++i) {
        before[i] = kOperatorApps[i].exists();
        zel_svc_run_log("[Config] %s App %s before App upgrade.\n", kOperatorApps[i].name,
                        before[i] ? "already existed" : "NOT existed");
    }
    zel_svc_run_log("[Config/End] Check App existence before App upgrade (FOTA).\n");
}

void zel_svc_config_install_apps(std::string_view customer) {
    zel_svc_timed(ZEL_TIME_LAP_APP, [customer] {
        zel_svc_guarded([] { __zel_svc_config_clear_dir(kAppFolder, 0); });
        zel_svc_guarded([] { install_list(kDefaultApps, ZEL_SVC_PRECONFIG_EVERY_CUSTOMER); });
        zel_svc_guarded([customer] { install_list(kCustomerApps, customer); });
    });
}

void zel_svc_config_disable_apps(std::string_view customer, const ZelSvcAppsBefore &before) {
    if (customer != kCustomerWithApps) {
        zel_svc_run_log("[Config] No need to disable App as default.\n");
        return;
    }
    zel_svc_run_log("[Config/Start] Disable App as default.\n");
    for (std::size_t i = 0; i < kOperatorApps.size(); ++i)
        disable(kOperatorApps[i], before[i]);
    zel_svc_run_log("[Config/Ended] Disable App as default.\n");
}

void zel_svc_config_remove_apps(std::string_view customer) {
    if (customer != kCustomerWithApps) {
        zel_svc_run_log("[Config] No need to remove App manually(FOTA).\n");
        return;
    }
    zel_svc_run_log("[Config/Start] Remove App manually(FOTA).\n");
    remove(kRemovedApp);
    zel_svc_run_log("[Config/Ended] Remove App manually(FOTA).\n");
}
