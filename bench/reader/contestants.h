#pragma once
// Those that read the same file. Each visits every element and every text and counts them, so that nobody
// gets away with reading less. (Some report white space between tags and parts of a text on their own.)

#include <cstddef>
#include <span>

namespace zel_bench {

struct Seen {
    std::size_t elements = 0; // start tags
    std::size_t texts = 0;    // runs of text that are not only white space
};

struct Contestant {
    const char *name;
    Seen (*read)(std::span<char> bytes); // of a copy that may be overwritten
};

Seen read_with_tokenizer(std::span<char> bytes);
Seen read_with_dispatch(std::span<char> bytes);
Seen read_with_walk(std::span<char> bytes);
Seen read_with_expat(std::span<char> bytes);
Seen read_with_libxml2(std::span<char> bytes);
Seen read_with_pugixml(std::span<char> bytes);

} // namespace zel_bench
