// The phone's own platform calls, in a temporary folder of this machine.
#include "zel-platform.h"

#include <cerrno>
#include <cstdlib>
#include <ctime>
#include <fcntl.h>
#include <filesystem>
#include <gtest/gtest.h>
#include <string>
#include <sys/stat.h>
#include <unistd.h>

namespace {

class DevicePlatform : public ::testing::Test {
  protected:
    void SetUp() override {
        std::string name = ::testing::TempDir() + "zel-device-XXXXXX";
        ASSERT_NE(nullptr, mkdtemp(name.data())) << name;
        folder_ = name;
    }
    void TearDown() override { std::filesystem::remove_all(folder_); }

    std::string at(const std::string &name) const { return folder_ + "/" + name; }

    // The error of opening a name with some flags, 0 when it opened.
    int error_of(const std::string &name, int flags) const {
        const int fd = zel_platform_open(at(name).c_str(), flags, 0644);
        const int error = fd < 0 ? errno : 0;
        if (fd >= 0) close(fd);
        return error;
    }

  private:
    std::string folder_;
};

TEST_F(DevicePlatform, CreatesAFileWithItsModeAndOpensItAgain) {
    const mode_t mask = umask(022);
    EXPECT_EQ(0, error_of("file", O_WRONLY | O_CREAT));
    umask(mask);
    struct stat status {};
    ASSERT_EQ(0, stat(at("file").c_str(), &status));
    EXPECT_EQ(0644U, status.st_mode & 07777U);
    EXPECT_EQ(0, error_of("file", O_RDONLY));
    EXPECT_EQ(EEXIST, error_of("file", O_WRONLY | O_CREAT | O_EXCL));
}

TEST_F(DevicePlatform, AppendsAndTruncatesAnExistingFile) {
    const int first = zel_platform_open(at("file").c_str(), O_WRONLY | O_CREAT, 0644);
    ASSERT_EQ(3, write(first, "one", 3));
    close(first);
    const int second = zel_platform_open(at("file").c_str(), O_WRONLY | O_CREAT | O_APPEND, 0644);
    ASSERT_EQ(3, write(second, "two", 3));
    close(second);
    EXPECT_EQ(6U, std::filesystem::file_size(at("file")));
    EXPECT_EQ(0, error_of("file", O_WRONLY | O_CREAT | O_TRUNC));
    EXPECT_EQ(0U, std::filesystem::file_size(at("file")));
}

TEST_F(DevicePlatform, DescriptorsAreClosedOnExec) {
    const int fd = zel_platform_open(at("file").c_str(), O_RDWR | O_CREAT, 0644);
    EXPECT_EQ(FD_CLOEXEC, fcntl(fd, F_GETFD));
    close(fd);
    const int again = zel_platform_open(at("file").c_str(), O_RDWR, 0);
    EXPECT_EQ(FD_CLOEXEC, fcntl(again, F_GETFD));
    close(again);
}

TEST_F(DevicePlatform, AFifoIsRefusedWithoutWaitingForAWriter) {
    ASSERT_EQ(0, mkfifo(at("fifo").c_str(), 0644));
    EXPECT_EQ(EINVAL, error_of("fifo", O_RDONLY));
    EXPECT_EQ(EINVAL, error_of("fifo", O_WRONLY));
    EXPECT_EQ(EINVAL, error_of("fifo", O_RDWR | O_CREAT));
}

TEST_F(DevicePlatform, FoldersOpenOnlyAsFolders) {
    ASSERT_EQ(0, mkdir(at("folder").c_str(), 0755));
    EXPECT_EQ(0, error_of("folder", O_RDONLY | O_DIRECTORY));
    EXPECT_EQ(EISDIR, error_of("folder", O_RDONLY));
    EXPECT_EQ(0, error_of("file", O_WRONLY | O_CREAT));
    EXPECT_EQ(ENOTDIR, error_of("file", O_RDONLY | O_DIRECTORY));
}

TEST_F(DevicePlatform, ALinkIsFollowedUnlessToldOtherwise) {
    EXPECT_EQ(0, error_of("file", O_WRONLY | O_CREAT));
    ASSERT_EQ(0, symlink("file", at("link").c_str()));
    EXPECT_EQ(0, error_of("link", O_RDONLY));
    EXPECT_EQ(EINVAL, error_of("link", O_RDONLY | O_NOFOLLOW));
}

TEST_F(DevicePlatform, RelativeAndMissingPathsFail) {
    EXPECT_EQ(ENOENT, error_of("absent", O_RDONLY));
    EXPECT_EQ(-1, zel_platform_open("relative", O_RDONLY, 0));
    EXPECT_EQ(EINVAL, errno);
    EXPECT_EQ(-1, zel_platform_open(nullptr, O_RDONLY, 0));
    EXPECT_EQ(EINVAL, errno);
}

TEST_F(DevicePlatform, ParentGivesTheFolderAndTheLastName) {
    char name[ZEL_PLATFORM_NAME_MAX] = "";
    const int folder = zel_platform_open_parent(at("new").c_str(), name);
    ASSERT_LE(0, folder);
    EXPECT_STREQ("new", name);
    EXPECT_EQ(0, mkdirat(folder, name, 0755));
    close(folder);
    EXPECT_TRUE(std::filesystem::is_directory(at("new")));
}

TEST_F(DevicePlatform, ParentOfATopLevelNameIsTheRoot) {
    char name[ZEL_PLATFORM_NAME_MAX] = "";
    const int folder = zel_platform_open_parent("/csa", name);
    ASSERT_LE(0, folder);
    EXPECT_STREQ("csa", name);
    struct stat root {};
    struct stat opened {};
    ASSERT_EQ(0, stat("/", &root));
    ASSERT_EQ(0, fstat(folder, &opened));
    EXPECT_EQ(root.st_ino, opened.st_ino);
    close(folder);
}

TEST_F(DevicePlatform, ParentNeedsAPlainName) {
    char name[ZEL_PLATFORM_NAME_MAX] = "kept";
    for (const char *path : {"/", "/opt/", "/opt/.", "/opt/..", "opt", ""}) {
        EXPECT_EQ(-1, zel_platform_open_parent(path, name)) << path;
        EXPECT_EQ(EINVAL, errno) << path;
    }
    EXPECT_EQ(-1, zel_platform_open_parent(at(std::string(256, 'n')).c_str(), name));
    EXPECT_EQ(ENAMETOOLONG, errno);
    EXPECT_STREQ("kept", name);
}

TEST_F(DevicePlatform, OwnerOfAnOpenFileIsReadAndSet) {
    const int fd = zel_platform_open(at("file").c_str(), O_RDWR | O_CREAT, 0644);
    ASSERT_LE(0, fd);
    uid_t uid = 0;
    gid_t gid = 0;
    ASSERT_EQ(0, zel_platform_get_owner(fd, &uid, &gid));
    EXPECT_EQ(geteuid(), uid);
    EXPECT_EQ(0, zel_platform_set_owner(fd, uid, gid));
    close(fd);
    EXPECT_EQ(-1, zel_platform_get_owner(fd, &uid, &gid));
    EXPECT_EQ(-1, zel_platform_set_owner(fd, uid, gid));
}

TEST_F(DevicePlatform, ACommandGivesItsRawWaitStatus) {
    EXPECT_EQ(0, zel_platform_command("true"));
    EXPECT_EQ(0x300, zel_platform_command("exit 3"));
}

TEST_F(DevicePlatform, NowIsTheWallClock) {
    struct timeval now {};
    const std::time_t before = std::time(nullptr);
    ASSERT_EQ(0, zel_platform_now(&now));
    EXPECT_LE(before, now.tv_sec);
    EXPECT_LE(now.tv_sec, before + 60);
}

} // namespace
