#pragma once
// Where in the element table a tag stands: one probe into a hash table instead of a walk over all rows.

#include "spec/zel-svc-element-table.h"

#include <array>
#include <cstdint>
#include <cstring>
#include <string_view>

// A tag as integers: its first and its last eight bytes (or what a shorter one has), and its length. Two tags
// of at most 16 bytes are equal exactly when these are; longer ones have bytes in between.
struct ZelSvcTagKey {
    std::uint64_t first;
    std::uint64_t last;
    std::size_t length;
};

template <typename Word> Word zel_svc_load_word(const char *bytes) {
    Word word;
    std::memcpy(&word, bytes, sizeof word);
    return word;
}

inline ZelSvcTagKey zel_svc_tag_key(std::string_view tag) {
    const char *bytes = tag.data();
    const std::size_t length = tag.size();
    if (length >= 8)
        return {zel_svc_load_word<std::uint64_t>(bytes), zel_svc_load_word<std::uint64_t>(bytes + length - 8), length};
    if (length >= 4)
        return {zel_svc_load_word<std::uint32_t>(bytes), zel_svc_load_word<std::uint32_t>(bytes + length - 4), length};
    std::uint64_t word = 0;
    for (const char byte : tag)
        word = word << 8U | static_cast<unsigned char>(byte);
    return {word, 0, length};
}

// Distinct tags are numbered from 1 in the order of their first rows.
using ZelSvcTagNumber = std::uint16_t;

class ZelSvcElementIndex {
  public:
    ZelSvcElementIndex();

    // The first row of a tag that takes this place; `current` and `enclosing` are the two top elements.
    [[nodiscard]] ZelSvcElementId find(std::string_view tag, ZelSvcElementId current, ZelSvcElementId enclosing) const {
        const Slot &slot = slots_[slot_of(tag)];
        for (std::size_t at = slot.first_row; at < std::size_t{slot.first_row} + slot.row_count; ++at) {
            const Row &row = rows_[at];
            if (row.parent == kAnyParent) return ZelSvcElementId{row.id};
            // An end tag belongs to the element on top, which stands inside the one below it.
            const ZelSvcElementId outer = row.id == current ? enclosing : current;
            if (tag_numbers_[static_cast<std::size_t>(outer)] == row.parent) return ZelSvcElementId{row.id};
        }
        return ZEL_SVC_ELEMENT_NONE;
    }

  private:
    // A power of two and sparse, so that nearly every tag stands in its first slot.
    static constexpr unsigned kSlotBits = 10;
    static constexpr std::size_t kSlotCount = std::size_t{1} << kSlotBits;
    static constexpr ZelSvcTagNumber kAnyParent = 0;
    static constexpr ZelSvcTagNumber kUnknownParent = 0xFFFF;

    struct Slot {
        std::uint64_t first;
        std::uint64_t last;
        std::uint16_t length; // 0 in a free slot
        std::uint16_t first_row;
        std::uint16_t row_count;
        ZelSvcTagNumber number;
    };
    struct Row {
        std::int16_t id;
        ZelSvcTagNumber parent;
    };

    static std::size_t home(const ZelSvcTagKey &key) {
        const std::uint64_t mixed =
            (key.first ^ (key.last << 23U | key.last >> 41U) ^ key.length) * 0x9E3779B97F4A7C15U;
        return static_cast<std::size_t>(mixed >> (64U - kSlotBits));
    }

    [[nodiscard]] bool holds(const Slot &slot, const ZelSvcTagKey &key, std::string_view tag) const {
        if (slot.first != key.first || slot.last != key.last || slot.length != key.length) return false;
        return tag.size() <= 16 || kZelSvcElementTable[static_cast<std::size_t>(rows_[slot.first_row].id)].tag == tag;
    }

    // The slot of a tag, or the free one where it would stand.
    [[nodiscard]] std::size_t slot_of(std::string_view tag) const {
        const ZelSvcTagKey key = zel_svc_tag_key(tag);
        std::size_t at = home(key);
        while (slots_[at].length != 0 && !holds(slots_[at], key, tag))
            at = (at + 1) % kSlotCount;
        return at;
    }

    void add_tag(std::size_t first_row);
    [[nodiscard]] ZelSvcTagNumber number_of_parent(std::string_view parent) const;

    std::array<Slot, kSlotCount> slots_ = {};
    std::array<Row, ZEL_SVC_ELEMENT_COUNT> rows_ = {}; // the rows of one tag together, in their order
    // By element; that of no element is no row's parent.
    std::array<ZelSvcTagNumber, ZEL_SVC_ELEMENT_COUNT + 1> tag_numbers_ = {};
    std::uint16_t row_count_ = 0;
    ZelSvcTagNumber tag_count_ = 0;
};
