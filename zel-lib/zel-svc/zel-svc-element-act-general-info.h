#pragma once
// General information of a customer file: the customer's sales code and country.

#include "handler/zel-svc-setting.h"

#include <span>

// Begins a customer: what an earlier one left in the network table is forgotten.
void zel_svc_element_act_general_info_start(Occurrence &occurrence);
void zel_svc_element_act_general_info_value(Occurrence &occurrence);

std::span<const Setting> zel_svc_general_info_settings();
