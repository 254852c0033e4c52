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
// With ColourMatch::ByColour, colours compare by what they show (through each workbook's own
// palette), for files from writers that arrange the palette their own way.
enum class ColourMatch { ByIndex, ByColour };
std::string workbookDifferences(
    const engine::Workbook& expected, const engine::Workbook& actual, ColourMatch colours = ColourMatch::ByIndex);

} // namespace penmoor::xls::test
