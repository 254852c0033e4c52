#pragma once

#include "spreadsheet/workbook/address.h"
#include "spreadsheet/workbook/cell.h"
#include "spreadsheet/workbook/pagesetup.h"
#include "spreadsheet/workbook/style.h"
#include "spreadsheet/workbook/styleruns.h"

#include <array>
#include <cstdint>
#include <functional>
#include <optional>
#include <string>
#include <vector>

namespace penmoor::engine {

inline constexpr double kDefaultRowHeightPoints = 12.75;
inline constexpr double kDefaultColumnWidthCharacters = 8.43;

// A cell that holds a value or a formula; cells that only carry a format are style runs.
struct CellEntry {
    std::uint16_t column = 1;
    CellContent content;
};

// What a sheet keeps for one row. Most formatted cells hold no value, so formats and values
// are stored apart: formats as runs, values sparsely by column.
struct RowData {
    std::optional<double> heightPoints;
    std::optional<StyleId> style; // the whole row's format
    StyleRuns styleRuns; // cells with a format of their own
    std::vector<CellEntry> cells; // sorted by column

    bool isEmpty() const { return !heightPoints && !style && styleRuns.empty() && cells.empty(); }
};

struct ColumnData {
    std::optional<double> widthCharacters;
    std::optional<StyleId> style; // the whole column's format
};

// Consecutive existing cells of a row as a file writer or a painter meets them: either one cell
// that holds content, or a stretch of cells that carry a format but no content.
struct CellSpan {
    int firstColumn = 1;
    int lastColumn = 1;
    StyleId style = kDefaultStyleId; // the cells' effective format
    const CellContent* content = nullptr; // set for a single cell with content
};

// Maps a format to what an operation makes of it; the caller memoises it per operation.
using StyleMap = std::function<StyleId(StyleId)>;

// One worksheet: formats of the sheet, rows, columns and cells, contents, merged areas, page
// setup and selection. A cell's effective format is its own, else its row's, else its
// column's, else the sheet's.
class Sheet {
public:
    Sheet(std::string name, std::uint64_t id);

    const std::string& name() const { return m_name; }
    // Stable identity within the workbook, never reused for another sheet.
    std::uint64_t id() const { return m_id; }

    // Formats
    StyleId sheetStyle() const { return m_sheetStyle; }
    void setSheetStyle(StyleId style) { m_sheetStyle = style; }
    std::optional<StyleId> rowStyle(int row) const;
    void setRowStyle(int row, std::optional<StyleId> style);
    std::optional<StyleId> columnStyle(int column) const { return columnData(column).style; }
    void setColumnStyle(int column, std::optional<StyleId> style);
    std::optional<StyleId> cellStyle(CellPosition position) const; // the cell's own format
    void setCellStyle(CellPosition position, StyleId style)
    {
        setCellStyles(position.row, position.column, position.column, style);
    }
    void setCellStyles(int row, int firstColumn, int lastColumn, StyleId style);
    StyleId effectiveStyle(CellPosition position) const;
    // Gives every cell of the region the format map(its effective format), as a formatting
    // command does: whole-sheet, whole-row and whole-column formats are changed once where the
    // region covers them, and a cell that inherits its format gets one of its own only where the
    // result differs from what it would inherit.
    void restyle(const Region& region, const StyleMap& map);
    // Removes every format of the region's cells (and of its rows, columns or the sheet where it
    // covers them), so they show the default format.
    void clearFormats(const Region& region);

    // Sizes
    double defaultRowHeight() const { return m_defaultRowHeight; }
    void setDefaultRowHeight(double points) { m_defaultRowHeight = points; }
    std::optional<double> rowHeight(int row) const;
    double effectiveRowHeight(int row) const { return rowHeight(row).value_or(m_defaultRowHeight); }
    void setRowHeight(int row, std::optional<double> points);
    double defaultColumnWidth() const { return m_defaultColumnWidth; }
    void setDefaultColumnWidth(double characters) { m_defaultColumnWidth = characters; }
    std::optional<double> columnWidth(int column) const { return columnData(column).widthCharacters; }
    double effectiveColumnWidth(int column) const { return columnWidth(column).value_or(m_defaultColumnWidth); }
    void setColumnWidth(int column, std::optional<double> characters);

    // Contents
    const CellContent* content(CellPosition position) const;
    Formula* formula(CellPosition position);
    // Stores content in a cell; an empty content (std::monostate) empties it.
    void setContent(CellPosition position, CellContent content);
    void clearContents(const Region& region);
    // Calls visit(position, content) for every cell of the region that holds content, row by
    // row, in column order.
    void forEachContent(const Region& region, const std::function<void(CellPosition, const CellContent&)>& visit) const;
    // Every formula of the sheet, row by row, in column order.
    void forEachFormula(const std::function<void(CellPosition, Formula&)>& visit);

    // Recalculation bookkeeping: contents changed since the formulas were last evaluated.
    bool needsRecalculation() const { return m_contentVersion != m_calculatedVersion; }
    void markCalculated() { m_calculatedVersion = m_contentVersion; }

    // Rows in order, for writers and painters: rows 1 to lastStoredRow() may have data.
    int lastStoredRow() const { return static_cast<int>(m_rows.size()); }
    const RowData* rowData(int row) const;
    // The existing cells of a row (own format and/or content) in column order.
    void cellSpans(int row, std::vector<CellSpan>& out) const;

    // Merged areas, never overlapping and never a single cell.
    const std::vector<Region>& mergedAreas() const { return m_mergedAreas; }
    // Makes the region one merged area; merged areas it touches are dissolved first. A single
    // cell stays as it is. Contents are left alone (merging in the application also empties
    // every cell but the top-left one; its caller does that).
    void merge(const Region& region);
    void unmerge(const Region& region); // dissolves every merged area the region touches

    PageSetup& pageSetup() { return m_pageSetup; }
    const PageSetup& pageSetup() const { return m_pageSetup; }

    const Region& selection() const { return m_selection; }
    CellPosition activeCell() const { return m_activeCell; }
    // The active cell must lie in the selection.
    void select(const Region& selection, CellPosition activeCell);

    // From the first to the last row and column that hold content, a format of their own, or a
    // row height or column width that was set; A1 alone on an empty sheet.
    Region usedRange() const;

private:
    friend class Workbook;

    const ColumnData& columnData(int column) const { return m_columns.at(static_cast<std::size_t>(column - 1)); }
    RowData& materialiseRow(int row);
    void restyleRows(const Region& region, const StyleMap& map, bool wholeRows);
    void restyleColumns(const Region& region, const StyleMap& map);
    void restyleSheet(const StyleMap& map);
    StyleRuns columnBases() const;
    void contentChanged() { ++m_contentVersion; }

    std::string m_name;
    std::uint64_t m_id = 0;
    StyleId m_sheetStyle = kDefaultStyleId;
    double m_defaultRowHeight = kDefaultRowHeightPoints;
    double m_defaultColumnWidth = kDefaultColumnWidthCharacters;
    std::vector<RowData> m_rows; // index row - 1, up to the last row with data
    std::array<ColumnData, kMaxColumns> m_columns {};
    std::vector<Region> m_mergedAreas;
    PageSetup m_pageSetup;
    Region m_selection;
    CellPosition m_activeCell;
    std::uint64_t m_contentVersion = 0;
    std::uint64_t m_calculatedVersion = 0;
    StyleRuns m_scratch;
};

} // namespace penmoor::engine
