#pragma once

#include "spreadsheet/workbook/workbook.h"

#include <cstdint>
#include <vector>

namespace penmoor::xls {

// The workbook as BIFF8 records: the globals (palette, fonts, formats, sheets, print areas,
// shared strings), then one substream per sheet. Formula results must be current. Equal
// workbooks give equal bytes. Raises WriteError for what the format cannot hold.
std::vector<std::uint8_t> writeWorkbookStream(const engine::Workbook& workbook);

// The bytes of the .xls file: that stream as "Workbook" in a compound file.
std::vector<std::uint8_t> writeXls(const engine::Workbook& workbook);

} // namespace penmoor::xls
