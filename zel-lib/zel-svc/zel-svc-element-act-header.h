#pragma once
// The head of a package: its name and version, and the customers that it lists.

#include "handler/zel-svc-setting.h"

#include <span>

// Full and header mode install the name and the version, customer-list mode collects the list.
void zel_svc_element_act_header_value(Occurrence &occurrence);
void zel_svc_element_act_header_customer_start(Occurrence &occurrence);
void zel_svc_element_act_header_end(Occurrence &occurrence);

std::span<const Setting> zel_svc_package_settings();
std::span<const Setting> zel_svc_customer_list_settings();
