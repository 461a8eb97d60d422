#pragma once
// Quick access: the entries that the browser takes from the section store. No service holds them, so
// verification and export go by what was recorded.

#include "spec/zel-svc-occurrence.h"

void zel_svc_element_act_quick_access_count(Occurrence &occurrence);
void zel_svc_element_act_quick_access_start(Occurrence &occurrence);
void zel_svc_element_act_quick_access_value(Occurrence &occurrence);
void zel_svc_element_act_quick_access_end(Occurrence &occurrence);

// Drops what a parse that ended inside of an entry left behind; called when a parse begins.
void zel_svc_element_act_quick_access_begin_parse();
