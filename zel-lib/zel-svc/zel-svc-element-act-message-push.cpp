#include "zel-svc-element-act-message.h"

#include "handler/zel-svc-setting-rows.h"

namespace {

constexpr SettingSection kPush{ZEL_SVC_DATA_MESSAGE, "push_msg", "PushMsg"};

constexpr Word kLoadings[] = {{"always", 0}, {"prompt", 1}, {"never", 2}};

constexpr Setting kPushSettings[] = {
    recorded_switch(kPush, ZEL_SVC_ELEMENT_PUSH_MSG_REC_OPTION, "db/private/msg-service/push_msg/recv_option",
                    "recv_option"),
    recorded(kPush, ZEL_SVC_ELEMENT_PUSH_LOADING, words(kLoadings),
             int_key("db/private/msg-service/push_msg/service_load"), "loading"),
};

} // namespace

std::span<const Setting> zel_svc_push_settings() { return kPushSettings; }

void zel_svc_element_act_message_push_value(Occurrence &occurrence) {
    zel_svc_setting_handle(kPushSettings, occurrence);
}
