#pragma once
// Which SIMs reach which operator of a customer.
//
// For every entry the SIM that is most likely to get it is made up: one that has what the entry asks for and
// nothing that an entry before it asks for. The library's own matcher then says what that SIM gets. When even
// that SIM does not reach the entry, none does.

#include <zel-svc.h>

#include <span>
#include <string>
#include <vector>

namespace zel_command {

enum class Reach {
    Alone,   // a SIM that the phone reads gets this operator
    Asked,   // the user is asked, and may choose this operator
    Caller,  // only callers that know a SIM's GID or SPN, which the phone does not read, reach it
    Nothing, // no SIM reaches it
};

struct Reached {
    Reach reach = Reach::Nothing;
    std::vector<std::size_t> but_for; // entries that take some of its SIMs
    std::vector<std::size_t> asked;   // Reach::Asked: all that the user is asked about, itself among them
    std::vector<std::size_t> instead; // Reach::Nothing: what the made-up SIM gets
    std::string why;                  // Reach::Nothing
};

// One for each entry.
std::vector<Reached> reached(std::span<const ZelSvcSimOperator> entries);

// An MSIN of so many digits that begins with `prefix` and with none of `taken`; "" when there is none.
std::string free_msin(const std::string &prefix, std::span<const std::string> taken, std::size_t digits);

} // namespace zel_command
