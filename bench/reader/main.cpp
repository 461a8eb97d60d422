// Reads customer files with the system's own reader and with its peers, side by side:
//
//     zel-bench-reader customer-30K.xml customer-300K.xml customer-10M.xml
//
// All contestants take turns, so that what else the machine does meets them alike; each one's best run counts.

#include "reader/contestants.h"
#include "reader/memory.h"

#include <algorithm>
#include <array>
#include <chrono>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <fstream>
#include <iterator>
#include <string>
#include <vector>

namespace zel_bench {
namespace {

using Clock = std::chrono::steady_clock;

constexpr std::array<Contestant, 6> kContestants{{
    {"zel tokenizer", read_with_tokenizer},
    {"zel tokenizer + dispatch", read_with_dispatch},
    {"  with a walk of the rows", read_with_walk},
    {"expat", read_with_expat},
    {"libxml2 SAX", read_with_libxml2},
    {"pugixml in place + walk", read_with_pugixml},
}};
constexpr std::size_t kTokenizer = 0;
constexpr std::size_t kExpat = 3;
constexpr std::size_t kPugixml = 5;

struct Measure {
    double best = 1e9; // seconds
    std::vector<double> all;
    Seen seen;
    Memory memory;

    [[nodiscard]] double median() {
        std::nth_element(all.begin(), all.begin() + static_cast<std::ptrdiff_t>(all.size() / 2), all.end());
        return all[all.size() / 2];
    }
};

using Measures = std::array<Measure, kContestants.size()>;

std::string read_file(const char *path) {
    std::ifstream file(path, std::ios::binary);
    std::string bytes{std::istreambuf_iterator<char>(file), {}};
    constexpr std::size_t kMarkSize = 3;
    if (bytes.size() > kMarkSize) return bytes.substr(kMarkSize);
    std::fprintf(stderr, "zel-bench-reader: no spec file: %s\n", path);
    std::exit(1);
}

void run_once(const Contestant &contestant, const std::string &file, std::string &copy, Measure &measure) {
    std::memcpy(copy.data(), file.data(), file.size());
    const auto start = Clock::now();
    measure.seen = contestant.read(copy);
    const double seconds = std::chrono::duration<double>(Clock::now() - start).count();
    measure.best = std::min(measure.best, seconds);
    measure.all.push_back(seconds);
}

void count_memory(const Contestant &contestant, const std::string &file, std::string &copy, Measure &measure) {
    std::memcpy(copy.data(), file.data(), file.size());
    start_counting();
    contestant.read(copy);
    measure.memory = stop_counting();
}

void print(const std::string &file, const char *path, Measures &measures, std::size_t rounds) {
    std::printf("\n%s: %zu bytes, %zu elements, %zu texts, %zu rounds\n", path, file.size(),
                measures[kTokenizer].seen.elements, measures[kTokenizer].seen.texts, rounds);
    std::printf("%-26s %9s %9s %9s %9s %7s %11s\n", "", "best MB/s", "med. MB/s", "x expat", "x pugixml", "allocs",
                "memory KiB");
    for (std::size_t at = 0; at < kContestants.size(); ++at) {
        Measure &measure = measures[at];
        const auto rate = [&](double seconds) { return static_cast<double>(file.size()) / seconds / 1e6; };
        std::printf("%-26s %9.1f %9.1f %9.2f %9.2f %7zu %11.1f\n", kContestants[at].name, rate(measure.best),
                    rate(measure.median()), measures[kExpat].best / measure.best,
                    measures[kPugixml].best / measure.best, measure.memory.allocations,
                    static_cast<double>(measure.memory.peak) / 1024);
    }
}

void compare(const char *path) {
    const std::string file = read_file(path);
    std::string copy = file;
    Measures measures;
    // About as many bytes for a small file as for a large one.
    const std::size_t rounds = std::clamp<std::size_t>(300'000'000 / file.size(), 15, 3000);
    for (std::size_t round = 0; round < rounds; ++round)
        for (std::size_t at = 0; at < kContestants.size(); ++at)
            run_once(kContestants[at], file, copy, measures[at]);
    for (std::size_t at = 0; at < kContestants.size(); ++at)
        count_memory(kContestants[at], file, copy, measures[at]);
    for (const Measure &measure : measures)
        if (measure.seen.elements != measures[kTokenizer].seen.elements) {
            std::fprintf(stderr, "zel-bench-reader: the contestants disagree on %s\n", path);
            std::exit(1);
        }
    print(file, path, measures, rounds);
}

} // namespace
} // namespace zel_bench

int main(int count, char **arguments) {
    if (count < 2) {
        std::fputs("usage: zel-bench-reader FILE...\n", stderr);
        return 2;
    }
    for (int at = 1; at < count; ++at)
        zel_bench::compare(arguments[at]);
    return 0;
}
