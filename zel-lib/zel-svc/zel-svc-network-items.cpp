#include "zel-svc-network-items.h"

#include "zel-svc-network-info.h"

std::optional<std::int32_t> zel_svc_current_operators_network_id() {
    const ZelSvcSimOperator &current = zel_svc_current_operator();
    std::int32_t id = 0;
    if (!__zel_svc_network_info_get_id(current.network_name, current.mccmnc, 1, &id) || id < 1) return std::nullopt;
    return id;
}

std::optional<std::int32_t> zel_svc_network_next_id(NetworkDatabase &database, const char *select, std::int32_t first) {
    NetworkStatement statement = database.prepare(select);
    if (statement.step() != NetworkStep::Row) return std::nullopt;
    if (statement.integer(0) == 0) return first;
    return zel_svc_network_id_after(statement.integer(1));
}
