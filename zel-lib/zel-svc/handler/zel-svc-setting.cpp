#include "handler/zel-svc-setting.h"

#include "base/zel-svc-key-text.h"
#include "base/zel-svc-number.h"
#include "base/zel-svc-observer.h"
#include "spec/zel-svc-verification.h"

#include <vconf.h>

#include <algorithm>
#include <iterator>

namespace {

constexpr std::string_view kUnknown = "??";

void write_records(const Setting &setting, std::size_t stores_written, std::int32_t value, std::string_view text) {
    const auto used = static_cast<std::size_t>(std::count_if(std::begin(setting.stores), std::end(setting.stores),
                                                             [](const Store &store) { return store.key != nullptr; }));
    for (const Record &record : setting.records) {
        if (stores_written < std::min(record.after, used)) continue;
        zel_svc_setting_record(record, value, text);
    }
}

void verify_volume(const Setting &setting, std::string_view tag, std::string_view text) {
    const auto stored = zel_svc_store_number(setting.stores[0]);
    if (!stored) return;
    const auto levels = static_cast<std::uint32_t>(*stored);
    const std::string speaker = std::to_string(levels & 0xFFU);
    const std::string earphone = std::to_string((levels >> 8) & 0xFFU);
    zel_svc_setting_add_result(setting.report.label, tag, text, "(Speaker)" + speaker + ",(Earphone)" + earphone,
                               text == speaker && text == earphone);
}

void verify_number(const Setting &setting, std::string_view tag, std::string_view text) {
    const auto stored = zel_svc_store_number(setting.stores[0]);
    const std::int32_t spec = zel_svc_number_from_text(text);
    const std::string shown = stored ? zel_svc_number_text(*stored) : std::string{setting.report.shown_as};
    zel_svc_setting_add_result(setting.report.label, tag, zel_svc_number_text(spec), shown, stored == spec);
}

void verify_text(const Setting &setting, std::string_view tag, std::string_view text) {
    const auto phone = zel_svc_setting_phone_text(setting);
    if (!phone && setting.report.unreadable == Report::Unreadable::NoLine) return;
    const std::string shown = phone.value_or(std::string{setting.report.shown_as});
    zel_svc_setting_add_result(setting.report.label, tag, text, shown, text == shown);
}

bool flag_is_off(ZelSvcAutoFlag flag) {
    return flag == ZEL_SVC_AUTO_NEVER || gbZelSvcNetworkAutoFlags.at(static_cast<std::size_t>(flag)) != 1;
}

bool says_something(const Setting &setting) {
    if (setting.exports.when == Export::When::Recorded) return zel_svc_setting_is_recorded(setting);
    return setting.exports.when != Export::When::Never;
}

void encode(const Setting &setting, Occurrence &occurrence) {
    if (!occurrence.out || !says_something(setting)) return;
    if (setting.encode) return setting.encode(setting, occurrence);
    zel_svc_setting_encode(setting, *occurrence.out);
}

void verify(const Setting &setting, Occurrence &occurrence) {
    if (!flag_is_off(setting.auto_flag)) return;
    if (setting.verify) return setting.verify(setting, occurrence);
    zel_svc_setting_verify(setting, occurrence.tag, occurrence.text);
}

void install(const Setting &setting, Occurrence &occurrence) {
    if (setting.install) return setting.install(setting, occurrence);
    zel_svc_setting_install(setting, occurrence.text);
}

} // namespace

const Setting *zel_svc_setting_find(std::span<const Setting> settings, ZelSvcElementId element) {
    const auto found = std::find_if(settings.begin(), settings.end(),
                                    [&](const Setting &setting) { return setting.element == element; });
    return found == settings.end() ? nullptr : &*found;
}

void zel_svc_setting_handle(std::span<const Setting> settings, Occurrence &occurrence) {
    const Setting *setting = zel_svc_setting_find(settings, occurrence.element);
    if (!setting) return;
    if (occurrence.exports()) return encode(*setting, occurrence);
    if (!zel_svc_accepts_value(setting->accepts, occurrence.text)) {
        zel_svc_observer().refused_text(occurrence.tag, occurrence.text, occurrence.offset);
        return;
    }
    if (occurrence.verifies()) return verify(*setting, occurrence);
    install(*setting, occurrence);
}

bool zel_svc_setting_install(const Setting &setting, std::string_view text) {
    const auto value = zel_svc_accepts_value(setting.accepts, text);
    if (!value) return false;
    std::size_t written = 0;
    bool refused = false;
    for (const Store &store : setting.stores) {
        if (!store.key) continue;
        refused = !zel_svc_store_write(store, *value, text);
        if (refused) break;
        ++written;
    }
    write_records(setting, written, *value, text);
    return !refused;
}

void zel_svc_setting_verify(const Setting &setting, std::string_view tag, std::string_view text) {
    switch (setting.report.as) {
    case Report::As::Nothing:
        return;
    case Report::As::Text:
        return verify_text(setting, tag, text);
    case Report::As::Number:
        return verify_number(setting, tag, text);
    case Report::As::Volume:
        return verify_volume(setting, tag, text);
    }
}

void zel_svc_setting_encode(const Setting &setting, ZelSvcExportText &out) {
    if (!says_something(setting)) return;
    const auto phone = zel_svc_setting_phone_text(setting);
    out.assign(phone ? std::string_view{*phone} : setting.exports.shown_as);
}

std::optional<std::string> zel_svc_setting_phone_text(const Setting &setting) {
    const Store &store = setting.stores[0];
    if (store.type == KeyType::String) return zel_svc_store_text(store);
    const auto value = zel_svc_store_number(store);
    if (!value) return std::nullopt;
    return zel_svc_accepts_text(setting.accepts, *value).value_or(std::string{kUnknown});
}

bool zel_svc_store_write(const Store &store, std::int32_t value, std::string_view text) {
    if (!store.key) return false;
    switch (store.type) {
    case KeyType::Int:
        return vconf_set_int(store.key, value) == 0;
    case KeyType::Bool:
        return vconf_set_bool(store.key, value) == 0;
    case KeyType::String:
        return vconf_set_str(store.key, std::string{text}.c_str()) == 0;
    }
    return false;
}

std::optional<std::int32_t> zel_svc_store_number(const Store &store) {
    if (!store.key || store.type == KeyType::String) return std::nullopt;
    int value = 0;
    const int result =
        store.type == KeyType::Bool ? vconf_get_bool(store.key, &value) : vconf_get_int(store.key, &value);
    if (result != 0) return std::nullopt;
    return value;
}

std::optional<std::string> zel_svc_store_text(const Store &store) {
    if (!store.key || store.type != KeyType::String) return std::nullopt;
    return zel_svc_key_text(store.key);
}

void zel_svc_setting_record(const Record &record, std::int32_t value, std::string_view text) {
    if (!record.key) return;
    if (record.form == RecordForm::SpecText)
        zel_svc_data_set_str(record.group, record.section, record.key, text);
    else
        zel_svc_data_set_int(record.group, record.section, record.key, value);
}

bool zel_svc_setting_is_recorded(const Setting &setting) {
    const Record &record = setting.records[0];
    return record.key && zel_svc_data_find(record.group, record.section, record.key) != 0;
}

void zel_svc_setting_add_result(std::string_view label, std::string_view tag, std::string_view spec,
                                std::string_view phone, bool matched) {
    std::string full{label};
    if (!label.empty()) full += '/';
    full += tag;
    zel_svc_verification_add_compared(full, spec, phone, matched);
}
