#include "spec/zel-svc-element-table.h"

#include "zel-svc-element-act-active-sync.h"
#include "zel-svc-element-act-bookmark.h"
#include "zel-svc-element-act-browser.h"
#include "zel-svc-element-act-connection.h"
#include "zel-svc-element-act-connectivity.h"
#include "zel-svc-element-act-contact.h"
#include "zel-svc-element-act-email-account.h"
#include "zel-svc-element-act-email.h"
#include "zel-svc-element-act-fast-dormancy.h"
#include "zel-svc-element-act-general-info.h"
#include "zel-svc-element-act-gps.h"
#include "zel-svc-element-act-header.h"
#include "zel-svc-element-act-ims.h"
#include "zel-svc-element-act-main.h"
#include "zel-svc-element-act-max-pdp.h"
#include "zel-svc-element-act-message.h"
#include "zel-svc-element-act-multimedia.h"
#include "zel-svc-element-act-network-info.h"
#include "zel-svc-element-act-network.h"
#include "zel-svc-element-act-quick-access.h"
#include "zel-svc-element-act-security.h"
#include "zel-svc-element-act-syncml.h"
#include "zel-svc-element-act-voicemail.h"
#include "zel-svc-element-act-wb-amr.h"

// The only file that names handlers. One row a line, in the order that look-up depends on: a row with a
// parent stands before its namesake without one, and the first match wins.
//
// Columns: id, tag, parent ("" for any), start, value, end, repeats, enabled.

namespace {

constexpr Handler kNone = nullptr;
constexpr bool kRepeats = true;
constexpr bool kOnce = false;

} // namespace

// clang-format off
extern constexpr std::array<ZelSvcElement, ZEL_SVC_ELEMENT_COUNT> kZelSvcElementTable{{
    // root and document header
    {ZEL_SVC_ELEMENT_SW_CONFIGURATION,                "SW-Configuration",                "",                  kNone, kNone, kNone, kOnce, 0},
    {ZEL_SVC_ELEMENT_MOBILE_DATA,                     "MobileData",                      "",                  kNone, kNone, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_PUBLIC_NAME,                     "PublicName",                      "",                  kNone, kNone, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_NICK_NAME,                       "NickName",                        "",                  kNone, kNone, kNone, kOnce, 1},
    // customer list
    {ZEL_SVC_ELEMENT_CUSTOMER_DATA_SET,               "CustomerDataSet",                 "",                  kNone, kNone, zel_svc_element_act_header_end, kOnce, 1},
    {ZEL_SVC_ELEMENT_ZEL_NAME,                        "ZELName",                         "",                  kNone, zel_svc_element_act_header_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_ZEL_VERSION,                     "ZELVersion",                      "",                  kNone, zel_svc_element_act_header_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_NB_CUSTOMER,                     "NbCustomer",                      "",                  kNone, zel_svc_element_act_header_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_CUSTOMER_DATA_SET_CUSTOMER_DATA, "CustomerData",                    "CustomerDataSet",   zel_svc_element_act_header_customer_start, kNone, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_CUSTOMER_DATA,                   "CustomerData",                    "",                  kNone, kNone, kNone, kOnce, 1},
    // general information
    {ZEL_SVC_ELEMENT_GENERAL_INFO,                    "GeneralInfo",                     "",                  zel_svc_element_act_general_info_start, kNone, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_SALES_CODE,                      "SalesCode",                       "",                  kNone, zel_svc_element_act_general_info_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_COUNTRY_ISO,                     "CountryISO",                      "",                  kNone, zel_svc_element_act_general_info_value, kNone, kOnce, 1},
    // network identities
    {ZEL_SVC_ELEMENT_NETWORK_INFO,                    "NetworkInfo",                     "",                  zel_svc_element_act_network_info_start, kNone, zel_svc_element_act_network_info_end, kRepeats, 1},
    {ZEL_SVC_ELEMENT_MCCMNC,                          "MCCMNC",                          "",                  kNone, zel_svc_element_act_network_info_value, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_NETWORK_INFO_NETWORK_NAME,       "NetworkName",                     "NetworkInfo",       kNone, zel_svc_element_act_network_info_value, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_SP_CODE,                         "SPCode",                          "",                  kNone, zel_svc_element_act_network_info_value, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_SUBSET_CODE,                     "SubsetCode",                      "",                  kNone, zel_svc_element_act_network_info_value, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_SP_NAME,                         "SPName",                          "",                  kNone, zel_svc_element_act_network_info_value, kNone, kOnce, 1},
    // settings containers
    {ZEL_SVC_ELEMENT_SETTINGS,                        "Settings",                        "",                  kNone, kNone, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_MAIN,                            "Main",                            "",                  kNone, kNone, kNone, kOnce, 1},
    // security locks
    {ZEL_SVC_ELEMENT_SECURITY,                        "Security",                        "",                  zel_svc_element_act_security_start, kNone, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_NB_NETWORK_LOCK,                 "NbNetworkLock",                   "",                  kNone, zel_svc_element_act_security_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_NETWORK_LOCK,                    "NetworkLock",                     "",                  kNone, zel_svc_element_act_security_value, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_NB_SP_LOCK,                      "NbSPLock",                        "",                  kNone, zel_svc_element_act_security_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_SP_LOCK,                         "SPLock",                          "",                  kNone, zel_svc_element_act_security_value, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_NB_SUBSET_LOCK,                  "NbSubsetLock",                    "",                  kNone, zel_svc_element_act_security_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_SUBSET_LOCK,                     "SubsetLock",                      "",                  kNone, zel_svc_element_act_security_value, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_NB_CP_LOCK,                      "NbCPLock",                        "",                  kNone, zel_svc_element_act_security_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_CP_LOCK,                         "CPLock",                          "",                  kNone, zel_svc_element_act_security_value, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_AUTO_NETWORK_LOCK,               "AutoNetworkLock",                 "",                  kNone, zel_svc_element_act_security_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_AUTO_SIM_LOCK,                   "AutoSIMLock",                     "",                  kNone, zel_svc_element_act_security_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_AUTO_SP_LOCK,                    "AutoSPLock",                      "",                  kNone, zel_svc_element_act_security_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_UNLOCK_CNT,                      "UnlockCnt",                       "",                  kNone, zel_svc_element_act_security_value, kNone, kOnce, 1},
    // network Auto flags
    {ZEL_SVC_ELEMENT_NETWORK,                         "Network",                         "",                  zel_svc_element_act_network_start, kNone, zel_svc_element_act_network_end, kOnce, 1},
    {ZEL_SVC_ELEMENT_AUTO_PROFILE,                    "AutoProfile",                     "",                  kNone, zel_svc_element_act_network_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_AUTO_VOICEMAIL,                  "AutoVoicemail",                   "",                  kNone, zel_svc_element_act_network_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_AUTO_EMAIL_ACCOUNT,              "AutoEmailAccount",                "",                  kNone, zel_svc_element_act_network_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_AUTO_BOOKMARK,                   "AutoBookmark",                    "",                  kNone, zel_svc_element_act_network_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_AUTO_LINK,                       "AutoLink",                        "",                  kNone, zel_svc_element_act_network_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_AUTO_SYNCML,                     "AutoSyncML",                      "",                  kNone, zel_svc_element_act_network_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_AUTO_FOTA,                       "AutoFOTA",                        "",                  kNone, zel_svc_element_act_network_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_AUTO_FAST_DORMANCY,              "AutoFastDormancy",                "",                  kNone, zel_svc_element_act_network_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_AUTO_WB_AMR,                     "AutoWbAmr",                       "",                  kNone, zel_svc_element_act_network_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_AUTO_MAX_PDP,                    "AutoMaxPDP",                      "",                  kNone, zel_svc_element_act_network_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_AUTO_ATTACH,                     "AutoAttach",                      "",                  kNone, zel_svc_element_act_network_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_AUTO_DETACH,                     "AutoDetach",                      "",                  kNone, zel_svc_element_act_network_value, kNone, kOnce, 1},
    // maximum PDP contexts
    {ZEL_SVC_ELEMENT_NB_MAX_PDP,                      "NbMaxPDP",                        "",                  kNone, zel_svc_element_act_max_pdp_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_MAX_PDP,                         "MaxPDP",                          "",                  zel_svc_element_act_max_pdp_start, kNone, zel_svc_element_act_max_pdp_end, kRepeats, 1},
    {ZEL_SVC_ELEMENT_MAX_PDP_NETWORK_NAME,            "NetworkName",                     "MaxPDP",            kNone, zel_svc_element_act_max_pdp_value, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_MAX_PDP_2G,                      "MaxPDP2G",                        "",                  kNone, zel_svc_element_act_max_pdp_value, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_MAX_PDP_3G,                      "MaxPDP3G",                        "",                  kNone, zel_svc_element_act_max_pdp_value, kNone, kRepeats, 1},
    // wide-band AMR
    {ZEL_SVC_ELEMENT_NB_WB_AMR,                       "NbWbAmr",                         "",                  kNone, zel_svc_element_act_wb_amr_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_WB_AMR,                          "WbAmr",                           "",                  zel_svc_element_act_wb_amr_start, kNone, zel_svc_element_act_wb_amr_end, kRepeats, 1},
    {ZEL_SVC_ELEMENT_WB_AMR_NETWORK_NAME,             "NetworkName",                     "WbAmr",             kNone, zel_svc_element_act_wb_amr_value, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_WB_AMR_CODEC,                    "WbAmrCodec",                      "",                  kNone, zel_svc_element_act_wb_amr_value, kNone, kRepeats, 1},
    // fast dormancy
    {ZEL_SVC_ELEMENT_NB_FAST_DORMANCY,                "NbFastDormancy",                  "",                  kNone, zel_svc_element_act_fast_dormancy_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_FAST_DORMANCY,                   "FastDormancy",                    "",                  zel_svc_element_act_fast_dormancy_start, kNone, zel_svc_element_act_fast_dormancy_end, kRepeats, 1},
    {ZEL_SVC_ELEMENT_FAST_DORMANCY_NETWORK_NAME,      "NetworkName",                     "FastDormancy",      kNone, zel_svc_element_act_fast_dormancy_value, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_FAST_DORMANCY_ENABLE_STATUS,     "FastDormancyEnableStatus",        "",                  kNone, zel_svc_element_act_fast_dormancy_value, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_TIMEOUT_VALUE,                   "TimeoutValue",                    "",                  kNone, zel_svc_element_act_fast_dormancy_value, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_LCD_STATUS,                      "LCDStatus",                       "",                  kNone, zel_svc_element_act_fast_dormancy_value, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_FAST_DORMANCY_VERSION,           "Version",                         "FastDormancy",      kNone, zel_svc_element_act_fast_dormancy_value, kNone, kRepeats, 1},
    // display, sound, phone
    {ZEL_SVC_ELEMENT_DISPLAY,                         "Display",                         "",                  kNone, kNone, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_WALLPAPER,                       "Wallpaper",                       "",                  zel_svc_element_act_main_media_start, kNone, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_SOUND,                           "Sound",                           "",                  kNone, kNone, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_RNG_VOLUME,                      "RngVolume",                       "",                  kNone, zel_svc_element_act_main_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_RING_TONE,                       "RingTone",                        "",                  zel_svc_element_act_main_media_start, kNone, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_MSG_TONE_VOLUME,                 "MsgToneVolume",                   "",                  kNone, zel_svc_element_act_main_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_MESSAGE_TONE,                    "MessageTone",                     "",                  zel_svc_element_act_main_media_start, kNone, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_ALARM_TONE,                      "AlarmTone",                       "",                  zel_svc_element_act_main_media_start, kNone, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_KEY_TONE,                        "KeyTone",                         "",                  kNone, kNone, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_KEY_VOLUME,                      "KeyVolume",                       "",                  kNone, zel_svc_element_act_main_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_TOUCH_TONE,                      "TouchTone",                       "",                  kNone, zel_svc_element_act_main_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_EXTRA_SOUND,                     "ExtraSound",                      "",                  kNone, kNone, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_CONNECT_TONE,                    "ConnectTone",                     "",                  kNone, zel_svc_element_act_main_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_MINUTE_MIND,                     "MinuteMind",                      "",                  kNone, zel_svc_element_act_main_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_CALL_END_TONE,                   "CallEndTone",                     "",                  kNone, zel_svc_element_act_main_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_PHONE,                           "Phone",                           "",                  kNone, kNone, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_DEF_LANGUAGE,                    "DefLanguage",                     "",                  kNone, zel_svc_element_act_main_language_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_DEF_LANGUAGE_NO_SIM,             "DefLanguageNoSIM",                "",                  kNone, zel_svc_element_act_main_language_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_T9_ENABLING,                     "T9Enabling",                      "",                  kNone, zel_svc_element_act_main_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_DATE_TIME_FORMAT,                "DateTimeFormat",                  "",                  kNone, kNone, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_DATE_FORMAT,                     "DateFormat",                      "",                  kNone, zel_svc_element_act_main_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_TIME_FORMAT,                     "TimeFormat",                      "",                  kNone, zel_svc_element_act_main_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_TIMEZONE_UPDATE,                 "TimezoneUpdate",                  "",                  kNone, zel_svc_element_act_main_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_CALL_NOISE_REDUCTION,            "CallNoiseReduction",              "",                  kNone, zel_svc_element_act_main_value, kNone, kOnce, 1},
    // contact, calendar, camera, BT, Wi-Fi
    {ZEL_SVC_ELEMENT_CONTACT,                         "Contact",                         "",                  kNone, kNone, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_CONTACT_SORT,                    "ContactSort",                     "",                  kNone, zel_svc_element_act_contact_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_CLI_DIGITS,                      "CLIDigits",                       "",                  kNone, zel_svc_element_act_contact_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_CALENDAR,                        "Calendar",                        "",                  kNone, kNone, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_START_DAY,                       "StartDay",                        "",                  kNone, zel_svc_element_act_contact_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_MULTIMEDIA,                      "Multimedia",                      "",                  kNone, kNone, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_CAMERA,                          "Camera",                          "",                  kNone, kNone, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_SHUTTER_SOUND,                   "ShutterSound",                    "",                  kNone, zel_svc_element_act_multimedia_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_BT,                              "BT",                              "",                  kNone, kNone, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_BT_ACTIVATION,                   "Activation",                      "BT",                kNone, zel_svc_element_act_connectivity_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_BT_VISIBILITY,                   "Visibility",                      "BT",                kNone, zel_svc_element_act_connectivity_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_WIFI,                            "Wifi",                            "",                  kNone, kNone, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_SLEEP_POLICY,                    "SleepPolicy",                     "",                  kNone, zel_svc_element_act_connectivity_value, kNone, kOnce, 1},
    // voicemail
    {ZEL_SVC_ELEMENT_MESSAGES,                        "Messages",                        "",                  kNone, kNone, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_VOICEMAIL,                       "Voicemail",                       "",                  zel_svc_element_act_voicemail_start, kNone, zel_svc_element_act_voicemail_end, kRepeats, 1},
    {ZEL_SVC_ELEMENT_VOICEMAIL_NETWORK_NAME,          "NetworkName",                     "Voicemail",         kNone, zel_svc_element_act_voicemail_value, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_VOICEMAIL_NAME,                  "VoicemailName",                   "",                  kNone, zel_svc_element_act_voicemail_value, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_VOICEMAIL_TEL_NUM,               "TelNum",                          "Voicemail",         kNone, zel_svc_element_act_voicemail_value, kNone, kRepeats, 1},
    // SMS, cell broadcast, push, MMS
    {ZEL_SVC_ELEMENT_SMS,                             "SMS",                             "",                  kNone, kNone, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_SMS_BEARER,                      "Bearer",                          "SMS",               kNone, zel_svc_element_act_message_sms_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_REPLY_PATH,                      "ReplyPath",                       "",                  kNone, zel_svc_element_act_message_sms_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_DELIVERY_REPORT,                 "DeliveryReport",                  "",                  kNone, zel_svc_element_act_message_sms_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_PAGE_LIMIT,                      "PageLimit",                       "",                  kNone, zel_svc_element_act_message_sms_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_MSG_TYPE_THRESHOLD,              "MsgTypeThreshold",                "",                  kNone, kNone, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_THRESHOLD_TYPE,                  "ThresholdType",                   "",                  kNone, zel_svc_element_act_message_sms_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_THRESHOLD_VALUE,                 "ThresholdValue",                  "",                  kNone, zel_svc_element_act_message_sms_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_MAX_RECIPIENT,                   "MaxRecipient",                    "",                  kNone, zel_svc_element_act_message_sms_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_SMS_KEEP_COPY,                   "KeepCopy",                        "SMS",               kNone, zel_svc_element_act_message_sms_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_CHAR_SUPPORT,                    "CharSupport",                     "",                  kNone, zel_svc_element_act_message_sms_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_CELL_BROADCAST,                  "CellBroadcast",                   "",                  kNone, zel_svc_element_act_message_sms_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_NB_CELL_BROADCAST_CHANNEL,       "NbCellBroadcastChannel",          "",                  kNone, zel_svc_element_act_message_sms_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_CELL_BROADCAST_CHANNEL,          "CellBroadcastChannel",            "",                  kNone, zel_svc_element_act_message_sms_value, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_FONT_SIZE_BY_VOLUME_KEY,         "FontSizeByVolumeKey",             "",                  kNone, zel_svc_element_act_message_sms_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_VALIDITY_PERIOD,                 "ValidityPeriod",                  "",                  kNone, zel_svc_element_act_message_sms_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_SSMS,                            "SSMS",                            "",                  kNone, zel_svc_element_act_message_sms_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_IMEI_TRACKER,                    "ImeiTracker",                     "",                  kNone, zel_svc_element_act_message_sms_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_PUSH_MSG,                        "PushMsg",                         "",                  kNone, kNone, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_PUSH_MSG_REC_OPTION,             "RecOption",                       "PushMsg",           kNone, zel_svc_element_act_message_push_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_PUSH_LOADING,                    "PushLoading",                     "",                  kNone, zel_svc_element_act_message_push_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_MMS,                             "MMS",                             "",                  kNone, kNone, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_MMS_SENDING,                     "MmsSending",                      "",                  kNone, kNone, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_MMS_SENDING_REQ_DELIVERY_REP,    "ReqDeliveryRep",                  "MmsSending",        kNone, zel_svc_element_act_message_mms_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_HIDE_ADDRESS,                    "HideAddress",                     "",                  kNone, zel_svc_element_act_message_mms_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_MMS_SENDING_REQ_READ_REP,        "ReqReadRep",                      "MmsSending",        kNone, zel_svc_element_act_message_mms_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_MMS_SENDING_PRIORITY,            "Priority",                        "MmsSending",        kNone, zel_svc_element_act_message_mms_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_MMS_SENDING_EXPIRY,              "Expiry",                          "MmsSending",        kNone, zel_svc_element_act_message_mms_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_DELIVERY_TIME,                   "DeliveryTime",                    "",                  kNone, zel_svc_element_act_message_mms_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_DELIVERY_CUST_TIME,              "DeliveryCustTime",                "",                  kNone, zel_svc_element_act_message_mms_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_CREATION_MODE,                   "CreationMode",                    "",                  kNone, zel_svc_element_act_message_mms_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_MMS_SENDING_KEEP_COPY,           "KeepCopy",                        "MmsSending",        kNone, zel_svc_element_act_message_mms_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_MAX_RECIPIENT_MMS,               "MaxRecipientMMS",                 "",                  kNone, zel_svc_element_act_message_mms_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_MMS_RECEIVING,                   "MmsReceiving",                    "",                  kNone, kNone, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_MMS_RECEIVING_HOME,              "Home",                            "MmsReceiving",      kNone, zel_svc_element_act_message_mms_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_MMS_RECEIVING_ROAMING,           "Roaming",                         "MmsReceiving",      kNone, zel_svc_element_act_message_mms_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_SEND_READ_REP,                   "SendReadRep",                     "",                  kNone, zel_svc_element_act_message_mms_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_SEND_DELIVERY_REP,               "SendDeliveryRep",                 "",                  kNone, zel_svc_element_act_message_mms_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_ANONYM_REC,                      "AnonymRec",                       "",                  kNone, zel_svc_element_act_message_mms_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_ADVERT_REC,                      "AdvertRec",                       "",                  kNone, zel_svc_element_act_message_mms_value, kNone, kOnce, 1},
    // e-mail options
    {ZEL_SVC_ELEMENT_EMAIL,                           "Email",                           "",                  kNone, kNone, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_EMAIL_SENDING,                   "EmailSending",                    "",                  kNone, kNone, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_EMAIL_SENDING_KEEP_COPY,         "KeepCopy",                        "EmailSending",      kNone, zel_svc_element_act_email_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_SEND_ME_COPY,                    "SendMeCopy",                      "",                  kNone, zel_svc_element_act_email_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_EMAIL_SENDING_REQ_DELIVERY_REP,  "ReqDeliveryRep",                  "EmailSending",      kNone, zel_svc_element_act_email_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_EMAIL_SENDING_REQ_READ_REP,      "ReqReadRep",                      "EmailSending",      kNone, zel_svc_element_act_email_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_EMAIL_SENDING_PRIORITY,          "Priority",                        "EmailSending",      kNone, zel_svc_element_act_email_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_INC_BODY_REPLY,                  "IncBodyReply",                    "",                  kNone, zel_svc_element_act_email_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_INC_ATTACH_FWD,                  "IncAttachFwd",                    "",                  kNone, zel_svc_element_act_email_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_EMAIL_SENDING_SIGNATURE,         "Signature",                       "EmailSending",      kNone, zel_svc_element_act_email_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_EMAIL_RECEIVING,                 "EmailReceiving",                  "",                  kNone, kNone, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_AUTO_POLL,                       "AutoPoll",                        "",                  kNone, zel_svc_element_act_email_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_POLL_TIME,                       "PollTime",                        "",                  kNone, zel_svc_element_act_email_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_REC_LIMIT,                       "RecLimit",                        "",                  kNone, zel_svc_element_act_email_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_FETCH_OPTION,                    "FetchOption",                     "",                  kNone, zel_svc_element_act_email_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_KEEP_SERVER,                     "KeepServer",                      "",                  kNone, zel_svc_element_act_email_value, kNone, kOnce, 1},
    // e-mail accounts
    {ZEL_SVC_ELEMENT_NB_ACCOUNT,                      "NbAccount",                       "",                  kNone, kNone, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_ACCOUNT,                         "Account",                         "",                  zel_svc_element_act_email_account_start, kNone, zel_svc_element_act_email_account_end, kRepeats, 1},
    {ZEL_SVC_ELEMENT_ACCOUNT_NETWORK_NAME,            "NetworkName",                     "Account",           kNone, zel_svc_element_act_email_account_value, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_ACCOUNT_NAME,                    "AccountName",                     "Account",           kNone, zel_svc_element_act_email_account_value, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_ACCOUNT_EMAIL_ADDR,              "EmailAddr",                       "Account",           kNone, zel_svc_element_act_email_account_value, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_ACCOUNT_USER_ID,                 "UserId",                          "Account",           kNone, zel_svc_element_act_email_account_value, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_ACCOUNT_PASSWORD,                "Password",                        "Account",           kNone, zel_svc_element_act_email_account_value, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_INCOMING,                        "Incoming",                        "Account",           kNone, kNone, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_MAILBOX_TYPE,                    "MailboxType",                     "",                  kNone, zel_svc_element_act_email_account_value, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_INCOMING_SERV_ADDR,              "ServAddr",                        "Incoming",          kNone, zel_svc_element_act_email_account_value, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_INCOMING_PORT,                   "Port",                            "Incoming",          kNone, zel_svc_element_act_email_account_value, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_INCOMING_SECURE,                 "Secure",                          "Incoming",          kNone, zel_svc_element_act_email_account_value, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_APOP,                            "Apop",                            "",                  kNone, zel_svc_element_act_email_account_value, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_IMAP_FETCH_OPT,                  "ImapFetchOpt",                    "",                  kNone, zel_svc_element_act_email_account_value, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_OUTGOING,                        "Outgoing",                        "Account",           kNone, kNone, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_OUTGOING_SERV_ADDR,              "ServAddr",                        "Outgoing",          kNone, zel_svc_element_act_email_account_value, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_OUTGOING_PORT,                   "Port",                            "Outgoing",          kNone, zel_svc_element_act_email_account_value, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_SMTP_AUTH,                       "SmtpAuth",                        "",                  kNone, zel_svc_element_act_email_account_value, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_OUTGOING_SECURE,                 "Secure",                          "Outgoing",          kNone, zel_svc_element_act_email_account_value, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_SAME_ID_PWD,                     "SameIdPwd",                       "",                  kNone, zel_svc_element_act_email_account_value, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_POP_BEFORE_SMTP,                 "PopBeforeSmtp",                   "",                  kNone, zel_svc_element_act_email_account_value, kNone, kRepeats, 1},
    // ActiveSync
    {ZEL_SVC_ELEMENT_ACTIVE_SYNC,                     "ActiveSync",                      "",                  kNone, kNone, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_USE_SSL,                         "UseSSL",                          "",                  kNone, zel_svc_element_act_active_sync_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_ACCEPT_ALL_SSL_CERT,             "AcceptAllSSLCert",                "",                  kNone, zel_svc_element_act_active_sync_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_SYNC_CALENDAR,                   "SyncCalendar",                    "",                  kNone, zel_svc_element_act_active_sync_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_SYNC_CONTACTS,                   "SyncContacts",                    "",                  kNone, zel_svc_element_act_active_sync_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_SYNC_TASKS,                      "SyncTasks",                       "",                  kNone, zel_svc_element_act_active_sync_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_SYNC_SMS,                        "SyncSms",                         "",                  kNone, zel_svc_element_act_active_sync_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_ROAMING_SETTING,                 "RoamingSetting",                  "",                  kNone, zel_svc_element_act_active_sync_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_ACTIVE_SYNC_SIGNATURE,           "Signature",                       "ActiveSync",        kNone, zel_svc_element_act_active_sync_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_SYNC_SCHEDULE,                   "SyncSchedule",                    "",                  kNone, kNone, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_PEAK_DURATION,                   "PeakDuration",                    "",                  kNone, zel_svc_element_act_active_sync_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_OFF_PEAK_DURATION,               "OffPeakDuration",                 "",                  kNone, zel_svc_element_act_active_sync_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_PEAK_DAY_START,                  "PeakDayStart",                    "",                  kNone, zel_svc_element_act_active_sync_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_PEAK_DAY_END,                    "PeakDayEnd",                      "",                  kNone, zel_svc_element_act_active_sync_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_PEAK_TIME_START,                 "PeakTimeStart",                   "",                  kNone, zel_svc_element_act_active_sync_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_PEAK_TIME_END,                   "PeakTimeEnd",                     "",                  kNone, zel_svc_element_act_active_sync_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_EAS_EMAIL,                       "EasEmail",                        "",                  kNone, kNone, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_PERIOD_EMAIL,                    "PeriodEmail",                     "",                  kNone, zel_svc_element_act_active_sync_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_SIZE_EMAIL,                      "SizeEmail",                       "",                  kNone, zel_svc_element_act_active_sync_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_EAS_CALENDAR,                    "EasCalendar",                     "",                  kNone, kNone, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_PERIOD_CALENDAR,                 "PeriodCalendar",                  "",                  kNone, zel_svc_element_act_active_sync_value, kNone, kOnce, 1},
    // browser, bookmarks, quick access, e-manual
    {ZEL_SVC_ELEMENT_BROWSER,                         "Browser",                         "",                  kNone, kNone, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_COOKIE_OPTION,                   "CookieOption",                    "",                  kNone, zel_svc_element_act_browser_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_NB_BOOKMARK,                     "NbBookmark",                      "",                  kNone, zel_svc_element_act_bookmark_count, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_BOOKMARK,                        "Bookmark",                        "",                  zel_svc_element_act_bookmark_start, kNone, zel_svc_element_act_bookmark_end, kRepeats, 1},
    {ZEL_SVC_ELEMENT_BOOKMARK_NETWORK_NAME,           "NetworkName",                     "Bookmark",          kNone, zel_svc_element_act_bookmark_value, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_BOOKMARK_EDITABLE,               "Editable",                        "Bookmark",          kNone, zel_svc_element_act_bookmark_value, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_BOOKMARK_FOLDER,                 "Folder",                          "Bookmark",          kNone, zel_svc_element_act_bookmark_value, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_BOOKMARK_NAME,                   "BookmarkName",                    "",                  kNone, zel_svc_element_act_bookmark_value, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_BOOKMARK_URL,                    "URL",                             "Bookmark",          kNone, zel_svc_element_act_bookmark_value, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_NB_QUICK_ACCESS,                 "NbQuickAccess",                   "",                  kNone, zel_svc_element_act_quick_access_count, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_QUICK_ACCESS,                    "QuickAccess",                     "",                  zel_svc_element_act_quick_access_start, kNone, zel_svc_element_act_quick_access_end, kRepeats, 1},
    {ZEL_SVC_ELEMENT_QUICK_ACCESS_EDITABLE,           "Editable",                        "QuickAccess",       kNone, zel_svc_element_act_quick_access_value, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_QA_TITLE,                        "QATitle",                         "",                  kNone, zel_svc_element_act_quick_access_value, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_QA_URL,                          "QAURL",                           "",                  kNone, zel_svc_element_act_quick_access_value, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_E_MANUAL,                        "eManual",                         "",                  kNone, kNone, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_E_MANUAL_URL,                    "URL",                             "eManual",           kNone, zel_svc_element_act_browser_value, kNone, kOnce, 1},
    // default connections
    {ZEL_SVC_ELEMENT_CONNECTIONS,                     "Connections",                     "",                  zel_svc_element_act_connection_start, kNone, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_NB_PROFILE_HANDLE,               "NbProfileHandle",                 "",                  kNone, zel_svc_element_act_connection_handle_count, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_PROFILE_HANDLE,                  "ProfileHandle",                   "",                  zel_svc_element_act_connection_handle_start, kNone, zel_svc_element_act_connection_handle_end, kOnce, 1},
    {ZEL_SVC_ELEMENT_PROFILE_HANDLE_NETWORK_NAME,     "NetworkName",                     "ProfileHandle",     kNone, zel_svc_element_act_connection_handle_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_PROF_BROWSER,                    "ProfBrowser",                     "",                  kNone, zel_svc_element_act_connection_handle_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_PROF_MMS,                        "ProfMMS",                         "",                  kNone, zel_svc_element_act_connection_handle_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_PROF_INT_SHARING,                "ProfIntSharing",                  "",                  kNone, zel_svc_element_act_connection_handle_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_PROF_IMS,                        "ProfIMS",                         "",                  kNone, zel_svc_element_act_connection_handle_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_PROF_XCAP,                       "ProfXCAP",                        "",                  kNone, zel_svc_element_act_connection_handle_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_PROF_EMERGENCY_IMS_CALL,         "ProfEmergencyIMSCall",            "",                  kNone, zel_svc_element_act_connection_handle_value, kNone, kOnce, 1},
    // APN profiles
    {ZEL_SVC_ELEMENT_NB_PROFILE,                      "NbProfile",                       "",                  kNone, zel_svc_element_act_connection_profile_count, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_PROFILE,                         "Profile",                         "",                  zel_svc_element_act_connection_profile_start, kNone, zel_svc_element_act_connection_profile_end, kRepeats, 1},
    {ZEL_SVC_ELEMENT_PROFILE_NETWORK_NAME,            "NetworkName",                     "Profile",           kNone, zel_svc_element_act_connection_profile_value, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_PROFILE_NAME,                    "ProfileName",                     "",                  kNone, zel_svc_element_act_connection_profile_value, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_PROFILE_EDITABLE,                "Editable",                        "Profile",           kNone, zel_svc_element_act_connection_profile_value, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_PROFILE_ENABLE_STATUS,           "EnableStatus",                    "Profile",           kNone, zel_svc_element_act_connection_profile_value, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_PROFILE_HIDDEN_STATUS,           "HiddenStatus",                    "Profile",           kNone, zel_svc_element_act_connection_profile_value, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_PROFILE_ROAMING_ENABLE_STATUS,   "RoamingEnableStatus",             "Profile",           kNone, zel_svc_element_act_connection_profile_value, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_IP_VERSION,                      "IpVersion",                       "",                  kNone, zel_svc_element_act_connection_profile_value, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_ROAMING_IP_VERSION,              "RoamingIpVersion",                "",                  kNone, zel_svc_element_act_connection_profile_value, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_AUTH,                            "Auth",                            "",                  kNone, zel_svc_element_act_connection_profile_value, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_PS_PARAM,                        "PSparam",                         "",                  kNone, kNone, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_APN,                             "APN",                             "",                  kNone, zel_svc_element_act_connection_profile_value, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_PS_PARAM_USER_ID,                "UserId",                          "PSparam",           kNone, zel_svc_element_act_connection_profile_value, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_PS_PARAM_PASSWORD,               "Password",                        "PSparam",           kNone, zel_svc_element_act_connection_profile_value, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_TRAFFIC_CLASS,                   "TrafficClass",                    "",                  kNone, kNone, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_PROFILE_PROTOCOL,                "Protocol",                        "Profile",           kNone, kNone, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_PROFILE_URL,                     "URL",                             "Profile",           kNone, zel_svc_element_act_connection_profile_value, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_PROXY,                           "Proxy",                           "Profile",           kNone, kNone, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_PROXY_SERV_ADDR,                 "ServAddr",                        "Proxy",             kNone, zel_svc_element_act_connection_profile_value, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_PROXY_PORT,                      "Port",                            "Proxy",             kNone, zel_svc_element_act_connection_profile_value, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_GATEWAY,                         "Gateway",                         "Profile",           kNone, kNone, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_GATEWAY_SERV_ADDR,               "ServAddr",                        "Gateway",           kNone, zel_svc_element_act_connection_profile_value, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_SECURE_CONN,                     "SecureConn",                      "",                  kNone, kNone, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_LINGER_TIME,                     "LingerTime",                      "",                  kNone, kNone, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_STATIC_IP,                       "StaticIP",                        "",                  kNone, kNone, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_STATIC_IP_ENABLE_FLAG,           "EnableFlag",                      "StaticIP",          kNone, zel_svc_element_act_connection_profile_value, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_STATIC_IP_ADDR,                  "IPAddr",                          "StaticIP",          kNone, zel_svc_element_act_connection_profile_value, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_DNS,                             "DNS",                             "",                  kNone, kNone, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_DNS_ENABLE_FLAG,                 "EnableFlag",                      "DNS",               kNone, zel_svc_element_act_connection_profile_value, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_DNS_IP_ADDR,                     "IPAddr",                          "DNS",               kNone, zel_svc_element_act_connection_profile_value, kNone, kRepeats, 1},
    // SyncML data sync
    {ZEL_SVC_ELEMENT_SYNCML,                          "SyncML",                          "",                  zel_svc_element_act_syncml_start, kNone, zel_svc_element_act_syncml_end, kOnce, 1},
    {ZEL_SVC_ELEMENT_NB_DATA_SYNC,                    "NbDataSync",                      "",                  kNone, zel_svc_element_act_data_sync_count, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_DATA_SYNC,                       "DataSync",                        "",                  zel_svc_element_act_data_sync_start, kNone, zel_svc_element_act_data_sync_end, kRepeats, 1},
    {ZEL_SVC_ELEMENT_DATA_SYNC_NETWORK_NAME,          "NetworkName",                     "DataSync",          kNone, zel_svc_element_act_data_sync_value, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_DATA_SYNC_ACC_NAME,              "AccName",                         "DataSync",          kNone, zel_svc_element_act_data_sync_value, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_DATA_SYNC_SERV_ADDR,             "ServAddr",                        "DataSync",          kNone, zel_svc_element_act_data_sync_value, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_DATA_SYNC_USER_ID,               "UserId",                          "DataSync",          kNone, zel_svc_element_act_data_sync_value, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_DATA_SYNC_PASSWORD,              "Password",                        "DataSync",          kNone, zel_svc_element_act_data_sync_value, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_DB_LIST,                         "DBList",                          "",                  kNone, kNone, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_CONTACT_DB,                      "ContactDB",                       "",                  kNone, kNone, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_CONTACT_DB_ENABLE_FLAG,          "EnableFlag",                      "ContactDB",         kNone, zel_svc_element_act_data_sync_value, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_CONTACT_DB_NAME,                 "DBName",                          "ContactDB",         kNone, zel_svc_element_act_data_sync_value, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_CONTACT_DB_ID,                   "DBId",                            "ContactDB",         kNone, zel_svc_element_act_data_sync_value, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_CONTACT_DB_PASSWORD,             "DBPassword",                      "ContactDB",         kNone, zel_svc_element_act_data_sync_value, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_CALENDAR_DB,                     "CalendarDB",                      "",                  kNone, kNone, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_CALENDAR_DB_ENABLE_FLAG,         "EnableFlag",                      "CalendarDB",        kNone, zel_svc_element_act_data_sync_value, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_CALENDAR_DB_NAME,                "DBName",                          "CalendarDB",        kNone, zel_svc_element_act_data_sync_value, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_CALENDAR_DB_ID,                  "DBId",                            "CalendarDB",        kNone, zel_svc_element_act_data_sync_value, kNone, kRepeats, 1},
    {ZEL_SVC_ELEMENT_CALENDAR_DB_PASSWORD,            "DBPassword",                      "CalendarDB",        kNone, zel_svc_element_act_data_sync_value, kNone, kRepeats, 1},
    // GPS
    {ZEL_SVC_ELEMENT_GPS,                             "GPS",                             "",                  kNone, kNone, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_GPS_ACTIVATION,                  "GPSActivation",                   "",                  kNone, zel_svc_element_act_gps_value, kNone, kOnce, 1},
    // IMS
    {ZEL_SVC_ELEMENT_IMS_SETTING,                     "IMSSetting",                      "",                  zel_svc_element_act_ims_start, kNone, zel_svc_element_act_ims_end, kOnce, 1},
    {ZEL_SVC_ELEMENT_IMS_SETTING_NB_SETTING,          "NbSetting",                       "IMSSetting",        kNone, kNone, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_IMS_SETTING_SETTING,             "Setting",                         "IMSSetting",        zel_svc_element_act_ims_start, kNone, zel_svc_element_act_ims_end, kOnce, 1},
    {ZEL_SVC_ELEMENT_SETTING_NETWORK_NAME,            "NetworkName",                     "Setting",           kNone, zel_svc_element_act_ims_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_ENABLE_IMS,                      "EnableIMS",                       "",                  kNone, zel_svc_element_act_ims_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_VOLTE,                           "VoLTE",                           "",                  kNone, kNone, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_ENABLE_VOLTE,                    "EnableVoLTE",                     "",                  kNone, zel_svc_element_act_ims_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_ENABLE_VOICE_OVER_WIFI,          "EnableVoiceoverWIFI",             "",                  kNone, zel_svc_element_act_ims_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_ENABLE_VIDEO_CALL,               "EnableVideocall",                 "",                  kNone, zel_svc_element_act_ims_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_ENABLE_VOLTE_INDICATOR,          "EnableVoLTEindicator",            "",                  kNone, zel_svc_element_act_ims_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_VOICE_DOMAIN_PREFERENCE_EUTRAN,  "Voice_Domain_Preference_EUTRAN",  "",                  kNone, zel_svc_element_act_ims_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_EMREGENCY_CALL_DOMAIN,           "Emregencycall_Domain",            "",                  kNone, zel_svc_element_act_ims_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_SRVCC_VERSION,                   "SRVCCversion",                    "",                  kNone, zel_svc_element_act_ims_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_SS_DOMAIN_PREFERENCE,            "SS_Domain_Preference",            "",                  kNone, zel_svc_element_act_ims_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_SS_PS_CONTROL_PREFERENCE,        "SS_PS_Control_Preference",        "",                  kNone, zel_svc_element_act_ims_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_SS_CSFB_WITH_IMS_ERROR,          "SS_CSFBwithIMSerror",             "",                  kNone, zel_svc_element_act_ims_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_USSD_DOMAIN_PREFERENCE,          "USSD_Domain_Preference",          "",                  kNone, zel_svc_element_act_ims_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_SMSOIP_DOMAIN,                   "SMSoIP_Domain",                   "",                  kNone, zel_svc_element_act_ims_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_ENABLE_SMS_OVER_IP,              "EnableSMSoverIP",                 "",                  kNone, zel_svc_element_act_ims_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_RCS,                             "RCS",                             "",                  kNone, kNone, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_ENABLE_RCS,                      "EnableRCS",                       "",                  kNone, zel_svc_element_act_ims_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_JOYN,                            "Joyn",                            "",                  kNone, zel_svc_element_act_ims_value, kNone, kOnce, 1},
    {ZEL_SVC_ELEMENT_ENABLE_RCS_CHAT,                 "EnableRCSchat",                   "",                  kNone, zel_svc_element_act_ims_value, kNone, kOnce, 1},
}};
// clang-format on

extern constexpr ZelSvcParseBegin kZelSvcParseBegins[] = {
    zel_svc_element_act_network_info_begin_parse,
    zel_svc_element_act_bookmark_begin_parse,
    zel_svc_element_act_quick_access_begin_parse,
    zel_svc_element_act_syncml_begin_parse,
    zel_svc_element_act_connection_handle_begin_parse,
    zel_svc_element_act_connection_profile_begin_parse,
    nullptr,
};

namespace {

constexpr bool ids_count_the_rows() {
    for (std::size_t row = 0; row < kZelSvcElementTable.size(); ++row)
        if (static_cast<std::size_t>(kZelSvcElementTable[row].id) != row) return false;
    return true;
}
static_assert(ids_count_the_rows(), "an element id is the index of its row");

} // namespace
