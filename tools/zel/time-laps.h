#pragma once
// How long the phases of the last install took, from the phone's time-lap log.

#include <string>
#include <string_view>
#include <vector>

namespace zel_command {

struct TimeLap {
    std::string phase;
    double seconds;
};

// The lines of the log that are laps, in its order.
//
//     Time lap (Spec) : 2.4294467296 sec     is 1.5 s: two numbers, the second one's sign lost in an unsigned
//
// A lap's text is no decimal. The log subtracts the two halves of its times without a borrow and prints them
// unsigned.
std::vector<TimeLap> time_laps(std::string_view log);

} // namespace zel_command
