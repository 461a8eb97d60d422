// Verifications around a thousand lines, which is what a list holds.

#include "service-phone.h"
#include "support/lines.h"

#include <gmock/gmock.h>

#include <memory>

namespace {

using ::testing::HasSubstr;

constexpr const char *kGpsKey = "db/location/setting/GpsEnabled";
constexpr std::size_t kHead = 8; // lines of a report in front of its list

class VerificationLimit : public zel_test::ServicePhone {
  protected:
    void SetUp() override {
        ServicePhone::SetUp();
        set_string("db/zel/salescode", "BTU");
        set_int(kGpsKey, 1);
    }

    // Two application lines come first, so `lines` - 2 values are compared, of which the last is `last`.
    void write_values(int lines, const std::string &all, const std::string &last) {
        std::string elements;
        for (int i = 2; i < lines - 1; ++i)
            elements += "<GPSActivation>" + all + "</GPSActivation>";
        write_customer("BTU", "<GPS>" + elements + "<GPSActivation>" + last + "</GPSActivation></GPS>");
    }

    int count() {
        int count = -1;
        EXPECT_EQ(zel_svc_config_verification(results_.get(), &count), 1);
        return count;
    }
    int failed_for_imei() { return zel_svc_config_verification_for_imei(line_, sizeof line_); }

    std::vector<std::string> report() {
        return zel_test::lines_of(read("/opt/system/zel-default/output/zel-verification-report.log"));
    }
    // The report's list is the caller's, line by line.
    void expect_listed(int count) {
        const std::vector<std::string> lines = report();
        ASSERT_EQ(lines.size(), kHead + static_cast<std::size_t>(count));
        for (std::size_t i = 0; i < static_cast<std::size_t>(count); ++i) {
            const ZelSvcVerificationResult &result = results_[i];
            ASSERT_EQ(lines[kHead + i], std::string{result.text} + (result.passed == 1 ? " ==> Pass" : " ==> Failure"));
        }
    }

    // With guards on both sides of the thousand entries.
    std::unique_ptr<ZelSvcVerificationResult[]> results_ =
        std::make_unique<ZelSvcVerificationResult[]>(ZEL_SVC_MAX_RESULTS + 1);
    char line_[306] = "";
};

} // namespace

TEST_F(VerificationLimit, OfGoodValuesListsThemUpToAThousand) {
    results_[ZEL_SVC_MAX_RESULTS].passed = -7;
    for (const auto &[lines, kept] : {std::pair{999, 999}, {1000, 1000}, {1001, 1000}}) {
        write_values(lines, "on", "on");
        EXPECT_EQ(count(), kept);
        expect_listed(kept);
        EXPECT_EQ(report()[3], "Verification Result : OK!");
        EXPECT_EQ(report()[5], "Pass count : " + std::to_string(kept));
        EXPECT_EQ(report()[6], "Failure count : 0");
        EXPECT_EQ(results_[ZEL_SVC_MAX_RESULTS].passed, -7) << "behind the list nothing is written";
        EXPECT_EQ(failed_for_imei(), 0);
        EXPECT_STREQ(line_, "");
    }
}

TEST_F(VerificationLimit, OfALastValueThatFailsTellsItThoughTheListHasLostIt) {
    for (const auto &[lines, kept, listed] : {std::tuple{999, 999, 1}, {1000, 1000, 1}, {1001, 1000, 0}}) {
        write_values(lines, "on", "off");
        EXPECT_EQ(count(), kept);
        expect_listed(kept);
        EXPECT_EQ(results_[static_cast<std::size_t>(kept) - 1].passed, 1 - listed);
        EXPECT_EQ(report()[3], "Verification Result : NOT OK!");
        EXPECT_EQ(report()[5], "Pass count : " + std::to_string(kept - 1));
        EXPECT_EQ(report()[6], "Failure count : 1");
        EXPECT_EQ(failed_for_imei(), listed) << "the IMEI tool's answer counts what is in the list";
        EXPECT_STREQ(line_, listed == 1 ? "[Spec][GPS/GPSActivation] Spec='off',Phone='on'" : "");
    }
}

// A thousand values are kept for the count, 998 of them find room in the list behind the applications' lines.
TEST_F(VerificationLimit, OfFailuresAloneCountsNoMoreThanTheListHolds) {
    for (const auto &[lines, kept, failed] :
         {std::tuple{999, 999, 997}, {1000, 1000, 998}, {1001, 1000, 999}, {1002, 1000, 1000}, {1003, 1000, 1000}}) {
        write_values(lines, "off", "off");
        EXPECT_EQ(count(), kept);
        expect_listed(kept);
        EXPECT_EQ(report()[5], "Pass count : " + std::to_string(kept - failed));
        EXPECT_EQ(report()[6], "Failure count : " + std::to_string(failed));
        EXPECT_EQ(failed_for_imei(), kept - 2);
    }
}
