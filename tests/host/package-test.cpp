// A package is somebody else's: nothing in it reaches out of it, and nothing in it is ever executed.

#include "support/bench-phone.h"

#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <gmock/gmock.h>
#include <sys/stat.h>
#include <zel-platform.h>

namespace {

namespace fs = std::filesystem;
using nlohmann::json;

struct Package : zel_test::BenchPhone {
    void SetUp() override {
        BenchPhone::SetUp();
        folder = zel_test::make_folder();
        put("SW_Configuration.xml", "header");
        put("mps/ZEL/Customer/XFV/customer.xml", "spec");
    }

    void TearDown() override {
        zel_test::remove_folder(folder);
        BenchPhone::TearDown();
    }

    void put(const std::string &name, const std::string &bytes) const {
        fs::create_directories(fs::path(folder + "/" + name).parent_path());
        std::ofstream(folder + "/" + name) << bytes;
    }

    int try_package(const std::string &source, json &answer) {
        zel_host_phone *phone = zel_host_open(root().c_str(), nullptr);
        char *text = nullptr;
        const int result = zel_host_call(phone, "package", json{{"folder", source}}.dump().c_str(), &text);
        answer = json::parse(text);
        zel_host_free(text);
        zel_host_close(phone);
        return result;
    }

    std::string folder;
};

TEST_F(Package, IsCopiedIntoItsPlace) {
    EXPECT_EQ(call("package", {{"folder", folder}}),
              json({{"files", 2}, {"folders", 4}, {"links", 0}, {"skipped", 0}}));
    EXPECT_EQ(read("/opt/system/zel/SW_Configuration.xml"), "header");
    EXPECT_EQ(read("/opt/system/zel/mps/ZEL/Customer/XFV/customer.xml"), "spec");
}

TEST_F(Package, ReplacesTheOldOneWhole) {
    write("/opt/system/zel/old", "old");
    call("package", {{"folder", folder}});
    EXPECT_FALSE(exists("/opt/system/zel/old"));
}

TEST_F(Package, KeepsPermissionsButNoSetIdBits) {
    ASSERT_EQ(::chmod((folder + "/SW_Configuration.xml").c_str(), 04640), 0);
    call("package", {{"folder", folder}});
    EXPECT_EQ(call("stat", {{"path", "/opt/system/zel/SW_Configuration.xml"}}).at("mode"), "0640");
}

TEST_F(Package, LinksAreCopiedAsLinksAndSpecialFilesLeftOut) {
    put("../" + fs::path(folder).filename().string() + "-secret", "workstation");
    fs::create_symlink(folder + "-secret", folder + "/link");
    fs::create_directory_symlink("/etc", folder + "/etc");
    ASSERT_EQ(::mkfifo((folder + "/fifo").c_str(), 0666), 0);
    const json copied = call("package", {{"folder", folder}});
    fs::remove(folder + "-secret");
    EXPECT_EQ(copied.at("links"), 2);
    EXPECT_EQ(copied.at("skipped"), 1);
    EXPECT_FALSE(exists("/opt/system/zel/fifo"));
    EXPECT_TRUE(fs::is_symlink(root() + "/opt/system/zel/link"));
    EXPECT_LT(zel_platform_open("/opt/system/zel/etc/passwd", 0, 0), 0);
}

TEST_F(Package, LinkInItsPlaceIsReplacedAndNotFollowed) {
    fs::remove_all(root() + "/opt/system/zel");
    fs::create_directory_symlink("/opt/usr", root() + "/opt/system/zel");
    call("package", {{"folder", folder}});
    EXPECT_TRUE(exists("/opt/usr/media"));
    EXPECT_FALSE(fs::is_symlink(root() + "/opt/system/zel"));
    EXPECT_EQ(read("/opt/system/zel/SW_Configuration.xml"), "header");
}

TEST_F(Package, FailedOneLeavesTheOld) {
    call("package", {{"folder", folder}});
    json answer;
    EXPECT_EQ(try_package(folder + "/none", answer), 1);
    EXPECT_EQ(try_package(root(), answer), 1);
    EXPECT_EQ(try_package(root() + "/opt/system/zel", answer), 1);
    EXPECT_EQ(try_package(fs::path(root()).parent_path().string(), answer), 1);
    EXPECT_EQ(read("/opt/system/zel/SW_Configuration.xml"), "header");
}

TEST_F(Package, ProgramsInItAreNeverRun) {
    const std::string mark = folder + "/ran";
    const std::string script = "#!/bin/sh\ntouch " + mark + "\n";
    write("/usr/bin/pkgcmd", script, 0755);
    write("/usr/bin/other", script, 0755);
    write("/opt/list", "[zel packages]\nname_001 = com.example.notes\n");
    EXPECT_EQ(zel_platform_command("/usr/bin/pkgcmd -S /opt/list -p /opt/result"), 0);
    EXPECT_EQ(zel_platform_command("/usr/bin/other"), 32512);
    EXPECT_EQ(zel_platform_command("touch "), 32512);
    EXPECT_EQ(zel_platform_command("/bin/sh -c true"), 32512);
    EXPECT_EQ(zel_platform_command(("/usr/bin/pkg; touch " + mark).c_str()), 32512);
    EXPECT_EQ(zel_platform_command(("/usr/bin/pkg ; touch " + mark + " `touch " + mark + "`").c_str()), 1 << 8);
    EXPECT_EQ(zel_platform_command(""), 32512);
    EXPECT_FALSE(fs::exists(mark));
}

TEST_F(Package, ComesWithANewPhone) {
    const std::string other = zel_test::make_folder();
    char *answer = nullptr;
    const json arguments{{"root", other}, {"package", folder}, {"product-code", "SM-Q7N0ZKXFV"}, {"sims", 2}};
    EXPECT_EQ(zel_host_call(nullptr, "create", arguments.dump().c_str(), &answer), 0) << answer;
    zel_host_free(answer);
    EXPECT_TRUE(fs::exists(other + "/opt/system/zel/SW_Configuration.xml"));
    std::string code;
    std::ifstream(other + "/csa/imei/prodcode.dat") >> code;
    EXPECT_EQ(code, "SM-Q7N0ZKXFV");
    zel_test::remove_folder(other);
}

TEST_F(Package, StaysWhenThePhoneIsReset) {
    call("package", {{"folder", folder}});
    write("/csa/imei/prodcode.dat", "CODE");
    write("/opt/usr/media/Images/a.png", "picture");
    set_string("db/x", "1");
    fail("vconf_set_int");
    call("clock", {{"stop", "1000"}});
    call("reset");
    EXPECT_EQ(read("/opt/system/zel/SW_Configuration.xml"), "header");
    EXPECT_EQ(read("/csa/imei/prodcode.dat"), "CODE");
    EXPECT_FALSE(exists("/opt/usr/media/Images/a.png"));
    EXPECT_TRUE(exists("/opt/usr/media/Images"));
    EXPECT_TRUE(exists("/opt/dbspace/.dnet.db"));
    EXPECT_EQ(get_string("db/x"), std::nullopt);
    EXPECT_EQ(get_int("memory/telephony/sim_slot_count"), 1);
    EXPECT_TRUE(call("fault-list").at("faults").empty());
    EXPECT_EQ(call("clock").at("mode"), "runs");
    EXPECT_EQ(call("tool-list").at("tools").size(), 3U);
}

} // namespace
