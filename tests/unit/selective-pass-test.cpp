// The elements of every selective pass, against literal numbers.

#include "zel-svc-selective-pass.h"

#include "spec/zel-svc-element-stack.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <numeric>
#include <vector>

namespace {

using ::testing::ElementsAreArray;

std::vector<int> numbers(int first, int last) {
    std::vector<int> all(static_cast<std::size_t>(last - first + 1));
    std::iota(all.begin(), all.end(), first);
    return all;
}

std::vector<int> both(std::vector<int> first, const std::vector<int> &second) {
    first.insert(first.end(), second.begin(), second.end());
    return first;
}

std::vector<int> elements_of(ZelSvcPass pass) {
    std::vector<int> ids;
    for (const ZelSvcElementRange &range : zel_svc_selective_pass(pass).elements)
        ids = both(std::move(ids), numbers(range.first, range.last));
    return ids;
}

std::vector<int> enabled_elements() {
    std::vector<int> ids;
    for (int id = 0; id < 304; ++id)
        if (zel_svc_element_is_enabled(static_cast<ZelSvcElementId>(id)) != 0) ids.push_back(id);
    return ids;
}

void expect_pass(ZelSvcPass pass, const std::vector<int> &elements, int auto_flag, int group) {
    EXPECT_THAT(elements_of(pass), ElementsAreArray(elements));
    EXPECT_EQ(zel_svc_selective_pass(pass).auto_flag, auto_flag);
    EXPECT_EQ(zel_svc_selective_pass(pass).group, group);
}

} // namespace

TEST(SelectivePass, NetworkInfoLeavesTheSubsetCodeOut) {
    expect_pass(ZEL_SVC_PASS_NETWORK_INFO, {10, 13, 14, 15, 16, 18}, -1, -1);
}

TEST(SelectivePass, ConnectionsLeaveTheProtocolOut) {
    expect_pass(ZEL_SVC_PASS_CONNECTIONS, both(numbers(219, 244), numbers(246, 259)), 0, 13);
}

TEST(SelectivePass, Bookmark) { expect_pass(ZEL_SVC_PASS_BOOKMARK, numbers(205, 211), 3, 15); }
TEST(SelectivePass, VoiceMail) { expect_pass(ZEL_SVC_PASS_VOICE_MAIL, numbers(101, 104), 1, 8); }
TEST(SelectivePass, EmailAccount) { expect_pass(ZEL_SVC_PASS_EMAIL_ACCOUNT, numbers(162, 181), 2, 11); }
TEST(SelectivePass, WbAmr) { expect_pass(ZEL_SVC_PASS_WB_AMR, numbers(52, 55), 8, 3); }
TEST(SelectivePass, FastDormancy) { expect_pass(ZEL_SVC_PASS_FAST_DORMANCY, numbers(56, 62), 7, 14); }
TEST(SelectivePass, MaxPdp) { expect_pass(ZEL_SVC_PASS_MAX_PDP, numbers(47, 51), 9, 19); }

TEST(SelectivePass, ImsLeavesTheCountersOut) {
    expect_pass(ZEL_SVC_PASS_IMS, both({281, 283, 284, 285}, both(numbers(287, 299), {301, 302, 303})), -1, 21);
}

TEST(SelectivePass, AParseEnablesItsElementsAndNoOthers) {
    zel_svc_element_enable(ZEL_SVC_ELEMENT_GPS);
    zel_svc_element_set_stop(ZEL_SVC_ELEMENT_GPS);
    const ZelSvcElementRange ranges[] = {{ZEL_SVC_ELEMENT_CONNECTIONS, ZEL_SVC_ELEMENT_TRAFFIC_CLASS},
                                         {ZEL_SVC_ELEMENT_PROFILE_URL, ZEL_SVC_ELEMENT_DNS_IP_ADDR}};
    zel_svc_selective_parse(ranges, ZEL_SVC_PARSE_MODE_OPERATOR, "");
    EXPECT_THAT(enabled_elements(), ElementsAreArray(both(numbers(219, 244), numbers(246, 259))));
    EXPECT_EQ(zel_svc_element_is_stop(ZEL_SVC_ELEMENT_GPS), 0);
    EXPECT_EQ(geZelSvcParseMode, ZEL_SVC_PARSE_MODE_OPERATOR);
    EXPECT_EQ(geZelSvcParseAction, ZEL_SVC_PARSE_ACTION_INSTALL);
}

TEST(SelectivePass, TheAutoFlagsAreReadInHeaderMode) {
    zel_svc_selective_pass_read_auto_flags("");
    EXPECT_THAT(enabled_elements(), ElementsAreArray(numbers(34, 44)));
    EXPECT_EQ(geZelSvcParseMode, ZEL_SVC_PARSE_MODE_HEADER);
}

TEST(SelectivePass, APassRunsOnlyWhileItsFlagHasTheWantedValue) {
    const ZelSvcPassSequence wanted_1{.wanted_flag = 1, .mode = ZEL_SVC_PARSE_MODE_OPERATOR, .variant = 0, .path = {}};
    zel_svc_element_clear_enabled();
    zel_svc_element_enable(ZEL_SVC_ELEMENT_GPS);
    gbZelSvcNetworkAutoFlags[ZEL_SVC_AUTO_WB_AMR] = 0;
    zel_svc_selective_pass_run(ZEL_SVC_PASS_WB_AMR, wanted_1);
    EXPECT_THAT(enabled_elements(), ElementsAreArray({279}));
    gbZelSvcNetworkAutoFlags[ZEL_SVC_AUTO_WB_AMR] = 1;
    zel_svc_selective_pass_run(ZEL_SVC_PASS_WB_AMR, wanted_1);
    EXPECT_THAT(enabled_elements(), ElementsAreArray(numbers(52, 55)));
}
