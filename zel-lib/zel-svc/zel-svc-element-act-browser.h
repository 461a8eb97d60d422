#pragma once
// The browser's cookies and the phone's electronic manual, whose address the bookmark service keeps.

#include "handler/zel-svc-setting.h"

#include <span>

void zel_svc_element_act_browser_value(Occurrence &occurrence);

std::span<const Setting> zel_svc_browser_settings();
