#pragma once
// Bluetooth and Wi-Fi.

#include "handler/zel-svc-setting.h"

#include <span>

void zel_svc_element_act_connectivity_value(Occurrence &occurrence);

std::span<const Setting> zel_svc_connectivity_settings();
