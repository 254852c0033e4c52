#pragma once

#include "spreadsheet/workbook/sheet.h"
#include "spreadsheet/xls/cellformats.h"
#include "spreadsheet/xls/recordwriter.h"
#include "spreadsheet/xls/sharedstrings.h"

namespace penmoor::xls {

// Writes one worksheet substream, BOF to EOF, at the writer's current offset: page setup,
// column formats and widths, the cell table in blocks of 32 rows with their INDEX and DBCELL
// records, window, selection and merged areas. Text cells refer to `strings`, which must
// already hold every text of the sheet. Formula results must be current.
void writeSheet(RecordWriter& writer, const engine::Sheet& sheet, const CellFormatTable& formats,
    const SharedStrings& strings, bool active);

} // namespace penmoor::xls
