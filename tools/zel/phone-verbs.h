#pragma once
// `zel phone VERB`: one command for each verb of the bench phone, made from the bench phone's own table.

#include "command.h"

#include <vector>

namespace zel_command {

std::vector<Command> phone_verb_commands();

} // namespace zel_command
