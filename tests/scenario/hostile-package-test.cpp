// A package and a phone tree that try to reach the workstation: links that point outside, programs that the
// package brings along, names of the bench phone's own state. A whole install runs over them, and the
// surroundings of the phone are compared byte for byte.

#include "support/bench-phone.h"

#include "zel-svc.h"

#include <filesystem>
#include <fstream>
#include <iterator>
#include <map>

namespace {

namespace fs = std::filesystem;

constexpr const char *kMark = "\xEF\xBB\xBF";

// Every name below a folder with what it is: a file's bytes, a link's target.
std::map<std::string, std::string> snapshot(const std::string &folder) {
    std::map<std::string, std::string> found;
    for (const auto &entry : fs::recursive_directory_iterator{folder}) {
        const std::string name = fs::relative(entry.path(), folder).string();
        if (entry.is_symlink()) {
            found[name] = "-> " + fs::read_symlink(entry.path()).string();
        } else if (entry.is_regular_file()) {
            std::ifstream file{entry.path(), std::ios::binary};
            found[name] = {std::istreambuf_iterator<char>{file}, {}};
        } else {
            found[name] = "folder";
        }
    }
    return found;
}

struct HostilePackage : zel_test::BenchPhone {
    void SetUp() override {
        BenchPhone::SetUp();
        outside = zel_test::make_folder();
        fs::create_directory(outside + "/folder");
        std::ofstream{outside + "/secret"} << "not the phone's";
        std::ofstream{outside + "/folder/kept"} << "must stay";
        write("/opt/system/zel/mps/ZEL/SW_Configuration.xml", header());
        write("/opt/system/zel/mps/ZEL/Customer/TST/customer.xml", customer("/media/tone.wav"));
        write("/opt/system/zel/mps/ZEL/media/tone.wav", "a tone");
        write("/opt/system/zel/preconfig/TST/usr/file", "a file");
    }

    void TearDown() override {
        zel_test::remove_folder(outside);
        BenchPhone::TearDown();
    }

    static std::string header() {
        return std::string{kMark} +
               "<?xml version=\"1.0\"?><SW-Configuration><CustomerDataSet><ZELName>TST0001</ZELName>"
               "<ZELVersion>A1</ZELVersion><NbCustomer>1</NbCustomer>"
               "<CustomerData src=\"/Customer/TST/customer.xml\"/></CustomerDataSet></SW-Configuration>";
    }

    static std::string customer(const std::string &tone) {
        return std::string{kMark} +
               "<?xml version=\"1.0\"?><SW-Configuration><CustomerData><GeneralInfo>"
               "<SalesCode>TST</SalesCode></GeneralInfo><Settings><Main><Sound>"
               "<RingTone src=\"" +
               tone + "\"/></Sound></Main></Settings></CustomerData></SW-Configuration>";
    }

    // Puts a link in the place of whatever stands at a phone path.
    void link(const std::string &phone_path, const std::string &target) {
        const fs::path path = root() + phone_path;
        fs::remove_all(path);
        fs::create_directories(path.parent_path());
        fs::create_symlink(target, path);
    }

    std::string file_in_root(const std::string &phone_path) { return root() + phone_path; }

    // The same target as seen from the root's own folder, for links that climb.
    std::string climbing(const std::string &target) { return "../../../../../../../../../../.." + target; }

    void run_every_kind() {
        zel_svc_config_set_pre_config_for_config_mode("TST");
        zel_svc_config_upgrade_pre_config_for_fota_mode("TST");
        zel_svc_config_upgrade_pre_config_for_normal_booting();
        zel_svc_config_set_pre_config_for_factory_reset();
        zel_svc_config_verification_for_imei(nullptr, 0);
        zel_svc_config_encoding_xml();
    }

    std::string outside;
};

TEST_F(HostilePackage, LinksInThePackageReachNothingOutside) {
    link("/opt/system/zel/mps/ZEL/media/tone.wav", outside + "/secret");
    link("/opt/system/zel/preconfig/TST/usr/absolute", outside + "/secret");
    link("/opt/system/zel/preconfig/TST/usr/climbing", climbing(outside) + "/secret");
    link("/opt/system/zel/preconfig/TST/usr/folder", outside + "/folder");
    link("/opt/system/zel/preconfig/TST/usr/self", "self");
    link("/opt/system/zel/preconfig/TST/usr/process", "/proc/self/root" + outside);
    link("/opt/system/zel/preconfig/DEF/usr", climbing(outside) + "/folder");
    const auto before = snapshot(outside);
    run_every_kind();
    EXPECT_EQ(snapshot(outside), before);
    for (const char *name : {"absolute", "climbing", "folder/kept", "kept", "process"})
        EXPECT_FALSE(fs::exists(file_in_root("/opt/system/zel-default/usr/") + name)) << name;
    EXPECT_FALSE(fs::exists(file_in_root("/opt/usr/share/settings/Ringtones/tone.wav")));
    EXPECT_EQ(read("/opt/system/zel-default/usr/file"), "a file");
}

TEST_F(HostilePackage, LinksInThePhoneAreNotWrittenThroughToTheOutside) {
    link("/opt/system/zel-default/output", outside + "/folder");
    link("/opt/system/zel-default/data", climbing(outside) + "/folder");
    link("/opt/system/zel-default/usr", outside + "/folder");
    link("/opt/usr/share/settings/Ringtones", climbing(outside) + "/folder");
    link("/csa/zel", outside + "/folder");
    link("/csa/imei/prodcode.dat", outside + "/secret");
    link("/opt/dbspace/.dnet.db", outside + "/secret");
    link("/opt/system/zel-default/SW_Configuration.xml", outside + "/secret");
    link("/opt/system/zel-default/app", outside + "/folder");
    const auto before = snapshot(outside);
    run_every_kind();
    EXPECT_EQ(snapshot(outside), before);
}

TEST_F(HostilePackage, SourcePathThatClimbsOutOfThePackageStaysInThePhone) {
    write("/opt/system/zel/mps/ZEL/Customer/TST/customer.xml", customer("/" + climbing(outside) + "/secret"));
    const auto before = snapshot(outside);
    run_every_kind();
    EXPECT_EQ(snapshot(outside), before);
    EXPECT_FALSE(fs::exists(file_in_root("/opt/usr/share/settings/Ringtones/secret")));
}

TEST_F(HostilePackage, CustomerNamesThatClimbNameNoFolder) {
    const auto before = snapshot(outside);
    for (const char *name : {"..", "../../..", ".", "a/b", ""})
        zel_svc_config_set_pre_config_for_config_mode(name);
    EXPECT_EQ(snapshot(outside), before);
    EXPECT_NE(run_log().find("[Config/Ended] * Set pre-config for configuration mode *"), std::string::npos);
}

TEST_F(HostilePackage, BenchPhonesOwnStateCannotBeReadOrWritten) {
    write("/opt/system/zel/mps/ZEL/Customer/TST/customer.xml", customer("/../../../../.platform/phone"));
    link("/opt/system/zel/preconfig/TST/usr", "/.platform");
    link("/opt/system/zel-default/data", "/.platform");
    const auto marker = snapshot(file_in_root("/.platform")).at("phone");
    std::vector<std::string> names;
    for (const auto &entry : fs::directory_iterator{file_in_root("/.platform")})
        names.push_back(entry.path().filename().string());
    run_every_kind();
    EXPECT_EQ(snapshot(file_in_root("/.platform")).at("phone"), marker);
    EXPECT_FALSE(fs::exists(file_in_root("/opt/usr/share/settings/Ringtones/phone")));
    EXPECT_FALSE(fs::exists(file_in_root("/opt/system/zel-default/usr/phone")));
    for (const auto &entry : fs::directory_iterator{file_in_root("/.platform")})
        EXPECT_EQ(entry.path().extension() == ".ini", false) << entry.path();
}

TEST_F(HostilePackage, ProgramsThatThePackageBringsAreNotRun) {
    const std::string script = "#!/bin/sh\necho run > " + outside + "/was-run\n";
    for (const char *program : {"/usr/bin/pkgcmd", "/usr/bin/pkg", "/usr/bin/rpm-backend", "/bin/sh"})
        write(program, script, 0755);
    const auto before = snapshot(outside);
    run_every_kind();
    zel_svc_config_reboot();
    EXPECT_EQ(snapshot(outside), before);
}

} // namespace
