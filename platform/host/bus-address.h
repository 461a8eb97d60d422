#pragma once
// The phone's system bus is a socket inside its root. libdbus keeps the first address that a process asked
// for, so the address is set before any other code can ask: at load to one where nobody can listen (never
// the machine's own bus), then to the phone's once its root is known.

#include <string>

namespace zel_host {

void set_bus_address(const std::string &root);

} // namespace zel_host
