#include "base/zel-svc-fs-status.h"

#include "base/zel-svc-file.h"
#include "base/zel-svc-ini.h"
#include "support/files-phone.h"

#include <unistd.h>

namespace {

using zel_test::Attributes;
using zel_test::FilesPhone;

constexpr const char *kConfig = "/opt/system/zel-default/output/zel-fs-status-config.ini";
constexpr const char *kVerify = "/opt/system/zel-default/output/zel-fs-status-verify.ini";

constexpr std::pair<const char *, const char *> kMedia[] = {
    {"wallpaper", "/opt/usr/share/settings/Wallpapers"},
    {"ringtone", "/opt/usr/share/settings/Ringtones"},
    {"alerttone", "/opt/usr/share/settings/Alerts"},
    {"alarmtone", "/opt/usr/share/settings/Alarms"},
    {"image", "/opt/usr/media/Images"},
    {"sound", "/opt/usr/media/Sounds"},
    {"video", "/opt/usr/media/Videos"},
    {"others", "/opt/usr/media/Downloads/Others"},
    {"camera", "/opt/usr/media/DCIM"},
    {"screenshot", "/opt/usr/media/Screenshots"},
};

class FsStatus : public FilesPhone {
  protected:
    static std::string value(const char *path, const std::string &key) {
        const ZelSvcIni ini = ZelSvcIni::load(path);
        const char *text = ini.text("media:" + key);
        return text ? text : "(absent)";
    }
};

TEST_F(FsStatus, CountsEachFolderUnderItsOwnWord) {
    std::size_t files = 0;
    for (const auto &[word, folder] : kMedia) {
        ++files;
        for (std::size_t i = 0; i < files; ++i)
            write(std::string{folder} + "/file" + std::to_string(i), std::string(100 * files, 'x'));
    }
    __zel_svc_config_fs_status_write(1);
    files = 0;
    for (const auto &[word, folder] : kMedia) {
        ++files;
        EXPECT_EQ(value(kConfig, std::string{word} + "_count"), std::to_string(files)) << word;
        EXPECT_EQ(value(kConfig, std::string{word} + "_size"), std::to_string(files * files * 100)) << word;
    }
}

TEST_F(FsStatus, CountsSubfoldersOnceAndWhatIsInThem) {
    write("/opt/usr/media/Images/a", "12345");
    write("/opt/usr/media/Images/sub/b", "123");
    write("/opt/usr/media/Images/sub/deep/c", "1");
    const auto folders =
        status_of("/opt/usr/media/Images/sub").st_size + status_of("/opt/usr/media/Images/sub/deep").st_size;
    __zel_svc_config_fs_status_write(1);
    EXPECT_EQ(value(kConfig, "image_count"), "5");
    EXPECT_EQ(value(kConfig, "image_size"), std::to_string(9 + folders));
}

TEST_F(FsStatus, CountsALinkAsItselfAndDoesNotFollowIt) {
    write("/opt/t/big", std::string(1000, 'x'));
    add_folder("/opt/usr/media/Images");
    link_to("/opt/t", "/opt/usr/media/Images/to-folder");
    link_to("/opt/t/big", "/opt/usr/media/Images/to-file");
    link_to("..", "/opt/usr/media/Images/loop");
    __zel_svc_config_fs_status_write(1);
    EXPECT_EQ(value(kConfig, "image_count"), "3");
    EXPECT_EQ(value(kConfig, "image_size"), "18") << "6, 10 and 2 bytes of link text";
}

TEST_F(FsStatus, OfMissingFoldersIsZero) {
    ASSERT_EQ(::rename(on_disk("/opt/usr").c_str(), on_disk("/opt/moved").c_str()), 0);
    __zel_svc_config_fs_status_write(1);
    for (const auto &[word, folder] : kMedia) {
        EXPECT_EQ(value(kConfig, std::string{word} + "_count"), "0");
        EXPECT_EQ(value(kConfig, std::string{word} + "_size"), "0");
    }
}

TEST_F(FsStatus, SizesAreUnsignedAndWrapAtFourGiB) {
    write("/opt/usr/media/Videos/long", "");
    write("/opt/usr/media/Sounds/long", "");
    if (::truncate(on_disk("/opt/usr/media/Videos/long").c_str(), 3'000'000'000) != 0 ||
        ::truncate(on_disk("/opt/usr/media/Sounds/long").c_str(), (std::int64_t{1} << 32) + 7) != 0)
        FAIL() << "the file system of temporary files takes no sparse file of 4 GiB";
    __zel_svc_config_fs_status_write(1);
    EXPECT_EQ(value(kConfig, "video_size"), "3000000000");
    EXPECT_EQ(value(kConfig, "sound_size"), "7");
}

TEST_F(FsStatus, OfAnInstallReplacesBothFiles) {
    write(kConfig, "[media]\nold = 1\n");
    write(kVerify, "[media]\nold = 1\n");
    __zel_svc_config_fs_status_write(1);
    EXPECT_EQ(value(kConfig, "old"), "(absent)");
    EXPECT_EQ(value(kConfig, "image_count"), "0");
    EXPECT_FALSE(exists(kVerify));
}

TEST_F(FsStatus, OfAVerificationLeavesTheInstalls) {
    for (const int mode : {0, 2, -1}) {
        write(kConfig, "[media]\nold = 1\n");
        write(kVerify, "[media]\nold = 1\n");
        __zel_svc_config_fs_status_write(mode);
        EXPECT_EQ(read(kConfig), "[media]\nold = 1\n");
        EXPECT_EQ(value(kVerify, "old"), "(absent)");
        EXPECT_EQ(value(kVerify, "screenshot_count"), "0");
    }
}

TEST_F(FsStatus, FilesHaveTheAttributesOfLogs) {
    __zel_svc_config_fs_status_write(1);
    __zel_svc_config_fs_status_write(0);
    const Attributes expected{.mode = 0644, .uid = 200, .gid = 5000, .label = "*"};
    EXPECT_EQ(attributes(kConfig), expected);
    EXPECT_EQ(attributes(kVerify), expected);
}

TEST_F(FsStatus, IsNotWrittenWhenItsFileDoesNotOpen) {
    fail("zel_platform_open", kConfig);
    __zel_svc_config_fs_status_write(1);
    EXPECT_FALSE(exists(kConfig));
}

TEST_F(FsStatus, EndsInAVeryDeepTree) {
    add_folder("/opt/usr/media/Images");
    add_deep_tree("/opt/usr/media/Images", 5000);
    __zel_svc_config_fs_status_write(1);
    EXPECT_EQ(value(kConfig, "image_count"), "5001") << "5000 folders and the file beside them";
    EXPECT_EQ(__zel_svc_config_clear_dir("/opt/usr/media/Images", 1), 1);
}

} // namespace
