#include "zel-svc-element-act-header.h"

#include "base/zel-svc-number.h"
#include "base/zel-svc-run-log.h"

#include <algorithm>
#include <string>

namespace {

constexpr Store kName{KeyType::String, "db/private/zel/bin_name"};
constexpr Store kVersion{KeyType::String, "db/private/zel/bin_version"};
constexpr Store kCode{KeyType::String, "db/zel/bincode"};
constexpr Store kFullVersion{KeyType::String, "db/zel/bin_full_version"};

// A customer's path is "/Customer/<code>/customer.xml".
constexpr std::size_t kBeforeCode = 10;
constexpr std::size_t kBehindCode = 13;

// The package's code is the end of its name. Both are set whatever becomes of the other.
void install_name(const Setting &setting, Occurrence &occurrence) {
    const std::string_view name = occurrence.text;
    const std::size_t code = name.size() < 3 ? 0 : zel_svc_text_cut(name, name.size() - 3);
    zel_svc_store_write(setting.stores[0], 0, name);
    zel_svc_store_write(setting.stores[1], 0, name.substr(code));
}

void collect_count(const Setting & /*setting*/, Occurrence &occurrence) {
    constexpr auto kMost = static_cast<std::int32_t>(ZEL_SVC_CUSTOMER_LIST_MAX);
    zel_svc_collected_customers().count = std::clamp(zel_svc_number_from_text(occurrence.text), 0, kMost);
}

constexpr Setting kPackageSettings[] = {
    {.element = ZEL_SVC_ELEMENT_ZEL_NAME, .stores = {kName, kCode}, .install = install_name},
    {.element = ZEL_SVC_ELEMENT_ZEL_VERSION, .stores = {kVersion}},
};

constexpr Setting kCustomerListSettings[] = {
    {.element = ZEL_SVC_ELEMENT_NB_CUSTOMER, .accepts = any_number(), .install = collect_count},
};

bool installs_package(const Occurrence &occurrence) {
    return occurrence.mode == ZEL_SVC_PARSE_MODE_FULL || occurrence.mode == ZEL_SVC_PARSE_MODE_HEADER;
}

std::string_view code_of(std::string_view path) {
    if (path.size() < kBeforeCode + kBehindCode) return {};
    return path.substr(kBeforeCode, path.size() - kBeforeCode - kBehindCode);
}

} // namespace

std::span<const Setting> zel_svc_package_settings() { return kPackageSettings; }
std::span<const Setting> zel_svc_customer_list_settings() { return kCustomerListSettings; }

void zel_svc_element_act_header_value(Occurrence &occurrence) {
    if (!occurrence.installs()) return;
    if (installs_package(occurrence)) return zel_svc_setting_handle(kPackageSettings, occurrence);
    if (occurrence.mode == ZEL_SVC_PARSE_MODE_CUSTOMER_LIST) zel_svc_setting_handle(kCustomerListSettings, occurrence);
}

void zel_svc_element_act_header_customer_start(Occurrence &occurrence) {
    if (occurrence.element != ZEL_SVC_ELEMENT_CUSTOMER_DATA_SET_CUSTOMER_DATA) return;
    if (!occurrence.installs() || occurrence.mode != ZEL_SVC_PARSE_MODE_CUSTOMER_LIST) return;
    const ZelSvcXmlAttribute *source = occurrence.attributes;
    if (!source || zel_svc_text_view(source->name) != "src") return;
    auto &entries = zel_svc_collected_customers().entries;
    const auto index = static_cast<std::size_t>(occurrence.index);
    if (index >= entries.size()) return;
    const std::string_view path = zel_svc_text_view(source->value);
    zel_svc_text_copy(entries[index].name, sizeof entries[index].name, code_of(path));
    zel_svc_text_copy(entries[index].path, sizeof entries[index].path, path);
}

void zel_svc_element_act_header_end(Occurrence &occurrence) {
    if (occurrence.element != ZEL_SVC_ELEMENT_CUSTOMER_DATA_SET) return;
    if (!occurrence.installs() || !installs_package(occurrence)) return;
    const auto name = zel_svc_store_text(kName);
    const auto version = zel_svc_store_text(kVersion);
    if (!name || !version) return zel_svc_run_log("[Header/Error] Binary version not set.\n");
    const std::string full = *name + *version;
    if (zel_svc_store_write(kFullVersion, 0, full))
        zel_svc_run_log("[Header/Success] Binary version('%s') set.\n", full.c_str());
    else
        zel_svc_run_log("[Header/Error] Binary version('%s') not set.\n", full.c_str());
}
