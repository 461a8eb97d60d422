// The rows of the element table and the look-up of a tag among them.

#include "spec/zel-svc-element-dispatcher.h"
#include "spec/zel-svc-element-stack.h"
#include "spec/zel-svc-element-table.h"
#include "unit/element-walk.h"

#include <gtest/gtest.h>
#include <set>
#include <string>

namespace {

using zel_test::kElementRows;
using zel_test::kNoRow;

ZelSvcElementId id_of(std::size_t row) { return static_cast<ZelSvcElementId>(row); }

// `enclosing` and, inside it, `current` are the open elements; kNoRow for none.
void open_elements(std::size_t enclosing, std::size_t current) {
    zel_svc_element_stack_reset();
    zel_svc_element_push(id_of(enclosing));
    zel_svc_element_push(id_of(current));
}

ZelSvcElementId find_inside(ZelSvcElementId enclosing, ZelSvcElementId current, const char *tag) {
    open_elements(static_cast<std::size_t>(enclosing), static_cast<std::size_t>(current));
    return zel_svc_element_find(tag);
}

// Whether the plain walk finds a tag outside any element.
bool is_found(std::string_view tag) { return zel_test::walk_rows(kElementRows, tag, kNoRow, kNoRow) != kNoRow; }

std::set<std::string_view> all_tags() {
    std::set<std::string_view> tags;
    for (const auto &row : kElementRows)
        tags.insert(row.tag);
    return tags;
}

} // namespace

TEST(ElementTable, RowsAreThoseOfTheVocabulary) {
    ASSERT_EQ(kZelSvcElementTable.size(), 304U);
    for (std::size_t row = 0; row < kElementRows.size(); ++row) {
        EXPECT_EQ(kZelSvcElementTable[row].id, id_of(row));
        EXPECT_EQ(kZelSvcElementTable[row].tag, kElementRows[row].tag) << row;
        EXPECT_EQ(kZelSvcElementTable[row].parent, kElementRows[row].parent) << row;
        EXPECT_EQ(kZelSvcElementTable[row].repeats, kElementRows[row].repeats) << row << kElementRows[row].tag;
    }
}

TEST(ElementTable, OnlyTheRootIsDisabled) {
    for (const ZelSvcElement &row : kZelSvcElementTable)
        EXPECT_EQ(row.enabled, row.tag == "SW-Configuration" ? 0 : 1) << row.tag;
}

TEST(ElementLookUp, EqualsAWalkOverTheRowsAtEveryPlace) {
    std::size_t cases = 0;
    for (const std::string_view tag : all_tags())
        for (std::size_t current = 0; current <= kNoRow; ++current) {
            // What is below the top matters only for the tag of the top itself; nothing is below nothing.
            const bool below_matters = current != kNoRow && kElementRows[current].tag == tag;
            for (std::size_t below = below_matters ? 0 : kNoRow; below <= kNoRow; ++below, ++cases) {
                open_elements(below, current);
                const auto expected = zel_test::walk_rows(kElementRows, tag, current, below);
                ASSERT_EQ(zel_svc_element_find(tag.data()), id_of(expected)) << tag << current << below;
            }
        }
    EXPECT_EQ(cases, 265U * 305U + 304U * 304U);
}

TEST(ElementLookUp, ElementBelowAnotherTagsTopDoesNotMatter) {
    for (std::size_t below = 0; below < kNoRow; ++below) {
        EXPECT_EQ(find_inside(id_of(below), ZEL_SVC_ELEMENT_MAX_PDP, "NetworkName"), 49);
        EXPECT_EQ(find_inside(id_of(below), ZEL_SVC_ELEMENT_GPS, "NetworkName"), ZEL_SVC_ELEMENT_NONE);
    }
}

TEST(ElementLookUp, NetworkNameBelongsToItsEnclosingElement) {
    EXPECT_EQ(find_inside(ZEL_SVC_ELEMENT_NONE, ZEL_SVC_ELEMENT_MAX_PDP, "NetworkName"), 49);
    EXPECT_EQ(find_inside(ZEL_SVC_ELEMENT_NONE, ZEL_SVC_ELEMENT_BOOKMARK, "NetworkName"), 207);
    EXPECT_EQ(find_inside(ZEL_SVC_ELEMENT_NONE, ZEL_SVC_ELEMENT_NONE, "NetworkName"), 304);
}

TEST(ElementLookUp, EndTagLooksBelowTheTop) {
    EXPECT_EQ(find_inside(ZEL_SVC_ELEMENT_INCOMING, id_of(171), "Port"), 171);
    EXPECT_EQ(find_inside(ZEL_SVC_ELEMENT_OUTGOING, id_of(177), "Port"), 177);
    EXPECT_EQ(find_inside(ZEL_SVC_ELEMENT_OUTGOING, id_of(171), "Port"), 304);
    EXPECT_EQ(find_inside(ZEL_SVC_ELEMENT_NONE, id_of(171), "Port"), 304);
}

TEST(ElementLookUp, CustomerDataWithoutTheListIsTheDocument) {
    EXPECT_EQ(find_inside(ZEL_SVC_ELEMENT_NONE, ZEL_SVC_ELEMENT_CUSTOMER_DATA_SET, "CustomerData"), 8);
    EXPECT_EQ(find_inside(ZEL_SVC_ELEMENT_NONE, ZEL_SVC_ELEMENT_NONE, "CustomerData"), 9);
}

TEST(ElementLookUp, TagsAreComparedExactly) {
    zel_svc_element_stack_reset();
    for (const std::string_view tag : all_tags()) {
        const std::string known{tag};
        for (const std::string &other : {known + "x", known.substr(1), known.substr(0, known.size() - 1), " " + known,
                                         std::string("x") + known.substr(1)})
            EXPECT_EQ(zel_svc_element_find(other.c_str()) == 304, !is_found(other)) << other;
    }
    EXPECT_EQ(zel_svc_element_find("gps"), 304);
    EXPECT_EQ(zel_svc_element_find(""), 304);
    EXPECT_EQ(zel_svc_element_find(nullptr), 304);
    EXPECT_EQ(zel_svc_element_find(std::string(5000, 'x').c_str()), 304);
    // Only the bytes in the middle differ.
    EXPECT_EQ(zel_svc_element_find("RoamingEnaXleStatus"), 304);
    EXPECT_EQ(zel_svc_element_find("Voice_Domain_XXXference_EUTRAN"), 304);
}
