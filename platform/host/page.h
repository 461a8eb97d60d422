#pragma once
// What every platform call must know at once, in a small file that all processes on a phone share in memory:
// whether there are faults, whether the journal is on, what the clock does.

#include <atomic>
#include <cstdint>

namespace zel_host {

enum class ClockMode : std::uint32_t { Runs, Shifted, Stands };

struct Page {
    std::atomic<std::uint64_t> fault_change; // grows with every change of the faults; 0: none were ever set
    std::atomic<std::uint32_t> journal_on;
    std::atomic<ClockMode> clock_mode;
    std::atomic<std::int64_t> clock_us; // Shifted: what is added to the machine's clock; Stands: the time
};
static_assert(std::atomic<std::uint64_t>::is_always_lock_free);

inline constexpr const char *kPageName = "page"; // in the state folder

// Maps the page of a phone; null when it cannot be. It stays mapped until unmap_page().
Page *map_page(int state_folder);
void unmap_page(Page *page);

} // namespace zel_host
