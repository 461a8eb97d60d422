#include "zel-svc-element-act-gps.h"

namespace {

// Switching on takes the user's consent for granted as well; switching off deliberately leaves the consent,
// key and record, as it is.
void install_activation(const Setting &setting, Occurrence &occurrence) {
    if (occurrence.text == "on") {
        zel_svc_setting_install(setting, occurrence.text);
        return;
    }
    if (zel_svc_store_write(setting.stores[0], 0, {})) zel_svc_setting_record(setting.records[0], 0, {});
}

constexpr Setting kGpsSettings[] = {
    {.element = ZEL_SVC_ELEMENT_GPS_ACTIVATION,
     .accepts = on_off(),
     .stores = {{KeyType::Int, "db/location/setting/GpsEnabled"}, {KeyType::Int, "db/location/setting/Usemylocation"}},
     .records = {{ZEL_SVC_DATA_GPS, "gps", "gps_activation"}, {ZEL_SVC_DATA_GPS, "gps", "use_my_location"}},
     .report = text_in("GPS"),
     .exports = if_recorded(),
     .install = install_activation},
};

} // namespace

std::span<const Setting> zel_svc_gps_settings() { return kGpsSettings; }

void zel_svc_element_act_gps_value(Occurrence &occurrence) { zel_svc_setting_handle(kGpsSettings, occurrence); }
