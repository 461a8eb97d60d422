#include "preset/zel-svc-preset-table.h"

#include "preset/zel-svc-preset-actions.h"

namespace {

using Type = ZelSvcPresetType;

} // namespace

constexpr ZelSvcPresetRow ZEL_SVC_PRESETS[] = {
    {.key = "keyboard_uuid", .act = zel_svc_preset_set_keyboard},
    {.key = "keyboard_lang", .store = "db/isf/input_language"},
    {.key = "keyboard_preinstalled_lang", .store = "db/ise/swiftkey/lpm/preinstalled_lang"},
    {.key = "web_homepage_url", .store = "file/private/com.quorvex.browser/homepage_uri"},
    {.key = "nfc_activation", .type = Type::Boolean, .store = "db/nfc/enable"},
    {.key = "velaro_pkg_name", .store = "db/velaro/package_name"},
    {.key = "fota_max_size_on_data_net",
     .type = Type::Integer,
     .store = "db/SyncML/oma-dm-service/MaxSizeOnDataNetwork"},
    {.key = "ua", .act = zel_svc_preset_set_user_agent},
    {.key = "ua_prof_2g", .store = "db/browser/user_agent_profile_2G"},
    {.key = "ua_prof_3g", .store = "db/browser/user_agent_profile_3G"},
    {.key = "ua_prof_4g", .store = "db/browser/user_agent_profile_4G"},
    {.key = "lockscreen_short_cut_2", .store = "file/lockscreen/shortcut2"},
    {.key = "lockscreen_theme", .type = Type::Integer, .store = "db/lockscreen/style"},
    {.key = "lbs_use_my_location", .type = Type::Integer, .store = "db/location/setting/Usemylocation"},
    {.key = "lbs_net_activation", .type = Type::Integer, .store = "db/location/setting/NetworkEnabled"},
    {.key = "wifi_smart_net_switch", .type = Type::Integer, .store = "file/private/wifi/smart_switching"},
    {.key = "setting_lcd_brightness", .type = Type::Integer, .store = "db/setting/Brightness"},
    {.key = "setting_lcd_backlight_time", .type = Type::Integer, .store = "db/setting/lcd_backlight_normal"},
    {.key = "setting_net_mobile_data", .type = Type::Boolean, .store = "db/setting/3gEnabled"},
    {.key = "setting_net_data_roaming", .type = Type::Boolean, .store = "db/setting/data_roaming"},
    {.key = "setting_ring_tone_default", .store = "db/setting/sound/call/ringtone_default_path"},
    {.key = "setting_ring_tone", .store = "db/setting/sound/call/ringtone_path"},
    {.key = "setting_noti_tone", .store = "db/setting/sound/noti/msg_ringtone_path"},
    {.key = "font_style", .store = "db/zel/font_default_style"},
    {.key = "setting_time_zone_path", .act = zel_svc_preset_set_time_zone},
    {.key = "tel_voice_preferred_sim",
     .type = Type::Integer,
     .store = "db/telephony/dualsim/preferred_voice_subscription"},
    {.key = "setting_region_format", .store = "db/menu_widget/regionformat"},
};
