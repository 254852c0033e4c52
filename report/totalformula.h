#pragma once

#include <cstddef>
#include <span>
#include <string>

namespace penmoor {

enum class Combination {
    Sum, // adds every referenced cell
    Difference, // the first referenced cell minus each of the others
};

// The longest formula text that the .xls generation of spreadsheet applications accepts.
inline constexpr std::size_t kMaxFormulaLength = 1024;

// The formula of a total row: the cells rowOffsets rows away in the same column, in that order,
// combined. Normally a chain of single references ("=R[-7]C[0]+R[-6]C[0]"); when that chain
// would be longer than kMaxFormulaLength, runs of consecutive rows are written as ranges
// ("=SUM(R[-980]C[0]:R[-3]C[0])+R[-1]C[0]"), which adds exactly the same cells. rowOffsets must
// not be empty.
std::string totalFormula(Combination combination, std::span<const int> rowOffsets);

} // namespace penmoor
