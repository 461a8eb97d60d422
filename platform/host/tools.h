#pragma once
// Commands of the phone. A command is split into words at blanks, and its first word names a registered
// tool, which answers in this process. No program of the phone or of the workstation is ever executed.

#include "phone.h"

#include <string_view>

namespace zel_host {

inline constexpr int kNotFound = 32512; // the raw status of a shell that found no program

// Raw wait status.
int run_command(Phone &phone, std::string_view command);

void add_tool(Phone &phone, std::string_view path, int exit_status);

} // namespace zel_host
