#include "spreadsheet/picture/decimaldigits.h"

#include <array>
#include <charconv>
#include <cmath>
#include <cstdlib>

namespace penmoor::picture {

namespace {

constexpr int kSignificantDigits = 15;

// The absolute value as 15 significant digits d1 d2 ... d15 with value = d1.d2...d15 x 10^exponent.
struct Significant {
    std::string digits; // empty for zero
    int exponent = 0;
};

Significant significant(double value)
{
    Significant result;
    value = std::fabs(value);
    if (value == 0.0 || !std::isfinite(value)) {
        return result;
    }
    std::array<char, 40> buffer {};
    auto [end, ec] = std::to_chars(
        buffer.data(), buffer.data() + buffer.size(), value, std::chars_format::scientific, kSignificantDigits - 1);
    if (ec != std::errc()) {
        return result;
    }
    const std::string text(buffer.data(), end);
    const auto ePos = text.find('e');
    for (std::size_t i = 0; i < ePos; ++i) {
        if (text[i] != '.') {
            result.digits.push_back(text[i]);
        }
    }
    result.exponent = std::atoi(text.c_str() + ePos + 1);
    return result;
}

// Rounds the digit string to its first `keep` digits, halves away from zero; a carry out of the
// first digit adds a digit in front and raises the exponent.
void roundTo(Significant& number, int keep)
{
    if (keep < 0) {
        number.digits.clear();
        return;
    }
    if (keep >= static_cast<int>(number.digits.size())) {
        return;
    }
    const bool up = number.digits[static_cast<std::size_t>(keep)] >= '5';
    number.digits.resize(static_cast<std::size_t>(keep));
    if (!up) {
        return;
    }
    int i = keep - 1;
    while (i >= 0 && number.digits[static_cast<std::size_t>(i)] == '9') {
        number.digits[static_cast<std::size_t>(i)] = '0';
        --i;
    }
    if (i >= 0) {
        ++number.digits[static_cast<std::size_t>(i)];
    } else {
        number.digits.insert(number.digits.begin(), '1');
        ++number.exponent;
    }
}

} // namespace

bool FixedDigits::isZero() const
{
    return integer.empty() && fraction.find_first_not_of('0') == std::string::npos;
}

FixedDigits fixedDigits(double value, int decimals)
{
    FixedDigits result;
    Significant number = significant(value);
    if (!number.digits.empty()) {
        roundTo(number, number.exponent + 1 + decimals);
    }
    // Place the digits around the decimal point: digit k stands for 10^(exponent - k).
    const int count = static_cast<int>(number.digits.size());
    if (!number.digits.empty()) {
        for (int power = number.exponent; power >= 0; --power) {
            const int k = number.exponent - power;
            result.integer.push_back(k < count ? number.digits[static_cast<std::size_t>(k)] : '0');
        }
    }
    for (int place = 1; place <= decimals; ++place) {
        const int k = number.exponent + place;
        result.fraction.push_back(
            !number.digits.empty() && k >= 0 && k < count ? number.digits[static_cast<std::size_t>(k)] : '0');
    }
    return result;
}

ScientificDigits scientificDigits(double value, int decimals)
{
    ScientificDigits result;
    Significant number = significant(value);
    if (number.digits.empty()) {
        result.digits.assign(static_cast<std::size_t>(decimals + 1), '0');
        return result;
    }
    roundTo(number, decimals + 1);
    number.digits.resize(static_cast<std::size_t>(decimals + 1), '0');
    result.digits = number.digits;
    result.exponent = number.exponent;
    return result;
}

int decimalExponent(double value)
{
    return significant(value).exponent;
}

std::string integerText(long long value, int minimumDigits)
{
    std::array<char, 24> buffer {};
    auto [end, ec] = std::to_chars(buffer.data(), buffer.data() + buffer.size(), value < 0 ? -value : value);
    std::string digits(buffer.data(), ec == std::errc() ? end : buffer.data());
    if (static_cast<int>(digits.size()) < minimumDigits) {
        digits.insert(0, static_cast<std::size_t>(minimumDigits) - digits.size(), '0');
    }
    return value < 0 ? "-" + digits : digits;
}

} // namespace penmoor::picture
