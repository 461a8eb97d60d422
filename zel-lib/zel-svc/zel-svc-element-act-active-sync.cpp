#include "zel-svc-element-act-active-sync.h"

#include "handler/zel-svc-setting-rows.h"

namespace {

constexpr SettingSection kGeneral{ZEL_SVC_DATA_ACTIVE_SYNC, "general", "ActiveSync"};
constexpr SettingSection kSchedule{ZEL_SVC_DATA_ACTIVE_SYNC, "sync_schedule", "ActiveSync"};
constexpr SettingSection kEmail{ZEL_SVC_DATA_ACTIVE_SYNC, "email", "ActiveSync"};
constexpr SettingSection kCalendar{ZEL_SVC_DATA_ACTIVE_SYNC, "calendar", "ActiveSync"};

constexpr Word kDurations[] = {{"5m", 1}, {"15m", 3}, {"1h", 5}, {"2h", 8}, {"manual", 10}, {"push", 11}};
// One bit a day.
constexpr Word kDays[] = {{"sunday", 1},    {"monday", 2},  {"tuesday", 4},  {"wednesday", 8},
                          {"thursday", 16}, {"friday", 32}, {"saturday", 64}};
constexpr Word kEmailPeriods[] = {{"all", 0}, {"1d", 1}, {"3d", 2}, {"1w", 3}, {"2w", 4}, {"1m", 5}};
constexpr Word kEmailSizes[] = {{"2k", 3}, {"5k", 4}, {"10k", 5}, {"20k", 6}, {"50k", 7}, {"100k", 8}, {"all", 9}};
constexpr Word kCalendarPeriods[] = {{"all", 0}, {"2w", 1}, {"1m", 2}, {"3m", 3}, {"6m", 4}};

// Deliberately every text is taken, and "manual" alone is no.
void record_roaming(const Setting &setting, Occurrence &occurrence) {
    zel_svc_setting_record(setting.records[0], occurrence.text == "manual" ? 0 : 1, occurrence.text);
}

// clang-format off
constexpr Setting kActiveSyncSettings[] = {
    only_recorded     (kGeneral,  ZEL_SVC_ELEMENT_USE_SSL,               on_off(),                "use_ssl"),
    only_recorded     (kGeneral,  ZEL_SVC_ELEMENT_ACCEPT_ALL_SSL_CERT,   on_off(),                "accept_all_cert"),
    only_recorded     (kGeneral,  ZEL_SVC_ELEMENT_SYNC_CALENDAR,         on_off(),                "sync_calendar"),
    only_recorded     (kGeneral,  ZEL_SVC_ELEMENT_SYNC_CONTACTS,         on_off(),                "sync_contact"),
    only_recorded     (kGeneral,  ZEL_SVC_ELEMENT_SYNC_TASKS,            on_off(),                "sync_task"),
    only_recorded     (kGeneral,  ZEL_SVC_ELEMENT_SYNC_SMS,              on_off(),                "sync_sms"),
    {.element = ZEL_SVC_ELEMENT_ROAMING_SETTING, .records = {{ZEL_SVC_DATA_ACTIVE_SYNC, "general", "roaming"}}, .install = record_roaming},
    only_recorded_text(kGeneral,  ZEL_SVC_ELEMENT_ACTIVE_SYNC_SIGNATURE, any_text(),              "signature"),
    only_recorded     (kSchedule, ZEL_SVC_ELEMENT_PEAK_DURATION,         words(kDurations),       "peak_duration"),
    only_recorded     (kSchedule, ZEL_SVC_ELEMENT_OFF_PEAK_DURATION,     words(kDurations),       "off_peak_duration"),
    only_recorded     (kSchedule, ZEL_SVC_ELEMENT_PEAK_DAY_START,        words(kDays),            "peak_day_start"),
    only_recorded     (kSchedule, ZEL_SVC_ELEMENT_PEAK_DAY_END,          words(kDays),            "peak_day_end"),
    only_recorded_text(kSchedule, ZEL_SVC_ELEMENT_PEAK_TIME_START,       any_text(),              "peak_time_start"),
    only_recorded_text(kSchedule, ZEL_SVC_ELEMENT_PEAK_TIME_END,         any_text(),              "peak_time_end"),
    only_recorded     (kEmail,    ZEL_SVC_ELEMENT_PERIOD_EMAIL,          words(kEmailPeriods),    "period"),
    only_recorded     (kEmail,    ZEL_SVC_ELEMENT_SIZE_EMAIL,            words(kEmailSizes),      "size"),
    only_recorded     (kCalendar, ZEL_SVC_ELEMENT_PERIOD_CALENDAR,       words(kCalendarPeriods), "period"),
};
// clang-format on

} // namespace

std::span<const Setting> zel_svc_active_sync_settings() { return kActiveSyncSettings; }

void zel_svc_element_act_active_sync_value(Occurrence &occurrence) {
    zel_svc_setting_handle(kActiveSyncSettings, occurrence);
}
