#pragma once

#include "automation/contract/value.h"
#include "spreadsheet/formula/token.h"

#include <string>
#include <type_traits>
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

// The value a cell shows: its constant, or its formula's current result.
inline xl::Value cellValue(const CellContent& content)
{
    return std::visit(
        [](const auto& held) -> xl::Value {
            if constexpr (std::is_same_v<std::decay_t<decltype(held)>, Formula>)
                return held.cachedValue;
            else
                return held;
        },
        content);
}

} // namespace penmoor::engine
