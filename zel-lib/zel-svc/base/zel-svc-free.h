#pragma once
// Memory that the C library or a service of the phone handed over, released with free().

#include <cstdlib>
#include <memory>

struct ZelSvcFree {
    void operator()(void *memory) const { std::free(memory); }
};

template <class T> using ZelSvcOwned = std::unique_ptr<T, ZelSvcFree>;
using ZelSvcOwnedText = ZelSvcOwned<char>;
