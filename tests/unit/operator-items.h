#pragma once
// What decides whether an item of one network is installed: the mode, the group's Auto flag and the operator.

#include "spec/zel-svc-parse-context.h"

#include "base/zel-svc-text.h"

#include <string_view>

namespace zel_test {

inline void set_auto_flag(ZelSvcAutoFlag flag, std::int32_t value) {
    gbZelSvcNetworkAutoFlags.at(static_cast<std::size_t>(flag)) = value;
}

inline void set_operator(std::string_view network_name) {
    ZelSvcSimOperator &current = zel_svc_current_operator();
    zel_svc_text_copy(current.network_name, sizeof current.network_name, network_name);
}

// The modes in which no item of a network is installed.
inline constexpr ZelSvcParseMode kModesWithoutItems[] = {ZEL_SVC_PARSE_MODE_PARTIAL, ZEL_SVC_PARSE_MODE_CUSTOMER_LIST,
                                                         ZEL_SVC_PARSE_MODE_SECURITY_LOCK,
                                                         ZEL_SVC_PARSE_MODE_OPERATOR_LIST, ZEL_SVC_PARSE_MODE_HEADER};

} // namespace zel_test
