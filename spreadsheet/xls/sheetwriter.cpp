#include "spreadsheet/xls/sheetwriter.h"

#include "spreadsheet/xls/biffrecords.h"
#include "spreadsheet/xls/formaterror.h"
#include "spreadsheet/xls/formulatokens.h"
#include "spreadsheet/xls/sheetrecords.h"
#include "spreadsheet/xls/unicode.h"
#include "spreadsheet/xls/units.h"

#include <algorithm>
#include <array>
#include <cmath>

namespace penmoor::xls {

namespace {

using namespace engine;

constexpr double kDelta = 0.001;
constexpr std::uint16_t kCalcCount = 100;
constexpr std::uint16_t kRefModeA1 = 1;
constexpr std::uint16_t kCalcAutomatic = 1;
// A formula the file cannot express is stored as this error constant.
constexpr std::uint8_t kNameErrorFormula[] = { 0x1C, static_cast<std::uint8_t>(xl::ErrorValue::Name) };

CellArea fileArea(const Region& region)
{
    return { region.firstRow - 1, region.lastRow - 1, region.firstColumn - 1, region.lastColumn - 1 };
}

CachedResult cachedResult(const xl::Value& value)
{
    if (const double* number = std::get_if<double>(&value))
        return std::isfinite(*number) ? CachedResult { *number } : CachedResult { CachedError { 0x24 } };
    if (const std::string* text = std::get_if<std::string>(&value))
        return CachedText { utf8ToUtf16(*text) };
    if (const bool* flag = std::get_if<bool>(&value))
        return *flag;
    if (const xl::ErrorValue* error = std::get_if<xl::ErrorValue>(&value))
        return CachedError { static_cast<std::uint8_t>(*error) };
    return 0.0; // an empty result shows as 0
}

class SheetWriter {
public:
    SheetWriter(RecordWriter& writer, const Sheet& sheet, const CellFormatTable& formats, const SharedStrings& strings)
        : m_writer(writer)
        , m_sheet(sheet)
        , m_formats(formats)
        , m_strings(strings)
    {
    }

    void write(bool active)
    {
        collectRows();
        writeBof(m_writer, biff::kBofWorksheet);
        const int firstRow = m_rows.empty() ? 0 : m_rows.front() - 1;
        const int endRow = m_rows.empty() ? 0 : m_rows.back();
        const IndexPlaceholder index = writeIndex(m_writer, firstRow, endRow, blockCount());
        writeSettings();
        writePageSetup();
        m_writer.out().patchU32(index.defColWidthAt, static_cast<std::uint32_t>(m_writer.offset()));
        writeColumns();
        writeDimensions(m_writer, m_cellRows.first, m_cellRows.second, m_cellColumns.first, m_cellColumns.second);
        std::size_t dbCellSlot = index.firstDbCellAt;
        for (std::size_t first = 0; first < m_rows.size();) {
            std::size_t last = first;
            while (last + 1 < m_rows.size() && blockOf(m_rows[last + 1]) == blockOf(m_rows[first]))
                ++last;
            m_writer.out().patchU32(dbCellSlot, static_cast<std::uint32_t>(writeBlock(first, last)));
            dbCellSlot += 4;
            first = last + 1;
        }
        writeWindow2(m_writer, active);
        writeSelection(m_writer, m_sheet.activeCell().row - 1, m_sheet.activeCell().column - 1,
            std::vector<CellArea> { fileArea(m_sheet.selection()) }, 0);
        std::vector<CellArea> merged;
        for (const Region& area : m_sheet.mergedAreas()) {
            if (!area.isSingleCell())
                merged.push_back(fileArea(area));
        }
        writeMergedCells(m_writer, merged);
        m_writer.emptyRecord(biff::kEof);
    }

private:
    static int blockOf(int row) { return (row - 1) / biff::kRowsPerBlock; }

    std::size_t blockCount() const
    {
        std::size_t blocks = 0;
        for (std::size_t i = 0; i < m_rows.size(); ++i) {
            if (i == 0 || blockOf(m_rows[i]) != blockOf(m_rows[i - 1]))
                ++blocks;
        }
        return blocks;
    }

    // The rows that need a ROW record, and the extent of the cell records for DIMENSIONS.
    void collectRows()
    {
        int firstCellRow = 0;
        int lastCellRow = -1;
        int firstColumn = kMaxColumns;
        int lastColumn = 0;
        for (int row = 1; row <= m_sheet.lastStoredRow(); ++row) {
            const RowData* data = m_sheet.rowData(row);
            if (!data || data->isEmpty())
                continue;
            m_rows.push_back(row);
            // The row's cells: its runs of own formats and its cells with content.
            if (data->styleRuns.empty() && data->cells.empty())
                continue;
            if (lastCellRow < 0)
                firstCellRow = row;
            lastCellRow = row;
            if (!data->styleRuns.empty()) {
                firstColumn = std::min<int>(firstColumn, data->styleRuns.front().firstColumn);
                lastColumn = std::max<int>(lastColumn, data->styleRuns.back().lastColumn);
            }
            if (!data->cells.empty()) {
                firstColumn = std::min<int>(firstColumn, data->cells.front().column);
                lastColumn = std::max<int>(lastColumn, data->cells.back().column);
            }
        }
        if (lastCellRow >= 0) {
            m_cellRows = { firstCellRow - 1, lastCellRow };
            m_cellColumns = { firstColumn - 1, lastColumn };
        }
    }

    void writeSettings()
    {
        m_writer.u16Record(biff::kCalcMode, kCalcAutomatic);
        m_writer.u16Record(biff::kCalcCount, kCalcCount);
        m_writer.u16Record(biff::kRefMode, kRefModeA1);
        m_writer.u16Record(biff::kIteration, 0);
        writeMargin(m_writer, biff::kDelta, kDelta);
        m_writer.u16Record(biff::kSaveRecalc, 1);
        m_writer.u16Record(biff::kPrintHeaders, 0);
        m_writer.u16Record(biff::kPrintGridlines, 0);
        m_writer.u16Record(biff::kGridSet, 1);
        m_writer.begin(biff::kGuts);
        m_writer.out().zeros(8);
        m_writer.end();
        const std::uint16_t defaultHeight = pointsToTwips(m_sheet.defaultRowHeight());
        m_writer.begin(biff::kDefaultRowHeight);
        m_writer.out().u16(defaultHeight == pointsToTwips(kDefaultRowHeightPoints) ? 0 : 1);
        m_writer.out().u16(defaultHeight);
        m_writer.end();
        writeWsBool(m_writer, !m_sheet.pageSetup().zoomPercent.has_value());
    }

    void writePageSetup()
    {
        const PageSetup& page = m_sheet.pageSetup();
        m_writer.emptyRecord(biff::kHeader);
        m_writer.emptyRecord(biff::kFooter);
        m_writer.u16Record(biff::kHCenter, 0);
        m_writer.u16Record(biff::kVCenter, 0);
        writeMargin(m_writer, biff::kLeftMargin, page.leftMarginInches);
        writeMargin(m_writer, biff::kRightMargin, page.rightMarginInches);
        writeMargin(m_writer, biff::kTopMargin, page.topMarginInches);
        writeMargin(m_writer, biff::kBottomMargin, page.bottomMarginInches);
        SetupRecord setup;
        setup.paperSize = static_cast<std::uint16_t>(page.paperSize);
        setup.scale = static_cast<std::uint16_t>(page.zoomPercent.value_or(100));
        setup.fitWidth = static_cast<std::uint16_t>(page.fitToPagesWide);
        setup.fitHeight = static_cast<std::uint16_t>(page.fitToPagesTall);
        setup.landscape = page.orientation == Orientation::Landscape;
        setup.printNotes = page.comments != CommentPrinting::None;
        setup.notesAtEnd = page.comments == CommentPrinting::AtEnd;
        setup.headerMargin = page.headerMarginInches;
        setup.footerMargin = page.footerMarginInches;
        writeSetup(m_writer, setup);
    }

    // DEFCOLWIDTH, then COLINFO for every run of columns with the same width and format. With a
    // format on the whole sheet, every column carries it (or its own).
    void writeColumns()
    {
        const double defaultWidth = m_sheet.defaultColumnWidth();
        m_writer.u16Record(biff::kDefColWidth, static_cast<std::uint16_t>(std::lround(defaultWidth)));
        const bool sheetFormatted = m_sheet.sheetStyle() != kDefaultStyleId;
        std::optional<ColInfoRecord> run;
        for (int column = 1; column <= kMaxColumns; ++column) {
            const auto width = m_sheet.columnWidth(column);
            const auto style = m_sheet.columnStyle(column);
            std::optional<ColInfoRecord> info;
            if (width || style || sheetFormatted) {
                info = ColInfoRecord {};
                info->firstColumn = info->lastColumn = column - 1;
                info->width = columnWidthToFile(width.value_or(defaultWidth));
                info->hidden = width && *width == 0;
                if (info->hidden)
                    info->width = columnWidthToFile(defaultWidth);
                info->userSet = width.has_value();
                info->xf = m_formats.xf(style.value_or(m_sheet.sheetStyle()));
            }
            if (run && info && run->width == info->width && run->xf == info->xf && run->hidden == info->hidden
                && run->userSet == info->userSet && run->lastColumn + 1 == info->firstColumn) {
                run->lastColumn = info->lastColumn;
                continue;
            }
            if (run)
                writeColInfo(m_writer, *run);
            run = info;
        }
        if (run)
            writeColInfo(m_writer, *run);
    }

    // Rows m_rows[first..last], all in one block: their ROW records, their cells, a DBCELL.
    // Returns the DBCELL's offset for the INDEX.
    std::size_t writeBlock(std::size_t first, std::size_t last)
    {
        const std::size_t rowsAt = m_writer.offset();
        for (std::size_t i = first; i <= last; ++i) {
            m_sheet.cellSpans(m_rows[i], m_blockSpans[i - first]);
            writeRowRecord(m_rows[i], m_blockSpans[i - first]);
        }
        m_firstCells.clear();
        for (std::size_t i = first; i <= last; ++i) {
            m_firstCells.push_back(m_writer.offset());
            writeCells(m_rows[i], m_blockSpans[i - first]);
        }
        const std::size_t dbCellAt = m_writer.offset();
        writeDbCell(m_writer, rowsAt, m_firstCells);
        return dbCellAt;
    }

    void writeRowRecord(int row, const std::vector<CellSpan>& spans)
    {
        const RowData& data = *m_sheet.rowData(row);
        RowRecord record;
        record.row = row - 1;
        if (!spans.empty()) {
            record.firstColumn = spans.front().firstColumn - 1;
            record.endColumn = spans.back().lastColumn;
        }
        const double height = data.heightPoints.value_or(m_sheet.defaultRowHeight());
        record.hidden = height == 0;
        record.heightTwips = record.hidden ? pointsToTwips(m_sheet.defaultRowHeight()) : pointsToTwips(height);
        record.customHeight = data.heightPoints.has_value();
        if (data.style)
            record.xf = m_formats.xf(*data.style);
        writeRow(m_writer, record);
    }

    void writeCells(int row, const std::vector<CellSpan>& spans)
    {
        m_blankXfs.clear();
        int blankFirst = 0;
        for (const CellSpan& span : spans) {
            const std::uint16_t xf = m_formats.xf(span.style);
            if (!span.content) {
                if (m_blankXfs.empty() || blankFirst + static_cast<int>(m_blankXfs.size()) != span.firstColumn) {
                    flushBlanks(row, blankFirst);
                    blankFirst = span.firstColumn;
                }
                m_blankXfs.insert(
                    m_blankXfs.end(), static_cast<std::size_t>(span.lastColumn - span.firstColumn + 1), xf);
                continue;
            }
            flushBlanks(row, blankFirst);
            writeContent({ row, span.firstColumn }, xf, *span.content);
        }
        flushBlanks(row, blankFirst);
    }

    void flushBlanks(int row, int firstColumn)
    {
        if (m_blankXfs.size() == 1)
            writeBlank(m_writer, { row - 1, firstColumn - 1, m_blankXfs.front() });
        else if (!m_blankXfs.empty())
            writeMulBlank(m_writer, row - 1, firstColumn - 1, m_blankXfs);
        m_blankXfs.clear();
    }

    void writeContent(CellPosition position, std::uint16_t xf, const CellContent& content)
    {
        const CellHeader cell { position.row - 1, position.column - 1, xf };
        if (const double* number = std::get_if<double>(&content)) {
            if (std::isfinite(*number))
                writeNumber(m_writer, cell, *number);
            else
                writeBoolErr(m_writer, cell, static_cast<std::uint8_t>(xl::ErrorValue::Num), true);
        } else if (const std::string* text = std::get_if<std::string>(&content)) {
            writeLabelSst(m_writer, cell, m_strings.indexOf(*text));
        } else if (const bool* flag = std::get_if<bool>(&content)) {
            writeBoolErr(m_writer, cell, *flag ? 1 : 0, false);
        } else if (const xl::ErrorValue* error = std::get_if<xl::ErrorValue>(&content)) {
            writeBoolErr(m_writer, cell, static_cast<std::uint8_t>(*error), true);
        } else if (const Formula* formula = std::get_if<Formula>(&content)) {
            const auto tokens = encodeFormula(formula->tokens, position);
            if (tokens)
                writeFormula(m_writer, cell, cachedResult(formula->cachedValue), *tokens);
            else
                writeFormula(
                    m_writer, cell, CachedError { static_cast<std::uint8_t>(xl::ErrorValue::Name) }, kNameErrorFormula);
        }
    }

    RecordWriter& m_writer;
    const Sheet& m_sheet;
    const CellFormatTable& m_formats;
    const SharedStrings& m_strings;
    std::vector<int> m_rows;
    std::pair<int, int> m_cellRows { 0, 0 };
    std::pair<int, int> m_cellColumns { 0, 0 };
    std::array<std::vector<CellSpan>, biff::kRowsPerBlock> m_blockSpans;
    std::vector<std::uint16_t> m_blankXfs;
    std::vector<std::size_t> m_firstCells;
    FormulaEncoder m_encoder;
    ByteBuffer m_tokens;
};

} // namespace

void writeSheet(
    RecordWriter& writer, const Sheet& sheet, const CellFormatTable& formats, const SharedStrings& strings, bool active)
{
    SheetWriter(writer, sheet, formats, strings).write(active);
}

} // namespace penmoor::xls
