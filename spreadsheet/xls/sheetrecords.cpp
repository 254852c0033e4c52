#include "spreadsheet/xls/sheetrecords.h"

#include "spreadsheet/xls/biffrecords.h"
#include "spreadsheet/xls/biffstrings.h"
#include "spreadsheet/xls/bytereader.h"
#include "spreadsheet/xls/formaterror.h"
#include "spreadsheet/xls/rk.h"

#include <algorithm>

namespace penmoor::xls {

namespace {

constexpr std::uint16_t kRowHidden = 0x0020;
constexpr std::uint16_t kRowCustomHeight = 0x0040;
constexpr std::uint16_t kRowHasFormat = 0x0080;
constexpr std::uint16_t kRowAlwaysSet = 0x0100;
constexpr std::uint16_t kRowXfMask = 0x0FFF;
constexpr std::uint16_t kDefaultCellXf = 15;

constexpr std::uint16_t kColumnHidden = 0x0001;
constexpr std::uint16_t kColumnUserSet = 0x0002;

constexpr std::uint16_t kFormulaShared = 0x0008;
constexpr std::uint16_t kNonNumberMark = 0xFFFF;
constexpr std::uint8_t kResultText = 0;
constexpr std::uint8_t kResultBoolean = 1;
constexpr std::uint8_t kResultError = 2;
constexpr std::uint8_t kResultEmptyText = 3;

// Gridlines, headings, zeros and outline symbols shown, default header colour, page breaks view off.
constexpr std::uint16_t kWindow2Shown = 0x00B6;
constexpr std::uint16_t kWindow2Selected = 0x0200;
constexpr std::uint16_t kWindow2Active = 0x0400;
constexpr std::uint16_t kHeaderColourAutomatic = 0x40;
constexpr std::uint8_t kPaneTopLeft = 3;

constexpr std::uint16_t kSetupPortrait = 0x0002;
constexpr std::uint16_t kSetupNoPrinterData = 0x0004;
constexpr std::uint16_t kSetupNotes = 0x0020;
constexpr std::uint16_t kSetupNoOrientation = 0x0040;
constexpr std::uint16_t kSetupEndNotes = 0x0200;
constexpr std::uint16_t kPrintResolution = 600;

// Automatic page breaks and outline symbols shown.
constexpr std::uint16_t kWsBoolDefault = 0x04C1;
constexpr std::uint16_t kWsBoolFitToPage = 0x0100;

void cellHeader(ByteBuffer& out, const CellHeader& cell)
{
    out.u16(static_cast<std::uint16_t>(cell.row));
    out.u16(static_cast<std::uint16_t>(cell.column));
    out.u16(cell.xf);
}

void checkArea(const CellArea& area, const char* what)
{
    if (area.firstRow > area.lastRow || area.firstColumn > area.lastColumn)
        throw FormatError(std::string(what) + " has an inverted area");
}

} // namespace

void writeDimensions(RecordWriter& writer, int firstRow, int endRow, int firstColumn, int endColumn)
{
    writer.begin(biff::kDimensions);
    writer.out().u32(static_cast<std::uint32_t>(firstRow));
    writer.out().u32(static_cast<std::uint32_t>(endRow));
    writer.out().u16(static_cast<std::uint16_t>(firstColumn));
    writer.out().u16(static_cast<std::uint16_t>(endColumn));
    writer.out().u16(0);
    writer.end();
}

void writeRow(RecordWriter& writer, const RowRecord& row)
{
    writer.begin(biff::kRow);
    ByteBuffer& out = writer.out();
    out.u16(static_cast<std::uint16_t>(row.row));
    out.u16(static_cast<std::uint16_t>(row.firstColumn));
    out.u16(static_cast<std::uint16_t>(row.endColumn));
    out.u16(row.heightTwips);
    out.u32(0);
    out.u16(static_cast<std::uint16_t>(kRowAlwaysSet | (row.hidden ? kRowHidden : 0)
        | (row.customHeight ? kRowCustomHeight : 0) | (row.xf ? kRowHasFormat : 0)));
    out.u16(row.xf ? static_cast<std::uint16_t>(*row.xf & kRowXfMask) : kDefaultCellXf);
    writer.end();
}

RowRecord parseRow(std::span<const std::uint8_t> body)
{
    ByteReader in(body, "a ROW record");
    RowRecord row;
    row.row = in.u16();
    row.firstColumn = in.u16();
    row.endColumn = in.u16();
    row.heightTwips = in.u16() & 0x7FFF;
    in.skip(4);
    const std::uint16_t flags = in.u16();
    const std::uint16_t xf = in.u16() & kRowXfMask;
    row.hidden = (flags & kRowHidden) != 0;
    row.customHeight = (flags & kRowCustomHeight) != 0;
    if (flags & kRowHasFormat)
        row.xf = xf;
    return row;
}

void writeColInfo(RecordWriter& writer, const ColInfoRecord& columns)
{
    writer.begin(biff::kColInfo);
    ByteBuffer& out = writer.out();
    out.u16(static_cast<std::uint16_t>(columns.firstColumn));
    out.u16(static_cast<std::uint16_t>(columns.lastColumn));
    out.u16(columns.width);
    out.u16(columns.xf);
    out.u16(static_cast<std::uint16_t>((columns.hidden ? kColumnHidden : 0) | (columns.userSet ? kColumnUserSet : 0)));
    out.u16(0);
    writer.end();
}

ColInfoRecord parseColInfo(std::span<const std::uint8_t> body)
{
    ByteReader in(body, "a COLINFO record");
    ColInfoRecord columns;
    columns.firstColumn = in.u16();
    columns.lastColumn = in.u16();
    columns.width = in.u16();
    columns.xf = in.u16();
    const std::uint16_t flags = in.u16();
    columns.hidden = (flags & kColumnHidden) != 0;
    columns.userSet = (flags & kColumnUserSet) != 0;
    // Some writers let the last column run one past the sheet; the sheet ends there anyway.
    columns.lastColumn = std::min(columns.lastColumn, biff::kMaxColumns - 1);
    if (columns.firstColumn > columns.lastColumn)
        throw FormatError("a COLINFO record has an inverted column range");
    return columns;
}

CellHeader parseCellHeader(std::span<const std::uint8_t> body)
{
    ByteReader in(body, "a cell record");
    CellHeader cell;
    cell.row = in.u16();
    cell.column = in.u16();
    cell.xf = in.u16();
    if (cell.column >= biff::kMaxColumns)
        throw FormatError("a cell lies beyond column IV");
    return cell;
}

void writeBlank(RecordWriter& writer, const CellHeader& cell)
{
    writer.begin(biff::kBlank);
    cellHeader(writer.out(), cell);
    writer.end();
}

void writeMulBlank(RecordWriter& writer, int row, int firstColumn, std::span<const std::uint16_t> xfs)
{
    writer.begin(biff::kMulBlank);
    ByteBuffer& out = writer.out();
    out.u16(static_cast<std::uint16_t>(row));
    out.u16(static_cast<std::uint16_t>(firstColumn));
    for (std::uint16_t xf : xfs)
        out.u16(xf);
    out.u16(static_cast<std::uint16_t>(firstColumn + static_cast<int>(xfs.size()) - 1));
    writer.end();
}

void writeNumber(RecordWriter& writer, const CellHeader& cell, double value)
{
    if (const auto rk = encodeRk(value)) {
        writer.begin(biff::kRk);
        cellHeader(writer.out(), cell);
        writer.out().u32(*rk);
    } else {
        writer.begin(biff::kNumber);
        cellHeader(writer.out(), cell);
        writer.out().f64(value);
    }
    writer.end();
}

void writeLabelSst(RecordWriter& writer, const CellHeader& cell, std::uint32_t stringIndex)
{
    writer.begin(biff::kLabelSst);
    cellHeader(writer.out(), cell);
    writer.out().u32(stringIndex);
    writer.end();
}

void writeBoolErr(RecordWriter& writer, const CellHeader& cell, std::uint8_t value, bool isError)
{
    writer.begin(biff::kBoolErr);
    cellHeader(writer.out(), cell);
    writer.out().u8(value);
    writer.out().u8(isError ? 1 : 0);
    writer.end();
}

void writeFormula(
    RecordWriter& writer, const CellHeader& cell, const CachedResult& result, std::span<const std::uint8_t> tokens)
{
    writer.begin(biff::kFormula);
    ByteBuffer& out = writer.out();
    cellHeader(out, cell);
    // A result other than a number: a type byte, its value, and 0xFFFF where a double's top
    // bytes would be (a pattern no finite double has).
    auto special = [&](std::uint8_t type, std::uint8_t value) {
        out.u8(type);
        out.u8(0);
        out.u8(value);
        out.u8(0);
        out.u16(0);
        out.u16(kNonNumberMark);
    };
    const CachedText* text = std::get_if<CachedText>(&result);
    if (const double* number = std::get_if<double>(&result))
        out.f64(*number);
    else if (text)
        special(text->text.empty() ? kResultEmptyText : kResultText, 0);
    else if (const bool* flag = std::get_if<bool>(&result))
        special(kResultBoolean, *flag ? 1 : 0);
    else
        special(kResultError, std::get<CachedError>(result).code);
    out.u16(0); // no flags: calculated on demand, not shared
    out.u32(0);
    if (tokens.size() > biff::kMaxRecordBody - 22)
        throw WriteError("a formula is too long for the format");
    out.u16(static_cast<std::uint16_t>(tokens.size()));
    out.append(tokens);
    writer.end();
    if (text && !text->text.empty()) {
        writer.begin(biff::kString);
        writeString(writer.out(), text->text);
        writer.end();
    }
}

FormulaRecord parseFormula(std::span<const std::uint8_t> body)
{
    FormulaRecord formula;
    formula.cell = parseCellHeader(body);
    ByteReader in(body, "a FORMULA record");
    in.skip(6);
    const auto value = in.bytes(8);
    if (loadU16(value.data() + 6) == kNonNumberMark) {
        switch (value[0]) {
        case kResultText:
            formula.result = CachedText {};
            formula.textFollows = true;
            break;
        case kResultBoolean:
            formula.result = value[2] != 0;
            break;
        case kResultError:
            formula.result = CachedError { value[2] };
            break;
        case kResultEmptyText:
            formula.result = CachedText {};
            break;
        default:
            throw FormatError("a formula has a cached result of unknown type " + std::to_string(value[0]));
        }
    } else {
        ByteReader number(value, "a formula result");
        formula.result = number.f64();
    }
    formula.shared = (in.u16() & kFormulaShared) != 0;
    in.u32();
    const std::size_t length = in.u16();
    formula.tokens = in.bytes(length);
    return formula;
}

void writeMergedCells(RecordWriter& writer, std::span<const CellArea> areas)
{
    while (!areas.empty()) {
        const auto part = areas.first(std::min(areas.size(), biff::kMaxMergedAreasPerRecord));
        writer.begin(biff::kMergedCells);
        writer.out().u16(static_cast<std::uint16_t>(part.size()));
        for (const CellArea& area : part) {
            writer.out().u16(static_cast<std::uint16_t>(area.firstRow));
            writer.out().u16(static_cast<std::uint16_t>(area.lastRow));
            writer.out().u16(static_cast<std::uint16_t>(area.firstColumn));
            writer.out().u16(static_cast<std::uint16_t>(area.lastColumn));
        }
        writer.end();
        areas = areas.subspan(part.size());
    }
}

std::vector<CellArea> parseMergedCells(std::span<const std::uint8_t> body)
{
    ByteReader in(body, "a MERGEDCELLS record");
    const std::size_t count = in.u16();
    if (count * 8 > in.remaining())
        throw FormatError("a MERGEDCELLS record is cut short");
    std::vector<CellArea> areas(count);
    for (CellArea& area : areas) {
        area.firstRow = in.u16();
        area.lastRow = in.u16();
        area.firstColumn = in.u16();
        area.lastColumn = in.u16();
        checkArea(area, "a merged area");
        if (area.lastColumn >= biff::kMaxColumns)
            throw FormatError("a merged area lies beyond column IV");
    }
    return areas;
}

void writeWindow2(RecordWriter& writer, bool selected)
{
    writer.begin(biff::kWindow2);
    ByteBuffer& out = writer.out();
    out.u16(static_cast<std::uint16_t>(kWindow2Shown | (selected ? kWindow2Selected | kWindow2Active : 0)));
    out.u16(0); // top row
    out.u16(0); // left column
    out.u16(kHeaderColourAutomatic);
    out.u16(0);
    out.u16(0); // zoom in page break preview: default
    out.u16(0); // zoom in normal view: default (100%)
    out.u32(0);
    writer.end();
}

void writeSelection(
    RecordWriter& writer, int activeRow, int activeColumn, std::span<const CellArea> areas, std::uint16_t activeArea)
{
    writer.begin(biff::kSelection);
    ByteBuffer& out = writer.out();
    out.u8(kPaneTopLeft);
    out.u16(static_cast<std::uint16_t>(activeRow));
    out.u16(static_cast<std::uint16_t>(activeColumn));
    out.u16(activeArea);
    out.u16(static_cast<std::uint16_t>(areas.size()));
    for (const CellArea& area : areas) {
        out.u16(static_cast<std::uint16_t>(area.firstRow));
        out.u16(static_cast<std::uint16_t>(area.lastRow));
        out.u8(static_cast<std::uint8_t>(area.firstColumn));
        out.u8(static_cast<std::uint8_t>(area.lastColumn));
    }
    writer.end();
}

SelectionRecord parseSelection(std::span<const std::uint8_t> body)
{
    ByteReader in(body, "a SELECTION record");
    SelectionRecord selection;
    selection.pane = in.u8();
    selection.activeRow = in.u16();
    selection.activeColumn = in.u16();
    selection.activeArea = in.u16();
    const std::size_t count = in.u16();
    if (count * 6 > in.remaining())
        throw FormatError("a SELECTION record is cut short");
    for (std::size_t i = 0; i < count; ++i) {
        CellArea area;
        area.firstRow = in.u16();
        area.lastRow = in.u16();
        area.firstColumn = in.u8();
        area.lastColumn = in.u8();
        checkArea(area, "the selection");
        selection.areas.push_back(area);
    }
    return selection;
}

void writeSetup(RecordWriter& writer, const SetupRecord& setup)
{
    writer.begin(biff::kSetup);
    ByteBuffer& out = writer.out();
    out.u16(setup.paperSize);
    out.u16(setup.scale);
    out.u16(1); // first page number
    out.u16(setup.fitWidth);
    out.u16(setup.fitHeight);
    out.u16(static_cast<std::uint16_t>((setup.landscape ? 0 : kSetupPortrait) | (setup.printNotes ? kSetupNotes : 0)
        | (setup.printNotes && setup.notesAtEnd ? kSetupEndNotes : 0)));
    out.u16(kPrintResolution);
    out.u16(kPrintResolution);
    out.f64(setup.headerMargin);
    out.f64(setup.footerMargin);
    out.u16(1); // copies
    writer.end();
}

SetupRecord parseSetup(std::span<const std::uint8_t> body)
{
    ByteReader in(body, "the SETUP record");
    SetupRecord setup;
    setup.paperSize = in.u16();
    setup.scale = in.u16();
    in.u16();
    setup.fitWidth = in.u16();
    setup.fitHeight = in.u16();
    const std::uint16_t flags = in.u16();
    in.skip(4);
    setup.headerMargin = in.f64();
    setup.footerMargin = in.f64();
    setup.landscape = (flags & kSetupPortrait) == 0;
    setup.printNotes = (flags & kSetupNotes) != 0;
    setup.notesAtEnd = (flags & kSetupEndNotes) != 0;
    // Without printer data, paper, scale and orientation are undefined and must be ignored.
    setup.orientationKnown = (flags & (kSetupNoPrinterData | kSetupNoOrientation)) == 0;
    return setup;
}

void writeMargin(RecordWriter& writer, std::uint16_t type, double inches)
{
    writer.begin(type);
    writer.out().f64(inches);
    writer.end();
}

double parseDouble(std::span<const std::uint8_t> body, const char* what)
{
    ByteReader in(body, what);
    return in.f64();
}

void writeWsBool(RecordWriter& writer, bool fitToPage)
{
    writer.u16Record(biff::kWsBool, static_cast<std::uint16_t>(kWsBoolDefault | (fitToPage ? kWsBoolFitToPage : 0)));
}

bool parseFitToPage(std::span<const std::uint8_t> body)
{
    ByteReader in(body, "the WSBOOL record");
    return (in.u16() & kWsBoolFitToPage) != 0;
}

IndexPlaceholder writeIndex(RecordWriter& writer, int firstRow, int endRow, std::size_t blocks)
{
    writer.begin(biff::kIndex);
    ByteBuffer& out = writer.out();
    out.u32(0);
    out.u32(static_cast<std::uint32_t>(firstRow));
    out.u32(static_cast<std::uint32_t>(endRow));
    IndexPlaceholder placeholder;
    placeholder.defColWidthAt = writer.offset();
    out.u32(0);
    placeholder.firstDbCellAt = writer.offset();
    out.zeros(4 * blocks);
    writer.end();
    return placeholder;
}

void writeDbCell(RecordWriter& writer, std::size_t firstRowRecordAt, std::span<const std::size_t> firstCellAt)
{
    writer.begin(biff::kDbCell);
    ByteBuffer& out = writer.out();
    out.u32(static_cast<std::uint32_t>(writer.offset() - biff::kRecordHeaderSize - firstRowRecordAt));
    std::size_t from = firstRowRecordAt + kRowRecordSize;
    for (std::size_t at : firstCellAt) {
        out.u16(static_cast<std::uint16_t>(at - from));
        from = at;
    }
    writer.end();
}

} // namespace penmoor::xls
