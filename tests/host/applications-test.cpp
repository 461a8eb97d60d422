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
    int result_of(const std::string &verb, const json &arguments) {
        zel_host_phone *phone = zel_host_open(root().c_str(), nullptr);
        const int result = zel_host_call(phone, verb.c_str(), arguments.dump().c_str(), nullptr);
        zel_host_close(phone);
        return result;
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

// Whatever stands in a list, its results load again, a line for each application.
TEST_F(Applications, WhoseNamesNoResultCanHoldAreRefused) {
    const std::string longest(900, 'x');
    write("/opt/list.ini",
          "[zel packages]\nname_001 =\nname_002 = 'a\"b'\nname_003 = " + longest + "x\nname_004 = " + longest + "\n");
    EXPECT_EQ(zel_platform_command(kInstall), 0);
    std::string expected = "[result]\ncount = 4\n";
    for (const char *number : {"001", "002", "003"})
        expected +=
            std::string{"description_"} + number + " = \"path=:op=install\"\nresult_" + number + " = \"wrong name\"\n";
    EXPECT_EQ(read("/opt/result.ini"),
              expected + "description_004 = \"path=" + longest + ":op=install\"\nresult_004 = \"success\"\n");
    EXPECT_EQ(call("app-list").at("applications").size(), 1U);
    EXPECT_EQ(application(longest).at("state"), "installed");
}

TEST_F(Applications, AreRefusedWithAnAnswerThatAResultCanHold) {
    call("app-refuse", {{"name", "a"}, {"answer", std::string(900, 'x')}});
    for (const std::string &answer : {std::string(901, 'x'), std::string{"\""}, std::string{"a\nb"}}) {
        EXPECT_EQ(result_of("app-refuse", {{"name", "a"}, {"answer", answer}}), 2) << answer;
    }
    EXPECT_EQ(application("a").at("refusal"), std::string(900, 'x'));
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
