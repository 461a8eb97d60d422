#include "handler/zel-svc-phone-list.h"

#include "handler/zel-svc-setting.h"

void zel_svc_phone_list_count(Occurrence &occurrence, ZelSvcAutoFlag flag, std::string_view label,
                              std::string (*count)()) {
    if (occurrence.exports() && occurrence.out) return occurrence.out->assign(count());
    if (!occurrence.verifies() || !zel_svc_group_applies(occurrence, flag)) return;
    const std::string phone = count();
    zel_svc_setting_add_result(label, occurrence.tag, occurrence.text, phone, occurrence.text == phone);
}

void zel_svc_phone_list_add_unread(std::string_view item) {
    zel_svc_verification_add_result("[" + std::string{item} + "] Reading phone failed", false);
}
