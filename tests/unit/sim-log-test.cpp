#include "zel-svc-sim-auto-setting-log.h"

#include "support/bench-phone.h"

namespace {

constexpr const char *kLog = "/opt/system/zel-default/output/zel-sim-check.log";

using SimLog = zel_test::BenchPhone;

} // namespace

TEST(SimMessage, IsCutTo305Bytes) {
    const std::string text(400, 'a');
    EXPECT_EQ(zel_svc_sim_message("%s", text.c_str()).view(), std::string(305, 'a'));
    EXPECT_EQ(zel_svc_sim_message("%s", std::string(2000, 'a').c_str()).view(), std::string(305, 'a'));
}

TEST(SimMessage, IsCutAtAWholeCharacter) {
    const std::string text = std::string(304, 'a') + "\xC3\xA9";
    EXPECT_EQ(zel_svc_sim_message("%s", text.c_str()).view(), std::string(304, 'a'));
}

TEST(SimMessage, ShowsTheFirstThreeBytesOfAnMsin) {
    EXPECT_EQ(zel_svc_sim_msin_shown("1234567890"), "123");
    EXPECT_EQ(zel_svc_sim_msin_shown("123"), "123");
    EXPECT_EQ(zel_svc_sim_msin_shown("12"), "12");
    EXPECT_EQ(zel_svc_sim_msin_shown(""), "");
    EXPECT_EQ(zel_svc_sim_msin_shown("12\xC3\xA9"), "12");
}

TEST_F(SimLog, LinesAreAppended) {
    zel_svc_sim_log_append(kLog, zel_svc_sim_message("one"));
    zel_svc_sim_log_append(kLog, zel_svc_sim_message("%d", 2));
    EXPECT_EQ(read(kLog), "one\n2\n");
}

TEST_F(SimLog, ALogThatCannotBeOpenedIsPassedOver) {
    fail("zel_platform_open", kLog);
    zel_svc_sim_log_append(kLog, zel_svc_sim_message("one"));
    EXPECT_FALSE(exists(kLog));
    EXPECT_TRUE(system_log().empty());
}
