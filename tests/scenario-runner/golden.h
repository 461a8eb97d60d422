#pragma once
// Comparing a phone's state with golden files, and rewriting them on demand.

#include "phone-state.h"

#include <filesystem>

namespace zel_scenario {

// Compares each golden file below `folder` with its section; prints what differs. With ZEL_GOLDEN=update the
// files are rewritten, with ZEL_GOLDEN=all every section gets a file. Returns the number of differing files.
int compare_with_golden(const PhoneState &state, const std::filesystem::path &folder);

// The lines that only one side has, as "- line" and "+ line", in order. Equal lines are not shown.
std::vector<std::string> line_difference(const std::vector<std::string> &before, const std::vector<std::string> &after);

// The same for all sections, as "- SECTION: line". A long section of which nothing is left is one line.
std::vector<std::string> state_difference(const PhoneState &before, const PhoneState &after);

} // namespace zel_scenario
