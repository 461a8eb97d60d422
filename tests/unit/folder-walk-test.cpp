#include "base/zel-svc-folder-walk.h"

#include "base/zel-svc-file.h"
#include "support/files-phone.h"

#include <fcntl.h>
#include <unistd.h>

namespace {

using zel_test::FilesPhone;
using Step = ZelSvcFolderWalk::Step;
using ::testing::ElementsAre;
using ::testing::UnorderedElementsAre;

class FolderWalk : public FilesPhone {
  protected:
    // What a walk into every folder tells: "+" for an entry, "-" for a folder that it left.
    static std::vector<std::string> told(const char *path) {
        std::vector<std::string> steps;
        ZelSvcFolderWalk walk{path};
        for (Step step = walk.next(); step != Step::End; step = walk.next()) {
            steps.push_back((step == Step::Entry ? "+" : "-") + walk.below());
            if (step == Step::Entry && walk.is_folder()) walk.enter();
        }
        return steps;
    }
};

TEST_F(FolderWalk, TellsAFolderBeforeAndAfterItsContent) {
    write("/opt/t/a/b/c", "x");
    EXPECT_THAT(told("/opt/t"), ElementsAre("+a", "+a/b", "+a/b/c", "-a/b", "-a"));
}

TEST_F(FolderWalk, PassesOverAFolderThatIsNotEntered) {
    write("/opt/t/a/b", "x");
    ZelSvcFolderWalk walk{"/opt/t"};
    EXPECT_EQ(walk.next(), Step::Entry);
    EXPECT_EQ(walk.name(), "a");
    EXPECT_EQ(walk.next(), Step::End);
    EXPECT_EQ(walk.next(), Step::End);
}

TEST_F(FolderWalk, GoesOnInTheFolderAbove) {
    write("/opt/t/a/1", "x");
    write("/opt/t/b/1", "x");
    write("/opt/t/c", "x");
    EXPECT_THAT(told("/opt/t"), UnorderedElementsAre("+a", "+a/1", "-a", "+b", "+b/1", "-b", "+c"));
}

TEST_F(FolderWalk, DoesNotFollowLinks) {
    write("/opt/t/a/1", "x");
    link_to("..", "/opt/t/a/up");
    link_to("/opt/t/a", "/opt/t/a/self");
    EXPECT_THAT(told("/opt/t"), UnorderedElementsAre("+a", "+a/1", "+a/up", "+a/self", "-a"));
}

TEST_F(FolderWalk, DoesNotEnterALinkThatTookTheFoldersPlace) {
    write("/opt/t/a/1", "x");
    write("/opt/other/2", "x");
    ZelSvcFolderWalk walk{"/opt/t"};
    ASSERT_EQ(walk.next(), Step::Entry);
    ASSERT_EQ(::rename(on_disk("/opt/t/a").c_str(), on_disk("/opt/gone").c_str()), 0);
    link_to("/opt/other", "/opt/t/a");
    EXPECT_FALSE(walk.enter());
}

TEST_F(FolderWalk, EndsWhenTheFolderThatItIsInWasMoved) {
    write("/opt/t/a/1", "x");
    write("/opt/t/b", "x");
    ZelSvcFolderWalk walk{"/opt/t"};
    while (walk.next() != Step::End && walk.name() != "a") {
    }
    ASSERT_TRUE(walk.enter());
    ASSERT_EQ(walk.next(), Step::Entry);
    ASSERT_EQ(::rename(on_disk("/opt/t/a").c_str(), on_disk("/opt/system/a").c_str()), 0);
    EXPECT_EQ(walk.next(), Step::End);
    EXPECT_EQ(walk.next(), Step::End);
}

TEST_F(FolderWalk, OfWhatIsNoFolderHasNoSteps) {
    write("/opt/t/file", "x");
    EXPECT_FALSE(ZelSvcFolderWalk{"/opt/t/file"});
    EXPECT_FALSE(ZelSvcFolderWalk{"/opt/t/none"});
    EXPECT_FALSE(ZelSvcFolderWalk{nullptr});
    EXPECT_EQ(ZelSvcFolderWalk{"/opt/t/none"}.next(), Step::End);
}

TEST_F(FolderWalk, NeedsOneDescriptorInADeepTree) {
    add_folder("/opt/t");
    add_deep_tree("/opt/t", 2000);
    EXPECT_EQ(__zel_svc_config_file_exists("/opt/t"), 1); // the phone opens its own files at its first call
    const int before = open_descriptors();
    int deepest = 0;
    int most_open = 0;
    ZelSvcFolderWalk walk{"/opt/t"};
    int depth = 0;
    for (Step step = walk.next(); step != Step::End; step = walk.next()) {
        depth += step == Step::Leave ? -1 : 0;
        if (step == Step::Entry && walk.is_folder() && walk.enter()) deepest = std::max(deepest, ++depth);
        most_open = depth % 500 == 0 ? std::max(most_open, open_descriptors()) : most_open;
    }
    EXPECT_EQ(deepest, 2000);
    EXPECT_LE(most_open, before + 1);
    EXPECT_EQ(depth, 0);
    ASSERT_EQ(__zel_svc_config_clear_dir("/opt/t", 1), 1);
}

} // namespace
