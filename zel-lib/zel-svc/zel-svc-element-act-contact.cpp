#include "zel-svc-element-act-contact.h"

namespace {

constexpr Word kSortOrders[] = {{"firstname", 0}, {"lastname", 1}};
constexpr Word kStartDays[] = {{"sunday", 0}, {"monday", 1}, {"saturday", 6}};

constexpr std::size_t kAfterFirstStore = 1;

constexpr Setting kContactSettings[] = {
    {.element = ZEL_SVC_ELEMENT_CONTACT_SORT,
     .accepts = words(kSortOrders),
     .stores = {{KeyType::Int, "db/contacts-svc/name_sorting_order"},
                {KeyType::Int, "db/contacts-svc/name_display_order"}},
     .records = {{ZEL_SVC_DATA_CONTACT, "contact", "sort"}},
     .report = text_in("Contact"),
     .exports = if_recorded()},
    {.element = ZEL_SVC_ELEMENT_CLI_DIGITS,
     .accepts = numbers(7, 11),
     .stores = {{KeyType::Int, "db/contacts-svc/phonenumber_min_match_digit"}},
     .records = {{ZEL_SVC_DATA_CONTACT, "contact", "match_digit"}},
     .report = number_in("Contact", "-999"),
     .exports = if_recorded("-999")},
    // The week of the alarm clock follows the calendar's; the record is the calendar's alone.
    {.element = ZEL_SVC_ELEMENT_START_DAY,
     .accepts = words(kStartDays),
     .stores = {{KeyType::Int, "db/private/com.quorvex.calendar-lite/first_day_of_week"},
                {KeyType::Int, "db/private/com.quorvex.clock/alarm/start_of_weekday"}},
     .records = {{ZEL_SVC_DATA_CALENDAR, "Calendar", "start_day", RecordForm::Number, kAfterFirstStore}},
     .report = text_in("Calendar"),
     .exports = if_recorded()},
};

} // namespace

std::span<const Setting> zel_svc_contact_settings() { return kContactSettings; }

void zel_svc_element_act_contact_value(Occurrence &occurrence) { zel_svc_setting_handle(kContactSettings, occurrence); }
