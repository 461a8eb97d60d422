#pragma once
// The open elements, their counts and the enabled rows, laid out for the dispatcher, which asks for them at
// every tag. Everybody else goes through the functions of the element stack.

#include "spec/zel-svc-element-stack.h"

#include <array>
#include <cstddef>

struct ZelSvcElementState {
    std::int32_t depth = 0;
    // Open elements from the bottom, two slots of none below them: so the two top ones exist at any depth.
    std::array<ZelSvcElementId, ZEL_SVC_ELEMENT_MAX_DEPTH + 2> slots = {ZEL_SVC_ELEMENT_NONE, ZEL_SVC_ELEMENT_NONE};

    // By row, and that of no element last.
    std::array<std::int32_t, ZEL_SVC_ELEMENT_COUNT + 1> counts = {};

    std::int32_t enabled_count = 0;
    std::array<bool, ZEL_SVC_ELEMENT_COUNT + 1> disabled = {}; // none while the list is empty
    ZelSvcElementId stop = ZEL_SVC_ELEMENT_NONE;

    [[nodiscard]] ZelSvcElementId current() const { return slots[static_cast<std::size_t>(depth) + 1]; }
    [[nodiscard]] ZelSvcElementId enclosing() const { return slots[static_cast<std::size_t>(depth)]; }
    [[nodiscard]] bool is_stop(ZelSvcElementId id) const { return stop == id && id != ZEL_SVC_ELEMENT_NONE; }

    bool push(ZelSvcElementId id) {
        if (depth >= ZEL_SVC_ELEMENT_MAX_DEPTH) return false;
        slots[static_cast<std::size_t>(++depth) + 1] = id;
        return true;
    }
    void pop() {
        if (depth > 0) --depth;
    }
};

// Hidden, so that the shared library reaches it directly.
extern __attribute__((visibility("hidden"))) ZelSvcElementState gZelSvcElementState;
