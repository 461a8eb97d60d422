#pragma once
// Runs the built `zel` as a user would, on a phone of the test's own.

#include "support/bench-phone.h"

#include <string>
#include <vector>

namespace zel_test {

struct Outcome {
    int code = -1;
    std::string out; // standard output
    std::string err; // standard error
};

Outcome run_zel(const std::vector<std::string> &arguments);
// With standard output on a terminal.
Outcome run_zel_on_terminal(const std::vector<std::string> &arguments);

class ZelCommand : public BenchPhone {
  protected:
    // Runs a command that must succeed with nothing on standard error, and returns its JSON.
    nlohmann::json json_of(std::vector<std::string> arguments);
};

// Every command with all its options: from the completion script, which is made from the table.
struct KnownCommand {
    std::string name;
    std::vector<std::string> options;
};
std::vector<KnownCommand> known_commands();

} // namespace zel_test
