#pragma once
// The words, keys and records of locations, contacts, calendar, camera, Bluetooth, Wi-Fi and messages.

#include "word-setting.h"

namespace zel_test {

// A setting of one key that is compared and exported as a text where it is recorded.
constexpr ExpectedSetting kept(ZelSvcElementId element, const char *tag, const char *parent, bool is_boolean,
                               std::span<const ExpectedWord> words, const char *key, ZelSvcDataGroup group,
                               ExpectedRecord record, const char *label) {
    return {element, tag, is_boolean, words, {key}, group, {record}, label, true, true, parent};
}

inline constexpr ExpectedWord kSortWords[] = {{"firstname", 0}, {"lastname", 1}};
inline constexpr ExpectedWord kDayWords[] = {{"sunday", 0}, {"monday", 1}, {"saturday", 6}};
inline constexpr ExpectedWord kVisibilityWords[] = {{"off", 0}, {"on", -1}};
inline constexpr ExpectedWord kSleepWords[] = {{"always", 0}, {"plugged", 1}, {"never", 2}};
inline constexpr ExpectedWord kBearerWords[] = {{"ps", 1}, {"cs", 2}, {"psfirst", 3}};
inline constexpr ExpectedWord kThresholdWords[] = {{"pagecount", 0}, {"charcount", 1}};
inline constexpr ExpectedWord kCharacterWords[] = {{"gsmalpha", 0}, {"unicode", 2}, {"automatic", 3}};
inline constexpr ExpectedWord kValidityWords[] = {{"readfromsim", 0}, {"maximum", 255}};
inline constexpr ExpectedWord kLoadingWords[] = {{"always", 0}, {"prompt", 1}, {"never", 2}};
inline constexpr ExpectedWord kPriorityWords[] = {{"low", 0}, {"normal", 1}, {"high", 2}};
inline constexpr ExpectedWord kExpiryWords[] = {
    {"max", 0}, {"1d", 86400}, {"2d", 172800}, {"1w", 604800}, {"2w", 1209600}};
inline constexpr ExpectedWord kDeliveryWords[] = {
    {"imm", 0}, {"1h", 3600}, {"1d", 86400}, {"1w", 604800}, {"custom", 604801}};
inline constexpr ExpectedWord kCreationWords[] = {{"restricted", 0}, {"warning", 1}, {"free", 2}};
inline constexpr ExpectedWord kCookieWords[] = {{"accept", 1}, {"reject", 0}};
inline constexpr ExpectedWord kHomeWords[] = {{"auto", 0}, {"manual", 1}, {"reject", 3}};
inline constexpr ExpectedWord kRoamingWords[] = {{"auto", 0}, {"manual", 1}, {"restricted", 2}, {"reject", 3}};

// clang-format off
inline constexpr ExpectedSetting kExpectedPersonal[] = {
    // The second key and record of a location that is switched on have tests of their own.
    kept(ZEL_SVC_ELEMENT_GPS_ACTIVATION, "GPSActivation", nullptr, false, kSwitchWords, "db/location/setting/GpsEnabled",
         ZEL_SVC_DATA_GPS, {"gps", "gps_activation"}, "[GPS/GPSActivation]"),
    {ZEL_SVC_ELEMENT_CONTACT_SORT, "ContactSort", false, kSortWords,
     {"db/contacts-svc/name_sorting_order", "db/contacts-svc/name_display_order"},
     ZEL_SVC_DATA_CONTACT, {{"contact", "sort"}}, "[Contact/ContactSort]", true, true},
    {ZEL_SVC_ELEMENT_START_DAY, "StartDay", false, kDayWords,
     {"db/private/com.quorvex.calendar-lite/first_day_of_week", "db/private/com.quorvex.clock/alarm/start_of_weekday"},
     ZEL_SVC_DATA_CALENDAR, {{"Calendar", "start_day"}}, "[Calendar/StartDay]", true, true, nullptr, true},
    kept(ZEL_SVC_ELEMENT_SHUTTER_SOUND, "ShutterSound", nullptr, false, kSwitchWords, "file/camera/shutter_sound_policy",
         ZEL_SVC_DATA_MULTIMEDIA, {"camera", "shutter_sound"}, "[Camera/ShutterSound]"),
    kept(ZEL_SVC_ELEMENT_BT_ACTIVATION, "Activation", "BT", false, kSwitchWords, "db/bluetooth/status",
         ZEL_SVC_DATA_CONNECTIVITY, {"bluetooth", "activation"}, "[Bluetooth/Activation]"),
    kept(ZEL_SVC_ELEMENT_BT_VISIBILITY, "Visibility", "BT", false, kVisibilityWords,
         "file/private/libug-setting-bluetooth-efl/visibility_time",
         ZEL_SVC_DATA_CONNECTIVITY, {"bluetooth", "visibility"}, "[Bluetooth/Visibility]"),
    kept(ZEL_SVC_ELEMENT_SLEEP_POLICY, "SleepPolicy", nullptr, false, kSleepWords, "file/private/wifi/sleep_policy",
         ZEL_SVC_DATA_CONNECTIVITY, {"wifi", "sleep_policy"}, "[WiFi/SleepPolicy]"),
};

inline constexpr ExpectedSetting kExpectedBrowser[] = {
    kept(ZEL_SVC_ELEMENT_COOKIE_OPTION, "CookieOption", nullptr, false, kCookieWords, "file/private/com.quorvex.browser/cookie",
         ZEL_SVC_DATA_BROWSER, {"browser", "cookie_opt"}, "[Browser/CookieOption]"),
};

inline constexpr ExpectedSetting kExpectedSms[] = {
    kept(ZEL_SVC_ELEMENT_REPLY_PATH, "ReplyPath", nullptr, true, kSwitchWords,
         "db/private/msg-service/sms_send/reply_path", ZEL_SVC_DATA_MESSAGE, {"sms", "reply_path"}, "[SMS/ReplyPath]"),
    kept(ZEL_SVC_ELEMENT_DELIVERY_REPORT, "DeliveryReport", nullptr, true, kSwitchWords,
         "db/private/msg-service/sms_send/delivery_report", ZEL_SVC_DATA_MESSAGE, {"sms", "delivery_report"}, "[SMS/DeliveryReport]"),
    kept(ZEL_SVC_ELEMENT_SMS_KEEP_COPY, "KeepCopy", "SMS", true, kSwitchWords,
         "db/private/msg-service/general/keep_copy", ZEL_SVC_DATA_MESSAGE, {"sms", "keep_copy"}, "[SMS/KeepCopy]"),
    kept(ZEL_SVC_ELEMENT_FONT_SIZE_BY_VOLUME_KEY, "FontSizeByVolumeKey", nullptr, true, kSwitchWords,
         "db/private/com.quorvex.message-lite/use_volume_key", ZEL_SVC_DATA_MESSAGE, {"sms", "font_size_by_vol_key"}, "[SMS/FontSizeByVolumeKey]"),
    kept(ZEL_SVC_ELEMENT_SSMS, "SSMS", nullptr, true, kSwitchWords,
         "db/msg/ssms", ZEL_SVC_DATA_MESSAGE, {"sms", "ssms"}, "[SMS/SSMS]"),
    kept(ZEL_SVC_ELEMENT_IMEI_TRACKER, "ImeiTracker", nullptr, true, kSwitchWords,
         "db/private/msg-service/imei_tracker/enable", ZEL_SVC_DATA_MESSAGE, {"sms", "imei_tracker"}, "[SMS/ImeiTracker]"),
    kept(ZEL_SVC_ELEMENT_SMS_BEARER, "Bearer", "SMS", false, kBearerWords,
         "db/msg/network_mode", ZEL_SVC_DATA_MESSAGE, {"sms", "bearer"}, "[SMS/Bearer]"),
    kept(ZEL_SVC_ELEMENT_THRESHOLD_TYPE, "ThresholdType", nullptr, false, kThresholdWords,
         "db/private/com.quorvex.message-lite/sms_mms_threshold_type", ZEL_SVC_DATA_MESSAGE, {"sms", "threshold_type"}, "[SMS/ThresholdType]"),
    kept(ZEL_SVC_ELEMENT_CHAR_SUPPORT, "CharSupport", nullptr, false, kCharacterWords,
         "db/private/msg-service/sms_send/dcs", ZEL_SVC_DATA_MESSAGE, {"sms", "char_support"}, "[SMS/CharSupport]"),
    kept(ZEL_SVC_ELEMENT_VALIDITY_PERIOD, "ValidityPeriod", nullptr, false, kValidityWords,
         "db/msg/validity_period", ZEL_SVC_DATA_MESSAGE, {"sms", "validity_period"}, "[SMS/ValidityPeriod]"),
    kept(ZEL_SVC_ELEMENT_PUSH_MSG_REC_OPTION, "RecOption", "PushMsg", true, kSwitchWords,
         "db/private/msg-service/push_msg/recv_option", ZEL_SVC_DATA_MESSAGE, {"push_msg", "recv_option"}, "[PushMsg/RecOption]"),
    kept(ZEL_SVC_ELEMENT_PUSH_LOADING, "PushLoading", nullptr, false, kLoadingWords,
         "db/private/msg-service/push_msg/service_load", ZEL_SVC_DATA_MESSAGE, {"push_msg", "loading"}, "[PushMsg/PushLoading]"),
};

inline constexpr ExpectedSetting kExpectedMms[] = {
    kept(ZEL_SVC_ELEMENT_MMS_SENDING_REQ_DELIVERY_REP, "ReqDeliveryRep", "MmsSending", true, kSwitchWords,
         "db/private/msg-service/mms_send/delivery_report", ZEL_SVC_DATA_MESSAGE, {"mms", "send_delivery_report"}, "[MMS/ReqDeliveryRep]"),
    kept(ZEL_SVC_ELEMENT_HIDE_ADDRESS, "HideAddress", nullptr, true, kSwitchWords,
         "db/private/msg-service/mms_send/hide_recipients", ZEL_SVC_DATA_MESSAGE, {"mms", "send_hide_addr"}, "[MMS/HideAddress]"),
    kept(ZEL_SVC_ELEMENT_MMS_SENDING_REQ_READ_REP, "ReqReadRep", "MmsSending", true, kSwitchWords,
         "db/private/msg-service/mms_send/read_reply", ZEL_SVC_DATA_MESSAGE, {"mms", "send_read_report"}, "[MMS/ReqReadRep]"),
    kept(ZEL_SVC_ELEMENT_MMS_SENDING_KEEP_COPY, "KeepCopy", "MmsSending", true, kSwitchWords,
         "db/private/msg-service/mms_send/keep_copy", ZEL_SVC_DATA_MESSAGE, {"mms", "send_keep_copy"}, "[MMS/KeepCopy]"),
    kept(ZEL_SVC_ELEMENT_SEND_READ_REP, "SendReadRep", nullptr, true, kSwitchWords,
         "db/private/msg-service/mms_recv/read_receipt", ZEL_SVC_DATA_MESSAGE, {"mms", "recv_send_read_report"}, "[MMS/SendReadRep]"),
    kept(ZEL_SVC_ELEMENT_SEND_DELIVERY_REP, "SendDeliveryRep", nullptr, true, kSwitchWords,
         "db/private/msg-service/mms_recv/delivery_receipt", ZEL_SVC_DATA_MESSAGE, {"mms", "recv_send_delivery_report"}, "[MMS/SendDeliveryRep]"),
    kept(ZEL_SVC_ELEMENT_ANONYM_REC, "AnonymRec", nullptr, true, kSwitchWords,
         "db/private/msg-service/mms_recv/reject_unknown", ZEL_SVC_DATA_MESSAGE, {"mms", "recv_reject_unknown"}, "[MMS/AnonymRec]"),
    kept(ZEL_SVC_ELEMENT_ADVERT_REC, "AdvertRec", nullptr, true, kSwitchWords,
         "db/private/msg-service/mms_recv/reject_advertisement", ZEL_SVC_DATA_MESSAGE, {"mms", "recv_reject_ad"}, "[MMS/AdvertRec]"),
    kept(ZEL_SVC_ELEMENT_MMS_SENDING_PRIORITY, "Priority", "MmsSending", false, kPriorityWords,
         "db/private/msg-service/mms_send/priority", ZEL_SVC_DATA_MESSAGE, {"mms", "send_priority"}, "[MMS/Priority]"),
    kept(ZEL_SVC_ELEMENT_MMS_SENDING_EXPIRY, "Expiry", "MmsSending", false, kExpiryWords,
         "db/private/msg-service/mms_send/expiry_time", ZEL_SVC_DATA_MESSAGE, {"mms", "send_expiry_time"}, "[MMS/Expiry]"),
    kept(ZEL_SVC_ELEMENT_DELIVERY_TIME, "DeliveryTime", nullptr, false, kDeliveryWords,
         "db/private/msg-service/mms_send/delivery_time", ZEL_SVC_DATA_MESSAGE, {"mms", "send_delivery_time"}, "[MMS/DeliveryTime]"),
    kept(ZEL_SVC_ELEMENT_CREATION_MODE, "CreationMode", nullptr, false, kCreationWords,
         "db/private/msg-service/mms_send/creation_mode", ZEL_SVC_DATA_MESSAGE, {"mms", "send_creation_mode"}, "[MMS/CreationMode]"),
    kept(ZEL_SVC_ELEMENT_MMS_RECEIVING_HOME, "Home", "MmsReceiving", false, kHomeWords,
         "db/private/msg-service/mms_recv/home_network", ZEL_SVC_DATA_MESSAGE, {"mms", "recv_home_net"}, "[MMS/Home]"),
    kept(ZEL_SVC_ELEMENT_MMS_RECEIVING_ROAMING, "Roaming", "MmsReceiving", false, kRoamingWords,
         "db/private/msg-service/mms_recv/abroad_network", ZEL_SVC_DATA_MESSAGE, {"mms", "recv_roaming_net"}, "[MMS/Roaming]"),
};
// clang-format on

} // namespace zel_test
