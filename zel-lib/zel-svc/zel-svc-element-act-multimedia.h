#pragma once
// The camera.

#include "handler/zel-svc-setting.h"

#include <span>

void zel_svc_element_act_multimedia_value(Occurrence &occurrence);

std::span<const Setting> zel_svc_multimedia_settings();
