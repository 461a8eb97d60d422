#pragma once
// Messages: SMS, cell broadcast, push messages and MMS. None depends on the parse mode or on an Auto flag.

#include "handler/zel-svc-setting.h"

#include <span>

// Cell broadcast is recorded for the message service; no key of the phone holds it, so it is neither
// verified nor exported. Its channels are numbered on from the last channel count that was read, whatever
// parse that was in.
void zel_svc_element_act_message_sms_value(Occurrence &occurrence);
void zel_svc_element_act_message_push_value(Occurrence &occurrence);
void zel_svc_element_act_message_mms_value(Occurrence &occurrence);

std::span<const Setting> zel_svc_sms_settings();
std::span<const Setting> zel_svc_push_settings();
std::span<const Setting> zel_svc_mms_settings();
