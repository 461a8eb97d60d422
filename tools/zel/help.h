#pragma once
// Help texts, made from the command table. No line is longer than 80 columns.

#include "command.h"

#include <string>

namespace zel_command {

constexpr std::size_t kHelpWidth = 80;

// `zel --help`.
std::string help_of_all();
// `zel vconf --help`.
std::string help_of_group(std::string_view group);
// `zel vconf get --help`.
std::string help_of(const Command &command);

// "zel vconf get KEY [--type TYPE]"
std::string usage_of(const Command &command);
// An option as it is typed: "--root DIR", "-v, --verbose".
std::string typed_option(const Parameter &parameter);

} // namespace zel_command
