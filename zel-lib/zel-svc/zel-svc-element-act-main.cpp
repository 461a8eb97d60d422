#include "zel-svc-element-act-main.h"

namespace {

constexpr Word kPredictions[] = {{"enable", 1}, {"disable", 0}};
constexpr Word kDateFormats[] = {{"ddmmyyyy", 0}, {"mmddyyyy", 1}, {"yyyymmdd", 2}};
constexpr Word kTimeFormats[] = {{"12h", 1}, {"24h", 2}};

// One level for the speaker and the earphone; recorded as the spec wrote it.
constexpr Setting level(ZelSvcElementId element, const char *key, const char *record) {
    return {.element = element,
            .accepts = volume(),
            .stores = {{KeyType::Int, key}},
            .records = {{ZEL_SVC_DATA_MAIN, "sound", record, RecordForm::SpecText}},
            .report = volume_if_readable(),
            .exports = if_readable()};
}

// A switch of the call service, which keeps it: it is neither recorded nor missed when it cannot be read.
constexpr Setting call_tone(ZelSvcElementId element, const char *key) {
    return {.element = element,
            .accepts = on_off(),
            .stores = {{KeyType::Bool, key}},
            .report = text_if_readable(),
            .exports = if_readable()};
}

constexpr Setting kMainSettings[] = {
    level(ZEL_SVC_ELEMENT_RNG_VOLUME, "db/private/sound/volume/ringtone", "ring_vol"),
    level(ZEL_SVC_ELEMENT_MSG_TONE_VOLUME, "db/private/sound/volume/notification", "msg_vol"),
    level(ZEL_SVC_ELEMENT_KEY_VOLUME, "db/private/sound/volume/system", "sys_vol"),
    {.element = ZEL_SVC_ELEMENT_TOUCH_TONE,
     .accepts = on_off(),
     .stores = {{KeyType::Bool, "db/setting/sound/touch_sounds"}, {KeyType::Bool, "db/setting/sound/button_sounds"}},
     .records = {{ZEL_SVC_DATA_MAIN, "sound", "touch_sound"}, {ZEL_SVC_DATA_MAIN, "sound", "button_sound"}},
     .report = text_in("Sound"),
     .exports = if_recorded()},
    call_tone(ZEL_SVC_ELEMENT_CONNECT_TONE, "db/ciss/call_connect_tone"),
    call_tone(ZEL_SVC_ELEMENT_MINUTE_MIND, "db/ciss/minute_minder"),
    call_tone(ZEL_SVC_ELEMENT_CALL_END_TONE, "db/ciss/call_end_tone"),
    call_tone(ZEL_SVC_ELEMENT_CALL_NOISE_REDUCTION, "db/ciss/noise_reduction"),
    {.element = ZEL_SVC_ELEMENT_T9_ENABLING,
     .accepts = words(kPredictions),
     .stores = {{KeyType::Bool, "db/ise/swiftkey/prediction_val"}},
     .records = {{ZEL_SVC_DATA_MAIN, "phone", "predictive_text"}},
     .report = text_in("Phone"),
     .exports = if_recorded()},
    {.element = ZEL_SVC_ELEMENT_DATE_FORMAT,
     .accepts = words(kDateFormats),
     .stores = {{KeyType::Int, "db/setting/date_format"}},
     .records = {{ZEL_SVC_DATA_MAIN, "phone", "date_format"}},
     .report = text_in("Phone"),
     .exports = if_recorded()},
    {.element = ZEL_SVC_ELEMENT_TIME_FORMAT,
     .accepts = words(kTimeFormats),
     .stores = {{KeyType::Int, "db/menu_widget/regionformat_time1224"}},
     .records = {{ZEL_SVC_DATA_MAIN, "phone", "time_format"}},
     .report = text_in("Phone"),
     .exports = if_recorded()},
    {.element = ZEL_SVC_ELEMENT_TIMEZONE_UPDATE,
     .accepts = on_off(),
     .stores = {{KeyType::Bool, "db/setting/automatic_time_update"}},
     .records = {{ZEL_SVC_DATA_MAIN, "phone", "timezone_update"}},
     .report = text_in("Phone"),
     .exports = if_recorded()},
};

} // namespace

std::span<const Setting> zel_svc_main_settings() { return kMainSettings; }

void zel_svc_element_act_main_value(Occurrence &occurrence) { zel_svc_setting_handle(kMainSettings, occurrence); }
