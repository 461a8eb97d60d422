#include "handler/zel-svc-applies.h"

bool zel_svc_group_applies(const Occurrence &occurrence, ZelSvcAutoFlag flag) {
    const bool from_sim = gbZelSvcNetworkAutoFlags.at(static_cast<std::size_t>(flag)) == 1;
    if (occurrence.verifies()) return occurrence.mode == ZEL_SVC_PARSE_MODE_PARTIAL && !from_sim;
    if (!occurrence.installs()) return false;
    if (occurrence.mode == ZEL_SVC_PARSE_MODE_FULL) return !from_sim;
    return occurrence.mode == ZEL_SVC_PARSE_MODE_OPERATOR && from_sim;
}

bool zel_svc_is_current_operators(std::string_view network_name, Wildcard wildcard) {
    if (network_name.empty()) return false;
    if (wildcard == Wildcard::DefaultIsEverybodys && network_name == "default") return true;
    const ZelSvcSimOperator &current = zel_svc_current_operator();
    return network_name == zel_svc_text_view(current.network_name, sizeof current.network_name);
}

bool zel_svc_item_applies(const Occurrence &occurrence, ZelSvcAutoFlag flag, std::string_view network_name,
                          Wildcard wildcard) {
    if (!occurrence.installs() || !zel_svc_group_applies(occurrence, flag)) return false;
    return occurrence.mode == ZEL_SVC_PARSE_MODE_FULL || zel_svc_is_current_operators(network_name, wildcard);
}
