#include "zel-svc-sim-auto-setting-operators.h"

#include "base/zel-svc-guard.h"
#include "base/zel-svc-internal-customer.h"
#include "base/zel-svc-text.h"
#include "spec/zel-svc-element-stack.h"
#include "spec/zel-svc-spec-file.h"
#include "zel-svc-configuration-customer-path.h"
#include "zel-svc-selective-pass.h"

#include <algorithm>
#include <cstring>
#include <string>
#include <vector>

namespace {

constexpr ZelSvcElementRange kOperators[] = {
    {ZEL_SVC_ELEMENT_GENERAL_INFO, ZEL_SVC_ELEMENT_SALES_CODE},
    {ZEL_SVC_ELEMENT_NETWORK_INFO, ZEL_SVC_ELEMENT_SP_NAME},
};

struct CustomerFile {
    std::string customer; // stamped into entries whose file names no sales code
    std::string path;
};

std::vector<CustomerFile> file_in_folder(std::string_view customer) {
    return {{std::string{customer}, zel_svc_customer_spec_path(customer)}};
}

std::vector<CustomerFile> file_of_active_customer() {
    const ZelSvcCurrentCustomer customer = zel_svc_current_customer();
    return customer.code.empty() ? std::vector<CustomerFile>{} : file_in_folder(customer.folder.view());
}

CustomerFile file_of(const ZelSvcCustomer &customer) {
    return {std::string{zel_svc_text_view(customer.name, sizeof customer.name)},
            ZEL_SVC_SPEC_ROOT + std::string{zel_svc_text_view(customer.path, sizeof customer.path)}};
}

std::vector<CustomerFile> files_of_all_customers() {
    std::vector<ZelSvcCustomer> customers(ZEL_SVC_MAX_CUSTOMERS);
    std::int32_t count = 0;
    zel_svc_config_get_customer_list(customers.data(), &count);
    std::vector<CustomerFile> files;
    std::transform(customers.begin(), customers.begin() + count, std::back_inserter(files), file_of);
    return files;
}

// What a network says about itself is all in GeneralInfo: the rest of the file, most of it, is not read.
void prepare_parse() {
    zel_svc_selective_enable(kOperators);
    zel_svc_element_set_stop(ZEL_SVC_ELEMENT_GENERAL_INFO);
    geZelSvcParseMode = ZEL_SVC_PARSE_MODE_OPERATOR_LIST;
    std::memset(&zel_svc_collected_operators(), 0, sizeof(ZelSvcOperatorList));
}

void collect(const CustomerFile &file) {
    ZelSvcOperatorList &operators = zel_svc_collected_operators();
    zel_svc_text_copy(operators.customer_name, sizeof operators.customer_name, file.customer);
    zel_svc_set_sales_code({}); // a file without GeneralInfo would keep that of the file before it
    zel_svc_spec_parse_file(ZEL_SVC_PARSE_ACTION_INSTALL, file.path.c_str(), 0);
}

std::span<const ZelSvcSimOperator> operators_in(const std::vector<CustomerFile> &files) {
    if (files.empty()) return {};
    prepare_parse();
    for (const CustomerFile &file : files)
        zel_svc_guarded([&] { collect(file); });
    const ZelSvcOperatorList &operators = zel_svc_collected_operators();
    return {operators.entries.data(), static_cast<std::size_t>(operators.count)};
}

} // namespace

std::span<const ZelSvcSimOperator> zel_svc_sim_operators(ZelSvcOperatorsOf whose) {
    return operators_in(whose == ZelSvcOperatorsOf::AllCustomers ? files_of_all_customers()
                                                                 : file_of_active_customer());
}

std::span<const ZelSvcSimOperator> zel_svc_sim_operators_of(std::string_view customer) {
    return operators_in(file_in_folder(zel_svc_internal_customer(customer)));
}

void zel_svc_sim_auto_setting_get_operator_list(ZelSvcSimOperator *list, int32_t *count, int all_customers) {
    if (!list || !count) return;
    *count = 0;
    const auto whose = all_customers == 0 ? ZelSvcOperatorsOf::ActiveCustomer : ZelSvcOperatorsOf::AllCustomers;
    zel_svc_guarded([=] {
        const std::span<const ZelSvcSimOperator> operators = zel_svc_sim_operators(whose);
        std::copy(operators.begin(), operators.end(), list);
        *count = static_cast<std::int32_t>(operators.size());
    });
}
