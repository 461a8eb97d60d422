#pragma once
// Voicemail entries of an operator: a name and the number to call, recorded for the telephony applications.
// No key of the phone holds them, so they are neither verified nor exported.

#include "spec/zel-svc-occurrence.h"

void zel_svc_element_act_voicemail_start(Occurrence &occurrence);
void zel_svc_element_act_voicemail_value(Occurrence &occurrence);
void zel_svc_element_act_voicemail_end(Occurrence &occurrence);
