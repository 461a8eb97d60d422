#include "base/zel-svc-time-lap.h"

#include "support/files-phone.h"

#include <cinttypes>
#include <cstdio>

namespace {

using zel_test::FilesPhone;

constexpr const char *kPath = "/opt/system/zel-default/output/zel-time-lap.log";

class TimeLapClock : public FilesPhone {
  protected:
    // The phone's clock stands at a time in microseconds.
    void stand_at(std::int64_t us) {
        char seconds[40];
        std::snprintf(seconds, sizeof seconds, "%" PRId64 ".%06" PRId64, us / 1'000'000, us % 1'000'000);
        call("clock", {{"stop", seconds}});
    }

    void lap(int slot, std::int64_t from, std::int64_t to) {
        stand_at(from);
        zel_svc_time_lap_begin(slot);
        stand_at(to);
        __zel_svc_config_time_lap_end(slot);
    }
};

TEST_F(TimeLapClock, EverySlotHasItsLine) {
    for (int slot = 0; slot < 15; ++slot)
        lap(slot, 1'000'000'000'000'000, 1'000'000'000'000'000 + slot * 1'000'001);
    EXPECT_EQ(read(kPath), "Time lap (All on Config mode) : 0.0 sec\n"
                           "Time lap (All on FOTA mode) : 1.1 sec\n"
                           "Time lap (All on Normal booting) : 2.2 sec\n"
                           "Time lap (Spec) : 3.3 sec\n"
                           "Time lap (Spec/NetworkInfo) : 4.4 sec\n"
                           "Time lap (Spec/APN) : 5.5 sec\n"
                           "Time lap (Spec/Bookmark) : 6.6 sec\n"
                           "Time lap (Spec(SIM2)) : 7.7 sec\n"
                           "Time lap (Spec(SIM2)/APN) : 8.8 sec\n"
                           "Time lap (Preset) : 9.9 sec\n"
                           "Time lap (App) : 10.10 sec\n"
                           "Time lap (FS update) : 11.11 sec\n"
                           "Time lap (Usr) : 12.12 sec\n"
                           "Time lap (Keyboard) : 13.13 sec\n"
                           "Time lap (Collect) : 14.14 sec\n");
}

TEST_F(TimeLapClock, OverASecondBoundaryBorrowsNothing) {
    lap(ZEL_TIME_LAP_SPEC, 10'900'000, 12'800'000);
    EXPECT_EQ(read(kPath), "Time lap (Spec) : 2.4294867296 sec\n");
}

TEST_F(TimeLapClock, OfAClockThatWentBackIsUnsigned) {
    lap(ZEL_TIME_LAP_SPEC, 12'000'000, 11'000'001);
    EXPECT_EQ(read(kPath), "Time lap (Spec) : 4294967295.1 sec\n");
}

TEST_F(TimeLapClock, CanBeEndedTwice) {
    lap(ZEL_TIME_LAP_APP, 1'000'000, 2'000'000);
    stand_at(5'000'005);
    __zel_svc_config_time_lap_end(ZEL_TIME_LAP_APP);
    EXPECT_EQ(read(kPath), "Time lap (App) : 1.0 sec\nTime lap (App) : 4.5 sec\n");
}

} // namespace
