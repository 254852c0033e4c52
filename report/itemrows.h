#pragma once

#include "model/options.h"
#include "report/sheetwriter.h"

#include <vector>

namespace penmoor {

// Gives every item its sheet row: the items follow each other from row 5 on, with one spacer
// row above each section heading. Returns the number of rows they take, spacers included, so
// the last item row is that number + 4.
int numberItemRows(Options& options);

// The positions that the linkage list of the item at position names, in list order. Raises
// xl::Error for an element that is not the number of an item of the list.
std::vector<int> linkedPositions(const Options& options, int position);

// Every item's row as numbered: its height and label, the spacer row above a section heading,
// the shading of headings and totals, and the formulas of total rows in every column from C
// (from D for the opening cash carried over from the previous period) to the total column.
void writeItemRows(SheetWriter& sheet, const Options& options, int lastColumn);

} // namespace penmoor
