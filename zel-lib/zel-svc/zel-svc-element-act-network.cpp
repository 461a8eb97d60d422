#include "zel-svc-element-act-network.h"

#include "handler/zel-svc-setting-rows.h"

#include <vconf.h>

namespace {

// The elements stand in the order of their flags.
constexpr ZelSvcAutoFlag flag_of(ZelSvcElementId element) {
    return static_cast<ZelSvcAutoFlag>(element - ZEL_SVC_ELEMENT_AUTO_PROFILE);
}
static_assert(flag_of(ZEL_SVC_ELEMENT_AUTO_BOOKMARK) == ZEL_SVC_AUTO_BOOKMARK);
static_assert(flag_of(ZEL_SVC_ELEMENT_AUTO_MAX_PDP) == ZEL_SVC_AUTO_MAX_PDP);

void set_flag(const Setting &setting, Occurrence &occurrence) {
    const auto flag = static_cast<std::size_t>(flag_of(setting.element));
    gbZelSvcNetworkAutoFlags.at(flag) = zel_svc_accepts_value(setting.accepts, occurrence.text).value_or(0);
}

constexpr Setting auto_flag(ZelSvcElementId element) {
    return {.element = element, .accepts = on_off(), .install = set_flag, .verify = set_flag};
}

constexpr SettingSection kNetwork{ZEL_SVC_DATA_NETWORK, "network", "Network"};

constexpr Setting kNetworkSettings[] = {
    auto_flag(ZEL_SVC_ELEMENT_AUTO_PROFILE),
    auto_flag(ZEL_SVC_ELEMENT_AUTO_VOICEMAIL),
    auto_flag(ZEL_SVC_ELEMENT_AUTO_EMAIL_ACCOUNT),
    auto_flag(ZEL_SVC_ELEMENT_AUTO_BOOKMARK),
    auto_flag(ZEL_SVC_ELEMENT_AUTO_LINK),
    auto_flag(ZEL_SVC_ELEMENT_AUTO_SYNCML),
    auto_flag(ZEL_SVC_ELEMENT_AUTO_FOTA),
    auto_flag(ZEL_SVC_ELEMENT_AUTO_FAST_DORMANCY),
    auto_flag(ZEL_SVC_ELEMENT_AUTO_WB_AMR),
    auto_flag(ZEL_SVC_ELEMENT_AUTO_MAX_PDP),
    recorded(kNetwork, ZEL_SVC_ELEMENT_AUTO_ATTACH, on_off(), int_key("db/zel/network/ps_auto_attach"),
             "ps_auto_attach"),
    recorded(kNetwork, ZEL_SVC_ELEMENT_AUTO_DETACH, on_off(), int_key("db/zel/network/ps_auto_detach"),
             "ps_auto_detach"),
};

// Whether the SIM decides anything. E-mail accounts deliberately do not count.
bool sim_decides() {
    std::int32_t any = 0;
    for (std::int32_t flag = 0; flag < ZEL_SVC_AUTO_FLAG_COUNT; ++flag)
        if (flag != ZEL_SVC_AUTO_EMAIL_ACCOUNT) any |= gbZelSvcNetworkAutoFlags.at(static_cast<std::size_t>(flag));
    return any != 0;
}

} // namespace

std::span<const Setting> zel_svc_network_settings() { return kNetworkSettings; }

// A full install and a verification keep the flags: an earlier pass over the file's header read them.
void zel_svc_element_act_network_start(Occurrence &occurrence) {
    if (occurrence.element != ZEL_SVC_ELEMENT_NETWORK || occurrence.exports()) return;
    if (occurrence.mode < ZEL_SVC_PARSE_MODE_CUSTOMER_LIST) return;
    gbZelSvcNetworkAutoFlags.fill(0);
}

void zel_svc_element_act_network_value(Occurrence &occurrence) { zel_svc_setting_handle(kNetworkSettings, occurrence); }

void zel_svc_element_act_network_end(Occurrence &occurrence) {
    if (occurrence.element != ZEL_SVC_ELEMENT_NETWORK || !occurrence.installs()) return;
    if (occurrence.mode != ZEL_SVC_PARSE_MODE_FULL) return;
    vconf_set_int("db/private/zel/sim_auto_enable", sim_decides() ? 1 : 0);
}
