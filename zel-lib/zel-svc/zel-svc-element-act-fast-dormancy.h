#pragma once
// Fast dormancy: how long the modem keeps its radio connection after the last data, for each network, with the
// screen on and with the screen off. One element tells one of these times.

#include "spec/zel-svc-occurrence.h"

void zel_svc_element_act_fast_dormancy_start(Occurrence &occurrence);
void zel_svc_element_act_fast_dormancy_value(Occurrence &occurrence);
void zel_svc_element_act_fast_dormancy_end(Occurrence &occurrence);
