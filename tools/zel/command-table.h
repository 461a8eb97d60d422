#pragma once
// Every command of `zel`, in the order of its help.

#include "command.h"

#include <vector>

namespace zel_command {

// The commands of this program, then one "phone VERB" for each verb of the bench phone.
const std::vector<Command> &command_table();

// The row of that name; null when there is none.
const Command *find_command(std::string_view name);

} // namespace zel_command
