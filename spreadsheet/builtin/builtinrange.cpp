#include "spreadsheet/builtin/builtinrange.h"

#include "automation/contract/error.h"
#include "spreadsheet/builtin/builtinformatting.h"
#include "spreadsheet/builtin/contractvalues.h"
#include "spreadsheet/formula/cellentry.h"
#include "spreadsheet/formula/evaluation.h"
#include "spreadsheet/formula/r1c1parser.h"
#include "spreadsheet/formula/recalculation.h"
#include "spreadsheet/formula/valuetext.h"
#include "spreadsheet/workbook/text.h"

#include <algorithm>
#include <cmath>
#include <string_view>

namespace penmoor::engine {

namespace {

// Entering content fills every cell of a range; beyond this many cells it is refused rather
// than exhausting memory (a whole column is 65536 cells, the whole sheet 16.7 million).
constexpr long long kMaxFilledCells = 1 << 20;
constexpr std::size_t kMaxNumberFormatLength = 255;
constexpr double kMaxRowHeightPoints = 409.0;
constexpr double kMaxColumnWidthCharacters = 255.0;

} // namespace

BuiltinRange::BuiltinRange(SheetHandle sheet, const Region& region, Collection collection)
    : m_target(std::move(sheet), region)
    , m_collection(collection)
{
}

void BuiltinRange::Select()
{
    const SheetHandle& handle = m_target.sheet();
    Sheet& sheet = handle.sheet();
    if (!handle.isActive())
        throw xl::Error("The range " + Address() + " of the sheet \"" + sheet.name()
            + "\" cannot be selected: that sheet is not the active sheet.");
    sheet.select(region(), region().topLeft());
}

void BuiltinRange::Clear()
{
    Sheet& sheet = m_target.sheet().sheet();
    sheet.clearContents(region());
    sheet.clearFormats(region());
    sheet.unmerge(region());
}

void BuiltinRange::Merge()
{
    Sheet& sheet = m_target.sheet().sheet();
    if (region().isSingleCell())
        return;
    // The merged cell shows the top-left cell's content; the others lose theirs.
    CellContent kept;
    if (const CellContent* content = sheet.content(region().topLeft()))
        kept = *content;
    sheet.clearContents(region());
    sheet.setContent(region().topLeft(), std::move(kept));
    sheet.merge(region());
}

std::string BuiltinRange::Address() const
{
    m_target.sheet().sheet(); // fails once the sheet is gone
    return formatAddress(region());
}

long long BuiltinRange::count() const
{
    m_target.sheet().sheet();
    switch (m_collection) {
    case Collection::Rows:
        return region().rowCount();
    case Collection::Columns:
        return region().columnCount();
    case Collection::Cells:
        break;
    }
    return region().cellCount();
}

std::unique_ptr<xl::Range> BuiltinRange::Rows()
{
    return std::make_unique<BuiltinRange>(m_target.sheet(), region(), Collection::Rows);
}

std::unique_ptr<xl::Range> BuiltinRange::Columns()
{
    return std::make_unique<BuiltinRange>(m_target.sheet(), region(), Collection::Columns);
}

std::unique_ptr<xl::Range> BuiltinRange::Item(long long index)
{
    const Region& block = region();
    const auto outside = [&]() -> std::unique_ptr<xl::Range> {
        throw xl::Error("The range " + Address() + " has no item " + std::to_string(index)
            + " (items beyond the sheet's edge do not exist).");
    };
    if (index < 1)
        return outside();
    const long long offset = index - 1;
    switch (m_collection) {
    case Collection::Rows: {
        if (offset > kMaxRows - block.firstRow)
            return outside();
        const int row = block.firstRow + static_cast<int>(offset);
        return std::make_unique<BuiltinRange>(
            m_target.sheet(), Region { row, block.firstColumn, row, block.lastColumn }, Collection::Rows);
    }
    case Collection::Columns: {
        if (offset > kMaxColumns - block.firstColumn)
            return outside();
        const int column = block.firstColumn + static_cast<int>(offset);
        return std::make_unique<BuiltinRange>(
            m_target.sheet(), Region { block.firstRow, column, block.lastRow, column }, Collection::Columns);
    }
    case Collection::Cells:
        break;
    }
    // Cells count row by row across the block's width, and on below its last row.
    const long long width = block.columnCount();
    if (offset / width > kMaxRows - block.firstRow)
        return outside();
    const int row = block.firstRow + static_cast<int>(offset / width);
    const int column = block.firstColumn + static_cast<int>(offset % width);
    return std::make_unique<BuiltinRange>(m_target.sheet(), Region::cell(row, column));
}

int BuiltinRange::HorizontalAlignment() const
{
    return toContract(m_target.topLeftStyle().horizontal);
}

void BuiltinRange::setHorizontalAlignment(int alignment)
{
    const engine::HorizontalAlignment value = horizontalAlignmentFrom(alignment);
    m_target.format([&](CellStyle& style) { style.horizontal = value; });
}

int BuiltinRange::VerticalAlignment() const
{
    return toContract(m_target.topLeftStyle().vertical);
}

void BuiltinRange::setVerticalAlignment(int alignment)
{
    const engine::VerticalAlignment value = verticalAlignmentFrom(alignment);
    m_target.format([&](CellStyle& style) { style.vertical = value; });
}

bool BuiltinRange::WrapText() const
{
    return m_target.topLeftStyle().wrapText;
}

void BuiltinRange::setWrapText(bool wrap)
{
    m_target.format([&](CellStyle& style) { style.wrapText = wrap; });
}

double BuiltinRange::RowHeight() const
{
    return m_target.sheet().sheet().effectiveRowHeight(region().firstRow);
}

void BuiltinRange::setRowHeight(double points)
{
    if (!std::isfinite(points) || points < 0.0 || points > kMaxRowHeightPoints)
        throw xl::Error("The row height " + numberText(points) + " is not valid: it must be 0 to 409 points.");
    Sheet& sheet = m_target.sheet().sheet();
    if (region().spansAllRows()) {
        // Every row: the sheet's standard height, and no row keeps one of its own.
        sheet.setDefaultRowHeight(points);
        for (int row = 1; row <= sheet.lastStoredRow(); ++row)
            sheet.setRowHeight(row, std::nullopt);
        return;
    }
    for (int row = region().firstRow; row <= region().lastRow; ++row)
        sheet.setRowHeight(row, points);
}

double BuiltinRange::ColumnWidth() const
{
    return m_target.sheet().sheet().effectiveColumnWidth(region().firstColumn);
}

void BuiltinRange::setColumnWidth(double characters)
{
    if (!std::isfinite(characters) || characters < 0.0 || characters > kMaxColumnWidthCharacters)
        throw xl::Error(
            "The column width " + numberText(characters) + " is not valid: it must be 0 to 255 characters.");
    Sheet& sheet = m_target.sheet().sheet();
    if (region().spansAllColumns()) {
        sheet.setDefaultColumnWidth(characters);
        for (int column = 1; column <= kMaxColumns; ++column)
            sheet.setColumnWidth(column, std::nullopt);
        return;
    }
    for (int column = region().firstColumn; column <= region().lastColumn; ++column)
        sheet.setColumnWidth(column, characters);
}

std::string BuiltinRange::NumberFormat() const
{
    return m_target.topLeftStyle().numberFormat;
}

void BuiltinRange::setNumberFormat(const std::string& format)
{
    if (format.size() > kMaxNumberFormatLength)
        throw xl::Error("The number format \"" + format.substr(0, 60) + "...\" is longer than 255 characters.");
    const std::string stored = format.empty() || equalsIgnoringCase(format, "General") ? "General" : format;
    m_target.format([&](CellStyle& style) { style.numberFormat = stored; });
}

std::unique_ptr<xl::Font> BuiltinRange::Font()
{
    return std::make_unique<BuiltinFont>(m_target);
}

std::unique_ptr<xl::Interior> BuiltinRange::Interior()
{
    return std::make_unique<BuiltinInterior>(m_target);
}

std::unique_ptr<xl::Border> BuiltinRange::Borders(int edge)
{
    const BorderIndex border = borderIndexFrom(edge);
    return std::make_unique<BuiltinBorder>(m_target, border);
}

std::string BuiltinRange::FormulaR1C1() const
{
    const Sheet& sheet = m_target.sheet().sheet();
    const CellContent* content = sheet.content(region().topLeft());
    return content ? entryText(*content, m_target.topLeftStyle().numberFormat) : std::string();
}

void BuiltinRange::forEachCellToFill(const std::function<void(CellPosition)>& store) const
{
    if (region().cellCount() > kMaxFilledCells)
        throw xl::Error("Entering content into the " + std::to_string(region().cellCount()) + " cells of " + Address()
            + " at once is not supported (at most 1048576 cells).");
    for (int row = region().firstRow; row <= region().lastRow; ++row) {
        for (int column = region().firstColumn; column <= region().lastColumn; ++column)
            store({ row, column });
    }
}

void BuiltinRange::setFormulaR1C1(const std::string& text)
{
    if (text.size() > kMaxTextLength)
        throw xl::Error("The text entered into " + Address() + " is longer than 32767 characters.");
    Sheet& sheet = m_target.sheet().sheet();
    if (!text.empty() && text.front() == '=') {
        const TokenArray tokens = parseFormulaR1C1(text);
        forEachCellToFill([&](CellPosition cell) { sheet.setContent(cell, Formula { tokens, {} }); });
        return;
    }
    StyleTable& styles = m_target.sheet().workbook().styles();
    forEachCellToFill([&](CellPosition cell) {
        const std::string currentFormat = styles.style(sheet.effectiveStyle(cell)).numberFormat;
        EnteredContent entered = parseCellEntry(text, currentFormat);
        sheet.setContent(cell, std::move(entered.content));
        if (entered.numberFormat) {
            applyFormat(styles, sheet, Region::cell(cell),
                [&](CellStyle& style) { style.numberFormat = *entered.numberFormat; });
        }
    });
}

void BuiltinRange::setLiteralText(const std::string& text)
{
    if (text.size() > kMaxTextLength)
        throw xl::Error("The text entered into " + Address() + " is longer than 32767 characters.");
    Sheet& sheet = m_target.sheet().sheet();
    forEachCellToFill(
        [&](CellPosition cell) { sheet.setContent(cell, text.empty() ? CellContent {} : CellContent { text }); });
}

xl::Value BuiltinRange::Value() const
{
    Sheet& sheet = m_target.sheet().sheet();
    recalculate(sheet);
    const CellContent* content = sheet.content(region().topLeft());
    return content ? cellValue(*content) : xl::Value();
}

xl::Picture BuiltinRange::CopyPicture()
{
    const SheetHandle& handle = m_target.sheet();
    Sheet& sheet = handle.sheet();
    const std::shared_ptr<PictureRenderer>& renderer = handle.workbookHandle().application()->renderer;
    if (!renderer)
        throw xl::Error("A picture of the range " + Address() + " cannot be made: this build has no sheet pictures.");
    recalculate(sheet);
    return renderer->renderPicture(handle.workbook(), sheet, region());
}

} // namespace penmoor::engine
