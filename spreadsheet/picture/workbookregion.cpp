#include "spreadsheet/picture/workbookregion.h"

#include "spreadsheet/picture/geometry.h"

#include <algorithm>
#include <unordered_map>

namespace penmoor::picture {

namespace {

BorderWeight weightOf(engine::LineStyle line)
{
    switch (line) {
    case engine::LineStyle::None:
        return BorderWeight::None;
    case engine::LineStyle::Hair:
        return BorderWeight::Hairline;
    case engine::LineStyle::Thin:
        return BorderWeight::Thin;
    case engine::LineStyle::Medium:
        return BorderWeight::Medium;
    case engine::LineStyle::Thick:
        return BorderWeight::Thick;
    }
    return BorderWeight::Thin;
}

Edge edgeOf(const engine::CellStyle& style, engine::EdgeSide side)
{
    const engine::Edge& edge = style.edge(side);
    return { weightOf(edge.line), edge.colorIndex };
}

HorizontalAlignment horizontalOf(engine::HorizontalAlignment alignment)
{
    switch (alignment) {
    case engine::HorizontalAlignment::Left:
        return HorizontalAlignment::Left;
    case engine::HorizontalAlignment::Center:
        return HorizontalAlignment::Center;
    case engine::HorizontalAlignment::Right:
        return HorizontalAlignment::Right;
    case engine::HorizontalAlignment::General:
        break;
    }
    return HorizontalAlignment::General;
}

VerticalAlignment verticalOf(engine::VerticalAlignment alignment)
{
    switch (alignment) {
    case engine::VerticalAlignment::Top:
        return VerticalAlignment::Top;
    case engine::VerticalAlignment::Center:
        return VerticalAlignment::Center;
    case engine::VerticalAlignment::Bottom:
        break;
    }
    return VerticalAlignment::Bottom;
}

CellFormat formatOf(const engine::CellStyle& style)
{
    CellFormat format;
    format.font.name = style.font.name;
    format.font.sizePoints = style.font.sizePoints;
    format.font.bold = style.font.bold;
    format.font.italic = style.font.italic;
    format.fontColorIndex = style.font.colorIndex;
    format.numberFormat = style.numberFormat;
    format.fillColorIndex = style.fillColorIndex;
    format.left = edgeOf(style, engine::EdgeSide::Left);
    format.right = edgeOf(style, engine::EdgeSide::Right);
    format.top = edgeOf(style, engine::EdgeSide::Top);
    format.bottom = edgeOf(style, engine::EdgeSide::Bottom);
    format.horizontal = horizontalOf(style.horizontal);
    format.vertical = verticalOf(style.vertical);
    format.wrap = style.wrapText;
    return format;
}

xl::Value valueOf(const engine::CellContent& content)
{
    return std::visit(
        [](const auto& held) -> xl::Value {
            using Held = std::decay_t<decltype(held)>;
            if constexpr (std::is_same_v<Held, engine::Formula>) {
                return held.cachedValue;
            } else {
                return held;
            }
        },
        content);
}

} // namespace

SheetRegion sheetRegion(const engine::Workbook& workbook, const engine::Sheet& sheet, const engine::Region& block)
{
    SheetRegion region;
    std::copy(workbook.palette().begin(), workbook.palette().end(), region.palette.begin());

    // Sizes first: they decide how much of the block fits into the picture.
    std::vector<int> columnPixels;
    std::vector<int> rowPixels;
    for (int column = block.firstColumn; column <= block.lastColumn; ++column) {
        region.columnWidths.push_back(sheet.effectiveColumnWidth(column));
        columnPixels.push_back(columnWidthToPixels(region.columnWidths.back()));
    }
    for (int row = block.firstRow; row <= block.lastRow; ++row) {
        region.rowHeights.push_back(sheet.effectiveRowHeight(row));
        rowPixels.push_back(rowHeightToPixels(region.rowHeights.back()));
    }
    const GridGeometry grid(columnPixels, rowPixels);
    region.columnWidths.resize(static_cast<std::size_t>(grid.visibleColumnCount()));
    region.rowHeights.resize(static_cast<std::size_t>(grid.visibleRowCount()));
    if (region.columnWidths.empty() || region.rowHeights.empty()) {
        return region;
    }
    const engine::Region visible { block.firstRow, block.firstColumn, block.firstRow + region.rowCount() - 1,
        block.firstColumn + region.columnCount() - 1 };

    std::unordered_map<engine::StyleId, std::uint32_t> formatIndex;
    region.formats.clear();
    region.formatIds.reserve(
        static_cast<std::size_t>(region.rowCount()) * static_cast<std::size_t>(region.columnCount()));
    for (int row = visible.firstRow; row <= visible.lastRow; ++row) {
        for (int column = visible.firstColumn; column <= visible.lastColumn; ++column) {
            const engine::StyleId style = sheet.effectiveStyle({ row, column });
            auto found = formatIndex.find(style);
            if (found == formatIndex.end()) {
                found = formatIndex.emplace(style, static_cast<std::uint32_t>(region.formats.size())).first;
                region.formats.push_back(formatOf(workbook.styles().style(style)));
            }
            region.formatIds.push_back(found->second);
        }
    }

    sheet.forEachContent(visible, [&](engine::CellPosition position, const engine::CellContent& content) {
        CellValue cell;
        cell.row = position.row - visible.firstRow;
        cell.column = position.column - visible.firstColumn;
        cell.value = valueOf(content);
        region.values.push_back(std::move(cell));
    });

    for (const engine::Region& area : sheet.mergedAreas()) {
        if (area.lastRow < visible.firstRow || area.firstRow > visible.lastRow || area.lastColumn < visible.firstColumn
            || area.firstColumn > visible.lastColumn) {
            continue;
        }
        region.merges.push_back({ area.firstRow - visible.firstRow, area.firstColumn - visible.firstColumn,
            area.lastRow - visible.firstRow, area.lastColumn - visible.firstColumn });
    }
    return region;
}

} // namespace penmoor::picture
