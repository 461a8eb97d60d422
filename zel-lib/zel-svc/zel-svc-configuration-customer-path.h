#pragma once
// Where a customer's files lie.

#include <string>
#include <string_view>

// A customer that is empty, "." or "..", or holds "/" names no folder: the paths below are then empty and
// open nothing, so a code can never lead out of the package.
bool zel_svc_customer_names_folder(std::string_view customer);

// "/opt/system/zel/mps/ZEL/Customer/CUSTOMER/customer.xml"
std::string zel_svc_customer_spec_path(std::string_view customer);

// "/opt/system/zel/preconfig/CUSTOMER/NAME"; customer "DEF" holds what every customer gets.
std::string zel_svc_customer_preconfig_path(std::string_view customer, std::string_view name);
inline constexpr std::string_view ZEL_SVC_PRECONFIG_EVERY_CUSTOMER = "DEF";
