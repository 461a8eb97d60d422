// Whether the SIM decides anything on this phone.

#include "zel-svc-sim-auto-setting-slot.h"
#include "zel-svc.h"

#include <algorithm>

namespace {

constexpr const char *kEnableKey = "db/private/zel/sim_auto_enable";

bool is_switched_on() {
    const ZelSvcSimNumber enabled = zel_svc_sim_number(kEnableKey);
    return enabled.result == 0 && enabled.value != 0;
}

bool awaits_selection(const ZelSvcSimSlot &slot) { return zel_svc_sim_number(slot.selection.key).value == 1; }

} // namespace

int zel_svc_sim_auto_setting_chk_feature_enable() {
    if (zel_svc_config_chk_active_customer_exist() == 0 || !is_switched_on()) return 0;
    return std::any_of(kZelSvcSimSlots.begin(), kZelSvcSimSlots.end(), awaits_selection) ? 2 : 1;
}

int zel_svc_reinstall_connection(int value) { return value; }
