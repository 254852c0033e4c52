#pragma once

#include "spreadsheet/formula/token.h"

#include <string_view>

namespace penmoor::engine {

// Formulas are at most this long, as the application accepts them.
inline constexpr std::size_t kMaxFormulaLength = 8192;
// Text constants in a formula hold at most this many characters (an .xls limit).
inline constexpr std::size_t kMaxFormulaStringLength = 255;

// Parses a formula in R1C1 form, starting with "=": references R[n]C[m], RC[m], R[n]C, RC,
// RnCm and blocks of them; numbers, "text", TRUE and FALSE, error literals; the operators
// + - * / ^ & = <> < <= > >=, unary minus and plus, %; parentheses; function calls, whose
// argument counts are checked against the function table. Letter case does not matter.
// Raises xl::Error naming the formula and what is wrong with it when it is malformed.
TokenArray parseFormulaR1C1(std::string_view formula);

} // namespace penmoor::engine
