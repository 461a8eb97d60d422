#pragma once
// Options that are recorded for another component and held by no key of the phone: their elements, texts and
// entries, written down a second time. The tests are in recorded-options-test.cpp.

#include "support/bench-phone.h"
#include "support/spec-text.h"

#include <ostream>
#include <span>
#include <string>
#include <string_view>

namespace zel_test {

// What the section store holds for an accepted text; numbers as their digits.
struct RecordedText {
    std::string_view text;
    std::string_view recorded;
};

struct ExpectedOption {
    ZelSvcElementId element;
    const char *parent;
    const char *tag;
    std::span<const RecordedText> texts; // empty: every text, as it is
    ZelSvcDataGroup group;
    const char *section;
    const char *key;

    friend void PrintTo(const ExpectedOption &option, std::ostream *out) { *out << option.tag; }
};

inline constexpr RecordedText kSwitchTexts[] = {{"on", "1"}, {"off", "0"}};
inline constexpr RecordedText kPriorityTexts[] = {{"high", "high"}, {"normal", "normal"}, {"low", "low"}};
inline constexpr RecordedText kPollTexts[] = {{"30m", "30m"}, {"1h", "1h"}, {"6h", "6h"}, {"24h", "24h"}};
inline constexpr RecordedText kLimitTexts[] = {{"300", "300"}};
inline constexpr RecordedText kFetchTexts[] = {{"header", "header"}, {"normal", "normal"}};
inline constexpr RecordedText kDurationTexts[] = {{"5m", "1"}, {"15m", "3"},     {"1h", "5"},
                                                  {"2h", "8"}, {"manual", "10"}, {"push", "11"}};
inline constexpr RecordedText kDayTexts[] = {{"sunday", "1"},    {"monday", "2"},    {"tuesday", "4"},
                                             {"wednesday", "8"}, {"thursday", "16"}, {"friday", "32"},
                                             {"saturday", "64"}};
inline constexpr RecordedText kMailPeriodTexts[] = {{"all", "0"}, {"1d", "1"}, {"3d", "2"},
                                                    {"1w", "3"},  {"2w", "4"}, {"1m", "5"}};
inline constexpr RecordedText kSizeTexts[] = {{"2k", "3"},  {"5k", "4"},   {"10k", "5"}, {"20k", "6"},
                                              {"50k", "7"}, {"100k", "8"}, {"all", "9"}};
inline constexpr RecordedText kCalendarPeriodTexts[] = {
    {"all", "0"}, {"2w", "1"}, {"1m", "2"}, {"3m", "3"}, {"6m", "4"}};

// clang-format off
inline constexpr ExpectedOption kEmailOptions[] = {
    {ZEL_SVC_ELEMENT_EMAIL_SENDING_KEEP_COPY,        "EmailSending",   "KeepCopy",       kSwitchTexts,   ZEL_SVC_DATA_EMAIL, "email", "send_keep_copy"},
    {ZEL_SVC_ELEMENT_SEND_ME_COPY,                   "EmailSending",   "SendMeCopy",     kSwitchTexts,   ZEL_SVC_DATA_EMAIL, "email", "send_send_me_copy"},
    {ZEL_SVC_ELEMENT_EMAIL_SENDING_REQ_DELIVERY_REP, "EmailSending",   "ReqDeliveryRep", kSwitchTexts,   ZEL_SVC_DATA_EMAIL, "email", "send_req_delivery_report"},
    {ZEL_SVC_ELEMENT_EMAIL_SENDING_REQ_READ_REP,     "EmailSending",   "ReqReadRep",     kSwitchTexts,   ZEL_SVC_DATA_EMAIL, "email", "send_req_read_report"},
    {ZEL_SVC_ELEMENT_EMAIL_SENDING_PRIORITY,         "EmailSending",   "Priority",       kPriorityTexts, ZEL_SVC_DATA_EMAIL, "email", "send_priority"},
    {ZEL_SVC_ELEMENT_INC_BODY_REPLY,                 "EmailSending",   "IncBodyReply",   kSwitchTexts,   ZEL_SVC_DATA_EMAIL, "email", "send_include_body_reply"},
    {ZEL_SVC_ELEMENT_INC_ATTACH_FWD,                 "EmailSending",   "IncAttachFwd",   kSwitchTexts,   ZEL_SVC_DATA_EMAIL, "email", "send_include_attach_fwd"},
    {ZEL_SVC_ELEMENT_EMAIL_SENDING_SIGNATURE,        "EmailSending",   "Signature",      {},             ZEL_SVC_DATA_EMAIL, "email", "send_signature"},
    {ZEL_SVC_ELEMENT_AUTO_POLL,                      "EmailReceiving", "AutoPoll",       kSwitchTexts,   ZEL_SVC_DATA_EMAIL, "email", "recv_auto_poll"},
    {ZEL_SVC_ELEMENT_POLL_TIME,                      "EmailReceiving", "PollTime",       kPollTexts,     ZEL_SVC_DATA_EMAIL, "email", "recv_poll_time"},
    {ZEL_SVC_ELEMENT_REC_LIMIT,                      "EmailReceiving", "RecLimit",       kLimitTexts,    ZEL_SVC_DATA_EMAIL, "email", "recv_limit_size"},
    {ZEL_SVC_ELEMENT_FETCH_OPTION,                   "EmailReceiving", "FetchOption",    kFetchTexts,    ZEL_SVC_DATA_EMAIL, "email", "recv_fetch_option"},
    {ZEL_SVC_ELEMENT_KEEP_SERVER,                    "EmailReceiving", "KeepServer",     kSwitchTexts,   ZEL_SVC_DATA_EMAIL, "email", "recv_keep_server"},
};

// What the roaming option takes has tests of its own.
inline constexpr ExpectedOption kActiveSyncOptions[] = {
    {ZEL_SVC_ELEMENT_USE_SSL,               "ActiveSync",   "UseSSL",           kSwitchTexts,         ZEL_SVC_DATA_ACTIVE_SYNC, "general",       "use_ssl"},
    {ZEL_SVC_ELEMENT_ACCEPT_ALL_SSL_CERT,   "ActiveSync",   "AcceptAllSSLCert", kSwitchTexts,         ZEL_SVC_DATA_ACTIVE_SYNC, "general",       "accept_all_cert"},
    {ZEL_SVC_ELEMENT_SYNC_CALENDAR,         "ActiveSync",   "SyncCalendar",     kSwitchTexts,         ZEL_SVC_DATA_ACTIVE_SYNC, "general",       "sync_calendar"},
    {ZEL_SVC_ELEMENT_SYNC_CONTACTS,         "ActiveSync",   "SyncContacts",     kSwitchTexts,         ZEL_SVC_DATA_ACTIVE_SYNC, "general",       "sync_contact"},
    {ZEL_SVC_ELEMENT_SYNC_TASKS,            "ActiveSync",   "SyncTasks",        kSwitchTexts,         ZEL_SVC_DATA_ACTIVE_SYNC, "general",       "sync_task"},
    {ZEL_SVC_ELEMENT_SYNC_SMS,              "ActiveSync",   "SyncSms",          kSwitchTexts,         ZEL_SVC_DATA_ACTIVE_SYNC, "general",       "sync_sms"},
    {ZEL_SVC_ELEMENT_ACTIVE_SYNC_SIGNATURE, "ActiveSync",   "Signature",        {},                   ZEL_SVC_DATA_ACTIVE_SYNC, "general",       "signature"},
    {ZEL_SVC_ELEMENT_PEAK_DURATION,         "SyncSchedule", "PeakDuration",     kDurationTexts,       ZEL_SVC_DATA_ACTIVE_SYNC, "sync_schedule", "peak_duration"},
    {ZEL_SVC_ELEMENT_OFF_PEAK_DURATION,     "SyncSchedule", "OffPeakDuration",  kDurationTexts,       ZEL_SVC_DATA_ACTIVE_SYNC, "sync_schedule", "off_peak_duration"},
    {ZEL_SVC_ELEMENT_PEAK_DAY_START,        "SyncSchedule", "PeakDayStart",     kDayTexts,            ZEL_SVC_DATA_ACTIVE_SYNC, "sync_schedule", "peak_day_start"},
    {ZEL_SVC_ELEMENT_PEAK_DAY_END,          "SyncSchedule", "PeakDayEnd",       kDayTexts,            ZEL_SVC_DATA_ACTIVE_SYNC, "sync_schedule", "peak_day_end"},
    {ZEL_SVC_ELEMENT_PEAK_TIME_START,       "SyncSchedule", "PeakTimeStart",    {},                   ZEL_SVC_DATA_ACTIVE_SYNC, "sync_schedule", "peak_time_start"},
    {ZEL_SVC_ELEMENT_PEAK_TIME_END,         "SyncSchedule", "PeakTimeEnd",      {},                   ZEL_SVC_DATA_ACTIVE_SYNC, "sync_schedule", "peak_time_end"},
    {ZEL_SVC_ELEMENT_PERIOD_EMAIL,          "EasEmail",     "PeriodEmail",      kMailPeriodTexts,     ZEL_SVC_DATA_ACTIVE_SYNC, "email",         "period"},
    {ZEL_SVC_ELEMENT_SIZE_EMAIL,            "EasEmail",     "SizeEmail",        kSizeTexts,           ZEL_SVC_DATA_ACTIVE_SYNC, "email",         "size"},
    {ZEL_SVC_ELEMENT_PERIOD_CALENDAR,       "EasCalendar",  "PeriodCalendar",   kCalendarPeriodTexts, ZEL_SVC_DATA_ACTIVE_SYNC, "calendar",      "period"},
};
// clang-format on

class RecordedOption : public BenchPhone, public testing::WithParamInterface<ExpectedOption> {
  protected:
    [[nodiscard]] static std::string spec(std::string_view text) {
        return element(GetParam().parent, element(GetParam().tag, text));
    }
    [[nodiscard]] static std::string element(const std::string &tag, std::string_view content) {
        return "<" + tag + ">" + std::string{content} + "</" + tag + ">";
    }
    [[nodiscard]] static std::optional<std::string> recorded(const LoadedGroup &group) {
        return group.text(GetParam().section, GetParam().key);
    }
    // A text that the option takes.
    [[nodiscard]] static RecordedText one_text() {
        return GetParam().texts.empty() ? RecordedText{"Sent by me", "Sent by me"} : GetParam().texts.front();
    }
};

inline std::string recorded_option_name(const testing::TestParamInfo<ExpectedOption> &option) {
    return option.param.tag;
}

} // namespace zel_test
