// What cannot be read of a product code that is open.

#include "base/zel-svc-file.h"
#include "support/bench-phone.h"
#include "zel-svc-configuration-wallpaper.h"

#include <fcntl.h>

namespace {

struct Handset : zel_test::BenchPhone {};

TEST_F(Handset, PlacesThatGiveNoBytesAreNotRead) {
    write("/csa/imei/prodcode.dat", "SM-Q7N0XZKABCD");
    const ZelSvcFd unreadable = zel_svc_file_open("/csa/imei/prodcode.dat", O_WRONLY);
    EXPECT_FALSE(zel_svc_wallpaper_read_handset(unreadable.get()).has_value());
    EXPECT_EQ(run_log(), "[Config][DefaultWallpaperByHWColor] Model name not read.\n"
                         "[Config][DefaultWallpaperByHWColor] Color code not read.\n");
}

TEST_F(Handset, IsItsModelAndColour) {
    write("/csa/imei/prodcode.dat", "SM-Q7N0XZKABCD");
    const ZelSvcFd file = zel_svc_file_open("/csa/imei/prodcode.dat", O_RDWR);
    const std::optional<ZelSvcHandset> handset = zel_svc_wallpaper_read_handset(file.get());
    ASSERT_TRUE(handset.has_value());
    EXPECT_EQ(handset->model.view(), "Q7N0");
    EXPECT_EQ(handset->colour.view(), "ZK");
}

} // namespace
