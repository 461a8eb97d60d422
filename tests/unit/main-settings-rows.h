#pragma once
// The settings of one key or two that take a fixed set of words, written down a second time from the
// product's vocabulary: the library's rows must agree with this copy.

#include "spec/zel-svc-data.h"
#include "spec/zel-svc-element-id.h"

#include <ostream>
#include <span>
#include <string_view>

namespace zel_test {

struct ExpectedWord {
    std::string_view text;
    int number;
};

struct ExpectedRecord {
    const char *section = nullptr;
    const char *key = nullptr;
};

struct ExpectedSetting {
    ZelSvcElementId element;
    const char *tag;
    bool is_boolean;
    std::span<const ExpectedWord> words;
    const char *keys[2]; // the second may be null
    ZelSvcDataGroup group;
    ExpectedRecord records[2];
    const char *label; // of the result line
    bool unreadable_adds_line;
    bool exported_when_recorded_only;

    friend void PrintTo(const ExpectedSetting &setting, std::ostream *out) { *out << setting.tag; }
};

inline constexpr ExpectedWord kSwitchWords[] = {{"on", 1}, {"off", 0}};
inline constexpr ExpectedWord kPredictionWords[] = {{"enable", 1}, {"disable", 0}};
inline constexpr ExpectedWord kDateWords[] = {{"ddmmyyyy", 0}, {"mmddyyyy", 1}, {"yyyymmdd", 2}};
inline constexpr ExpectedWord kTimeWords[] = {{"12h", 1}, {"24h", 2}};

inline constexpr ExpectedSetting kExpectedSettings[] = {
    {ZEL_SVC_ELEMENT_TOUCH_TONE,
     "TouchTone",
     true,
     kSwitchWords,
     {"db/setting/sound/touch_sounds", "db/setting/sound/button_sounds"},
     ZEL_SVC_DATA_MAIN,
     {{"sound", "touch_sound"}, {"sound", "button_sound"}},
     "[Sound/TouchTone]",
     true,
     true},
    {ZEL_SVC_ELEMENT_CONNECT_TONE,
     "ConnectTone",
     true,
     kSwitchWords,
     {"db/ciss/call_connect_tone"},
     ZEL_SVC_DATA_MAIN,
     {},
     "[ConnectTone]",
     false,
     false},
    {ZEL_SVC_ELEMENT_MINUTE_MIND,
     "MinuteMind",
     true,
     kSwitchWords,
     {"db/ciss/minute_minder"},
     ZEL_SVC_DATA_MAIN,
     {},
     "[MinuteMind]",
     false,
     false},
    {ZEL_SVC_ELEMENT_CALL_END_TONE,
     "CallEndTone",
     true,
     kSwitchWords,
     {"db/ciss/call_end_tone"},
     ZEL_SVC_DATA_MAIN,
     {},
     "[CallEndTone]",
     false,
     false},
    {ZEL_SVC_ELEMENT_CALL_NOISE_REDUCTION,
     "CallNoiseReduction",
     true,
     kSwitchWords,
     {"db/ciss/noise_reduction"},
     ZEL_SVC_DATA_MAIN,
     {},
     "[CallNoiseReduction]",
     false,
     false},
    {ZEL_SVC_ELEMENT_T9_ENABLING,
     "T9Enabling",
     true,
     kPredictionWords,
     {"db/ise/swiftkey/prediction_val"},
     ZEL_SVC_DATA_MAIN,
     {{"phone", "predictive_text"}},
     "[Phone/T9Enabling]",
     true,
     true},
    {ZEL_SVC_ELEMENT_DATE_FORMAT,
     "DateFormat",
     false,
     kDateWords,
     {"db/setting/date_format"},
     ZEL_SVC_DATA_MAIN,
     {{"phone", "date_format"}},
     "[Phone/DateFormat]",
     true,
     true},
    {ZEL_SVC_ELEMENT_TIME_FORMAT,
     "TimeFormat",
     false,
     kTimeWords,
     {"db/menu_widget/regionformat_time1224"},
     ZEL_SVC_DATA_MAIN,
     {{"phone", "time_format"}},
     "[Phone/TimeFormat]",
     true,
     true},
    {ZEL_SVC_ELEMENT_TIMEZONE_UPDATE,
     "TimezoneUpdate",
     true,
     kSwitchWords,
     {"db/setting/automatic_time_update"},
     ZEL_SVC_DATA_MAIN,
     {{"phone", "timezone_update"}},
     "[Phone/TimezoneUpdate]",
     true,
     true},
    {ZEL_SVC_ELEMENT_AUTO_ATTACH,
     "AutoAttach",
     false,
     kSwitchWords,
     {"db/zel/network/ps_auto_attach"},
     ZEL_SVC_DATA_NETWORK,
     {{"network", "ps_auto_attach"}},
     "[Network/AutoAttach]",
     true,
     true},
    {ZEL_SVC_ELEMENT_AUTO_DETACH,
     "AutoDetach",
     false,
     kSwitchWords,
     {"db/zel/network/ps_auto_detach"},
     ZEL_SVC_DATA_NETWORK,
     {{"network", "ps_auto_detach"}},
     "[Network/AutoDetach]",
     true,
     true},
};

} // namespace zel_test
