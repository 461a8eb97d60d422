#pragma once
// Contacts and the calendar.

#include "handler/zel-svc-setting.h"

#include <span>

void zel_svc_element_act_contact_value(Occurrence &occurrence);

std::span<const Setting> zel_svc_contact_settings();
