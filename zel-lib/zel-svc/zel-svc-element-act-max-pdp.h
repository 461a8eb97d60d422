#pragma once
// How many packet data (PDP) contexts the modem may open at once in a network, on 2G and on 3G. The network
// database holds the 3G limit; both are recorded in the section store, which verification and export read.

#include "spec/zel-svc-occurrence.h"

void zel_svc_element_act_max_pdp_start(Occurrence &occurrence);
void zel_svc_element_act_max_pdp_value(Occurrence &occurrence);
void zel_svc_element_act_max_pdp_end(Occurrence &occurrence);
