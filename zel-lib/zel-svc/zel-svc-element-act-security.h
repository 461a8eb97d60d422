#pragma once
// The SIM personalisation data of a customer's file: which networks, service providers, subsets and
// corporate codes the phone may be locked to. Only the security-lock query reads it, into the parse
// context's lock table and the security group; every other parse passes it by.

#include "spec/zel-svc-occurrence.h"

void zel_svc_element_act_security_start(Occurrence &occurrence);
void zel_svc_element_act_security_value(Occurrence &occurrence);
