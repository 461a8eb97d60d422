#include "summary-parts.h"

#include "auto-flags.h"
#include "package-check.h"

#include <array>

namespace zel_command {
namespace {

struct ShownKey {
    const char *name;
    const char *key;
};

// What a person asks for first; `zel vconf list` shows the rest.
constexpr std::array kShownKeys = {
    ShownKey{"Region format", "db/menu_widget/regionformat"},
    ShownKey{"Time format (1: 12 hours, 2: 24)", "db/menu_widget/regionformat_time1224"},
    ShownKey{"Date format", "db/setting/date_format"},
    ShownKey{"Network time", "db/setting/automatic_time_update"},
    ShownKey{"Predictive text", "db/ise/swiftkey/prediction_val"},
    ShownKey{"Home wallpaper", "db/menu_widget/bgset"},
    ShownKey{"Ring tone", "db/setting/sound/call/ringtone_path"},
    ShownKey{"Message tone", "db/setting/sound/noti/msg_ringtone_path"},
    ShownKey{"Alarm tone", "db/private/com.quorvex.clock/alarm_app/default_alarm_tone"},
    ShownKey{"Touch sounds", "db/setting/sound/touch_sounds"},
    ShownKey{"Data roaming", "db/setting/data_roaming"},
    ShownKey{"GPS", "db/location/setting/GpsEnabled"},
    ShownKey{"First day of the week (0: Sunday)", "db/private/com.quorvex.calendar-lite/first_day_of_week"},
    ShownKey{"Bluetooth", "db/bluetooth/status"},
    ShownKey{"SMS bearer (1: PS, 2: CS, 3: PS first)", "db/msg/network_mode"},
    ShownKey{"Wide-band AMR codec", "db/zel/network/wb_amr_codec"},
    ShownKey{"Browser's user agent", "db/browser/user_agent"},
    ShownKey{"Power-on animation", "db/zel/power_ani_file_path"},
};

std::string value_of(const Phone &phone, const char *key) {
    Json entry;
    return phone.try_call("vconf-get", {{"key", key}}, entry) == 0 ? bytes_of(entry, "value") : std::string{};
}

} // namespace

Json summary_customer(const Phone &phone) {
    const std::string code = value_of(phone, "db/zel/salescode");
    Json result = Json::object();
    put_text(result, "code", code);
    put_text(result, "folder", code.empty() ? "" : internal_name_of(code));
    put_text(result, "package", value_of(phone, "db/zel/bin_full_version"));
    put_text(result, "country", value_of(phone, "db/zel/country_iso"));
    put_text(result, "language", value_of(phone, "db/menu_widget/language"));
    result["configured"] = value_of(phone, "db/private/telephony/zel_config") == "1";
    return result;
}

Json summary_settings(const Phone &phone) {
    Json result = Json::array();
    for (const ShownKey &shown : kShownKeys) {
        Json entry;
        if (phone.try_call("vconf-get", {{"key", shown.key}}, entry) != 0) continue;
        Json row{{"name", shown.name}};
        row.update(entry);
        result.push_back(std::move(row));
    }
    return result;
}

Json summary_auto_flags(const std::string &customer) {
    if (customer.empty() || !read_auto_flags(customer_file_path(customer))) return nullptr;
    Json result = Json::object();
    for (const AutoFlag &flag : auto_flags())
        result[flag.name] = flag.on;
    return result;
}

} // namespace zel_command
