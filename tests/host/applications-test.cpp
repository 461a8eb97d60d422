// The package tools of a phone: applications in a list, and what the tools say about each.

#include "support/bench-phone.h"

#include <alarm-manager.h>
#include <cstdlib>
#include <isf-control.h>
#include <system-info.h>
#include <zel-platform.h>

namespace {

using nlohmann::json;

constexpr const char *kInstall = "/usr/bin/pkgcmd -S /opt/list.ini -p /opt/result.ini";

struct Applications : zel_test::BenchPhone {
    json application(const std::string &name) {
        const json list = call("app-list"); // the loop needs it to the end
        for (const json &one : list.at("applications"))
            if (one.at("name") == name) return one;
        return nullptr;
    }
};

TEST_F(Applications, OfAListAreInstalledAndTold) {
    write("/opt/list.ini",
          "[zel packages]\nname_001 = com.example.notes\ntype_001 = tpk\nname_002 = \"com.example.map\"\n"
          "type_002 = wgt\nname_004 = com.example.unreached\n");
    EXPECT_EQ(zel_platform_command(kInstall), 0);
    EXPECT_EQ(read("/opt/result.ini"), "[result]\ncount = 2\n"
                                       "description_001 = \"path=com.example.notes:op=install\"\n"
                                       "result_001 = \"success\"\n"
                                       "description_002 = \"path=com.example.map:op=install\"\n"
                                       "result_002 = \"success\"\n");
    EXPECT_EQ(application("com.example.notes").at("state"), "installed");
    EXPECT_EQ(application("com.example.map").at("type"), "wgt");
    EXPECT_EQ(application("com.example.unreached"), nullptr);
}

TEST_F(Applications, ThatAreRefusedAreToldSo) {
    write("/opt/list.ini", "[zel packages]\nname_001 = com.example.notes\n");
    call("app-refuse", {{"name", "com.example.notes"}, {"answer", "no space"}});
    EXPECT_EQ(zel_platform_command(kInstall), 0);
    EXPECT_NE(read("/opt/result.ini").find("result_001 = \"no space\"\n"), std::string::npos);
    EXPECT_EQ(application("com.example.notes").at("state"), "");
    EXPECT_EQ(zel_platform_command("/usr/bin/pkg -d com.example.notes"), 1 << 8);
    EXPECT_EQ(zel_platform_command("/usr/bin/rpm-backend -c path=com.example.notes:op=uninstall:removable=true"),
              1 << 8);
    call("app-refuse", {{"name", "com.example.notes"}});
    EXPECT_EQ(zel_platform_command("/usr/bin/pkg -d com.example.notes"), 0);
    EXPECT_EQ(application("com.example.notes").at("state"), "disabled");
}

TEST_F(Applications, ThatAreUninstalledLoseTheirFiles) {
    write("/opt/usr/apps/com.example.notes/bin/notes", "never run", 0755);
    write("/opt/usr/apps/com.example.map/bin/map", "never run", 0755);
    EXPECT_EQ(zel_platform_command("/usr/bin/rpm-backend -c path=com.example.notes:op=uninstall:removable=true"), 0);
    EXPECT_FALSE(exists("/opt/usr/apps/com.example.notes"));
    EXPECT_TRUE(exists("/opt/usr/apps/com.example.map/bin/map"));
    EXPECT_EQ(application("com.example.notes").at("state"), "removed");
}

TEST_F(Applications, NamesThatClimbReachNoFolder) {
    write("/opt/usr/file", "kept");
    for (const char *name : {"..", ".", "../..", "/opt/usr", ""})
        zel_platform_command(
            (std::string("/usr/bin/rpm-backend -c path=") + name + ":op=uninstall:removable=true").c_str());
    EXPECT_EQ(read("/opt/usr/file"), "kept");
    EXPECT_TRUE(exists("/opt/usr/apps"));
}

TEST_F(Applications, ListsThatDoNotLoadFailWithoutAResult) {
    EXPECT_EQ(zel_platform_command(kInstall), 1 << 8);
    EXPECT_FALSE(exists("/opt/result.ini"));
    EXPECT_EQ(zel_platform_command("/usr/bin/pkgcmd"), 1 << 8);
    EXPECT_EQ(zel_platform_command("/usr/bin/pkg -d"), 1 << 8);
    EXPECT_EQ(zel_platform_command("/usr/bin/rpm-backend -c com.example.notes"), 1 << 8);
    write("/opt/list.ini", "[zel packages]\nname_001 = com.example.notes\n");
    EXPECT_EQ(zel_platform_command("/usr/bin/pkgcmd -S /opt/list.ini -p /opt/none/result.ini"), 1 << 8);
}

TEST_F(Applications, AToolThatWasToldToFailDoesNothing) {
    write("/opt/list.ini", "[zel packages]\nname_001 = com.example.notes\n");
    call("tool-add", {{"path", "/usr/bin/pkgcmd"}, {"status", 7}, {"does", "install-list"}});
    EXPECT_EQ(zel_platform_command(kInstall), 7 << 8);
    EXPECT_FALSE(exists("/opt/result.ini"));
    EXPECT_TRUE(call("app-list").at("applications").empty());
}

TEST_F(Applications, ResetForgetsThem) {
    zel_platform_command("/usr/bin/pkg -d com.example.notes");
    call("reset");
    EXPECT_TRUE(call("app-list").at("applications").empty());
    EXPECT_EQ(zel_platform_command("/usr/bin/pkg -d com.example.notes"), 0);
}

struct PhoneServices : zel_test::BenchPhone {};

TEST_F(PhoneServices, KeyboardsAreRememberedApart) {
    EXPECT_EQ(isf_control_set_initial_ise_by_uuid("first"), 0);
    EXPECT_EQ(isf_control_set_active_ise_by_uuid("second"), 0);
    EXPECT_LT(isf_control_set_active_ise_by_uuid(""), 0);
    EXPECT_LT(isf_control_set_initial_ise_by_uuid(nullptr), 0);
    EXPECT_EQ(call("status").at("initial_keyboard"), "first");
    EXPECT_EQ(call("status").at("active_keyboard"), "second");
}

TEST_F(PhoneServices, TheTimeZoneIsRemembered) {
    EXPECT_EQ(alarmmgr_set_timezone("/usr/share/zoneinfo/Asia/Kolkata"), 0);
    EXPECT_LT(alarmmgr_set_timezone(""), 0);
    EXPECT_LT(alarmmgr_set_timezone(nullptr), 0);
    EXPECT_EQ(call("status").at("time_zone"), "/usr/share/zoneinfo/Asia/Kolkata");
}

TEST_F(PhoneServices, SystemInformationIsToldByItsKey) {
    char *text = nullptr;
    EXPECT_EQ(system_info_get_value_string(SYSTEM_INFO_MODEL, &text), 0);
    EXPECT_STREQ(text, "Q7N0");
    std::free(text);
    call("system-set", {{"name", "build-version"}, {"text", ""}});
    EXPECT_EQ(system_info_get_value_string(7, &text), 0);
    EXPECT_STREQ(text, "");
    std::free(text);
    text = nullptr;
    call("system-set", {{"name", "platform-version"}});
    EXPECT_LT(system_info_get_value_string(1, &text), 0);
    EXPECT_LT(system_info_get_value_string(2, &text), 0);
    EXPECT_LT(system_info_get_value_string(0, nullptr), 0);
    EXPECT_EQ(text, nullptr);
    EXPECT_EQ(call("system"), (json{{"model", "Q7N0"}, {"build-version", ""}, {"platform-version", nullptr}}));
    call("reset");
    EXPECT_EQ(call("system").at("platform-version"), "2.4.0");
}

} // namespace
