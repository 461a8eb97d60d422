// Owner and label belong to the file: as attributes of it, and in a table where the file system has none.

#include "support/bench-phone.h"

#include <cerrno>
#include <cstdlib>
#include <fcntl.h>
#include <filesystem>
#include <security-server.h>
#include <smack.h>
#include <sys/stat.h>
#include <unistd.h>
#include <zel-platform.h>

namespace {

namespace fs = std::filesystem;

struct Attributes : zel_test::BenchPhone, ::testing::WithParamInterface<const char *> {
    Attributes() { ::setenv("ZEL_HOST_ATTRIBUTES", GetParam(), 1); }

    void SetUp() override {
        BenchPhone::SetUp();
        write("/opt/file", "x");
    }

    static std::string label_of(const char *path) {
        char *label = nullptr;
        if (smack_lgetlabel(path, &label) != 0) return label == nullptr ? "none" : "touched";
        std::string result = label;
        std::free(label);
        return result;
    }

    static bool give(const char *path, uid_t user, gid_t group) {
        const int fd = zel_platform_open(path, O_RDONLY, 0);
        const int result = zel_platform_set_owner(fd, user, group);
        ::close(fd);
        return result == 0;
    }

    static std::string owner_of(const char *path) {
        uid_t user = 0;
        gid_t group = 0;
        const int fd = zel_platform_open(path, O_RDONLY, 0);
        const int result = zel_platform_get_owner(fd, &user, &group);
        ::close(fd);
        return result == 0 ? std::to_string(user) + ":" + std::to_string(group) : "none";
    }
};

INSTANTIATE_TEST_SUITE_P(In, Attributes, ::testing::Values("file", "table"),
                         [](const auto &variant) { return std::string(variant.param); });

TEST_P(Attributes, LabelIsReadBack) {
    EXPECT_EQ(label_of("/opt/file"), "none");
    EXPECT_EQ(security_server_label_access("/opt/file", "*"), 0);
    EXPECT_EQ(label_of("/opt/file"), "*");
    EXPECT_EQ(security_server_label_access("/opt/file", "zel-manager"), 0);
    EXPECT_EQ(label_of("/opt/file"), "zel-manager");
    EXPECT_EQ(call("stat", {{"path", "/opt/file"}}).at("label"), "zel-manager");
}

TEST_P(Attributes, FolderHasALabelToo) {
    EXPECT_EQ(security_server_label_access("/opt", "*"), 0);
    EXPECT_EQ(label_of("/opt"), "*");
}

TEST_P(Attributes, LabelOfAMissingFileFails) {
    EXPECT_LT(security_server_label_access("/opt/none", "*"), 0);
    EXPECT_EQ(label_of("/opt/none"), "none");
    EXPECT_LT(security_server_label_access("/.platform/phone", "*"), 0);
    EXPECT_LT(security_server_label_access(nullptr, "*"), 0);
    EXPECT_LT(smack_lgetlabel("/opt/file", nullptr), 0);
}

TEST_P(Attributes, LabelIsThatOfTheLinkWhenAskedForTheLink) {
    fs::create_symlink("/opt/file", root() + "/opt/link");
    EXPECT_EQ(security_server_label_access("/opt/link", "*"), 0);
    EXPECT_EQ(label_of("/opt/file"), "*");
    EXPECT_EQ(label_of("/opt/link"), "none");
}

TEST_P(Attributes, OwnerIsReadBack) {
    ASSERT_TRUE(give("/opt/file", 200, 5000));
    EXPECT_EQ(owner_of("/opt/file"), "200:5000");
    const nlohmann::json shown = call("stat", {{"path", "/opt/file"}});
    EXPECT_EQ(shown.at("owner"), 200);
    EXPECT_EQ(shown.at("group"), 5000);
}

TEST_P(Attributes, OwnerIsTheRealOneBeforeItIsSet) {
    const std::string real = std::to_string(::geteuid()) + ":" + std::to_string(::getegid());
    EXPECT_EQ(owner_of("/opt/file"), real);
}

TEST_P(Attributes, RealOwnerChangesWhereAllowed) {
    ASSERT_TRUE(give("/opt/file", 200, 5000));
    struct stat status {};
    ASSERT_EQ(::stat((root() + "/opt/file").c_str(), &status), 0);
    EXPECT_EQ(status.st_uid, ::geteuid() == 0 ? 200U : ::geteuid());
}

TEST_P(Attributes, SurviveRenaming) {
    ASSERT_TRUE(give("/opt/file", 200, 5000));
    ASSERT_EQ(security_server_label_access("/opt/file", "*"), 0);
    fs::rename(root() + "/opt/file", root() + "/csa/moved");
    EXPECT_EQ(label_of("/csa/moved"), "*");
    EXPECT_EQ(owner_of("/csa/moved"), "200:5000");
    EXPECT_EQ(label_of("/opt/file"), "none");
}

TEST_P(Attributes, NewFileInTheSamePlaceHasNone) {
    ASSERT_TRUE(give("/opt/file", 200, 5000));
    ASSERT_EQ(security_server_label_access("/opt/file", "*"), 0);
    fs::remove(root() + "/opt/file");
    write("/opt/file", "y");
    EXPECT_EQ(label_of("/opt/file"), "none");
    EXPECT_EQ(owner_of("/opt/file"), std::to_string(::geteuid()) + ":" + std::to_string(::getegid()));
}

TEST_P(Attributes, OwnerOfABadDescriptorFails) {
    uid_t user = 7;
    gid_t group = 7;
    EXPECT_LT(zel_platform_set_owner(-1, 1, 1), 0);
    EXPECT_LT(zel_platform_get_owner(-1, &user, &group), 0);
    EXPECT_EQ(user, 7U);
    EXPECT_EQ(group, 7U);
}

} // namespace
