#pragma once
// What an export writes, in the order of the document.

#include "spec/zel-svc-element-id.h"

#include <span>

struct ZelSvcEncodeStep {
    enum class Kind {
        Open,      // a container; its children stand between it and its Close
        Close,     // of the container opened last
        Leaf,      // an element with a value
        EmptyLeaf, // an element without one
    };

    Kind kind;
    ZelSvcElementId id;
    int (*times)(); // how often; null: once
};

std::span<const ZelSvcEncodeStep> zel_svc_encode_sequence();

// The step behind the Close of the container that a step opens.
std::size_t zel_svc_encode_behind(std::span<const ZelSvcEncodeStep> steps, std::size_t open);
