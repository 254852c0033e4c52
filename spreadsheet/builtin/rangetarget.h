#pragma once

#include "spreadsheet/builtin/session.h"
#include "spreadsheet/workbook/formatting.h"

#include <functional>

namespace penmoor::engine {

// The cells a range object, its font, fill or borders act on: a block of a sheet.
class RangeTarget {
public:
    RangeTarget(SheetHandle sheet, const Region& region);

    const SheetHandle& sheet() const { return m_sheet; }
    const Region& region() const { return m_region; }

    // Runs a formatting command over the block.
    void format(const std::function<void(CellStyle&)>& change) const;
    // Changes the cell edges that one border of the block stands for.
    void formatBorder(BorderIndex border, bool touchingNeighbours, const std::function<void(Edge&)>& change) const;
    // Properties read from the top-left cell.
    const CellStyle& topLeftStyle() const;
    Edge visibleBorder(BorderIndex border) const;

private:
    SheetHandle m_sheet;
    Region m_region;
};

} // namespace penmoor::engine
