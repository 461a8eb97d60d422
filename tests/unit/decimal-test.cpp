#include "base/zel-svc-decimal.h"

#include <gtest/gtest.h>

#include <clocale>

namespace {

struct Reading {
    const char *text;
    std::int32_t number;
};

constexpr std::int32_t kLargest = 2147483647;
constexpr std::int32_t kSmallest = -2147483647 - 1;

constexpr Reading kReadings[] = {
    {"2.5", 2500},
    {"0", 0},
    {"10", 10000},
    {"32.3", 32300}, // 32299.999... as a binary fraction times 1000
    {"1.001", 1001},
    {"4.35", 4350},
    {"0.0009999", 0},
    {"0.0019999", 1},
    {".5", 500},
    {"5.", 5000},
    {"-2.5", -2500},
    {"-0.0009", 0},
    {"+7", 7000},
    {" \t\n\v\f\r3", 3000},
    {"1e3", 1000000},
    {"1E+1", 10000},
    {"12345e-4", 1234},
    {"1e-3", 1},
    {"1e-4", 0},
    {"1e", 1000}, // no exponent without a digit
    {"1e+", 1000},
    {"1ee2", 1000},
    {"2.5s", 2500},
    {"2,5", 2000},
    {"1.2.3", 1200},
    {"0x10", 0},
    {"inf", 0},
    {"nan", 0},
    {"ten", 0},
    {"", 0},
    {" ", 0},
    {".", 0},
    {"-", 0},
    {"-.", 0},
    {".e5", 0},
    {"+-1", 0},
    {"2147483.647", kLargest},
    {"2147483.648", kLargest},
    {"-2147483.648", kSmallest},
    {"-2147483.649", kSmallest},
    {"99999999999999999999", kLargest},
    {"-1e99", kSmallest},
    {"1e999999999999999999", kLargest},
    {"0e999999999999999999", 0},
    {"1e-999999999999999999", 0},
    {"0.00000000000000000000000000000000000000000000000025e49", 2500},
};

TEST(Thousandths, AreCutFromTheExactDecimalText) {
    for (const Reading &reading : kReadings)
        EXPECT_EQ(zel_svc_thousandths_from_text(reading.text), reading.number) << reading.text;
}

TEST(Thousandths, EndWithTheirText) {
    const std::string_view text = "12345";
    EXPECT_EQ(zel_svc_thousandths_from_text(text.substr(0, 2)), 12000);
    EXPECT_EQ(zel_svc_thousandths_from_text({}), 0);
}

TEST(Thousandths, LongTextsAreReadInFull) {
    const std::string zeros(100'000, '0');
    EXPECT_EQ(zel_svc_thousandths_from_text(zeros + "2.5" + zeros), 2500);
    EXPECT_EQ(zel_svc_thousandths_from_text("0." + zeros + "25e100001"), 2500);
}

struct Showing {
    std::int32_t thousandths;
    const char *text;
};

constexpr Showing kShowings[] = {
    {0, "0"},
    {1, "0.001"},
    {2500, "2.5"},
    {30000, "30"},
    {32300, "32.3"},
    {100, "0.1"},
    {-2500, "-2.5"},
    {999999, "999.999"},
    {1234567, "1234.57"},
    {1000000000, "1e+06"},
    {12, "0.012"},
    {16777217, "16777.2"},
    {kLargest, "2.14748e+06"},
};

TEST(Decimals, AreCutToTheirWholeNumber) {
    const Reading readings[] = {
        {"7", 7},
        {"-7", -7},
        {"2.9", 2},
        {"-2.9", -2},
        {"1.0e-05", 0},
        {"1.0e+3", 1000},
        {"1.0e+19", kLargest},
        {"-1.0e+19", kSmallest},
        {"word", 0},
        {"", 0},
        {"2147483647.9", kLargest},
        {"2147483648", kLargest},
        {"-2147483649", kSmallest},
    };
    for (const Reading &reading : readings)
        EXPECT_EQ(zel_svc_whole_from_text(reading.text), reading.number) << reading.text;
}

TEST(Thousandths, AreShownInSixDigits) {
    for (const Showing &showing : kShowings)
        EXPECT_EQ(zel_svc_thousandths_text(showing.thousandths), showing.text);
}

} // namespace
