#include "zel-svc-element-act-email.h"

#include "handler/zel-svc-setting-rows.h"

namespace {

constexpr SettingSection kEmail{ZEL_SVC_DATA_EMAIL, "email", "Email"};

constexpr Word kPriorities[] = {{"high"}, {"normal"}, {"low"}};
constexpr Word kPollTimes[] = {{"30m"}, {"1h"}, {"6h"}, {"24h"}};
// The only limit that the e-mail application knows, deliberately.
constexpr Word kLimits[] = {{"300"}};
constexpr Word kFetchOptions[] = {{"header"}, {"normal"}};

// clang-format off
constexpr Setting kEmailSettings[] = {
    only_recorded     (kEmail, ZEL_SVC_ELEMENT_EMAIL_SENDING_KEEP_COPY,        on_off(),                  "send_keep_copy"),
    only_recorded     (kEmail, ZEL_SVC_ELEMENT_SEND_ME_COPY,                   on_off(),                  "send_send_me_copy"),
    only_recorded     (kEmail, ZEL_SVC_ELEMENT_EMAIL_SENDING_REQ_DELIVERY_REP, on_off(),                  "send_req_delivery_report"),
    only_recorded     (kEmail, ZEL_SVC_ELEMENT_EMAIL_SENDING_REQ_READ_REP,     on_off(),                  "send_req_read_report"),
    only_recorded_text(kEmail, ZEL_SVC_ELEMENT_EMAIL_SENDING_PRIORITY,         kept_words(kPriorities),   "send_priority"),
    only_recorded     (kEmail, ZEL_SVC_ELEMENT_INC_BODY_REPLY,                 on_off(),                  "send_include_body_reply"),
    only_recorded     (kEmail, ZEL_SVC_ELEMENT_INC_ATTACH_FWD,                 on_off(),                  "send_include_attach_fwd"),
    only_recorded_text(kEmail, ZEL_SVC_ELEMENT_EMAIL_SENDING_SIGNATURE,        any_text(),                "send_signature"),
    only_recorded     (kEmail, ZEL_SVC_ELEMENT_AUTO_POLL,                      on_off(),                  "recv_auto_poll"),
    only_recorded_text(kEmail, ZEL_SVC_ELEMENT_POLL_TIME,                      kept_words(kPollTimes),    "recv_poll_time"),
    only_recorded_text(kEmail, ZEL_SVC_ELEMENT_REC_LIMIT,                      kept_words(kLimits),       "recv_limit_size"),
    only_recorded_text(kEmail, ZEL_SVC_ELEMENT_FETCH_OPTION,                   kept_words(kFetchOptions), "recv_fetch_option"),
    only_recorded     (kEmail, ZEL_SVC_ELEMENT_KEEP_SERVER,                    on_off(),                  "recv_keep_server"),
};
// clang-format on

} // namespace

std::span<const Setting> zel_svc_email_settings() { return kEmailSettings; }

void zel_svc_element_act_email_value(Occurrence &occurrence) { zel_svc_setting_handle(kEmailSettings, occurrence); }
