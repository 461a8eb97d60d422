#pragma once
// The operators that the package offers.

#include "zel-svc.h"

#include <span>
#include <string_view>

enum class ZelSvcOperatorsOf { ActiveCustomer, AllCustomers };

// Reads the customers' files; what is found belongs to the parse context until the next operator list.
std::span<const ZelSvcSimOperator> zel_svc_sim_operators(ZelSvcOperatorsOf whose);

// The same for one customer, active or not, by its sales code.
std::span<const ZelSvcSimOperator> zel_svc_sim_operators_of(std::string_view customer);
