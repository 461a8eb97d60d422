#pragma once
// How long each phase of a run took: "/opt/system/zel-default/output/zel-time-lap.log", one line a lap.

enum ZelTimeLapSlot : int {
    ZEL_TIME_LAP_CONFIG_MODE = 0,
    ZEL_TIME_LAP_FOTA_MODE = 1,
    ZEL_TIME_LAP_NORMAL_BOOTING = 2,
    ZEL_TIME_LAP_SPEC = 3,
    ZEL_TIME_LAP_SPEC_NETWORK_INFO = 4,
    ZEL_TIME_LAP_SPEC_APN = 5,
    ZEL_TIME_LAP_SPEC_BOOKMARK = 6,
    ZEL_TIME_LAP_SIM2_SPEC = 7,
    ZEL_TIME_LAP_SIM2_APN = 8,
    ZEL_TIME_LAP_PRESET = 9,
    ZEL_TIME_LAP_APP = 10,
    ZEL_TIME_LAP_FS_UPDATE = 11,
    ZEL_TIME_LAP_USR = 12,
    ZEL_TIME_LAP_KEYBOARD = 13, // no phase uses it
    ZEL_TIME_LAP_COLLECT = 14,
    ZEL_TIME_LAP_SLOT_COUNT = 15,
    ZEL_TIME_LAP_NONE = -1,
};

// Takes the start time of a slot. Slots outside the table are ignored here and below.
void zel_svc_time_lap_begin(int slot);

// Deletes the log, for a run that starts a new one.
void __zel_svc_config_time_lap_start();

// Takes the end time and appends the slot's line. The microseconds are subtracted without a borrow from the
// seconds and printed unsigned: tools read the two numbers, not a decimal.
void __zel_svc_config_time_lap_end(int slot);
