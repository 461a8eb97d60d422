#include "zel-svc-element-act-multimedia.h"

#include "handler/zel-svc-setting-rows.h"

namespace {

constexpr SettingSection kCamera{ZEL_SVC_DATA_MULTIMEDIA, "camera", "Camera"};

constexpr Setting kMultimediaSettings[] = {
    recorded(kCamera, ZEL_SVC_ELEMENT_SHUTTER_SOUND, on_off(), int_key("file/camera/shutter_sound_policy"),
             "shutter_sound"),
};

} // namespace

std::span<const Setting> zel_svc_multimedia_settings() { return kMultimediaSettings; }

void zel_svc_element_act_multimedia_value(Occurrence &occurrence) {
    zel_svc_setting_handle(kMultimediaSettings, occurrence);
}
