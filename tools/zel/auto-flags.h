#pragma once
// Which groups of a customer's settings the SIM card decides.

#include <array>
#include <string>

namespace zel_command {

struct AutoFlag {
    const char *name; // as in the customer's file
    bool on;
};

// Where the customer's file is on the phone.
std::string customer_file_path(const std::string &customer);

// Reads a customer's file to its end; of its elements only the Auto flags are looked at, and nothing is
// written. False when the file cannot be read.
bool read_auto_flags(const std::string &path);

// The flags as the last reading left them.
std::array<AutoFlag, 10> auto_flags();

} // namespace zel_command
