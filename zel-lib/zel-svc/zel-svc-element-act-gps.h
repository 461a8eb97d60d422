#pragma once
// The location service.

#include "handler/zel-svc-setting.h"

#include <span>

void zel_svc_element_act_gps_value(Occurrence &occurrence);

std::span<const Setting> zel_svc_gps_settings();
