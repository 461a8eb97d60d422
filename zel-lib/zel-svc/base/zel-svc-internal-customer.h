#pragma once
// Sales codes that share one customer folder.

#include <string_view>

// The folder that a sales code uses; most codes are their own.
std::string_view zel_svc_internal_customer(std::string_view code);
