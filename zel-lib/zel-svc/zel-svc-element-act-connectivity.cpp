#include "zel-svc-element-act-connectivity.h"

#include "handler/zel-svc-setting-rows.h"

namespace {

constexpr SettingSection kBluetooth{ZEL_SVC_DATA_CONNECTIVITY, "bluetooth", "Bluetooth"};
constexpr SettingSection kWifi{ZEL_SVC_DATA_CONNECTIVITY, "wifi", "WiFi"};

// The key is a time: 0 is hidden, -1 visible without a limit. A user's own limit is neither word.
constexpr Word kVisibilities[] = {{"off", 0}, {"on", -1}};
constexpr Word kSleepPolicies[] = {{"always", 0}, {"plugged", 1}, {"never", 2}};

// clang-format off
constexpr Setting kConnectivitySettings[] = {
    recorded(kBluetooth, ZEL_SVC_ELEMENT_BT_ACTIVATION, on_off(),              int_key("db/bluetooth/status"),                                        "activation"),
    recorded(kBluetooth, ZEL_SVC_ELEMENT_BT_VISIBILITY, words(kVisibilities),  int_key("file/private/libug-setting-bluetooth-efl/visibility_time"),   "visibility"),
    recorded(kWifi,      ZEL_SVC_ELEMENT_SLEEP_POLICY,  words(kSleepPolicies), int_key("file/private/wifi/sleep_policy"),                             "sleep_policy"),
};
// clang-format on

} // namespace

std::span<const Setting> zel_svc_connectivity_settings() { return kConnectivitySettings; }

void zel_svc_element_act_connectivity_value(Occurrence &occurrence) {
    zel_svc_setting_handle(kConnectivitySettings, occurrence);
}
