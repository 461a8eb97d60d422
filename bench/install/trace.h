#pragma once
// What the library asks of the network database, written down call by call and asked again with nothing else
// around it.
//
//     start_recording();
//     install();                       // every call below goes through a wrapper of the linker's (--wrap)
//     const Trace trace = stop_recording();
//     replay(trace);                   // the same opens, statements, values, steps, columns and closes

#include <cstddef>
#include <cstdint>
#include <string>
#include <vector>

namespace zel_bench {

enum class Call : std::uint8_t { Open, Close, Prepare, BindInt, BindText, BindNull, Step, Column, Finalize };

struct TracedCall {
    Call call;
    std::size_t database = 0;  // number of the connection, in the order of opening
    std::size_t statement = 0; // number of the statement, in the order of preparing
    int at = 0;                // parameter or column
    int value = 0;             // of BindInt
    std::string text;          // path, statement, or value of BindText
};

struct Trace {
    std::vector<TracedCall> calls;
    std::size_t databases = 0;
    std::size_t statements = 0;
};

void start_recording();
Trace stop_recording();

void replay(const Trace &trace);

} // namespace zel_bench
