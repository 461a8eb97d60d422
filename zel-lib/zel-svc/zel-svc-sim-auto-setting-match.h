#pragma once
// Which of a customer's operators a SIM belongs to, and what kept it from the others.
//
//     const ZelSvcSimMatch match = zel_svc_sim_match(zel_svc_sim_operators(ZelSvcOperatorsOf::ActiveCustomer), sim);
//     for (std::size_t entry : match.chosen) ...      // one: it is installed; several: the user chooses

#include "zel-svc.h"

#include <span>
#include <vector>

// What an entry asks of a SIM beside its MCC and MNC: the first that it states, whatever else it states.
enum class ZelSvcSimAsks {
    Msin,    // its subset code: the first digits
    Gid,     // its group identifier
    SpName,  // its service provider name
    Nothing, // fits every SIM of the network
};
ZelSvcSimAsks zel_svc_sim_asks(const ZelSvcSimOperator &entry);

enum class ZelSvcSimVerdict {
    OtherNetwork, // not the SIM's MCC and MNC
    OtherMsin,    // the SIM's MSIN does not begin with the entry's subset code
    OtherGid,     // not the SIM's group identifier
    OtherSpName,  // not the SIM's service provider name
    Plain,        // the SIM's MCC and MNC, and nothing else to go by
    Decisive,     // the SIM has what tells this operator from others in the same network
};

struct ZelSvcSimMatch {
    std::vector<ZelSvcSimVerdict> verdicts; // of every entry, by itself
    std::vector<std::size_t> chosen;        // the first decisive entry alone, or all plain ones, in their order
};

ZelSvcSimMatch zel_svc_sim_match(std::span<const ZelSvcSimOperator> operators, const ZelSvcSimInfo &sim);
