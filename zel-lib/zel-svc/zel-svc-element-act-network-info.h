#pragma once
// The networks that a customer serves. A full install registers each one in the network database and enters
// it in the network table; the operator list collects each one as an operator.

#include "spec/zel-svc-occurrence.h"

void zel_svc_element_act_network_info_start(Occurrence &occurrence);
void zel_svc_element_act_network_info_value(Occurrence &occurrence);
void zel_svc_element_act_network_info_end(Occurrence &occurrence);

// Drops what a parse that ended inside a network left behind; called when a parse begins.
void zel_svc_element_act_network_info_begin_parse();
