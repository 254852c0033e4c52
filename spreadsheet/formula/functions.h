#pragma once

#include "spreadsheet/formula/evaluation.h"

#include <cstdint>
#include <span>

namespace penmoor::engine {

// Calls the function with .xls number `index` (see functiontable.h) on its evaluated
// arguments, with the application's rules for each; a function outside the table gives #NAME?.
// IF passes the chosen argument on as it is, so a reference stays a reference.
Operand callFunction(
    std::uint16_t index, std::span<const Operand> arguments, CellPosition origin, const CellValueSource& cells);

} // namespace penmoor::engine
