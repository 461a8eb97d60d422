#pragma once
// The switches of the spec's Network element: which groups of operator data come from the SIM card (the Auto
// flags), and how the phone attaches to the packet service.

#include "handler/zel-svc-setting.h"

#include <span>

void zel_svc_element_act_network_start(Occurrence &occurrence);
void zel_svc_element_act_network_value(Occurrence &occurrence);
void zel_svc_element_act_network_end(Occurrence &occurrence);

std::span<const Setting> zel_svc_network_settings();
