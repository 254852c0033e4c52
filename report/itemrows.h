#pragma once

#include "model/options.h"
#include "report/sheetwriter.h"

namespace penmoor {

// Gives every item its sheet row: the items follow each other from row 5 on, with one spacer
// row above each section heading. Returns the number of rows they take, spacers included, so
// the last item row is that number + 4.
int numberItemRows(Options& options);

// Every item's row as numbered: its height and label, the spacer row above a section heading,
// the shading of headings and totals, and the formulas of total rows in every column from C
// (from D for the opening cash carried over from the previous period) to the total column.
void writeItemRows(SheetWriter& sheet, const Options& options, int lastColumn);

} // namespace penmoor
