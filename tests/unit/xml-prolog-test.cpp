// What stands in front of the root element.

#include "unit/xml-events.h"

#include <gmock/gmock.h>

using ::testing::ElementsAre;
using zel_test::parse_xml;
using namespace std::string_literals;

namespace {

std::string event_of(const std::string &prolog) {
    const auto parse = parse_xml(prolog + "<a/>");
    return parse.result == ZEL_SVC_XML_OK && parse.events.size() > 4 ? parse.events.at(1)
                                                                     : "result " + std::to_string(parse.result);
}

} // namespace

TEST(XmlProlog, ItemsMayComeInAnyOrderAndAgain) {
    EXPECT_THAT(parse_xml(" <!--one--> <?xml version=\"1.0\"?>\n<!DOCTYPE d x>\n<?p q?><!--two--><?xml "
                          "version=\"1.1\"?><a/>")
                    .events,
                ElementsAre("begin", "comment one", "xml 1.0,,", "type d x", "pi p q", "comment two", "xml 1.1,,",
                            "start a", "end a", "finish"));
}

TEST(XmlProlog, DeclarationHasThreeValues) {
    EXPECT_EQ(event_of("<?xml version=\"1.0\" encoding=\"UTF-8\" standalone=\"yes\"?>"), "xml 1.0,UTF-8,yes");
    EXPECT_EQ(event_of("<?xml version=\"1.0\" standalone=\"no\" encoding=\"UTF-8\"?>"), "xml 1.0,UTF-8,no");
    EXPECT_EQ(event_of("<?xml version=\"\"?>"), "xml ,,");
    EXPECT_EQ(event_of("<?xml version=\"1\" encoding=\"first\" encoding=\"2nd\"?>"), "xml 1,2nd,");
}

TEST(XmlProlog, WhiteSpaceIsFreeAroundEveryEqualsSignAndBehindEveryValue) {
    EXPECT_EQ(event_of("<?xml\n\tversion \r\n = \t\"1.0\" \n encoding\t= \"UTF-8\"\nstandalone =\n\"yes\" \t ?>"),
              "xml 1.0,UTF-8,yes");
    EXPECT_EQ(event_of("<?xmlversion=\"1.0\"encoding=\"UTF-8\"standalone=\"yes\"?>"), "xml 1.0,UTF-8,yes");
}

TEST(XmlProlog, DeclarationValuesOf9BytesAreTheLongest) {
    EXPECT_EQ(event_of("<?xml version=\"123456789\" encoding=\"abcdefghi\" standalone=\"ABCDEFGHI\"?>"),
              "xml 123456789,abcdefghi,ABCDEFGHI");
    EXPECT_EQ(event_of("<?xml version=\"1234567890\"?>"), "result 1");
    EXPECT_EQ(event_of("<?xml version=\"1\" encoding=\"ISO-8859-1\"?>"), "result 1");
    EXPECT_EQ(event_of("<?xml version=\"1\" standalone=\"1234567890\"?>"), "result 1");
}

TEST(XmlProlog, DeclarationNamesAreExactAndItsVersionComesFirst) {
    for (const char *prolog : {"<?xml?>", "<?xml encoding=\"x\"?>", "<?xml Version=\"1.0\"?>", "<?xml versio=\"1\"?>",
                               "<?xml version=\"1\" Encoding=\"x\"?>", "<?xml version=\"1\" encodinG=\"x\"?>",
                               "<?xml version=\"1\" x=\"y\"?>", "<?xml version=\"1\" version=\"2\"?>",
                               "<?xml version=\"1\"? >", "<?xml version\"1\"?>", "<?xml version=1?>",
                               "<?xml-stylesheet href=\"x\"?>", "<?xSLT?>", "<?xml version=\"1\">"})
        EXPECT_EQ(event_of(prolog), "result 1") << prolog;
}

TEST(XmlProlog, SingleQuotedDeclarationValueRunsToTheNextDoubleQuote) {
    EXPECT_EQ(event_of("<?xml version='1.0\"?>"), "xml 1.0,,");
    EXPECT_EQ(event_of("<?xml version='1.0' encoding=\"x\"?>"), "result 1");
}

TEST(XmlProlog, DocumentTypeIsItsNameAndTheRest) {
    EXPECT_EQ(event_of("<!DOCTYPE spec SYSTEM \"x.dtd\">"), "type spec SYSTEM \"x.dtd\"");
    EXPECT_EQ(event_of("<!DOCTYPE\n spec \t >"), "type spec (null)");
    EXPECT_EQ(event_of("<!DOCTYPE spec \0x>"s), "type spec ");
    EXPECT_EQ(event_of("<!DOCTYPE " + std::string(31, 'n') + " x>"), "type " + std::string(31, 'n') + " x");
    EXPECT_EQ(event_of("<!DOCTYPE " + std::string(32, 'n') + " x>"), "result 1");
    EXPECT_EQ(event_of("<!DOCTYP spec x>"), "result 1");
    EXPECT_EQ(event_of("<!Doctype spec x>"), "result 1");
}

TEST(XmlProlog, OnlyWhiteSpaceEndsADocumentTypesName) {
    EXPECT_EQ(event_of("<!DOCTYPE a/b=? x>"), "type a/b=? x");
    // The bracket belongs to the name, so the rest takes the root element's tag with it.
    EXPECT_THAT(parse_xml("<!DOCTYPE a>\n<b><c/>").events,
                ElementsAre("begin", "type a> <b", "start c", "end c", "finish"));
}

TEST(XmlProlog, DocumentTypeEndsAtItsFirstBracket) {
    EXPECT_EQ(parse_xml("<!DOCTYPE d [<!ENTITY e \"x\">]><a/>").result, ZEL_SVC_XML_ERR_SYNTAX);
    EXPECT_EQ(parse_xml("<!DOCTYPE d [<!ENTITY e \"x\">]><a/>").events.at(1), "type d [<!ENTITY e \"x\"");
}

TEST(XmlProlog, InstructionHasATargetAndPerhapsData) {
    EXPECT_EQ(event_of("<?target some data?>"), "pi target some data");
    EXPECT_EQ(event_of("<? target  \n data ?>"), "pi target data ");
    EXPECT_EQ(event_of("<?target?>"), "pi target (null)");
    EXPECT_EQ(event_of("<?target  ?>"), "pi target (null)");
    EXPECT_EQ(event_of("<?target?x?>"), "pi target ?x");
    EXPECT_EQ(event_of("<?t a > b ? > c?\?>"), "pi t a > b ? > c?");
    EXPECT_EQ(event_of("<? xml version?>"), "pi xml version");
    EXPECT_EQ(event_of("<?" + std::string(31, 't') + " d?>"), "pi " + std::string(31, 't') + " d");
    EXPECT_EQ(event_of("<?" + std::string(32, 't') + " d?>"), "result 1");
    EXPECT_EQ(event_of("<?\?>"), "result 1");
    EXPECT_EQ(event_of("<? ?>"), "result 1");
}

TEST(XmlProlog, CommentsNeedTheirWholeOpening) {
    EXPECT_EQ(event_of("<!--a-b--c -->"), "comment a-b--c ");
    EXPECT_EQ(event_of("<!--a\0b-->"s), "comment a");
    EXPECT_EQ(event_of("<!-a-->"), "result 1");
    EXPECT_EQ(parse_xml("<!-- <a/>").result, ZEL_SVC_XML_ERR_EOF);
}

TEST(XmlProlog, TextInFrontOfTheRootIsASyntaxError) {
    EXPECT_EQ(parse_xml("x<a/>").result, ZEL_SVC_XML_ERR_SYNTAX);
    EXPECT_EQ(parse_xml("<!--c-->x<a/>").result, ZEL_SVC_XML_ERR_SYNTAX);
    EXPECT_EQ(parse_xml("\xEF\xBB\xBF<a/>").result, ZEL_SVC_XML_ERR_SYNTAX);
    EXPECT_EQ(parse_xml("\xEF\xBB\xBF<a/>").position, 0);
}
