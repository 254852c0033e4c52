#pragma once

#include "report/periodcolumns.h"
#include "report/sheetwriter.h"

#include <string>

namespace penmoor {

// Rows 2 and 4 of the sheet; lastColumn is the total column.

// The title "Cash flow" in B2, the headings of the pre-startup and total columns in row 4, and
// the company name in H2, exactly as typed.
void writeTitleBlock(SheetWriter& sheet, int lastColumn, const std::string& company);

// The period start in row 2 (label and value in the two columns left of and at the total
// column) and one heading per period in row 4, from D on: years counting up from the start
// year, the first days of the months from the start date, or Week 1, Week 2, ...
void writePeriodHeader(SheetWriter& sheet, const PeriodSettings& periods, int lastColumn);

} // namespace penmoor
