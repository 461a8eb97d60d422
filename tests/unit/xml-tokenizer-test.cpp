// Elements, their texts and end tags, as the tokenizer reports them.

#include "unit/xml-events.h"

#include <gmock/gmock.h>

using ::testing::ElementsAre;
using zel_test::parse_xml;
using namespace std::string_literals;

namespace {

std::string repeated(char byte, std::size_t count) { return std::string(count, byte); }

} // namespace

TEST(XmlTokenizer, DocumentIsReportedInOrder) {
    const auto parse = parse_xml("<a><b>one</b><c>two</c></a>");
    EXPECT_EQ(parse.result, ZEL_SVC_XML_OK);
    EXPECT_THAT(parse.events, ElementsAre("begin", "start a", "start b", "text one", "end b", "start c", "text two",
                                          "end c", "end a", "finish"));
    EXPECT_EQ(parse.position, 27);
}

TEST(XmlTokenizer, NothingIsReadBehindTheRootElement) {
    const auto parse = parse_xml("<a/><b/> junk & < more");
    EXPECT_EQ(parse.result, ZEL_SVC_XML_OK);
    EXPECT_THAT(parse.events, ElementsAre("begin", "start a", "end a", "finish"));
    EXPECT_EQ(parse.position, 4);
}

TEST(XmlTokenizer, EmptyElementHasStartAndEndAndNoText) {
    EXPECT_THAT(parse_xml("<a><b/><c /></a>").events,
                ElementsAre("begin", "start a", "start b", "end b", "start c", "end c", "end a", "finish"));
    EXPECT_THAT(parse_xml("<a></a>").events, ElementsAre("begin", "start a", "end a", "finish"));
}

TEST(XmlTokenizer, SlashOfAnEmptyElementNeedsTheBracketRightBehindIt) {
    EXPECT_EQ(parse_xml("<a/ >").result, ZEL_SVC_XML_ERR_SYNTAX);
    EXPECT_EQ(parse_xml("<a/b>").result, ZEL_SVC_XML_ERR_SYNTAX);
    EXPECT_EQ(parse_xml("<a/").result, ZEL_SVC_XML_ERR_EOF);
}

TEST(XmlTokenizer, WhiteSpaceBetweenTagsIsNoText) {
    EXPECT_THAT(parse_xml("<a> \t\r\n <b> \n </b> \n </a>").events,
                ElementsAre("begin", "start a", "start b", "end b", "end a", "finish"));
}

TEST(XmlTokenizer, LeadingWhiteSpaceOfATextIsDroppedAndTrailingIsKept) {
    EXPECT_THAT(parse_xml("<a> \t\r\n one two \r\n\t</a>").events,
                ElementsAre("begin", "start a", "text one two \r\n\t", "end a", "finish"));
}

TEST(XmlTokenizer, OtherControlBytesAreNoWhiteSpace) {
    EXPECT_THAT(parse_xml("<a>\v\f x</a>").events, ElementsAre("begin", "start a", "text \v\f x", "end a", "finish"));
    EXPECT_THAT(parse_xml("<a\v>x</a>").events, ElementsAre("begin", "start a\v", "text x", "end a", "finish"));
    EXPECT_EQ(parse_xml("\v<a/>").result, ZEL_SVC_XML_ERR_SYNTAX);
}

TEST(XmlTokenizer, TextAroundChildrenComesInPieces) {
    EXPECT_THAT(parse_xml("<a>one<b/>two<!--c-->three<![CDATA[four]]>five</a>").events,
                ElementsAre("begin", "start a", "text one", "start b", "end b", "text two", "comment c", "text three",
                            "cdata four", "text five", "end a", "finish"));
}

TEST(XmlTokenizer, TextMayHoldAnyBracketButTheOpeningOne) {
    EXPECT_THAT(parse_xml("<a>x > y ]]> \" ' / = ?</a>").events,
                ElementsAre("begin", "start a", "text x > y ]]> \" ' / = ?", "end a", "finish"));
}

TEST(XmlTokenizer, TextOfHighBytesIsUntouched) {
    EXPECT_THAT(parse_xml("<a>\xC3\xA9\xFF\x80</a>").events,
                ElementsAre("begin", "start a", "text \xC3\xA9\xFF\x80", "end a", "finish"));
}

TEST(XmlTokenizer, TextEndsAtItsFirstNul) {
    EXPECT_THAT(parse_xml("<a>one\0two</a>"s).events, ElementsAre("begin", "start a", "text one", "end a", "finish"));
    EXPECT_THAT(parse_xml("<a>&lt;\0&gt;</a>"s).events, ElementsAre("begin", "start a", "text <", "end a", "finish"));
}

TEST(XmlTokenizer, TextThatBeginsWithNulIsNone) {
    EXPECT_THAT(parse_xml("<a>\0two<b/></a>"s).events,
                ElementsAre("begin", "start a", "start b", "end b", "end a", "finish"));
    EXPECT_THAT(parse_xml("<a>  \0two</a>"s).events, ElementsAre("begin", "start a", "end a", "finish"));
}

TEST(XmlTokenizer, TextOfEveryLengthIsWhole) {
    for (std::size_t length = 1; length <= 300; ++length) {
        std::string text = repeated('x', length);
        text.back() = 'y';
        ASSERT_THAT(parse_xml("<a>" + text + "</a>").events,
                    ElementsAre("begin", "start a", "text " + text, "end a", "finish"));
    }
}

TEST(XmlTokenizer, NamesOf31BytesAreTheLongest) {
    const std::string longest = repeated('n', 31);
    const std::string too_long = repeated('n', 32);
    EXPECT_THAT(parse_xml("<" + longest + "></" + longest + ">").events,
                ElementsAre("begin", "start " + longest, "end " + longest, "finish"));
    EXPECT_THAT(parse_xml("<a><" + longest + "/></a>").events,
                ElementsAre("begin", "start a", "start " + longest, "end " + longest, "end a", "finish"));
    const auto start = parse_xml("<a><" + too_long + "></a></a>");
    EXPECT_EQ(start.result, ZEL_SVC_XML_ERR_SYNTAX);
    EXPECT_THAT(start.events, ElementsAre("begin", "start a"));
    EXPECT_EQ(parse_xml("<" + too_long + "/>").result, ZEL_SVC_XML_ERR_SYNTAX);
    EXPECT_EQ(parse_xml("<" + too_long + " />").result, ZEL_SVC_XML_ERR_SYNTAX);
    EXPECT_EQ(parse_xml("<a></" + too_long + ">").result, ZEL_SVC_XML_ERR_SYNTAX);
    EXPECT_EQ(parse_xml("<" + repeated('n', 500) + ">").result, ZEL_SVC_XML_ERR_SYNTAX);
}

TEST(XmlTokenizer, NameOfEveryLengthEndsAtEachOfItsDelimiters) {
    for (std::size_t length = 1; length <= 31; ++length) {
        const std::string name = repeated('n', length);
        for (const char *rest : {">", " >", "\t>", "\r>", "\n>", "/>", " />"})
            ASSERT_EQ(parse_xml("<" + name + rest + "<a").events.at(1), "start " + name) << length << rest;
        for (const char *rest : {">", " >", "\t>", "\r>", "\n>"})
            ASSERT_EQ(parse_xml("<a></" + name + rest).events.at(2), "end " + name) << length << rest;
    }
}

TEST(XmlTokenizer, NameMayHoldWhatIsNoDelimiterOfIt) {
    EXPECT_EQ(parse_xml("<a<b=\"?></a/b>").result, ZEL_SVC_XML_OK);
    EXPECT_THAT(parse_xml("<a<b=\"?></a/b>").events, ElementsAre("begin", "start a<b=\"?", "end a/b", "finish"));
}

TEST(XmlTokenizer, NamesOfNoByteAreSyntaxErrors) {
    for (const char *text : {"<>", "< a>", "</a>", "<a>< b/></a>", "<a></>", "<a></ a>", "<a =\"1\"/>", "<a><>"})
        EXPECT_EQ(parse_xml(text).result, ZEL_SVC_XML_ERR_SYNTAX) << text;
    EXPECT_EQ(parse_xml("<\0>"s).result, ZEL_SVC_XML_ERR_SYNTAX);
}

TEST(XmlTokenizer, RootIsNoDeclaration) {
    for (const char *text : {"<!a/>", "<!ELEMENT a>", "<![CDATA[x]]><a/>", "<!>", "<!a"}) {
        const auto parse = parse_xml(text);
        EXPECT_EQ(parse.result, ZEL_SVC_XML_ERR_SYNTAX) << text;
        EXPECT_THAT(parse.events, ElementsAre("begin")) << text;
    }
}

TEST(XmlTokenizer, EndTagNeedNotNameItsElement) {
    EXPECT_THAT(parse_xml("<a><b>x</other></a>").events,
                ElementsAre("begin", "start a", "start b", "text x", "end other", "end a", "finish"));
}

TEST(XmlTokenizer, EndTagMayHoldOneStrayByte) {
    for (const char *text : {"<a></a x>", "<a></a />", "<a></a \n<>", "<a></a >"}) {
        EXPECT_EQ(parse_xml(text).result, ZEL_SVC_XML_OK) << text;
        EXPECT_EQ(parse_xml(text).events.at(2), "end a") << text;
    }
    EXPECT_EQ(parse_xml("<a></a xy>").result, ZEL_SVC_XML_ERR_SYNTAX);
    EXPECT_EQ(parse_xml("<a></a x >").result, ZEL_SVC_XML_ERR_SYNTAX);
    EXPECT_THAT(parse_xml("<a></a xy>").events, ElementsAre("begin", "start a"));
}

TEST(XmlTokenizer, StopLeavesTheRestUnread) {
    const auto parse = parse_xml("<a><b>x</b><c>y</c></a>", "b");
    EXPECT_EQ(parse.result, ZEL_SVC_XML_STOP);
    EXPECT_THAT(parse.events, ElementsAre("begin", "start a", "start b", "text x", "end b"));
    EXPECT_EQ(parse.position, 23);
}

TEST(XmlTokenizer, StopAtTheRootReportsNoEndOfDocument) {
    EXPECT_EQ(parse_xml("<a></a>", "a").result, ZEL_SVC_XML_STOP);
    EXPECT_THAT(parse_xml("<a></a>", "a").events, ElementsAre("begin", "start a", "end a"));
}

TEST(XmlTokenizer, EmptyElementCannotStop) {
    EXPECT_EQ(parse_xml("<a><b/><c/></a>", "b").result, ZEL_SVC_XML_OK);
    EXPECT_EQ(parse_xml("<a/>", "a").events.back(), "finish");
}

TEST(XmlTokenizer, WhatCameBeforeAnErrorStays) {
    const auto parse = parse_xml("<a><b>x</b><></a>");
    EXPECT_EQ(parse.result, ZEL_SVC_XML_ERR_SYNTAX);
    EXPECT_THAT(parse.events, ElementsAre("begin", "start a", "start b", "text x", "end b"));
    EXPECT_EQ(parse.position, 12);
}

TEST(XmlTokenizer, ContentKnowsNoOtherDeclarations) {
    EXPECT_EQ(parse_xml("<a><!DOCTYPE x ></a>").result, ZEL_SVC_XML_ERR_SYNTAX);
    EXPECT_EQ(parse_xml("<a><!-x--></a>").result, ZEL_SVC_XML_ERR_SYNTAX);
    EXPECT_EQ(parse_xml("<a><![CDAT[x]]></a>").result, ZEL_SVC_XML_ERR_SYNTAX);
    EXPECT_EQ(parse_xml("<a><!").result, ZEL_SVC_XML_ERR_EOF);
}

TEST(XmlTokenizer, InstructionInContentIsReported) {
    EXPECT_THAT(parse_xml("<a><?xml data?><? t\n d ?><?t?></a>").events,
                ElementsAre("begin", "start a", "pi xml data", "pi t d ", "pi t (null)", "end a", "finish"));
}

TEST(XmlTokenizer, CommentsAndCdataAreNotDecoded) {
    EXPECT_THAT(parse_xml("<a><!--&lt;- ->--><![CDATA[&amp;<b>]]]]></a>").events,
                ElementsAre("begin", "start a", "comment &lt;- ->", "cdata &amp;<b>]]", "end a", "finish"));
    EXPECT_THAT(parse_xml("<a><!----><![CDATA[]]></a>").events,
                ElementsAre("begin", "start a", "comment ", "cdata ", "end a", "finish"));
    EXPECT_EQ(parse_xml("<a><!-->x</a>").result, ZEL_SVC_XML_ERR_EOF);
}

TEST(XmlTokenizer, InputThatEndsEarlyIsToldFromASyntaxError) {
    const std::string whole = "<?xml version=\"1.0\" encoding=\"UTF-8\" standalone='yes\"?><!--c--><!DOCTYPE d x>"
                              "<?pi data?><a x = \"1\" y='2\">t<b/><!--c--><![CDATA[d]]><?pi?><c>u</c ></a>";
    ASSERT_EQ(parse_xml(whole).result, ZEL_SVC_XML_OK);
    for (std::size_t length = 0; length < whole.size(); ++length) {
        const auto parse = parse_xml(whole.substr(0, length));
        EXPECT_EQ(parse.result, ZEL_SVC_XML_ERR_EOF) << whole.substr(0, length);
        EXPECT_NE(parse.events.back(), "finish");
    }
}

TEST(XmlTokenizer, EmptyAndBlankInputHasNoRoot) {
    EXPECT_EQ(parse_xml("").result, ZEL_SVC_XML_ERR_EOF);
    EXPECT_EQ(parse_xml(" \r\n\t ").result, ZEL_SVC_XML_ERR_EOF);
    EXPECT_THAT(parse_xml("").events, ElementsAre("begin"));
    EXPECT_EQ(parse_xml("text").result, ZEL_SVC_XML_ERR_SYNTAX);
}
