#pragma once
// E-mail options, recorded for the e-mail application. No key of the phone holds them, so they are neither
// verified nor exported.

#include "handler/zel-svc-setting.h"

#include <span>

void zel_svc_element_act_email_value(Occurrence &occurrence);

std::span<const Setting> zel_svc_email_settings();
