#pragma once

#include <optional>
#include <string>
#include <string_view>

namespace penmoor {

// Booleans and counts in the form the settings store holds them. Values written by the program
// always have that form; values written from outside fall back to a default instead of failing.

// "True" or "False", as the program writes booleans.
std::string booleanText(bool value);

// A stored boolean: "True" or "False" in any letter case, or a number (0 is false, any other
// number true), blanks around it ignored. Anything else gives fallback.
bool readStoredBoolean(std::string_view text, bool fallback);

// A stored whole number between 1 and maximum, blanks around it ignored ("44", " 44 ", "44.0").
// Empty when the text is not a number, not whole, or out of that range.
std::optional<int> readStoredCount(std::string_view text, int maximum);

} // namespace penmoor
