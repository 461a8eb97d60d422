// Each platform call of a verification and of an export fails once, in a process that goes on: nothing of that
// call is left in the next one.

#include "support/files-phone.h"
#include "support/source-dir.h"

#include <zel-svc.h>

#include <functional>
#include <map>
#include <memory>

namespace {

constexpr const char *kDocument = "/opt/system/zel-default/output/customer-phone.xml";
constexpr const char *kReport = "/opt/system/zel-default/output/zel-verification-report.log";
constexpr const char *kEarlier = "an earlier one\n";

struct Call {
    std::string function;
    std::string text;
    int number; // among those of this function and text
};

// A phone with one item of each kind, and with what only services hold.
class NextCall : public zel_test::FilesPhone {
  protected:
    void SetUp() override {
        FilesPhone::SetUp();
        call("package", {{"folder", zel_test::source_dir() + "/tests/scenarios/faults-verification/package"}});
        zel_svc_config_set_pre_config_for_config_mode("TST");
        call("bookmarks-add", {{"title", "A"}, {"url", "http://a.example/"}, {"folder", "News"}});
        call("sync-accounts-add", {{"name", "Work"}});
    }

    std::vector<Call> calls_of(const std::function<void()> &work) {
        call("journal-start");
        work();
        call("journal-stop");
        std::vector<Call> calls;
        std::map<std::pair<std::string, std::string>, int> seen;
        const auto journal = call("journal-list"); // the loop needs it to the end
        for (const auto &entry : journal.at("calls")) {
            const bool has_text = entry.at("text").is_string() && entry.at("function") != "__dlog_print";
            Call one{entry.at("function"), has_text ? entry.at("text").get<std::string>() : "", 0};
            one.number = ++seen[{one.function, one.text}];
            calls.push_back(one);
        }
        return calls;
    }

    // Does the work with each of its calls failed, and then once more; the other function looks at the latter.
    void fail_each_call(const std::function<void()> &work, const std::function<void()> &expect_whole) {
        work(); // what the first call makes, the second one finds
        const std::vector<Call> calls = calls_of(work);
        EXPECT_GT(calls.size(), 40U);
        const int descriptors = open_descriptors();
        for (const Call &failed : calls) {
            SCOPED_TRACE(failed.function + " " + failed.text + " #" + std::to_string(failed.number));
            fail(failed.function, failed.text, failed.number, 1);
            work();
            EXPECT_GE(call("fault-list").at("faults").at(0).at("seen"), failed.number) << "it did not happen";
            call("fault-clear");
            work();
            expect_whole();
        }
        EXPECT_EQ(open_descriptors(), descriptors);
    }

    std::unique_ptr<ZelSvcVerificationResult[]> results_ =
        std::make_unique<ZelSvcVerificationResult[]>(ZEL_SVC_MAX_RESULTS);
};

} // namespace

TEST_F(NextCall, OfAVerificationIsWholeAgain) {
    int result = 0;
    int count = 0;
    const auto verify = [&] { result = zel_svc_config_verification(results_.get(), &count); };
    verify();
    ASSERT_EQ(result, 1);
    ASSERT_EQ(count, 54);
    const std::string whole = read(kReport);
    fail_each_call(verify, [&] {
        EXPECT_EQ(result, 1);
        EXPECT_EQ(count, 54);
        EXPECT_EQ(read(kReport), whole);
    });
}

TEST_F(NextCall, OfTheImeiToolIsWholeAgain) {
    int result = -1;
    char line[306] = "";
    const auto verify = [&] { result = zel_svc_config_verification_for_imei(line, sizeof line); };
    fail_each_call(verify, [&] {
        EXPECT_EQ(result, 0);
        EXPECT_STREQ(line, "");
    });
}

TEST_F(NextCall, OfAnExportIsWholeAgain) {
    ASSERT_EQ(zel_svc_config_encoding_xml(), 1);
    const std::string whole = read(kDocument);
    int result = -1;
    const auto export_it = [&] {
        write(kDocument, kEarlier);
        result = zel_svc_config_encoding_xml();
        EXPECT_FALSE(exists(std::string{kDocument} + ".new"));
        EXPECT_EQ(read(kDocument) == kEarlier, result == 0) << "an earlier document stays when there is no new one";
    };
    fail_each_call(export_it, [&] {
        EXPECT_EQ(result, 1);
        EXPECT_EQ(read(kDocument), whole);
    });
}
