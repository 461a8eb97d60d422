#include "base/zel-svc-decimal.h"

#include <algorithm>
#include <charconv>
#include <limits>

namespace {

constexpr std::int64_t kFarOutside = std::int64_t{1} << 40;
constexpr int kThousandths = 3; // digits behind the point that count

constexpr bool is_blank(char c) { return c == ' ' || (c >= '\t' && c <= '\r'); }
constexpr bool is_digit(char c) { return c >= '0' && c <= '9'; }

// Reads a text from the front.
class Cursor {
  public:
    explicit Cursor(std::string_view text) : rest_(text) {}

    void skip_blanks() {
        while (!rest_.empty() && is_blank(rest_.front()))
            rest_.remove_prefix(1);
    }
    bool take(char c) {
        if (rest_.empty() || rest_.front() != c) return false;
        rest_.remove_prefix(1);
        return true;
    }
    bool take_sign() {
        const bool negative = take('-');
        if (!negative) take('+');
        return negative;
    }
    std::string_view take_digits() {
        const auto end = std::find_if_not(rest_.begin(), rest_.end(), is_digit);
        const std::string_view digits = rest_.substr(0, static_cast<std::size_t>(end - rest_.begin()));
        rest_.remove_prefix(digits.size());
        return digits;
    }

  private:
    std::string_view rest_;
};

std::int64_t appended(std::int64_t value, std::string_view digits) {
    for (const char digit : digits)
        value = std::min(value * 10 + (digit - '0'), kFarOutside);
    return value;
}

std::int64_t exponent(Cursor &text) {
    if (!text.take('e') && !text.take('E')) return 0;
    const bool negative = text.take_sign();
    const std::int64_t value = appended(0, text.take_digits());
    return negative ? -value : value;
}

// The number of the first `count` digits of a digit string; zeros follow its end for ever.
std::int64_t leading(const std::string &digits, std::int64_t count) {
    if (count <= 0) return 0;
    const auto size = static_cast<std::int64_t>(digits.size());
    std::int64_t value = appended(0, std::string_view{digits}.substr(0, static_cast<std::size_t>(count)));
    for (std::int64_t more = count - size; more > 0 && value != 0 && value < kFarOutside; --more)
        value *= 10;
    return value;
}

// The number with its point moved `places` to the right, cut to an integer.
std::int32_t shifted(std::string_view text, std::int64_t places) {
    using Limits = std::numeric_limits<std::int32_t>;
    Cursor cursor{text};
    cursor.skip_blanks();
    const bool negative = cursor.take_sign();
    std::string digits{cursor.take_digits()};
    const auto before_point = static_cast<std::int64_t>(digits.size());
    if (cursor.take('.')) digits += cursor.take_digits();
    if (digits.empty()) return 0;
    const std::int64_t value = leading(digits, before_point + exponent(cursor) + places);
    return static_cast<std::int32_t>(std::clamp<std::int64_t>(negative ? -value : value, Limits::min(), Limits::max()));
}

} // namespace

std::int32_t zel_svc_thousandths_from_text(std::string_view text) { return shifted(text, kThousandths); }
std::int32_t zel_svc_whole_from_text(std::string_view text) { return shifted(text, 0); }

std::string zel_svc_thousandths_text(std::int32_t thousandths) {
    constexpr int kDigits = 6;
    constexpr float kThousand = 1000;
    char text[32];
    const float number = static_cast<float>(thousandths) / kThousand;
    const auto end = std::to_chars(text, text + sizeof text, number, std::chars_format::general, kDigits);
    return {text, end.ptr};
}
