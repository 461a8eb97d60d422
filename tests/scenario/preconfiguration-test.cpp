// The pre-configuration folders through the install run: presets, file-system update, several upgrades, and
// trees and scripts that try to break it.

#include "support/files-phone.h"
#include "support/lines.h"

#include <zel-svc.h>

#include <filesystem>
#include <fstream>
#include <gmock/gmock.h>
#include <map>
#include <sys/socket.h>
#include <sys/stat.h>
#include <sys/un.h>
#include <unistd.h>

namespace {

namespace fs = std::filesystem;

constexpr const char *kState = "/opt/system/zel-default/fsupdate/zel-fsupdate-info.ini";

class Preconfiguration : public zel_test::FilesPhone {
  protected:
    static std::string in(const std::string &package) { return "/opt/system/zel/preconfig/" + package; }
    void write_script(const std::string &package, const std::string &text) {
        write(in(package) + "/fsupdate/zel-fsupdate.ini", text);
    }
    void write_tree(const std::string &package, const std::string &path, const std::string &text) {
        write(in(package) + "/fsupdate/fs" + path, text);
    }
    // The state file without its blanks and empty lines.
    std::string state() {
        std::string text;
        for (const char c : read(kState))
            if (c != ' ' && !(c == '\n' && (text.empty() || text.back() == '\n'))) text += c;
        return text;
    }
    void upgrade() { zel_svc_config_install_customer("BTU", ZEL_SVC_INSTALL_FOTA_MODE); }
};

TEST_F(Preconfiguration, AFullInstallAndThreeUpgrades) {
    write(in("DEF") + "/preset/zel-preset.ini", "[default]\nfont_style = \"Sans\"\nlockscreen_theme = 1\n"
                                                "[upgrade_update]\nlockscreen_theme = 1\n");
    write(in("BTU") + "/preset/zel-preset.ini", "[default]\nfont_style = \"Serif\"\n");
    write_tree("DEF", "/opt/etc/a", "DEF a");
    write_tree("BTU", "/opt/etc/b", "BTU b");
    write_script("DEF", "[rel]\nversion = 1\n1_rm = /opt/etc/none\n");
    write_script("BTU", "[rel]\nversion = 10\n");
    zel_svc_config_install_customer("BTU", ZEL_SVC_INSTALL_CONFIG_MODE);
    EXPECT_EQ(state(), "[cur_version]\ndef=1\nbtu=10\n");
    EXPECT_EQ(get_string("db/zel/font_default_style"), "Serif");
    EXPECT_EQ(get_int("db/lockscreen/style"), 1);
    EXPECT_EQ(read("/opt/etc/a") + read("/opt/etc/b"), "DEF aBTU b");

    set_string("db/zel/font_default_style", "the user's");
    set_int("db/lockscreen/style", 9);
    const std::string first = "[rel]\nversion = 1\n[up_1]\nversion = 2\n1_rm = /opt/etc/a\n";
    write_script("DEF", first);
    upgrade();
    EXPECT_EQ(state(), "[cur_version]\ndef=2\nbtu=10\n");
    EXPECT_FALSE(exists("/opt/etc/a"));
    EXPECT_EQ(get_string("db/zel/font_default_style"), "the user's");
    EXPECT_EQ(get_int("db/lockscreen/style"), 1);

    write_script("DEF", first + "[up_2]\nversion = 7\n1_cp = /opt/etc/a\n");
    write_script("BTU", "[up_1]\nversion = 12\n1_rm = /opt/etc/b\n");
    upgrade();
    EXPECT_EQ(state(), "[cur_version]\ndef=7\nbtu=12\n");
    EXPECT_EQ(read("/opt/etc/a"), "DEF a");
    EXPECT_FALSE(exists("/opt/etc/b"));

    // The last step is an old one: what the phone has stays.
    write_script("BTU", "[up_1]\nversion = 13\n1_cp = /opt/etc/b\n[up_2]\nversion = 3\n1_rm = /opt/etc/a\n");
    upgrade();
    EXPECT_EQ(state(), "[cur_version]\ndef=7\nbtu=12\n");
    EXPECT_EQ(read("/opt/etc/a") + read("/opt/etc/b"), "DEF aBTU b");

    const std::string line = "[FSUpdate] Run /";
    std::string steps;
    for (const std::string &text : zel_test::lines_of(run_log()))
        if (text.starts_with(line)) steps += text.substr(line.size()) + "\n";
    EXPECT_EQ(steps, "DEF/rel:1_rm.\nDEF/up_1:1_rm.\nDEF/up_2:1_cp.\nBTU/up_1:1_rm.\nBTU/up_1:1_cp.\n");
}

// A folder beside the phone that no run may touch.
class HostileTree : public Preconfiguration {
  protected:
    void SetUp() override {
        Preconfiguration::SetUp();
        outside = zel_test::make_folder();
        fs::create_directory(outside + "/folder");
        std::ofstream{outside + "/secret"} << "not the phone's";
        std::ofstream{outside + "/folder/kept"} << "must stay";
    }
    void TearDown() override {
        EXPECT_EQ(content(outside + "/secret") + content(outside + "/folder/kept"), "not the phone'smust stay");
        EXPECT_EQ(std::distance(fs::recursive_directory_iterator{outside}, {}), 3);
        zel_test::remove_folder(outside);
        Preconfiguration::TearDown();
    }
    static std::string content(const std::string &path) {
        std::ostringstream bytes;
        bytes << std::ifstream{path}.rdbuf();
        return bytes.str();
    }
    std::string climbing() const { return "../../../../../../../../../../../.." + outside; }
    std::string tree_on_disk(const std::string &path) { return on_disk(in("BTU") + "/fsupdate/fs" + path); }
    void link_in_tree(const std::string &target, const std::string &path) {
        fs::create_directories(fs::path{tree_on_disk(path)}.parent_path());
        fs::create_symlink(target, tree_on_disk(path));
    }
    void install() {
        zel_svc_config_install_customer("BTU", ZEL_SVC_INSTALL_CONFIG_MODE);
        upgrade();
        EXPECT_TRUE(run_log().ends_with("[Config/Ended] Install customer('BTU') to upgrade configuration on FOTA "
                                        "mode.\n"));
    }

    std::string outside;
};

TEST_F(HostileTree, LinksReachNothingOutside) {
    link_in_tree(outside + "/secret", "/opt/t/absolute");
    link_in_tree(climbing() + "/secret", "/opt/t/climbing");
    link_in_tree(outside + "/folder", "/opt/t/folder");
    link_in_tree("self", "/opt/t/self");
    link_in_tree("/", "/opt/t/root");
    link_in_tree("/proc/self/root" + outside + "/secret", "/opt/t/process");
    link_in_tree("real", "/opt/t/link");
    write_tree("BTU", "/opt/t/real", "text");
    write_script("BTU", "[rel]\n1_cp = /opt/t/absolute\n2_cp = /opt/t/climbing\n3_cp_r = /opt/t/folder\n"
                        "4_cp_r = /opt/t/root\n5_cp = /opt/t/root/etc/passwd\n6_cp = /opt/t/self\n");
    install();
    for (const char *name : {"absolute", "climbing", "process", "self", "folder/kept"})
        EXPECT_FALSE(exists(std::string{"/opt/t/"} + name)) << name;
    EXPECT_EQ(read("/opt/t/real"), "text");
    EXPECT_EQ(read("/opt/t/link"), "text");
}

TEST_F(HostileTree, ScriptsReachNothingOutside) {
    add_folder("/opt/t");
    link_to(outside, "/opt/t/absolute");
    link_to(climbing(), "/opt/t/climbing");
    const std::string script = "1_rm = /opt/t/absolute/secret\n2_rm_r = /opt/t/climbing/folder\n"
                               "3_rm_r = /opt/t/absolute/folder/\n4_cp = /opt/t/climbing/secret\n"
                               "5_cp_r = /opt/t/absolute\n6_rm = " +
                               climbing() + "/secret\n7_rm_r = /.." + outside + "/folder\n8_rm_r = " + outside +
                               "\n9_cp = " + outside +
                               "/secret\n10_rm_r = /\n11_rm_r = /.platform\n"
                               "12_cp = /.platform/phone\n13_rm_r = /opt/t/climbing\n";
    write_tree("BTU", "/opt/t/climbing/secret", "overwritten");
    write_tree("BTU", outside + "/secret", "overwritten");
    write_tree("BTU", "/opt/t/absolute/folder/kept", "overwritten");
    write_tree("BTU", "/.platform/phone", "overwritten");
    write_script("BTU", "[rel]\n" + script + "[up_always]\n" + script);
    const std::string marker = content(root() + "/.platform/phone");
    install();
    EXPECT_EQ(content(root() + "/.platform/phone"), marker);
    EXPECT_FALSE(exists("/opt/t/climbing"));
}

TEST_F(HostileTree, SpecialFilesAndUnreadableFoldersAreLeftOut) {
    write_tree("BTU", "/opt/t/first", "text");
    write_tree("BTU", "/opt/t/zlast", "text");
    ASSERT_EQ(::mkfifo(tree_on_disk("/opt/t/fifo").c_str(), 0644), 0);
    const int made = ::socket(AF_UNIX, SOCK_STREAM, 0);
    sockaddr_un address = {};
    address.sun_family = AF_UNIX;
    const std::string short_path = root() + "/tmp/s";
    short_path.copy(address.sun_path, sizeof address.sun_path - 1);
    ASSERT_EQ(::bind(made, reinterpret_cast<const sockaddr *>(&address), sizeof address), 0);
    ::close(made);
    fs::rename(short_path, tree_on_disk("/opt/t/socket"));
    write_tree("BTU", "/opt/t/locked/file", "text");
    fs::permissions(tree_on_disk("/opt/t/locked"), fs::perms::none);
    write_script("BTU",
                 "[rel]\n1_cp = /opt/t/fifo\n2_cp = /opt/t/socket\n3_cp_r = /opt/t/locked\n4_rm = /opt/t/first\n");
    install();
    fs::permissions(tree_on_disk("/opt/t/locked"), fs::perms::owner_all);
    if (exists("/opt/t/locked")) fs::permissions(on_disk("/opt/t/locked"), fs::perms::owner_all);
    EXPECT_FALSE(exists("/opt/t/fifo"));
    EXPECT_FALSE(exists("/opt/t/socket"));
    EXPECT_FALSE(exists("/opt/t/first"));
    EXPECT_EQ(read("/opt/t/zlast"), "text");
}

TEST_F(HostileTree, LongNamesAndDeepFoldersEnd) {
    const std::string name(255, 'n');
    write_tree("BTU", "/opt/t/" + name, "text");
    add_deep_tree(in("BTU") + "/fsupdate/fs/opt/t", 300);
    write_script("BTU", "[rel]\n1_cp = /opt/t/" + name + "\n2_rm_r = /opt/t/" + name + "\n3_rm = /opt/t/" +
                            std::string(300, 'x') + "\n4_cp_r = /opt/t\n5_rm_r = /opt/t/d/d/d/d/d/d/d/d/d/d\n");
    upgrade(); // the phone opens its own files at its first call
    const int before = open_descriptors();
    install();
    EXPECT_EQ(open_descriptors(), before);
    EXPECT_EQ(read("/opt/t/" + name), "text");
    EXPECT_EQ(depth_of("/opt/t"), 9);
    EXPECT_TRUE(exists("/opt/t/d/d/d/d/d/d/d/d/file"));
}

TEST_F(HostileTree, AnEndlessLookingScriptEndsWithItsNumbers) {
    std::string text = "[rel]\nversion = 1\n";
    for (int i = 1; i <= 300; ++i)
        text += std::to_string(i) + "_rm = /opt/none\n";
    write_script("BTU", text);
    install();
    EXPECT_NE(run_log().find("[FSUpdate] Run /BTU/rel:300_rm.\n"), std::string::npos);
    EXPECT_EQ(run_log().find("rel:301"), std::string::npos);
}

} // namespace
