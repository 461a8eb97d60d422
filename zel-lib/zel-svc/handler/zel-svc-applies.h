#pragma once
// When does an item of the spec apply? Questions that are asked by every group whose data may come from the
// SIM card instead of the customer's file.

#include "spec/zel-svc-occurrence.h"

#include <string_view>

// Install: a full install applies a group whose Auto flag is 0, an operator install one whose flag is 1, no
// other mode applies any. Verification checks, in the partial mode, a group whose flag is 0. Never in an
// export.
bool zel_svc_group_applies(const Occurrence &occurrence, ZelSvcAutoFlag flag);

enum class Wildcard { None, DefaultIsEverybodys };

// Whether an item's network name is that of the operator being installed. An empty name is nobody's; a
// group may take the name "default" for every operator's.
bool zel_svc_is_current_operators(std::string_view network_name, Wildcard wildcard = Wildcard::None);

// Install of an item that serves one network: a full install takes it as soon as its group applies, an
// operator install only when it is the operator's own.
bool zel_svc_item_applies(const Occurrence &occurrence, ZelSvcAutoFlag flag, std::string_view network_name,
                          Wildcard wildcard = Wildcard::None);

inline bool zel_svc_is_every_network(std::string_view network_name) {
    return network_name.empty() || network_name == "default";
}

// Calls f(entry) for each entry of the network table that a name stands for: those of that name, or all of
// them for an empty name and "default". Document order.
template <class Function> void zel_svc_for_each_network(std::string_view network_name, Function &&f) {
    for (const ZelSvcNetworkEntry &entry : zel_svc_network_table())
        if (zel_svc_is_every_network(network_name) || network_name == entry.network_name) f(entry);
}

// The same until a call of f(entry) gives false; whether none did.
template <class Function> bool zel_svc_every_network(std::string_view network_name, Function &&f) {
    for (const ZelSvcNetworkEntry &entry : zel_svc_network_table()) {
        if (!zel_svc_is_every_network(network_name) && network_name != entry.network_name) continue;
        if (!f(entry)) return false;
    }
    return true;
}
