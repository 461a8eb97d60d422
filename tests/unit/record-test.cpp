#include "support/bench-phone.h"
#include "support/spec-text.h"

#include "base/zel-svc-observer.h"
#include "handler/zel-svc-record.h"

#include <gmock/gmock.h>

namespace zel_test {

using testing::ElementsAre;
using testing::IsEmpty;

namespace {

constexpr Word kYesNo[] = {{"yes", 1}, {"no", 0}};
constexpr Word kTypes[] = {{"pop3"}, {"imap4"}};

struct Item {
    FixedText<8> name;
    FixedText<20> url;
    FixedText<20> editable;
    FixedText<20> login;
    FixedText<20> type;
    FixedText<20> port;
    FixedText<20> timeout;
};

std::int32_t doubled(std::string_view text) { return 2 * std::stoi(std::string{text}); }
std::string halved(std::int32_t number) { return std::to_string(number / 2); }
bool hidden_is_on(std::string_view spec, std::string_view phone) { return spec == "on" && phone == "hidden"; }

// The element ids stand for themselves only: the table is this test's own.
constexpr Field<Item> kFields[] = {
    field<&Item::name>(ZEL_SVC_ELEMENT_BOOKMARK_NAME, {.fills = FieldFills::Install, .record = {"name_%d"}}),
    field<&Item::url>(ZEL_SVC_ELEMENT_BOOKMARK_URL, {.record = {"url_%d", FieldForm::TextIfGiven}, .report = {"URL"}}),
    field<&Item::editable>(ZEL_SVC_ELEMENT_BOOKMARK_EDITABLE, {.accepts = words(kYesNo),
                                                               .others = FieldOthers::Kept,
                                                               .record = {"editable_%d", FieldForm::Word},
                                                               .report = {"Editable", LineWhen::SpecGiven}}),
    field<&Item::login>(ZEL_SVC_ELEMENT_APOP,
                        {.accepts = on_off(), .record = {.key = "login_%d", .form = FieldForm::Word, .otherwise = 0}}),
    field<&Item::type>(ZEL_SVC_ELEMENT_MAILBOX_TYPE, {.accepts = kept_words(kTypes), .record = {"type_%d"}}),
    field<&Item::port>(ZEL_SVC_ELEMENT_INCOMING_PORT, {.record = {"port", FieldForm::NumberIfGiven, "other"},
                                                       .report = {"Port", LineWhen::EitherGiven}}),
    field<&Item::timeout>(
        ZEL_SVC_ELEMENT_TIMEOUT_VALUE,
        {.record = {.key = "time_%d", .form = FieldForm::NumberIfGiven, .reads = doubled, .shows = halved},
         .report = {"Hidden", LineWhen::Always, hidden_is_on}}),
};

Occurrence occurrence_of(ZelSvcElementId element, ZelSvcParseAction action, std::string_view text) {
    return {.kind = OccurrenceKind::Value,
            .element = element,
            .tag = "Tag",
            .action = action,
            .mode = ZEL_SVC_PARSE_MODE_FULL,
            .index = 0,
            .offset = -1,
            .text = text,
            .attributes = nullptr,
            .out = nullptr};
}

bool fill(OpenRecord<Item> &open, ZelSvcElementId element, std::string_view text,
          ZelSvcParseAction action = ZEL_SVC_PARSE_ACTION_INSTALL) {
    Occurrence occurrence = occurrence_of(element, action, text);
    return open.copy(kFields, occurrence);
}

void save(Item &item, int number) {
    zel_svc_record_save<Item>(ZEL_SVC_DATA_BOOKMARK, "bookmark", kFields, item, number);
}

std::vector<ResultLine> compare(Item &spec, Item &phone, std::string_view label = "Item3") {
    zel_svc_verification_clear_results();
    zel_svc_record_compare<Item>(label, kFields, spec, phone);
    return result_lines();
}

} // namespace

class RecordShape : public BenchPhone {};

TEST_F(RecordShape, TextsGoIntoTheFieldOfTheirElement) {
    OpenRecord<Item> open;
    open.open();
    EXPECT_TRUE(fill(open, ZEL_SVC_ELEMENT_BOOKMARK_NAME, "News"));
    EXPECT_TRUE(fill(open, ZEL_SVC_ELEMENT_BOOKMARK_URL, "http://a"));
    EXPECT_EQ(open->name.view(), "News");
    EXPECT_EQ(open->url.view(), "http://a");
    EXPECT_FALSE(fill(open, ZEL_SVC_ELEMENT_QA_TITLE, "x"));
}

TEST_F(RecordShape, FieldsKeepOneByteForTheirEnd) {
    OpenRecord<Item> open;
    open.open();
    fill(open, ZEL_SVC_ELEMENT_BOOKMARK_NAME, "12345678");
    EXPECT_EQ(open->name.view(), "1234567");
    fill(open, ZEL_SVC_ELEMENT_BOOKMARK_NAME, "123456é");
    EXPECT_EQ(open->name.view(), "123456");
    fill(open, ZEL_SVC_ELEMENT_BOOKMARK_NAME, "");
    EXPECT_EQ(open->name.view(), "");
}

TEST_F(RecordShape, WithoutAnOpenRecordNothingHappens) {
    OpenRecord<Item> open;
    EXPECT_FALSE(fill(open, ZEL_SVC_ELEMENT_BOOKMARK_NAME, "News"));
    EXPECT_FALSE(open.text_of(kFields, ZEL_SVC_ELEMENT_BOOKMARK_NAME).has_value());
    EXPECT_FALSE(open);
    EXPECT_EQ(open.take(), nullptr);
}

TEST_F(RecordShape, OpeningAgainStartsAfreshUnlessPendingIsKept) {
    OpenRecord<Item> open;
    open.open();
    fill(open, ZEL_SVC_ELEMENT_BOOKMARK_URL, "old");
    open.open_unless_pending();
    EXPECT_EQ(open->url.view(), "old");
    open.open();
    EXPECT_EQ(open->url.view(), "");
    open.close();
    EXPECT_FALSE(open);
    open.open_unless_pending();
    EXPECT_TRUE(static_cast<bool>(open));
}

TEST_F(RecordShape, TakenRecordLeavesNoneOpen) {
    OpenRecord<Item> open;
    open.open();
    fill(open, ZEL_SVC_ELEMENT_BOOKMARK_URL, "x");
    const auto item = open.take();
    ASSERT_NE(item, nullptr);
    EXPECT_EQ(item->url.view(), "x");
    EXPECT_FALSE(open);
}

TEST_F(RecordShape, VerificationFillsTheFieldsThatItCompares) {
    OpenRecord<Item> open;
    open.open();
    EXPECT_FALSE(fill(open, ZEL_SVC_ELEMENT_BOOKMARK_NAME, "x", ZEL_SVC_PARSE_ACTION_VERIFY));
    EXPECT_TRUE(fill(open, ZEL_SVC_ELEMENT_BOOKMARK_URL, "y", ZEL_SVC_PARSE_ACTION_VERIFY));
    EXPECT_EQ(open->name.view(), "");
    EXPECT_EQ(open->url.view(), "y");
}

TEST_F(RecordShape, ExportGivesTheFieldOutAndChangesNothing) {
    OpenRecord<Item> open;
    open.open();
    fill(open, ZEL_SVC_ELEMENT_BOOKMARK_NAME, "News");
    ZelSvcExportText out;
    Occurrence occurrence = occurrence_of(ZEL_SVC_ELEMENT_BOOKMARK_NAME, ZEL_SVC_PARSE_ACTION_ENCODE, "ignored");
    EXPECT_FALSE(open.copy(kFields, occurrence));
    occurrence.out = &out;
    EXPECT_TRUE(open.copy(kFields, occurrence));
    EXPECT_EQ(out.view(), "News");
    EXPECT_EQ(open->name.view(), "News");
}

TEST_F(RecordShape, TextThatIsNotAcceptedIsIgnoredAndTold) {
    class : public ZelSvcObserver {
      public:
        void refused_text(std::string_view /*tag*/, std::string_view text, std::int32_t /*offset*/) override {
            seen.emplace_back(text);
        }
        std::vector<std::string> seen;
    } refusals;
    zel_svc_set_observer(&refusals);
    OpenRecord<Item> open;
    open.open();
    EXPECT_TRUE(fill(open, ZEL_SVC_ELEMENT_MAILBOX_TYPE, "imap4"));
    EXPECT_FALSE(fill(open, ZEL_SVC_ELEMENT_MAILBOX_TYPE, "IMAP4"));
    EXPECT_EQ(open->type.view(), "imap4");
    EXPECT_TRUE(fill(open, ZEL_SVC_ELEMENT_BOOKMARK_EDITABLE, "maybe"));
    EXPECT_EQ(open->editable.view(), "maybe");
    EXPECT_THAT(refusals.seen, ElementsAre("IMAP4"));
    zel_svc_set_observer(nullptr);
}

TEST_F(RecordShape, FieldOfAnElementCanBeLookedAt) {
    OpenRecord<Item> open;
    open.open();
    fill(open, ZEL_SVC_ELEMENT_BOOKMARK_URL, "x");
    EXPECT_EQ(open.text_of(kFields, ZEL_SVC_ELEMENT_BOOKMARK_URL)->view(), "x");
    EXPECT_FALSE(open.text_of(kFields, ZEL_SVC_ELEMENT_QA_URL).has_value());
}

TEST_F(RecordShape, EmptyRecordIsSavedWhereItsFormsSaySo) {
    const LoadedGroup group{ZEL_SVC_DATA_BOOKMARK};
    Item item;
    save(item, 3);
    EXPECT_EQ(group.text("bookmark", "name_3"), "");
    EXPECT_EQ(group.text("bookmark", "url_3"), std::nullopt);
    EXPECT_EQ(group.text("bookmark", "editable_3"), std::nullopt);
    EXPECT_EQ(group.number("bookmark", "login_3"), 0);
    EXPECT_EQ(group.text("bookmark", "type_3"), "");
    EXPECT_EQ(group.text("other", "port"), std::nullopt);
    EXPECT_EQ(group.text("bookmark", "time_3"), std::nullopt);
}

TEST_F(RecordShape, FullRecordIsSavedInItsForms) {
    const LoadedGroup group{ZEL_SVC_DATA_BOOKMARK};
    Item item;
    item.name.assign("News");
    item.url.assign("http://a");
    item.editable.assign("no");
    item.login.assign("on");
    item.type.assign("pop3");
    item.port.assign("0110");
    item.timeout.assign("21");
    save(item, 12);
    EXPECT_EQ(group.text("bookmark", "name_12"), "News");
    EXPECT_EQ(group.text("bookmark", "url_12"), "http://a");
    EXPECT_EQ(group.number("bookmark", "editable_12"), 0);
    EXPECT_EQ(group.number("bookmark", "login_12"), 1);
    EXPECT_EQ(group.text("bookmark", "type_12"), "pop3");
    EXPECT_EQ(group.number("other", "port"), 110);
    EXPECT_EQ(group.number("bookmark", "time_12"), 42);
}

TEST_F(RecordShape, UnknownWordIsRecordedAsTheRowSays) {
    const LoadedGroup group{ZEL_SVC_DATA_BOOKMARK};
    Item item;
    item.editable.assign("maybe");
    item.login.assign("ON");
    save(item, 1);
    EXPECT_EQ(group.text("bookmark", "editable_1"), std::nullopt);
    EXPECT_EQ(group.number("bookmark", "login_1"), 0);
}

TEST_F(RecordShape, SavedRecordIsLoadedAsItWas) {
    const LoadedGroup group{ZEL_SVC_DATA_BOOKMARK};
    Item item;
    item.name.assign("News");
    item.url.assign("http://a");
    item.editable.assign("no");
    item.login.assign("on");
    item.type.assign("pop3");
    item.port.assign("110");
    item.timeout.assign("21");
    save(item, 12);
    Item loaded;
    loaded.url.assign("an older and longer one");
    zel_svc_record_load<Item>(ZEL_SVC_DATA_BOOKMARK, "bookmark", kFields, loaded, 12);
    EXPECT_EQ(loaded.name.view(), "News");
    EXPECT_EQ(loaded.url.view(), "http://a");
    EXPECT_EQ(loaded.editable.view(), "no");
    EXPECT_EQ(loaded.login.view(), "on");
    EXPECT_EQ(loaded.type.view(), "pop3");
    EXPECT_EQ(loaded.port.view(), "110");
    EXPECT_EQ(loaded.timeout.view(), "21");
}

TEST_F(RecordShape, AbsentEntriesAreLoadedEmpty) {
    const LoadedGroup group{ZEL_SVC_DATA_BOOKMARK};
    Item item;
    for (FixedText<20> *text : {&item.url, &item.editable, &item.login, &item.type, &item.port, &item.timeout})
        text->assign("old");
    zel_svc_record_load<Item>(ZEL_SVC_DATA_BOOKMARK, "bookmark", kFields, item, 1);
    for (const FixedText<20> *text : {&item.url, &item.editable, &item.login, &item.type, &item.port, &item.timeout})
        EXPECT_EQ(text->view(), "");
}

TEST_F(RecordShape, NumbersThatStandForNothingAreLoadedEmpty) {
    const LoadedGroup group{ZEL_SVC_DATA_BOOKMARK};
    zel_svc_data_set_int(ZEL_SVC_DATA_BOOKMARK, "bookmark", "editable_1", 2);
    zel_svc_data_set_int(ZEL_SVC_DATA_BOOKMARK, "bookmark", "time_1", -1);
    zel_svc_data_set_int(ZEL_SVC_DATA_BOOKMARK, "other", "port", -2);
    Item item;
    zel_svc_record_load<Item>(ZEL_SVC_DATA_BOOKMARK, "bookmark", kFields, item, 1);
    EXPECT_EQ(item.editable.view(), "");
    EXPECT_EQ(item.timeout.view(), "");
    EXPECT_EQ(item.port.view(), "-2");
}

TEST_F(RecordShape, SavingTellsWhetherItWrote) {
    const LoadedGroup group{ZEL_SVC_DATA_BOOKMARK};
    EXPECT_TRUE(zel_svc_field_save(ZEL_SVC_DATA_BOOKMARK, "bookmark", kFields[1].rules, 1, "x"));
    EXPECT_FALSE(zel_svc_field_save(ZEL_SVC_DATA_BOOKMARK, "bookmark", kFields[1].rules, 1, ""));
    EXPECT_FALSE(zel_svc_field_save(ZEL_SVC_DATA_BOOKMARK, "bookmark", kFields[2].rules, 1, "maybe"));
    EXPECT_FALSE(zel_svc_field_save(ZEL_SVC_DATA_BOOKMARK, "bookmark", {}, 1, "x"));
}

TEST_F(RecordShape, ItemsAreCounted) {
    const LoadedGroup group{ZEL_SVC_DATA_BOOKMARK};
    EXPECT_EQ(zel_svc_record_count_up(ZEL_SVC_DATA_BOOKMARK, "bookmark"), 1);
    EXPECT_EQ(zel_svc_record_count_up(ZEL_SVC_DATA_BOOKMARK, "bookmark"), 2);
    EXPECT_EQ(group.number("bookmark", "count"), 2);
}

TEST_F(RecordShape, CountStopsAtTheLargestNumber) {
    const LoadedGroup group{ZEL_SVC_DATA_BOOKMARK};
    zel_svc_data_set_int(ZEL_SVC_DATA_BOOKMARK, "bookmark", "count", 2147483646);
    EXPECT_EQ(zel_svc_record_count_up(ZEL_SVC_DATA_BOOKMARK, "bookmark"), 2147483647);
    EXPECT_EQ(zel_svc_record_count_up(ZEL_SVC_DATA_BOOKMARK, "bookmark"), 2147483647);
    EXPECT_EQ(group.number("bookmark", "count"), 2147483647);
}

TEST_F(RecordShape, EqualFieldsPass) {
    Item item;
    item.url.assign("u");
    item.editable.assign("no");
    item.port.assign("1");
    EXPECT_THAT(compare(item, item),
                ElementsAre(passed("[Item3/URL] Spec='u',Phone='u'"), passed("[Item3/Editable] Spec='no',Phone='no'"),
                            passed("[Item3/Port] Spec='1',Phone='1'"), passed("[Item3/Hidden] Spec='',Phone=''")));
}

TEST_F(RecordShape, LinesAreWrittenWhenTheirRulesSaySo) {
    Item spec;
    Item phone;
    EXPECT_THAT(compare(spec, phone),
                ElementsAre(passed("[Item3/URL] Spec='',Phone=''"), passed("[Item3/Hidden] Spec='',Phone=''")));
    phone.editable.assign("no");
    phone.port.assign("1");
    EXPECT_THAT(compare(spec, phone),
                ElementsAre(passed("[Item3/URL] Spec='',Phone=''"), failed("[Item3/Port] Spec='',Phone='1'"),
                            passed("[Item3/Hidden] Spec='',Phone=''")));
    spec.editable.assign("yes");
    EXPECT_EQ(compare(spec, phone).at(1), failed("[Item3/Editable] Spec='yes',Phone='no'"));
}

TEST_F(RecordShape, RuleCanPassUnequalTexts) {
    Item spec;
    Item phone;
    spec.timeout.assign("on");
    phone.timeout.assign("hidden");
    EXPECT_EQ(compare(spec, phone).back(), passed("[Item3/Hidden] Spec='on',Phone='hidden'"));
    EXPECT_EQ(compare(phone, spec).back(), failed("[Item3/Hidden] Spec='hidden',Phone='on'"));
}

TEST_F(RecordShape, LinesNeedNoItemLabel) {
    Item item;
    EXPECT_THAT(compare(item, item, ""),
                ElementsAre(passed("[URL] Spec='',Phone=''"), passed("[Hidden] Spec='',Phone=''")));
}

} // namespace zel_test
