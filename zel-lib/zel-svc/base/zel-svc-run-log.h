#pragma once
// The run log, "/opt/system/zel-default/output/zel-config.log": what a run did, for people.
//
//     zel_svc_run_log("[Config] SIM slot count=%d.\n", count);

#include <cstdarg>

inline constexpr const char *ZEL_SVC_RUN_LOG_PATH = "/opt/system/zel-default/output/zel-config.log";

// Appends one formatted line of any length through zel_svc_config_print_log_file(). The newline is the
// caller's.
__attribute__((format(printf, 1, 2))) void zel_svc_run_log(const char *format, ...);
