#pragma once
// The phone's wall clock: the machine's, a shifted one, or one that stands still.

#include "phone.h"

#include <cstdint>

namespace zel_host {

std::int64_t now_us(Phone &phone); // microseconds since the epoch
void run_clock(Phone &phone);
void set_clock(Phone &phone, std::int64_t us);
void stop_clock(Phone &phone, std::int64_t us);

} // namespace zel_host
