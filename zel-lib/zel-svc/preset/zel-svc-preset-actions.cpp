#include "preset/zel-svc-preset-actions.h"

#include "base/zel-svc-run-log.h"

#include <alarm-manager.h>
#include <isf-control.h>

#include <string>

void zel_svc_preset_set_keyboard(const char *uuid) {
    if (*uuid == '\0') return;
    isf_control_set_initial_ise_by_uuid(uuid);
    isf_control_set_active_ise_by_uuid(uuid);
    zel_svc_run_log("[Preset] Keyboard isf API() called.\n");
}

void zel_svc_preset_set_time_zone(const char *zone) {
    if (*zone == '\0') return;
    const int result = alarmmgr_set_timezone((std::string{"/usr/share/zoneinfo/"} + zone).c_str());
    zel_svc_run_log("[Preset] Time zone('%s')=%d set.\n", zone, result);
}
