// Calls one exported entry point on the phone in $ZEL_ROOT, in a process of its own, and prints what it
// answers: `zel-step config XFV`. Linked with the shared library alone, as the platform's boot code is.

#include "zel-svc.h"

#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <memory>
#include <string_view>

namespace {

struct Step {
    const char *name;
    int arguments;
    void (*run)(char **arguments);
};

void print_text(int result, const char *text) { std::printf("%d '%s'\n", result, text); }

void internal_name(char **arguments) {
    char name[10];
    const int result = zel_svc_config_get_internal_customer_name(arguments[0], name, sizeof name);
    print_text(result, name);
}

void active_customer(char ** /*none*/) {
    char name[10] = "";
    const int result = zel_svc_config_get_active_customer_name(name, sizeof name);
    print_text(result, name);
}

void first_customer(char ** /*none*/) {
    char name[10] = "";
    const int result = zel_svc_config_get_first_customer_name_in_zel_bin(name, sizeof name);
    print_text(result, name);
}

void version(char ** /*none*/) {
    char text[20] = "";
    const int result = zel_svc_config_get_zel_bin_version(text, sizeof text);
    print_text(result, text);
}

void customers(char ** /*none*/) {
    const auto list = std::make_unique<ZelSvcCustomer[]>(ZEL_SVC_MAX_CUSTOMERS);
    int count = 0;
    const int result = zel_svc_config_get_customer_list(list.get(), &count);
    std::printf("%d, %d customers\n", result, count);
    for (int i = 0; i < count; ++i)
        std::printf("%s %s\n", list[static_cast<unsigned>(i)].name, list[static_cast<unsigned>(i)].path);
}

void approval(char ** /*none*/) {
    ZelSvcApprovalVersion versions;
    const int result = zel_svc_config_get_approval_version(&versions);
    std::printf("%d ap='%s' cp='%s' zel='%s'\n", result, versions.ap, versions.cp, versions.zel);
}

// The lines are in the report.
void verify(char ** /*none*/) {
    const auto results = std::make_unique<ZelSvcVerificationResult[]>(ZEL_SVC_MAX_RESULTS);
    int count = 0;
    const int result = zel_svc_config_verification(results.get(), &count);
    int passed = 0;
    for (int i = 0; i < count; ++i)
        passed += results[static_cast<unsigned>(i)].passed;
    std::printf("%d, %d lines, %d passed\n", result, count, passed);
}

void verify_for_imei(char ** /*none*/) {
    char line[306] = "";
    const int result = zel_svc_config_verification_for_imei(line, sizeof line);
    print_text(result, line);
}

void print_operators(const ZelSvcSimOperator *list, int count) {
    std::printf("%d operators\n", count);
    for (int i = 0; i < count; ++i) {
        const ZelSvcSimOperator &entry = list[i];
        std::printf("%s %s %s subset='%s' gid='%s' sp='%s'\n", entry.customer_name, entry.network_name, entry.mccmnc,
                    entry.subset_code, entry.gid, entry.sp_name);
    }
}

void sim_operators(char **arguments) {
    const auto list = std::make_unique<ZelSvcSimOperator[]>(ZEL_SVC_MAX_OPERATORS);
    int count = 0;
    zel_svc_sim_auto_setting_get_operator_list(list.get(), &count, std::atoi(arguments[0]));
    print_operators(list.get(), count);
}

void sim_matches(char **arguments) {
    const auto list = std::make_unique<ZelSvcSimOperator[]>(ZEL_SVC_MAX_OPERATORS);
    ZelSvcSimInfo sim;
    int count = 0;
    if (zel_svc_sim_auto_setting_get_sim_info(&sim, std::atoi(arguments[0])) == 1)
        zel_svc_sim_auto_setting_get_operator_list_by_sim(&sim, list.get(), &count);
    print_operators(list.get(), count);
}

// An operator by its customer and network name, as a user's choice from the list gives it.
void sim_install(char **arguments) {
    const auto list = std::make_unique<ZelSvcSimOperator[]>(ZEL_SVC_MAX_OPERATORS);
    int count = 0;
    zel_svc_sim_auto_setting_get_operator_list(list.get(), &count, 1);
    for (int i = 0; i < count; ++i) {
        const ZelSvcSimOperator &entry = list[static_cast<unsigned>(i)];
        if (std::strcmp(entry.customer_name, arguments[0]) != 0) continue;
        if (std::strcmp(entry.network_name, arguments[1]) != 0) continue;
        return zel_svc_sim_auto_setting_install_operator(&entry, std::atoi(arguments[2]));
    }
    std::printf("no such operator\n");
}

void install(char **arguments) { zel_svc_config_install_customer(arguments[0], std::atoi(arguments[1])); }

constexpr Step kSteps[] = {
    {"config", 1, [](char **a) { zel_svc_config_set_pre_config_for_config_mode(a[0]); }},
    {"fota", 1, [](char **a) { zel_svc_config_upgrade_pre_config_for_fota_mode(a[0]); }},
    {"boot", 0, [](char **) { zel_svc_config_upgrade_pre_config_for_normal_booting(); }},
    {"imei", 1, [](char **a) { std::printf("%d\n", zel_svc_config_set_pre_config_for_imei(a[0])); }},
    {"factory-reset", 0, [](char **) { std::printf("%d\n", zel_svc_config_set_pre_config_for_factory_reset()); }},
    {"reboot", 0, [](char **) { zel_svc_config_reboot(); }},
    {"install", 2, install},
    {"header", 0, [](char **) { zel_svc_config_install_header(); }},
    {"internal-name", 1, internal_name},
    {"active-customer", 0, active_customer},
    {"first-customer", 0, first_customer},
    {"customers", 0, customers},
    {"version", 0, version},
    {"approval", 0, approval},
    {"verify", 0, verify},
    {"verify-for-imei", 0, verify_for_imei},
    {"export", 0, [](char **) { std::printf("%d\n", zel_svc_config_encoding_xml()); }},
    {"sim-run", 0, [](char **) { std::printf("%d\n", zel_svc_sim_auto_setting_execute_by_sim()); }},
    {"sim-feature", 0, [](char **) { std::printf("%d\n", zel_svc_sim_auto_setting_chk_feature_enable()); }},
    {"sim-operators", 1, sim_operators},
    {"sim-matches", 1, sim_matches},
    {"sim-install", 3, sim_install},
};

} // namespace

int main(int argc, char **argv) {
    for (const Step &step : kSteps) {
        if (argc < 2 || std::string_view{step.name} != argv[1]) continue;
        if (argc - 2 != step.arguments) break;
        step.run(argv + 2);
        return 0;
    }
    std::fprintf(stderr, "usage: zel-step STEP [ARGUMENTS]\n");
    for (const Step &step : kSteps)
        std::fprintf(stderr, "  %s (%d arguments)\n", step.name, step.arguments);
    return 2;
}
