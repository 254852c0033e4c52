#include "spreadsheet/workbook/formatting.h"

#include <optional>
#include <unordered_map>

namespace penmoor::engine {

void applyFormat(StyleTable& styles, Sheet& sheet, const Region& region, const std::function<void(CellStyle&)>& change)
{
    std::unordered_map<StyleId, StyleId> memo;
    sheet.restyle(region, [&](StyleId id) {
        const auto [it, inserted] = memo.try_emplace(id, id);
        if (inserted) {
            CellStyle style = styles.style(id);
            change(style);
            it->second = styles.intern(style);
        }
        return it->second;
    });
}

namespace {

// The block of columns first..last of the region, or nothing when it is empty.
std::optional<Region> columnsOf(const Region& region, int first, int last)
{
    if (first > last || first < 1 || last > kMaxColumns)
        return std::nullopt;
    return Region { region.firstRow, first, region.lastRow, last };
}

std::optional<Region> rowsOf(const Region& region, int first, int last)
{
    if (first > last || first < 1 || last > kMaxRows)
        return std::nullopt;
    return Region { first, region.firstColumn, last, region.lastColumn };
}

} // namespace

std::vector<EdgeTarget> borderTargets(const Region& region, BorderIndex border, bool touchingNeighbours)
{
    std::vector<EdgeTarget> targets;
    const auto add = [&](std::optional<Region> cells, EdgeSide side) {
        if (cells)
            targets.push_back({ *cells, side });
    };
    const int r1 = region.firstRow, r2 = region.lastRow, c1 = region.firstColumn, c2 = region.lastColumn;
    switch (border) {
    case BorderIndex::EdgeLeft:
        add(columnsOf(region, c1, c1), EdgeSide::Left);
        if (touchingNeighbours)
            add(columnsOf(region, c1 - 1, c1 - 1), EdgeSide::Right);
        break;
    case BorderIndex::EdgeRight:
        add(columnsOf(region, c2, c2), EdgeSide::Right);
        if (touchingNeighbours)
            add(columnsOf(region, c2 + 1, c2 + 1), EdgeSide::Left);
        break;
    case BorderIndex::EdgeTop:
        add(rowsOf(region, r1, r1), EdgeSide::Top);
        if (touchingNeighbours)
            add(rowsOf(region, r1 - 1, r1 - 1), EdgeSide::Bottom);
        break;
    case BorderIndex::EdgeBottom:
        add(rowsOf(region, r2, r2), EdgeSide::Bottom);
        if (touchingNeighbours)
            add(rowsOf(region, r2 + 1, r2 + 1), EdgeSide::Top);
        break;
    case BorderIndex::InsideVertical:
        add(columnsOf(region, c1, c2 - 1), EdgeSide::Right);
        add(columnsOf(region, c1 + 1, c2), EdgeSide::Left);
        break;
    case BorderIndex::InsideHorizontal:
        add(rowsOf(region, r1, r2 - 1), EdgeSide::Bottom);
        add(rowsOf(region, r1 + 1, r2), EdgeSide::Top);
        break;
    }
    return targets;
}

Edge visibleBorder(const StyleTable& styles, const Sheet& sheet, const Region& region, BorderIndex border)
{
    // The cell whose side is read, that side, and the neighbour sharing the line.
    CellPosition cell = region.topLeft();
    EdgeSide side = EdgeSide::Left;
    CellPosition neighbour = cell;
    EdgeSide neighbourSide = EdgeSide::Right;
    switch (border) {
    case BorderIndex::EdgeLeft:
        neighbour.column -= 1;
        break;
    case BorderIndex::EdgeRight:
        cell.column = region.lastColumn;
        side = EdgeSide::Right;
        neighbour = { cell.row, cell.column + 1 };
        neighbourSide = EdgeSide::Left;
        break;
    case BorderIndex::EdgeTop:
        side = EdgeSide::Top;
        neighbour.row -= 1;
        neighbourSide = EdgeSide::Bottom;
        break;
    case BorderIndex::EdgeBottom:
        cell.row = region.lastRow;
        side = EdgeSide::Bottom;
        neighbour = { cell.row + 1, cell.column };
        neighbourSide = EdgeSide::Top;
        break;
    case BorderIndex::InsideVertical:
        if (region.columnCount() < 2)
            return {};
        side = EdgeSide::Right;
        neighbour.column += 1;
        neighbourSide = EdgeSide::Left;
        break;
    case BorderIndex::InsideHorizontal:
        if (region.rowCount() < 2)
            return {};
        side = EdgeSide::Bottom;
        neighbour.row += 1;
        neighbourSide = EdgeSide::Top;
        break;
    }
    const Edge own = styles.style(sheet.effectiveStyle(cell)).edge(side);
    if (own.line != LineStyle::None)
        return own;
    if (!Region::wholeSheet().contains(neighbour))
        return own;
    return styles.style(sheet.effectiveStyle(neighbour)).edge(neighbourSide);
}

} // namespace penmoor::engine
