#include "call.h"
#include "system-log.h"

#include <array>
#include <cstdarg>
#include <cstdio>
#include <dlog.h>
#include <string>

namespace {

[[gnu::format(printf, 1, 0)]] std::string formatted(const char *format, va_list values) {
    std::array<char, 1024> text{};
    va_list again;
    va_copy(again, values);
    const int size = std::vsnprintf(text.data(), text.size(), format, values);
    const std::size_t length = size < 0 ? 0 : static_cast<std::size_t>(size);
    std::string result(text.data(), std::min(length, text.size() - 1));
    if (length >= text.size()) {
        result.resize(length + 1);
        static_cast<void>(std::vsnprintf(result.data(), result.size(), format, again));
        result.resize(length);
    }
    va_end(again);
    return result;
}

} // namespace

using namespace zel_host;

ZEL_HOST_EXPORT int __dlog_print(int log_id, int priority, const char *tag, const char *format, ...) {
    if (format == nullptr) return -1;
    try {
        va_list values;
        va_start(values, format);
        const std::string message = formatted(format, values);
        va_end(values);
        return answer<function("__dlog_print")>(
            [&](Phone &phone) { return write_log(phone, priority, tag == nullptr ? "" : tag, message); }, log_id,
            priority, tag, message.c_str());
    } catch (const std::exception &) {
        return -1;
    }
}
