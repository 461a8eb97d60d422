#pragma once
// A phase of an install run: a line at its start, its work, a line at its end, and the time that it took.
//
//     zel_svc_phase("Copy user folder", ZEL_TIME_LAP_USR, [&] { copy_user_folders(customer); });
//
// The end line and the lap are written whatever the work ran into.

#include "base/zel-svc-guard.h"
#include "base/zel-svc-run-log.h"
#include "base/zel-svc-time-lap.h"

template <class Work> void zel_svc_timed(int lap, Work &&work) {
    zel_svc_time_lap_begin(lap);
    zel_svc_guarded(work);
    zel_svc_guarded([lap] { __zel_svc_config_time_lap_end(lap); });
}

template <class Work> void zel_svc_phase(const char *name, int lap, Work &&work) {
    zel_svc_guarded([name] { zel_svc_run_log("[Config/Start] %s.\n", name); });
    zel_svc_timed(lap, work);
    zel_svc_guarded([name] { zel_svc_run_log("[Config/Ended] %s.\n", name); });
}
