#pragma once
// One call of the command: which row, and what was given.

#include "command.h"
#include "phone.h"

#include <map>
#include <string>

namespace zel_command {

class Invocation {
  public:
    const Command *command = nullptr;
    std::map<std::string, std::string> values; // of the parameters that were given; a flag's is "true"
    bool json = false;
    bool reveal = false; // show MSINs and passwords
    bool verbose = false;
    std::string root_option; // --root, empty when not given

    // Of a command that needs a phone, set before its function runs.
    std::string root;
    Phone phone;

    [[nodiscard]] bool has(const std::string &name) const { return values.count(name) != 0; }
    // The value of a parameter, empty when it was not given.
    [[nodiscard]] std::string value(const std::string &name) const {
        const auto found = values.find(name);
        return found == values.end() ? std::string{} : found->second;
    }
    // An option for a file was given, and it is not "-", standard output.
    [[nodiscard]] bool names_file(const std::string &name) const { return has(name) && value(name) != "-"; }
};

} // namespace zel_command
