#pragma once

#include "automation/contract/application.h"

#include <string>

namespace penmoor::test {

// The active sheet as the contract reads it back, as text to compare with a checked-in file:
// contents (address, kind, entry text, value), formats (runs of cells with the same style key,
// rows with the same runs folded together), row heights, column widths, page setup and
// selection. Only what differs from a new sheet's defaults is named.
std::string dumpActiveSheet(xl::Application& application);

// The style key of one cell, such as "Bold 9pt fill55 h:center v:center wrap L16 T16 B16 R16".
std::string styleKey(xl::Range& cell);

// A number as the dump writes it: integral values without a point, others with up to 15 digits.
std::string numberKey(double value);

} // namespace penmoor::test
