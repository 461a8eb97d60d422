#pragma once
// A telephony daemon for tests: owns "com.tcore.ps" on a bus and writes every call to a descriptor.

#include "phone-bus.h"

namespace zel_test {

// Runs until the bus goes away; never returns. Writes an empty line once the name is owned, then a line a call.
[[noreturn]] void run_telephony(const std::string &address, Telephony behaviour, int record, pid_t bus);

} // namespace zel_test
