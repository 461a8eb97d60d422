#include "call.h"
#include "system-log.h"

#include <cstdarg>
#include <cstdio>
#include <dlog.h>
#include <string>

using namespace zel_host;

ZEL_HOST_EXPORT int __dlog_print(int log_id, int priority, const char *tag, const char *format, ...) {
    if (format == nullptr) return -1;
    try {
        va_list values;
        va_start(values, format);
        const int size = std::vsnprintf(nullptr, 0, format, values);
        va_end(values);
        if (size < 0) return -1;
        std::string message(static_cast<std::size_t>(size) + 1, '\0');
        va_start(values, format);
        static_cast<void>(std::vsnprintf(message.data(), message.size(), format, values));
        va_end(values);
        message.pop_back();
        return answer<function("__dlog_print")>(
            [&](Phone &phone) { return write_log(phone, priority, tag == nullptr ? "" : tag, message); }, log_id,
            priority, tag, message.c_str());
    } catch (const std::exception &) {
        return -1;
    }
}
