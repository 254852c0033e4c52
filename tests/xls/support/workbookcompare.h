#pragma once

#include "spreadsheet/workbook/workbook.h"

#include <string>

namespace penmoor::xls::test {

// What differs between two workbooks as a user sees them: sheet names and order, the active
// sheet, palette, default sizes, every cell's effective format (as a format record, not an id)
// and content (formulas compared by their file tokens and cached results), row heights and
// column widths (set or not), merged areas, page setup and selection. Empty when they agree.
// Whole-sheet formats and column formats are compared through the cells they show on, since a
// file cannot tell a format on every column from one on the sheet.
std::string workbookDifferences(const engine::Workbook& expected, const engine::Workbook& actual);

} // namespace penmoor::xls::test
