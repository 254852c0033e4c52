// The workbook writer seen from the records it writes: the offsets that tie the stream
// together, the cell table's order and index, token bytes of the cash-flow formulas, and the
// limits of the format refused with a reason.
#include "spreadsheet/workbook/formatting.h"
#include "spreadsheet/xls/biffrecords.h"
#include "spreadsheet/xls/bytereader.h"
#include "spreadsheet/xls/compoundfilereader.h"
#include "spreadsheet/xls/formaterror.h"
#include "spreadsheet/xls/formulatokens.h"
#include "spreadsheet/xls/globalsrecords.h"
#include "spreadsheet/xls/recordreader.h"
#include "spreadsheet/xls/sheetrecords.h"
#include "spreadsheet/xls/xlswriter.h"
#include "tests/xls/support/recorddump.h"
#include "tests/xls/support/sampleworkbooks.h"

#include <map>

#include <gtest/gtest.h>

namespace penmoor::xls {
namespace {

using namespace engine;

std::vector<Record> records(const std::vector<std::uint8_t>& stream, std::size_t from = 0)
{
    std::vector<Record> result;
    RecordReader reader(stream, from);
    while (!reader.atEnd()) {
        if (reader.peekType() == 0)
            break; // the padding after the last EOF
        result.push_back(reader.next());
        if (result.back().type == biff::kEof && from != 0)
            break;
    }
    return result;
}

Workbook twoSheets()
{
    Workbook book = test::cashFlowSample();
    test::addOddsAndEnds(book);
    return book;
}

TEST(XlsWriter, StreamHangsTogether)
{
    const Workbook book = twoSheets();
    const auto stream = writeWorkbookStream(book);
    EXPECT_EQ(writeWorkbookStream(book), stream) << "the same workbook gives the same bytes";
    EXPECT_GE(stream.size(), 4096u);

    std::vector<BoundSheetRecord> sheets;
    for (const Record& record : records(stream)) {
        EXPECT_LE(record.body.size(), biff::kMaxRecordBody);
        if (record.type == biff::kBoundSheet)
            sheets.push_back(parseBoundSheet(record.body));
    }
    ASSERT_EQ(sheets.size(), 2u);
    EXPECT_EQ(sheets[0].name, u"CashFlow");
    EXPECT_EQ(sheets[1].name, u"Odds & Ends");
    for (const BoundSheetRecord& sheet : sheets) {
        RecordReader at(stream, sheet.position);
        const Record bof = at.next();
        ASSERT_EQ(bof.type, biff::kBof);
        EXPECT_EQ(parseBof(bof.body), biff::kBofWorksheet);
    }

    // The compound file holds exactly that stream.
    const auto file = writeXls(book);
    const CompoundFileReader container(file);
    ASSERT_EQ(container.entries().size(), 1u);
    EXPECT_EQ(container.readStream(u"Workbook"), stream);
}

// INDEX points at DEFCOLWIDTH and at each DBCELL; each DBCELL points back at its first ROW
// record and at the first cell of each of its rows, in row order.
TEST(XlsWriter, CellTableIsIndexed)
{
    Workbook book = test::largeSample(100, 5);
    const auto stream = writeWorkbookStream(book);
    std::size_t sheetAt = 0;
    for (const Record& record : records(stream)) {
        if (record.type == biff::kBoundSheet)
            sheetAt = parseBoundSheet(record.body).position;
    }
    const auto sheet = records(stream, sheetAt);
    ASSERT_GE(sheet.size(), 2u);
    ASSERT_EQ(sheet[1].type, biff::kIndex);
    ByteReader index(sheet[1].body, "INDEX");
    index.u32();
    EXPECT_EQ(index.u32(), 0u);
    EXPECT_EQ(index.u32(), 100u);
    std::map<std::size_t, Record> byOffset;
    for (const Record& record : sheet)
        byOffset[record.offset] = record;
    EXPECT_EQ(byOffset.at(index.u32()).type, biff::kDefColWidth);
    int blocks = 0;
    while (index.remaining() > 0) {
        const Record dbCell = byOffset.at(index.u32());
        ASSERT_EQ(dbCell.type, biff::kDbCell);
        ByteReader cells(dbCell.body, "DBCELL");
        const std::size_t firstRowAt = dbCell.offset - cells.u32();
        const Record firstRow = byOffset.at(firstRowAt);
        ASSERT_EQ(firstRow.type, biff::kRow);
        std::size_t at = firstRowAt + kRowRecordSize;
        for (int row = 0; cells.remaining() > 0; ++row) {
            at += cells.u16();
            const CellHeader cell = parseCellHeader(byOffset.at(at).body);
            EXPECT_EQ(cell.row, blocks * 32 + row);
            EXPECT_EQ(cell.column, 0);
        }
        ++blocks;
    }
    EXPECT_EQ(blocks, 4);
}

TEST(XlsWriter, DimensionsCoverEveryCellRecord)
{
    const auto stream = writeWorkbookStream(test::cashFlowSample());
    bool found = false;
    for (const Record& record : records(stream)) {
        if (record.type == biff::kDimensions) {
            // Rows 2 to 9 (the "#,##0" block reaches row 9), columns B to G.
            EXPECT_EQ(test::hex(record.body), "01 00 00 00 09 00 00 00 01 00 07 00 00 00");
            found = true;
        }
    }
    EXPECT_TRUE(found);
}

std::string formulaBytes(const Workbook& book, int row, int column)
{
    const Formula* formula = std::get_if<Formula>(book.sheet(0).content({ row, column }));
    EXPECT_NE(formula, nullptr);
    const auto bytes = encodeFormula(formula->tokens, { row, column });
    return bytes ? test::hex(*bytes) : "none";
}

TEST(XlsWriter, FormulaTokensAsOtherWritersWriteThem)
{
    const Workbook book = test::cashFlowSample();
    // =DATE(YEAR(RC[-1]),MONTH(RC[-1])+1,1) in E4: references to D4, value class, relative.
    EXPECT_EQ(
        formulaBytes(book, 4, 5), "44 03 00 03 C0 41 45 00 44 03 00 03 C0 41 44 00 1E 01 00 03 1E 01 00 41 41 00");
    // =R[-2]C+R[-1]C in C7.
    EXPECT_EQ(formulaBytes(book, 7, 3), "44 04 00 02 C0 44 05 00 02 C0 03");
    // =SUM(RC[-4]:RC[-1]) in G5: the area is a reference-class operand of SUM.
    EXPECT_EQ(formulaBytes(book, 5, 7), "25 04 00 04 00 02 C0 05 C0 42 01 04 00");
}

TEST(XlsWriter, FormulaEdgesOfTheSheet)
{
    // A relative reference off the sheet becomes a reference error; an absolute one stays.
    const TokenArray above { ReferenceToken { { { -1, true }, { 0, true } } } };
    EXPECT_EQ(test::hex(*encodeFormula(above, { 1, 1 })), "4A 00 00 00 00");
    const TokenArray absolute { ReferenceToken { { { 65536, false }, { 256, false } } } };
    EXPECT_EQ(test::hex(*encodeFormula(absolute, { 1, 1 })), "44 FF FF FF 00");
    const TokenArray right { AreaToken { { { 0, true }, { 0, true } }, { { 0, true }, { 1, true } } },
        FunctionToken { 4, 1, {} } };
    EXPECT_EQ(test::hex(*encodeFormula(right, { 1, 256 })), "2B 00 00 00 00 00 00 00 00 42 01 04 00");
    EXPECT_FALSE(encodeFormula({ NameToken { "Total" } }, { 1, 1 }).has_value());
    EXPECT_FALSE(encodeFormula({ NumberToken { 1 }, FunctionToken { kUnknownFunctionIndex, 1, "MYFUNC" } }, { 1, 1 })
                     .has_value());
    EXPECT_THROW(encodeFormula({ StringToken { std::string(256, 'x') } }, { 1, 1 }), WriteError);
    EXPECT_THROW(encodeFormula({ OperatorToken { Operator::Add } }, { 1, 1 }), WriteError);
}

TEST(XlsWriter, RefusesWhatTheFormatCannotHold)
{
    Workbook longText;
    longText.addSheet("S").setContent({ 3, 2 }, std::string(32768, 'x'));
    try {
        writeWorkbookStream(longText);
        FAIL() << "a text over 32767 characters was written";
    } catch (const WriteError& error) {
        EXPECT_NE(std::string(error.what()).find("B3"), std::string::npos) << error.what();
    }

    // 4001 formats from fills, alignments, wrap and a left edge, with one font and one number format.
    Workbook manyFormats;
    Sheet& sheet = manyFormats.addSheet("S");
    for (int i = 0; i < 4001; ++i) {
        CellStyle style;
        style.fillColorIndex = static_cast<std::uint8_t>(1 + i % 56);
        style.horizontal = static_cast<HorizontalAlignment>((i / 56) % 4);
        style.vertical = static_cast<VerticalAlignment>((i / 224) % 3);
        style.wrapText = (i / 672) % 2 != 0;
        style.edge(EdgeSide::Left).line = static_cast<LineStyle>((i / 1344) % 5);
        sheet.setCellStyle({ 1 + i / 200, 1 + i % 200 }, manyFormats.styles().intern(style));
    }
    try {
        writeWorkbookStream(manyFormats);
        FAIL() << "4001 cell formats were written";
    } catch (const WriteError& error) {
        EXPECT_NE(std::string(error.what()).find("4000"), std::string::npos) << error.what();
    }
}

} // namespace
} // namespace penmoor::xls
