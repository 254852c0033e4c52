#pragma once

#include "spreadsheet/workbook/workbook.h"

#include <cstdint>
#include <span>

namespace penmoor::xls {

// Reads the bytes of an .xls file (BIFF8 in a compound file) into a workbook model: sheets,
// palette, formats, sizes, cells, formulas with their cached results, merged areas, print areas,
// page setup, selection and the active sheet. Raises FormatError with the reason when the bytes
// are not a readable workbook, in time and memory bounded by their size.
engine::Workbook readXls(std::span<const std::uint8_t> file);

// The same from the Workbook stream itself (the BIFF8 records, without the compound file).
engine::Workbook readWorkbookStream(std::span<const std::uint8_t> stream);

} // namespace penmoor::xls
