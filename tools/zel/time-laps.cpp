#include "time-laps.h"

#include <charconv>
#include <cstdint>
#include <optional>

namespace zel_command {
namespace {

constexpr std::string_view kStart = "Time lap (";
constexpr std::string_view kMiddle = ") : ";
constexpr std::string_view kEnd = " sec";
constexpr double kMicroseconds = 1e6;

// An unsigned 32-bit number with the sign that it had before it was printed.
std::optional<std::int32_t> half_of(std::string_view digits) {
    std::uint32_t number = 0;
    const auto [end, error] = std::from_chars(digits.data(), digits.data() + digits.size(), number);
    if (error != std::errc{} || end != digits.data() + digits.size()) return std::nullopt;
    return static_cast<std::int32_t>(number);
}

std::optional<TimeLap> lap_of(std::string_view line) {
    const std::size_t middle = line.rfind(kMiddle);
    if (!line.starts_with(kStart) || !line.ends_with(kEnd) || middle == std::string_view::npos) return std::nullopt;
    std::string_view numbers = line.substr(middle + kMiddle.size());
    numbers.remove_suffix(kEnd.size());
    const std::size_t point = numbers.find('.');
    if (middle < kStart.size() || point == std::string_view::npos) return std::nullopt;
    const auto seconds = half_of(numbers.substr(0, point));
    const auto microseconds = half_of(numbers.substr(point + 1));
    if (!seconds || !microseconds) return std::nullopt;
    return TimeLap{std::string{line.substr(kStart.size(), middle - kStart.size())},
                   *seconds + *microseconds / kMicroseconds};
}

} // namespace

std::vector<TimeLap> time_laps(std::string_view log) {
    std::vector<TimeLap> laps;
    while (!log.empty()) {
        const std::string_view line = log.substr(0, log.find('\n'));
        log.remove_prefix(std::min(log.size(), line.size() + 1));
        if (auto lap = lap_of(line)) laps.push_back(std::move(*lap));
    }
    return laps;
}

} // namespace zel_command
