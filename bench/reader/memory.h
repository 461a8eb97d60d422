#pragma once
// Allocations of this program and of the libraries it uses.

#include <cstddef>

namespace zel_bench {

struct Memory {
    std::size_t allocations = 0;
    std::size_t peak = 0; // bytes held at one time, beyond those held at the start
};

void start_counting();
Memory stop_counting();

} // namespace zel_bench
