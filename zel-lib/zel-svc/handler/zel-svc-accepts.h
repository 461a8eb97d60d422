#pragma once
// What a spec text may be. This is the only place that says so: install and verification judge by it, and
// checkers, generated documentation and completion read it.
//
//     constexpr Word kStartDays[] = {{"sunday", 0}, {"monday", 1}, {"saturday", 6}};
//     .accepts = words(kStartDays)       exactly these texts, each standing for its number
//     .accepts = kept_words(kPriorities) exactly these texts, kept as they are
//     .accepts = any_number()            a decimal number as the C library reads one
//     .accepts = numbers(7, 11)          the same, in a range
//     .accepts = volume()                a level, stored in the speaker and the earphone byte alike
//     .accepts = language()              a language name of the language table, or a locale
//     .accepts = any_text()              whatever is written
//
// Texts are compared byte for byte: a capital letter or a blank makes another text.

#include <cstdint>
#include <optional>
#include <span>
#include <string>
#include <string_view>

struct Word {
    std::string_view text;
    std::int32_t value = 0;
};

inline constexpr Word kOnOff[] = {{"on", 1}, {"off", 0}};
inline constexpr Word kYesNo[] = {{"yes", 1}, {"no", 0}};

struct Accepts {
    enum class Kind { Words, KeptWords, Number, NumberInRange, Volume, Language, AnyText };

    Kind kind = Kind::AnyText;
    std::span<const Word> words = {}; // Words, KeptWords; further words of Language
    std::int32_t minimum = INT32_MIN; // NumberInRange
    std::int32_t maximum = INT32_MAX;
};

constexpr Accepts words(std::span<const Word> list) { return {.kind = Accepts::Kind::Words, .words = list}; }
constexpr Accepts kept_words(std::span<const Word> list) { return {.kind = Accepts::Kind::KeptWords, .words = list}; }
constexpr Accepts on_off() { return words(kOnOff); }
constexpr Accepts yes_no() { return words(kYesNo); }
constexpr Accepts any_number() { return {.kind = Accepts::Kind::Number}; }
constexpr Accepts numbers(std::int32_t minimum, std::int32_t maximum) {
    return {.kind = Accepts::Kind::NumberInRange, .minimum = minimum, .maximum = maximum};
}
constexpr Accepts volume() { return {.kind = Accepts::Kind::Volume}; }
// `more` are words that the element takes besides languages, such as "automatic".
constexpr Accepts language(std::span<const Word> more = {}) { return {.kind = Accepts::Kind::Language, .words = more}; }
constexpr Accepts any_text() { return {}; }

// The number that an accepted text stands for (0 for kept texts); nothing when the text is not accepted.
// An empty text is accepted by any_text() alone.
std::optional<std::int32_t> zel_svc_accepts_value(const Accepts &accepts, std::string_view text);

// The text that a stored number stands for; nothing when no accepted text gives that number.
// A number outside its range has a text all the same: the phone's value is shown as it is.
std::optional<std::string> zel_svc_accepts_text(const Accepts &accepts, std::int32_t value);
