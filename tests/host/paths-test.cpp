// Whatever a package or a phone's own links hold, a path ends inside the root, and never in the state folder.

#include "support/bench-phone.h"

#include <array>
#include <cerrno>
#include <climits>
#include <cstdlib>
#include <fcntl.h>
#include <filesystem>
#include <fstream>
#include <gmock/gmock.h>
#include <sys/socket.h>
#include <sys/stat.h>
#include <sys/un.h>
#include <unistd.h>
#include <zel-platform.h>

namespace {

namespace fs = std::filesystem;

// Each test runs with the kernel's resolver and with the walk that stands in where a kernel has none.
struct Paths : zel_test::BenchPhone, ::testing::WithParamInterface<const char *> {
    Paths() { ::setenv("ZEL_HOST_RESOLVER", GetParam(), 1); }

    void SetUp() override {
        BenchPhone::SetUp();
        outside_ = zel_test::make_folder();
        std::ofstream(outside_ + "/secret") << "workstation";
        write("/opt/file", "phone");
    }

    void TearDown() override {
        zel_test::remove_folder(outside_);
        BenchPhone::TearDown();
    }

    void link(const std::string &target, const std::string &phone_path) {
        fs::create_symlink(target, root() + phone_path);
    }

    // The content that the phone sees, or "errno N".
    static std::string seen(const std::string &path, int flags = O_RDONLY) {
        const int fd = zel_platform_open(path.c_str(), flags, 0644);
        if (fd < 0) return "errno " + std::to_string(errno);
        std::array<char, 64> bytes{};
        const ssize_t size = ::read(fd, bytes.data(), bytes.size());
        ::close(fd);
        return size < 0 ? "unreadable" : std::string(bytes.data(), static_cast<std::size_t>(size));
    }

    static std::string none(int error) { return "errno " + std::to_string(error); }

    std::string outside_;
};

INSTANTIATE_TEST_SUITE_P(By, Paths, ::testing::Values("kernel", "walk"),
                         [](const auto &variant) { return std::string(variant.param); });

TEST_P(Paths, PlainOnesOpen) {
    EXPECT_EQ(seen("/opt/file"), "phone");
    EXPECT_EQ(seen("//opt/./system/..///file"), "phone");
    EXPECT_EQ(seen("/../../opt/file"), "phone");
}

TEST_P(Paths, AbsoluteLinkStartsAtTheRoot) {
    link("/opt/file", "/opt/link");
    link("/opt", "/csa/folder");
    EXPECT_EQ(seen("/opt/link"), "phone");
    EXPECT_EQ(seen("/csa/folder/file"), "phone");
}

TEST_P(Paths, AbsoluteLinkToTheWorkstationFindsNothing) {
    link(outside_ + "/secret", "/opt/link");
    link(outside_, "/csa/folder");
    EXPECT_EQ(seen("/opt/link"), none(ENOENT));
    EXPECT_EQ(seen("/csa/folder/secret"), none(ENOENT));
}

TEST_P(Paths, LinkThatClimbsStaysInTheRoot) {
    link("../../../../../.." + outside_ + "/secret", "/opt/link");
    link("../../../../../..", "/opt/up");
    EXPECT_EQ(seen("/opt/link"), none(ENOENT));
    EXPECT_EQ(seen("/opt/up/opt/file"), "phone");
    EXPECT_EQ(seen("/opt/up" + outside_ + "/secret"), none(ENOENT));
}

TEST_P(Paths, ChainOfLinksIsFollowed) {
    link("b", "/opt/a");
    link("/csa/c", "/opt/b");
    link("../opt/file", "/csa/c");
    EXPECT_EQ(seen("/opt/a"), "phone");
}

TEST_P(Paths, LoopOfLinksEnds) {
    link("/opt/b", "/opt/a");
    link("a", "/opt/b");
    link("self/self", "/opt/self");
    EXPECT_EQ(seen("/opt/a"), none(ELOOP));
    EXPECT_EQ(seen("/opt/a/file"), none(ELOOP));
    EXPECT_EQ(seen("/opt/self"), none(ELOOP));
}

TEST_P(Paths, LinksIntoTheWorkstationsProcFindNothing) {
    link("/proc/self/root" + outside_ + "/secret", "/opt/a");
    link("/proc/self/cwd", "/opt/b");
    link("/proc/self/fd/0", "/opt/c");
    EXPECT_EQ(seen("/opt/a"), none(ENOENT));
    EXPECT_EQ(seen("/opt/b"), none(ENOENT));
    EXPECT_EQ(seen("/opt/c"), none(ENOENT));
}

TEST_P(Paths, FileIsNoFolder) {
    EXPECT_EQ(seen("/opt/file/x"), none(ENOTDIR));
    EXPECT_EQ(seen("/opt/file/"), none(ENOTDIR));
    EXPECT_EQ(seen("/opt/file/../file"), none(ENOTDIR));
    EXPECT_EQ(seen("/opt/file", O_RDONLY | O_DIRECTORY), none(ENOTDIR));
}

TEST_P(Paths, RelativeAndEmptyOnesAreRefused) {
    EXPECT_EQ(seen("opt/file"), none(EINVAL));
    EXPECT_EQ(seen(""), none(ENOENT));
    EXPECT_LT(zel_platform_open(nullptr, O_RDONLY, 0), 0);
}

TEST_P(Paths, StateFolderDoesNotExist) {
    EXPECT_EQ(seen("/.platform/phone"), none(ENOENT));
    EXPECT_EQ(seen("/opt/../.platform/phone"), none(ENOENT));
    EXPECT_EQ(seen("//./.platform/../opt/file"), none(ENOENT));
    EXPECT_EQ(seen("/.platform", O_RDONLY | O_DIRECTORY), none(ENOENT));
}

TEST_P(Paths, StateFolderDoesNotExistThroughLinks) {
    link("/.platform", "/opt/a");
    link("../.platform/phone", "/opt/b");
    link("/", "/opt/root");
    link(root() + "/.platform", "/opt/c");
    EXPECT_EQ(seen("/opt/a/phone"), none(ENOENT));
    EXPECT_EQ(seen("/opt/b"), none(ENOENT));
    EXPECT_EQ(seen("/opt/root/.platform/phone"), none(ENOENT));
    EXPECT_EQ(seen("/opt/c/phone"), none(ENOENT));
}

TEST_P(Paths, StateFolderCannotBeMade) {
    link("/.platform/new", "/opt/a");
    link("/.platform", "/opt/b");
    std::array<char, ZEL_PLATFORM_NAME_MAX> name{};
    EXPECT_EQ(seen("/.platform", O_WRONLY | O_CREAT), none(ENOENT));
    EXPECT_EQ(seen("/.platform/new", O_WRONLY | O_CREAT), none(ENOENT));
    EXPECT_EQ(seen("/opt/a", O_WRONLY | O_CREAT), none(ENOENT));
    EXPECT_LT(zel_platform_open_parent("/.platform", name.data()), 0);
    EXPECT_EQ(errno, ENOENT);
    EXPECT_LT(zel_platform_open_parent("/opt/../.platform", name.data()), 0);
    EXPECT_LT(zel_platform_open_parent("/.platform/new", name.data()), 0);
    EXPECT_LT(zel_platform_open_parent("/opt/b/new", name.data()), 0);
    EXPECT_FALSE(fs::exists(root() + "/.platform/new"));
}

TEST_P(Paths, CreatingThroughADanglingLinkStaysInside) {
    link("/csa/made", "/opt/inside");
    link(outside_ + "/made", "/opt/outside");
    EXPECT_EQ(seen("/opt/inside", O_RDWR | O_CREAT), "");
    EXPECT_TRUE(exists("/csa/made"));
    EXPECT_EQ(seen("/opt/outside", O_RDWR | O_CREAT), none(ENOENT));
    EXPECT_FALSE(fs::exists(outside_ + "/made"));
}

TEST_P(Paths, ExclusiveCreationRefusesWhatIsThere) {
    link("/csa/made", "/opt/link");
    EXPECT_EQ(seen("/opt/file", O_WRONLY | O_CREAT | O_EXCL), none(EEXIST));
    EXPECT_EQ(seen("/opt/link", O_WRONLY | O_CREAT | O_EXCL), none(EEXIST));
    EXPECT_FALSE(exists("/csa/made"));
}

TEST_P(Paths, UnfollowedLinkIsRefused) {
    link("/opt/file", "/opt/link");
    EXPECT_EQ(seen("/opt/link", O_RDONLY | O_NOFOLLOW), none(ELOOP));
}

TEST_P(Paths, SpecialFilesAreRefusedWithoutBlocking) {
    ASSERT_EQ(::mkfifo((root() + "/opt/fifo").c_str(), 0666), 0);
    const int server = ::socket(AF_UNIX, SOCK_STREAM, 0);
    sockaddr_un address{};
    address.sun_family = AF_UNIX;
    (root() + "/opt/socket").copy(address.sun_path, sizeof address.sun_path - 1);
    ASSERT_EQ(::bind(server, reinterpret_cast<sockaddr *>(&address), sizeof address), 0);
    for (const int flags : {O_RDONLY, O_WRONLY, O_RDWR, O_WRONLY | O_CREAT, O_WRONLY | O_CREAT | O_TRUNC}) {
        EXPECT_EQ(seen("/opt/fifo", flags), none(EINVAL));
        EXPECT_EQ(seen("/opt/socket", flags), none(EINVAL));
    }
    ::close(server);
}

TEST_P(Paths, DeviceIsRefused) {
    // Where this user may not make device nodes, a link to the workstation's must find nothing either.
    const bool made = ::mknod((root() + "/opt/null").c_str(), S_IFCHR | 0666, 0x103) == 0;
    link("/dev/null", "/opt/link");
    EXPECT_EQ(seen("/opt/null"), none(made ? EINVAL : ENOENT));
    EXPECT_EQ(seen("/opt/link"), none(ENOENT));
}

TEST_P(Paths, ParentIsTheFolderOfTheLastName) {
    link("/opt", "/csa/folder");
    std::array<char, ZEL_PLATFORM_NAME_MAX> name{};
    const int folder = zel_platform_open_parent("/csa/folder/new", name.data());
    ASSERT_GE(folder, 0);
    EXPECT_STREQ(name.data(), "new");
    EXPECT_EQ(::mkdirat(folder, name.data(), 0755), 0);
    EXPECT_TRUE(exists("/opt/new"));
    ::close(folder);
}

TEST_P(Paths, ParentNeedsAPlainName) {
    std::array<char, ZEL_PLATFORM_NAME_MAX> name{};
    for (const char *path : {"/", "/opt/.", "/opt/..", "/.", "/..", "opt", ""}) {
        EXPECT_LT(zel_platform_open_parent(path, name.data()), 0) << path;
        EXPECT_EQ(errno, EINVAL) << path;
    }
    EXPECT_LT(zel_platform_open_parent(("/opt/" + std::string(256, 'n')).c_str(), name.data()), 0);
    EXPECT_EQ(errno, ENAMETOOLONG);
    const int folder = zel_platform_open_parent(("/opt/" + std::string(255, 'n')).c_str(), name.data());
    EXPECT_GE(folder, 0);
    ::close(folder);
}

TEST_P(Paths, ParentsFileIsNoFolder) {
    std::array<char, ZEL_PLATFORM_NAME_MAX> name{};
    EXPECT_LT(zel_platform_open_parent("/opt/file/x", name.data()), 0);
    EXPECT_EQ(errno, ENOTDIR);
    EXPECT_LT(zel_platform_open_parent("/opt/none/x", name.data()), 0);
    EXPECT_EQ(errno, ENOENT);
}

TEST_P(Paths, ListingOfTheRootLeavesTheStateFolderOut) {
    link("/opt", "/alias");
    const int fd = zel_platform_open("/", O_RDONLY | O_DIRECTORY, 0);
    ASSERT_GE(fd, 0);
    std::vector<std::string> names;
    for (const auto &entry : fs::directory_iterator("/proc/self/fd/" + std::to_string(fd)))
        names.push_back(entry.path().filename());
    ::close(fd);
    EXPECT_THAT(names, ::testing::UnorderedElementsAre("alias", "csa", "opt", "run", "tmp", "usr"));
}

TEST_P(Paths, LongOnesAreRefused) {
    const std::string path = "/opt/" + std::string(PATH_MAX, 'x');
    EXPECT_EQ(seen(path), none(ENAMETOOLONG));
    EXPECT_EQ(seen("/opt/" + std::string(300, 'x'), O_WRONLY | O_CREAT), none(ENAMETOOLONG));
}

TEST_P(Paths, CreatedFileTakesItsModeLessTheUmask) {
    ::umask(022);
    const int fd = zel_platform_open("/opt/new", O_WRONLY | O_CREAT, 0666);
    ASSERT_GE(fd, 0);
    struct stat status {};
    EXPECT_EQ(::fstat(fd, &status), 0);
    EXPECT_EQ(status.st_mode & 07777U, 0644U);
    EXPECT_EQ(::fcntl(fd, F_GETFD) & FD_CLOEXEC, FD_CLOEXEC);
    ::close(fd);
}

} // namespace
