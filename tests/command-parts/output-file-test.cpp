// Files that the user names: whole or as they were.

#include "output-file.h"

#include "support/bench-phone.h"

#include <gmock/gmock.h>

#include <csignal>
#include <filesystem>
#include <fstream>
#include <iterator>

#include <sys/resource.h>
#include <sys/stat.h>

namespace {

namespace fs = std::filesystem;
using ::testing::UnorderedElementsAre;
using zel_command::write_file;

struct OutputFile : testing::Test {
    OutputFile() : folder{zel_test::make_folder()} {}
    ~OutputFile() override { zel_test::remove_folder(folder); }

    static std::string content_of(const std::string &path) {
        std::ifstream file{path, std::ios::binary};
        return {std::istreambuf_iterator<char>{file}, {}};
    }
    static void put(const std::string &path, const std::string &content) {
        std::ofstream{path, std::ios::binary} << content;
    }
    static unsigned mode_of(const std::string &path) {
        struct stat found {};
        return stat(path.c_str(), &found) == 0 ? found.st_mode & 07777U : 0;
    }
    [[nodiscard]] std::vector<std::string> names() const {
        std::vector<std::string> result;
        for (const auto &entry : fs::directory_iterator{folder})
            result.push_back(entry.path().filename());
        return result;
    }

    std::string folder;
};

} // namespace

TEST_F(OutputFile, IsMadeAsTheUsersMaskSays) {
    umask(027);
    EXPECT_EQ(write_file(folder + "/a", std::string{"x\0y", 3}), "");
    EXPECT_EQ(content_of(folder + "/a"), (std::string{"x\0y", 3}));
    EXPECT_EQ(mode_of(folder + "/a"), 0640U);
    EXPECT_THAT(names(), UnorderedElementsAre("a"));
}

TEST_F(OutputFile, OfAnEarlierOneKeepsModeAndLinks) {
    put(folder + "/a", "an earlier text");
    fs::permissions(folder + "/a", static_cast<fs::perms>(0604));
    fs::create_symlink("a", folder + "/link");
    EXPECT_EQ(write_file(folder + "/link", "new"), "");
    EXPECT_TRUE(fs::is_symlink(folder + "/link"));
    EXPECT_EQ(content_of(folder + "/a"), "new");
    EXPECT_EQ(mode_of(folder + "/a"), 0604U);
    EXPECT_THAT(names(), UnorderedElementsAre("a", "link"));
}

TEST_F(OutputFile, ThatDoesNotFitLeavesTheEarlierOne) {
    put(folder + "/a", "an earlier text");
    std::signal(SIGXFSZ, SIG_IGN);
    rlimit limit{};
    ASSERT_EQ(getrlimit(RLIMIT_FSIZE, &limit), 0);
    limit.rlim_cur = 1000;
    ASSERT_EQ(setrlimit(RLIMIT_FSIZE, &limit), 0);
    EXPECT_EQ(write_file(folder + "/a", std::string(1001, 'x')), "File too large");
    EXPECT_EQ(write_file(folder + "/b", std::string(1001, 'x')), "File too large");
    EXPECT_EQ(content_of(folder + "/a"), "an earlier text");
    EXPECT_THAT(names(), UnorderedElementsAre("a")) << "nothing half written is left";
}

TEST_F(OutputFile, SaysWhyItFailed) {
    EXPECT_EQ(write_file(folder + "/missing/a", "x"), "No such file or directory");
    EXPECT_EQ(write_file(folder, "x"), "Is a directory");
    EXPECT_EQ(write_file("/dev/full", "x"), "No space left on device");
    EXPECT_EQ(write_file("/dev/null", "x"), "");
    EXPECT_TRUE(fs::is_character_file("/dev/null"));
    EXPECT_EQ(write_file("", "x"), "No such file or directory");
}
