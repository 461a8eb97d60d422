#pragma once
// From the words that the user typed to one row of the command table.

#include "invocation.h"

namespace zel_command {

// Fills in the invocation and returns a negative number, or prints help or an error and returns the exit code.
int parse_command_line(int argc, char **argv, Invocation &invocation);

} // namespace zel_command
