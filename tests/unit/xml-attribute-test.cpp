// Attributes of start tags and the entities in them.

#include "unit/xml-events.h"

#include <gmock/gmock.h>

using zel_test::parse_xml;
using namespace std::string_literals;

namespace {

// The start event of an element with these attributes, or the result when the tag is refused.
std::string start_with(const std::string &attributes) {
    const auto parse = parse_xml("<a" + attributes + ">");
    return parse.events.size() > 1 ? parse.events.at(1) : "result " + std::to_string(parse.result);
}

} // namespace

TEST(XmlAttributes, KeepTheirOrder) {
    EXPECT_EQ(start_with(" z=\"1\" a=\"2\" z=\"3\""), "start a z=1 a=2 z=3");
    EXPECT_EQ(start_with(""), "start a");
}

TEST(XmlAttributes, OfOneElementAreNotThoseOfTheNext) {
    const auto parse = parse_xml("<a x=\"1\"><b/><c y=\"2\"/></a>");
    EXPECT_THAT(parse.events, testing::ElementsAre("begin", "start a x=1", "start b", "end b", "start c y=2", "end c",
                                                   "end a", "finish"));
}

TEST(XmlAttributes, WhiteSpaceAroundThemIsFree) {
    EXPECT_EQ(start_with(" \n x \t=\r\n \"1\"y=\"2\"\tz=\"3\" "), "start a x=1 y=2 z=3");
    EXPECT_EQ(parse_xml("<a x=\"1\"/>").events.at(1), "start a x=1");
    EXPECT_EQ(parse_xml("<a x=\"1\" />").events.at(1), "start a x=1");
}

TEST(XmlAttributes, NeedAnEqualsSignAndAQuotedValue) {
    EXPECT_EQ(start_with(" x"), "result 2"); // the bracket belongs to the name
    EXPECT_EQ(start_with(" x >"), "result 1");
    EXPECT_EQ(start_with(" x y=\"1\""), "result 1");
    EXPECT_EQ(start_with(" x=1"), "result 1");
    EXPECT_EQ(start_with(" x=>"), "result 1");
    EXPECT_EQ(start_with(" =\"1\""), "result 1");
}

TEST(XmlAttributes, ByteInPlaceOfTheQuoteIsRead) {
    EXPECT_EQ(parse_xml("<a x=1>").position, 6);
    EXPECT_EQ(parse_xml("<a x~").position, 5);
}

TEST(XmlAttributes, DoubleQuoteEndsAValueWhicheverQuoteBeganIt) {
    EXPECT_EQ(start_with(" x='1\" y='a'b\""), "start a x=1 y=a'b");
    EXPECT_EQ(start_with(" x='1' y=\"2\" z=\"3\""), "result 1"); // x is: 1' y=
    EXPECT_EQ(start_with(" x=\"it's\""), "start a x=it's");
}

TEST(XmlAttributes, QuoteRightBehindTheOpeningOneIsAnEmptyValue) {
    EXPECT_EQ(start_with(" x=\"\" y='\""), "start a x= y=");
    EXPECT_EQ(start_with(" x=''\""), "start a x='");
}

TEST(XmlAttributes, InputThatEndsInsideAValueEndsEarly) {
    for (const char *text : {"<a x=", "<a x=\"", "<a x='", "<a x=\"1", "<a x='1", "<a x='1'", "<a x=\"1\"", "<a x"})
        EXPECT_EQ(parse_xml(text).result, ZEL_SVC_XML_ERR_EOF) << text;
}

TEST(XmlAttributes, LastByteOfTheInputMayBeAnyClosingQuote) {
    // The value is complete, so its length is looked at before the input is found to end.
    EXPECT_EQ(parse_xml("<?xml version='1234567890'").result, ZEL_SVC_XML_ERR_SYNTAX);
    EXPECT_EQ(parse_xml("<?xml version='123456789'").result, ZEL_SVC_XML_ERR_EOF);
    EXPECT_EQ(parse_xml("<?xml version='1234567890").result, ZEL_SVC_XML_ERR_EOF);
}

TEST(XmlAttributes, EntitiesInValuesAreDecoded) {
    EXPECT_EQ(start_with(" x=\"&lt;&amp;&gt;&quot;&#10;&apos;\""), "start a x=<&>\"\n&apos;");
    EXPECT_EQ(start_with(" x=\"&amp;lt;\""), "start a x=<");
}

TEST(XmlAttributes, NamesAreNotDecodedAndMayBeLong) {
    EXPECT_EQ(start_with(" &lt;=\"1\""), "start a &lt;=1");
    const std::string name(100, 'n');
    EXPECT_EQ(start_with(" " + name + "=\"1\""), "start a " + name + "=1");
    EXPECT_EQ(start_with(" x>y/z=\"1\""), "start a x>y/z=1");
}

TEST(XmlAttributes, TextsEndAtTheirFirstNul) {
    EXPECT_EQ(start_with(" x\0y=\"1\0002\" z=\"\0\""s), "start a x=1 z=");
    EXPECT_EQ(start_with(" \0y=\"1\""s), "result 1");
}

TEST(XmlAttributes, MayBeManyAndLarge) {
    std::string attributes;
    std::string expected = "start a";
    for (int number = 0; number < 2000; ++number) {
        const std::string value(static_cast<std::size_t>(number % 700), static_cast<char>('a' + number % 26));
        attributes += " n" + std::to_string(number) + "=\"" + value + "\"";
        expected += " n" + std::to_string(number) + "=" + value;
    }
    attributes += " last=\"" + std::string(70000, 'x') + "\"";
    expected += " last=" + std::string(70000, 'x');
    EXPECT_EQ(start_with(attributes), expected);
}

TEST(XmlAttributes, ValueOver65535BytesIsPassedAsItIsWritten) {
    const std::string fits = "&lt;" + std::string(65531, 'x');
    EXPECT_EQ(start_with(" v=\"" + fits + "\""), "start a v=<" + std::string(65531, 'x'));
    EXPECT_EQ(start_with(" v=\"" + fits + "x\""), "start a v=" + fits + "x");
}
