// The run after each start of a phone whose SIM decides the operator: notices another SIM in a slot, finds the
// operator that it belongs to, and installs it.

#include "base/zel-svc-file.h"
#include "base/zel-svc-guard.h"
#include "base/zel-svc-internal-customer.h"
#include "base/zel-svc-key-text.h"
#include "base/zel-svc-log.h"
#include "zel-svc-sim-auto-setting-log.h"
#include "zel-svc-sim-auto-setting-slot.h"

#include <span>
#include <vector>

namespace {

enum class Outcome { Nothing, Installed, SelectionNeeded };

// A slot during the run. What is found out about a SIM that was there before stands in the check log; from
// the discovery of another one on, everything stands in the setting log alone.
struct Check {
    const ZelSvcSimSlot &slot;
    const char *log;
    ZelSvcSimInfo sim;
};

void tell(const Check &check, const ZelSvcSimMessage &message) {
    ZEL_SVC_LOG("[SIM%d] %s", check.slot.number, message.c_str());
    zel_svc_sim_log_append(check.log, message);
}

// Ends a run before any slot was looked at; the first slot's log says why.
int refuse(const char *why, int result) {
    ZEL_SVC_LOG("%s", why);
    zel_svc_guarded([=] { zel_svc_sim_log_append(kZelSvcSimSlots[0].check_log, zel_svc_sim_message("%s", why)); });
    return result;
}

struct Identity {
    FixedText<10> mccmnc;
    FixedText<20> msin;
};

Identity identity_seen_last_time(const ZelSvcSimSlot &slot) {
    return {FixedText<10>{zel_svc_key_text_or_empty(slot.mccmnc.key)},
            FixedText<20>{zel_svc_key_text_or_empty(slot.msin.key)}};
}

void store_identity(const Check &check) {
    vconf_set_str(check.slot.mccmnc.key, zel_svc_sim_text(check.sim.mccmnc).c_str());
    vconf_set_str(check.slot.msin.key, zel_svc_sim_text(check.sim.msin).c_str());
}

ZelSvcSimMessage phone_text(const Identity &phone) {
    if (phone.msin.empty()) return zel_svc_sim_message("Phone(MCCMNC='%s',MSIN='').", phone.mccmnc.c_str());
    return zel_svc_sim_message("Phone(MCCMNC='%s',MSIN(3)='%s').", phone.mccmnc.c_str(),
                               zel_svc_sim_msin_shown(phone.msin.view()).c_str());
}

ZelSvcSimMessage sim_text(const ZelSvcSimInfo &sim) {
    return zel_svc_sim_message("SIM(MCCMNC='%s',MSIN(3)='%s',GID='%s',SPN='%s') inserted.",
                               zel_svc_sim_text(sim.mccmnc).c_str(),
                               zel_svc_sim_msin_shown(zel_svc_sim_text(sim.msin)).c_str(),
                               zel_svc_sim_text(sim.gid).c_str(), zel_svc_sim_text(sim.spn).c_str());
}

bool is_readable(Check &check) {
    const int state = zel_svc_sim_number(check.slot.state_key).value;
    if (state != 1) {
        tell(check, zel_svc_sim_message("SIM%d not inserted(%d).", check.slot.number, state));
        return false;
    }
    tell(check, zel_svc_sim_message("SIM%d normally inserted.", check.slot.number));
    return true;
}

bool reads_sim(Check &check) {
    if (zel_svc_sim_auto_setting_get_sim_info(&check.sim, check.slot.number) == 1) return true;
    tell(check, zel_svc_sim_message("SIM recognition failed."));
    return false;
}

// The whole MSIN counts, though no log shows where two differ behind the third digit.
bool is_another_sim(const Check &check, const Identity &phone) {
    tell(check, phone_text(phone));
    zel_svc_sim_log_append(check.log, sim_text(check.sim));
    const bool changed =
        !(phone.mccmnc == zel_svc_sim_text(check.sim.mccmnc)) || !(phone.msin == zel_svc_sim_text(check.sim.msin));
    tell(check, zel_svc_sim_message(changed ? "SIM changed." : "SIM not changed."));
    return changed;
}

void start_setting(Check &check) {
    const ZelSvcSimSlot &slot = check.slot;
    const int result = vconf_set_bool(slot.changed.key, 1);
    ZEL_SVC_LOG("[SIM%d] vconf_set_bool(%s,1)=%d run.", slot.number, slot.changed.word, result);
    check.log = slot.setting_log;
    zel_svc_file_remove(check.log);
    zel_svc_sim_log_append(check.log, sim_text(check.sim));
    const ZelSvcSimOperator nobody = {};
    zel_svc_sim_auto_setting_set_active_operator(&nobody, slot.number);
    vconf_set_int(slot.selection.key, 0);
}

void tell_candidates(const Check &check, std::span<const ZelSvcSimOperator> candidates) {
    int number = 0;
    for (const ZelSvcSimOperator &entry : candidates) {
        const std::string text = zel_svc_sim_operator_text(entry);
        zel_svc_sim_log_append(check.log, zel_svc_sim_message("[Op%d] %s found.", number, text.c_str()));
        ZEL_SVC_LOG("[SIM%d][Op%d] %s_%s found!", check.slot.number, number,
                    zel_svc_sim_text(entry.customer_name).c_str(), zel_svc_sim_text(entry.network_name).c_str());
        ++number;
    }
    ZEL_SVC_LOG("[SIM%d] opCount=%d.", check.slot.number, number);
}

Outcome install(const Check &check, const ZelSvcSimOperator &entry) {
    zel_svc_sim_auto_setting_install_operator(&entry, check.slot.number);
    zel_svc_sim_auto_setting_set_active_operator(&entry, check.slot.number);
    store_identity(check);
    return Outcome::Installed;
}

ZelSvcSimMessage not_found_text() {
    const ZelSvcCurrentCustomer customer = zel_svc_current_customer();
    const char *code = customer.code.c_str();
    if (!customer.shares_folder) return zel_svc_sim_message("Operator in %s spec not found, skip.", code);
    return zel_svc_sim_message("Operator in %s spec(active:%s) not found, skip.", customer.folder.c_str(), code);
}

// The same SIM is not looked at again.
Outcome skip(const Check &check) {
    tell(check, not_found_text());
    store_identity(check);
    return Outcome::Nothing;
}

// The SIM's identity is not stored: until the user has chosen, every run finds another SIM and asks again.
Outcome ask_user(const Check &check) {
    tell(check, zel_svc_sim_message("Selection UI needed!"));
    vconf_set_int(check.slot.selection.key, 1);
    return Outcome::SelectionNeeded;
}

Outcome set_up(Check &check) {
    start_setting(check);
    std::vector<ZelSvcSimOperator> room(ZEL_SVC_MAX_OPERATORS);
    int32_t count = 0;
    zel_svc_sim_auto_setting_get_operator_list_by_sim(&check.sim, room.data(), &count);
    const std::span candidates{room.data(), static_cast<std::size_t>(count)};
    tell_candidates(check, candidates);
    if (candidates.empty()) return skip(check);
    return candidates.size() == 1 ? install(check, candidates.front()) : ask_user(check);
}

Outcome check_slot(const ZelSvcSimSlot &slot) {
    Check check{slot, slot.check_log, {}};
    if (!is_readable(check)) return Outcome::Nothing;
    const Identity phone = identity_seen_last_time(slot);
    if (!reads_sim(check) || !is_another_sim(check, phone)) return Outcome::Nothing;
    return set_up(check);
}

std::span<const ZelSvcSimSlot> slots() {
    const ZelSvcSimNumber count = zel_svc_sim_number(ZEL_SVC_SIM_SLOT_COUNT_KEY);
    return std::span{kZelSvcSimSlots}.first(count.result == 0 && count.value >= 2 ? 2 : 1);
}

int check_slots() {
    int result = ZEL_SVC_SIM_NOTHING_INSTALLED;
    bool selection_needed = false;
    for (const ZelSvcSimSlot &slot : slots()) {
        const Outcome outcome = zel_svc_guarded_or(Outcome::Nothing, [&] { return check_slot(slot); });
        if (outcome == Outcome::Installed) result = ZEL_SVC_SIM_INSTALLED;
        selection_needed = selection_needed || outcome == Outcome::SelectionNeeded;
    }
    return selection_needed ? ZEL_SVC_SIM_SELECTION_NEEDED : result;
}

} // namespace

int zel_svc_sim_auto_setting_execute_by_sim() {
    ZEL_SVC_LOG("***** ZEL SIM auto settings / Start *****");
    for (const ZelSvcSimSlot &slot : kZelSvcSimSlots)
        zel_svc_file_remove(slot.check_log);
    if (zel_svc_config_chk_active_customer_exist() == 0)
        return refuse("Pre-configuration needed.", ZEL_SVC_SIM_NO_CUSTOMER);
    if (zel_svc_sim_auto_setting_chk_feature_enable() == 0)
        return refuse("SIM auto setting disabled.", ZEL_SVC_SIM_DISABLED);
    const int result = check_slots();
    ZEL_SVC_LOG("***** ZEL SIM auto settings / End *****");
    return result;
}
