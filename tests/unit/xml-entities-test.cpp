// The entity decoder and the replace-all routine.

#include "spec/zel-svc-xml.h"
#include "unit/xml-events.h"

#include <cstdlib>
#include <gtest/gtest.h>
#include <memory>
#include <optional>

using zel_test::parse_xml;

namespace {

std::optional<std::string> taken(char *text) {
    if (!text) return std::nullopt;
    const std::unique_ptr<char, decltype(&std::free)> owner{text, &std::free};
    return std::string{text};
}

std::optional<std::string> decoded(const std::string &text) { return taken(zel_svc_xml_decode_entities(text.c_str())); }

std::optional<std::string> replaced(const char *text, const char *from, const char *to) {
    return taken(zel_svc_str_replace_all(text, from, to));
}

std::string text_of(const std::string &text) { return parse_xml("<a>" + text + "</a>").events.at(2); }

} // namespace

TEST(XmlEntities, FiveAreKnown) {
    EXPECT_EQ(decoded("1&amp;2&#10;3&lt;4&gt;5&quot;6"), "1&2\n3<4>5\"6");
    EXPECT_EQ(decoded("&lt;&lt;&gt;&gt;"), "<<>>");
}

TEST(XmlEntities, OthersStayAsTheyAre) {
    EXPECT_EQ(decoded("&apos;&#65;&#x0A;&#010;&nbsp;&LT;&lt &;&&"), "&apos;&#65;&#x0A;&#010;&nbsp;&LT;&lt &;&&");
    EXPECT_EQ(decoded("&"), "&");
    EXPECT_EQ(decoded("&am"), "&am");
    EXPECT_EQ(decoded(""), "");
}

TEST(XmlEntities, AmpersandsAreDecodedBeforeTheOthers) {
    EXPECT_EQ(decoded("&amp;lt;"), "<");
    EXPECT_EQ(decoded("&amp;gt;"), ">");
    EXPECT_EQ(decoded("&amp;quot;"), "\"");
    EXPECT_EQ(decoded("&amp;#10;"), "\n");
    EXPECT_EQ(decoded("&amp;amp;"), "&amp;");
    EXPECT_EQ(decoded("&amp;amp;lt;"), "&amp;lt;");
    EXPECT_EQ(decoded("&&amp;amp;"), "&&amp;");
}

TEST(XmlEntities, EachIsDecodedThroughTheWholeTextBeforeTheNext) {
    EXPECT_EQ(decoded("&l&#10;t;"), "&l\nt;");
    EXPECT_EQ(decoded("&gt;&lt;&amp;gt;"), "><>");
    EXPECT_EQ(decoded("&#1&amp;0;"), "&#1&0;");
}

TEST(XmlEntities, TextOver65535BytesIsNotDecoded) {
    const std::string fits = "&lt;" + std::string(65531, 'x');
    EXPECT_EQ(decoded(fits), "<" + std::string(65531, 'x'));
    EXPECT_EQ(decoded(fits + "x"), std::nullopt);
    EXPECT_EQ(taken(zel_svc_xml_decode_entities(nullptr)), std::nullopt);
}

TEST(XmlEntities, LongTextOfAnElementIsPassedWholeAsItIsWritten) {
    const std::string fits = "&lt;" + std::string(65531, 'x');
    EXPECT_EQ(text_of(fits), "text <" + std::string(65531, 'x'));
    EXPECT_EQ(text_of(fits + "x"), "text " + fits + "x");
    EXPECT_EQ(text_of(std::string(200000, 'y')), "text " + std::string(200000, 'y'));
}

TEST(XmlEntities, TextsOfElementsAreDecodedWhereverTheyStand) {
    EXPECT_EQ(text_of("&lt;"), "text <");
    EXPECT_EQ(text_of("&amp;lt;"), "text <");
    EXPECT_EQ(text_of("AT&amp;T"), "text AT&T");
    for (std::size_t front = 0; front < 70; ++front)
        EXPECT_EQ(text_of(std::string(front, 'x') + "&gt;y"), "text " + std::string(front, 'x') + ">y");
}

TEST(ReplaceAll, ReplacesEveryOccurrenceFromTheLeft) {
    EXPECT_EQ(replaced("a-b-c", "-", "+"), "a+b+c");
    EXPECT_EQ(replaced("aaaaa", "aa", "b"), "bba");
    EXPECT_EQ(replaced("aaa", "a", "aa"), "aaaaaa");
    EXPECT_EQ(replaced("xyx", "xyx", "z"), "z");
    EXPECT_EQ(replaced("ab", "abc", "z"), "ab");
    EXPECT_EQ(replaced("plain", "&", "&amp;"), "plain");
    EXPECT_EQ(replaced("", "a", "b"), "");
}

TEST(ReplaceAll, NothingToSearchOrToPutIsAFailure) {
    EXPECT_EQ(replaced(nullptr, "a", "b"), std::nullopt);
    EXPECT_EQ(replaced("a", nullptr, "b"), std::nullopt);
    EXPECT_EQ(replaced("a", "a", nullptr), std::nullopt);
    EXPECT_EQ(replaced("a", "", "b"), std::nullopt);
    EXPECT_EQ(replaced("a", "a", ""), std::nullopt);
}

TEST(ReplaceAll, TextsAndResultsOver65535BytesFail) {
    const std::string longest(65535, 'a');
    EXPECT_EQ(replaced(longest.c_str(), "b", "c"), longest);
    EXPECT_EQ(replaced(longest.c_str(), "a", "c"), std::string(65535, 'c'));
    EXPECT_EQ(replaced((longest + "a").c_str(), "b", "c"), std::nullopt);
    EXPECT_EQ(replaced(std::string(32767, 'a').c_str(), "a", "bb"), std::string(65534, 'b'));
    EXPECT_EQ(replaced(std::string(32768, 'a').c_str(), "a", "bb"), std::nullopt);
    EXPECT_EQ(replaced("a", "a", longest.c_str()), longest);
    EXPECT_EQ(replaced("aa", "a", longest.c_str()), std::nullopt);
}
