#include "call.h"
#include "record.h"

#include <alarm-manager.h>

namespace zel_host {
namespace {

// The phone has no zone files, so any name is taken for one.
int choose_zone(Phone &phone, const char *path) {
    if (path == nullptr || *path == '\0') return -1;
    record(phone, "time_zone", path);
    return 0;
}

} // namespace
} // namespace zel_host

using namespace zel_host;

ZEL_HOST_EXPORT int alarmmgr_set_timezone(const char *path) {
    return answer<function("alarmmgr_set_timezone")>([path](Phone &phone) { return choose_zone(phone, path); }, path);
}
