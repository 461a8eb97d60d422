#pragma once
// The customer that this phone is configured for, and the operator keys that its sales code stands for.
// The exported operations are in zel-svc.h.

#include <cstdint>
#include <string_view>

inline constexpr const char *ZEL_SVC_ACTIVE_CUSTOMER_PATH = "/csa/zel/zel-active-customer.inf";
inline constexpr const char *ZEL_SVC_PRODUCT_CODE_PATH = "/csa/imei/prodcode.dat";
inline constexpr unsigned ZEL_SVC_SALES_CODE_SIZE = 10;

struct ZelSvcOperatorRow {
    std::string_view code;
    std::int32_t operator_id;
    std::int32_t country;
    std::int32_t region;
    std::int32_t sim;
};

// The row of a sales code; of an unknown one the empty row, all 0.
const ZelSvcOperatorRow &zel_svc_operator_row(std::string_view code);
