// What is a phone, and what never is. Each of these runs in a process of its own.

#include "support/bench-phone.h"

#include <cerrno>
#include <cstdlib>
#include <fcntl.h>
#include <filesystem>
#include <fstream>
#include <gmock/gmock.h>
#include <vconf.h>
#include <zel-platform.h>

namespace {

namespace fs = std::filesystem;
using nlohmann::json;

struct Roots : ::testing::Test {
    void SetUp() override { folder = zel_test::make_folder(); }
    void TearDown() override { zel_test::remove_folder(folder); }

    static int create(const std::string &root, std::string &answer) {
        char *text = nullptr;
        const int result = zel_host_call(nullptr, "create", json{{"root", root}}.dump().c_str(), &text);
        answer = text;
        zel_host_free(text);
        return result;
    }

    static int create(const std::string &root) {
        std::string ignored;
        return create(root, ignored);
    }

    static bool works_on(const char *root) {
        ::setenv("ZEL_ROOT", root, 1);
        return vconf_set_int("db/x", 1) == 0 && zel_platform_open("/", O_RDONLY | O_DIRECTORY, 0) >= 0;
    }

    std::string folder;
};

TEST_F(Roots, WithoutOneEveryCallFailsAndOneMessageSaysSo) {
    ::unsetenv("ZEL_ROOT");
    ::testing::internal::CaptureStderr();
    EXPECT_LT(vconf_set_int("db/x", 1), 0);
    EXPECT_EQ(vconf_get_str("db/x"), nullptr);
    EXPECT_LT(zel_platform_open("/", O_RDONLY, 0), 0);
    EXPECT_LT(zel_platform_reboot(1), 0);
    EXPECT_LT(zel_platform_command("/usr/bin/pkg"), 0);
    zel_platform_sync();
    EXPECT_EQ(::testing::internal::GetCapturedStderr(), "zel: no phone: $ZEL_ROOT names no folder\n");
}

TEST_F(Roots, UnmarkedFolderIsNone) {
    EXPECT_FALSE(works_on(folder.c_str()));
    EXPECT_TRUE(fs::is_empty(folder));
}

TEST_F(Roots, MachinesRootIsNone) {
    EXPECT_FALSE(works_on("/"));
    EXPECT_FALSE(works_on("/usr/.."));
    EXPECT_EQ(create("/"), 1);
}

TEST_F(Roots, HomeFolderIsNoneEvenMarked) {
    ::setenv("HOME", folder.c_str(), 1);
    EXPECT_EQ(create(folder), 1);
    EXPECT_TRUE(fs::is_empty(folder));
    fs::create_directory(folder + "/.platform");
    std::ofstream(folder + "/.platform/phone") << "mark";
    EXPECT_FALSE(works_on(folder.c_str()));
}

TEST_F(Roots, LinkedStateFolderIsNone) {
    ASSERT_EQ(create(folder + "/a"), 0);
    fs::create_directory(folder + "/b");
    fs::create_directory_symlink(folder + "/a/.platform", folder + "/b/.platform");
    EXPECT_FALSE(works_on((folder + "/b").c_str()));
}

TEST_F(Roots, CreationRefusesANonEmptyFolder) {
    std::ofstream(folder + "/mine") << "text";
    std::string answer;
    EXPECT_EQ(create(folder, answer), 1);
    EXPECT_THAT(answer, ::testing::HasSubstr("is not empty"));
    EXPECT_FALSE(fs::exists(folder + "/.platform"));
}

TEST_F(Roots, CreationMakesTheFolder) {
    EXPECT_EQ(create(folder + "/new"), 0);
    EXPECT_TRUE(works_on((folder + "/new").c_str()));
    EXPECT_EQ(create(folder + "/no/parent"), 1);
}

TEST_F(Roots, SecondInOneProcessIsRefused) {
    ASSERT_EQ(create(folder + "/a"), 0);
    ASSERT_EQ(create(folder + "/b"), 0);
    ASSERT_TRUE(works_on((folder + "/a").c_str()));
    EXPECT_FALSE(works_on((folder + "/b").c_str()));
    EXPECT_TRUE(works_on((folder + "/b/../a").c_str()));
}

TEST_F(Roots, AnyNumberCanBeLookedInto) {
    ASSERT_EQ(create(folder + "/a"), 0);
    ASSERT_EQ(create(folder + "/b"), 0);
    zel_host_phone *a = zel_host_open((folder + "/a").c_str(), nullptr);
    zel_host_phone *b = zel_host_open((folder + "/b").c_str(), nullptr);
    ASSERT_NE(a, nullptr);
    ASSERT_NE(b, nullptr);
    EXPECT_EQ(zel_host_call(a, "vconf-set", R"({"key": "db/x", "value": "1"})", nullptr), 0);
    EXPECT_EQ(zel_host_call(b, "vconf-get", R"({"key": "db/x"})", nullptr), 1);
    zel_host_close(a);
    zel_host_close(b);
}

TEST_F(Roots, OpeningNoneSaysWhy) {
    char *error = nullptr;
    EXPECT_EQ(zel_host_open(folder.c_str(), &error), nullptr);
    EXPECT_THAT(error, ::testing::HasSubstr("is no phone"));
    zel_host_free(error);
    EXPECT_EQ(zel_host_open(nullptr, nullptr), nullptr);
}

TEST_F(Roots, BusAddressIsNeverTheMachines) {
    EXPECT_STREQ(std::getenv("DBUS_SYSTEM_BUS_ADDRESS"), "unix:path=/dev/null/no-phone");
    ASSERT_EQ(create(folder + "/a b"), 0);
    ASSERT_TRUE(works_on((folder + "/a b").c_str()));
    EXPECT_EQ(std::string(std::getenv("DBUS_SYSTEM_BUS_ADDRESS")),
              "unix:path=" + folder + "/a%20b/run/dbus/system_bus_socket");
}

} // namespace
