#pragma once

#include "spreadsheet/formula/token.h"

#include <string>

namespace penmoor::engine {

// The formula in R1C1 form, starting with "=", as the application shows it: references in
// their shortest form (R[-7]C for R[-7]C[0], RC for R[0]C[0]), function names in capitals,
// numbers in General form, and parentheses where the tokens have them or where the order of
// operations needs them. Raises xl::Error when the tokens do not form a formula.
std::string formatFormulaR1C1(const TokenArray& tokens);

} // namespace penmoor::engine
