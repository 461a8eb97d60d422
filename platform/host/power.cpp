#include "call.h"
#include "record.h"

#include <device-power.h>

namespace zel_host {
namespace {

std::string lock_name(int type) { return "display_lock_" + std::to_string(type); }

int change_lock(Phone &phone, int type, int held) {
    record(phone, lock_name(type), held);
    return 0;
}

} // namespace
} // namespace zel_host

using namespace zel_host;

ZEL_HOST_EXPORT int device_power_request_lock(int type, int timeout_ms) {
    return answer<function("device_power_request_lock")>([&](Phone &phone) { return change_lock(phone, type, 1); },
                                                         type, timeout_ms);
}

ZEL_HOST_EXPORT int device_power_release_lock(int type) {
    return answer<function("device_power_release_lock")>([&](Phone &phone) { return change_lock(phone, type, 0); },
                                                         type);
}
