#include "spreadsheet/xls/xlswriter.h"

#include "spreadsheet/xls/biffrecords.h"
#include "spreadsheet/xls/biffstrings.h"
#include "spreadsheet/xls/cellformats.h"
#include "spreadsheet/xls/compoundfilewriter.h"
#include "spreadsheet/xls/formaterror.h"
#include "spreadsheet/xls/sharedstrings.h"
#include "spreadsheet/xls/sheetwriter.h"
#include "spreadsheet/xls/unicode.h"

namespace penmoor::xls {

namespace {

using namespace engine;

constexpr std::uint16_t kUtf16CodePage = 1200;
constexpr std::uint16_t kFunctionGroups = 14;
constexpr std::size_t kWriteAccessSize = 112;
constexpr std::u16string_view kUserName = u"Penmoor";
// Both scroll bars and the sheet tabs shown; the tab bar takes 60% of the width.
constexpr std::uint16_t kWindow1Flags = 0x0038;
constexpr std::uint16_t kTabRatio = 600;
constexpr std::uint16_t kCountryUnitedStates = 1;
// Readers that cannot take a Workbook stream in the mini stream get one of at least 4096 bytes.
constexpr std::size_t kMinimumStreamSize = 4096;

void writeInterface(RecordWriter& writer)
{
    writer.u16Record(biff::kInterfaceHdr, kUtf16CodePage);
    writer.u16Record(biff::kMms, 0);
    writer.emptyRecord(biff::kInterfaceEnd);
    writer.begin(biff::kWriteAccess);
    writeString(writer.out(), kUserName);
    writer.out().append(std::vector<std::uint8_t>(kWriteAccessSize - 3 - kUserName.size(), ' '));
    writer.end();
    writer.u16Record(biff::kCodePage, kUtf16CodePage);
    writer.u16Record(biff::kDsf, 0);
}

void writeTabIds(RecordWriter& writer, int sheets)
{
    writer.begin(biff::kTabId);
    for (int i = 1; i <= sheets; ++i)
        writer.out().u16(static_cast<std::uint16_t>(i));
    writer.end();
}

void writeProtectionAndWindow(RecordWriter& writer, const Workbook& workbook)
{
    writer.u16Record(biff::kFnGroupCount, kFunctionGroups);
    writer.u16Record(biff::kWindowProtect, 0);
    writer.u16Record(biff::kProtect, 0);
    writer.u16Record(biff::kPassword, 0);
    writer.u16Record(biff::kProt4Rev, 0);
    writer.u16Record(biff::kProt4RevPass, 0);
    writer.begin(biff::kWindow1);
    ByteBuffer& out = writer.out();
    out.u16(0);
    out.u16(0);
    out.u16(16384);
    out.u16(8192);
    out.u16(kWindow1Flags);
    out.u16(static_cast<std::uint16_t>(workbook.activeSheetIndex()));
    out.u16(0); // first tab shown
    out.u16(1); // selected tabs
    out.u16(kTabRatio);
    writer.end();
    writer.u16Record(biff::kBackup, 0);
    writer.u16Record(biff::kHideObj, 0);
    writer.u16Record(biff::kDateMode, 0); // the 1900 date system
    writer.u16Record(biff::kPrecision, 1); // full precision, not as displayed
    writer.u16Record(biff::kRefreshAll, 0);
    writer.u16Record(biff::kBookBool, 0);
}

// SUPBOOK, EXTERNSHEET and one NAME per sheet with a print area.
void writePrintAreas(RecordWriter& writer, const Workbook& workbook)
{
    std::vector<std::uint16_t> sheets;
    for (int index = 0; index < workbook.sheetCount(); ++index) {
        if (workbook.sheet(index).pageSetup().printArea)
            sheets.push_back(static_cast<std::uint16_t>(index));
    }
    if (sheets.empty())
        return;
    writeInternalSupBook(writer, static_cast<std::uint16_t>(workbook.sheetCount()));
    writeExternSheet(writer, sheets);
    for (std::size_t entry = 0; entry < sheets.size(); ++entry) {
        const Region& area = *workbook.sheet(sheets[entry]).pageSetup().printArea;
        writePrintAreaName(writer, sheets[entry], static_cast<std::uint16_t>(entry),
            { area.firstRow - 1, area.lastRow - 1, area.firstColumn - 1, area.lastColumn - 1 });
    }
}

// One pass over every existing cell: the formats the sheets use (sheet, columns, rows and
// cells) and the texts of the shared string table, both in the order the cells come.
void scanWorkbook(const Workbook& workbook, CellFormatTable& formats, SharedStrings& strings)
{
    std::vector<CellSpan> spans;
    for (int index = 0; index < workbook.sheetCount(); ++index) {
        const Sheet& sheet = workbook.sheet(index);
        formats.use(sheet.sheetStyle());
        for (int column = 1; column <= kMaxColumns; ++column) {
            if (const auto style = sheet.columnStyle(column))
                formats.use(*style);
        }
        for (int row = 1; row <= sheet.lastStoredRow(); ++row) {
            const RowData* data = sheet.rowData(row);
            if (!data)
                continue;
            if (data->style)
                formats.use(*data->style);
            sheet.cellSpans(row, spans);
            for (const CellSpan& span : spans) {
                formats.use(span.style);
                const std::string* text = span.content ? std::get_if<std::string>(span.content) : nullptr;
                if (text && strings.strings()[strings.add(*text)].size() > biff::kMaxCellTextLength)
                    throw WriteError("the text in " + columnLetters(span.firstColumn) + std::to_string(row)
                        + " is longer than 32767 characters");
            }
        }
    }
}

} // namespace

std::vector<std::uint8_t> writeWorkbookStream(const Workbook& workbook)
{
    CellFormatTable formats(workbook.styles());
    SharedStrings strings;
    scanWorkbook(workbook, formats, strings);

    ByteBuffer out(1 << 16);
    RecordWriter writer(out);
    writeBof(writer, biff::kBofGlobals);
    writeInterface(writer);
    writeTabIds(writer, workbook.sheetCount());
    writeProtectionAndWindow(writer, workbook);
    formats.write(writer);
    Palette palette {};
    std::copy(workbook.palette().begin(), workbook.palette().end(), palette.begin());
    writePalette(writer, palette);
    writer.u16Record(biff::kUsesElfs, 0);
    std::vector<std::size_t> positions;
    for (int index = 0; index < workbook.sheetCount(); ++index)
        positions.push_back(writeBoundSheet(writer, utf8ToUtf16(workbook.sheet(index).name())));
    writer.begin(biff::kCountry);
    out.u16(kCountryUnitedStates);
    out.u16(kCountryUnitedStates);
    writer.end();
    writePrintAreas(writer, workbook);
    writeSharedStrings(writer, strings);
    writer.emptyRecord(biff::kEof);

    for (int index = 0; index < workbook.sheetCount(); ++index) {
        out.patchU32(positions[static_cast<std::size_t>(index)], static_cast<std::uint32_t>(writer.offset()));
        writeSheet(writer, workbook.sheet(index), formats, strings, index == workbook.activeSheetIndex());
    }
    if (out.size() < kMinimumStreamSize)
        out.zeros(kMinimumStreamSize - out.size());
    return out.take();
}

std::vector<std::uint8_t> writeXls(const Workbook& workbook)
{
    const std::vector<std::uint8_t> stream = writeWorkbookStream(workbook);
    const CompoundStream workbookStream { u"Workbook", stream };
    return writeCompoundFile({ &workbookStream, 1 });
}

} // namespace penmoor::xls
