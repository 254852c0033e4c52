#pragma once

#include <string>

namespace penmoor::picture {

// Decimal digits of a number as the spreadsheet application sees them: it keeps 15 significant
// digits and rounds halves away from zero on those digits, so 2.675 shown with two decimals is
// 2.68 although the nearest double lies just below. Every conversion goes through std::to_chars,
// never through the C locale.

// The absolute value rounded to a fixed number of decimals: integer digits without leading zeros
// ("" when the integer part is zero) and exactly `decimals` fraction digits.
struct FixedDigits {
    std::string integer;
    std::string fraction;
    bool isZero() const;
};
FixedDigits fixedDigits(double value, int decimals);

// The absolute value in scientific form with `decimals` digits after the first: mantissa digits
// (1 + decimals of them, the first one non-zero unless the value is zero) and the exponent.
struct ScientificDigits {
    std::string digits;
    int exponent = 0;
};
ScientificDigits scientificDigits(double value, int decimals);

// The decimal exponent of the first significant digit after rounding to 15 digits (0 for zero).
int decimalExponent(double value);

// Integer as decimal text, for exponents and date parts.
std::string integerText(long long value, int minimumDigits = 1);

} // namespace penmoor::picture
