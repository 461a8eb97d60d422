#include "clock.h"
#include "verb.h"

#include <array>
#include <charconv>
#include <cmath>
#include <ctime>

namespace zel_host {
namespace {

constexpr std::int64_t kSecond = 1'000'000;

const char *word_for(ClockMode mode) {
    switch (mode) {
    case ClockMode::Runs:
        return "runs";
    case ClockMode::Shifted:
        return "set";
    case ClockMode::Stands:
        return "stands";
    }
    return "";
}

std::int64_t time_in(Phone &phone, const std::string &text) {
    if (text == "now") return now_us(phone);
    std::tm parts{};
    const char *end = ::strptime(text.c_str(), "%Y-%m-%dT%H:%M:%S", &parts);
    if (end != nullptr && (*end == '\0' || std::string_view(end) == "Z")) return ::timegm(&parts) * kSecond;
    double seconds = 0;
    const char *text_end = text.data() + text.size();
    const auto [stop, error] = std::from_chars(text.data(), text_end, seconds, std::chars_format::fixed);
    if (error != std::errc{} || stop != text_end || !(std::fabs(seconds) < 1e12))
        throw WrongArguments("'" + text + "' is no time: YYYY-MM-DDTHH:MM:SS (UTC), seconds since 1970, or now");
    return static_cast<std::int64_t>(std::llround(seconds * static_cast<double>(kSecond)));
}

std::string shown_time(std::int64_t us) {
    const std::time_t seconds = us / kSecond;
    std::tm parts{};
    std::array<char, 40> text{};
    ::gmtime_r(&seconds, &parts);
    return {text.data(), std::strftime(text.data(), text.size(), "%Y-%m-%dT%H:%M:%SZ", &parts)};
}

Json clock(Phone &phone, const Json &arguments) {
    if (flag_of(arguments, "run")) run_clock(phone);
    if (arguments.contains("set")) set_clock(phone, time_in(phone, text_of(arguments, "set")));
    if (arguments.contains("stop")) stop_clock(phone, time_in(phone, text_of(arguments, "stop")));
    const std::int64_t us = now_us(phone);
    return {{"mode", word_for(phone.page().clock_mode.load())}, {"us", us}, {"time", shown_time(us)}};
}

constexpr Argument kArguments[] = {
    {.name = "run", .type = ArgumentType::Boolean, .help = "Run with this machine's clock"},
    {.name = "set", .help = "Run from this time on (UTC, seconds since 1970, or now)"},
    {.name = "stop", .help = "Stand still at this time"},
};

constexpr Verb kVerbs[] = {
    {.name = "clock", .help = "Show or change the phone's clock", .arguments = kArguments, .run = clock},
};

} // namespace

std::span<const Verb> clock_verbs() { return kVerbs; }

} // namespace zel_host
