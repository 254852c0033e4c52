#pragma once

namespace penmoor {

// Where things sit on the cash-flow sheet. Rows 1 to 4 are the header (title block in row 2,
// column headings in row 4); item rows start below it.
inline constexpr int kHeaderRows = 4;
// Column A is a narrow margin, B holds the labels, C the pre-startup estimate; the periods
// follow from D, one column each, and the total column comes last.
inline constexpr int kPreStartupColumn = 3; // C
inline constexpr int kFirstPeriodColumn = 4; // D

} // namespace penmoor
