// The columns that no setting of the main group uses, and the steps around them.

#include "support/bench-phone.h"
#include "support/spec-text.h"

#include "base/zel-svc-observer.h"
#include "handler/zel-svc-setting.h"

#include <gmock/gmock.h>

namespace zel_test {

using testing::ElementsAre;
using testing::IsEmpty;

namespace {

constexpr Word kDays[] = {{"sunday", 0}, {"monday", 1}};
constexpr Word kSizes[] = {{"small"}, {"large"}};

std::vector<std::string> gSteps;

void note_install(const Setting & /*setting*/, Occurrence &occurrence) {
    gSteps.push_back("install " + std::string{occurrence.text});
}
void note_verify(const Setting & /*setting*/, Occurrence &occurrence) {
    gSteps.push_back("verify " + std::string{occurrence.text});
}
void note_encode(const Setting & /*setting*/, Occurrence &occurrence) {
    gSteps.emplace_back("encode");
    occurrence.out->assign("odd");
}

// The element ids stand for themselves only: the table below is this test's own.
constexpr Setting kSettings[] = {
    {.element = ZEL_SVC_ELEMENT_START_DAY,
     .accepts = words(kDays),
     .stores = {{KeyType::Int, "db/test/first"}, {KeyType::Int, "db/test/second"}},
     .records = {{ZEL_SVC_DATA_MAIN, "test", "early", RecordForm::Number, 1}, {ZEL_SVC_DATA_MAIN, "test", "late"}},
     .report = text_in("Test"),
     .exports = if_recorded()},
    {.element = ZEL_SVC_ELEMENT_CLI_DIGITS,
     .accepts = numbers(7, 11),
     .stores = {{KeyType::Int, "db/test/digits"}},
     .records = {{ZEL_SVC_DATA_MAIN, "test", "digits"}},
     .report = number_in("Test", "-999"),
     .exports = if_recorded("-999")},
    {.element = ZEL_SVC_ELEMENT_PAGE_LIMIT,
     .accepts = any_number(),
     .stores = {{KeyType::Int, "db/test/pages"}},
     .report = text_in("Test"),
     .exports = always()},
    {.element = ZEL_SVC_ELEMENT_SIZE_EMAIL,
     .accepts = kept_words(kSizes),
     .records = {{ZEL_SVC_DATA_MAIN, "test", "size", RecordForm::SpecText}}},
    {.element = ZEL_SVC_ELEMENT_COUNTRY_ISO,
     .stores = {{KeyType::String, "db/test/text"}},
     .report = text_in("Test"),
     .exports = if_readable()},
    {.element = ZEL_SVC_ELEMENT_WB_AMR_CODEC,
     .auto_flag = ZEL_SVC_AUTO_WB_AMR,
     .accepts = on_off(),
     .stores = {{KeyType::Int, "db/test/codec"}},
     .report = text_in("Test")},
    {.element = ZEL_SVC_ELEMENT_GPS_ACTIVATION,
     .accepts = on_off(),
     .records = {{ZEL_SVC_DATA_MAIN, "test", "gps"}},
     .exports = if_recorded(),
     .install = note_install,
     .verify = note_verify,
     .encode = note_encode},
    {.element = ZEL_SVC_ELEMENT_USE_SSL, .accepts = on_off(), .encode = note_encode},
};

class Refusals : public ZelSvcObserver {
  public:
    Refusals() { zel_svc_set_observer(this); }
    Refusals(const Refusals &) = delete;
    Refusals &operator=(const Refusals &) = delete;
    ~Refusals() override { zel_svc_set_observer(nullptr); }
    void refused_text(std::string_view tag, std::string_view text, std::int32_t offset) override {
        seen.push_back(std::string{tag} + "=" + std::string{text} + "@" + std::to_string(offset));
    }
    std::vector<std::string> seen;
};

Occurrence occurrence_of(ZelSvcElementId element, ZelSvcParseAction action, std::string_view text) {
    return {.kind = OccurrenceKind::Value,
            .element = element,
            .tag = "Tag",
            .action = action,
            .mode = ZEL_SVC_PARSE_MODE_FULL,
            .index = 0,
            .offset = 17,
            .text = text,
            .attributes = nullptr,
            .out = nullptr};
}

void install(ZelSvcElementId element, std::string_view text) {
    Occurrence occurrence = occurrence_of(element, ZEL_SVC_PARSE_ACTION_INSTALL, text);
    zel_svc_setting_handle(kSettings, occurrence);
}

std::vector<ResultLine> verify(ZelSvcElementId element, std::string_view text) {
    zel_svc_verification_clear_results();
    Occurrence occurrence = occurrence_of(element, ZEL_SVC_PARSE_ACTION_VERIFY, text);
    zel_svc_setting_handle(kSettings, occurrence);
    return result_lines();
}

std::string encode(ZelSvcElementId element) {
    ZelSvcExportText out;
    Occurrence occurrence = occurrence_of(element, ZEL_SVC_PARSE_ACTION_ENCODE, {});
    occurrence.out = &out;
    zel_svc_setting_handle(kSettings, occurrence);
    return std::string{out.view()};
}

} // namespace

class SettingEngine : public BenchPhone {};

TEST_F(SettingEngine, RecordWaitsForTheStoresThatItNames) {
    const LoadedGroup group{ZEL_SVC_DATA_MAIN};
    fail("vconf_set_int", "db/test/second");
    install(ZEL_SVC_ELEMENT_START_DAY, "monday");
    EXPECT_EQ(get_int("db/test/first"), 1);
    EXPECT_EQ(group.number("test", "early"), 1);
    EXPECT_EQ(group.text("test", "late"), std::nullopt);
}

TEST_F(SettingEngine, RefusedFirstStoreRecordsNothing) {
    const LoadedGroup group{ZEL_SVC_DATA_MAIN};
    fail("vconf_set_int", "db/test/first");
    install(ZEL_SVC_ELEMENT_START_DAY, "monday");
    EXPECT_EQ(get_int("db/test/second"), std::nullopt);
    EXPECT_EQ(group.text("test", "early"), std::nullopt);
}

TEST_F(SettingEngine, InstallingTellsWhetherAllWasWritten) {
    EXPECT_TRUE(zel_svc_setting_install(kSettings[0], "monday"));
    EXPECT_FALSE(zel_svc_setting_install(kSettings[0], "Monday"));
    fail("vconf_set_int", "db/test/second");
    EXPECT_FALSE(zel_svc_setting_install(kSettings[0], "monday"));
}

TEST_F(SettingEngine, FirstStoreIsComparedAndExported) {
    const LoadedGroup group{ZEL_SVC_DATA_MAIN};
    install(ZEL_SVC_ELEMENT_START_DAY, "monday");
    set_int("db/test/second", 0);
    EXPECT_THAT(verify(ZEL_SVC_ELEMENT_START_DAY, "monday"),
                ElementsAre(passed("[Test/Tag] Spec='monday',Phone='monday'")));
    EXPECT_EQ(encode(ZEL_SVC_ELEMENT_START_DAY), "monday");
}

TEST_F(SettingEngine, NumbersAreComparedAsNumbers) {
    set_int("db/test/digits", 7);
    EXPECT_THAT(verify(ZEL_SVC_ELEMENT_CLI_DIGITS, "07"), ElementsAre(passed("[Test/Tag] Spec='7',Phone='7'")));
    set_int("db/test/digits", 12);
    EXPECT_THAT(verify(ZEL_SVC_ELEMENT_CLI_DIGITS, "7"), ElementsAre(failed("[Test/Tag] Spec='7',Phone='12'")));
    EXPECT_THAT(verify(ZEL_SVC_ELEMENT_CLI_DIGITS, "12"), IsEmpty());
}

TEST_F(SettingEngine, UnreadableNumberIsShownAsTheRowSays) {
    const LoadedGroup group{ZEL_SVC_DATA_MAIN};
    EXPECT_THAT(verify(ZEL_SVC_ELEMENT_CLI_DIGITS, "7"), ElementsAre(failed("[Test/Tag] Spec='7',Phone='-999'")));
    install(ZEL_SVC_ELEMENT_CLI_DIGITS, "7");
    set_string("db/test/digits", "x");
    EXPECT_EQ(encode(ZEL_SVC_ELEMENT_CLI_DIGITS), "-999");
    set_int("db/test/digits", 12);
    EXPECT_EQ(encode(ZEL_SVC_ELEMENT_CLI_DIGITS), "12");
}

TEST_F(SettingEngine, NumbersOutsideTheRangeAreLeftAlone) {
    for (const char *text : {"6", "12", ""})
        install(ZEL_SVC_ELEMENT_CLI_DIGITS, text);
    EXPECT_EQ(get_int("db/test/digits"), std::nullopt);
    install(ZEL_SVC_ELEMENT_CLI_DIGITS, "11");
    EXPECT_EQ(get_int("db/test/digits"), 11);
}

TEST_F(SettingEngine, NumbersCanBeComparedAsTexts) {
    set_int("db/test/pages", 5);
    EXPECT_THAT(verify(ZEL_SVC_ELEMENT_PAGE_LIMIT, "05"), ElementsAre(failed("[Test/Tag] Spec='05',Phone='5'")));
    EXPECT_THAT(verify(ZEL_SVC_ELEMENT_PAGE_LIMIT, "5"), ElementsAre(passed("[Test/Tag] Spec='5',Phone='5'")));
    EXPECT_EQ(encode(ZEL_SVC_ELEMENT_PAGE_LIMIT), "5");
    set_string("db/test/pages", "5");
    EXPECT_EQ(encode(ZEL_SVC_ELEMENT_PAGE_LIMIT), "??");
}

TEST_F(SettingEngine, SettingWithoutStoreIsOnlyRecorded) {
    const LoadedGroup group{ZEL_SVC_DATA_MAIN};
    install(ZEL_SVC_ELEMENT_SIZE_EMAIL, "large");
    install(ZEL_SVC_ELEMENT_SIZE_EMAIL, "huge");
    EXPECT_EQ(group.text("test", "size"), "large");
    EXPECT_THAT(verify(ZEL_SVC_ELEMENT_SIZE_EMAIL, "large"), IsEmpty());
    EXPECT_EQ(encode(ZEL_SVC_ELEMENT_SIZE_EMAIL), "");
}

TEST_F(SettingEngine, TextsAreStoredAsTheyStand) {
    install(ZEL_SVC_ELEMENT_COUNTRY_ISO, "a \"text\" = ü");
    EXPECT_EQ(get_string("db/test/text"), "a \"text\" = ü");
    EXPECT_EQ(encode(ZEL_SVC_ELEMENT_COUNTRY_ISO), "a \"text\" = ü");
    EXPECT_THAT(verify(ZEL_SVC_ELEMENT_COUNTRY_ISO, "b"),
                ElementsAre(failed("[Test/Tag] Spec='b',Phone='a \"text\" = ü'")));
}

// The spec's own "??" equals what is shown for a value that cannot be read.
TEST_F(SettingEngine, UnknownMarkInTheSpecPasses) {
    EXPECT_THAT(verify(ZEL_SVC_ELEMENT_COUNTRY_ISO, "??"), ElementsAre(passed("[Test/Tag] Spec='?\?',Phone='?\?'")));
}

TEST_F(SettingEngine, AutoFlagKeepsAGroupFromBeingVerified) {
    set_int("db/test/codec", 1);
    gbZelSvcNetworkAutoFlags[ZEL_SVC_AUTO_WB_AMR] = 1;
    EXPECT_THAT(verify(ZEL_SVC_ELEMENT_WB_AMR_CODEC, "on"), IsEmpty());
    gbZelSvcNetworkAutoFlags.fill(1);
    gbZelSvcNetworkAutoFlags[ZEL_SVC_AUTO_WB_AMR] = 0;
    EXPECT_THAT(verify(ZEL_SVC_ELEMENT_WB_AMR_CODEC, "on"), ElementsAre(passed("[Test/Tag] Spec='on',Phone='on'")));
}

TEST_F(SettingEngine, OddStepsStandInForTheEnginesAndGetAcceptedTextsOnly) {
    gSteps.clear();
    install(ZEL_SVC_ELEMENT_GPS_ACTIVATION, "on");
    install(ZEL_SVC_ELEMENT_GPS_ACTIVATION, "ON");
    verify(ZEL_SVC_ELEMENT_GPS_ACTIVATION, "off");
    verify(ZEL_SVC_ELEMENT_GPS_ACTIVATION, "");
    EXPECT_THAT(gSteps, ElementsAre("install on", "verify off"));
}

TEST_F(SettingEngine, OddExportRunsWhenTheRowSaysSo) {
    const LoadedGroup group{ZEL_SVC_DATA_MAIN};
    gSteps.clear();
    EXPECT_EQ(encode(ZEL_SVC_ELEMENT_GPS_ACTIVATION), "");
    EXPECT_EQ(encode(ZEL_SVC_ELEMENT_USE_SSL), "");
    EXPECT_THAT(gSteps, IsEmpty());
    zel_svc_data_set_int(ZEL_SVC_DATA_MAIN, "test", "gps", 1);
    EXPECT_EQ(encode(ZEL_SVC_ELEMENT_GPS_ACTIVATION), "odd");
}

TEST_F(SettingEngine, ExportWithoutABufferDoesNothing) {
    Occurrence occurrence = occurrence_of(ZEL_SVC_ELEMENT_PAGE_LIMIT, ZEL_SVC_PARSE_ACTION_ENCODE, "5");
    zel_svc_setting_handle(kSettings, occurrence);
    EXPECT_EQ(get_int("db/test/pages"), std::nullopt);
}

TEST_F(SettingEngine, ElementsOfOtherTablesAreLeftAlone) {
    install(ZEL_SVC_ELEMENT_BT_ACTIVATION, "on");
    EXPECT_THAT(verify(ZEL_SVC_ELEMENT_BT_ACTIVATION, "on"), IsEmpty());
    EXPECT_EQ(encode(ZEL_SVC_ELEMENT_NONE), "");
}

TEST_F(SettingEngine, RefusedTextsAreTold) {
    const Refusals refusals;
    install(ZEL_SVC_ELEMENT_START_DAY, "Monday");
    verify(ZEL_SVC_ELEMENT_CLI_DIGITS, "12");
    install(ZEL_SVC_ELEMENT_START_DAY, "monday");
    EXPECT_THAT(refusals.seen, ElementsAre("Tag=Monday@17", "Tag=12@17"));
}

} // namespace zel_test
