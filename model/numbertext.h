#pragma once

#include <cstddef>
#include <cstdint>
#include <string>
#include <string_view>

namespace penmoor {

// The blanks that number reading skips: space, tab, carriage return, line feed.
bool isBlank(char c);

// The number at the start of a text, read the way the program reads every number a user types
// or the store holds: blanks are skipped anywhere, then an optional sign, digits and at most one
// decimal point; reading stops at the first other character. No exponent, no hexadecimal.
struct LeadingNumber {
    double value = 0.0;
    // How many characters the number took, from the start of the text to its last sign, digit
    // or point; 0 when the text does not begin with a number (a lone sign or point is none).
    std::size_t length = 0;
};

LeadingNumber scanLeadingNumber(std::string_view text);

// The numeric value of a text: its leading number, 0 when it does not begin with one.
// "2013abc" gives 2013, "" and "abc" give 0, " - 1 2.5x" gives -12.5.
double numericValue(std::string_view text);

// Rounds to the nearest 32-bit integer, halves to the even neighbour (5.5 gives 6, 6.5 gives 6).
// Values beyond the 32-bit range saturate at its ends; NaN gives 0.
std::int32_t roundHalfToEven(double value);

// The text of a number as the program shows it: integral values without a decimal point
// ("2013", never "2013.0" or "-0"), others with up to 15 significant digits ("2013.5").
// Always a '.' as decimal point, whatever the locale.
std::string numberText(double value);

} // namespace penmoor
