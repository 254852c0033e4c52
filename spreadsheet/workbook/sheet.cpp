#include "spreadsheet/workbook/sheet.h"

#include <algorithm>
#include <climits>

namespace penmoor::engine {

namespace {

auto findCell(std::vector<CellEntry>& cells, int column)
{
    return std::lower_bound(
        cells.begin(), cells.end(), column, [](const CellEntry& entry, int c) { return entry.column < c; });
}

auto findCell(const std::vector<CellEntry>& cells, int column)
{
    return std::lower_bound(
        cells.begin(), cells.end(), column, [](const CellEntry& entry, int c) { return entry.column < c; });
}

} // namespace

Sheet::Sheet(std::string name, std::uint64_t id)
    : m_name(std::move(name))
    , m_id(id)
{
}

const RowData* Sheet::rowData(int row) const
{
    if (row < 1 || row > lastStoredRow())
        return nullptr;
    return &m_rows[static_cast<std::size_t>(row - 1)];
}

RowData& Sheet::materialiseRow(int row)
{
    if (row > lastStoredRow())
        m_rows.resize(static_cast<std::size_t>(row));
    return m_rows[static_cast<std::size_t>(row - 1)];
}

std::optional<StyleId> Sheet::rowStyle(int row) const
{
    const RowData* data = rowData(row);
    return data ? data->style : std::nullopt;
}

void Sheet::setRowStyle(int row, std::optional<StyleId> style)
{
    materialiseRow(row).style = style;
}

void Sheet::setColumnStyle(int column, std::optional<StyleId> style)
{
    m_columns.at(static_cast<std::size_t>(column - 1)).style = style;
}

std::optional<StyleId> Sheet::cellStyle(CellPosition position) const
{
    const RowData* data = rowData(position.row);
    return data ? findRunStyle(data->styleRuns, position.column) : std::nullopt;
}

void Sheet::setCellStyles(int row, int firstColumn, int lastColumn, StyleId style)
{
    assignRuns(materialiseRow(row).styleRuns, firstColumn, lastColumn, style);
}

StyleId Sheet::effectiveStyle(CellPosition position) const
{
    if (const RowData* data = rowData(position.row)) {
        if (const std::optional<StyleId> own = findRunStyle(data->styleRuns, position.column))
            return *own;
        if (data->style)
            return *data->style;
    }
    return columnData(position.column).style.value_or(m_sheetStyle);
}

std::optional<double> Sheet::rowHeight(int row) const
{
    const RowData* data = rowData(row);
    return data ? data->heightPoints : std::nullopt;
}

void Sheet::setRowHeight(int row, std::optional<double> points)
{
    if (!points && row > lastStoredRow())
        return;
    materialiseRow(row).heightPoints = points;
}

void Sheet::setColumnWidth(int column, std::optional<double> characters)
{
    m_columns.at(static_cast<std::size_t>(column - 1)).widthCharacters = characters;
}

const CellContent* Sheet::content(CellPosition position) const
{
    const RowData* data = rowData(position.row);
    if (!data)
        return nullptr;
    const auto it = findCell(data->cells, position.column);
    return it != data->cells.end() && it->column == position.column ? &it->content : nullptr;
}

Formula* Sheet::formula(CellPosition position)
{
    if (position.row < 1 || position.row > lastStoredRow())
        return nullptr;
    std::vector<CellEntry>& cells = m_rows[static_cast<std::size_t>(position.row - 1)].cells;
    const auto it = findCell(cells, position.column);
    if (it == cells.end() || it->column != position.column)
        return nullptr;
    return std::get_if<Formula>(&it->content);
}

void Sheet::setContent(CellPosition position, CellContent content)
{
    contentChanged();
    const bool empty = std::holds_alternative<std::monostate>(content);
    if (empty && position.row > lastStoredRow())
        return;
    std::vector<CellEntry>& cells = materialiseRow(position.row).cells;
    const auto it = findCell(cells, position.column);
    const bool exists = it != cells.end() && it->column == position.column;
    if (empty) {
        if (exists)
            cells.erase(it);
    } else if (exists) {
        it->content = std::move(content);
    } else {
        cells.insert(it, CellEntry { static_cast<std::uint16_t>(position.column), std::move(content) });
    }
}

void Sheet::clearContents(const Region& region)
{
    contentChanged();
    const int lastRow = std::min(region.lastRow, lastStoredRow());
    for (int row = region.firstRow; row <= lastRow; ++row) {
        std::vector<CellEntry>& cells = m_rows[static_cast<std::size_t>(row - 1)].cells;
        cells.erase(findCell(cells, region.firstColumn), findCell(cells, region.lastColumn + 1));
    }
}

void Sheet::forEachContent(
    const Region& region, const std::function<void(CellPosition, const CellContent&)>& visit) const
{
    const int lastRow = std::min(region.lastRow, lastStoredRow());
    for (int row = region.firstRow; row <= lastRow; ++row) {
        const std::vector<CellEntry>& cells = m_rows[static_cast<std::size_t>(row - 1)].cells;
        for (auto it = findCell(cells, region.firstColumn); it != cells.end() && it->column <= region.lastColumn; ++it)
            visit({ row, it->column }, it->content);
    }
}

void Sheet::forEachFormula(const std::function<void(CellPosition, Formula&)>& visit)
{
    for (std::size_t index = 0; index < m_rows.size(); ++index) {
        for (CellEntry& entry : m_rows[index].cells) {
            if (Formula* formula = std::get_if<Formula>(&entry.content))
                visit({ static_cast<int>(index) + 1, entry.column }, *formula);
        }
    }
}

void Sheet::cellSpans(int row, std::vector<CellSpan>& out) const
{
    out.clear();
    const RowData* data = rowData(row);
    if (!data)
        return;
    const StyleRuns& runs = data->styleRuns;
    auto run = runs.begin();
    // Emits the format-only stretches of runs within columns first..last.
    const auto emitRuns = [&](int first, int last) {
        for (; run != runs.end() && run->firstColumn <= last; ++run) {
            const int spanFirst = std::max<int>(run->firstColumn, first);
            const int spanLast = std::min<int>(run->lastColumn, last);
            if (spanFirst <= spanLast)
                out.push_back({ spanFirst, spanLast, run->style, nullptr });
            if (run->lastColumn > last)
                break;
        }
    };
    int column = 1;
    for (const CellEntry& entry : data->cells) {
        emitRuns(column, entry.column - 1);
        out.push_back({ entry.column, entry.column, effectiveStyle({ row, entry.column }), &entry.content });
        column = entry.column + 1;
    }
    emitRuns(column, kMaxColumns);
}

void Sheet::merge(const Region& region)
{
    if (region.isSingleCell())
        return;
    unmerge(region);
    m_mergedAreas.push_back(region);
}

void Sheet::unmerge(const Region& region)
{
    std::erase_if(m_mergedAreas, [&](const Region& area) { return area.intersects(region); });
}

void Sheet::select(const Region& selection, CellPosition activeCell)
{
    m_selection = selection;
    m_activeCell = selection.contains(activeCell) ? activeCell : selection.topLeft();
}

Region Sheet::usedRange() const
{
    int firstRow = INT_MAX, lastRow = 0, firstColumn = INT_MAX, lastColumn = 0;
    const auto useRow = [&](int row) {
        firstRow = std::min(firstRow, row);
        lastRow = std::max(lastRow, row);
    };
    const auto useColumns = [&](int first, int last) {
        firstColumn = std::min(firstColumn, first);
        lastColumn = std::max(lastColumn, last);
    };
    for (int row = 1; row <= lastStoredRow(); ++row) {
        const RowData& data = m_rows[static_cast<std::size_t>(row - 1)];
        if (data.isEmpty())
            continue;
        useRow(row);
        if (!data.styleRuns.empty())
            useColumns(data.styleRuns.front().firstColumn, data.styleRuns.back().lastColumn);
        if (!data.cells.empty())
            useColumns(data.cells.front().column, data.cells.back().column);
    }
    for (int column = 1; column <= kMaxColumns; ++column) {
        const ColumnData& data = columnData(column);
        if (data.widthCharacters || data.style)
            useColumns(column, column);
    }
    if (lastRow == 0)
        firstRow = lastRow = 1;
    if (lastColumn == 0)
        firstColumn = lastColumn = 1;
    return { firstRow, firstColumn, lastRow, lastColumn };
}

} // namespace penmoor::engine
