#pragma once

#include "spreadsheet/picture/sheetregion.h"

#include <algorithm>

namespace penmoor::picture::test {

// A block made up for the layout and paint tests: every column `width` characters and every
// row `height` points wide, and a palette whose every index shows a colour of its own.
inline SheetRegion syntheticRegion(int rows, int columns, double width = 10.0, double height = 15.0)
{
    SheetRegion region;
    region.columnWidths.assign(static_cast<std::size_t>(columns), width);
    region.rowHeights.assign(static_cast<std::size_t>(rows), height);
    for (std::size_t k = 0; k < region.palette.size(); ++k) {
        region.palette[k] = static_cast<std::uint32_t>(k + 1) * 0x010203u;
    }
    return region;
}

// Gives one cell (0-based) a format, sharing the entry of an equal format already used.
inline void setCellFormat(SheetRegion& region, int row, int column, const CellFormat& format)
{
    if (region.formatIds.empty()) {
        region.formatIds.assign(region.rowHeights.size() * region.columnWidths.size(), 0);
    }
    auto found = std::find(region.formats.begin(), region.formats.end(), format);
    if (found == region.formats.end()) {
        region.formats.push_back(format);
        found = region.formats.end() - 1;
    }
    region.formatIds[static_cast<std::size_t>(row) * region.columnWidths.size() + static_cast<std::size_t>(column)]
        = static_cast<std::uint32_t>(found - region.formats.begin());
}

inline void setCellValue(SheetRegion& region, int row, int column, const xl::Value& value)
{
    CellValue cell;
    cell.row = row;
    cell.column = column;
    cell.value = value;
    region.values.push_back(cell);
}

} // namespace penmoor::picture::test
