// Which handlers a document calls, with what, and how a parse is steered.

#include "dispatch/recording-table.h"
#include "spec/zel-svc-element-dispatcher.h"
#include "spec/zel-svc-element-stack.h"
#include "spec/zel-svc-spec-file.h"

#include <gmock/gmock.h>

using ::testing::ElementsAre;
using ::testing::IsEmpty;

namespace {

std::vector<std::string> dispatched(std::string_view text) {
    zel_test::calls().clear();
    zel_svc_spec_parse_buffer(text.data(), static_cast<std::int32_t>(text.size()));
    return zel_test::call_texts();
}

const Occurrence &occurrence(std::size_t call) { return zel_test::calls().at(call).occurrence; }

std::int32_t start(const char *tag) {
    return zel_svc_element_on_start(0, tag, static_cast<std::int32_t>(std::string_view(tag).size() + 1), nullptr);
}

std::int32_t value(const char *text) {
    return zel_svc_element_on_value(0, text, static_cast<std::int32_t>(std::string_view(text).size() + 1));
}

std::int32_t end(const char *tag) { return zel_svc_element_on_end(0, tag); }

} // namespace

TEST(Dispatch, CallsStartValueAndEndOfTheRow) {
    EXPECT_THAT(dispatched("<GPS a=\"1\" b=\"2\"><GPSActivation>on</GPSActivation></GPS>"),
                ElementsAre("start GPS a=1 b=2", "start GPSActivation", "value GPSActivation on", "end GPSActivation",
                            "end GPS"));
}

TEST(Dispatch, OccurrenceTellsKindElementTextAndPlace) {
    geZelSvcParseAction = ZEL_SVC_PARSE_ACTION_VERIFY;
    geZelSvcParseMode = ZEL_SVC_PARSE_MODE_PARTIAL;
    dispatched("<Bookmark> <URL>a &amp; b</URL></Bookmark>");
    EXPECT_EQ(occurrence(0).kind, OccurrenceKind::Start);
    EXPECT_EQ(occurrence(0).element, ZEL_SVC_ELEMENT_BOOKMARK);
    EXPECT_EQ(occurrence(0).offset, 0);
    EXPECT_EQ(occurrence(0).attributes, nullptr);
    EXPECT_EQ(occurrence(1).offset, 11);
    EXPECT_EQ(occurrence(2).kind, OccurrenceKind::Value);
    EXPECT_EQ(occurrence(2).offset, 16);
    EXPECT_EQ(occurrence(3).kind, OccurrenceKind::End);
    EXPECT_EQ(occurrence(3).offset, 25);
    EXPECT_EQ(occurrence(4).offset, 31);
    for (const auto &call : zel_test::calls()) {
        EXPECT_EQ(call.occurrence.action, ZEL_SVC_PARSE_ACTION_VERIFY);
        EXPECT_EQ(call.occurrence.mode, ZEL_SVC_PARSE_MODE_PARTIAL);
        EXPECT_EQ(call.occurrence.out, nullptr);
    }
}

TEST(Dispatch, TextIsTerminated) {
    struct Terminated {
        static void check() {
            static const char kText[] = "text and more";
            zel_svc_element_on_value(0, kText, 5);
        }
    };
    start("GPS");
    zel_test::calls().clear();
    Terminated::check();
    EXPECT_THAT(zel_test::call_texts(), ElementsAre("value GPS text"));
}

TEST(Dispatch, EndedOccurrencesAreCountedOfRepeatingRowsOnly) {
    dispatched("<CustomerData><Profile/><Profile/><GPS/><GPS/><Profile></Profile></CustomerData>");
    EXPECT_EQ(zel_svc_element_get_count(ZEL_SVC_ELEMENT_PROFILE), 3);
    EXPECT_EQ(zel_svc_element_get_count(ZEL_SVC_ELEMENT_GPS), 0);
    EXPECT_EQ(occurrence(1).index, 0);
    EXPECT_EQ(occurrence(2).index, 0); // its own end is not counted yet
    EXPECT_EQ(occurrence(3).index, 1);
    EXPECT_EQ(occurrence(9).index, 2);
    dispatched("<CustomerData><Profile/></CustomerData>");
    EXPECT_EQ(zel_svc_element_get_count(ZEL_SVC_ELEMENT_PROFILE), 1);
}

TEST(Dispatch, RootIsNeverOpen) {
    EXPECT_THAT(dispatched("<SW-Configuration>x<GPS>y</GPS></SW-Configuration>"),
                ElementsAre("start GPS", "value GPS y", "end GPS"));
    zel_svc_element_table_init();
    EXPECT_EQ(start("SW-Configuration"), ZEL_SVC_DISPATCH_DISABLED);
    EXPECT_EQ(value("x"), ZEL_SVC_DISPATCH_NO_ELEMENT);
    EXPECT_EQ(end("SW-Configuration"), ZEL_SVC_DISPATCH_DISABLED);
}

TEST(Dispatch, ResultsSayWhatBecameOfAnEvent) {
    EXPECT_EQ(start("GPS"), ZEL_SVC_DISPATCH_OK);
    EXPECT_EQ(value("x"), ZEL_SVC_DISPATCH_OK);
    EXPECT_EQ(start("Nonsense"), ZEL_SVC_DISPATCH_UNKNOWN);
    EXPECT_EQ(end("Nonsense"), ZEL_SVC_DISPATCH_UNKNOWN);
    EXPECT_EQ(end("GPS"), ZEL_SVC_DISPATCH_OK);
    EXPECT_EQ(value("x"), ZEL_SVC_DISPATCH_NO_ELEMENT);
    zel_svc_element_enable(ZEL_SVC_ELEMENT_MAIN);
    EXPECT_EQ(start("GPS"), ZEL_SVC_DISPATCH_DISABLED);
    EXPECT_EQ(end("GPS"), ZEL_SVC_DISPATCH_DISABLED);
    zel_svc_element_push(ZEL_SVC_ELEMENT_GPS);
    EXPECT_EQ(value("x"), ZEL_SVC_DISPATCH_DISABLED);
}

TEST(Dispatch, TextBetweenChildrenGoesToTheEnclosingElement) {
    EXPECT_THAT(dispatched("<Main>one<GPS/>two<Unknown>three</Unknown>four</Main>"),
                ElementsAre("start Main", "value Main one", "start GPS", "end GPS", "value Main two",
                            "value Main three", "value Main four", "end Main"));
}

TEST(Dispatch, DisabledElementsAreAsIfAbsent) {
    for (const auto id : {ZEL_SVC_ELEMENT_SECURITY, ZEL_SVC_ELEMENT_NETWORK_LOCK})
        zel_svc_element_enable(id);
    EXPECT_THAT(dispatched("<CustomerData><Settings><Main>x<Security><NbNetworkLock>2</NbNetworkLock>"
                           "<NetworkLock>40401</NetworkLock></Security></Main></Settings></CustomerData>"),
                ElementsAre("start Security", "value Security 2", "start NetworkLock", "value NetworkLock 40401",
                            "end NetworkLock", "end Security"));
}

TEST(Dispatch, ChildOfADisabledParentIsNotFound) {
    zel_svc_element_enable(ZEL_SVC_ELEMENT_MAX_PDP_NETWORK_NAME);
    EXPECT_THAT(dispatched("<MaxPDP><NetworkName>x</NetworkName></MaxPDP>"), IsEmpty());
}

TEST(Dispatch, SameTagIsAnotherRowInAnotherPlace) {
    dispatched("<Account><Incoming><Port>1</Port></Incoming><Outgoing><Port>2</Port></Outgoing></Account>");
    std::vector<int> rows;
    for (const auto &call : zel_test::calls())
        if (call.occurrence.kind == OccurrenceKind::Value) rows.push_back(call.occurrence.element);
    EXPECT_THAT(rows, ElementsAre(171, 177));
}

TEST(Dispatch, FiftyFirstElementStartsButIsNotOpen) {
    for (int depth = 0; depth < 50; ++depth)
        EXPECT_EQ(start("Main"), ZEL_SVC_DISPATCH_OK);
    zel_test::calls().clear();
    EXPECT_EQ(start("GPS"), ZEL_SVC_DISPATCH_OK);
    value("x");
    end("GPS");
    EXPECT_THAT(zel_test::call_texts(), ElementsAre("start GPS in Main", "value Main x", "end GPS in Main"));
    EXPECT_EQ(zel_svc_element_get_current_id(), ZEL_SVC_ELEMENT_MAIN);
}

TEST(Dispatch, EndTagOfAnotherElementLeavesTheTopOpen) {
    EXPECT_THAT(dispatched("<Main><Sound>x</GPS>y</Main></Sound>"),
                ElementsAre("start Main", "start Sound", "value Sound x", "end GPS in Sound", "value Sound y",
                            "end Main in Sound"));
    EXPECT_EQ(zel_svc_element_get_current_id(), ZEL_SVC_ELEMENT_SOUND);
    EXPECT_EQ(zel_svc_element_get_enclosing_id(), ZEL_SVC_ELEMENT_MAIN);
}

TEST(Dispatch, EndTagWithNothingOpenHasNoElement) {
    EXPECT_EQ(end("GPS"), ZEL_SVC_DISPATCH_OK);
    EXPECT_THAT(zel_test::call_texts(), ElementsAre("end GPS in "));
    EXPECT_EQ(occurrence(0).element, ZEL_SVC_ELEMENT_NONE);
    EXPECT_EQ(occurrence(0).index, 0);
    EXPECT_EQ(occurrence(0).offset, -1);
}

TEST(Dispatch, StopElementEndsTheParseRightBehindIt) {
    zel_svc_element_set_stop(ZEL_SVC_ELEMENT_NETWORK);
    EXPECT_THAT(dispatched("<Main><Network>x</Network><GPS/></Main>"),
                ElementsAre("start Main", "start Network", "value Network x", "end Network"));
    EXPECT_EQ(start("Network"), ZEL_SVC_DISPATCH_OK);
    EXPECT_EQ(end("Network"), ZEL_SVC_DISPATCH_STOP);
}

TEST(Dispatch, EmptyStopElementDoesNotStop) {
    zel_svc_element_set_stop(ZEL_SVC_ELEMENT_NETWORK);
    EXPECT_THAT(dispatched("<Main><Network/><GPS/></Main>"),
                ElementsAre("start Main", "start Network", "end Network", "start GPS", "end GPS", "end Main"));
}

TEST(Dispatch, HandlerWithoutMemoryDoesNotEndTheParse) {
    EXPECT_THAT(dispatched("<Main><GPS>no memory</GPS><Sound>x</Sound></Main>"),
                ElementsAre("start Main", "start GPS", "value GPS no memory", "end GPS", "start Sound", "value Sound x",
                            "end Sound", "end Main"));
}

TEST(Dispatch, OtherItemsCallNobody) {
    EXPECT_THAT(
        dispatched("<?xml version=\"1.0\"?><!DOCTYPE d e><?p d?><!--c--><GPS><!--c--><![CDATA[d]]><?p d?></GPS>"),
        ElementsAre("start GPS", "end GPS"));
    const auto &callbacks = kZelSvcElementCallbacks;
    EXPECT_EQ(callbacks.start_document(0, "", 0), 0);
    EXPECT_EQ(callbacks.end_document(0), 0);
    EXPECT_EQ(callbacks.declaration(0, "", "", ""), 0);
    EXPECT_EQ(callbacks.document_type(0, "", nullptr), 0);
    EXPECT_EQ(callbacks.instruction(0, "", nullptr), 0);
    EXPECT_EQ(callbacks.cdata(0, ""), 0);
    EXPECT_EQ(callbacks.comment(0, ""), 0);
}

TEST(Dispatch, EveryParseBeginsAfresh) {
    dispatched("<Main><Profile></Profile><Sound>");
    EXPECT_EQ(zel_test::begun_parses(), 2); // both functions of the list
    EXPECT_EQ(zel_svc_element_get_current_id(), ZEL_SVC_ELEMENT_SOUND);
    EXPECT_THAT(dispatched("<NetworkName/>"), IsEmpty());
    EXPECT_EQ(zel_test::begun_parses(), 4);
    EXPECT_EQ(zel_svc_element_get_current_id(), ZEL_SVC_ELEMENT_NONE);
    EXPECT_EQ(zel_svc_element_get_count(ZEL_SVC_ELEMENT_PROFILE), 0);
}

TEST(Dispatch, NoBufferIsAnEmptyDocument) {
    zel_svc_spec_parse_buffer(nullptr, 10);
    zel_svc_spec_parse_buffer("<GPS/>", -1);
    EXPECT_THAT(zel_test::call_texts(), IsEmpty());
}
