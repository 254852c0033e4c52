// Formatting commands on regions of a sheet: how whole-sheet, whole-row, whole-column and cell
// formats change together, so that every cell ends with the format the command gives it while
// each layer is touched once and cells get a format of their own only where they need one.
#include "spreadsheet/workbook/sheet.h"

namespace penmoor::engine {

namespace {

// Calls visit(first, last, base) for the parts of columns first..last over which the column
// bases (a run list covering every column) are constant.
template <class Visit> void forEachBase(const StyleRuns& bases, int first, int last, Visit&& visit)
{
    auto it = std::lower_bound(
        bases.begin(), bases.end(), first, [](const StyleRun& run, int column) { return run.lastColumn < column; });
    for (; it != bases.end() && it->firstColumn <= last; ++it)
        visit(std::max<int>(it->firstColumn, first), std::min<int>(it->lastColumn, last), it->style);
}

} // namespace

StyleRuns Sheet::columnBases() const
{
    StyleRuns bases;
    for (int column = 1; column <= kMaxColumns; ++column)
        appendRun(bases, column, column, columnData(column).style.value_or(m_sheetStyle));
    return bases;
}

void Sheet::restyle(const Region& region, const StyleMap& map)
{
    if (region.isWholeSheet())
        restyleSheet(map);
    else if (region.spansAllRows())
        restyleColumns(region, map);
    else
        restyleRows(region, map, region.spansAllColumns());
}

void Sheet::restyleSheet(const StyleMap& map)
{
    m_sheetStyle = map(m_sheetStyle);
    for (ColumnData& column : m_columns) {
        if (column.style)
            column.style = map(*column.style);
    }
    for (RowData& row : m_rows) {
        if (row.style)
            row.style = map(*row.style);
        if (!row.styleRuns.empty())
            rewriteRuns(
                row.styleRuns, 1, kMaxColumns, map, [](int, int, StyleRuns&) {}, m_scratch);
    }
}

void Sheet::restyleColumns(const Region& region, const StyleMap& map)
{
    for (int column = region.firstColumn; column <= region.lastColumn; ++column) {
        ColumnData& data = m_columns[static_cast<std::size_t>(column - 1)];
        if (data.style) {
            data.style = map(*data.style);
        } else if (const StyleId mapped = map(m_sheetStyle); mapped != m_sheetStyle) {
            data.style = mapped;
        }
    }
    // Cells under a row format do not see the column's; they need formats of their own.
    for (RowData& row : m_rows) {
        if (!row.style && row.styleRuns.empty())
            continue;
        const std::optional<StyleId> rowStyle = row.style;
        rewriteRuns(
            row.styleRuns, region.firstColumn, region.lastColumn, map,
            [&](int first, int last, StyleRuns& out) {
                if (!rowStyle)
                    return;
                if (const StyleId mapped = map(*rowStyle); mapped != *rowStyle)
                    appendRun(out, first, last, mapped);
            },
            m_scratch);
    }
}

void Sheet::restyleRows(const Region& region, const StyleMap& map, bool wholeRows)
{
    const StyleRuns bases = columnBases();

    // Applies the command to one row's cells and, for whole rows, to the row's own format;
    // gives the row's format afterwards.
    const auto restyleRow = [&](const std::optional<StyleId> rowBefore, StyleRuns& runs) {
        std::optional<StyleId> rowAfter = rowBefore;
        if (wholeRows) {
            if (rowBefore)
                rowAfter = map(*rowBefore);
            else if (const StyleId mapped = map(m_sheetStyle); mapped != m_sheetStyle)
                rowAfter = mapped;
        }
        rewriteRuns(
            runs, region.firstColumn, region.lastColumn, map,
            [&](int first, int last, StyleRuns& out) {
                if (rowBefore) {
                    const StyleId mapped = map(*rowBefore);
                    if (mapped != rowAfter.value_or(*rowBefore))
                        appendRun(out, first, last, mapped);
                    return;
                }
                forEachBase(bases, first, last, [&](int baseFirst, int baseLast, StyleId base) {
                    const StyleId mapped = map(base);
                    if (mapped != rowAfter.value_or(base))
                        appendRun(out, baseFirst, baseLast, mapped);
                });
            },
            m_scratch);
        return rowAfter;
    };

    // Every row without formats of its own comes out the same: work that result out once.
    StyleRuns blankRowRuns;
    const std::optional<StyleId> blankRowStyle = restyleRow(std::nullopt, blankRowRuns);
    const bool blankRowsChange = blankRowStyle || !blankRowRuns.empty();
    if (blankRowsChange && region.lastRow > lastStoredRow())
        m_rows.resize(static_cast<std::size_t>(region.lastRow));

    const int lastRow = std::min(region.lastRow, lastStoredRow());
    for (int row = region.firstRow; row <= lastRow; ++row) {
        RowData& data = m_rows[static_cast<std::size_t>(row - 1)];
        if (data.style || !data.styleRuns.empty()) {
            data.style = restyleRow(data.style, data.styleRuns);
        } else if (blankRowsChange) {
            data.style = blankRowStyle;
            data.styleRuns = blankRowRuns;
        }
    }
}

void Sheet::clearFormats(const Region& region)
{
    if (region.isWholeSheet()) {
        m_sheetStyle = kDefaultStyleId;
        for (ColumnData& column : m_columns)
            column.style.reset();
        for (RowData& row : m_rows) {
            row.style.reset();
            row.styleRuns.clear();
        }
        return;
    }
    // Forget the formats the region covers, then give the default format to whatever would
    // still inherit another one.
    if (region.spansAllRows()) {
        for (int column = region.firstColumn; column <= region.lastColumn; ++column)
            m_columns[static_cast<std::size_t>(column - 1)].style.reset();
    }
    const int lastRow = std::min(region.lastRow, lastStoredRow());
    for (int row = region.firstRow; row <= lastRow; ++row) {
        RowData& data = m_rows[static_cast<std::size_t>(row - 1)];
        if (region.spansAllColumns())
            data.style.reset();
        eraseRuns(data.styleRuns, region.firstColumn, region.lastColumn);
    }
    restyle(region, [](StyleId) { return kDefaultStyleId; });
}

} // namespace penmoor::engine
