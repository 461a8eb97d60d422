#pragma once
// A command that cannot go on throws one of these; main prints it and exits with its code.

#include "command.h"

#include <stdexcept>
#include <string>

namespace zel_command {

class Failure : public std::runtime_error {
  public:
    // `what` says what was tried, on which path, and why it failed; `next` what to do about it.
    Failure(ExitCode code, const std::string &what, std::string next = {})
        : std::runtime_error{what}, code_{code}, next_{std::move(next)} {}

    [[nodiscard]] ExitCode code() const { return code_; }
    [[nodiscard]] const std::string &next() const { return next_; }

  private:
    ExitCode code_;
    std::string next_;
};

} // namespace zel_command
