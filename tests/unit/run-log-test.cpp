#include "base/zel-svc-run-log.h"

#include "base/zel-svc-observer.h"
#include "support/files-phone.h"
#include "zel-svc.h"

#include <csignal>
#include <sys/resource.h>

namespace {

using zel_test::Attributes;
using zel_test::FilesPhone;

constexpr const char *kPath = "/opt/system/zel-default/output/zel-config.log";

class Listener : public ZelSvcObserver {
  public:
    void run_log_line(std::string_view line) override { lines.emplace_back(line); }
    std::vector<std::string> lines;
};

class RunLog : public FilesPhone {};

TEST_F(RunLog, TakesTextsAsTheyAreOneBehindTheOther) {
    EXPECT_EQ(zel_svc_config_print_log_file("one\n"), 1);
    EXPECT_EQ(zel_svc_config_print_log_file("100 %s %n without an end"), 1);
    EXPECT_EQ(zel_svc_config_print_log_file(""), 1);
    EXPECT_EQ(zel_svc_config_print_log_file("\n"), 1);
    EXPECT_EQ(read(kPath), "one\n100 %s %n without an end\n");
}

TEST_F(RunLog, KeepsWhatItHeld) {
    write(kPath, "before\n");
    EXPECT_EQ(zel_svc_config_print_log_file("now\n"), 1);
    EXPECT_EQ(read(kPath), "before\nnow\n");
}

TEST_F(RunLog, GetsItsAttributesWithEveryText) {
    write(kPath, "", 0600);
    EXPECT_EQ(zel_svc_config_print_log_file("x\n"), 1);
    EXPECT_EQ(attributes(kPath), (Attributes{.mode = 0644, .uid = 200, .gid = 5000, .label = "*"}));
}

TEST_F(RunLog, WithoutItsFolderIsNotWritten) {
    ASSERT_EQ(::rename(on_disk("/opt/system/zel-default/output").c_str(), on_disk("/opt/moved").c_str()), 0);
    EXPECT_EQ(zel_svc_config_print_log_file("x\n"), 0);
    EXPECT_FALSE(exists(kPath));
}

TEST_F(RunLog, ThatDoesNotOpenIsNotWritten) {
    fail("zel_platform_open", kPath);
    EXPECT_EQ(zel_svc_config_print_log_file("x\n"), 0);
    EXPECT_FALSE(exists(kPath));
}

TEST_F(RunLog, OnAFullDiskFails) {
    write(kPath, std::string(1 << 20, 'x'));
    std::signal(SIGXFSZ, SIG_IGN);
    const rlimit limit = {.rlim_cur = 1 << 20, .rlim_max = RLIM_INFINITY};
    ASSERT_EQ(::setrlimit(RLIMIT_FSIZE, &limit), 0);
    EXPECT_EQ(zel_svc_config_print_log_file("y\n"), 0);
    EXPECT_EQ(read(kPath), std::string(1 << 20, 'x'));
}

TEST_F(RunLog, WithoutATextIsLeftAlone) {
    EXPECT_EQ(zel_svc_config_print_log_file(nullptr), 0);
    EXPECT_FALSE(exists(kPath));
}

TEST_F(RunLog, TakesFormattedLinesOfAnyLength) {
    zel_svc_run_log("[Config] SIM slot count=%d.\n", 2);
    zel_svc_run_log("%s\n", std::string(100'000, 'y').c_str());
    zel_svc_run_log("%s", "");
    EXPECT_EQ(read(kPath), "[Config] SIM slot count=2.\n" + std::string(100'000, 'y') + "\n");
}

TEST_F(RunLog, TellsItsListenerOfEveryLineWrittenOrNot) {
    Listener listener;
    EXPECT_EQ(zel_svc_set_observer(&listener), nullptr);
    zel_svc_config_print_log_file("one\n");
    fail("zel_platform_open", kPath);
    zel_svc_run_log("two %d\n", 2);
    EXPECT_EQ(zel_svc_set_observer(nullptr), &listener);
    zel_svc_config_print_log_file("three\n");
    EXPECT_THAT(listener.lines, ::testing::ElementsAre("one\n", "two 2\n"));
}

} // namespace
