#include "zel-svc-element-act-main.h"

#include "base/zel-svc-file.h"

#include <algorithm>
#include <iterator>
#include <string>

namespace {

constexpr const char *kMessageAlert = "db/setting/sound/noti/msg_ringtone_path";
constexpr const char *kEmailAlert = "db/setting/sound/noti/email_ringtone_path";

constexpr Media kMedia[] = {
    {.element = ZEL_SVC_ELEMENT_WALLPAPER,
     .folder = "/opt/usr/share/settings/Wallpapers/",
     .keys = {"db/menu_widget/bgset"},
     .lines = {{"db/menu_widget/bgset"}}},
    {.element = ZEL_SVC_ELEMENT_RING_TONE,
     .folder = "/opt/usr/share/settings/Ringtones/",
     .keys = {"db/setting/sound/call/ringtone_default_path", "db/setting/sound/call/ringtone_path"},
     .records = {"ring_tone"},
     .lines = {{"db/setting/sound/call/ringtone_default_path"}}},
    {.element = ZEL_SVC_ELEMENT_MESSAGE_TONE,
     .folder = "/opt/usr/share/settings/Alerts/",
     // Set twice, kept: listeners of the key see the change twice.
     .keys = {kMessageAlert, kMessageAlert, kEmailAlert},
     .records = {"msg_alert", "email_alert"},
     .lines = {{kMessageAlert, "MessageAlert"}, {kEmailAlert, "EmailAlert"}}},
    {.element = ZEL_SVC_ELEMENT_ALARM_TONE,
     .folder = "/opt/usr/share/settings/Alarms/",
     .keys = {"db/private/com.quorvex.clock/alarm_app/default_alarm_tone"},
     .records = {"alarm_tone"},
     .lines = {{"db/private/com.quorvex.clock/alarm_app/default_alarm_tone"}}},
};

// What "src" paths are relative to.
constexpr std::string_view kPackage = "/opt/system/zel/mps/ZEL";

using SourceText = FixedText<200>;

const Media *media_of(ZelSvcElementId element) {
    const auto *found = std::find_if(std::begin(kMedia), std::end(kMedia),
                                     [&](const Media &media) { return media.element == element; });
    return found == std::end(kMedia) ? nullptr : found;
}

// The attribute "src", empty without one.
SourceText source_of(const ZelSvcXmlAttribute *attribute) {
    while (attribute && zel_svc_text_view(attribute->name) != "src")
        attribute = attribute->next;
    return attribute ? SourceText{zel_svc_text_view(attribute->value)} : SourceText{};
}

std::string_view behind_last_slash(std::string_view path) { return path.substr(path.rfind('/') + 1); }

bool set_keys(const Media &media, const std::string &path) {
    return std::all_of(std::begin(media.keys), std::end(media.keys), [&](const char *key) {
        return !key || zel_svc_store_write({KeyType::String, key}, 0, path);
    });
}

void install(const Media &media, std::string_view source_text, bool first) {
    const std::string source = std::string{kPackage}.append(source_text);
    const std::string target = std::string{media.folder}.append(zel_svc_file_name_part(source));
    __zel_svc_config_copy_file(source.c_str(), target.c_str());
    if (!first || !set_keys(media, target)) return;
    for (const char *key : media.records)
        if (key) zel_svc_data_set_str(ZEL_SVC_DATA_MAIN, "sound", key, target);
}

void verify(const MediaLine &line, std::string_view tag, std::string_view source) {
    const auto path = zel_svc_store_text({KeyType::String, line.key});
    if (!path) return;
    std::string label{tag};
    if (!line.line.empty()) label.append("/").append(line.line);
    const std::string_view spec = behind_last_slash(source);
    const std::string_view phone = behind_last_slash(*path);
    zel_svc_setting_add_result({}, label, spec, phone, spec == phone);
}

} // namespace

std::span<const Media> zel_svc_media() { return kMedia; }

void zel_svc_element_act_main_media_start(Occurrence &occurrence) {
    const Media *media = media_of(occurrence.element);
    const SourceText source = source_of(occurrence.attributes);
    if (!media || source.empty()) return;
    const bool first = occurrence.index == 0;
    if (occurrence.installs()) return install(*media, source.view(), first);
    if (!occurrence.verifies() || !first) return;
    for (const MediaLine &line : media->lines)
        if (line.key) verify(line, occurrence.tag, source.view());
}
