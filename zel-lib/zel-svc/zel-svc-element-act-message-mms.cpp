#include "zel-svc-element-act-message.h"

#include "handler/zel-svc-setting-rows.h"

namespace {

constexpr SettingSection kMms{ZEL_SVC_DATA_MESSAGE, "mms", "MMS"};

constexpr Word kPriorities[] = {{"low", 0}, {"normal", 1}, {"high", 2}};
// Seconds.
constexpr Word kExpiries[] = {{"max", 0}, {"1d", 86400}, {"2d", 172800}, {"1w", 604800}, {"2w", 1209600}};
// "custom" is told from a week by one second more; the time itself is DeliveryCustTime.
constexpr Word kDeliveryTimes[] = {{"imm", 0}, {"1h", 3600}, {"1d", 86400}, {"1w", 604800}, {"custom", 604801}};
constexpr Word kCreationModes[] = {{"restricted", 0}, {"warning", 1}, {"free", 2}};
// At home nothing is restricted, so 2 has no word there.
constexpr Word kHomeRetrievals[] = {{"auto", 0}, {"manual", 1}, {"reject", 3}};
constexpr Word kRoamingRetrievals[] = {{"auto", 0}, {"manual", 1}, {"restricted", 2}, {"reject", 3}};

// clang-format off
constexpr Setting kMmsSettings[] = {
    recorded_switch(kMms, ZEL_SVC_ELEMENT_MMS_SENDING_REQ_DELIVERY_REP, "db/private/msg-service/mms_send/delivery_report",      "send_delivery_report"),
    recorded_switch(kMms, ZEL_SVC_ELEMENT_HIDE_ADDRESS,                 "db/private/msg-service/mms_send/hide_recipients",      "send_hide_addr"),
    recorded_switch(kMms, ZEL_SVC_ELEMENT_MMS_SENDING_REQ_READ_REP,     "db/private/msg-service/mms_send/read_reply",           "send_read_report"),
    recorded       (kMms, ZEL_SVC_ELEMENT_MMS_SENDING_PRIORITY,         words(kPriorities),        int_key("db/private/msg-service/mms_send/priority"),        "send_priority"),
    recorded       (kMms, ZEL_SVC_ELEMENT_MMS_SENDING_EXPIRY,           words(kExpiries),          int_key("db/private/msg-service/mms_send/expiry_time"),     "send_expiry_time"),
    recorded       (kMms, ZEL_SVC_ELEMENT_DELIVERY_TIME,                words(kDeliveryTimes),     int_key("db/private/msg-service/mms_send/delivery_time"),   "send_delivery_time"),
    recorded       (kMms, ZEL_SVC_ELEMENT_DELIVERY_CUST_TIME,           any_number(),              int_key("db/private/msg-service/mms_send/custom_delivery"), "send_delivery_cust_time"),
    recorded       (kMms, ZEL_SVC_ELEMENT_CREATION_MODE,                words(kCreationModes),     int_key("db/private/msg-service/mms_send/creation_mode"),   "send_creation_mode"),
    recorded_switch(kMms, ZEL_SVC_ELEMENT_MMS_SENDING_KEEP_COPY,        "db/private/msg-service/mms_send/keep_copy",            "send_keep_copy"),
    recorded       (kMms, ZEL_SVC_ELEMENT_MAX_RECIPIENT_MMS,            any_number(),              int_key("db/private/com.quorvex.message-lite/mms_recipient_count_limit"), "send_max_recipient"),
    recorded       (kMms, ZEL_SVC_ELEMENT_MMS_RECEIVING_HOME,           words(kHomeRetrievals),    int_key("db/private/msg-service/mms_recv/home_network"),    "recv_home_net"),
    recorded       (kMms, ZEL_SVC_ELEMENT_MMS_RECEIVING_ROAMING,        words(kRoamingRetrievals), int_key("db/private/msg-service/mms_recv/abroad_network"),  "recv_roaming_net"),
    recorded_switch(kMms, ZEL_SVC_ELEMENT_SEND_READ_REP,                "db/private/msg-service/mms_recv/read_receipt",         "recv_send_read_report"),
    recorded_switch(kMms, ZEL_SVC_ELEMENT_SEND_DELIVERY_REP,            "db/private/msg-service/mms_recv/delivery_receipt",     "recv_send_delivery_report"),
    recorded_switch(kMms, ZEL_SVC_ELEMENT_ANONYM_REC,                   "db/private/msg-service/mms_recv/reject_unknown",       "recv_reject_unknown"),
    recorded_switch(kMms, ZEL_SVC_ELEMENT_ADVERT_REC,                   "db/private/msg-service/mms_recv/reject_advertisement", "recv_reject_ad"),
};
// clang-format on

} // namespace

std::span<const Setting> zel_svc_mms_settings() { return kMmsSettings; }

void zel_svc_element_act_message_mms_value(Occurrence &occurrence) { zel_svc_setting_handle(kMmsSettings, occurrence); }
