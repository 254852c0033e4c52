#pragma once

#include "model/palette.h"
#include "report/sheetwriter.h"

#include <string>

namespace penmoor {

// The parts of the sheet's look that do not depend on the items. lastColumn is the total column.

// The palette table becomes the workbook's palette, colours 1 to 56.
void copyPalette(xl::Application& application, const PaletteTable& palette);

// Empties the whole sheet and sets it in Arial; leaves the whole sheet selected.
void resetSheet(SheetWriter& sheet);

// On the still selected whole sheet: the white fill; then the column widths and the heights of
// the four header rows.
void setSheetSizes(SheetWriter& sheet, int lastColumn);

// The table of rows 4 to the last item row (rowCount rows below the header): its grid, vertical
// centring, the "#,##0" figures and the shaded column headings. Returns the print area, which
// reaches two rows below the last item row.
std::string drawTableFrame(SheetWriter& sheet, int lastColumn, int rowCount);

} // namespace penmoor
