// Questions about the package: its customers, its version, the active customer's SIM locks.

#include "base/zel-svc-guard.h"
#include "base/zel-svc-internal-customer.h"
#include "base/zel-svc-key-text.h"
#include "base/zel-svc-text.h"
#include "spec/zel-svc-data.h"
#include "spec/zel-svc-spec-file.h"
#include "zel-svc-configuration-customer-path.h"
#include "zel-svc-selective-pass.h"

#include <algorithm>
#include <cstring>

namespace {

constexpr ZelSvcElementRange kCustomerList[] = {
    {ZEL_SVC_ELEMENT_CUSTOMER_DATA_SET, ZEL_SVC_ELEMENT_CUSTOMER_DATA_SET},
    {ZEL_SVC_ELEMENT_NB_CUSTOMER, ZEL_SVC_ELEMENT_CUSTOMER_DATA_SET_CUSTOMER_DATA},
};
constexpr ZelSvcElementRange kVersion[] = {{ZEL_SVC_ELEMENT_ZEL_NAME, ZEL_SVC_ELEMENT_ZEL_VERSION}};
constexpr ZelSvcElementRange kSecurityLocks[] = {{ZEL_SVC_ELEMENT_SECURITY, ZEL_SVC_ELEMENT_UNLOCK_CNT}};

constexpr std::string_view kUnknownVersion = "Q0000NXBBBB1";
constexpr std::size_t kVersionPartSize = 10;

// The entries that the package counts, whether or not it describes each. They belong to the parse context:
// 120 of them are too many for a caller's small stack.
std::span<const ZelSvcCustomer> read_customers() {
    ZelSvcCustomerList &customers = zel_svc_collected_customers();
    std::memset(&customers, 0, sizeof customers);
    zel_svc_selective_parse(kCustomerList, ZEL_SVC_PARSE_MODE_CUSTOMER_LIST, ZEL_SVC_SPEC_HEADER_PATH);
    const auto limit = static_cast<std::int32_t>(customers.entries.size());
    return {customers.entries.data(), static_cast<std::size_t>(std::clamp(customers.count, 0, limit))};
}

std::string_view name_of(const ZelSvcCustomer &customer) {
    return zel_svc_text_view(customer.name, sizeof customer.name);
}

bool is_customer(std::string_view name) {
    const std::span<const ZelSvcCustomer> customers = read_customers();
    return !name.empty() && std::any_of(customers.begin(), customers.end(),
                                        [name](const ZelSvcCustomer &customer) { return name_of(customer) == name; });
}

std::string_view first_customer() {
    const std::span<const ZelSvcCustomer> customers = read_customers();
    return customers.empty() ? std::string_view{} : name_of(customers.front());
}

// Name and version in one; empty when the phone knows either not.
std::string package_version() {
    zel_svc_selective_parse(kVersion, ZEL_SVC_PARSE_MODE_HEADER, ZEL_SVC_SPEC_HEADER_PATH);
    using Part = FixedText<kVersionPartSize>;
    const Part name{zel_svc_key_text_or_empty("db/private/zel/bin_name")};
    const Part version{zel_svc_key_text_or_empty("db/private/zel/bin_version")};
    if (name.empty() || version.empty()) return {};
    return std::string{name.view()}.append(version.view());
}

// Records what the parse collects in the security group as well.
void read_locks(std::string_view customer, ZelSvcSecurityLock &result) {
    const std::string path = zel_svc_customer_spec_path(zel_svc_internal_customer(customer));
    zel_svc_data_load(ZEL_SVC_DATA_SECURITY, ZEL_SVC_DATA_SIM1, 1);
    std::memset(&zel_svc_collected_locks(), 0, sizeof result);
    zel_svc_guarded([&] { zel_svc_selective_parse(kSecurityLocks, ZEL_SVC_PARSE_MODE_SECURITY_LOCK, path.c_str()); });
    result = zel_svc_collected_locks();
    zel_svc_guarded([] { zel_svc_data_dump(ZEL_SVC_DATA_SECURITY, ZEL_SVC_DATA_SIM1); });
    zel_svc_data_free(ZEL_SVC_DATA_SECURITY);
}

} // namespace

int zel_svc_config_get_customer_list(ZelSvcCustomer *list, int32_t *count) {
    if (!list || !count) return 0;
    return zel_svc_guarded_or(0, [=] {
        const std::span<const ZelSvcCustomer> customers = read_customers();
        std::copy(customers.begin(), customers.end(), list);
        *count = static_cast<std::int32_t>(customers.size());
        return 1;
    });
}

int zel_svc_config_chk_customer_name_exist_in_zel_bin(const char *customer) {
    if (!customer) return 0;
    return zel_svc_guarded_or(0, [=] { return is_customer(zel_svc_internal_customer(customer)) ? 1 : 0; });
}

int zel_svc_config_get_first_customer_name_in_zel_bin(char *buffer, int size) {
    if (!buffer) return 0;
    return zel_svc_guarded_or(0, [=] {
        zel_svc_text_copy(buffer, zel_svc_buffer_size(size), {});
        const std::string_view name = first_customer();
        zel_svc_text_copy(buffer, zel_svc_buffer_size(size), name);
        return name.empty() ? 0 : 1;
    });
}

int zel_svc_config_get_zel_bin_version(char *buffer, int size) {
    if (!buffer || size < 1) return 0;
    // Unknown, too, where there is no memory to find out.
    zel_svc_text_copy(buffer, zel_svc_buffer_size(size), kUnknownVersion);
    return zel_svc_guarded_or(0, [=] {
        const std::string version = package_version();
        if (version.empty()) return 0;
        zel_svc_text_copy(buffer, zel_svc_buffer_size(size), version);
        return 1;
    });
}

int zel_svc_config_get_security_lock_info(ZelSvcSecurityLock *result) {
    if (!result) return 0;
    return zel_svc_guarded_or(0, [=] {
        FixedText<10> customer;
        if (zel_svc_config_get_active_customer_name(customer.data(), static_cast<int>(customer.width)) == 0) return 0;
        read_locks(customer.view(), *result);
        return 1;
    });
}
