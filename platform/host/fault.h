#pragma once
// Injected faults: which calls of the platform fail, and how.

#include "function.h"
#include "phone.h"

#include <cstdint>
#include <functional>
#include <string>

namespace zel_host {

struct Fault {
    std::int64_t id = 0;
    std::string function;
    std::string text; // "" matches any
    int from = 1;     // the first matching call that fails, counted over all processes since the fault was set
    int times = -1;   // how many fail; negative: all
    int result = -1;
    int error = 0; // errno
};

// The fault that fails this call; null for none. Counts the call. The faults are read again only when they
// have changed.
const Fault *matching_fault(Phone &phone, const Function &row, const char *text);

// False as long as none was ever set: the cheap question before the one above.
bool any_faults(Phone &phone);

// Adds a fault, its id aside, and returns its id.
std::int64_t add_fault(Phone &phone, const Fault &fault);
void each_fault(Phone &phone, const std::function<void(const Fault &fault, std::int64_t seen)> &use);
void clear_faults(Phone &phone);

} // namespace zel_host
