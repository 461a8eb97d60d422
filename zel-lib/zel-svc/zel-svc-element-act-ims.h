#pragma once
// IMS, VoLTE, SMS over IP and RCS switches, one entry a network, recorded for the IMS service. The entry
// "default" is for the time before a SIM card is known and for operators without an entry of their own.
// IMS is neither verified nor exported.

#include "spec/zel-svc-occurrence.h"

void zel_svc_element_act_ims_start(Occurrence &occurrence);
void zel_svc_element_act_ims_value(Occurrence &occurrence);
void zel_svc_element_act_ims_end(Occurrence &occurrence);
