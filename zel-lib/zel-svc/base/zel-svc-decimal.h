#pragma once
// Decimal fractions in texts, to the thousandth, without a rounding error: 32.3 is 32300 thousandths, which
// no binary fraction times 1000 promises.

#include <cstdint>
#include <string>
#include <string_view>

// Leading blanks, an optional sign, digits with at most one point among them, an optional exponent ("2.5",
// "-.5", "1e-2"), times 1000 and cut to an integer. 0 when there is no digit; what lies outside a signed 32-bit
// integer saturates at its limits. What follows the number is ignored.
std::int32_t zel_svc_thousandths_from_text(std::string_view text);

// The same number cut to an integer: "1.0e+3" is 1000, "0.9" is 0.
std::int32_t zel_svc_whole_from_text(std::string_view text);

// Thousandths as a text of at most six digits: 2500 is "2.5", 30000 is "30", 1234567 is "1234.57".
std::string zel_svc_thousandths_text(std::int32_t thousandths);
