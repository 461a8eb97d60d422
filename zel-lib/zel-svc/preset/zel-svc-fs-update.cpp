#include "preset/zel-svc-fs-update.h"

#include "base/zel-svc-file.h"
#include "base/zel-svc-guard.h"
#include "zel-svc-configuration-customer-path.h"
#include "zel-svc.h"

namespace {

constexpr std::string_view kDefaults = ZEL_SVC_PRECONFIG_EVERY_CUSTOMER;
constexpr const char *kVersions = "cur_version";

struct Versions {
    int defaults = 0;
    int customer = 0;
};

std::string version_key(std::string_view package) { return std::string{kVersions}.append(":").append(package); }

ZelSvcIni load_script(std::string_view package) {
    return ZelSvcIni::load(zel_svc_customer_preconfig_path(package, "fsupdate/zel-fsupdate.ini").c_str());
}

void copy_tree(std::string_view package) {
    __zel_svc_config_copy_dir(zel_svc_customer_preconfig_path(package, "fsupdate/fs").c_str(), "/");
}

ZelSvcFd open_state_afresh() { return zel_svc_file_open_output(ZEL_SVC_FS_UPDATE_STATE_PATH, "zel-manager"); }

// The INI library keeps most codes as a key. Some would be read back as another one, as a comment or as an
// error that costs the whole file: a customer of such a code keeps no version.
bool can_be_key(std::string_view code) {
    constexpr std::string_view kBlanks = " \t\n\v\f\r";
    constexpr std::string_view kComments = "#;";
    if (code.empty() || code.find_first_of("=\n") != std::string_view::npos) return false;
    return !(kComments.find(code.front()) != std::string_view::npos ||
             kBlanks.find(code.front()) != std::string_view::npos ||
             kBlanks.find(code.back()) != std::string_view::npos);
}

void set_version(ZelSvcIni &state, std::string_view package, int version) {
    if (can_be_key(package)) state.set(version_key(package), std::to_string(version));
}

int install(std::string_view package) {
    zel_svc_guarded([package] { copy_tree(package); });
    const ZelSvcIni script = load_script(package);
    if (!script) return 0;
    zel_svc_guarded([&] { zel_svc_fs_update_run_section(package, script, "rel"); });
    return script.number("rel:version", 0);
}

void install_all(std::string_view customer) {
    zel_svc_file_remove(ZEL_SVC_FS_UPDATE_STATE_PATH);
    open_state_afresh();
    const Versions installed = {.defaults = install(kDefaults), .customer = install(customer)};
    ZelSvcIni state = ZelSvcIni::load(ZEL_SVC_FS_UPDATE_STATE_PATH);
    const ZelSvcFd file = open_state_afresh();
    if (!state) state = ZelSvcIni::load(file.get()); // empty now, whatever stood in it
    state.add_section(kVersions);
    set_version(state, kDefaults, installed.defaults);
    set_version(state, customer, installed.customer);
    state.dump(file.get());
}

// The version of the last section, run or not: a list that ends in an old version keeps the phone's.
int upgrade(std::string_view package, int applied) {
    const ZelSvcIni script = load_script(package);
    int version = applied;
    zel_svc_guarded([&] { zel_svc_fs_update_run_section(package, script, "up_always"); });
    for (int n = 1; script.has("up_" + std::to_string(n)); ++n) {
        const std::string section = "up_" + std::to_string(n);
        version = script.number(section + ":version", 0);
        if (applied < version) zel_svc_guarded([&] { zel_svc_fs_update_run_section(package, script, section); });
    }
    return version;
}

void upgrade_all(std::string_view customer) {
    ZelSvcIni state = ZelSvcIni::load(ZEL_SVC_FS_UPDATE_STATE_PATH);
    if (!state) return;
    const Versions applied = {.defaults = state.number(version_key(kDefaults), 0),
                              .customer = state.number(version_key(customer), 0)};
    const Versions reached = {.defaults = upgrade(kDefaults, applied.defaults),
                              .customer = upgrade(customer, applied.customer)};
    state = ZelSvcIni::load(ZEL_SVC_FS_UPDATE_STATE_PATH); // a script may have brought another
    if (!state) return;
    state.add_section(kVersions);
    if (reached.defaults >= applied.defaults) set_version(state, kDefaults, reached.defaults);
    if (reached.customer >= applied.customer) set_version(state, customer, reached.customer);
    state.dump(open_state_afresh().get());
}

} // namespace

void zel_svc_fs_update(std::string_view customer, int kind) {
    if (kind == ZEL_SVC_INSTALL_CONFIG_MODE)
        install_all(customer);
    else
        upgrade_all(customer);
}
