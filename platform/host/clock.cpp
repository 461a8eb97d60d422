#include "clock.h"

#include <sys/time.h>

namespace zel_host {
namespace {

constexpr std::int64_t kSecond = 1'000'000;

std::int64_t machine_us() {
    timeval now{};
    ::gettimeofday(&now, nullptr);
    return std::int64_t{now.tv_sec} * kSecond + now.tv_usec;
}

void store(Phone &phone, ClockMode mode, std::int64_t us) {
    phone.page().clock_us.store(us);
    phone.page().clock_mode.store(mode);
}

} // namespace

std::int64_t now_us(Phone &phone) {
    const std::int64_t us = phone.page().clock_us.load();
    switch (phone.page().clock_mode.load()) {
    case ClockMode::Stands:
        return us;
    case ClockMode::Shifted:
        return machine_us() + us;
    case ClockMode::Runs:
        break;
    }
    return machine_us();
}

void run_clock(Phone &phone) { store(phone, ClockMode::Runs, 0); }
void set_clock(Phone &phone, std::int64_t us) { store(phone, ClockMode::Shifted, us - machine_us()); }
void stop_clock(Phone &phone, std::int64_t us) { store(phone, ClockMode::Stands, us); }

} // namespace zel_host
