#pragma once
// The rows of the commands of SIM auto setting.

#include "command.h"

namespace zel_command {

std::vector<Command> sim_commands();

} // namespace zel_command
