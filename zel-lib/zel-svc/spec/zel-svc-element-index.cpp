#include "spec/zel-svc-element-index.h"

ZelSvcElementIndex::ZelSvcElementIndex() {
    for (std::size_t row = 0; row < kZelSvcElementTable.size(); ++row)
        if (tag_numbers_[row] == 0) add_tag(row);
    for (Row &row : rows_)
        row.parent = number_of_parent(kZelSvcElementTable[static_cast<std::size_t>(row.id)].parent);
}

// Gives a new tag its number and gathers its rows: this one and its namesakes further down.
void ZelSvcElementIndex::add_tag(std::size_t first_row) {
    const std::string_view tag = kZelSvcElementTable[first_row].tag;
    const std::size_t at = slot_of(tag);
    const ZelSvcTagKey key = zel_svc_tag_key(tag);
    slots_[at] = {key.first, key.last, static_cast<std::uint16_t>(tag.size()), row_count_, 0, ++tag_count_};
    for (std::size_t row = first_row; row < kZelSvcElementTable.size(); ++row) {
        if (kZelSvcElementTable[row].tag != tag) continue;
        tag_numbers_[row] = tag_count_;
        rows_[row_count_++].id = static_cast<std::int16_t>(row);
        ++slots_[at].row_count;
    }
}

ZelSvcTagNumber ZelSvcElementIndex::number_of_parent(std::string_view parent) const {
    if (parent.empty()) return kAnyParent;
    const Slot &slot = slots_[slot_of(parent)];
    return slot.length != 0 ? slot.number : kUnknownParent;
}
