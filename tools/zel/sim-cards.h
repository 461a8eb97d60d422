#pragma once
// SIM cards and slots, as the commands of SIM auto setting show and name them.

#include "field-text.h"
#include "invocation.h"

#include <zel-svc.h>

#include <string>
#include <string_view>
#include <vector>

namespace zel_command {

// The slot that --slot names, 1 without it. Throws a Failure when the phone has no such slot.
int chosen_slot(const Invocation &invocation);
// Every slot of the phone, or the one that --slot names.
std::vector<int> chosen_slots(const Invocation &invocation);

// As much of a subscriber number as people may see: its first three digits.
std::string shown_msin(std::string_view msin, bool reveal);
// The same of a code that an MSIN is known to begin with: "98", "987***".
std::string shown_first_digits(std::string_view code, bool reveal);

// A card that --mccmnc, --msin, --gid and --spn describe. Throws a Failure when it is none.
ZelSvcSimInfo described_card(const Invocation &invocation);

Json card_json(const ZelSvcSimInfo &card, bool reveal);
// "21405, MSIN 987***, GID A3, SPN Orange"; what the card lacks is left out.
std::string card_text(const ZelSvcSimInfo &card, bool reveal);
std::string card_text(const Json &card); // of card_json()

} // namespace zel_command
