#include "handler/zel-svc-accepts.h"

#include <gtest/gtest.h>

#include <climits>

namespace {

constexpr Word kDays[] = {{"sunday", 0}, {"monday", 1}, {"saturday", 6}};
constexpr Word kTwice[] = {{"first", 1}, {"second", 1}};
constexpr Word kAutomatic[] = {{"automatic", 1}};

TEST(Accepts, WordsStandForTheirNumbers) {
    EXPECT_EQ(zel_svc_accepts_value(words(kDays), "saturday"), 6);
    EXPECT_EQ(zel_svc_accepts_value(words(kDays), "sunday"), 0);
    for (const char *text : {"", "Sunday", "sunday ", " sunday", "sun", "6"})
        EXPECT_EQ(zel_svc_accepts_value(words(kDays), text), std::nullopt) << text;
    EXPECT_EQ(zel_svc_accepts_text(words(kDays), 6), "saturday");
    EXPECT_EQ(zel_svc_accepts_text(words(kDays), 2), std::nullopt);
}

TEST(Accepts, FirstWordOfANumberIsItsText) { EXPECT_EQ(zel_svc_accepts_text(words(kTwice), 1), "first"); }

TEST(Accepts, KeptWordsAreAcceptedButStandForNoNumber) {
    EXPECT_TRUE(zel_svc_accepts_value(kept_words(kDays), "monday").has_value());
    EXPECT_EQ(zel_svc_accepts_value(kept_words(kDays), "tuesday"), std::nullopt);
    EXPECT_EQ(zel_svc_accepts_text(kept_words(kDays), 1), std::nullopt);
}

TEST(Accepts, NumbersAreDecimal) {
    EXPECT_EQ(zel_svc_accepts_value(any_number(), "5"), 5);
    EXPECT_EQ(zel_svc_accepts_value(any_number(), " -05x"), -5);
    EXPECT_EQ(zel_svc_accepts_value(any_number(), "x"), 0);
    EXPECT_EQ(zel_svc_accepts_value(any_number(), ""), std::nullopt);
    EXPECT_EQ(zel_svc_accepts_value(any_number(), "2147483648"), INT_MAX);
    EXPECT_EQ(zel_svc_accepts_text(any_number(), -5), "-5");
}

TEST(Accepts, RangeIncludesItsEnds) {
    EXPECT_EQ(zel_svc_accepts_value(numbers(7, 11), "6"), std::nullopt);
    EXPECT_EQ(zel_svc_accepts_value(numbers(7, 11), "7"), 7);
    EXPECT_EQ(zel_svc_accepts_value(numbers(7, 11), "11"), 11);
    EXPECT_EQ(zel_svc_accepts_value(numbers(7, 11), "12"), std::nullopt);
    EXPECT_EQ(zel_svc_accepts_value(numbers(7, 11), ""), std::nullopt);
    // What the phone holds is shown as it is.
    EXPECT_EQ(zel_svc_accepts_text(numbers(7, 11), 12), "12");
}

TEST(Accepts, VolumeFillsTwoBytes) {
    EXPECT_EQ(zel_svc_accepts_value(volume(), "5"), 1285);
    EXPECT_EQ(zel_svc_accepts_value(volume(), ""), std::nullopt);
    EXPECT_EQ(zel_svc_accepts_text(volume(), 0x0503), "3");
    EXPECT_EQ(zel_svc_accepts_text(volume(), -1), "255");
}

TEST(Accepts, LanguagesAndTheWordsBesidesThem) {
    EXPECT_TRUE(zel_svc_accepts_value(language(), "english_us").has_value());
    EXPECT_TRUE(zel_svc_accepts_value(language(), "en_GB").has_value());
    EXPECT_EQ(zel_svc_accepts_value(language(), "automatic"), std::nullopt);
    EXPECT_EQ(zel_svc_accepts_value(language(kAutomatic), "automatic"), 1);
    EXPECT_EQ(zel_svc_accepts_value(language(kAutomatic), "german"), std::nullopt);
    EXPECT_EQ(zel_svc_accepts_value(language(kAutomatic), ""), std::nullopt);
}

TEST(Accepts, AnyTextIsAnyText) {
    EXPECT_TRUE(zel_svc_accepts_value(any_text(), "").has_value());
    EXPECT_TRUE(zel_svc_accepts_value(any_text(), "x").has_value());
    EXPECT_EQ(zel_svc_accepts_text(any_text(), 0), std::nullopt);
}

} // namespace
