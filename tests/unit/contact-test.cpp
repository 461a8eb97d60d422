// The digits that two phone numbers must share, and the two keys of the week's first day and of the sort
// order.

#include "support/bench-phone.h"
#include "support/spec-text.h"

#include <gmock/gmock.h>

namespace zel_test {

using testing::ElementsAre;
using testing::IsEmpty;

namespace {

constexpr const char *kDigits = "db/contacts-svc/phonenumber_min_match_digit";
constexpr const char *kCalendarDay = "db/private/com.quorvex.calendar-lite/first_day_of_week";
constexpr const char *kAlarmDay = "db/private/com.quorvex.clock/alarm/start_of_weekday";
constexpr const char *kSorting = "db/contacts-svc/name_sorting_order";
constexpr const char *kDisplay = "db/contacts-svc/name_display_order";

std::string digits(const std::string &text) { return "<Contact><CLIDigits>" + text + "</CLIDigits></Contact>"; }
std::string start_day(const std::string &text) { return "<Calendar><StartDay>" + text + "</StartDay></Calendar>"; }
std::string sort(const std::string &text) { return "<Contact><ContactSort>" + text + "</ContactSort></Contact>"; }

} // namespace

class CliDigits : public BenchPhone {};

TEST_F(CliDigits, SevenToElevenAreStoredAndRecorded) {
    for (const char *text : {"7", "8", "9", "10", "11"}) {
        const LoadedGroup group{ZEL_SVC_DATA_CONTACT};
        install_spec(digits(text));
        EXPECT_EQ(get_int(kDigits), std::stoi(text));
        EXPECT_EQ(group.text("contact", "match_digit"), text);
    }
}

TEST_F(CliDigits, NumbersOutsideAreIgnored) {
    const LoadedGroup group{ZEL_SVC_DATA_CONTACT};
    set_int(kDigits, 9);
    for (const char *text : {"", "6", "12", "0", "-8", "seven", "100000000000000000008"}) {
        install_spec(digits(text));
        EXPECT_EQ(get_int(kDigits), 9) << text;
        EXPECT_EQ(group.text("contact", "match_digit"), std::nullopt) << text;
        EXPECT_THAT(verify_spec(digits(text)), IsEmpty()) << text;
    }
}

TEST_F(CliDigits, TextsAreReadAsDecimalNumbers) {
    const LoadedGroup group{ZEL_SVC_DATA_CONTACT};
    install_spec(digits("08 digits"));
    EXPECT_EQ(get_int(kDigits), 8);
    EXPECT_EQ(group.text("contact", "match_digit"), "8");
}

TEST_F(CliDigits, NumbersAreComparedNotTexts) {
    set_int(kDigits, 7);
    EXPECT_THAT(verify_spec(digits("07")), ElementsAre(passed("[Contact/CLIDigits] Spec='7',Phone='7'")));
    EXPECT_THAT(verify_spec(digits("8")), ElementsAre(failed("[Contact/CLIDigits] Spec='8',Phone='7'")));
}

TEST_F(CliDigits, PhonesNumberIsShownThoughNoSpecCouldGiveIt) {
    set_int(kDigits, 99);
    EXPECT_THAT(verify_spec(digits("7")), ElementsAre(failed("[Contact/CLIDigits] Spec='7',Phone='99'")));
}

TEST_F(CliDigits, UnreadableKeyShowsMinus999) {
    EXPECT_THAT(verify_spec(digits("7")), ElementsAre(failed("[Contact/CLIDigits] Spec='7',Phone='-999'")));
    set_string(kDigits, "7");
    EXPECT_THAT(verify_spec(digits("7")), ElementsAre(failed("[Contact/CLIDigits] Spec='7',Phone='-999'")));
}

TEST_F(CliDigits, ExportWritesTheNumberOfARecordedSetting) {
    const LoadedGroup group{ZEL_SVC_DATA_CONTACT};
    install_spec(digits("10"));
    EXPECT_EQ(export_value(ZEL_SVC_ELEMENT_CLI_DIGITS), "10");
    set_int(kDigits, 99);
    EXPECT_EQ(export_value(ZEL_SVC_ELEMENT_CLI_DIGITS), "99");
    set_string(kDigits, "10");
    EXPECT_EQ(export_value(ZEL_SVC_ELEMENT_CLI_DIGITS), "-999");
}

TEST_F(CliDigits, UnrecordedSettingIsNotExported) {
    const LoadedGroup group{ZEL_SVC_DATA_CONTACT};
    set_int(kDigits, 10);
    EXPECT_EQ(export_value(ZEL_SVC_ELEMENT_CLI_DIGITS), "");
}

TEST_F(CliDigits, RefusedKeyIsNotRecorded) {
    const LoadedGroup group{ZEL_SVC_DATA_CONTACT};
    fail("vconf_set_int", kDigits);
    install_spec(digits("7"));
    EXPECT_EQ(group.text("contact", "match_digit"), std::nullopt);
}

class StartDay : public BenchPhone {};

TEST_F(StartDay, SaturdayIsSixInBothKeys) {
    const LoadedGroup group{ZEL_SVC_DATA_CALENDAR};
    install_spec(start_day("saturday"));
    EXPECT_EQ(get_int(kCalendarDay), 6);
    EXPECT_EQ(get_int(kAlarmDay), 6);
    EXPECT_EQ(group.text("Calendar", "start_day"), "6");
}

TEST_F(StartDay, AlarmKeyIsLeftWhenCalendarKeyFails) {
    const LoadedGroup group{ZEL_SVC_DATA_CALENDAR};
    fail("vconf_set_int", kCalendarDay);
    install_spec(start_day("monday"));
    EXPECT_EQ(get_int(kAlarmDay), std::nullopt);
    EXPECT_EQ(group.text("Calendar", "start_day"), std::nullopt);
}

TEST_F(StartDay, RecordIsWrittenWhateverBecomesOfTheAlarmKey) {
    const LoadedGroup group{ZEL_SVC_DATA_CALENDAR};
    fail("vconf_set_int", kAlarmDay);
    install_spec(start_day("monday"));
    EXPECT_EQ(get_int(kCalendarDay), 1);
    EXPECT_EQ(get_int(kAlarmDay), std::nullopt);
    EXPECT_EQ(group.text("Calendar", "start_day"), "1");
}

TEST_F(StartDay, CalendarKeyAloneIsComparedAndExported) {
    const LoadedGroup group{ZEL_SVC_DATA_CALENDAR};
    install_spec(start_day("monday"));
    set_int(kAlarmDay, 6);
    EXPECT_THAT(verify_spec(start_day("monday")),
                ElementsAre(passed("[Calendar/StartDay] Spec='monday',Phone='monday'")));
    EXPECT_EQ(export_value(ZEL_SVC_ELEMENT_START_DAY), "monday");
}

TEST_F(StartDay, TuesdayIsNoFirstDay) {
    const LoadedGroup group{ZEL_SVC_DATA_CALENDAR};
    install_spec(start_day("tuesday"));
    EXPECT_EQ(get_int(kCalendarDay), std::nullopt);
    set_int(kCalendarDay, 2);
    EXPECT_THAT(verify_spec(start_day("sunday")), ElementsAre(failed("[Calendar/StartDay] Spec='sunday',Phone='?\?'")));
}

class ContactSort : public BenchPhone {};

TEST_F(ContactSort, SortingAloneIsComparedAndExported) {
    const LoadedGroup group{ZEL_SVC_DATA_CONTACT};
    install_spec(sort("lastname"));
    set_int(kDisplay, 0);
    EXPECT_THAT(verify_spec(sort("lastname")),
                ElementsAre(passed("[Contact/ContactSort] Spec='lastname',Phone='lastname'")));
    EXPECT_EQ(export_value(ZEL_SVC_ELEMENT_CONTACT_SORT), "lastname");
}

TEST_F(ContactSort, RefusedDisplayOrderKeepsItOffTheRecord) {
    const LoadedGroup group{ZEL_SVC_DATA_CONTACT};
    fail("vconf_set_int", kDisplay);
    install_spec(sort("lastname"));
    EXPECT_EQ(get_int(kSorting), 1);
    EXPECT_EQ(group.text("contact", "sort"), std::nullopt);
}

class BluetoothVisibility : public BenchPhone {};

TEST_F(BluetoothVisibility, TimeLimitIsNeitherOnNorOff) {
    constexpr const char *kTime = "file/private/libug-setting-bluetooth-efl/visibility_time";
    const std::string spec = "<BT><Visibility>on</Visibility></BT>";
    const LoadedGroup group{ZEL_SVC_DATA_CONNECTIVITY};
    install_spec(spec);
    EXPECT_EQ(get_int(kTime), -1);
    EXPECT_EQ(group.text("bluetooth", "visibility"), "-1");
    set_int(kTime, 120);
    EXPECT_THAT(verify_spec(spec), ElementsAre(failed("[Bluetooth/Visibility] Spec='on',Phone='?\?'")));
    EXPECT_EQ(export_value(ZEL_SVC_ELEMENT_BT_VISIBILITY), "??");
}

TEST_F(BluetoothVisibility, OutsideBluetoothItIsNobodys) {
    install_spec("<Visibility>on</Visibility><Activation>on</Activation>");
    EXPECT_EQ(get_int("file/private/libug-setting-bluetooth-efl/visibility_time"), std::nullopt);
    EXPECT_EQ(get_int("db/bluetooth/status"), std::nullopt);
}

} // namespace zel_test
