#pragma once
// The customer's bookmarks, made in the platform's bookmark service and recorded once the service took them.
// In an operator install the network name "default" stands for every operator.

#include "spec/zel-svc-occurrence.h"

void zel_svc_element_act_bookmark_count(Occurrence &occurrence);
void zel_svc_element_act_bookmark_start(Occurrence &occurrence);
void zel_svc_element_act_bookmark_value(Occurrence &occurrence);
void zel_svc_element_act_bookmark_end(Occurrence &occurrence);

// Drops what a parse that ended inside of a bookmark left behind; called when a parse begins.
void zel_svc_element_act_bookmark_begin_parse();
