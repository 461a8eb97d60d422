#pragma once
// Operators of a package, as the commands of SIM auto setting show them.

#include "invocation.h"
#include "run-watch.h"

#include <zel-svc.h>

#include <span>
#include <string>
#include <vector>

namespace zel_command {

// What an entry asks of a SIM beside its MCC and MNC: "MSIN 98...", "GID A3", "SPN Orange", or "".
std::string asked_text(const ZelSvcSimOperator &entry);
// The same of an operator that a slot has: what its code says of the card there is shown as of any MSIN.
std::string asked_text_of_card(const ZelSvcSimOperator &entry, bool reveal);

// {"number": 3, "customer": ..., "network": ..., "mccmnc": ..., "subset_code": ..., "gid": ..., "sp_name": ...}
// Numbers count from 1.
Json operator_json(const ZelSvcSimOperator &entry, std::size_t index);
// Of an operator that a card has got, or gets, `subset_code` is shown as the card's MSIN is.
Json operator_json_of_card(const ZelSvcSimOperator &entry, std::size_t index, bool reveal);

// The entries of the customer that is named, else of the active one. Throws a Failure when there is none or its
// file cannot be read.
struct CustomerOperators {
    std::string customer;
    std::vector<ZelSvcSimOperator> entries;
};
CustomerOperators operators_of(const Invocation &invocation, const std::string &customer);
// The same for each customer that the package lists.
std::vector<CustomerOperators> operators_of_package(const Invocation &invocation);

// Throws a Failure when a file that was read has an end before its end.
void require_readable_files(const Invocation &invocation, const RunWatch &watch);

std::string active_customer_name();

} // namespace zel_command
