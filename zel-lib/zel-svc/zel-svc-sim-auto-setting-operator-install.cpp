// Installs the settings of one operator for one SIM slot: the groups that the customer leaves to the SIM, and
// of those the entries of the operator's network.

#include "base/zel-svc-guard.h"
#include "base/zel-svc-internal-customer.h"
#include "base/zel-svc-log.h"
#include "zel-svc-configuration-customer-path.h"
#include "zel-svc-selective-pass.h"
#include "zel-svc-sim-auto-setting-apn-reset.h"
#include "zel-svc-sim-auto-setting-log.h"
#include "zel-svc-sim-auto-setting-slot.h"

#include <vconf.h>

#include <string>

namespace {

// Bookmarks, e-mail accounts and WB-AMR codecs are one for both slots: the later install wins.
enum class KeptFor { Phone, Slot };

struct Step {
    ZelSvcPass pass;
    KeptFor kept_for;
};

constexpr Step kProfiles{ZEL_SVC_PASS_CONNECTIONS, KeptFor::Slot};
constexpr Step kAfterProfiles[] = {
    {ZEL_SVC_PASS_BOOKMARK, KeptFor::Phone},
    {ZEL_SVC_PASS_VOICE_MAIL, KeptFor::Slot},
    {ZEL_SVC_PASS_EMAIL_ACCOUNT, KeptFor::Phone},
    {ZEL_SVC_PASS_WB_AMR, KeptFor::Phone},
    {ZEL_SVC_PASS_FAST_DORMANCY, KeptFor::Slot},
    {ZEL_SVC_PASS_MAX_PDP, KeptFor::Slot},
    {ZEL_SVC_PASS_IMS, KeptFor::Slot},
};

bool read_active_customers_flags() {
    const ZelSvcCurrentCustomer customer = zel_svc_current_customer();
    if (customer.code.empty()) return false;
    return zel_svc_selective_pass_read_auto_flags(zel_svc_customer_spec_path(customer.folder.view()));
}

// Without a customer or its file, what an earlier one said must not decide now. A file that was read, though not to
// its end, is that customer's.
void read_flags() {
    if (!zel_svc_guarded_or(false, [] { return read_active_customers_flags(); })) gbZelSvcNetworkAutoFlags.fill(0);
}

bool sim_brings_profiles() { return gbZelSvcNetworkAutoFlags.at(ZEL_SVC_AUTO_PROFILE) == 1; }

void run_pass(const Step &step, const ZelSvcSimOperator &entry, const ZelSvcSimSlot &slot) {
    zel_svc_current_operator() = entry;
    zel_svc_selective_pass_run(step.pass,
                               {.wanted_flag = 1,
                                .mode = ZEL_SVC_PARSE_MODE_OPERATOR,
                                .variant = step.kept_for == KeptFor::Slot ? slot.data_variant : ZEL_SVC_DATA_SIM1,
                                .path = zel_svc_customer_spec_path(zel_svc_sim_text(entry.customer_name))});
}

void install_profiles(const ZelSvcSimOperator &entry, const ZelSvcSimSlot &slot, int number) {
    if (!sim_brings_profiles()) return;
    zel_svc_guarded([&] { run_pass(kProfiles, entry, slot); });
    zel_svc_guarded([=] { __zel_svc_sim_auto_setting_reset_apn_with_dbus(number); });
}

void log_start(const ZelSvcSimOperator &entry, int slot) {
    ZEL_SVC_LOG("***** ZEL SIM auto settings / Install operator *****");
    ZEL_SVC_LOG("[SIM%d] API(pszCustomerName='%s',pszNetworkName='%s') run.", slot,
                zel_svc_sim_text(entry.customer_name).c_str(), zel_svc_sim_text(entry.network_name).c_str());
}

void log_end(const ZelSvcSimOperator &entry, const ZelSvcSimSlot &slot) {
    const std::string text = zel_svc_sim_operator_text(entry);
    zel_svc_sim_log_append(slot.setting_log, zel_svc_sim_message("%s installed.", text.c_str()));
}

} // namespace

void zel_svc_sim_auto_setting_install_operator(const ZelSvcSimOperator *operator_entry, int slot) {
    if (!operator_entry) return;
    const ZelSvcSimOperator &entry = *operator_entry;
    const ZelSvcSimSlot &place = zel_svc_sim_slot(slot);
    zel_svc_guarded([&] { log_start(entry, slot); });
    read_flags();
    zel_svc_set_network_db_path(place.network_database);
    install_profiles(entry, place, slot);
    for (const Step &step : kAfterProfiles)
        zel_svc_guarded([&] { run_pass(step, entry, place); });
    vconf_set_int("memory/zel/sim_auto_setting_updated", 1);
    zel_svc_guarded([&] { log_end(entry, place); });
}
