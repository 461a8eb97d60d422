#include "reader/memory.h"

#include <algorithm>
#include <cstdlib>
#include <malloc.h>

// The allocator under its own names, so that malloc() can be stood in for.
extern "C" {
void *__libc_malloc(std::size_t size);
void *__libc_calloc(std::size_t count, std::size_t size);
void *__libc_realloc(void *memory, std::size_t size);
void __libc_free(void *memory);
}

namespace zel_bench {
namespace {

bool gCounts = false;
Memory gMemory;
long gHeld = 0;

void count(long bytes, bool allocates) {
    gHeld += bytes;
    gMemory.allocations += allocates ? 1 : 0;
    gMemory.peak = std::max(gMemory.peak, static_cast<std::size_t>(std::max(gHeld, 0L)));
}

long usable(void *memory) { return static_cast<long>(malloc_usable_size(memory)); }

} // namespace

void start_counting() {
    gMemory = {};
    gHeld = 0;
    gCounts = true;
}

Memory stop_counting() {
    gCounts = false;
    return gMemory;
}

} // namespace zel_bench

using zel_bench::count;
using zel_bench::gCounts;
using zel_bench::usable;

extern "C" {

void *malloc(std::size_t size) {
    void *memory = __libc_malloc(size);
    if (gCounts) count(usable(memory), true);
    return memory;
}

void *calloc(std::size_t members, std::size_t size) {
    void *memory = __libc_calloc(members, size);
    if (gCounts) count(usable(memory), true);
    return memory;
}

void *realloc(void *memory, std::size_t size) {
    if (gCounts) count(-usable(memory), false);
    void *moved = __libc_realloc(memory, size);
    if (gCounts) count(usable(moved), true);
    return moved;
}

void free(void *memory) {
    if (gCounts) count(-usable(memory), false);
    __libc_free(memory);
}
}
