#include "base/zel-svc-time-lap.h"

#include "support/files-phone.h"

namespace {

using zel_test::FilesPhone;

constexpr const char *kPath = "/opt/system/zel-default/output/zel-time-lap.log";

class TimeLap : public FilesPhone {};

TEST_F(TimeLap, LogHasTheAttributesOfLogs) {
    __zel_svc_config_time_lap_end(ZEL_TIME_LAP_USR);
    EXPECT_EQ(attributes(kPath), (zel_test::Attributes{.mode = 0644, .uid = 200, .gid = 5000, .label = "*"}));
}

TEST_F(TimeLap, IsLostWhenTheLogDoesNotOpen) {
    fail("zel_platform_now");
    fail("zel_platform_open", kPath, 1, 1);
    __zel_svc_config_time_lap_end(ZEL_TIME_LAP_USR);
    EXPECT_FALSE(exists(kPath));
    __zel_svc_config_time_lap_end(ZEL_TIME_LAP_APP);
    EXPECT_EQ(read(kPath), "Time lap (App) : 0.0 sec\n");
}

TEST_F(TimeLap, IgnoresWhatIsNoSlot) {
    for (const int slot : {15, 16, 1 << 30, -1, -(1 << 30)}) {
        zel_svc_time_lap_begin(slot);
        __zel_svc_config_time_lap_end(slot);
    }
    EXPECT_FALSE(exists(kPath));
}

TEST_F(TimeLap, WithoutAClockIsEmpty) {
    fail("zel_platform_now");
    zel_svc_time_lap_begin(ZEL_TIME_LAP_USR);
    __zel_svc_config_time_lap_end(ZEL_TIME_LAP_USR);
    EXPECT_EQ(read(kPath), "Time lap (Usr) : 0.0 sec\n");
}

TEST_F(TimeLap, StartDeletesTheLogAndSaysSo) {
    write(kPath, "old\n");
    __zel_svc_config_time_lap_start();
    EXPECT_FALSE(exists(kPath));
    __zel_svc_config_time_lap_start();
    const std::vector<std::string> log = system_log();
    ASSERT_EQ(log.size(), 2U);
    EXPECT_THAT(log[0], ::testing::MatchesRegex("zel-svc-time-lap\\.cpp: __zel_svc_config_time_lap_start\\([0-9]+\\) > "
                                                "remove\\(ZelTimeLap\\)=0 run\\.\n"));
    EXPECT_THAT(log[1], ::testing::EndsWith(" > remove(ZelTimeLap)=-1 run.\n"));
}

} // namespace
