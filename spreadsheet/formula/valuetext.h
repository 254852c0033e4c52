#pragma once

#include "automation/contract/value.h"

#include <optional>
#include <string>
#include <string_view>

namespace penmoor::engine {

// A number as the application writes it in General form: up to 15 significant digits, no
// trailing zeros, an exponent (1E+20, 1E-07) for very large or small magnitudes. Never depends
// on the locale.
std::string numberText(double value);

// "#DIV/0!", "#N/A", ...
std::string_view errorText(xl::ErrorValue error);
// The error a literal such as "#n/a" names, in either letter case.
std::optional<xl::ErrorValue> parseErrorText(std::string_view text);

// How a typed number was written, which decides the number format the cell gets.
enum class NumberForm {
    Plain, // 2013, -3.5, (7)
    Grouped, // 1,000 or 1,000.5
    Percent, // 10% or 12.5%
    Scientific, // 1E3
    Date, // 1/1/2013, 1-1-13
};

struct ParsedNumber {
    double value = 0.0;
    NumberForm form = NumberForm::Plain;
    bool hasFraction = false; // digits after the decimal point (Grouped, Percent)
};

// Reads text that the application takes for a number, in the en-US manner: optional blanks
// around it, a sign or parentheses for a negative, thousands separators in groups of three,
// a decimal point, an exponent, a trailing percent sign; or a date month/day/year with "/"
// or "-" (two-digit years 00-29 are 2000-2029, 30-99 are 1930-1999). Nothing otherwise.
std::optional<ParsedNumber> parseNumberText(std::string_view text);

} // namespace penmoor::engine
