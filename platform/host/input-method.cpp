#include "call.h"
#include "record.h"

#include <isf-control.h>

namespace zel_host {
namespace {

int choose(Phone &phone, const char *name, const char *uuid) {
    if (uuid == nullptr || *uuid == '\0') return -1;
    record(phone, name, uuid);
    return 0;
}

} // namespace
} // namespace zel_host

using namespace zel_host;

ZEL_HOST_EXPORT int isf_control_set_initial_ise_by_uuid(const char *uuid) {
    return answer<function("isf_control_set_initial_ise_by_uuid")>(
        [uuid](Phone &phone) { return choose(phone, "initial_keyboard", uuid); }, uuid);
}

ZEL_HOST_EXPORT int isf_control_set_active_ise_by_uuid(const char *uuid) {
    return answer<function("isf_control_set_active_ise_by_uuid")>(
        [uuid](Phone &phone) { return choose(phone, "active_keyboard", uuid); }, uuid);
}
