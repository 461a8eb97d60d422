#pragma once
// A setting: one element, what it accepts, where it goes, where it is recorded, how it is compared and how
// it is exported. A group is a table of these; one engine installs, verifies and exports them all.
//
//     constexpr Setting kContactSettings[] = {
//         {.element = ZEL_SVC_ELEMENT_CLI_DIGITS,
//          .accepts = numbers(7, 11),
//          .stores = {{KeyType::Int, "db/contacts-svc/phonenumber_min_match_digit"}},
//          .records = {{ZEL_SVC_DATA_CONTACT, "contact", "match_digit"}},
//          .report = number_in("Contact", "-999"),
//          .exports = if_recorded("-999")},
//     };
//
//     void zel_svc_element_act_contact_value(Occurrence &o) { zel_svc_setting_handle(kContactSettings, o); }
//
// Install: a text that is not accepted changes nothing. The stores are written in order and the first
// refusal stops the setting; a record is written once the stores that it waits for were.
// Verify: an accepted text is compared with the first store, and one line is added.
// Export: the first store's value as a spec text.
//
// A setting with one odd step names a function for exactly that step; its other columns stay true, so that
// whoever reads the row (a checker, the manual, completion) need not know the function.

#include "handler/zel-svc-accepts.h"
#include "spec/zel-svc-data.h"
#include "spec/zel-svc-occurrence.h"

#include <cstdint>
#include <optional>
#include <span>
#include <string>
#include <string_view>

enum class KeyType { Int, Bool, String };

// A key of the settings store. A null key is an unused place.
struct Store {
    KeyType type = KeyType::Int;
    const char *key = nullptr;
};

enum class RecordForm {
    Number,   // the number that the text stands for
    SpecText, // the text as it stands in the spec
};

inline constexpr std::size_t kAfterAllStores = SIZE_MAX;

// An entry of the section store. A null key is an unused place.
struct Record {
    ZelSvcDataGroup group = ZEL_SVC_DATA_MAIN;
    const char *section = nullptr;
    const char *key = nullptr;
    RecordForm form = RecordForm::Number;
    std::size_t after = kAfterAllStores; // how many stores must have been written
};

// How verification compares and what it says. `label` stands in front of the tag, "[Sound/KeyVolume]"; an
// empty one leaves "[KeyVolume]".
struct Report {
    enum class As { Nothing, Text, Number, Volume };
    enum class Unreadable { ShownAs, NoLine };

    As as = As::Nothing;
    std::string_view label = {};
    Unreadable unreadable = Unreadable::ShownAs;
    std::string_view shown_as = "??"; // what stands for a value that cannot be read
};

constexpr Report no_report() { return {}; }
constexpr Report text_in(std::string_view label) { return {.as = Report::As::Text, .label = label}; }
constexpr Report text_if_readable() { return {.as = Report::As::Text, .unreadable = Report::Unreadable::NoLine}; }
// Compared as numbers, so that "07" equals 7.
constexpr Report number_in(std::string_view label, std::string_view unreadable) {
    return {.as = Report::As::Number, .label = label, .shown_as = unreadable};
}
constexpr Report volume_if_readable() { return {.as = Report::As::Volume, .unreadable = Report::Unreadable::NoLine}; }

// When the export says something, and what stands for a value that cannot be read. An odd encode step runs
// only when this says so: `when` tells whether, the step tells what.
struct Export {
    enum class When { Never, Recorded, Readable, Always };

    When when = When::Never;
    std::string_view shown_as = "??";
};

constexpr Export never() { return {}; }
constexpr Export if_recorded(std::string_view unreadable = "??") { return {Export::When::Recorded, unreadable}; }
constexpr Export if_readable() { return {Export::When::Readable, ""}; }
constexpr Export always(std::string_view unreadable = "??") { return {Export::When::Always, unreadable}; }

struct Setting;
using SettingStep = void (*)(const Setting &, Occurrence &);

struct Setting {
    ZelSvcElementId element;
    ZelSvcAutoFlag auto_flag = ZEL_SVC_AUTO_NEVER; // verified only while this flag is not 1
    Accepts accepts = any_text();
    Store stores[3]; // unused places are empty
    Record records[3];
    Report report = no_report();
    Export exports = never();
    // Odd steps, each in place of the engine's. Install and verify steps get accepted texts only.
    SettingStep install = nullptr;
    SettingStep verify = nullptr;
    SettingStep encode = nullptr;
};

// Runs the occurrence on the row of its element; does nothing when the table has none.
void zel_svc_setting_handle(std::span<const Setting> settings, Occurrence &occurrence);

const Setting *zel_svc_setting_find(std::span<const Setting> settings, ZelSvcElementId element);

// The engine's own steps, for odd ones that add to them and for records that end in a setting.
// Installing returns whether every store and record was written.
bool zel_svc_setting_install(const Setting &setting, std::string_view text);
void zel_svc_setting_verify(const Setting &setting, std::string_view tag, std::string_view text);
void zel_svc_setting_encode(const Setting &setting, ZelSvcExportText &out);

// The phone's value of the first store as a spec text; nothing when it cannot be read. A value outside the
// accepted ones gives "??".
std::optional<std::string> zel_svc_setting_phone_text(const Setting &setting);
bool zel_svc_setting_is_recorded(const Setting &setting); // its first record exists

// One place of a row, for odd steps that keep their keys in the columns. Writing a store uses the number or
// the text, as its type wants; a read gives nothing for a key of another type.
bool zel_svc_store_write(const Store &store, std::int32_t value, std::string_view text);
std::optional<std::int32_t> zel_svc_store_number(const Store &store);
std::optional<std::string> zel_svc_store_text(const Store &store);
void zel_svc_setting_record(const Record &record, std::int32_t value, std::string_view text);

// Adds one line "[label/tag] Spec='...',Phone='...'"; an empty label leaves "[tag]".
void zel_svc_setting_add_result(std::string_view label, std::string_view tag, std::string_view spec,
                                std::string_view phone, bool matched);
