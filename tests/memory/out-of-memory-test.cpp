// Verification and export while the phone runs out of memory: one request of the library is refused at a time.
// Each path of calls that leads to a request is tried twice, with its first and its last one: there are some
// hundred of them, and several times as many requests.

#include "memory/failing-memory.h"
#include "support/files-phone.h"
#include "support/lines.h"
#include "support/source-dir.h"

#include <zel-svc.h>

#include <algorithm>

namespace {

using ::testing::AnyOf;
using ::testing::EndsWith;
using zel_test::Asked;
using zel_test::lines_of;

constexpr const char *kDocument = "/opt/system/zel-default/output/customer-phone.xml";
constexpr const char *kReport = "/opt/system/zel-default/output/zel-verification-report.log";
constexpr const char *kEarlier = "an earlier document";

ZelSvcVerificationResult gResults[ZEL_SVC_MAX_RESULTS];

// What a verification gave: its result, its list and its report.
struct Verified {
    int result = -1;
    std::vector<std::string> lines; // with "+" for a passed one and "-" for a failed one in front
    std::string report;             // empty: none

    friend bool operator==(const Verified &, const Verified &) = default;
};

// A phone with one item of each kind, installed by its package, and with what only services hold.
class OutOfMemory : public zel_test::FilesPhone {
  protected:
    void SetUp() override {
        FilesPhone::SetUp();
        call("package", {{"folder", zel_test::source_dir() + "/tests/scenarios/faults-verification/package"}});
        zel_svc_config_set_pre_config_for_config_mode("TST");
        call("bookmarks-add", {{"title", "A & B"}, {"url", "http://a.example/"}, {"folder", "News"}});
        call("sync-accounts-add", {{"name", "Work"}});
        set_int("file/private/wifi/sleep_policy", 0); // what the package says is another one
    }

    std::string exported() {
        EXPECT_EQ(zel_svc_config_encoding_xml(), 1);
        return read(kDocument);
    }

    Verified seen_after(int result, int count) {
        Verified verified{.result = result};
        for (int i = 0; i < count; ++i)
            verified.lines.push_back((gResults[i].passed == 1 ? "+" : "-") + std::string{gResults[i].text});
        if (exists(kReport)) verified.report = read(kReport);
        return verified;
    }
    Verified verified() {
        int count = -1;
        const int result = zel_svc_config_verification(gResults, &count);
        return seen_after(result, count);
    }
};

bool is_in(const std::string &line, const std::vector<std::string> &lines) {
    return std::find(lines.begin(), lines.end(), line) != lines.end();
}

// A report holds its seven lines of head, an empty one, and the list.
void expect_consistent(const Verified &verified) {
    const std::vector<std::string> report = lines_of(verified.report);
    ASSERT_EQ(report.size(), 8 + verified.lines.size());
    EXPECT_THAT(report[0], AnyOf("ZEL Version : TST0001A1B2C3D4E", "ZEL Version : Q0000NXBBBB1"));
    EXPECT_THAT(report[1], AnyOf("Sales code : TST", "Sales code : "));
    for (std::size_t i = 0; i < verified.lines.size(); ++i) {
        const bool passed = verified.lines[i].front() == '+';
        EXPECT_EQ(report[8 + i], verified.lines[i].substr(1) + (passed ? " ==> Pass" : " ==> Failure"));
    }
}

} // namespace

TEST_F(OutOfMemory, AnExportIsWholeOrLeavesTheEarlierDocument) {
    exported();
    const std::string whole = exported();
    const int descriptors = open_descriptors();
    int none = 0;
    int result = -1;
    const auto export_it = [&] { result = zel_svc_config_encoding_xml(); };
    for (const int place : zel_test::requests_of_library(export_it)) {
        SCOPED_TRACE(place);
        write(kDocument, kEarlier);
        const Asked asked = zel_test::refuse_one(place, export_it);
        EXPECT_NE(asked, Asked::Nobody);
        const std::string document = read(kDocument);
        if (result == 0) {
            EXPECT_EQ(document, kEarlier);
        } else if (asked == Asked::Library) {
            EXPECT_EQ(document, whole);
        } else {
            EXPECT_THAT(document, EndsWith("</CustomerData>\n"));
        }
        EXPECT_FALSE(exists(std::string{kDocument} + ".new"));
        none += result == 0 ? 1 : 0;
        EXPECT_EQ(exported(), whole);
    }
    EXPECT_GT(none, 50);
    EXPECT_EQ(open_descriptors(), descriptors);
}

TEST_F(OutOfMemory, AVerificationLosesLinesAndPassesNone) {
    verified();
    const Verified whole = verified();
    const int descriptors = open_descriptors();
    int incomplete = 0;
    int result = -1;
    int count = -1;
    const auto verify = [&] { result = zel_svc_config_verification(gResults, &count); };
    for (const int place : zel_test::requests_of_library(verify)) {
        SCOPED_TRACE(place);
        EXPECT_NE(zel_test::refuse_one(place, verify), Asked::Nobody);
        const Verified left = seen_after(result, count);
        if (result == 0) {
            EXPECT_EQ(left.report, "");
        } else {
            expect_consistent(left);
        }
        for (const std::string &line : left.lines) {
            EXPECT_TRUE(line.front() == '-' || is_in(line, whole.lines)) << line;
        }
        incomplete += left == whole ? 0 : 1;
        EXPECT_EQ(verified(), whole);
    }
    EXPECT_GT(incomplete, 100);
    EXPECT_EQ(open_descriptors(), descriptors);
}

TEST_F(OutOfMemory, TheImeiToolsAnswerIsACountWithItsFirstLine) {
    char line[306] = "";
    EXPECT_EQ(zel_svc_config_verification_for_imei(line, sizeof line), 1);
    const std::string whole = line;
    EXPECT_EQ(whole, "[Spec][WiFi/SleepPolicy] Spec='never',Phone='always'");
    int result = -1;
    const auto verify = [&] { result = zel_svc_config_verification_for_imei(line, sizeof line); };
    for (const int place : zel_test::requests_of_library(verify)) {
        SCOPED_TRACE(place);
        EXPECT_NE(zel_test::refuse_one(place, verify), Asked::Nobody);
        const std::string first = line;
        const bool has_line = first.starts_with("[") || (result == 1 && first == "Pre-configuration not found!");
        EXPECT_TRUE(result == 0 ? first.empty() : has_line) << result << " " << first;
        verify();
        EXPECT_EQ(result, 1);
        EXPECT_EQ(line, whole);
    }
}
