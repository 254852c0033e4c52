#pragma once

#include "spreadsheet/workbook/sheet.h"

#include <functional>
#include <vector>

namespace penmoor::engine {

// Runs a formatting command over a region of a sheet: `change` edits a copy of each format met
// there, once per distinct format, and the results are interned in the workbook's table.
void applyFormat(StyleTable& styles, Sheet& sheet, const Region& region, const std::function<void(CellStyle&)>& change);

// The borders of a region that a formatting command can address.
enum class BorderIndex {
    EdgeLeft,
    EdgeTop,
    EdgeBottom,
    EdgeRight,
    InsideVertical,
    InsideHorizontal,
};

// One side of every cell of a block.
struct EdgeTarget {
    Region cells;
    EdgeSide side = EdgeSide::Left;

    bool operator==(const EdgeTarget&) const = default;
};

// The cell edges a border of the region stands for: the outline edges are the outer sides of
// the region's first or last row or column; the inside lines are both sides of every line
// between its cells. With `touchingNeighbours` the list also holds the neighbouring cells'
// sides that touch the region's outline (clearing a border clears those as well, so that no
// line stays visible there).
std::vector<EdgeTarget> borderTargets(const Region& region, BorderIndex border, bool touchingNeighbours);

// The line shown along a border of the region, read at its top-left cell: the cell's own edge,
// or the touching edge of its neighbour when the cell has none. An inside border of a region a
// single cell wide or high has no line.
Edge visibleBorder(const StyleTable& styles, const Sheet& sheet, const Region& region, BorderIndex border);

} // namespace penmoor::engine
