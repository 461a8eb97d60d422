#pragma once
// What the groups share whose items are rows of the network database, each item serving the networks that its
// name stands for.
//
//     zel_svc_for_each_mccmnc(occurrence, ZEL_SVC_AUTO_MAX_PDP, [](std::string_view mccmnc) { ... });

#include "handler/zel-svc-applies.h"
#include "zel-svc-network-database.h"

#include <cstdint>
#include <optional>
#include <string_view>

// Calls f(mccmnc) for each network whose items an install replaces: those of the network table in a full
// install, the operator's in an operator install. None while the group does not apply.
template <class Function>
void zel_svc_for_each_mccmnc(const Occurrence &occurrence, ZelSvcAutoFlag flag, Function &&f) {
    if (!occurrence.installs() || !zel_svc_group_applies(occurrence, flag)) return;
    const auto visit = [&](const auto &network) { f(zel_svc_text_view(network.mccmnc, sizeof network.mccmnc)); };
    if (occurrence.mode == ZEL_SVC_PARSE_MODE_OPERATOR) return visit(zel_svc_current_operator());
    zel_svc_for_each_network({}, visit);
}

// The id of the network of the operator being installed, which gets a row when it has none.
std::optional<std::int32_t> zel_svc_current_operators_network_id();

// The id for a new row, asked with "select count(*), max(id) from ...": `first` for an empty table, else the
// maximum plus one. Nothing when that cannot be told or there is no further one.
std::optional<std::int32_t> zel_svc_network_next_id(NetworkDatabase &database, const char *select, std::int32_t first);
