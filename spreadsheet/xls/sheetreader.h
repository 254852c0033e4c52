#pragma once

#include "spreadsheet/workbook/workbook.h"
#include "spreadsheet/xls/globalsreader.h"

#include <cstdint>
#include <span>

namespace penmoor::xls {

// Reads the worksheet substream that starts at `position` into `sheet`: sizes, formats, cells,
// formulas (shared ones included), merged areas, page setup and selection. Returns whether the
// file marks the sheet as the active one. Raises FormatError on anything that breaks the format;
// every loop is bounded by the stream's size.
bool readSheet(std::span<const std::uint8_t> stream, std::uint32_t position, WorkbookGlobals& globals,
    engine::Workbook& book, engine::Sheet& sheet);

} // namespace penmoor::xls
