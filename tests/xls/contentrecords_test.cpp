// Records that carry workbook content: exact bytes where the layout is easy to get subtly wrong
// (checked against files other writers produce), and write-then-parse for the rest.
#include "spreadsheet/xls/biffrecords.h"
#include "spreadsheet/xls/formaterror.h"
#include "spreadsheet/xls/globalsrecords.h"
#include "spreadsheet/xls/recordreader.h"
#include "spreadsheet/xls/rk.h"
#include "spreadsheet/xls/sheetrecords.h"
#include "tests/xls/support/recorddump.h"

#include <cmath>
#include <functional>
#include <limits>

#include <gtest/gtest.h>

namespace penmoor::xls {
namespace {

std::vector<std::uint8_t> written(const std::function<void(RecordWriter&)>& write)
{
    ByteBuffer out;
    RecordWriter writer(out);
    write(writer);
    return out.take();
}

// The body of the only record written.
std::vector<std::uint8_t> body(const std::function<void(RecordWriter&)>& write)
{
    const auto stream = written(write);
    RecordReader records(stream, 0);
    const Record record = records.next();
    EXPECT_TRUE(records.atEnd());
    return { record.body.begin(), record.body.end() };
}

struct ExactCase {
    const char* name;
    std::function<void(RecordWriter&)> write;
    const char* dump;
};

class ExactRecord : public ::testing::TestWithParam<ExactCase> { };

TEST_P(ExactRecord, HasTheBytesOtherReadersExpect)
{
    const auto lines = test::dumpRecords(written(GetParam().write));
    ASSERT_EQ(lines.size(), 1u);
    EXPECT_EQ(lines[0], GetParam().dump);
}

const ExactCase kExactCases[] = {
    { "PrintAreaA1toP53",
        [](RecordWriter& w) {
            writePrintAreaName(w, 0, 0, { 0, 52, 0, 15 });
        },
        "0x0018 27 20 00 00 01 0B 00 00 00 01 00 00 00 00 00 00 06 3B 00 00 00 00 34 00 00 00 0F 00" },
    { "OwnSupBook", [](RecordWriter& w) { writeInternalSupBook(w, 1); }, "0x01AE 4 01 00 01 04" },
    { "ExternSheet", [](RecordWriter& w) { writeExternSheet(w, std::vector<std::uint16_t> { 0 }); },
        "0x0017 8 01 00 00 00 00 00 00 00" },
    { "SelectionC5",
        [](RecordWriter& w) {
            writeSelection(w, 4, 2, std::vector<CellArea> { { 4, 4, 2, 2 } }, 0);
        },
        "0x001D 15 03 04 00 02 00 00 00 01 00 04 00 04 00 02 02" },
    { "GlobalsBof", [](RecordWriter& w) { writeBof(w, biff::kBofGlobals); },
        "0x0809 16 00 06 05 00 BB 0D CC 07 00 00 00 00 06 00 00 00" },
    { "LandscapeA4FitOnePage",
        [](RecordWriter& w) {
            SetupRecord setup;
            setup.landscape = true;
            setup.headerMargin = 0;
            setup.footerMargin = 0;
            writeSetup(w, setup);
        },
        "0x00A1 34 09 00 64 00 01 00 01 00 01 00 00 00 58 02 58 02 00 00 00 00 00 00 00 00 00 00 00 00 00 00 00 00 01 "
        "00" },
    { "WsBoolFitToPage", [](RecordWriter& w) { writeWsBool(w, true); }, "0x0081 2 C1 05" },
    { "RkForADateSerial",
        [](RecordWriter& w) {
            writeNumber(w, { 3, 3, 16 }, 41275);
        },
        "0x027E 10 03 00 03 00 10 00 EE 84 02 00" },
    { "NumberWhenNoRkFits",
        [](RecordWriter& w) {
            writeNumber(w, { 0, 0, 15 }, 1.0 / 3);
        },
        "0x0203 14 00 00 00 00 0F 00 55 55 55 55 55 55 D5 3F" },
    { "RowWithHeightAndFormat",
        [](RecordWriter& w) {
            writeRow(w, { 1, 0, 16, 555, true, false, std::uint16_t { 17 } });
        },
        "0x0208 16 01 00 00 00 10 00 2B 02 00 00 00 00 C0 01 11 00" },
    { "MulBlank",
        [](RecordWriter& w) {
            writeMulBlank(w, 4, 2, std::vector<std::uint16_t> { 16, 17, 16 });
        },
        "0x00BE 12 04 00 02 00 10 00 11 00 10 00 04 00" },
    { "UnfilledXf",
        [](RecordWriter& w) {
            XfRecord xf;
            xf.usedAttributes = 0xFC;
            writeXf(w, xf);
        },
        "0x00E0 20 00 00 00 00 01 00 20 00 00 FC 00 00 00 00 00 00 00 00 C0 20" },
    { "FormulaWithBooleanResult",
        [](RecordWriter& w) {
            writeFormula(w, { 0, 1, 15 }, true, std::vector<std::uint8_t> { 0x1D, 0x01 });
        },
        "0x0006 24 00 00 01 00 0F 00 01 00 01 00 00 00 FF FF 00 00 00 00 00 00 02 00 1D 01" },
};

INSTANTIATE_TEST_SUITE_P(Layouts, ExactRecord, ::testing::ValuesIn(kExactCases),
    [](const auto& test) { return std::string(test.param.name); });

TEST(ContentRecords, FontsAndPaletteComeBack)
{
    FontRecord font { 380, true, true, false, 0, 19, u"Arial Ünicode" };
    EXPECT_EQ(parseFont(body([&](RecordWriter& w) { writeFont(w, font); })), font);

    Palette palette {};
    for (std::size_t i = 0; i < palette.size(); ++i)
        palette[i] = static_cast<std::uint32_t>((0x010203 * i + 0xF00000 * (i % 2)) & 0xFFFFFF);
    const auto paletteBody = body([&](RecordWriter& w) { writePalette(w, palette); });
    EXPECT_EQ(paletteBody.size(), 2u + 56 * 4);
    EXPECT_EQ(parsePalette(paletteBody), palette);
    auto shortPalette = paletteBody;
    shortPalette[0] = 55;
    EXPECT_THROW(parsePalette(shortPalette), FormatError);
}

TEST(ContentRecords, RkKeepsExactlyTheValuesItCanHold)
{
    const double samples[] = { 0, 1, -1, 41275, 536870911, -536870912, 536870912, 0.5, -2.25, 12.34, 0.01, 1e300, -0.0,
        0.1, 1.0 / 3, 123456789.12 };
    for (double value : samples) {
        const auto rk = encodeRk(value);
        if (rk) {
            EXPECT_EQ(decodeRk(*rk), value) << value;
            EXPECT_EQ(std::signbit(decodeRk(*rk)), std::signbit(value)) << value;
        }
    }
    EXPECT_TRUE(encodeRk(12.34).has_value()) << "two decimals fit as hundredths";
    EXPECT_TRUE(encodeRk(0.1).has_value());
    EXPECT_FALSE(encodeRk(1.0 / 3).has_value());
    EXPECT_FALSE(encodeRk(std::numeric_limits<double>::quiet_NaN()).has_value());
    EXPECT_FALSE(encodeRk(std::numeric_limits<double>::infinity()).has_value());
}

TEST(ContentRecords, MergedCellsSplitIntoRecordsOfAtMost1026Areas)
{
    std::vector<CellArea> areas;
    for (int i = 0; i < 2100; ++i)
        areas.push_back({ i, i, 0, 1 });
    const auto stream = written([&](RecordWriter& w) { writeMergedCells(w, areas); });
    RecordReader records(stream, 0);
    std::vector<CellArea> back;
    std::vector<std::size_t> counts;
    while (!records.atEnd()) {
        const auto part = parseMergedCells(records.next().body);
        counts.push_back(part.size());
        back.insert(back.end(), part.begin(), part.end());
    }
    EXPECT_EQ(counts, (std::vector<std::size_t> { 1026, 1026, 48 }));
    EXPECT_EQ(back, areas);
}

TEST(ContentRecords, ParsersRefuseImpossibleAreas)
{
    EXPECT_THROW(parseMergedCells(test::fromHex("01 00 05 00 04 00 00 00 01 00")), FormatError);
    EXPECT_THROW(parseMergedCells(test::fromHex("02 00 05 00 05 00 00 00 01 00")), FormatError);
    EXPECT_THROW(parseSelection(test::fromHex("03 00 00 00 00 00 00 01 00 04 00 03 00 02 02")), FormatError);
    EXPECT_THROW(parseColInfo(test::fromHex("05 00 04 00 24 09 0F 00 00 00 00 00")), FormatError);
    EXPECT_THROW(parseCellHeader(test::fromHex("00 00 00 01 0F 00")), FormatError);
    EXPECT_THROW(parseBof(test::fromHex("00 05 05 00 00 00 00 00")), FormatError) << "BIFF5 is refused";
}

} // namespace
} // namespace penmoor::xls
