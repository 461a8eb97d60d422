#include "spec/zel-svc-element-stack.h"

#include <array>
#include <bitset>

namespace {

struct OpenElements {
    std::int32_t depth = 0;
    std::array<ZelSvcElementId, ZEL_SVC_ELEMENT_MAX_DEPTH> slots = {};
};

struct EnabledElements {
    std::int32_t count = 0;
    std::bitset<ZEL_SVC_ELEMENT_COUNT> rows;
    ZelSvcElementId stop = ZEL_SVC_ELEMENT_NONE;
};

OpenElements gOpen;
EnabledElements gEnabled;
std::array<std::int32_t, ZEL_SVC_ELEMENT_COUNT> gCounts = {};

bool is_row(ZelSvcElementId id) { return id >= 0 && id < ZEL_SVC_ELEMENT_COUNT; }

ZelSvcElementId open_element(std::int32_t from_top) {
    return gOpen.depth >= from_top ? gOpen.slots[static_cast<std::size_t>(gOpen.depth - from_top)]
                                   : ZEL_SVC_ELEMENT_NONE;
}

} // namespace

int zel_svc_element_push(ZelSvcElementId id) {
    if (!is_row(id) || gOpen.depth >= ZEL_SVC_ELEMENT_MAX_DEPTH) return 0;
    gOpen.slots[static_cast<std::size_t>(gOpen.depth++)] = id;
    return 1;
}

ZelSvcElementId zel_svc_element_pop() {
    const ZelSvcElementId top = open_element(1);
    if (gOpen.depth > 0) --gOpen.depth;
    return top;
}

ZelSvcElementId zel_svc_element_get_current_id() { return open_element(1); }
ZelSvcElementId zel_svc_element_get_enclosing_id() { return open_element(2); }
void zel_svc_element_stack_reset() { gOpen = {}; }

std::int32_t zel_svc_element_get_count(ZelSvcElementId id) {
    return is_row(id) ? gCounts[static_cast<std::size_t>(id)] : 0;
}

void zel_svc_element_count_up(ZelSvcElementId id) {
    if (is_row(id)) ++gCounts[static_cast<std::size_t>(id)];
}

void zel_svc_element_counts_reset() { gCounts.fill(0); }

void zel_svc_element_clear_enabled() { gEnabled = {}; }

int zel_svc_element_enable(ZelSvcElementId id) {
    if (gEnabled.count == ZEL_SVC_ELEMENT_MAX_ENABLED) return 0;
    ++gEnabled.count;
    if (is_row(id)) gEnabled.rows.set(static_cast<std::size_t>(id));
    return 1;
}

int zel_svc_element_is_enabled(ZelSvcElementId id) {
    if (gEnabled.count == 0) return 1;
    return is_row(id) && gEnabled.rows.test(static_cast<std::size_t>(id)) ? 1 : 0;
}

void zel_svc_element_set_stop(ZelSvcElementId id) { gEnabled.stop = id; }

int zel_svc_element_is_stop(ZelSvcElementId id) {
    return gEnabled.stop != ZEL_SVC_ELEMENT_NONE && gEnabled.stop == id ? 1 : 0;
}
