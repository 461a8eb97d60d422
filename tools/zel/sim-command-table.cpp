#include "sim-command-table.h"

#include "commands.h"

namespace zel_command {
namespace {

Parameter slot_option() { return option("slot", "N", "the SIM slot: 1 (the default) or 2"); }

std::vector<Parameter> card_options() {
    return {option("mccmnc", "DIGITS", "the SIM's MCC and MNC, such as 21405"),
            option("msin", "DIGITS", "its subscriber number: the rest of the IMSI"),
            option("gid", "TEXT", "its group identifier"), option("spn", "TEXT", "its service provider name")};
}

Parameter number_option() {
    Parameter result = option("number", "N", "its number in 'zel sim operators', in place of a name");
    result.integer = true;
    return result;
}

std::vector<Parameter> operator+(std::vector<Parameter> first, const std::vector<Parameter> &others) {
    first.insert(first.end(), others.begin(), others.end());
    return first;
}

} // namespace

std::vector<Command> sim_commands() {
    return {
        {.name = "sim insert",
         .parameters =
             card_options() + std::vector{flag("unreadable", "the card is there but cannot be read"), slot_option()},
         .help = "Put a SIM card into a slot of the bench phone.",
         .more = "GID and SPN are on the card, but the library does not read them. Of the MSIN three digits are "
                 "printed; --reveal prints all.",
         .access = Access::kWrites,
         .run = sim_insert},
        {.name = "sim remove",
         .parameters = {slot_option()},
         .help = "Take the SIM card out of a slot of the bench phone.",
         .access = Access::kWrites,
         .run = sim_remove},
        {.name = "sim info",
         .parameters = {option("slot", "N", "only this slot")},
         .help = "Show the SIM slots: card, last card seen, operator.",
         .more = "Of an MSIN three digits are printed; --reveal prints all.",
         .access = Access::kReads,
         .run = sim_info},
        {.name = "sim run",
         .help = "Install the operator that each new SIM belongs to, as after a start.",
         .more =
             "Prints what the run wrote about each slot. Exits 1 without an active customer, when the phone's switch "
             "for SIM auto setting is not on, and when a file of the package cannot be read to its end.",
         .access = Access::kWrites,
         .run = sim_run},
        {.name = "sim operators",
         .parameters = {flag("all", "of every customer of the package")},
         .help = "List the operators of the active customer.",
         .more = "At most 270 are listed. A subset code is the first digits of the MSIN.",
         .access = Access::kReads,
         .run = sim_operators},
        {.name = "sim match",
         .parameters = card_options() + std::vector{option("customer", "CUSTOMER",
                                                           "a sales code in place of the "
                                                           "active customer's"),
                                                    slot_option()},
         .help = "Say which operator a SIM gets, and why not each other one.",
         .more = "Without --mccmnc the SIM in the slot is taken, as the library reads it: without GID and SPN.",
         .access = Access::kReads,
         .run = sim_match},
        {.name = "sim matrix",
         .parameters = {optional_positional("CUSTOMER", "a sales code; else every customer of the package")},
         .help = "List which SIMs reach each operator, which ask the user, and what none reaches.",
         .access = Access::kReads,
         .run = sim_matrix},
        {.name = "sim install",
         .parameters = {optional_positional("NETWORK", "the operator's name; of several the SIM's MCC+MNC decides"),
                        number_option(), flag("all", "choose from every customer of the package"), slot_option()},
         .help = "Install an operator for a slot, as after a user's choice.",
         .more = "Makes it the slot's active operator, keeps the SIM's identity, and clears the question to the user.",
         .access = Access::kWrites,
         .run = sim_install},
        {.name = "sim active",
         .parameters = {option("slot", "N", "only this slot")},
         .help = "Print the operator in force for each slot.",
         .access = Access::kReads,
         .run = sim_active},
        {.name = "sim clear",
         .help = "Forget operators and SIMs of all slots, so that every SIM counts as new.",
         .access = Access::kWrites,
         .run = sim_clear},
    };
}

} // namespace zel_command
