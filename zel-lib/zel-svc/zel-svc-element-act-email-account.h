#pragma once
// E-mail accounts of an operator, recorded for the e-mail application and numbered from 1 on. They are
// neither verified nor exported.

#include "spec/zel-svc-occurrence.h"

void zel_svc_element_act_email_account_start(Occurrence &occurrence);
void zel_svc_element_act_email_account_value(Occurrence &occurrence);
void zel_svc_element_act_email_account_end(Occurrence &occurrence);
