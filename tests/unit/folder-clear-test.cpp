#include "base/zel-svc-file.h"

#include "support/files-phone.h"

#include <sys/stat.h>
#include <unistd.h>

namespace {

using ::testing::IsEmpty;
using ::testing::UnorderedElementsAre;
using zel_test::FilesPhone;

class FolderClear : public FilesPhone {};

TEST_F(FolderClear, RemovesEverythingInsideAndKeepsTheFolder) {
    write("/opt/t/folder/one", "1");
    write("/opt/t/folder/sub/two", "2");
    write("/opt/t/folder/sub/subsub/three", "3");
    add_folder("/opt/t/folder/empty");
    EXPECT_EQ(__zel_svc_config_clear_dir("/opt/t/folder", 0), 1);
    EXPECT_TRUE(exists("/opt/t/folder"));
    EXPECT_THAT(tree("/opt/t/folder"), IsEmpty());
}

TEST_F(FolderClear, RemovesTheFolderTooWhenAsked) {
    write("/opt/t/folder/sub/two", "2");
    write("/opt/t/other", "x");
    EXPECT_EQ(__zel_svc_config_clear_dir("/opt/t/folder", 1), 1);
    EXPECT_THAT(tree("/opt/t"), UnorderedElementsAre("other"));
}

TEST_F(FolderClear, RemovesTheFolderOnlyForOne) {
    write("/opt/t/folder/file", "2");
    EXPECT_EQ(__zel_svc_config_clear_dir("/opt/t/folder", 2), 1);
    EXPECT_TRUE(exists("/opt/t/folder"));
}

TEST_F(FolderClear, UnlinksLinksAndLeavesWhatTheyName) {
    write("/opt/t/elsewhere/file", "kept");
    add_folder("/opt/t/folder");
    link_to("/opt/t/elsewhere", "/opt/t/folder/to-folder");
    link_to("/opt/t/elsewhere/file", "/opt/t/folder/to-file");
    link_to("/opt/t/folder", "/opt/t/folder/to-itself");
    link_to("nothing", "/opt/t/folder/dangling");
    ASSERT_EQ(::mkfifo(on_disk("/opt/t/folder/fifo").c_str(), 0644), 0);
    EXPECT_EQ(__zel_svc_config_clear_dir("/opt/t/folder", 0), 1);
    EXPECT_THAT(tree("/opt/t/folder"), IsEmpty());
    EXPECT_EQ(read("/opt/t/elsewhere/file"), "kept");
}

TEST_F(FolderClear, EmptiesTheFolderThatALinkNames) {
    write("/opt/t/elsewhere/file", "x");
    link_to("/opt/t/elsewhere", "/opt/t/link");
    EXPECT_EQ(__zel_svc_config_clear_dir("/opt/t/link", 0), 1);
    EXPECT_THAT(tree("/opt/t"), UnorderedElementsAre("elsewhere", "link"));
}

TEST_F(FolderClear, RemovesALinkInTheFoldersPlaceAsALink) {
    write("/opt/t/elsewhere/file", "kept");
    link_to("/opt/t/elsewhere", "/opt/t/link");
    EXPECT_EQ(__zel_svc_config_clear_dir("/opt/t/link", 1), 1);
    EXPECT_THAT(tree("/opt/t"), UnorderedElementsAre("elsewhere", "elsewhere/file"));
}

TEST_F(FolderClear, OfWhatIsNoFolderDoesNothing) {
    write("/opt/t/file", "x");
    EXPECT_EQ(__zel_svc_config_clear_dir("/opt/t/file", 1), 0);
    EXPECT_EQ(__zel_svc_config_clear_dir("/opt/t/none", 1), 0);
    EXPECT_EQ(__zel_svc_config_clear_dir("/opt/t/file", 0), 0);
    EXPECT_EQ(__zel_svc_config_clear_dir(nullptr, 1), 0);
    EXPECT_EQ(read("/opt/t/file"), "x");
}

TEST_F(FolderClear, NeverEmptiesThePhone) {
    write("/opt/t/file", "x");
    link_to("/", "/opt/t/link");
    EXPECT_EQ(__zel_svc_config_clear_dir("/", 0), 0);
    EXPECT_EQ(__zel_svc_config_clear_dir("/", 1), 0);
    EXPECT_EQ(__zel_svc_config_clear_dir("/opt/..", 0), 0);
    EXPECT_EQ(__zel_svc_config_clear_dir("/opt/t/link", 0), 0);
    EXPECT_EQ(read("/opt/t/file"), "x");
}

TEST_F(FolderClear, FailsWhenTheFolderDoesNotOpen) {
    write("/opt/t/folder/file", "x");
    fail("zel_platform_open", "/opt/t/folder");
    EXPECT_EQ(__zel_svc_config_clear_dir("/opt/t/folder", 0), 0);
    EXPECT_EQ(__zel_svc_config_clear_dir("/opt/t/folder", 1), 0);
    EXPECT_TRUE(exists("/opt/t/folder/file"));
}

TEST_F(FolderClear, RemovesATreeDeeperThanAnyPath) {
    add_folder("/opt/t/folder/warm-up"); // the phone opens its own files at its first call
    EXPECT_EQ(__zel_svc_config_clear_dir("/opt/t/folder", 0), 1);
    add_deep_tree("/opt/t/folder", 5000);
    const int before = open_descriptors();
    EXPECT_EQ(__zel_svc_config_clear_dir("/opt/t/folder", 1), 1);
    EXPECT_FALSE(exists("/opt/t/folder"));
    EXPECT_EQ(open_descriptors(), before);
}

TEST_F(FolderClear, RemovesManyAndOddNames) {
    for (int i = 0; i < 2000; ++i)
        write("/opt/t/folder/" + std::to_string(i), "");
    write("/opt/t/folder/" + std::string(255, 'n'), "");
    write("/opt/t/folder/...", "");
    write("/opt/t/folder/..a/.b", "");
    write("/opt/t/folder/\xff\n", "");
    EXPECT_EQ(__zel_svc_config_clear_dir("/opt/t/folder", 0), 1);
    EXPECT_THAT(tree("/opt/t/folder"), IsEmpty());
}

} // namespace
