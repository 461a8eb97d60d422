/*
 * The interface from C: this file sees zel-svc.h and nothing else of the system. It configures the phone that
 * $ZEL_ROOT names for "XFV" and asks for everything that the header offers; 0 when every answer was right.
 */

#include <zel-svc.h>

#include <stdio.h>
#include <string.h>

static int failures = 0;

static void check(int right, const char *what) {
    if (right) return;
    ++failures;
    fprintf(stderr, "wrong: %s\n", what);
}

#define CHECK(expression) check((expression) ? 1 : 0, #expression)

static void configure(void) {
    zel_svc_config_set_pre_config_for_config_mode("XFV");
    zel_svc_config_upgrade_pre_config_for_fota_mode("XFV");
    zel_svc_config_upgrade_pre_config_for_normal_booting();
    zel_svc_config_install_customer("XFV", ZEL_SVC_INSTALL_NORMAL_BOOTING);
    CHECK(zel_svc_config_set_pre_config_for_imei("XFV") == 1);
}

static void ask_for_the_customer(void) {
    char name[10];
    CHECK(zel_svc_config_get_active_customer_name(name, (int)sizeof name) == 1);
    CHECK(strcmp(name, "XFV") == 0);
    CHECK(zel_svc_config_chk_active_customer_exist() == 1);
    CHECK(zel_svc_config_get_active_customer_name_from_csa(name, (int)sizeof name) == 1);
    CHECK(strcmp(name, "XFV") == 0);
    CHECK(zel_svc_config_get_internal_customer_name("UFN", name, (int)sizeof name) == 1);
    CHECK(strcmp(name, "TFG") == 0);
    zel_svc_config_set_active_customer_name("BTU");
    CHECK(zel_svc_config_get_active_customer_name(name, (int)sizeof name) == 1);
    CHECK(strcmp(name, "BTU") == 0);
}

static void ask_for_the_package(void) {
    static ZelSvcCustomer customers[ZEL_SVC_MAX_CUSTOMERS];
    int32_t count = -1;
    char text[20];
    ZelSvcApprovalVersion versions;
    static ZelSvcSecurityLock locks;

    CHECK(zel_svc_config_get_customer_list(customers, &count) == 1);
    CHECK(count == 1);
    CHECK(strcmp(customers[0].name, "XFV") == 0);
    CHECK(zel_svc_config_chk_customer_name_exist_in_zel_bin("XFV") == 1);
    CHECK(zel_svc_config_get_first_customer_name_in_zel_bin(text, (int)sizeof text) == 1);
    CHECK(strcmp(text, "XFV") == 0);
    CHECK(zel_svc_config_get_zel_bin_version(text, (int)sizeof text) == 1);
    CHECK(strcmp(text, "NAME01V02") == 0);
    CHECK(zel_svc_config_get_approval_version(&versions) == 0);
    CHECK(zel_svc_config_chk_approval_version_exist() == 0);
    CHECK(zel_svc_config_get_security_lock_info(&locks) == 1);
    zel_svc_config_install_header();
}

static void ask_for_the_operator(void) {
    ZelSvcSimOperator stored = {.customer_name = "XFV", .network_name = "Network", .mccmnc = "00101"};
    ZelSvcSimOperator read;
    CHECK(zel_svc_sim_auto_setting_set_active_operator(&stored, 2) == 1);
    CHECK(zel_svc_sim_auto_setting_get_active_operator(&read, 2) == 1);
    CHECK(memcmp(&read, &stored, sizeof read) == 0);
    CHECK(zel_svc_sim_auto_setting_clear_active_operator() == 1);
}

static void ask_for_the_sim(void) {
    static ZelSvcSimOperator operators[ZEL_SVC_MAX_OPERATORS];
    ZelSvcSimInfo sim;
    int32_t count = -1;
    CHECK(zel_svc_sim_auto_setting_chk_feature_enable() == 0);
    CHECK(zel_svc_sim_auto_setting_execute_by_sim() == ZEL_SVC_SIM_DISABLED);
    CHECK(zel_svc_sim_auto_setting_get_sim_info(&sim, 1) == 0);
    CHECK(sim.mccmnc[0] == '\0');
    zel_svc_sim_auto_setting_get_operator_list(operators, &count, 1);
    CHECK(count == 1);
    CHECK(strcmp(operators[0].network_name, "Network") == 0);
    memcpy(sim.mccmnc, "00101", sizeof "00101");
    zel_svc_sim_auto_setting_get_operator_list_by_sim(&sim, operators, &count);
    CHECK(count == 0);
    zel_svc_sim_auto_setting_install_operator(&operators[0], 1);
    CHECK(zel_svc_reinstall_connection(7) == 7);
}

int main(void) {
    configure();
    ask_for_the_customer();
    ask_for_the_package();
    ask_for_the_operator();
    ask_for_the_sim();
    CHECK(zel_svc_config_print_log_file("[C] done.\n") == 1);
    CHECK(zel_svc_config_set_pre_config_for_factory_reset() == 1);
    zel_svc_config_reboot();
    return failures == 0 ? 0 : 1;
}
