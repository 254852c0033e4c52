#pragma once

#include "model/options.h"

#include <string>

namespace penmoor {

// The sheet row of the item at target minus that of the item at current, as the builder has
// numbered them. Raises xl::Error for a position outside the item list.
int RowOffset(const Options& options, int target, int current);

// "R[<row offset>]C[<column offset>]": the cell of the item at target, columnOffset columns away,
// as seen from a cell in the row of the item at current (where the formula is written).
std::string RelativeRef(const Options& options, int target, int current, int columnOffset);

// The same reference for a row offset already known: R[-3]C[0], R[12]C[-1].
std::string relativeReference(int rowOffset, int columnOffset);

} // namespace penmoor
