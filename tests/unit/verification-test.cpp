// The lines of a verification.

#include "spec/zel-svc-verification.h"

#include <gtest/gtest.h>
#include <string>

TEST(VerificationResults, LinesKeepTheirOrderAndFlags) {
    zel_svc_verification_add_result("[GPS/GPSActivation] Spec='on',Phone='on'", true);
    zel_svc_verification_add_result("[GPS/GPSActivation] Spec='on',Phone='off'", false);
    EXPECT_EQ(zel_svc_verification_count(), 2);
    EXPECT_STREQ(zel_svc_verification_line(0), "[GPS/GPSActivation] Spec='on',Phone='on'");
    EXPECT_EQ(zel_svc_verification_flag(0), 1);
    EXPECT_STREQ(zel_svc_verification_line(1), "[GPS/GPSActivation] Spec='on',Phone='off'");
    EXPECT_EQ(zel_svc_verification_flag(1), 0);
    EXPECT_EQ(zel_svc_verification_line(2), nullptr);
}

TEST(VerificationResults, ComparedValuesMakeALine) {
    zel_svc_verification_add_compared("Profile3/APN", "internet", "??", false);
    EXPECT_STREQ(zel_svc_verification_line(0), "[Profile3/APN] Spec='internet',Phone='?\?'");
    EXPECT_EQ(zel_svc_verification_flag(0), 0);
}

TEST(VerificationResults, EmptyLineChangesNothing) {
    zel_svc_verification_add_result("", false);
    zel_svc_verification_add_result(std::string_view("\0text", 5), false);
    EXPECT_EQ(zel_svc_verification_count(), 0);
    EXPECT_EQ(zel_svc_verification_flag(0), 1);
}

TEST(VerificationResults, LinesAreCutTo305Bytes) {
    zel_svc_verification_add_result(std::string(400, 'x'), true);
    EXPECT_EQ(zel_svc_verification_line(0), std::string(305, 'x'));
    zel_svc_verification_add_result(std::string(305, 'y'), true);
    EXPECT_EQ(zel_svc_verification_line(1), std::string(305, 'y'));
    // A cut falls on a whole character.
    std::string crossing(304, 'z');
    crossing += "\xC3\xA9";
    zel_svc_verification_add_result(crossing, true);
    EXPECT_EQ(zel_svc_verification_line(2), std::string(304, 'z'));
}

TEST(VerificationResults, LineBehindTheThousandthIsLost) {
    for (int line = 0; line < 1000; ++line)
        zel_svc_verification_add_result(std::to_string(line), true);
    zel_svc_verification_add_result("one more", false);
    EXPECT_EQ(zel_svc_verification_count(), 1000);
    EXPECT_STREQ(zel_svc_verification_line(999), "999");
    EXPECT_EQ(zel_svc_verification_flag(999), 1);
}

TEST(VerificationResults, ClearingEmptiesEverySlot) {
    for (int line = 0; line < 1000; ++line)
        zel_svc_verification_add_result("failed", false);
    zel_svc_verification_clear_results();
    EXPECT_EQ(zel_svc_verification_count(), 0);
    for (std::size_t slot = 0; slot < 1000; ++slot) {
        EXPECT_EQ(zel_svc_verification_line(slot), nullptr);
        EXPECT_EQ(zel_svc_verification_flag(slot), 1);
    }
    zel_svc_verification_add_result("again", false);
    EXPECT_STREQ(zel_svc_verification_line(0), "again");
}
