// The file-system update: the package's trees, its scripts, and the versions that a phone remembers.

#include "preset/zel-svc-fs-update.h"
#include "support/files-phone.h"

#include <gmock/gmock.h>

#include <filesystem>
#include <unistd.h>

namespace {

using zel_test::Attributes;

constexpr const char *kState = "/opt/system/zel-default/fsupdate/zel-fsupdate-info.ini";

class FsUpdate : public zel_test::FilesPhone {
  protected:
    static std::string folder_of(const std::string &package) {
        return "/opt/system/zel/preconfig/" + package + "/fsupdate";
    }
    void write_script(const std::string &package, const std::string &text) {
        write(folder_of(package) + "/zel-fsupdate.ini", text);
    }
    void write_tree(const std::string &package, const std::string &path, const std::string &text) {
        write(folder_of(package) + "/fs" + path, text);
    }
    // "DEF 3, XFV 5"; "-" for a version that is not there.
    std::string versions(const std::string &customer = "XFV") {
        const ZelSvcIni state = ZelSvcIni::load(kState);
        const auto text = [&state](const std::string &package) {
            const char *version = state.text("cur_version:" + package);
            return package + ' ' + (version ? version : "-");
        };
        return text("DEF") + ", " + text(customer);
    }
    void remember(int defaults, int customer) {
        write(kState,
              "[cur_version]\nDEF = " + std::to_string(defaults) + "\nXFV = " + std::to_string(customer) + "\n");
    }
    static std::string line(const std::string &operation) { return "[FSUpdate] Run /" + operation + ".\n"; }
};

TEST_F(FsUpdate, TheFullInstallCopiesTreesRunsScriptsAndRemembersVersions) {
    write_tree("DEF", "/opt/etc/both", "DEF");
    write_tree("DEF", "/opt/etc/default", "DEF");
    write_tree("DEF", "/opt/new/folder/file", "DEF");
    write_tree("XFV", "/opt/etc/both", "XFV");
    write("/opt/old", "old");
    write("/opt/older/file", "old");
    write_script("DEF", "[rel]\nversion = 3\n1_rm = /opt/old\n[up_always]\n1_rm = /opt/etc/both\n");
    write_script("XFV", "[rel]\nversion = 5\n1_rm_r = /opt/older\n[up_1]\nversion = 9\n1_rm = /opt/etc/both\n");
    zel_svc_fs_update("XFV", 0);
    EXPECT_EQ(read("/opt/etc/both"), "XFV");
    EXPECT_EQ(read("/opt/etc/default"), "DEF");
    EXPECT_EQ(read("/opt/new/folder/file"), "DEF");
    EXPECT_FALSE(exists("/opt/old"));
    EXPECT_FALSE(exists("/opt/older"));
    EXPECT_EQ(versions(), "DEF 3, XFV 5");
    EXPECT_EQ(run_log(), line("DEF/rel:1_rm") + line("XFV/rel:1_rm_r"));
    EXPECT_EQ(attributes(kState), (Attributes{0644, 200, 5000, "zel-manager"}));
}

TEST_F(FsUpdate, WithoutScriptsTheVersionsAreZero) {
    write_tree("DEF", "/opt/etc/default", "DEF");
    write(kState, "[cur_version]\nDEF = 7\nOLD = 8\n", 0600);
    zel_svc_fs_update("XFV", 0);
    EXPECT_EQ(versions(), "DEF 0, XFV 0");
    EXPECT_EQ(versions("OLD"), "DEF 0, OLD -");
    EXPECT_EQ(read("/opt/etc/default"), "DEF");
    EXPECT_EQ(run_log(), "");
    EXPECT_EQ(attributes(kState), (Attributes{0644, 200, 5000, "zel-manager"}));
}

TEST_F(FsUpdate, AScriptThatDoesNotLoadIsNone) {
    write("/opt/old", "old");
    write_script("DEF", "[rel]\nversion = 3\n1_rm = /opt/old\n[broken\n");
    zel_svc_fs_update("XFV", 0);
    EXPECT_TRUE(exists("/opt/old"));
    EXPECT_EQ(versions(), "DEF 0, XFV 0");
}

TEST_F(FsUpdate, TheDefaultsScriptRunsBeforeTheCustomersTree) {
    write_tree("DEF", "/opt/file", "DEF");
    write_script("DEF", "[rel]\n1_rm = /opt/file\n");
    write_tree("XFV", "/opt/file", "XFV");
    zel_svc_fs_update("XFV", 0);
    EXPECT_EQ(read("/opt/file"), "XFV");
}

TEST_F(FsUpdate, CopiesKeepTheirAttributesAndGetTheFixedTime) {
    const Attributes file{0640, 1000, 2000, "app-label"};
    const Attributes folder{0750, 1001, 2001, "folder-label"};
    for (const char *path : {"/opt/by-tree/file", "/opt/by-cp", "/opt/by-cp-r/file"}) {
        write_tree("DEF", path, "text");
        give(folder_of("DEF") + "/fs" + path, file);
    }
    for (const char *path : {"/opt/by-tree", "/opt/by-cp-r"})
        give(folder_of("DEF") + "/fs" + path, folder);
    zel_svc_fs_update("XFV", 0);
    const auto check = [&] {
        for (const char *path : {"/opt/by-tree/file", "/opt/by-cp", "/opt/by-cp-r/file"}) {
            EXPECT_EQ(attributes(path), file) << path;
            struct tm time = {};
            const time_t changed = status_of(path).st_mtime;
            localtime_r(&changed, &time);
            EXPECT_EQ((std::vector{time.tm_year, time.tm_mon, time.tm_mday, time.tm_hour, time.tm_min, time.tm_sec}),
                      (std::vector{114, 0, 1, 0, 0, 1}))
                << path;
        }
        for (const char *path : {"/opt/by-tree", "/opt/by-cp-r"})
            EXPECT_EQ(attributes(path), folder) << path;
    };
    check();
    for (const char *path : {"/opt/by-cp", "/opt/by-cp-r"})
        std::filesystem::remove_all(on_disk(path));
    write_script("DEF", "[up_always]\n1_cp = /opt/by-cp\n2_cp_r = /opt/by-cp-r\n");
    zel_svc_fs_update("XFV", 1);
    check();
}

TEST_F(FsUpdate, AnUpgradeRunsScriptsAndCopiesNoTree) {
    remember(1, 1);
    write_tree("DEF", "/opt/not-copied", "DEF");
    write_tree("DEF", "/opt/copied", "DEF");
    write_tree("XFV", "/opt/folder/inner/file", "XFV");
    write_script("DEF", "[rel]\nversion = 9\n1_cp = /opt/not-copied\n[up_always]\n1_cp = /opt/copied\n");
    write_script("XFV", "[up_1]\nversion = 2\n1_cp_r = /opt/folder\n");
    zel_svc_fs_update("XFV", 1);
    EXPECT_FALSE(exists("/opt/not-copied"));
    EXPECT_EQ(read("/opt/copied"), "DEF");
    EXPECT_EQ(read("/opt/folder/inner/file"), "XFV");
    EXPECT_EQ(versions(), "DEF 1, XFV 2");
    EXPECT_EQ(run_log(), line("DEF/up_always:1_cp") + line("XFV/up_1:1_cp_r"));
}

TEST_F(FsUpdate, WithoutAStateFileAnUpgradeDoesNothing) {
    write("/opt/old", "old");
    write_script("DEF", "[up_always]\n1_rm = /opt/old\n");
    zel_svc_fs_update("XFV", 1);
    write(kState, "[broken\n");
    zel_svc_fs_update("XFV", 1);
    EXPECT_TRUE(exists("/opt/old"));
    EXPECT_EQ(run_log(), "");
    EXPECT_EQ(read(kState), "[broken\n");
}

TEST_F(FsUpdate, AChainOfUpgradesRunsEachStepOnce) {
    const std::string rel = "[rel]\nversion = 1\n";
    const std::string up1 = "[up_1]\nversion = 2\n1_rm = /opt/a\n";
    const std::string up2 = "[up_2]\nversion = 5\n1_rm = /opt/b\n";
    const std::string up3 = "[up_3]\nversion = 6\n1_rm = /opt/c\n";
    write_script("DEF", rel);
    write_script("XFV", "[rel]\nversion = 10\n");
    zel_svc_fs_update("XFV", 0);
    EXPECT_EQ(versions(), "DEF 1, XFV 10");
    write_script("DEF", rel + up1);
    zel_svc_fs_update("XFV", 1);
    EXPECT_EQ(versions(), "DEF 2, XFV 10");
    write_script("DEF", rel + up1 + up2);
    write_script("XFV", "[up_1]\nversion = 11\n1_rm = /opt/d\n");
    zel_svc_fs_update("XFV", 1);
    EXPECT_EQ(versions(), "DEF 5, XFV 11");
    write_script("DEF", rel + up1 + up2 + up3);
    zel_svc_fs_update("XFV", 1);
    EXPECT_EQ(versions(), "DEF 6, XFV 11");
    zel_svc_fs_update("XFV", 1);
    EXPECT_EQ(versions(), "DEF 6, XFV 11");
    EXPECT_EQ(run_log(), line("DEF/up_1:1_rm") + line("DEF/up_2:1_rm") + line("XFV/up_1:1_rm") + line("DEF/up_3:1_rm"));
    EXPECT_EQ(attributes(kState), (Attributes{0644, 200, 5000, "zel-manager"}));
}

TEST_F(FsUpdate, ThreeStepsAtOnceRunInOrder) {
    remember(1, 0);
    write_script("DEF", "[up_3]\nversion = 4\n1_rm = /opt/c\n[up_1]\nversion = 2\n1_rm = /opt/a\n"
                        "[up_2]\nversion = 3\n1_rm = /opt/b\n");
    zel_svc_fs_update("XFV", 1);
    EXPECT_EQ(run_log(), line("DEF/up_1:1_rm") + line("DEF/up_2:1_rm") + line("DEF/up_3:1_rm"));
    EXPECT_EQ(versions(), "DEF 4, XFV 0");
}

TEST_F(FsUpdate, StepsEndAtTheFirstMissingNumber) {
    remember(0, 0);
    write_script("DEF", "[up_1]\nversion = 1\n1_rm = /opt/a\n[up_3]\nversion = 3\n1_rm = /opt/c\n");
    zel_svc_fs_update("XFV", 1);
    EXPECT_EQ(run_log(), line("DEF/up_1:1_rm"));
    EXPECT_EQ(versions(), "DEF 1, XFV 0");
}

TEST_F(FsUpdate, ALastStepOfALowerVersionStoresNothing) {
    remember(4, 4);
    write_script("DEF", "[up_1]\nversion = 5\n1_rm = /opt/a\n[up_2]\nversion = 3\n1_rm = /opt/b\n");
    write_script("XFV", "[up_1]\nversion = 5\n[up_2]\n1_rm = /opt/c\n"); // without a version: 0
    zel_svc_fs_update("XFV", 1);
    EXPECT_EQ(run_log(), line("DEF/up_1:1_rm"));
    EXPECT_EQ(versions(), "DEF 4, XFV 4");
}

TEST_F(FsUpdate, AllStepsCompareWithTheVersionBeforeTheUpgrade) {
    remember(1, 1);
    write_script("DEF", "[up_1]\nversion = 9\n1_rm = /opt/a\n[up_2]\nversion = 2\n1_rm = /opt/b\n");
    zel_svc_fs_update("XFV", 1);
    EXPECT_EQ(run_log(), line("DEF/up_1:1_rm") + line("DEF/up_2:1_rm"));
    EXPECT_EQ(versions(), "DEF 2, XFV 1");
}

TEST_F(FsUpdate, AStepOfTheSameVersionIsNotRun) {
    remember(2, 0);
    write_script("DEF", "[up_1]\nversion = 2\n1_rm = /opt/a\n");
    zel_svc_fs_update("XFV", 1);
    EXPECT_EQ(run_log(), "");
    EXPECT_EQ(versions(), "DEF 2, XFV 0");
}

TEST_F(FsUpdate, OtherCustomersVersionsStay) {
    write(kState, "[cur_version]\nDEF = 1\nINS = 7\n");
    write_script("XFV", "[up_1]\nversion = 3\n");
    zel_svc_fs_update("XFV", 1);
    EXPECT_EQ(versions("INS"), "DEF 1, INS 7");
    EXPECT_EQ(versions("XFV"), "DEF 1, XFV 3");
}

TEST_F(FsUpdate, ANumberRunsTheFirstOfItsOperations) {
    for (const char *file : {"/opt/1", "/opt/2/file", "/opt/3"})
        write(file, "phone");
    for (const char *file : {"/opt/1", "/opt/2/file", "/opt/3", "/opt/4/file"})
        write_tree("DEF", file, "tree");
    write_script("DEF", "[rel]\n1_cp = /opt/1\n1_rm = /opt/1\n2_cp_r = /opt/2\n2_rm_r = /opt/2\n"
                        "3_cp_r = /opt/3\n3_cp = /opt/3\n4_cp_r = /opt/4\n");
    const ZelSvcIni script = ZelSvcIni::load((folder_of("DEF") + "/zel-fsupdate.ini").c_str());
    zel_svc_fs_update_run_section("DEF", script, "rel");
    EXPECT_FALSE(exists("/opt/1"));
    EXPECT_FALSE(exists("/opt/2"));
    EXPECT_EQ(read("/opt/3"), "tree");
    EXPECT_EQ(read("/opt/4/file"), "tree");
    EXPECT_EQ(run_log(), line("DEF/rel:1_rm") + line("DEF/rel:2_rm_r") + line("DEF/rel:3_cp") + line("DEF/rel:4_cp_r"));
}

TEST_F(FsUpdate, ASectionEndsAtTheFirstMissingNumber) {
    write("/opt/a", "a");
    write("/opt/b", "b");
    write_script("DEF", "[rel]\n0_rm = /opt/b\n1_rm = /opt/a\n3_rm = /opt/b\n2_mv = /opt/b\n");
    zel_svc_fs_update("XFV", 0);
    EXPECT_FALSE(exists("/opt/a"));
    EXPECT_TRUE(exists("/opt/b"));
    EXPECT_EQ(run_log(), line("DEF/rel:1_rm"));
}

TEST_F(FsUpdate, AnEmptyValueIsTheNumbersOperationAndDoesNothing) {
    write("/opt/a", "a");
    write("/opt/b", "b");
    write_script("DEF", "[rel]\n1_rm =\n1_rm_r = /opt/a\n2_rm = /opt/b\n");
    zel_svc_fs_update("XFV", 0);
    EXPECT_TRUE(exists("/opt/a"));
    EXPECT_FALSE(exists("/opt/b"));
    EXPECT_EQ(run_log(), line("DEF/rel:2_rm"));
}

// Each is logged as run and leaves the phone as it was.
TEST_F(FsUpdate, PathsThatAreNoneOfThePhonesDoNothing) {
    write("/opt/file", "kept");
    write("/opt/folder/file", "kept");
    write_tree("DEF", "/opt/file", "tree");
    write_script("DEF", "[rel]\n");
    write("/opt/system/zel-default/output/zel-config.log", "");
    const std::vector<std::string> before = tree("/opt");
    for (const char *path :
         {"opt/file", "/opt/../opt/file", "/..", "/opt/folder/..", "../opt/file", "/opt/folder/../file", "/", "//",
          "/.", "/./", "/opt/none", "/opt/none/file", "/opt/file/x", "."})
        for (const char *operation : {"rm", "rm_r", "cp"}) {
            write("/opt/system/zel-default/output/zel-config.log", "");
            write_script("DEF", std::string{"[rel]\n1_"} + operation + " = " + path + "\n");
            const ZelSvcIni script = ZelSvcIni::load((folder_of("DEF") + "/zel-fsupdate.ini").c_str());
            zel_svc_fs_update_run_section("DEF", script, "rel");
            EXPECT_EQ(run_log(), line(std::string{"DEF/rel:1_"} + operation)) << path;
            EXPECT_EQ(read("/opt/file"), "kept") << operation << ' ' << path;
            EXPECT_EQ(read("/opt/folder/file"), "kept") << operation << ' ' << path;
        }
    EXPECT_THAT(tree("/opt"), ::testing::UnorderedElementsAreArray(before));
}

TEST_F(FsUpdate, AFolderIsCopiedToNoOtherPlaceThanItsOwn) {
    write("/opt/folder/file", "kept");
    write_tree("DEF", "/opt/folder/file", "tree");
    write_tree("DEF", "/opt/new/inner/file", "tree");
    write_script("DEF", "[up_always]\n1_cp_r = opt/folder\n2_cp_r = /opt/folder/..\n3_cp_r = /opt/../opt/folder\n"
                        "4_cp_r = ..\n5_cp_r = folder\n6_cp_r = .\n7_cp_r = /opt/new/inner\n8_cp_r = /opt/none\n");
    remember(0, 0);
    write("/opt/system/zel-default/output/zel-config.log", "");
    const std::vector<std::string> before = tree("/");
    zel_svc_fs_update("XFV", 1);
    EXPECT_THAT(tree("/"), ::testing::UnorderedElementsAreArray(before));
    EXPECT_EQ(read("/opt/folder/file"), "kept");
    std::string expected;
    for (int i = 1; i <= 8; ++i)
        expected += line("DEF/up_always:" + std::to_string(i) + "_cp_r");
    EXPECT_EQ(run_log(), expected);
}

TEST_F(FsUpdate, ALinkIsRemovedAndNotWhatItNames) {
    write("/opt/target/file", "kept");
    link_to("/opt/target/file", "/opt/to-file");
    link_to("/opt/target", "/opt/to-folder");
    link_to("/opt/none", "/opt/to-none");
    write_script("DEF", "[up_always]\n1_rm = /opt/to-file\n2_rm = /opt/to-folder\n3_rm = /opt/to-none\n");
    remember(0, 0);
    zel_svc_fs_update("XFV", 1);
    for (const char *link : {"/opt/to-file", "/opt/to-folder", "/opt/to-none"})
        EXPECT_FALSE(exists(link)) << link;
    EXPECT_EQ(read("/opt/target/file"), "kept");
}

TEST_F(FsUpdate, AnUpgradeWritesTheStateFileInItsPlace) {
    remember(1, 1);
    const ino_t before = status_of(kState).st_ino;
    write_script("DEF", "[up_1]\nversion = 2\n");
    zel_svc_fs_update("XFV", 1);
    EXPECT_EQ(versions(), "DEF 2, XFV 1");
    EXPECT_EQ(status_of(kState).st_ino, before);
}

TEST_F(FsUpdate, AFullDiskKeepsTheVersionsOfAnUpgradeOnly) {
    remember(1, 1);
    write("/opt/old", "old");
    write_script("DEF", "[up_1]\nversion = 2\n1_rm = /opt/old\n");
    fail("disk_full", kState);
    zel_svc_fs_update("XFV", 1);
    EXPECT_FALSE(exists("/opt/old"));
    EXPECT_EQ(versions(), "DEF 1, XFV 1");
    EXPECT_EQ(run_log(), line("DEF/up_1:1_rm"));
}

TEST_F(FsUpdate, AnOperationOfTheOtherKindDoesNothing) {
    write("/opt/file", "kept");
    write("/opt/folder/file", "kept");
    write_tree("DEF", "/opt/folder/file", "tree");
    write_tree("DEF", "/opt/file", "tree");
    write_script("DEF",
                 "[up_always]\n1_rm = /opt/folder\n2_rm_r = /opt/file\n3_cp = /opt/folder\n4_cp_r = /opt/file\n");
    remember(0, 0);
    zel_svc_fs_update("XFV", 1);
    EXPECT_EQ(read("/opt/file"), "kept");
    EXPECT_EQ(read("/opt/folder/file"), "kept");
    EXPECT_EQ(run_log(), line("DEF/up_always:1_rm") + line("DEF/up_always:2_rm_r") + line("DEF/up_always:3_cp") +
                             line("DEF/up_always:4_cp_r"));
}

TEST_F(FsUpdate, TrailingSlashesAreDropped) {
    for (const char *path : {"/opt/a", "/opt/b/file", "/opt/target/file"})
        write(path, "phone");
    link_to("/opt/target", "/opt/link");
    write_tree("DEF", "/opt/c", "tree");
    write_tree("DEF", "/opt/d/file", "tree");
    write_script("DEF", "[up_always]\n1_rm = /opt/a/\n2_rm_r = /opt/b//\n3_cp = /opt/c/\n4_cp_r = /opt/d///\n"
                        "5_rm_r = /opt/link/\n");
    remember(0, 0);
    zel_svc_fs_update("XFV", 1);
    EXPECT_FALSE(exists("/opt/a"));
    EXPECT_FALSE(exists("/opt/b"));
    EXPECT_EQ(read("/opt/c"), "tree");
    EXPECT_EQ(read("/opt/d/file"), "tree");
    EXPECT_FALSE(exists("/opt/link"));
    EXPECT_EQ(read("/opt/target/file"), "phone");
}

// As a user whom modes stop: the super-user, as whom tests may run, fills any folder.
class FsUpdateOfAUser : public FsUpdate {
  protected:
    void become_user() {
        if (::geteuid() != 0) return;
        constexpr uid_t kUser = 65534;
        for (const auto &entry : std::filesystem::recursive_directory_iterator(root()))
            ASSERT_EQ(::lchown(entry.path().c_str(), kUser, kUser), 0);
        ASSERT_EQ(::chown(root().c_str(), kUser, kUser), 0);
        ASSERT_EQ(::seteuid(kUser), 0);
        super_user_ = true;
    }
    void TearDown() override {
        if (super_user_) {
            EXPECT_EQ(::seteuid(0), 0);
        }
        FsUpdate::TearDown();
    }

  private:
    bool super_user_ = false;
};

TEST_F(FsUpdateOfAUser, AReadOnlyFolderIsFilledBeforeItIsClosed) {
    const std::string package = folder_of("DEF") + "/fs";
    for (const char *path : {"/opt/sealed/file", "/opt/sealed/inner/file"})
        write_tree("DEF", path, "tree");
    for (const char *path : {"/opt/sealed/inner", "/opt/sealed"})
        give(package + path, {.mode = 0555, .uid = 301, .gid = 302, .label = "sealed"});
    write_script("DEF", "[up_always]\n1_cp_r = /opt/sealed\n");
    remember(0, 0);
    become_user();
    zel_svc_fs_update("XFV", 1);
    EXPECT_EQ(read("/opt/sealed/file"), "tree");
    EXPECT_EQ(read("/opt/sealed/inner/file"), "tree");
    for (const char *path : {"/opt/sealed", "/opt/sealed/inner"})
        EXPECT_EQ(attributes(path), (Attributes{0555, 301, 302, "sealed"})) << path;
    for (const char *path : {"/opt/sealed", "/opt/sealed/inner"}) // lets any user remove the phone
        for (const std::string &place : {package + path, std::string{path}})
            ::chmod(on_disk(place).c_str(), 0755);
}

TEST_F(FsUpdate, ACopiedFolderKeepsTheAttributesThatItHas) {
    const Attributes there{0750, 401, 402, "there"};
    write_tree("DEF", "/opt/folder/file", "tree");
    give(folder_of("DEF") + "/fs/opt/folder", {.mode = 0700, .uid = 301, .gid = 302, .label = "tree"});
    add_folder("/opt/folder");
    give("/opt/folder", there);
    write_script("DEF", "[up_always]\n1_cp_r = /opt/folder\n");
    remember(0, 0);
    zel_svc_fs_update("XFV", 1);
    EXPECT_EQ(read("/opt/folder/file"), "tree");
    EXPECT_EQ(attributes("/opt/folder"), there);
}

TEST_F(FsUpdate, ACopiedFolderMakesItsLastLevelOnly) {
    write_tree("DEF", "/opt/new/inner/file", "tree");
    write_script("DEF", "[up_always]\n1_cp_r = /opt/new/inner\n");
    remember(0, 0);
    zel_svc_fs_update("XFV", 1);
    EXPECT_FALSE(exists("/opt/new"));
    write_script("DEF", "[up_always]\n1_cp_r = /opt/new\n");
    zel_svc_fs_update("XFV", 1);
    EXPECT_EQ(read("/opt/new/inner/file"), "tree");
}

TEST_F(FsUpdate, TheWholeTreeCanBeCopiedOntoTheRoot) {
    write_tree("DEF", "/opt/new/file", "tree");
    write_script("DEF", "[up_always]\n1_cp_r = /\n");
    remember(0, 0);
    zel_svc_fs_update("XFV", 1);
    EXPECT_EQ(read("/opt/new/file"), "tree");
}

TEST_F(FsUpdate, AStateFileThatAScriptRemovesEndsTheUpgrade) {
    remember(1, 1);
    write_script("DEF", std::string{"[up_1]\nversion = 2\n1_rm = "} + kState + "\n");
    zel_svc_fs_update("XFV", 1);
    EXPECT_FALSE(exists(kState));
}

TEST_F(FsUpdate, AStateFileInATreeIsReadAgain) {
    write_tree("DEF", kState, "[cur_version]\nINS = 4\n");
    zel_svc_fs_update("XFV", 0);
    EXPECT_EQ(versions("INS"), "DEF 0, INS 4");
    write_tree("DEF", kState, "[broken\n");
    zel_svc_fs_update("XFV", 0);
    EXPECT_EQ(versions(), "DEF 0, XFV 0");
    EXPECT_EQ(attributes(kState), (Attributes{0644, 200, 5000, "zel-manager"}));
}

TEST_F(FsUpdate, AStateFileThatCannotBeWrittenStopsNothingElse) {
    write_tree("DEF", "/opt/file", "DEF");
    write_script("DEF", "[rel]\nversion = 2\n1_cp = /opt/file\n");
    fail("zel_platform_open", kState);
    zel_svc_fs_update("XFV", 0);
    EXPECT_EQ(read("/opt/file"), "DEF");
    EXPECT_EQ(run_log(), line("DEF/rel:1_cp"));
    EXPECT_FALSE(exists(kState));
}

// The INI library would refuse the whole file at the next start.
TEST_F(FsUpdate, ACodeThatIsNoKeyLeavesTheStateFileReadable) {
    write_script("DEF", "[rel]\nversion = 2\n");
    for (const char *code :
         {"", "=", "a=b", "a=", "#", "#a", ";a", "a\nb", "\na", "a\n", " ", " a", "a ", "\ta", "a\r"}) {
        zel_svc_fs_update(code, 0);
        EXPECT_EQ(versions(code), std::string{"DEF 2, "} + code + " -") << code;
        EXPECT_EQ(versions(), "DEF 2, XFV -") << code;
    }
}

// Whatever one byte does in front of, inside and behind a code: its version loads back, or none is kept.
TEST_F(FsUpdate, EveryOtherCodeIsAKeyOfTheStateFile) {
    write_script("DEF", "[rel]\nversion = 2\n");
    for (const char *code : {"'a'", "\"a\"", "\"", "'", "a\\", "\\", "a]", "[a]", "[a", "a:b", ":", "a#b", "a;", "a b",
                             "\xC3\xA9", "\xFF\xFE", "\x80", "\xA0", "\x01"}) {
        write(folder_of(code) + "/zel-fsupdate.ini", "[rel]\nversion = 7\n[up_1]\nversion = 8\n");
        zel_svc_fs_update(code, 0);
        EXPECT_EQ(versions(code), std::string{"DEF 2, "} + code + " 7") << code;
        zel_svc_fs_update(code, 1);
        EXPECT_EQ(versions(code), std::string{"DEF 2, "} + code + " 8") << code;
    }
}

TEST_F(FsUpdate, TheVersionIsAnIniNumber) {
    write_script("DEF", "[rel]\nversion = 0x10\n");
    write_script("XFV", "[rel]\nversion = \"12\" # twelve\n");
    zel_svc_fs_update("XFV", 0);
    EXPECT_EQ(versions(), "DEF 16, XFV 12");
}

} // namespace
