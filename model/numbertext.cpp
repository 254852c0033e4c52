#include "model/numbertext.h"

#include <array>
#include <charconv>
#include <cmath>
#include <limits>
#include <system_error>

namespace penmoor {

namespace {

bool isDigit(char c)
{
    return c >= '0' && c <= '9';
}

} // namespace

bool isBlank(char c)
{
    return c == ' ' || c == '\t' || c == '\r' || c == '\n';
}

LeadingNumber scanLeadingNumber(std::string_view text)
{
    // Collect sign, digits and point without the blanks, then convert once.
    std::string number;
    bool negative = false;
    bool signSeen = false;
    bool pointSeen = false;
    bool digitSeen = false;
    bool nonZeroIntegerDigit = false;
    std::size_t length = 0;

    for (std::size_t i = 0; i < text.size(); ++i) {
        const char c = text[i];
        if (isBlank(c)) {
            continue;
        }
        if ((c == '-' || c == '+') && !signSeen && !digitSeen && !pointSeen) {
            signSeen = true;
            negative = c == '-';
        } else if (c == '.' && !pointSeen) {
            pointSeen = true;
            number += c;
        } else if (isDigit(c)) {
            digitSeen = true;
            nonZeroIntegerDigit = nonZeroIntegerDigit || (!pointSeen && c != '0');
            number += c;
        } else {
            break;
        }
        // Blanks after the last accepted character are not part of the number.
        length = i + 1;
    }

    if (!digitSeen) {
        return {};
    }
    double value = 0.0;
    const std::from_chars_result parsed = std::from_chars(number.data(), number.data() + number.size(), value);
    if (parsed.ec == std::errc::result_out_of_range) {
        // Too large saturates at the largest double; too small is zero.
        value = nonZeroIntegerDigit ? std::numeric_limits<double>::max() : 0.0;
    }
    return { negative ? -value : value, length };
}

double numericValue(std::string_view text)
{
    return scanLeadingNumber(text).value;
}

std::int32_t roundHalfToEven(double value)
{
    constexpr double lowest = std::numeric_limits<std::int32_t>::min();
    constexpr double highest = std::numeric_limits<std::int32_t>::max();
    if (std::isnan(value)) {
        return 0;
    }
    if (value <= lowest) {
        return std::numeric_limits<std::int32_t>::min();
    }
    if (value >= highest) {
        return std::numeric_limits<std::int32_t>::max();
    }
    double rounded = std::floor(value);
    const double fraction = value - rounded;
    if (fraction > 0.5 || (fraction == 0.5 && std::fmod(rounded, 2.0) != 0.0)) {
        rounded += 1.0;
    }
    return static_cast<std::int32_t>(rounded);
}

std::string numberText(double value)
{
    if (value == 0.0) {
        return "0";
    }
    std::array<char, 64> buffer {};
    std::to_chars_result result;
    if (std::trunc(value) == value && std::fabs(value) < 1e15) {
        result = std::to_chars(buffer.data(), buffer.data() + buffer.size(), static_cast<long long>(value));
    } else {
        result = std::to_chars(buffer.data(), buffer.data() + buffer.size(), value, std::chars_format::general, 15);
    }
    return std::string(buffer.data(), result.ptr);
}

} // namespace penmoor
