#pragma once
// The wide-band AMR voice codec: each operator says whether its network wants it, the phone has one switch.
// In a full install the last one of the spec wins, whatever its network.

#include "handler/zel-svc-setting.h"

#include <span>

void zel_svc_element_act_wb_amr_start(Occurrence &occurrence);
void zel_svc_element_act_wb_amr_value(Occurrence &occurrence);
void zel_svc_element_act_wb_amr_end(Occurrence &occurrence);

std::span<const Setting> zel_svc_wb_amr_settings();
