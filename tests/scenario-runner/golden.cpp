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

// A long section that is gone as a whole is told in one line.
std::vector<std::string> shortened(std::vector<std::string> difference, std::size_t size_before) {
    constexpr std::size_t kLong = 50;
    const auto is_lost = [](const std::string &line) { return line.starts_with("- "); };
    const auto lost = static_cast<std::size_t>(std::count_if(difference.begin(), difference.end(), is_lost));
    if (size_before < kLong || lost < size_before) return difference;
    std::erase_if(difference, is_lost);
    difference.insert(difference.begin(), "- all " + std::to_string(size_before) + " lines");
    return difference;
}

std::vector<std::string> section_of(const PhoneState &state, const std::string &name) {
    const auto found = state.find(name);
    return found == state.end() ? std::vector<std::string>{} : found->second;
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

std::vector<std::string> state_difference(const PhoneState &before, const PhoneState &after) {
    std::vector<std::string> difference;
    const auto add = [&](const std::string &name, const std::vector<std::string> &lines) {
        for (const std::string &line : shortened(line_difference(lines, section_of(after, name)), lines.size()))
            difference.push_back(line.substr(0, 2) + name + ": " + line.substr(2));
    };
    for (const auto &[name, lines] : before)
        add(name, lines);
    for (const auto &section : after)
        if (!before.contains(section.first)) add(section.first, {});
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
