#include "zel-svc-configuration-customer-path.h"

#include "spec/zel-svc-spec-file.h"

namespace {

constexpr std::string_view kPreconfigRoot = "/opt/system/zel/preconfig/";

std::string joined(std::string_view before, std::string_view customer, std::string_view after) {
    std::string path;
    path.reserve(before.size() + customer.size() + after.size());
    return path.append(before).append(customer).append(after);
}

} // namespace

bool zel_svc_customer_names_folder(std::string_view customer) {
    return !customer.empty() && customer != "." && customer != ".." && customer.find('/') == std::string_view::npos;
}

std::string zel_svc_customer_spec_path(std::string_view customer) {
    if (!zel_svc_customer_names_folder(customer)) return {};
    constexpr std::string_view format = ZEL_SVC_SPEC_CUSTOMER_FORMAT;
    constexpr std::size_t place = format.find("%s");
    static_assert(place != std::string_view::npos);
    return joined(format.substr(0, place), customer, format.substr(place + 2));
}

std::string zel_svc_customer_preconfig_path(std::string_view customer, std::string_view name) {
    if (!zel_svc_customer_names_folder(customer)) return {};
    return joined(kPreconfigRoot, customer, "/").append(name);
}
