#include "handler/zel-svc-accepts.h"

#include "base/zel-svc-number.h"
#include "spec/zel-svc-language.h"

#include <algorithm>

namespace {

const Word *word_of(std::span<const Word> words, std::string_view text) {
    const auto found = std::find_if(words.begin(), words.end(), [&](const Word &word) { return word.text == text; });
    return found == words.end() ? nullptr : &*found;
}

std::optional<std::int32_t> word_value(std::span<const Word> words, std::string_view text) {
    if (const Word *word = word_of(words, text)) return word->value;
    return std::nullopt;
}

// Speaker level in the low byte, earphone level in the next one.
std::int32_t both_levels(std::uint32_t level) { return static_cast<std::int32_t>(level | (level << 8)); }

} // namespace

std::optional<std::int32_t> zel_svc_accepts_value(const Accepts &accepts, std::string_view text) {
    using Kind = Accepts::Kind;
    if (accepts.kind == Kind::AnyText) return 0;
    if (text.empty()) return std::nullopt;
    switch (accepts.kind) {
    case Kind::Words:
    case Kind::KeptWords:
        return word_value(accepts.words, text);
    case Kind::Number:
        return zel_svc_number_from_text(text);
    case Kind::Volume:
        return both_levels(static_cast<std::uint32_t>(zel_svc_number_from_text(text)));
    case Kind::NumberInRange: {
        const std::int32_t number = zel_svc_number_from_text(text);
        if (number < accepts.minimum || number > accepts.maximum) return std::nullopt;
        return number;
    }
    case Kind::Language:
        if (const auto value = word_value(accepts.words, text)) return value;
        if (zel_svc_language_known(text)) return 0;
        return std::nullopt;
    case Kind::AnyText:
        break;
    }
    return 0;
}

std::optional<std::string> zel_svc_accepts_text(const Accepts &accepts, std::int32_t value) {
    using Kind = Accepts::Kind;
    switch (accepts.kind) {
    case Kind::Words: {
        const auto found = std::find_if(accepts.words.begin(), accepts.words.end(),
                                        [&](const Word &word) { return word.value == value; });
        if (found == accepts.words.end()) return std::nullopt;
        return std::string{found->text};
    }
    case Kind::Number:
    case Kind::NumberInRange:
        return zel_svc_number_text(value);
    case Kind::Volume:
        return zel_svc_number_text(value & 0xFF);
    case Kind::KeptWords:
    case Kind::Language:
    case Kind::AnyText:
        break;
    }
    return std::nullopt;
}
