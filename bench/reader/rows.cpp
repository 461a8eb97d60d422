// The element table's rows without their handlers.

#include "spec/zel-svc-element-table.h"
#include "unit/element-rows.h"

namespace {

constexpr std::array<ZelSvcElement, ZEL_SVC_ELEMENT_COUNT> rows_without_handlers() {
    std::array<ZelSvcElement, ZEL_SVC_ELEMENT_COUNT> rows = {};
    for (std::size_t row = 0; row < rows.size(); ++row)
        rows[row] = {static_cast<ZelSvcElementId>(row),
                     zel_test::kElementRows[row].tag,
                     zel_test::kElementRows[row].parent,
                     nullptr,
                     nullptr,
                     nullptr,
                     zel_test::kElementRows[row].repeats,
                     row == ZEL_SVC_ELEMENT_SW_CONFIGURATION ? 0 : 1};
    return rows;
}

} // namespace

extern constexpr std::array<ZelSvcElement, ZEL_SVC_ELEMENT_COUNT> kZelSvcElementTable = rows_without_handlers();
extern constexpr ZelSvcParseBegin kZelSvcParseBegins[] = {nullptr};
