// The reader gives back what the writer wrote, and refuses damaged workbooks with a reason.
#include "spreadsheet/xls/biffrecords.h"
#include "spreadsheet/xls/bytereader.h"
#include "spreadsheet/xls/compoundfilewriter.h"
#include "spreadsheet/xls/formaterror.h"
#include "spreadsheet/xls/recordreader.h"
#include "spreadsheet/xls/sheetrecords.h"
#include "spreadsheet/xls/xlsreader.h"
#include "spreadsheet/xls/xlswriter.h"
#include "tests/xls/support/cfbtestfiles.h"
#include "tests/xls/support/sampleworkbooks.h"
#include "tests/xls/support/workbookcompare.h"

#include <functional>
#include <random>

#include <gtest/gtest.h>

namespace penmoor::xls {
namespace {

using namespace engine;

Workbook sampleBook()
{
    Workbook book = test::cashFlowSample();
    test::addOddsAndEnds(book);
    book.setActiveSheet(1);
    return book;
}

TEST(XlsReader, GivesBackWhatWasWritten)
{
    const Workbook back = readXls(writeXls(sampleBook()));
    // A reference off the sheet is stored as a reference error, which reads back as #REF!.
    Workbook expected = sampleBook();
    expected.sheet(1).setContent({ 3, 5 }, Formula { { ErrorToken { xl::ErrorValue::Ref } }, xl::ErrorValue::Ref });
    EXPECT_EQ(test::workbookDifferences(expected, back), "");
    EXPECT_EQ(writeXls(back), writeXls(expected)) << "a workbook read and written again gives the same bytes";
}

TEST(XlsReader, GivesBackALargeSheet)
{
    const Workbook book = test::largeSample(2000, 40);
    const Workbook back = readXls(writeXls(book));
    EXPECT_EQ(test::workbookDifferences(book, back), "");
}

TEST(XlsReader, KeepsTheFormulasItCannotExpressAsTheirResults)
{
    Workbook book;
    Sheet& sheet = book.addSheet("S");
    sheet.setContent({ 1, 1 }, Formula { { NameToken { "Total" } }, xl::ErrorValue::Name });
    const Workbook back = readXls(writeXls(book));
    const Formula* formula = std::get_if<Formula>(back.sheet(0).content({ 1, 1 }));
    ASSERT_NE(formula, nullptr);
    EXPECT_EQ(formula->tokens, (TokenArray { ErrorToken { xl::ErrorValue::Name } }));
    EXPECT_EQ(formula->cachedValue, xl::Value { xl::ErrorValue::Name });
}

// The Workbook stream of the sample, damaged by a change to one record, in a compound file.
struct Damage {
    const char* name;
    std::function<void(std::vector<std::uint8_t>&)> apply;
    const char* reason;
};

std::vector<std::uint8_t> wrap(const std::vector<std::uint8_t>& stream, const std::u16string& name = u"Workbook")
{
    const CompoundStream workbook { name, stream };
    return writeCompoundFile({ &workbook, 1 });
}

// The offset of the body of the n-th record of a type (0-based).
std::size_t bodyOf(const std::vector<std::uint8_t>& stream, std::uint16_t type, int n = 0)
{
    RecordReader records(stream, 0);
    while (!records.atEnd() && records.peekType() != 0) {
        const Record record = records.next();
        if (record.type == type && n-- == 0)
            return record.offset + biff::kRecordHeaderSize;
    }
    ADD_FAILURE() << "no record of type " << type;
    return 0;
}

class DamagedWorkbook : public ::testing::TestWithParam<Damage> { };

TEST_P(DamagedWorkbook, IsRefusedWithItsReason)
{
    auto stream = writeWorkbookStream(sampleBook());
    ASSERT_NO_THROW(readXls(wrap(stream)));
    GetParam().apply(stream);
    try {
        readXls(wrap(stream));
        FAIL() << "a damaged workbook was read";
    } catch (const FormatError& error) {
        EXPECT_NE(std::string(error.what()).find(GetParam().reason), std::string::npos) << error.what();
    }
}

using test::putU16;
using test::putU32;

const Damage kDamages[] = {
    { "SheetOffsetOutside", [](auto& s) { putU32(s, bodyOf(s, biff::kBoundSheet), 0x7FFFFFF0); }, "beyond the end" },
    { "SheetOffsetNotAtBof", [](auto& s) { putU32(s, bodyOf(s, biff::kBoundSheet), 4); }, "BOF" },
    { "TwoSheetsOneOffset",
        [](auto& s) { putU32(s, bodyOf(s, biff::kBoundSheet, 1), loadU32(&s[bodyOf(s, biff::kBoundSheet)])); },
        "same position" },
    { "RecordRunsPastTheEnd", [](auto& s) { s.resize(bodyOf(s, biff::kSst) + 20); }, "runs past the end" },
    { "OlderFormat", [](auto& s) { putU16(s, 4, 0x0500); }, "older Excel format" },
    { "StringIndexOutside", [](auto& s) { putU32(s, bodyOf(s, biff::kLabelSst) + 6, 100000); }, "shared string" },
    { "FormatIndexOutside", [](auto& s) { putU16(s, bodyOf(s, biff::kLabelSst) + 4, 5000); }, "format 5000" },
    { "MissingFont", [](auto& s) { putU16(s, bodyOf(s, biff::kXf, 16), 4); }, "font 4" },
    { "MulBlankLengthLies", [](auto& s) { putU16(s, bodyOf(s, biff::kMulBlank) + 2, 250); }, "MULBLANK" },
    { "SstCountLies", [](auto& s) { putU32(s, bodyOf(s, biff::kSst) + 4, 1000000); }, "fewer strings" },
    { "PaletteSizeLies", [](auto& s) { putU16(s, bodyOf(s, biff::kPalette), 57); }, "57 colours" },
    { "GlobalsWithoutEof", [](auto& s) { s.resize(bodyOf(s, biff::kEof) - biff::kRecordHeaderSize); }, "EOF" },
    { "SheetWithoutEof", [](auto& s) { s.resize(bodyOf(s, biff::kWindow2, 1) - biff::kRecordHeaderSize); }, "EOF" },
    { "InvertedMergedArea", [](auto& s) { putU16(s, bodyOf(s, biff::kMergedCells) + 2, 9); }, "inverted" },
    { "OverlappingMergedAreas",
        [](auto& s) {
            // The sample's one merged area E2:G2, turned into two that share F2.
            const std::size_t at = bodyOf(s, biff::kMergedCells);
            putU16(s, at - 2, 18);
            putU16(s, at, 2);
            const std::vector<std::uint8_t> second { 1, 0, 1, 0, 5, 0, 5, 0 };
            s.insert(s.begin() + static_cast<std::ptrdiff_t>(at + 10), second.begin(), second.end());
            // The second sheet now starts 8 bytes later.
            const std::size_t position = bodyOf(s, biff::kBoundSheet, 1);
            putU32(s, position, loadU32(&s[position]) + 8);
        },
        "overlap" },
    { "CellBeyondColumnIV", [](auto& s) { putU16(s, bodyOf(s, biff::kLabelSst) + 2, 300); }, "column IV" },
};

INSTANTIATE_TEST_SUITE_P(Faults, DamagedWorkbook, ::testing::ValuesIn(kDamages),
    [](const auto& test) { return std::string(test.param.name); });

TEST(XlsReader, RefusesContainersWithoutAWorkbook)
{
    const std::vector<std::uint8_t> text { 'h', 'e', 'l', 'l', 'o' };
    try {
        readXls(wrap(text, u"Book"));
        FAIL();
    } catch (const FormatError& error) {
        EXPECT_NE(std::string(error.what()).find("Excel 5 or 95"), std::string::npos) << error.what();
    }
    EXPECT_THROW(readXls(wrap(text, u"Other")), FormatError);
    EXPECT_THROW(readXls(wrap(text)), FormatError);
    EXPECT_THROW(readXls(text), FormatError);
}

// Random damage to the records: the reader reads the result or refuses it, never more.
TEST(XlsReader, RandomDamageIsReadOrRefused)
{
    const auto stream = writeWorkbookStream(sampleBook());
    std::mt19937 random(41275);
    std::uniform_int_distribution<std::size_t> where(0, stream.size() - 1);
    std::uniform_int_distribution<int> value(0, 255);
    int refused = 0;
    for (int round = 0; round < 400; ++round) {
        auto damaged = stream;
        for (int k = 0; k < 1 + round % 8; ++k)
            damaged[where(random)] = static_cast<std::uint8_t>(value(random));
        try {
            (void)readXls(wrap(damaged));
        } catch (const FormatError&) {
            ++refused;
        }
    }
    EXPECT_GT(refused, 0);
}

} // namespace
} // namespace penmoor::xls
