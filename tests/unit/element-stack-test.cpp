// Open elements, occurrence counts, enabled rows and the stop element.

#include "spec/zel-svc-element-dispatcher.h"
#include "spec/zel-svc-element-stack.h"

#include <gtest/gtest.h>

TEST(OpenElements, TopIsTheLastPushed) {
    EXPECT_EQ(zel_svc_element_get_current_id(), 304);
    EXPECT_EQ(zel_svc_element_push(ZEL_SVC_ELEMENT_SETTINGS), 1);
    EXPECT_EQ(zel_svc_element_push(ZEL_SVC_ELEMENT_MAIN), 1);
    EXPECT_EQ(zel_svc_element_get_current_id(), ZEL_SVC_ELEMENT_MAIN);
    EXPECT_EQ(zel_svc_element_get_enclosing_id(), ZEL_SVC_ELEMENT_SETTINGS);
    EXPECT_EQ(zel_svc_element_pop(), ZEL_SVC_ELEMENT_MAIN);
    EXPECT_EQ(zel_svc_element_get_enclosing_id(), 304);
    EXPECT_EQ(zel_svc_element_pop(), ZEL_SVC_ELEMENT_SETTINGS);
    EXPECT_EQ(zel_svc_element_pop(), 304);
    EXPECT_EQ(zel_svc_element_pop(), 304);
    EXPECT_EQ(zel_svc_element_push(ZEL_SVC_ELEMENT_GPS), 1);
    EXPECT_EQ(zel_svc_element_get_current_id(), ZEL_SVC_ELEMENT_GPS);
}

TEST(OpenElements, NoElementIsNotPushed) {
    EXPECT_EQ(zel_svc_element_push(ZEL_SVC_ELEMENT_NONE), 0);
    EXPECT_EQ(zel_svc_element_push(static_cast<ZelSvcElementId>(305)), 0);
    EXPECT_EQ(zel_svc_element_push(static_cast<ZelSvcElementId>(-1)), 0);
    EXPECT_EQ(zel_svc_element_get_current_id(), 304);
}

TEST(OpenElements, AreAtMostFifty) {
    for (int depth = 0; depth < 50; ++depth)
        EXPECT_EQ(zel_svc_element_push(ZEL_SVC_ELEMENT_MAIN), 1);
    EXPECT_EQ(zel_svc_element_push(ZEL_SVC_ELEMENT_GPS), 0);
    EXPECT_EQ(zel_svc_element_get_current_id(), ZEL_SVC_ELEMENT_MAIN);
    for (int depth = 0; depth < 50; ++depth)
        EXPECT_EQ(zel_svc_element_pop(), ZEL_SVC_ELEMENT_MAIN);
    EXPECT_EQ(zel_svc_element_pop(), 304);
}

TEST(OccurrenceCounts, AreKeptByRow) {
    zel_svc_element_count_up(ZEL_SVC_ELEMENT_PROFILE);
    zel_svc_element_count_up(ZEL_SVC_ELEMENT_PROFILE);
    zel_svc_element_count_up(ZEL_SVC_ELEMENT_NONE);
    EXPECT_EQ(zel_svc_element_get_count(ZEL_SVC_ELEMENT_PROFILE), 2);
    EXPECT_EQ(zel_svc_element_get_count(ZEL_SVC_ELEMENT_BOOKMARK), 0);
    EXPECT_EQ(zel_svc_element_get_count(ZEL_SVC_ELEMENT_NONE), 0);
    EXPECT_EQ(zel_svc_element_get_count(static_cast<ZelSvcElementId>(-1)), 0);
}

TEST(ElementTableInit, ForgetsElementsAndCountsButNotTheFilter) {
    zel_svc_element_push(ZEL_SVC_ELEMENT_PROFILE);
    zel_svc_element_count_up(ZEL_SVC_ELEMENT_PROFILE);
    zel_svc_element_enable(ZEL_SVC_ELEMENT_GPS);
    zel_svc_element_set_stop(ZEL_SVC_ELEMENT_GPS);
    zel_svc_element_table_init();
    EXPECT_EQ(zel_svc_element_get_current_id(), 304);
    EXPECT_EQ(zel_svc_element_get_enclosing_id(), 304);
    EXPECT_EQ(zel_svc_element_get_count(ZEL_SVC_ELEMENT_PROFILE), 0);
    EXPECT_EQ(zel_svc_element_is_enabled(ZEL_SVC_ELEMENT_GPS), 1);
    EXPECT_EQ(zel_svc_element_is_enabled(ZEL_SVC_ELEMENT_PROFILE), 0);
    EXPECT_EQ(zel_svc_element_is_stop(ZEL_SVC_ELEMENT_GPS), 1);
}

TEST(EnabledRows, EmptyListEnablesEveryRow) {
    for (int row = 0; row < 304; ++row)
        EXPECT_EQ(zel_svc_element_is_enabled(static_cast<ZelSvcElementId>(row)), 1);
}

TEST(EnabledRows, ListEnablesItsRowsOnly) {
    EXPECT_EQ(zel_svc_element_enable(ZEL_SVC_ELEMENT_SECURITY), 1);
    EXPECT_EQ(zel_svc_element_enable(ZEL_SVC_ELEMENT_NETWORK_LOCK), 1);
    for (int row = 0; row < 304; ++row)
        EXPECT_EQ(zel_svc_element_is_enabled(static_cast<ZelSvcElementId>(row)), row == 21 || row == 23 ? 1 : 0);
    zel_svc_element_clear_enabled();
    EXPECT_EQ(zel_svc_element_is_enabled(ZEL_SVC_ELEMENT_GPS), 1);
    EXPECT_EQ(zel_svc_element_enable(ZEL_SVC_ELEMENT_GPS), 1);
    EXPECT_EQ(zel_svc_element_is_enabled(ZEL_SVC_ELEMENT_SECURITY), 0);
}

TEST(EnabledRows, AreAtMostFifty) {
    for (int row = 0; row < 50; ++row)
        EXPECT_EQ(zel_svc_element_enable(static_cast<ZelSvcElementId>(row)), 1);
    EXPECT_EQ(zel_svc_element_enable(ZEL_SVC_ELEMENT_GPS), 0);
    EXPECT_EQ(zel_svc_element_is_enabled(ZEL_SVC_ELEMENT_GPS), 0);
    EXPECT_EQ(zel_svc_element_is_enabled(static_cast<ZelSvcElementId>(49)), 1);
}

TEST(EnabledRows, ListOfNoElementEnablesNothing) {
    EXPECT_EQ(zel_svc_element_enable(ZEL_SVC_ELEMENT_NONE), 1);
    EXPECT_EQ(zel_svc_element_is_enabled(ZEL_SVC_ELEMENT_GPS), 0);
    EXPECT_EQ(zel_svc_element_is_enabled(ZEL_SVC_ELEMENT_NONE), 1);
}

TEST(StopElement, IsOneElementUntilItIsCleared) {
    EXPECT_EQ(zel_svc_element_is_stop(ZEL_SVC_ELEMENT_NETWORK), 0);
    EXPECT_EQ(zel_svc_element_is_stop(ZEL_SVC_ELEMENT_NONE), 0);
    zel_svc_element_set_stop(ZEL_SVC_ELEMENT_NETWORK);
    EXPECT_EQ(zel_svc_element_is_stop(ZEL_SVC_ELEMENT_NETWORK), 1);
    EXPECT_EQ(zel_svc_element_is_stop(ZEL_SVC_ELEMENT_GPS), 0);
    zel_svc_element_clear_enabled();
    EXPECT_EQ(zel_svc_element_is_stop(ZEL_SVC_ELEMENT_NETWORK), 0);
}
