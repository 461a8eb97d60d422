#pragma once
// Sales codes that share one customer folder.

#include "base/zel-svc-active-customer.h"
#include "base/zel-svc-text.h"

#include <string_view>

// The folder that a sales code uses; most codes are their own.
std::string_view zel_svc_internal_customer(std::string_view code);

// The customer that the phone is configured for; both empty without one.
struct ZelSvcCurrentCustomer {
    FixedText<ZEL_SVC_SALES_CODE_SIZE> code;
    FixedText<ZEL_SVC_SALES_CODE_SIZE> folder; // the code itself when it has a folder of its own
    bool shares_folder = false;
};
ZelSvcCurrentCustomer zel_svc_current_customer();
