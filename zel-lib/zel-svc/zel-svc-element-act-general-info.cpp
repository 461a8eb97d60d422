#include "zel-svc-element-act-general-info.h"

#include "base/zel-svc-active-customer.h"

#include <string>

namespace {

using CodeText = FixedText<ZEL_SVC_SALES_CODE_SIZE>;
constexpr int kCodeSize = CodeText::width;

// The customer that the phone is configured for. `internal` is the folder that serves its sales code, empty
// when that is the code itself.
struct Customer {
    CodeText active;
    CodeText internal;

    [[nodiscard]] std::string_view folder() const { return (internal.empty() ? active : internal).view(); }
};

Customer current_customer() {
    Customer customer;
    if (!zel_svc_config_get_active_customer_name(customer.active.data(), kCodeSize)) return {};
    if (!zel_svc_config_get_internal_customer_name(customer.active.c_str(), customer.internal.data(), kCodeSize))
        customer.internal.clear();
    return customer;
}

void keep_sales_code(const Setting & /*setting*/, Occurrence &occurrence) { zel_svc_set_sales_code(occurrence.text); }

void verify_sales_code(const Setting &setting, Occurrence &occurrence) {
    const Customer customer = current_customer();
    std::string phone{customer.folder()};
    if (!customer.internal.empty()) phone.append("(active:").append(customer.active.view()).append(")");
    zel_svc_setting_add_result(setting.report.label, occurrence.tag, occurrence.text, phone,
                               occurrence.text == customer.folder());
}

void encode_sales_code(const Setting & /*setting*/, Occurrence &occurrence) {
    occurrence.out->assign(current_customer().folder());
}

constexpr Setting kGeneralInfoSettings[] = {
    {.element = ZEL_SVC_ELEMENT_SALES_CODE,
     .report = text_in(""),
     .exports = always(""),
     .install = keep_sales_code,
     .verify = verify_sales_code,
     .encode = encode_sales_code},
    {.element = ZEL_SVC_ELEMENT_COUNTRY_ISO,
     .stores = {{KeyType::String, "db/zel/country_iso"}},
     .report = text_if_readable(),
     .exports = if_readable()},
};

} // namespace

std::span<const Setting> zel_svc_general_info_settings() { return kGeneralInfoSettings; }

void zel_svc_element_act_general_info_start(Occurrence &occurrence) {
    if (occurrence.element != ZEL_SVC_ELEMENT_GENERAL_INFO || !occurrence.installs()) return;
    zel_svc_set_sales_code({});
    zel_svc_network_table_clear();
}

void zel_svc_element_act_general_info_value(Occurrence &occurrence) {
    zel_svc_setting_handle(kGeneralInfoSettings, occurrence);
}
