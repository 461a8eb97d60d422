#include "base/zel-svc-text.h"

#include <gtest/gtest.h>

#include <array>
#include <string>

namespace zel_test {

TEST(FixedText, TextWithoutAnAddressEmptiesTheField) {
    FixedText<10> field{"ABCDEFGHI"};
    // A view made of nothing: the sanitizers tell when its null pointer is handed to the C library.
    field.assign(std::string_view{});
    EXPECT_EQ(field.view(), "");
    EXPECT_EQ(std::string(field.data(), 10), std::string(10, '\0'));
}

TEST(FixedText, KeepsOneByteLessThanItsWidthAndNoTailOfAnEarlierText) {
    FixedText<10> field{"123456789A"};
    EXPECT_EQ(field.view(), "123456789");
    field.assign("XFV");
    EXPECT_EQ(std::string(field.data(), 10), std::string("XFV") + std::string(7, '\0'));
}

TEST(FixedText, IsCutAtAWholeCharacter) {
    EXPECT_EQ(FixedText<10>{"12345678\u00e9"}.view(), "12345678");
    EXPECT_EQ(FixedText<10>{"1234567\u00e9"}.view(), "1234567\u00e9");
    EXPECT_EQ(FixedText<10>{"1234567\u20ac"}.view(), "1234567");
    EXPECT_EQ(FixedText<10>{"123456\U0001F600"}.view(), "123456");
    EXPECT_EQ(FixedText<10>{"\U0001F600\U0001F600\U0001F600"}.view(), "\U0001F600\U0001F600");
}

TEST(FixedText, BytesThatAreNoUtf8AreCharactersOfTheirOwn) {
    EXPECT_EQ(FixedText<10>{std::string(12, '\x80')}.view(), std::string(9, '\x80'));
    EXPECT_EQ(FixedText<10>{"12345678\xc3x"}.view(), "12345678\xc3");
}

TEST(FixedText, EndsAtTheFirstNul) { EXPECT_EQ((FixedText<10>{std::string_view{"ab\0cd", 5}}.view()), "ab"); }

TEST(TextCopy, SizeOfZeroTouchesNothing) {
    std::array<char, 2> target{'x', 'y'};
    zel_svc_text_copy(target.data(), 0, "ab");
    EXPECT_EQ(std::string(target.data(), 2), "xy");
}

TEST(TextCopy, TextMayBePartOfItsTarget) {
    std::array<char, 10> target{"ABCDEFGHI"};
    zel_svc_text_copy(target.data(), target.size(), std::string_view{target.data() + 3, 6});
    EXPECT_STREQ(target.data(), "DEFGHI");
}

} // namespace zel_test
