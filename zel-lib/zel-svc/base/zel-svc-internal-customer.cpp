#include "base/zel-svc-internal-customer.h"

#include "base/zel-svc-guard.h"
#include "zel-svc.h"

#include <algorithm>
#include <array>

namespace {

constexpr std::string_view kSharedFolder = "TFG";
constexpr auto kCodesOfSharedFolder = std::to_array<std::string_view>(
    {"CHT", "COB", "CRM", "EBE", "NBS", "PBS", "SAL", "SAM", "TGU", "TMM", "UFN", "UFU", "VMT"});

bool shares_folder(std::string_view code) {
    return std::find(kCodesOfSharedFolder.begin(), kCodesOfSharedFolder.end(), code) != kCodesOfSharedFolder.end();
}

} // namespace

std::string_view zel_svc_internal_customer(std::string_view code) { return shares_folder(code) ? kSharedFolder : code; }

int zel_svc_config_get_internal_customer_name(const char *customer, char *buffer, int size) {
    if (!customer || !buffer) return 0;
    zel_svc_text_copy(buffer, zel_svc_buffer_size(size), zel_svc_internal_customer(customer));
    return shares_folder(customer) ? 1 : 0;
}

ZelSvcCurrentCustomer zel_svc_current_customer() {
    ZelSvcCurrentCustomer customer;
    constexpr int size = ZEL_SVC_SALES_CODE_SIZE;
    if (zel_svc_config_get_active_customer_name(customer.code.data(), size) == 0) return {};
    customer.shares_folder =
        zel_svc_config_get_internal_customer_name(customer.code.c_str(), customer.folder.data(), size) == 1;
    return customer;
}
