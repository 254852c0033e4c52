#pragma once

#include "spreadsheet/picture/sheetregion.h"
#include "spreadsheet/workbook/address.h"
#include "spreadsheet/workbook/sheet.h"
#include "spreadsheet/workbook/workbook.h"

namespace penmoor::picture {

// A block of a workbook's sheet as the picture draws it: column widths, row heights, the
// palette, every cell's effective format, the values (formula results as last calculated, so
// recalculate first), and the merged areas that reach into the block. Only the part that fits
// into the bounded picture is copied, so even a whole sheet costs no more than its picture.
SheetRegion sheetRegion(const engine::Workbook& workbook, const engine::Sheet& sheet, const engine::Region& block);

} // namespace penmoor::picture
