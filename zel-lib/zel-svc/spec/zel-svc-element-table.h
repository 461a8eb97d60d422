#pragma once
// The element table: what each tag of a spec file means, as data.

#include "spec/zel-svc-occurrence.h"

#include <array>
#include <cstdint>
#include <string_view>

struct ZelSvcElement {
    ZelSvcElementId id;      // the row's index
    std::string_view tag;    // compared exactly
    std::string_view parent; // empty: any
    Handler start;
    Handler value;
    Handler end;
    bool repeats;         // occurrences are counted
    std::int32_t enabled; // 0 makes the row inert
};

extern const std::array<ZelSvcElement, ZEL_SVC_ELEMENT_COUNT> kZelSvcElementTable;

// Called in this order when a parse begins, for what an earlier parse left open because its file ended too
// early. A null pointer ends the list.
using ZelSvcParseBegin = void (*)();
extern const ZelSvcParseBegin kZelSvcParseBegins[];
