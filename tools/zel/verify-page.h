#pragma once
// A verification as one HTML page that needs nothing but itself: no other file, no network.

#include "time-laps.h"
#include "verification.h"

namespace zel_command {

struct VerifyPage {
    const Verification &found;
    std::vector<TimeLap> laps;
    bool reveal; // show passwords
};

std::string verify_page(const VerifyPage &page);

} // namespace zel_command
