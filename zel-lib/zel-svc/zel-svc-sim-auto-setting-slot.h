#pragma once
// The SIM slots of a phone: where each one's state, identity, flags and logs are kept.

#include "spec/zel-svc-data.h"
#include "spec/zel-svc-parse-context.h"

#include <array>

struct ZelSvcSimKey {
    const char *key;
    const char *word; // in log messages
};

struct ZelSvcSimSlot {
    int number;
    const char *state_key; // 1: a SIM is inserted; anything else: none that can be used
    ZelSvcSimKey mccmnc;   // of the SIM seen last time
    ZelSvcSimKey msin;
    ZelSvcSimKey selection; // 1: the user has to choose an operator
    ZelSvcSimKey changed;
    const char *check_log;
    const char *setting_log;
    const char *network_database;
    unsigned data_variant;
};

inline constexpr std::array<ZelSvcSimSlot, 2> kZelSvcSimSlots{{
    {.number = 1,
     .state_key = "memory/telephony/sim_slot",
     .mccmnc = {"db/private/zel/sim_mcc_mnc", "ZelSimMccMnc"},
     .msin = {"db/private/zel/sim_msin", "ZelSimMsin"},
     .selection = {"db/private/zel/sim_selection_show", "ZelSimSelectionShow"},
     .changed = {"memory/private/zel/sim_changed", "ZelSimChanged"},
     .check_log = "/opt/system/zel-default/output/zel-sim-check.log",
     .setting_log = "/opt/system/zel-default/output/zel-sim-setting.log",
     .network_database = ZEL_SVC_NETWORK_DB_PATH_SIM1,
     .data_variant = ZEL_SVC_DATA_SIM1},
    {.number = 2,
     .state_key = "memory/telephony/sim_slot2",
     .mccmnc = {"db/private/zel/sim2/sim_mcc_mnc", "ZelSim2MccMnc"},
     .msin = {"db/private/zel/sim2/sim_msin", "ZelSim2Msin"},
     .selection = {"db/private/zel/sim2/sim_selection_show", "ZelSim2SelectionShow"},
     .changed = {"memory/private/zel/sim2/sim_changed", "ZelSim2Changed"},
     .check_log = "/opt/system/zel-default/output/zel-sim2-check.log",
     .setting_log = "/opt/system/zel-default/output/zel-sim2-setting.log",
     .network_database = ZEL_SVC_NETWORK_DB_PATH_SIM2,
     .data_variant = ZEL_SVC_DATA_SIM2},
}};

// Slot 2 is the second SIM's; any other number is the first's.
constexpr const ZelSvcSimSlot &zel_svc_sim_slot(int slot) { return kZelSvcSimSlots[slot == 2 ? 1 : 0]; }

// An integer key, or the number that stands for one that cannot be read.
struct ZelSvcSimNumber {
    int value = -1;
    int result = -1; // of the settings store, 0 when the value was read
};
ZelSvcSimNumber zel_svc_sim_number(const char *key);

inline constexpr const char *ZEL_SVC_SIM_SLOT_COUNT_KEY = "memory/telephony/sim_slot_count";
