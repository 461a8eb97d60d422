#pragma once
// Whether the package holds what a run needs. The library installs what it can and reports nothing, so the
// command looks.

#include "run-watch.h"

#include <string>
#include <vector>

namespace zel_command {

// Everything wrong with a customer and the files read for it, each as one sentence for people; empty when all
// is well. Reads the customer's file, without applying it, when the run did not.
std::vector<std::string> problems_of_run(const std::string &customer, RunWatch &watch);

// The folder that a sales code uses.
std::string internal_name_of(const std::string &customer);

// One file's problem: "PATH:LINE:COLUMN: syntax error".
std::string problem_text(const FileProblem &problem);

} // namespace zel_command
