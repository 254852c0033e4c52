#pragma once

#include "spreadsheet/formula/evaluation.h"
#include "spreadsheet/formula/token.h"

namespace penmoor::engine {

// The value of a formula that sits in cell `origin`, reading the cells it refers to from
// `cells`. Formula failures are values: a reference off the sheet gives #REF!, an operand of
// the wrong type #VALUE!, an unknown function or name #NAME?, a division by zero #DIV/0!. A
// formula whose result is an empty cell gives 0.
xl::Value evaluateFormula(const TokenArray& tokens, CellPosition origin, const CellValueSource& cells);

} // namespace penmoor::engine
