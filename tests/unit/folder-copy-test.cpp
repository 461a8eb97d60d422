#include "base/zel-svc-file.h"

#include "support/files-phone.h"

#include <sys/stat.h>
#include <unistd.h>

namespace {

using ::testing::UnorderedElementsAre;
using zel_test::Attributes;
using zel_test::FilesPhone;

class FolderCopy : public FilesPhone {
  protected:
    void SetUp() override {
        FilesPhone::SetUp();
        add_folder("/opt/t/source");
        add_folder("/opt/t/target");
    }
};

TEST_F(FolderCopy, HoldsAllFilesOfAllLevels) {
    write("/opt/t/source/one", "1");
    write("/opt/t/source/sub/two", "2");
    write("/opt/t/source/sub/subsub/three", "3");
    add_folder("/opt/t/source/empty");
    EXPECT_EQ(__zel_svc_config_copy_dir("/opt/t/source", "/opt/t/target"), 1);
    EXPECT_THAT(tree("/opt/t/target"),
                UnorderedElementsAre("one", "sub", "sub/two", "sub/subsub", "sub/subsub/three", "empty"));
    EXPECT_EQ(read("/opt/t/target/one"), "1");
    EXPECT_EQ(read("/opt/t/target/sub/two"), "2");
    EXPECT_EQ(read("/opt/t/target/sub/subsub/three"), "3");
}

TEST_F(FolderCopy, OverwritesFilesAndKeepsOthers) {
    write("/opt/t/source/sub/both", "new");
    write("/opt/t/target/sub/both", "old and longer");
    write("/opt/t/target/sub/other", "kept");
    EXPECT_EQ(__zel_svc_config_copy_dir("/opt/t/source", "/opt/t/target"), 1);
    EXPECT_EQ(read("/opt/t/target/sub/both"), "new");
    EXPECT_EQ(read("/opt/t/target/sub/other"), "kept");
}

TEST_F(FolderCopy, GivesNewFoldersTheAttributesOfTheirSource) {
    write("/opt/t/source/sub/inner/file", "x");
    give("/opt/t/source/sub", {.mode = 0711, .uid = 301, .gid = 302, .label = "outer"});
    give("/opt/t/source/sub/inner", {.mode = 0555, .uid = 303, .gid = 304, .label = "inner"});
    EXPECT_EQ(__zel_svc_config_copy_dir("/opt/t/source", "/opt/t/target"), 1);
    EXPECT_EQ(attributes("/opt/t/target/sub"), (Attributes{.mode = 0711, .uid = 301, .gid = 302, .label = "outer"}));
    EXPECT_EQ(attributes("/opt/t/target/sub/inner"),
              (Attributes{.mode = 0555, .uid = 303, .gid = 304, .label = "inner"}));
    EXPECT_EQ(read("/opt/t/target/sub/inner/file"), "x") << "a read-only folder is filled first";
    ::chmod(on_disk("/opt/t/target/sub/inner").c_str(), 0755); // lets the phone be removed by any user
    ::chmod(on_disk("/opt/t/source/sub/inner").c_str(), 0755);
}

TEST_F(FolderCopy, LeavesTheAttributesOfFoldersThatWereThere) {
    write("/opt/t/source/sub/file", "x");
    add_folder("/opt/t/target/sub");
    give("/opt/t/source/sub", {.mode = 0711, .uid = 301, .gid = 302, .label = "of-the-source"});
    give("/opt/t/target/sub", {.mode = 0755, .uid = 401, .gid = 402, .label = "of-the-target"});
    give("/opt/t/target", {.mode = 0755, .uid = 403, .gid = 404, .label = "top"});
    EXPECT_EQ(__zel_svc_config_copy_dir("/opt/t/source", "/opt/t/target"), 1);
    EXPECT_EQ(attributes("/opt/t/target/sub"),
              (Attributes{.mode = 0755, .uid = 401, .gid = 402, .label = "of-the-target"}));
    EXPECT_EQ(attributes("/opt/t/target"), (Attributes{.mode = 0755, .uid = 403, .gid = 404, .label = "top"}));
    EXPECT_EQ(read("/opt/t/target/sub/file"), "x");
}

TEST_F(FolderCopy, CarriesTheFixedTimeOnItsFiles) {
    ::setenv("TZ", "UTC0", 1);
    write("/opt/t/source/sub/file", "x");
    EXPECT_EQ(__zel_svc_config_copy_dir("/opt/t/source", "/opt/t/target"), 1);
    EXPECT_EQ(status_of("/opt/t/target/sub/file").st_mtim.tv_sec, 1388534401);
}

TEST_F(FolderCopy, OntoItselfIsRefused) {
    write("/opt/t/source/file", "x");
    link_to("/opt/t/source", "/opt/t/link");
    EXPECT_EQ(__zel_svc_config_copy_dir("/opt/t/source", "/opt/t/source"), 0);
    EXPECT_EQ(__zel_svc_config_copy_dir("/opt/t/source", "/opt/t/source/"), 0);
    EXPECT_EQ(__zel_svc_config_copy_dir("/opt/t/source", "/opt/t/link"), 0);
    EXPECT_EQ(__zel_svc_config_copy_files("/opt/t/source", "/opt/t/link"), 0);
    EXPECT_EQ(read("/opt/t/source/file"), "x");
}

TEST_F(FolderCopy, OfWhatDoesNotOpenIsRefused) {
    write("/opt/t/file", "x");
    EXPECT_EQ(__zel_svc_config_copy_dir("/opt/t/none", "/opt/t/target"), 0);
    EXPECT_EQ(__zel_svc_config_copy_dir("/opt/t/file", "/opt/t/target"), 0);
    EXPECT_EQ(__zel_svc_config_copy_files("/opt/t/none", "/opt/t/target"), 0);
    EXPECT_EQ(__zel_svc_config_copy_dir(nullptr, "/opt/t/target"), 0);
    EXPECT_EQ(__zel_svc_config_copy_dir("/opt/t/source", nullptr), 0);
    fail("zel_platform_open", "/opt/t/source");
    EXPECT_EQ(__zel_svc_config_copy_dir("/opt/t/source", "/opt/t/target"), 0);
}

TEST_F(FolderCopy, DoesNotMakeItsTarget) {
    write("/opt/t/source/file", "x");
    write("/opt/t/source/sub/file", "x");
    EXPECT_EQ(__zel_svc_config_copy_dir("/opt/t/source", "/opt/t/none"), 1);
    EXPECT_FALSE(exists("/opt/t/none"));
}

TEST_F(FolderCopy, GoesOnBehindAFileThatFails) {
    write("/opt/t/source/bad", "x");
    write("/opt/t/source/good", "y");
    fail("zel_platform_open", "/opt/t/source/bad");
    EXPECT_EQ(__zel_svc_config_copy_dir("/opt/t/source", "/opt/t/target"), 1);
    EXPECT_THAT(tree("/opt/t/target"), UnorderedElementsAre("good"));
}

TEST_F(FolderCopy, CopiesALinkToAFileAsTheFile) {
    write("/opt/t/elsewhere/file", "content");
    link_to("/opt/t/elsewhere/file", "/opt/t/source/link");
    EXPECT_EQ(__zel_svc_config_copy_dir("/opt/t/source", "/opt/t/target"), 1);
    EXPECT_TRUE(S_ISREG(status_of("/opt/t/target/link").st_mode));
    EXPECT_EQ(read("/opt/t/target/link"), "content");
}

TEST_F(FolderCopy, SkipsLinksToFoldersDanglingLinksAndSpecialFiles) {
    write("/opt/t/elsewhere/file", "content");
    link_to("/opt/t/elsewhere", "/opt/t/source/to-folder");
    link_to("/opt/t/source", "/opt/t/source/to-itself");
    link_to("/opt/t/nothing", "/opt/t/source/dangling");
    link_to("loop", "/opt/t/source/loop");
    ASSERT_EQ(::mkfifo(on_disk("/opt/t/source/fifo").c_str(), 0644), 0);
    write("/opt/t/source/file", "x");
    EXPECT_EQ(__zel_svc_config_copy_dir("/opt/t/source", "/opt/t/target"), 1);
    EXPECT_THAT(tree("/opt/t/target"), UnorderedElementsAre("file"));
}

TEST_F(FolderCopy, IntoItselfEnds) {
    write("/opt/t/source/file", "x");
    write("/opt/t/source/sub/file", "y");
    add_folder("/opt/t/source/sub/target");
    EXPECT_EQ(__zel_svc_config_copy_dir("/opt/t/source", "/opt/t/source/sub/target"), 1);
    EXPECT_THAT(tree("/opt/t/source"), UnorderedElementsAre("file", "sub", "sub/file", "sub/target", "sub/target/file",
                                                            "sub/target/sub", "sub/target/sub/file"));
}

// The target's "x" leads into the source, where every folder that the copy makes would be met again.
TEST_F(FolderCopy, IntoItselfThroughALinkInTheTargetEnds) {
    write("/opt/t/source/x/deep/file", "y");
    link_to("/opt/t/source/x/deep", "/opt/t/target/x");
    EXPECT_EQ(__zel_svc_config_copy_dir("/opt/t/source", "/opt/t/target"), 1);
    EXPECT_THAT(tree("/opt/t/source"),
                UnorderedElementsAre("x", "x/deep", "x/deep/file", "x/deep/deep", "x/deep/deep/file"));
}

TEST_F(FolderCopy, OntoTheTopOfThePhone) {
    write("/opt/t/source/opt/t/fresh/file", "x");
    EXPECT_EQ(__zel_svc_config_copy_dir("/opt/t/source", "/"), 1);
    EXPECT_EQ(read("/opt/t/fresh/file"), "x");
}

TEST_F(FolderCopy, TakesNamesOfAnyBytesAndTheLongest) {
    const std::string longest(255, 'n');
    const std::string odd = "\x01 \xff\"'\n%s";
    write("/opt/t/source/" + longest + "/" + longest, "x");
    write("/opt/t/source/" + odd, "y");
    EXPECT_EQ(__zel_svc_config_copy_dir("/opt/t/source", "/opt/t/target"), 1);
    EXPECT_EQ(read("/opt/t/target/" + longest + "/" + longest), "x");
    EXPECT_EQ(read("/opt/t/target/" + odd), "y");
}

// Deeper than a path can name: what a path reaches is copied, and the copy ends with its descriptors closed.
TEST_F(FolderCopy, OfAVeryDeepTreeEnds) {
    add_deep_tree("/opt/t/source", 3000);
    add_folder("/opt/t/warm/up"); // the phone opens its own files at its first calls
    EXPECT_EQ(__zel_svc_config_copy_dir("/opt/t/warm", "/opt/t/target"), 1);
    const int before = open_descriptors();
    EXPECT_EQ(__zel_svc_config_copy_dir("/opt/t/source", "/opt/t/target"), 1);
    EXPECT_EQ(open_descriptors(), before);
    EXPECT_TRUE(exists("/opt/t/target/d/d/d/d/d/d/d/d/file"));
    EXPECT_GT(depth_of("/opt/t/target"), 1000);
    EXPECT_EQ(__zel_svc_config_clear_dir("/opt/t/source", 1), 1);
    EXPECT_EQ(__zel_svc_config_clear_dir("/opt/t/target", 1), 1);
}

TEST_F(FolderCopy, FlatOneSkipsSubfolders) {
    write("/opt/t/source/file", "1");
    write("/opt/t/source/sub/file", "2");
    write("/opt/t/target/sub/other", "3");
    EXPECT_EQ(__zel_svc_config_copy_files("/opt/t/source", "/opt/t/target"), 1);
    EXPECT_THAT(tree("/opt/t/target"), UnorderedElementsAre("file", "sub", "sub/other"));
}

class FolderLike : public FolderCopy {};

TEST_F(FolderLike, IsMadeWithTheAttributesOfTheOther) {
    give("/opt/t/source", {.mode = 0711, .uid = 301, .gid = 302, .label = "of-the-source"});
    EXPECT_EQ(__zel_svc_config_create_dir_like("/opt/t/source", "/opt/t/new"), 1);
    EXPECT_EQ(attributes("/opt/t/new"), (Attributes{.mode = 0711, .uid = 301, .gid = 302, .label = "of-the-source"}));
    EXPECT_THAT(tree("/opt/t/new"), ::testing::IsEmpty());
}

TEST_F(FolderLike, IsDoneAndLeftAloneWhenItIsThere) {
    give("/opt/t/source", {.mode = 0711, .uid = 301, .gid = 302, .label = "of-the-source"});
    give("/opt/t/target", {.mode = 0755, .uid = 401, .gid = 402, .label = "of-the-target"});
    EXPECT_EQ(__zel_svc_config_create_dir_like("/opt/t/source", "/opt/t/target"), 1);
    EXPECT_EQ(attributes("/opt/t/target"),
              (Attributes{.mode = 0755, .uid = 401, .gid = 402, .label = "of-the-target"}));
}

TEST_F(FolderLike, IsNotMadeWithoutSourceOrAboveAMissingFolder) {
    write("/opt/t/file", "x");
    EXPECT_EQ(__zel_svc_config_create_dir_like("/opt/t/none", "/opt/t/new"), 0);
    EXPECT_EQ(__zel_svc_config_create_dir_like("/opt/t/file", "/opt/t/new"), 0);
    EXPECT_EQ(__zel_svc_config_create_dir_like("/opt/t/source", "/opt/t/none/new"), 0);
    EXPECT_EQ(__zel_svc_config_create_dir_like("/opt/t/source", "/opt/t/file"), 0);
    EXPECT_EQ(__zel_svc_config_create_dir_like(nullptr, "/opt/t/new"), 0);
    EXPECT_EQ(__zel_svc_config_create_dir_like("/opt/t/source", nullptr), 0);
    EXPECT_FALSE(exists("/opt/t/new"));
}

} // namespace
