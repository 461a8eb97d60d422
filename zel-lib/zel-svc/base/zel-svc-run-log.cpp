#include "base/zel-svc-run-log.h"

#include "base/zel-svc-file.h"
#include "base/zel-svc-observer.h"
#include "zel-svc.h"

#include <cstdio>
#include <fcntl.h>
#include <string>

int zel_svc_config_print_log_file(const char *text) {
    if (!text) return 0;
    zel_svc_observer().run_log_line(text);
    ZelSvcFd log = zel_svc_file_open(ZEL_SVC_RUN_LOG_PATH, O_WRONLY | O_CREAT | O_APPEND, 0644);
    if (!log) return 0;
    const bool written = zel_svc_file_write_all(log.get(), text);
    log.close();
    zel_svc_file_set_output_attr(ZEL_SVC_RUN_LOG_PATH, "*");
    return written ? 1 : 0;
}

void zel_svc_run_log(const char *format, ...) {
    std::va_list arguments;
    va_start(arguments, format);
    const int size = std::vsnprintf(nullptr, 0, format, arguments);
    va_end(arguments);
    if (size <= 0) return;
    std::string line(static_cast<std::size_t>(size), '\0');
    va_start(arguments, format);
    std::vsnprintf(line.data(), line.size() + 1, format, arguments);
    va_end(arguments);
    zel_svc_config_print_log_file(line.c_str());
}
