#include "base/zel-svc-time-lap.h"

#include "base/zel-svc-file.h"
#include "base/zel-svc-log.h"

#include <zel-platform.h>

#include <array>
#include <cstdio>
#include <fcntl.h>

namespace {

constexpr const char *kLogPath = "/opt/system/zel-default/output/zel-time-lap.log";

constexpr std::array<const char *, ZEL_TIME_LAP_SLOT_COUNT> kPhases = {
    "All on Config mode",
    "All on FOTA mode",
    "All on Normal booting",
    "Spec",
    "Spec/NetworkInfo",
    "Spec/APN",
    "Spec/Bookmark",
    "Spec(SIM2)",
    "Spec(SIM2)/APN",
    "Preset",
    "App",
    "FS update",
    "Usr",
    "Keyboard",
    "Collect",
};

std::array<timeval, ZEL_TIME_LAP_SLOT_COUNT> gstZelSvcTimeLapStarts = {};

bool is_slot(int slot) { return slot >= 0 && slot < ZEL_TIME_LAP_SLOT_COUNT; }

} // namespace

void zel_svc_time_lap_begin(int slot) {
    if (is_slot(slot)) zel_platform_now(&gstZelSvcTimeLapStarts[static_cast<std::size_t>(slot)]);
}

void __zel_svc_config_time_lap_start() {
    const int result = zel_svc_file_remove(kLogPath);
    ZEL_SVC_LOG("remove(ZelTimeLap)=%d run.\n", result);
}

void __zel_svc_config_time_lap_end(int slot) {
    if (!is_slot(slot)) return;
    const auto index = static_cast<std::size_t>(slot);
    const timeval &start = gstZelSvcTimeLapStarts[index];
    timeval end = start; // a clock that cannot be read gives an empty lap
    zel_platform_now(&end);

    char line[96];
    const int size = std::snprintf(line, sizeof line, "Time lap (%s) : %u.%u sec\n", kPhases[index],
                                   static_cast<unsigned>(end.tv_sec - start.tv_sec),
                                   static_cast<unsigned>(end.tv_usec - start.tv_usec));
    const ZelSvcFd log = zel_svc_file_open(kLogPath, O_RDWR | O_CREAT | O_APPEND, 0644);
    if (!log || size <= 0) return;
    zel_svc_file_write_all(log.get(), {line, static_cast<std::size_t>(size)});
    zel_svc_file_set_output_attr(kLogPath, "*");
}
