#include "base/zel-svc-file.h"

#include "support/files-phone.h"

#include <fcntl.h>
#include <sys/stat.h>
#include <sys/wait.h>
#include <unistd.h>

namespace {

using zel_test::Attributes;
using zel_test::FilesPhone;

TEST(NamePart, IsWhatFollowsTheLastSlashBehindTheFirstCharacter) {
    EXPECT_EQ(zel_svc_file_name_part("a/b/c.png"), "c.png");
    EXPECT_EQ(zel_svc_file_name_part("/a/b.png"), "b.png");
    EXPECT_EQ(zel_svc_file_name_part("a/"), "");
    EXPECT_EQ(zel_svc_file_name_part("//x"), "x");
}

TEST(NamePart, OfAPathWithoutSuchASlashIsTheWholePath) {
    EXPECT_EQ(zel_svc_file_name_part("/abc"), "/abc");
    EXPECT_EQ(zel_svc_file_name_part("abc"), "abc");
    EXPECT_EQ(zel_svc_file_name_part("/"), "/");
    EXPECT_EQ(zel_svc_file_name_part(""), "");
}

class File : public FilesPhone {};

TEST_F(File, ExistsWhenItOpensForReading) {
    write("/opt/t/file", "x");
    EXPECT_EQ(__zel_svc_config_file_exists("/opt/t/file"), 1);
    EXPECT_EQ(__zel_svc_config_file_exists("/opt/t/none"), 0);
    EXPECT_EQ(__zel_svc_config_file_exists("/opt/none/file"), 0);
    EXPECT_EQ(__zel_svc_config_file_exists(""), 0);
    EXPECT_EQ(__zel_svc_config_file_exists(nullptr), 0);
}

TEST_F(File, AFolderExistsToo) {
    write("/opt/t/file", "x");
    EXPECT_EQ(__zel_svc_config_file_exists("/opt/t"), 1);
}

TEST_F(File, AFifoDoesNotExistAndDoesNotBlock) {
    write("/opt/t/file", "x");
    ASSERT_EQ(::mkfifo(on_disk("/opt/t/fifo").c_str(), 0644), 0);
    EXPECT_EQ(__zel_svc_config_file_exists("/opt/t/fifo"), 0);
}

TEST_F(File, ThatDoesNotOpenDoesNotExist) {
    write("/opt/t/file", "x");
    fail("zel_platform_open", "/opt/t/file");
    EXPECT_EQ(__zel_svc_config_file_exists("/opt/t/file"), 0);
}

TEST_F(File, GetsModeOwnerAndLabel) {
    write("/opt/t/file", "x", 0600);
    __zel_svc_config_set_file_attr("/opt/t/file", 0751, 123, 456, "some-label");
    EXPECT_EQ(attributes("/opt/t/file"), (Attributes{.mode = 0751, .uid = 123, .gid = 456, .label = "some-label"}));
}

TEST_F(File, AFolderGetsModeOwnerAndLabel) {
    write("/opt/t/folder/file", "x", 0600);
    __zel_svc_config_set_file_attr("/opt/t/folder", 0750, 123, 456, "some-label");
    EXPECT_EQ(attributes("/opt/t/folder"), (Attributes{.mode = 0750, .uid = 123, .gid = 456, .label = "some-label"}));
}

TEST_F(File, KeepsItsModeWhenTheNewOneIsNegative) {
    write("/opt/t/file", "x", 0640);
    __zel_svc_config_set_file_attr("/opt/t/file", -1, 123, 456, nullptr);
    EXPECT_EQ(attributes("/opt/t/file"), (Attributes{.mode = 0640, .uid = 123, .gid = 456, .label = ""}));
}

TEST_F(File, KeepsItsOwnerWhenEitherIdIsNegative) {
    write("/opt/t/file", "x", 0640);
    __zel_svc_config_set_file_attr("/opt/t/file", 0640, 123, 456, nullptr);
    __zel_svc_config_set_file_attr("/opt/t/file", -1, -1, 9, nullptr);
    __zel_svc_config_set_file_attr("/opt/t/file", -1, 9, -1, nullptr);
    EXPECT_EQ(attributes("/opt/t/file"), (Attributes{.mode = 0640, .uid = 123, .gid = 456, .label = ""}));
}

TEST_F(File, KeepsItsLabelWhenNoneIsGiven) {
    write("/opt/t/file", "x", 0640);
    __zel_svc_config_set_file_attr("/opt/t/file", -1, -1, -1, "kept");
    __zel_svc_config_set_file_attr("/opt/t/file", 0644, 200, 5000, nullptr);
    EXPECT_EQ(attributes("/opt/t/file"), (Attributes{.mode = 0644, .uid = 200, .gid = 5000, .label = "kept"}));
}

TEST_F(File, GetsItsModeAndLabelWhenTheOwnerIsRefused) {
    write("/opt/t/file", "x", 0600);
    fail("zel_platform_set_owner");
    __zel_svc_config_set_file_attr("/opt/t/file", 0644, 200, 5000, "*");
    EXPECT_EQ(attributes("/opt/t/file").mode, 0644);
    EXPECT_EQ(attributes("/opt/t/file").label, "*");
    EXPECT_NE(attributes("/opt/t/file").uid, 200);
}

TEST_F(File, OutputFilesShareTheirAttributes) {
    write("/opt/t/file", "x", 0600);
    zel_svc_file_set_output_attr("/opt/t/file", "zel-manager");
    EXPECT_EQ(attributes("/opt/t/file"), (Attributes{.mode = 0644, .uid = 200, .gid = 5000, .label = "zel-manager"}));
}

TEST_F(File, AttributesOfAMissingFileAreNobodys) {
    __zel_svc_config_set_file_attr("/opt/t/none", 0644, 200, 5000, "*");
    __zel_svc_config_set_file_attr(nullptr, 0644, 200, 5000, "*");
    EXPECT_FALSE(exists("/opt/t/none"));
}

TEST_F(File, RemovalTellsWhetherItWasThere) {
    write("/opt/t/file", "x");
    EXPECT_EQ(zel_svc_file_remove("/opt/t/file"), 0);
    EXPECT_FALSE(exists("/opt/t/file"));
    EXPECT_EQ(zel_svc_file_remove("/opt/t/file"), -1);
    EXPECT_EQ(zel_svc_file_remove("/opt/t"), -1) << "a folder is no file";
    EXPECT_EQ(zel_svc_file_remove(nullptr), -1);
}

TEST_F(File, RemovalOfALinkLeavesWhatItNames) {
    write("/opt/t/file", "x");
    link_to("/opt/t/file", "/opt/t/link");
    EXPECT_EQ(zel_svc_file_remove("/opt/t/link"), 0);
    EXPECT_TRUE(exists("/opt/t/file"));
}

TEST_F(File, DescriptorsCloseWithTheirOwner) {
    write("/opt/t/file", "x");
    zel_svc_file_open("/opt/t/file", O_RDONLY); // the phone opens its own files at its first call
    const int before = open_descriptors();
    {
        ZelSvcFd one = zel_svc_file_open("/opt/t/file", O_RDONLY);
        ZelSvcFd other = zel_svc_file_open("/opt/t/file", O_RDONLY);
        one = std::move(other);
        EXPECT_TRUE(one);
        EXPECT_EQ(open_descriptors(), before + 1);
    }
    EXPECT_EQ(open_descriptors(), before);
}

TEST_F(File, ReadingEndsAtTheEndOfTheFile) {
    write("/opt/t/file", "four");
    const ZelSvcFd file = zel_svc_file_open("/opt/t/file", O_RDONLY);
    char bytes[10] = {};
    EXPECT_EQ(zel_svc_file_read_all(file.get(), bytes, sizeof bytes), 4U);
    EXPECT_STREQ(bytes, "four");
    EXPECT_EQ(zel_svc_file_read_all(-1, bytes, sizeof bytes), 0U);
}

TEST_F(File, WritingToNowhereFails) {
    EXPECT_FALSE(zel_svc_file_write_all(-1, "x"));
    EXPECT_TRUE(zel_svc_file_write_all(-1, ""));
}

} // namespace
