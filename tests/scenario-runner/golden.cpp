#include "golden.h"

#include <algorithm>
#include <cstdio>
#include <cstdlib>
#include <fstream>
#include <iterator>
#include <set>
#include <string_view>

namespace zel_scenario {

namespace {

namespace fs = std::filesystem;

std::vector<std::string> golden_lines(const fs::path &path) {
    std::ifstream file{path, std::ios::binary};
    return lines_of({std::istreambuf_iterator<char>{file}, {}});
}

void write_golden(const fs::path &path, const std::vector<std::string> &lines) {
    fs::create_directories(path.parent_path());
    std::ofstream{path, std::ios::binary | std::ios::trunc} << text_of(lines);
}

std::set<std::string> golden_names(const fs::path &folder) {
    std::set<std::string> names;
    if (!fs::exists(folder)) return names;
    for (const auto &entry : fs::recursive_directory_iterator{folder})
        if (entry.is_regular_file()) names.insert(fs::relative(entry.path(), folder).string());
    return names;
}

// Lengths of the longest common subsequences of all suffixes.
std::vector<std::vector<std::size_t>> common_lengths(const std::vector<std::string> &a,
                                                     const std::vector<std::string> &b) {
    std::vector<std::vector<std::size_t>> lengths(a.size() + 1, std::vector<std::size_t>(b.size() + 1, 0));
    for (std::size_t i = a.size(); i-- > 0;)
        for (std::size_t j = b.size(); j-- > 0;)
            lengths[i][j] = a[i] == b[j] ? lengths[i + 1][j + 1] + 1 : std::max(lengths[i + 1][j], lengths[i][j + 1]);
    return lengths;
}

} // namespace

std::vector<std::string> line_difference(const std::vector<std::string> &before,
                                         const std::vector<std::string> &after) {
    const auto lengths = common_lengths(before, after);
    std::vector<std::string> difference;
    std::size_t i = 0;
    std::size_t j = 0;
    while (i < before.size() || j < after.size()) {
        if (i < before.size() && j < after.size() && before[i] == after[j]) {
            ++i;
            ++j;
        } else if (j == after.size() || (i < before.size() && lengths[i + 1][j] >= lengths[i][j + 1])) {
            difference.push_back("- " + before[i++]);
        } else {
            difference.push_back("+ " + after[j++]);
        }
    }
    return difference;
}

int compare_with_golden(const PhoneState &state, const fs::path &folder) {
    const char *wanted = std::getenv("ZEL_GOLDEN");
    const bool update = wanted != nullptr;
    std::set<std::string> names = golden_names(folder);
    if (update && std::string_view{wanted} == "all")
        for (const auto &section : state)
            names.insert(section.first);
    int differing = 0;
    for (const std::string &name : names) {
        const auto section = state.find(name);
        const std::vector<std::string> now = section == state.end() ? std::vector<std::string>{} : section->second;
        const auto difference = line_difference(golden_lines(folder / name), now);
        if (difference.empty() && fs::exists(folder / name)) continue;
        ++differing;
        std::printf("%s:\n", name.c_str());
        for (const std::string &line : difference)
            std::printf("  %s\n", line.c_str());
        if (update) write_golden(folder / name, now);
    }
    return update ? 0 : differing;
}

} // namespace zel_scenario
