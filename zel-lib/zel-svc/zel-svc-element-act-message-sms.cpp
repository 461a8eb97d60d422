#include "zel-svc-element-act-message.h"

#include "handler/zel-svc-record.h"
#include "handler/zel-svc-setting-rows.h"

namespace {

constexpr SettingSection kSms{ZEL_SVC_DATA_MESSAGE, "sms", "SMS"};

constexpr Word kBearers[] = {{"ps", 1}, {"cs", 2}, {"psfirst", 3}};
constexpr Word kThresholdTypes[] = {{"pagecount", 0}, {"charcount", 1}};
// The 1 between them has no text, deliberately.
constexpr Word kCharacterSets[] = {{"gsmalpha", 0}, {"unicode", 2}, {"automatic", 3}};
constexpr Word kValidityPeriods[] = {{"readfromsim", 0}, {"maximum", 255}};

int gChannel = 0;

void begin_channels(const Setting &setting, Occurrence &occurrence) {
    zel_svc_setting_install(setting, occurrence.text);
    gChannel = 1;
}

void record_channel(const Setting &setting, Occurrence &occurrence) {
    const Record &channel = setting.records[0];
    const FieldRules numbered{.record = {.key = channel.key, .form = FieldForm::NumberIfGiven}};
    zel_svc_field_save(channel.group, channel.section, numbered, gChannel++, occurrence.text);
}

// clang-format off
constexpr Setting kSmsSettings[] = {
    recorded       (kSms, ZEL_SVC_ELEMENT_SMS_BEARER,              words(kBearers),         int_key("db/msg/network_mode"),                                         "bearer"),
    recorded_switch(kSms, ZEL_SVC_ELEMENT_REPLY_PATH,              "db/private/msg-service/sms_send/reply_path",           "reply_path"),
    recorded_switch(kSms, ZEL_SVC_ELEMENT_DELIVERY_REPORT,         "db/private/msg-service/sms_send/delivery_report",      "delivery_report"),
    recorded       (kSms, ZEL_SVC_ELEMENT_PAGE_LIMIT,              any_number(),            int_key("db/private/com.quorvex.message-lite/sms_page_limit"),          "page_limit"),
    recorded       (kSms, ZEL_SVC_ELEMENT_THRESHOLD_TYPE,          words(kThresholdTypes),  int_key("db/private/com.quorvex.message-lite/sms_mms_threshold_type"),  "threshold_type"),
    recorded       (kSms, ZEL_SVC_ELEMENT_THRESHOLD_VALUE,         any_number(),            int_key("db/private/com.quorvex.message-lite/sms_mms_threshold"),       "threshold_value"),
    recorded       (kSms, ZEL_SVC_ELEMENT_MAX_RECIPIENT,           any_number(),            int_key("db/private/com.quorvex.message-lite/sms_recipient_count_limit"), "max_recipient"),
    recorded_switch(kSms, ZEL_SVC_ELEMENT_SMS_KEEP_COPY,           "db/private/msg-service/general/keep_copy",             "keep_copy"),
    recorded       (kSms, ZEL_SVC_ELEMENT_CHAR_SUPPORT,            words(kCharacterSets),   int_key("db/private/msg-service/sms_send/dcs"),                         "char_support"),
    recorded_switch(kSms, ZEL_SVC_ELEMENT_FONT_SIZE_BY_VOLUME_KEY, "db/private/com.quorvex.message-lite/use_volume_key",   "font_size_by_vol_key"),
    recorded       (kSms, ZEL_SVC_ELEMENT_VALIDITY_PERIOD,         words(kValidityPeriods), int_key("db/msg/validity_period"),                                      "validity_period"),
    recorded_switch(kSms, ZEL_SVC_ELEMENT_SSMS,                    "db/msg/ssms",                                          "ssms"),
    recorded_switch(kSms, ZEL_SVC_ELEMENT_IMEI_TRACKER,            "db/private/msg-service/imei_tracker/enable",           "imei_tracker"),
    {.element = ZEL_SVC_ELEMENT_CELL_BROADCAST, .accepts = on_off(), .records = {{ZEL_SVC_DATA_MESSAGE, "sms", "cb"}}},
    {.element = ZEL_SVC_ELEMENT_NB_CELL_BROADCAST_CHANNEL, .accepts = any_number(), .records = {{ZEL_SVC_DATA_MESSAGE, "sms", "cb_channel_count"}}, .install = begin_channels},
    {.element = ZEL_SVC_ELEMENT_CELL_BROADCAST_CHANNEL, .accepts = any_number(), .records = {{ZEL_SVC_DATA_MESSAGE, "sms", "cb_channel_%d"}}, .install = record_channel},
};
// clang-format on

} // namespace

std::span<const Setting> zel_svc_sms_settings() { return kSmsSettings; }

void zel_svc_element_act_message_sms_value(Occurrence &occurrence) { zel_svc_setting_handle(kSmsSettings, occurrence); }
