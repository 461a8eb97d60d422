#include "base/zel-svc-file.h"

#include "support/files-phone.h"

#include <csignal>
#include <ctime>
#include <sys/resource.h>
#include <sys/stat.h>
#include <unistd.h>

namespace {

using zel_test::Attributes;
using zel_test::FilesPhone;

class FileCopy : public FilesPhone {};

TEST_F(FileCopy, HoldsEveryByteOfItsSource) {
    std::string bytes;
    for (int i = 0; i < 100'000; ++i)
        bytes += static_cast<char>(i * 7 % 256);
    write("/opt/t/source", bytes);
    EXPECT_EQ(__zel_svc_config_copy_file("/opt/t/source", "/opt/t/target"), 1);
    EXPECT_EQ(read("/opt/t/target"), bytes);
    EXPECT_EQ(read("/opt/t/source"), bytes);
}

TEST_F(FileCopy, OfAnEmptyFileIsEmpty) {
    write("/opt/t/source", "");
    EXPECT_EQ(__zel_svc_config_copy_file("/opt/t/source", "/opt/t/target"), 1);
    EXPECT_EQ(read("/opt/t/target"), "");
}

TEST_F(FileCopy, ReplacesALongerFile) {
    write("/opt/t/source", "short");
    write("/opt/t/target", "a much longer text");
    EXPECT_EQ(__zel_svc_config_copy_file("/opt/t/source", "/opt/t/target"), 1);
    EXPECT_EQ(read("/opt/t/target"), "short");
}

TEST_F(FileCopy, TakesModeOwnerAndLabelOfItsSource) {
    write("/opt/t/source", "x", 0600);
    write("/opt/t/target", "y", 0640);
    give("/opt/t/source", {.mode = 0711, .uid = 301, .gid = 302, .label = "of-the-source"});
    give("/opt/t/target", {.mode = 0640, .uid = 1, .gid = 2, .label = "of-the-target"});
    EXPECT_EQ(__zel_svc_config_copy_file("/opt/t/source", "/opt/t/target"), 1);
    EXPECT_EQ(attributes("/opt/t/target"),
              (Attributes{.mode = 0711, .uid = 301, .gid = 302, .label = "of-the-source"}));
}

TEST_F(FileCopy, KeepsAReadOnlyAndASetIdModeWithItsLabel) {
    write("/opt/t/source", "x", 0600);
    give("/opt/t/source", {.mode = 04555, .uid = 301, .gid = 302, .label = "of-the-source"});
    EXPECT_EQ(__zel_svc_config_copy_file("/opt/t/source", "/opt/t/target"), 1);
    EXPECT_EQ(attributes("/opt/t/target"),
              (Attributes{.mode = 04555, .uid = 301, .gid = 302, .label = "of-the-source"}));
}

TEST_F(FileCopy, WithoutALabelLeavesTheTargetsAlone) {
    write("/opt/t/source", "x", 0644);
    write("/opt/t/target", "y", 0644);
    __zel_svc_config_set_file_attr("/opt/t/target", -1, -1, -1, "of-the-target");
    EXPECT_EQ(__zel_svc_config_copy_file("/opt/t/source", "/opt/t/target"), 1);
    EXPECT_EQ(attributes("/opt/t/target").label, "of-the-target");
}

TEST_F(FileCopy, IsMadeThoughOwnerAndLabelAreRefused) {
    write("/opt/t/source", "x", 0640);
    fail("zel_platform_get_owner");
    fail("smack_lgetlabel");
    EXPECT_EQ(__zel_svc_config_copy_file("/opt/t/source", "/opt/t/target"), 1);
    EXPECT_EQ(read("/opt/t/target"), "x");
    EXPECT_EQ(attributes("/opt/t/target").mode, 0640);
}

// 1388534401 is 2014-01-01 00:00:01 UTC.
TEST_F(FileCopy, CarriesTheFixedLocalTime) {
    write("/opt/t/source", "x");
    for (const auto &[zone, seconds] : {std::pair{"UTC0", 1388534401L}, {"XYZ-9", 1388534401L - 9 * 3600}}) {
        ::setenv("TZ", zone, 1);
        ::tzset();
        EXPECT_EQ(__zel_svc_config_copy_file("/opt/t/source", "/opt/t/target"), 1);
        const struct stat status = status_of("/opt/t/target");
        EXPECT_EQ(status.st_mtim.tv_sec, seconds) << zone;
        EXPECT_EQ(status.st_atim.tv_sec, seconds) << zone;
        EXPECT_EQ(status.st_mtim.tv_nsec, 0) << zone;
    }
}

TEST_F(FileCopy, OntoItselfIsRefusedAndChangesNothing) {
    write("/opt/t/file", "content", 0640);
    const struct stat before = status_of("/opt/t/file");
    EXPECT_EQ(__zel_svc_config_copy_file("/opt/t/file", "/opt/t/file"), 0);
    EXPECT_EQ(read("/opt/t/file"), "content");
    EXPECT_EQ(status_of("/opt/t/file").st_mtim.tv_sec, before.st_mtim.tv_sec);
    EXPECT_EQ(status_of("/opt/t/file").st_mtim.tv_nsec, before.st_mtim.tv_nsec);
}

TEST_F(FileCopy, OntoAnotherNameOfItselfIsRefusedAndChangesNothing) {
    write("/opt/t/file", "content");
    link_to("/opt/t/file", "/opt/t/link");
    ASSERT_EQ(::link(on_disk("/opt/t/file").c_str(), on_disk("/opt/t/hard").c_str()), 0);
    EXPECT_EQ(__zel_svc_config_copy_file("/opt/t/file", "/opt/t/link"), 0);
    EXPECT_EQ(__zel_svc_config_copy_file("/opt/t/file", "/opt/t/hard"), 0);
    EXPECT_EQ(__zel_svc_config_copy_file("/opt/t/link", "/opt/t/../t/file"), 0);
    EXPECT_EQ(read("/opt/t/file"), "content");
}

TEST_F(FileCopy, OfAMissingSourceLeavesTheTarget) {
    write("/opt/t/target", "kept");
    EXPECT_EQ(__zel_svc_config_copy_file("/opt/t/none", "/opt/t/target"), 0);
    EXPECT_EQ(__zel_svc_config_copy_file("/opt/t/none", "/opt/t/new"), 0);
    EXPECT_EQ(read("/opt/t/target"), "kept");
    EXPECT_FALSE(exists("/opt/t/new"));
}

TEST_F(FileCopy, OfAFolderLeavesTheTarget) {
    write("/opt/t/folder/file", "x");
    write("/opt/t/target", "kept");
    EXPECT_EQ(__zel_svc_config_copy_file("/opt/t/folder", "/opt/t/target"), 0);
    EXPECT_EQ(read("/opt/t/target"), "kept");
}

TEST_F(FileCopy, OfAFifoEndsAndLeavesTheTarget) {
    write("/opt/t/target", "kept");
    ASSERT_EQ(::mkfifo(on_disk("/opt/t/fifo").c_str(), 0644), 0);
    EXPECT_EQ(__zel_svc_config_copy_file("/opt/t/fifo", "/opt/t/target"), 0);
    EXPECT_EQ(__zel_svc_config_copy_file("/opt/t/target", "/opt/t/fifo"), 0);
    EXPECT_EQ(read("/opt/t/target"), "kept");
}

TEST_F(FileCopy, NeedsTheFolderOfItsTarget) {
    write("/opt/t/source", "x");
    EXPECT_EQ(__zel_svc_config_copy_file("/opt/t/source", "/opt/none/target"), 0);
    EXPECT_EQ(__zel_svc_config_copy_file("/opt/t/source", "/opt/t"), 0);
    EXPECT_FALSE(exists("/opt/none"));
}

TEST_F(FileCopy, OfALinkIsTheFileThatItNames) {
    write("/opt/t/file", "content", 0640);
    give("/opt/t/file", {.mode = 0640, .uid = 301, .gid = 302, .label = "of-the-file"});
    link_to("/opt/t/file", "/opt/t/link");
    link_to("link", "/opt/t/link-to-link");
    EXPECT_EQ(__zel_svc_config_copy_file("/opt/t/link-to-link", "/opt/t/target"), 1);
    EXPECT_TRUE(S_ISREG(status_of("/opt/t/target").st_mode));
    EXPECT_EQ(read("/opt/t/target"), "content");
    EXPECT_EQ(attributes("/opt/t/target"), (Attributes{.mode = 0640, .uid = 301, .gid = 302, .label = "of-the-file"}));
}

TEST_F(FileCopy, ThroughALinkWritesTheFileThatItNames) {
    write("/opt/t/source", "new");
    write("/opt/t/far/file", "old");
    link_to("/opt/t/far/file", "/opt/t/link");
    link_to("far/fresh", "/opt/t/dangling");
    EXPECT_EQ(__zel_svc_config_copy_file("/opt/t/source", "/opt/t/link"), 1);
    EXPECT_EQ(__zel_svc_config_copy_file("/opt/t/source", "/opt/t/dangling"), 1);
    EXPECT_EQ(read("/opt/t/far/file"), "new");
    EXPECT_EQ(read("/opt/t/far/fresh"), "new");
    EXPECT_TRUE(S_ISLNK(status_of("/opt/t/link").st_mode));
    EXPECT_TRUE(S_ISLNK(status_of("/opt/t/dangling").st_mode));
}

TEST_F(FileCopy, EndsOnALoopOfLinks) {
    write("/opt/t/source", "x");
    link_to("/opt/t/b", "/opt/t/a");
    link_to("/opt/t/a", "/opt/t/b");
    EXPECT_EQ(__zel_svc_config_copy_file("/opt/t/a", "/opt/t/target"), 0);
    EXPECT_EQ(__zel_svc_config_copy_file("/opt/t/source", "/opt/t/a"), 0);
    EXPECT_FALSE(exists("/opt/t/target"));
}

TEST_F(FileCopy, OfNothingIsRefused) {
    write("/opt/t/source", "x");
    EXPECT_EQ(__zel_svc_config_copy_file(nullptr, "/opt/t/target"), 0);
    EXPECT_EQ(__zel_svc_config_copy_file("/opt/t/source", nullptr), 0);
}

TEST_F(FileCopy, FailsWhenEitherSideDoesNotOpen) {
    write("/opt/t/source", "x");
    write("/opt/t/target", "kept");
    fail("zel_platform_open", "/opt/t/target");
    EXPECT_EQ(__zel_svc_config_copy_file("/opt/t/source", "/opt/t/target"), 0);
    EXPECT_EQ(read("/opt/t/target"), "kept");
    fail("zel_platform_open", "/opt/t/source");
    EXPECT_EQ(__zel_svc_config_copy_file("/opt/t/source", "/opt/t/new"), 0);
    EXPECT_FALSE(exists("/opt/t/new"));
}

// A file size limit stands for the full disk: the write that crosses it fails.
class FullDisk : public FilesPhone {
  protected:
    void SetUp() override {
        FilesPhone::SetUp();
        write("/opt/t/source", std::string(3 << 20, 'x'));
        std::signal(SIGXFSZ, SIG_IGN);
        const rlimit limit = {.rlim_cur = 2 << 20, .rlim_max = RLIM_INFINITY};
        ASSERT_EQ(::setrlimit(RLIMIT_FSIZE, &limit), 0);
    }
};

TEST_F(FullDisk, LeavesNoPartOfACopy) {
    EXPECT_EQ(__zel_svc_config_copy_file("/opt/t/source", "/opt/t/target"), 0);
    EXPECT_FALSE(exists("/opt/t/target"));
}

TEST_F(FullDisk, LeavesNoPartOfACopyBehindALink) {
    write("/opt/t/far/file", "");
    link_to("/opt/t/far/fresh", "/opt/t/link");
    EXPECT_EQ(__zel_svc_config_copy_file("/opt/t/source", "/opt/t/link"), 0);
    EXPECT_FALSE(exists("/opt/t/far/fresh"));
    EXPECT_TRUE(S_ISLNK(status_of("/opt/t/link").st_mode));
}

TEST_F(FullDisk, DoesNotRemoveATargetThatWasThere) {
    write("/opt/t/target", "old");
    EXPECT_EQ(__zel_svc_config_copy_file("/opt/t/source", "/opt/t/target"), 0);
    EXPECT_TRUE(exists("/opt/t/target"));
}

} // namespace
