#include "zel-svc-element-act-main.h"

#include "spec/zel-svc-language.h"

#include <array>

namespace {

constexpr std::string_view kAutomatic = "automatic";
constexpr std::string_view kUnknown = "??";
constexpr Word kFollowsSim[] = {{kAutomatic, 1}};

// The phone's languages are locales with their encoding, in texts of this width.
using LocaleText = FixedText<20>;

enum LanguageStore : std::size_t { kLanguage, kRegion, kAutomaticFlag };
enum LanguageRecord : std::size_t { kAutomaticRecord, kWordRecord, kRegionRecord };

std::string look_up(std::string_view value, int to_locale) {
    std::array<char, ZEL_SVC_LANGUAGE_SIZE> out{};
    zel_svc_language_lookup(std::string{value}.c_str(), out.data(), to_locale);
    return out.data();
}

std::string locale_of(std::string_view word) { return look_up(word, 1); }

LocaleText encoded_locale_of(std::string_view word) { return LocaleText{locale_of(word) + ".UTF-8"}; }

// The stored locale without its encoding, "ko_KR" of "ko_KR.UTF-8".
std::optional<std::string> phone_locale(const Setting &setting) {
    auto text = zel_svc_store_text(setting.stores[kLanguage]);
    if (text) text->resize(std::min(text->size(), text->rfind('.')));
    return text;
}

bool follows_sim(const Setting &setting) {
    const Store &flag = setting.stores[kAutomaticFlag];
    return flag.key && zel_svc_store_number(flag) == 1;
}

bool write_locale(const Setting &setting, const LocaleText &locale) {
    return zel_svc_store_write(setting.stores[kLanguage], 0, locale.view()) &&
           zel_svc_store_write(setting.stores[kRegion], 0, locale.view());
}

void set_automatic(const Setting &setting, std::int32_t automatic) {
    if (zel_svc_store_write(setting.stores[kAutomaticFlag], automatic, {}))
        zel_svc_setting_record(setting.records[kAutomaticRecord], automatic, {});
}

void install_language(const Setting &setting, Occurrence &occurrence) {
    if (occurrence.text == kAutomatic) return set_automatic(setting, 1);
    const LocaleText locale = encoded_locale_of(occurrence.text);
    if (!write_locale(setting, locale)) return;
    zel_svc_setting_record(setting.records[kWordRecord], 0, occurrence.text);
    zel_svc_setting_record(setting.records[kRegionRecord], 0, locale.view());
    set_automatic(setting, 0);
}

// The language of a phone without a SIM leaves the automatic choice alone.
void install_language_no_sim(const Setting &setting, Occurrence &occurrence) {
    if (!write_locale(setting, encoded_locale_of(occurrence.text))) return;
    for (const Record &record : setting.records)
        zel_svc_setting_record(record, 0, occurrence.text);
}

void verify_language(const Setting &setting, Occurrence &occurrence) {
    const std::string expected = occurrence.text == kAutomatic ? std::string{kAutomatic} : locale_of(occurrence.text);
    const auto phone = follows_sim(setting) ? std::string{kAutomatic} : phone_locale(setting);
    zel_svc_setting_add_result(setting.report.label, occurrence.tag, occurrence.text,
                               phone.value_or(std::string{kUnknown}), phone == expected);
}

void encode_language(const Setting &setting, Occurrence &occurrence) {
    if (follows_sim(setting)) return occurrence.out->assign(kAutomatic);
    const std::string word = look_up(phone_locale(setting).value_or(std::string{}), 0);
    occurrence.out->assign(word.empty() ? kUnknown : std::string_view{word});
}

constexpr Setting kLanguageSettings[] = {
    {.element = ZEL_SVC_ELEMENT_DEF_LANGUAGE,
     .accepts = language(kFollowsSim),
     .stores = {{KeyType::String, "db/menu_widget/language"},
                {KeyType::String, "db/menu_widget/regionformat"},
                {KeyType::Bool, "db/setting/lang_automatic"}},
     .records = {{ZEL_SVC_DATA_MAIN, "phone", "lang_automatic"},
                 {ZEL_SVC_DATA_MAIN, "phone", "lang", RecordForm::SpecText},
                 {ZEL_SVC_DATA_MAIN, "phone", "region", RecordForm::SpecText}},
     .report = text_in("Phone"),
     .exports = if_recorded(),
     .install = install_language,
     .verify = verify_language,
     .encode = encode_language},
    {.element = ZEL_SVC_ELEMENT_DEF_LANGUAGE_NO_SIM,
     .accepts = language(),
     .stores = {{KeyType::String, "db/menu_widget/language"}, {KeyType::String, "db/menu_widget/regionformat"}},
     .records = {{ZEL_SVC_DATA_MAIN, "phone", "lang", RecordForm::SpecText},
                 {ZEL_SVC_DATA_MAIN, "phone", "lang_no_sim", RecordForm::SpecText},
                 {ZEL_SVC_DATA_MAIN, "phone", "region", RecordForm::SpecText}},
     .report = text_in("Phone"),
     .exports = always(),
     .install = install_language_no_sim,
     .verify = verify_language,
     .encode = encode_language},
};

} // namespace

std::span<const Setting> zel_svc_language_settings() { return kLanguageSettings; }

void zel_svc_element_act_main_language_value(Occurrence &occurrence) {
    zel_svc_setting_handle(kLanguageSettings, occurrence);
}
