#pragma once

#include "automation/contract/value.h"
#include "spreadsheet/formula/token.h"

#include <string>
#include <variant>

namespace penmoor::engine {

// A formula with its current result. The result is current once the sheet has been
// recalculated after its last change (recalculate() in spreadsheet/formula/recalculation.h);
// writers and painters recalculate before they read it.
struct Formula {
    TokenArray tokens;
    xl::Value cachedValue;

    bool operator==(const Formula&) const = default;
};

// What a cell holds: nothing, a constant, or a formula.
using CellContent = std::variant<std::monostate, double, std::string, bool, xl::ErrorValue, Formula>;

} // namespace penmoor::engine
