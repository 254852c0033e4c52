#pragma once

#include "spreadsheet/xls/globalsrecords.h"
#include "spreadsheet/xls/recordwriter.h"

#include <cstdint>
#include <optional>
#include <span>
#include <string>
#include <variant>
#include <vector>

// The records of a worksheet substream, each with one writer and, where the reader needs it,
// one parser. Rows and columns are 0-based as in the file.
namespace penmoor::xls {

// DIMENSIONS 0x0200: the used range, last row and column exclusive; all zero when empty.
void writeDimensions(RecordWriter& writer, int firstRow, int endRow, int firstColumn, int endColumn);

// ROW 0x0208.
struct RowRecord {
    int row = 0;
    int firstColumn = 0;
    int endColumn = 0; // exclusive
    std::uint16_t heightTwips = 255;
    bool customHeight = false;
    bool hidden = false;
    std::optional<std::uint16_t> xf; // the row's own format
};
void writeRow(RecordWriter& writer, const RowRecord& row);
RowRecord parseRow(std::span<const std::uint8_t> body);
inline constexpr std::size_t kRowRecordSize = 4 + 16;

// COLINFO 0x007D: width in 1/256 of the standard font's digit width, padding included.
struct ColInfoRecord {
    int firstColumn = 0;
    int lastColumn = 0;
    std::uint16_t width = 0;
    std::uint16_t xf = 15;
    bool hidden = false;
    bool userSet = false;
};
void writeColInfo(RecordWriter& writer, const ColInfoRecord& columns);
ColInfoRecord parseColInfo(std::span<const std::uint8_t> body);

// The row, column and format that every cell record starts with.
struct CellHeader {
    int row = 0;
    int column = 0;
    std::uint16_t xf = 0;
};
CellHeader parseCellHeader(std::span<const std::uint8_t> body);

// BLANK 0x0201 and MULBLANK 0x00BE (a run of at least two blank cells in one row).
void writeBlank(RecordWriter& writer, const CellHeader& cell);
void writeMulBlank(RecordWriter& writer, int row, int firstColumn, std::span<const std::uint16_t> xfs);
// NUMBER 0x0203, or RK 0x027E when the value fits one exactly.
void writeNumber(RecordWriter& writer, const CellHeader& cell, double value);
// LABELSST 0x00FD: a text cell by its index in the shared string table.
void writeLabelSst(RecordWriter& writer, const CellHeader& cell, std::uint32_t stringIndex);
// BOOLERR 0x0205: a boolean, or an error by its code.
void writeBoolErr(RecordWriter& writer, const CellHeader& cell, std::uint8_t value, bool isError);

// The cached result of a formula as the FORMULA record holds it.
struct CachedText {
    std::u16string text;
};
struct CachedError {
    std::uint8_t code = 0;
};
using CachedResult = std::variant<double, CachedText, bool, CachedError>;

// FORMULA 0x0006 with its token bytes, followed by STRING 0x0207 when the result is text that is
// not empty.
void writeFormula(
    RecordWriter& writer, const CellHeader& cell, const CachedResult& result, std::span<const std::uint8_t> tokens);
struct FormulaRecord {
    CellHeader cell;
    CachedResult result; // for text results, the text is that of the STRING record that follows
    bool textFollows = false; // a STRING record with the text follows
    bool shared = false; // the tokens refer to a shared formula
    std::span<const std::uint8_t> tokens;
};
FormulaRecord parseFormula(std::span<const std::uint8_t> body);

// MERGEDCELLS 0x00E5, as many records as the areas need.
void writeMergedCells(RecordWriter& writer, std::span<const CellArea> areas);
std::vector<CellArea> parseMergedCells(std::span<const std::uint8_t> body);

// WINDOW2 0x023E: gridlines, headings and zeros shown; selected and active when asked.
void writeWindow2(RecordWriter& writer, bool selected);
// SELECTION 0x001D: the active cell inside the selected areas.
void writeSelection(
    RecordWriter& writer, int activeRow, int activeColumn, std::span<const CellArea> areas, std::uint16_t activeArea);
struct SelectionRecord {
    int activeRow = 0;
    int activeColumn = 0;
    std::uint16_t activeArea = 0;
    std::vector<CellArea> areas;
    std::uint8_t pane = 3;
};
SelectionRecord parseSelection(std::span<const std::uint8_t> body);

// SETUP 0x00A1: paper, scale or fit, orientation, comments, header and footer margins (inches).
struct SetupRecord {
    std::uint16_t paperSize = 9;
    std::uint16_t scale = 100;
    std::uint16_t fitWidth = 1;
    std::uint16_t fitHeight = 1;
    bool landscape = false;
    bool printNotes = false;
    bool notesAtEnd = false;
    bool orientationKnown = true; // false when the file marks paper and orientation undefined
    double headerMargin = 0.5;
    double footerMargin = 0.5;
};
void writeSetup(RecordWriter& writer, const SetupRecord& setup);
SetupRecord parseSetup(std::span<const std::uint8_t> body);

// LEFTMARGIN 0x0026 and the other margin records: one double in inches.
void writeMargin(RecordWriter& writer, std::uint16_t type, double inches);
double parseDouble(std::span<const std::uint8_t> body, const char* what);

// WSBOOL 0x0081: sheet options; with fit to page, SETUP's fit values apply instead of its scale.
void writeWsBool(RecordWriter& writer, bool fitToPage);
bool parseFitToPage(std::span<const std::uint8_t> body);

// INDEX 0x020B after the sheet's BOF: the row range, the offset of DEFCOLWIDTH and one offset per
// DBCELL record. Written with placeholders; returns where the offsets go.
struct IndexPlaceholder {
    std::size_t defColWidthAt = 0;
    std::size_t firstDbCellAt = 0;
};
IndexPlaceholder writeIndex(RecordWriter& writer, int firstRow, int endRow, std::size_t blocks);
// DBCELL 0x00D7 after each block of rows: back to the block's first ROW record, then for each
// row the step to its first cell.
void writeDbCell(RecordWriter& writer, std::size_t firstRowRecordAt, std::span<const std::size_t> firstCellAt);

} // namespace penmoor::xls
