#include "spec/zel-svc-element-stack.h"

#include "spec/zel-svc-element-state.h"

ZelSvcElementState gZelSvcElementState;

namespace {

ZelSvcElementState &state() { return gZelSvcElementState; }
bool is_row(ZelSvcElementId id) { return id >= 0 && id < ZEL_SVC_ELEMENT_COUNT; }

// The list may name no element, too.
bool may_be_listed(ZelSvcElementId id) { return is_row(id) || id == ZEL_SVC_ELEMENT_NONE; }

} // namespace

int zel_svc_element_push(ZelSvcElementId id) { return is_row(id) && state().push(id) ? 1 : 0; }

ZelSvcElementId zel_svc_element_pop() {
    const ZelSvcElementId top = state().current();
    state().pop();
    return top;
}

ZelSvcElementId zel_svc_element_get_current_id() { return state().current(); }
ZelSvcElementId zel_svc_element_get_enclosing_id() { return state().enclosing(); }
void zel_svc_element_stack_reset() { state().depth = 0; }

std::int32_t zel_svc_element_get_count(ZelSvcElementId id) {
    return is_row(id) ? state().counts[static_cast<std::size_t>(id)] : 0;
}

void zel_svc_element_count_up(ZelSvcElementId id) {
    if (is_row(id)) ++state().counts[static_cast<std::size_t>(id)];
}

void zel_svc_element_counts_reset() { state().counts.fill(0); }

void zel_svc_element_clear_enabled() {
    state().enabled_count = 0;
    state().disabled.fill(false);
    state().stop = ZEL_SVC_ELEMENT_NONE;
}

int zel_svc_element_enable(ZelSvcElementId id) {
    if (state().enabled_count == ZEL_SVC_ELEMENT_MAX_ENABLED) return 0;
    if (state().enabled_count++ == 0) state().disabled.fill(true);
    if (may_be_listed(id)) state().disabled[static_cast<std::size_t>(id)] = false;
    return 1;
}

int zel_svc_element_is_enabled(ZelSvcElementId id) {
    if (state().enabled_count == 0) return 1;
    return may_be_listed(id) && !state().disabled[static_cast<std::size_t>(id)] ? 1 : 0;
}

void zel_svc_element_set_stop(ZelSvcElementId id) { state().stop = id; }
int zel_svc_element_is_stop(ZelSvcElementId id) { return state().is_stop(id) ? 1 : 0; }
