#include "call.h"
#include "clock.h"
#include "record.h"
#include "tools.h"

#include <zel-platform.h>

namespace zel_host {
namespace {

constexpr std::int64_t kSecond = 1'000'000;

int tell_time(Phone &phone, timeval *now) {
    errno = EFAULT;
    if (now == nullptr) return -1;
    const std::int64_t us = now_us(phone);
    now->tv_sec = us / kSecond;
    now->tv_usec = us % kSecond;
    return 0;
}

int note_restart(Phone &phone, int command) {
    record(phone, "restart_command", command);
    record(phone, "restarts", recorded_number(phone, "restarts") + 1);
    return 0;
}

} // namespace
} // namespace zel_host

using namespace zel_host;

ZEL_HOST_EXPORT int zel_platform_command(const char *command) {
    return answer<function("zel_platform_command")>(
        [&](Phone &phone) { return command == nullptr ? 0 : run_command(phone, command); }, command);
}

// Nothing of a bench phone needs to outlive the workstation's power.
ZEL_HOST_EXPORT void zel_platform_sync(void) {
    answer<function("zel_platform_sync")>([](Phone &) {});
}

ZEL_HOST_EXPORT int zel_platform_reboot(int command) {
    return answer<function("zel_platform_reboot")>([&](Phone &phone) { return note_restart(phone, command); }, command);
}

ZEL_HOST_EXPORT int zel_platform_now(struct timeval *now) {
    return answer<function("zel_platform_now")>([&](Phone &phone) { return tell_time(phone, now); });
}
