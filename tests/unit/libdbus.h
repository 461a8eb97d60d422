#pragma once
// The calls of libdbus that need a bus, answered by the test: this program's own functions stand before the
// library's. Everything that works without a bus is the real thing.

#include <optional>
#include <string>
#include <vector>

namespace zel_test {

struct Libdbus {
    bool connects = false;
    bool appends = true;
    bool replies = true;
    std::string error_name; // of a call without a reply; empty: none is set
    std::string error_text;

    std::optional<bool> exits_on_disconnect; // what the process's connection was told
    std::vector<std::string> sent;           // "DESTINATION PATH INTERFACE METHOD(SIGNATURE)"
    std::vector<int> arguments;
    std::vector<int> time_outs;
};

// Null, the default: libdbus itself answers.
void use_libdbus(Libdbus *fake);

} // namespace zel_test
