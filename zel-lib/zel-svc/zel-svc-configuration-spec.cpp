// The customer's file: all of it in configuration mode, group by group in an upgrade.

#include "base/zel-svc-guard.h"
#include "base/zel-svc-run-log.h"
#include "spec/zel-svc-data.h"
#include "spec/zel-svc-spec-file.h"
#include "zel-svc-configuration-customer-path.h"
#include "zel-svc-configuration-phase.h"
#include "zel-svc-configuration-phases.h"
#include "zel-svc-selective-pass.h"

#include <vconf.h>

namespace {

struct Step {
    ZelSvcPass pass;
    int lap = ZEL_TIME_LAP_NONE;
};

constexpr Step kUpgrade[] = {
    {ZEL_SVC_PASS_NETWORK_INFO, ZEL_TIME_LAP_SPEC_NETWORK_INFO},
    {ZEL_SVC_PASS_CONNECTIONS, ZEL_TIME_LAP_SPEC_APN},
    {ZEL_SVC_PASS_BOOKMARK, ZEL_TIME_LAP_SPEC_BOOKMARK},
    {ZEL_SVC_PASS_VOICE_MAIL},
    {ZEL_SVC_PASS_EMAIL_ACCOUNT},
    {ZEL_SVC_PASS_WB_AMR},
    {ZEL_SVC_PASS_FAST_DORMANCY},
    {ZEL_SVC_PASS_MAX_PDP},
    {ZEL_SVC_PASS_IMS},
};

// The groups that a phone keeps for each SIM. The networks are not read again: their table holds the ids of
// the first SIM's database.
constexpr Step kSecondSim[] = {
    {ZEL_SVC_PASS_CONNECTIONS, ZEL_TIME_LAP_SIM2_APN},
    {ZEL_SVC_PASS_FAST_DORMANCY},
    {ZEL_SVC_PASS_MAX_PDP},
    {ZEL_SVC_PASS_VOICE_MAIL},
    {ZEL_SVC_PASS_IMS},
};

void run_passes(std::span<const Step> steps, const std::string &path, unsigned variant) {
    const ZelSvcPassSequence sequence{
        .wanted_flag = 0, .mode = ZEL_SVC_PARSE_MODE_FULL, .variant = variant, .path = path};
    for (const Step &step : steps)
        zel_svc_selective_pass_run(step.pass, sequence, step.lap);
}

void load_every_group() {
    for (int group = 0; group < ZEL_SVC_DATA_GROUP_COUNT; ++group)
        zel_svc_guarded([group] { zel_svc_data_load(group, ZEL_SVC_DATA_SIM1, 1); });
}

void dump_every_group() {
    for (int group = 0; group < ZEL_SVC_DATA_GROUP_COUNT; ++group) {
        zel_svc_guarded([group] { zel_svc_data_dump(group, ZEL_SVC_DATA_SIM1); });
        zel_svc_data_free(group);
    }
}

void install_all(const std::string &path) {
    load_every_group();
    geZelSvcParseMode = ZEL_SVC_PARSE_MODE_FULL;
    zel_svc_guarded([&] { zel_svc_spec_parse_file(ZEL_SVC_PARSE_ACTION_INSTALL, path.c_str(), 1); });
    dump_every_group();
}

void install_second_sim(const std::string &path) {
    zel_svc_set_network_db_path(ZEL_SVC_NETWORK_DB_PATH_SIM2);
    run_passes(kSecondSim, path, ZEL_SVC_DATA_SIM2);
}

void install_further_sims(const std::string &path) {
    int slots = 0;
    if (vconf_get_int("memory/telephony/sim_slot_count", &slots) != 0) {
        zel_svc_run_log("[Config/Error!!] SIM slot count unknown!\n");
        return;
    }
    zel_svc_run_log("[Config] SIM slot count=%d.\n", slots);
    if (slots > 1)
        zel_svc_phase("Install customer.xml for dual SIM device", ZEL_TIME_LAP_SIM2_SPEC,
                      [&] { install_second_sim(path); });
}

void install_first_sim(const std::string &path, int kind) {
    // The flags decide what the handlers of the full parse skip and which passes an upgrade has.
    zel_svc_selective_pass_read_auto_flags(path);
    zel_svc_set_network_db_path(ZEL_SVC_NETWORK_DB_PATH_SIM1);
    if (kind == ZEL_SVC_INSTALL_CONFIG_MODE)
        zel_svc_phase("Install customer.xml (Full)", ZEL_TIME_LAP_NONE, [&] { install_all(path); });
    else
        zel_svc_phase("Install customer.xml (Upgrade)", ZEL_TIME_LAP_NONE,
                      [&] { run_passes(kUpgrade, path, ZEL_SVC_DATA_SIM1); });
}

} // namespace

void zel_svc_config_install_spec(std::string_view customer, int kind) {
    const std::string path = zel_svc_customer_spec_path(customer);
    zel_svc_timed(ZEL_TIME_LAP_SPEC, [&] { install_first_sim(path, kind); });
    install_further_sims(path);
}
