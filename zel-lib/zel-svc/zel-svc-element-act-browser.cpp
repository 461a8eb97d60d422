#include "zel-svc-element-act-browser.h"

#include "handler/zel-svc-setting-rows.h"
#include "zel-svc-bookmark-service.h"

namespace {

constexpr SettingSection kBrowser{ZEL_SVC_DATA_BROWSER, "browser", "Browser"};
constexpr Word kCookies[] = {{"accept", 1}, {"reject", 0}};

// No address counts like one that cannot be read.
std::string manual_on_phone(std::string_view unreadable) {
    BookmarkService service;
    const auto url = service ? service.manual_url() : std::nullopt;
    const bool read = service.close() && url && !url->empty();
    return read ? *url : std::string{unreadable};
}

void install_manual(const Setting &setting, Occurrence &occurrence) {
    if (occurrence.text.empty()) return;
    const BookmarkService service;
    const std::string url{occurrence.text};
    if (service && service.set_manual_url(url.c_str())) zel_svc_setting_record(setting.records[0], 0, url);
}

void verify_manual(const Setting &setting, Occurrence &occurrence) {
    const std::string phone = manual_on_phone(setting.report.shown_as);
    zel_svc_setting_add_result(setting.report.label, occurrence.tag, occurrence.text, phone, occurrence.text == phone);
}

void encode_manual(const Setting &setting, Occurrence &occurrence) {
    occurrence.out->assign(manual_on_phone(setting.exports.shown_as));
}

constexpr Setting kSettings[] = {
    recorded(kBrowser, ZEL_SVC_ELEMENT_COOKIE_OPTION, words(kCookies),
             int_key("file/private/com.quorvex.browser/cookie"), "cookie_opt"),
    {.element = ZEL_SVC_ELEMENT_E_MANUAL_URL,
     .accepts = any_text(),
     .records = {{ZEL_SVC_DATA_BROWSER, "emanual", "url", RecordForm::SpecText}},
     .report = text_in("EManual"),
     .exports = if_recorded(),
     .install = install_manual,
     .verify = verify_manual,
     .encode = encode_manual},
};

} // namespace

std::span<const Setting> zel_svc_browser_settings() { return kSettings; }

void zel_svc_element_act_browser_value(Occurrence &occurrence) { zel_svc_setting_handle(kSettings, occurrence); }
