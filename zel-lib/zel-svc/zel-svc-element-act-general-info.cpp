#include "zel-svc-element-act-general-info.h"

#include "base/zel-svc-internal-customer.h"

#include <string>

namespace {

void keep_sales_code(const Setting & /*setting*/, Occurrence &occurrence) { zel_svc_set_sales_code(occurrence.text); }

void verify_sales_code(const Setting &setting, Occurrence &occurrence) {
    const ZelSvcCurrentCustomer customer = zel_svc_current_customer();
    std::string phone{customer.folder.view()};
    if (customer.shares_folder) phone.append("(active:").append(customer.code.view()).append(")");
    zel_svc_setting_add_result(setting.report.label, occurrence.tag, occurrence.text, phone,
                               occurrence.text == customer.folder.view());
}

void encode_sales_code(const Setting & /*setting*/, Occurrence &occurrence) {
    occurrence.out->assign(zel_svc_current_customer().folder.view());
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
