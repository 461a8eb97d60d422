#pragma once
// System-log lines. Each begins with the source file, function and line that wrote it:
//
//     ZEL_SVC_LOG("API(customer='%s') entered.\n", customer);
//     -> "zel-svc-configuration-install.cpp: zel_svc_config_install_customer(42) > API(customer='XFV') entered.\n"
//
// Warnings start their text with "<Warning>" or "<WARN>".

#include <dlog.h>

// The name of a source file without its folders.
constexpr const char *zel_svc_log_base_name(const char *path) {
    const char *name = path;
    for (; *path != '\0'; ++path)
        if (*path == '/') name = path + 1;
    return name;
}

#define ZEL_SVC_LOG(format, ...)                                                                                       \
    static_cast<void>(__dlog_print(DLOG_ID_MAIN, DLOG_PRIORITY_WARN, "ZEL", "%s: %s(%d) > " format,                    \
                                   zel_svc_log_base_name(__FILE__), __func__, __LINE__ __VA_OPT__(, ) __VA_ARGS__))
