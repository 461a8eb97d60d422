// Elements written with what their handlers give out.

#include "dispatch/recording-table.h"
#include "spec/zel-svc-element-dispatcher.h"
#include "spec/zel-svc-element-stack.h"
#include "spec/zel-svc-encode-writer.h"
#include "spec/zel-svc-parse-context.h"

#include <gmock/gmock.h>

using ::testing::ElementsAre;
using ::testing::IsEmpty;

namespace {

struct EncodeWriter : ::testing::Test {
    EncodeWriter() {
        geZelSvcParseAction = ZEL_SVC_PARSE_ACTION_ENCODE;
        geZelSvcParseMode = ZEL_SVC_PARSE_MODE_HEADER;
    }
    static void gives(const std::string &call, const std::string &given) { zel_test::export_texts()[call] = given; }

    ZelSvcEncodeText text;
    ZelSvcEncodeWriter writer{text};
};

} // namespace

TEST_F(EncodeWriter, HeaderIsTheMarkAndTheDeclaration) {
    writer.header();
    EXPECT_EQ(text.view(), "\xEF\xBB\xBF<?xml version=\"1.0\" encoding=\"UTF-8\" ?>\n");
    EXPECT_EQ(text.view().size(), 43U) << "42 bytes and the line feed";
}

TEST_F(EncodeWriter, LeafIsOneLineWithTheHandlersValue) {
    gives("value GPSActivation", "on");
    writer.leaf(ZEL_SVC_ELEMENT_GPS_ACTIVATION);
    EXPECT_EQ(text.view(), "<GPSActivation>on</GPSActivation>\n");
    EXPECT_THAT(zel_test::call_texts(), ElementsAre("start GPSActivation", "value GPSActivation", "end GPSActivation"));
}

TEST_F(EncodeWriter, LeafWithoutAValueAsksForNone) {
    gives("value AlarmTone", "a value");
    writer.empty_leaf(ZEL_SVC_ELEMENT_ALARM_TONE);
    EXPECT_EQ(text.view(), "<AlarmTone></AlarmTone>\n");
    EXPECT_THAT(zel_test::call_texts(), ElementsAre("start AlarmTone", "end AlarmTone"));
}

TEST_F(EncodeWriter, WhatAStartHandlerGivesIsTheTagsAttributeText) {
    gives("start AlarmTone", "src=\"/a & b\"");
    writer.empty_leaf(ZEL_SVC_ELEMENT_ALARM_TONE);
    EXPECT_EQ(text.view(), "<AlarmTone src=\"/a & b\"></AlarmTone>\n") << "written as it is";
}

TEST_F(EncodeWriter, ContainersIndentWhatIsInThemByTwoBlanks) {
    writer.open(ZEL_SVC_ELEMENT_CUSTOMER_DATA);
    writer.open(ZEL_SVC_ELEMENT_GPS);
    writer.leaf(ZEL_SVC_ELEMENT_GPS_ACTIVATION);
    writer.close(ZEL_SVC_ELEMENT_GPS);
    writer.open(ZEL_SVC_ELEMENT_DISPLAY);
    writer.close(ZEL_SVC_ELEMENT_DISPLAY);
    writer.close(ZEL_SVC_ELEMENT_CUSTOMER_DATA);
    EXPECT_EQ(text.view(), "<CustomerData>\n"
                           "  <GPS>\n"
                           "    <GPSActivation></GPSActivation>\n"
                           "  </GPS>\n"
                           "  <Display>\n"
                           "  </Display>\n"
                           "</CustomerData>\n");
    EXPECT_EQ(zel_svc_element_get_current_id(), ZEL_SVC_ELEMENT_NONE);
}

TEST_F(EncodeWriter, EscapesAmpersandsAndNothingElse) {
    gives("value QAURL", "a&b&&<c> \"d\" 'e' &amp;");
    writer.leaf(ZEL_SVC_ELEMENT_QA_URL);
    EXPECT_EQ(text.view(), "<QAURL>a&amp;b&amp;&amp;<c> \"d\" 'e' &amp;amp;</QAURL>\n");
}

TEST_F(EncodeWriter, AValueOfNothingButAmpersandsIsEscapedWhole) {
    gives("value QAURL", std::string(199, '&'));
    std::string expected = "<QAURL>";
    for (int i = 0; i < 199; ++i)
        expected += "&amp;";
    writer.leaf(ZEL_SVC_ELEMENT_QA_URL);
    EXPECT_EQ(text.view(), expected + "</QAURL>\n");
}

TEST_F(EncodeWriter, HandlersSeeTheElementTheActionAndAnEmptyText) {
    writer.open(ZEL_SVC_ELEMENT_DNS);
    writer.leaf(ZEL_SVC_ELEMENT_DNS_IP_ADDR);
    const Occurrence &value = zel_test::calls().at(2).occurrence;
    EXPECT_EQ(value.kind, OccurrenceKind::Value);
    EXPECT_EQ(value.element, ZEL_SVC_ELEMENT_DNS_IP_ADDR);
    EXPECT_EQ(value.tag, "IPAddr");
    EXPECT_TRUE(value.exports());
    EXPECT_EQ(value.mode, ZEL_SVC_PARSE_MODE_HEADER);
    EXPECT_EQ(value.offset, -1);
    EXPECT_EQ(value.text, "");
    EXPECT_EQ(value.attributes, nullptr);
    EXPECT_NE(value.out, nullptr);
    EXPECT_EQ(zel_test::calls().at(3).occurrence.out, nullptr) << "an end gives nothing out";
}

TEST_F(EncodeWriter, CountsRepeatedElementsAsAParseDoes) {
    writer.open(ZEL_SVC_ELEMENT_DNS);
    writer.leaf(ZEL_SVC_ELEMENT_DNS_IP_ADDR);
    writer.leaf(ZEL_SVC_ELEMENT_DNS_IP_ADDR);
    writer.leaf(ZEL_SVC_ELEMENT_GPS_ACTIVATION);
    EXPECT_EQ(zel_test::calls().at(1).occurrence.index, 0);
    EXPECT_EQ(zel_test::calls().at(3).occurrence.index, 0) << "an element ends behind its end handler";
    EXPECT_EQ(zel_test::calls().at(4).occurrence.index, 1);
    EXPECT_EQ(zel_svc_element_get_count(ZEL_SVC_ELEMENT_DNS_IP_ADDR), 2);
    EXPECT_EQ(zel_svc_element_get_count(ZEL_SVC_ELEMENT_GPS_ACTIVATION), 0);
}

TEST_F(EncodeWriter, ClosesNothingButTheElementThatIsOpen) {
    writer.open(ZEL_SVC_ELEMENT_GPS);
    writer.close(ZEL_SVC_ELEMENT_DISPLAY);
    EXPECT_EQ(text.view(), "<GPS>\n");
    EXPECT_EQ(zel_svc_element_get_current_id(), ZEL_SVC_ELEMENT_GPS);
}

TEST_F(EncodeWriter, QueryGivesAValueAndWritesNothing) {
    gives("value NbProfile", "3");
    EXPECT_EQ(zel_svc_encode_query(ZEL_SVC_ELEMENT_NB_PROFILE).view(), "3");
    EXPECT_THAT(text.view(), IsEmpty());
    EXPECT_THAT(zel_test::call_texts(), ElementsAre("value NbProfile"));
    EXPECT_EQ(zel_test::calls().at(0).occurrence.element, ZEL_SVC_ELEMENT_NB_PROFILE);
    EXPECT_EQ(zel_svc_element_get_current_id(), ZEL_SVC_ELEMENT_NONE);
}

TEST_F(EncodeWriter, QueryOfAHandlerWithoutMemoryTellsItAndLeavesNothingOpen) {
    gives("value NbProfile", "no memory");
    EXPECT_THROW(zel_svc_encode_query(ZEL_SVC_ELEMENT_NB_PROFILE), std::bad_alloc);
    EXPECT_EQ(zel_svc_element_get_current_id(), ZEL_SVC_ELEMENT_NONE);
}
