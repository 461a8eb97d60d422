#pragma once
// Data-sync accounts, each a profile of the platform's sync agent, recorded once the agent took it. The agent
// is in use from the start to the end of the SyncML element.

#include "spec/zel-svc-occurrence.h"

// Drops the account and lets go of the agent that a parse left behind by ending inside of their elements; called
// when a parse begins.
void zel_svc_element_act_syncml_begin_parse();

void zel_svc_element_act_syncml_start(Occurrence &occurrence);
void zel_svc_element_act_syncml_end(Occurrence &occurrence);

void zel_svc_element_act_data_sync_count(Occurrence &occurrence);
void zel_svc_element_act_data_sync_start(Occurrence &occurrence);
void zel_svc_element_act_data_sync_value(Occurrence &occurrence);
void zel_svc_element_act_data_sync_end(Occurrence &occurrence);
