// Our files read by someone else: python3-xlrd reads the content and formatting the model holds,
// Gnumeric and LibreOffice recalculate every formula to the value the model cached, LibreOffice
// reads the page setup, and our reader reads what LibreOffice saves.
#include "spreadsheet/formula/valuetext.h"
#include "spreadsheet/xls/biffrecords.h"
#include "spreadsheet/xls/compoundfilewriter.h"
#include "spreadsheet/xls/recordreader.h"
#include "spreadsheet/xls/sheetrecords.h"
#include "spreadsheet/xls/xlsreader.h"
#include "spreadsheet/xls/xlswriter.h"
#include "tests/xls/support/expecteddump.h"
#include "tests/xls/support/files.h"
#include "tests/xls/support/readers.h"
#include "tests/xls/support/sampleworkbooks.h"
#include "tests/xls/support/tempdir.h"

#include <chrono>
#include <cmath>
#include <cstdio>
#include <cstring>
#include <fstream>
#include <functional>
#include <iterator>
#include <map>
#include <sstream>

#include <gtest/gtest.h>

namespace penmoor::xls {
namespace {

using namespace engine;

Workbook sampleBook()
{
    Workbook book = test::cashFlowSample();
    test::addOddsAndEnds(book);
    return book;
}

std::filesystem::path saveBytes(
    const test::TempDir& folder, const std::vector<std::uint8_t>& bytes, const std::string& name)
{
    const auto path = folder.file(name);
    test::writeFile(path, bytes);
    return path;
}

std::filesystem::path saveSample(const test::TempDir& folder, const Workbook& book, const std::string& name)
{
    return saveBytes(folder, writeXls(book), name);
}

// The sample saved with a wrong cached result in C7 of the first sheet (999 where the formula
// gives 350), for readers that must compute every formula themselves rather than show ours.
std::filesystem::path saveWithWrongCachedResult(const test::TempDir& folder, const Workbook& book)
{
    auto stream = writeWorkbookStream(book);
    RecordReader records(stream, 0);
    bool patched = false;
    while (!patched && !records.atEnd() && records.peekType() != 0) {
        const Record record = records.next();
        if (record.type != biff::kFormula)
            continue;
        const CellHeader cell = parseCellHeader(record.body);
        if (cell.row == 6 && cell.column == 2) {
            const double wrong = 999;
            EXPECT_EQ(std::get<Formula>(*book.sheet(0).content({ 7, 3 })).cachedValue, xl::Value { 350.0 });
            // Little-endian hosts only, as in CI.
            std::memcpy(stream.data() + record.offset + biff::kRecordHeaderSize + 6, &wrong, sizeof wrong);
            patched = true;
        }
    }
    EXPECT_TRUE(patched);
    const CompoundStream workbook { u"Workbook", stream };
    return saveBytes(folder, writeCompoundFile({ &workbook, 1 }), "patched.xls");
}

// Calls visit(sheet index, position, cached value) for every formula of the workbook.
void forEachFormula(const Workbook& book, const std::function<void(int, CellPosition, const xl::Value&)>& visit)
{
    for (int index = 0; index < book.sheetCount(); ++index) {
        book.sheet(index).forEachContent(Region::wholeSheet(), [&](CellPosition position, const CellContent& content) {
            if (const Formula* formula = std::get_if<Formula>(&content))
                visit(index, position, formula->cachedValue);
        });
    }
}

std::string cellName(CellPosition position)
{
    return columnLetters(position.column) + std::to_string(position.row);
}

// The fields of CSV text: rows of fields, quotes removed.
std::vector<std::vector<std::string>> parseCsv(const std::string& text)
{
    std::vector<std::vector<std::string>> rows(1);
    std::string field;
    bool quoted = false;
    for (std::size_t i = 0; i < text.size(); ++i) {
        const char c = text[i];
        if (quoted) {
            if (c == '"' && i + 1 < text.size() && text[i + 1] == '"') {
                field += '"';
                ++i;
            } else if (c == '"') {
                quoted = false;
            } else {
                field += c;
            }
        } else if (c == '"') {
            quoted = true;
        } else if (c == ',') {
            rows.back().push_back(field);
            field.clear();
        } else if (c == '\n') {
            rows.back().push_back(field);
            field.clear();
            rows.emplace_back();
        } else if (c != '\r') {
            field += c;
        }
    }
    if (!field.empty() || !rows.back().empty())
        rows.back().push_back(field);
    return rows;
}

bool sameNumber(double expected, const std::string& text)
{
    char* end = nullptr;
    const double actual = std::strtod(text.c_str(), &end);
    return end != text.c_str() && *end == '\0'
        && std::abs(actual - expected) <= 1e-12 * std::max(1.0, std::abs(expected));
}

// Where Gnumeric's CSV export starts: the first row and column that hold content.
CellPosition contentOrigin(const Sheet& sheet)
{
    CellPosition origin { kMaxRows, kMaxColumns };
    sheet.forEachContent(Region::wholeSheet(), [&](CellPosition position, const CellContent&) {
        origin.row = std::min(origin.row, position.row);
        origin.column = std::min(origin.column, position.column);
    });
    return origin;
}

TEST(XlsInterop, XlrdReadsWhatTheModelHolds)
{
    PENMOOR_NEED_READER(test::hasPythonModule("xlrd"), "python3-xlrd");
    test::TempDir folder;
    const Workbook book = sampleBook();
    const auto path = saveSample(folder, book, "sample.xls");
    const auto actual = test::lines(test::runPythonScript("xlrd_dump.py", { path.string() }));
    const auto expected = test::expectedXlrdDump(book);
    EXPECT_EQ(test::lineDifferences(expected, actual), "");
}

// Gnumeric recalculates every formula from our tokens; each result must equal the one the model
// cached, including C7, whose cached result in the file is wrong on purpose.
TEST(XlsInterop, GnumericRecalculatesToTheCachedResults)
{
    PENMOOR_NEED_READER(test::hasProgram("ssconvert"), "ssconvert (gnumeric)");
    test::TempDir folder;
    const Workbook book = sampleBook();
    const auto path = saveWithWrongCachedResult(folder, book);
    const auto pattern = folder.file("sheet%n.csv").string();
    const auto result = test::runCommand({ "ssconvert", "--recalc", "-S", "--export-type=Gnumeric_stf:stf_assistant",
        "-O", "separator=, format=raw quoting-mode=auto", path.string(), pattern });
    ASSERT_EQ(result.exitCode, 0) << result.errors;
    std::vector<std::vector<std::vector<std::string>>> sheets;
    std::vector<CellPosition> origins;
    for (int index = 0; index < book.sheetCount(); ++index) {
        std::ifstream in(folder.file("sheet" + std::to_string(index) + ".csv"));
        std::ostringstream text;
        text << in.rdbuf();
        sheets.push_back(parseCsv(text.str()));
        origins.push_back(contentOrigin(book.sheet(index)));
    }
    int checked = 0;
    forEachFormula(book, [&](int index, CellPosition position, const xl::Value& cached) {
        const auto& rows = sheets[static_cast<std::size_t>(index)];
        const auto row = static_cast<std::size_t>(position.row - origins[static_cast<std::size_t>(index)].row);
        const auto column = static_cast<std::size_t>(position.column - origins[static_cast<std::size_t>(index)].column);
        const std::string shown = row < rows.size() && column < rows[row].size() ? rows[row][column] : "";
        const std::string where = "sheet " + std::to_string(index) + " " + cellName(position);
        if (const double* number = std::get_if<double>(&cached)) {
            EXPECT_TRUE(sameNumber(*number, shown)) << where << ": cached " << *number << ", Gnumeric " << shown;
        } else if (const std::string* text = std::get_if<std::string>(&cached)) {
            EXPECT_EQ(shown, *text) << where;
        } else if (const bool* flag = std::get_if<bool>(&cached)) {
            EXPECT_EQ(shown, *flag ? "TRUE" : "FALSE") << where;
        } else if (const xl::ErrorValue* error = std::get_if<xl::ErrorValue>(&cached)) {
            EXPECT_EQ(shown, engine::errorText(*error)) << where;
        }
        ++checked;
    });
    EXPECT_EQ(checked, 14);
}

// "1900-03-01" style text of a 1900-system date serial (valid from March 1900 on).
std::string isoDate(double serial)
{
    using namespace std::chrono;
    const year_month_day date { sys_days { 1899y / December / 30 } + days { static_cast<int>(serial) } };
    char text[16];
    std::snprintf(text, sizeof text, "%04d-%02u-%02u", static_cast<int>(date.year()),
        static_cast<unsigned>(date.month()), static_cast<unsigned>(date.day()));
    return text;
}

std::string inches(double value)
{
    char text[32];
    std::snprintf(text, sizeof text, "%gin", value);
    return text;
}

// What lo_fods_dump.py prints for a sheet's page: orientation, paper, margins and scaling, in
// LibreOffice's own units.
std::string expectedPage(int index, const PageSetup& page)
{
    const bool landscape = page.orientation == Orientation::Landscape;
    std::string width = page.paperSize == 9 ? "8.2681in" : "8.5in";
    std::string height = page.paperSize == 9 ? "11.6929in" : "11in";
    if (landscape)
        std::swap(width, height);
    std::string line = "page " + std::to_string(index) + " margin-bottom=" + inches(page.bottomMarginInches)
        + " margin-left=" + inches(page.leftMarginInches) + " margin-right=" + inches(page.rightMarginInches)
        + " margin-top=" + inches(page.topMarginInches) + " page-height=" + height + " page-width=" + width
        + " print-orientation=" + (landscape ? "landscape" : "portrait");
    if (page.zoomPercent)
        line += " scale-to=" + std::to_string(*page.zoomPercent) + "%";
    else
        line += " scale-to-X=" + std::to_string(page.fitToPagesWide)
            + " scale-to-Y=" + std::to_string(page.fitToPagesTall);
    return line;
}

std::vector<std::string> libreOfficeDump(const test::TempDir& folder, const std::filesystem::path& file)
{
    const auto converted = test::convertWithLibreOffice(file, "fods", folder.path());
    if (converted.empty())
        return {};
    return test::lines(test::runPythonScript("lo_fods_dump.py", { converted.string() }));
}

// The numbers LibreOffice shows for the formula cells, by "sheet row column".
std::map<std::string, std::string> shownNumbers(const std::vector<std::string>& dump)
{
    std::map<std::string, std::string> numbers;
    for (const std::string& line : dump) {
        std::istringstream in(line);
        std::string kind, sheet, row, column, type, value;
        in >> kind >> sheet >> row >> column >> type >> value;
        if (kind == "value" && (type == "float" || type == "date"))
            numbers[sheet + " " + row + " " + column] = value;
    }
    return numbers;
}

TEST(XlsInterop, LibreOfficeReadsThePageSetupAndRecalculates)
{
    PENMOOR_NEED_READER(test::hasProgram("soffice"), "LibreOffice (libreoffice-calc-nogui)");
    test::TempDir folder;
    const Workbook book = sampleBook();
    // LibreOffice must compute the results itself, not show ours: C7's cached result is wrong.
    const auto dump = libreOfficeDump(folder, saveWithWrongCachedResult(folder, book));
    for (int index = 0; index < book.sheetCount(); ++index) {
        const std::string expected = expectedPage(index, book.sheet(index).pageSetup());
        // Properties sorted by name, as the script prints them.
        std::istringstream words(expected);
        std::vector<std::string> fields(std::istream_iterator<std::string> { words }, {});
        std::sort(fields.begin() + 2, fields.end());
        std::string sorted;
        for (const std::string& field : fields)
            sorted += (sorted.empty() ? "" : " ") + field;
        EXPECT_NE(std::find(dump.begin(), dump.end(), sorted), dump.end()) << "missing: " << sorted;
    }
    const auto numbers = shownNumbers(dump);
    forEachFormula(book, [&](int index, CellPosition position, const xl::Value& cached) {
        const double* number = std::get_if<double>(&cached);
        if (!number)
            return;
        const std::string key = std::to_string(index) + " " + std::to_string(position.row - 1) + " "
            + std::to_string(position.column - 1);
        const auto it = numbers.find(key);
        ASSERT_NE(it, numbers.end()) << "LibreOffice shows no number at " << cellName(position);
        if (it->second.find('-') != std::string::npos && it->second.size() == 10)
            EXPECT_EQ(it->second, isoDate(*number)) << cellName(position);
        else
            EXPECT_TRUE(sameNumber(*number, it->second)) << cellName(position) << ": " << it->second;
    });
}

// Our reader on a workbook LibreOffice saved from ours: its own record choices (formulas for
// constants, shared formulas, its palette, its spelling of number formats) read back to the
// same contents, formats, merges and page.
TEST(XlsInterop, ReadsWhatLibreOfficeSavesFromOurWorkbook)
{
    PENMOOR_NEED_READER(test::hasProgram("soffice"), "LibreOffice (libreoffice-calc-nogui)");
    test::TempDir folder;
    test::TempDir resaved;
    const Workbook book = sampleBook();
    const auto converted = test::convertWithLibreOffice(saveSample(folder, book, "sample.xls"), "xls", resaved.path());
    ASSERT_FALSE(converted.empty());
    const Workbook back = readXls(test::readFile(converted));
    ASSERT_EQ(back.sheetCount(), book.sheetCount());
    for (int index = 0; index < book.sheetCount(); ++index) {
        const Sheet& want = book.sheet(index);
        const Sheet& got = back.sheet(index);
        EXPECT_EQ(got.name(), want.name());
        want.forEachContent(Region::wholeSheet(), [&](CellPosition position, const CellContent& content) {
            const CellContent* read = got.content(position);
            ASSERT_NE(read, nullptr) << cellName(position);
            if (std::holds_alternative<Formula>(content)) {
                // LibreOffice caches text and boolean results as numbers; the tokens must decode.
                EXPECT_TRUE(std::holds_alternative<Formula>(*read)) << cellName(position);
            } else if (const Formula* formula = std::get_if<Formula>(read)) {
                // Constants it writes as formulas keep their value as the result.
                EXPECT_EQ(formula->cachedValue.index(), content.index()) << cellName(position);
            } else {
                EXPECT_EQ(*read, content) << cellName(position);
            }
            // What the cell shows, number format aside (LibreOffice spells it its own way).
            CellStyle wantStyle = book.styles().style(want.effectiveStyle(position));
            CellStyle gotStyle = back.styles().style(got.effectiveStyle(position));
            // Colours by what they show: LibreOffice arranges the palette its own way.
            const auto shown
                = [](const Workbook& b, std::uint8_t colour) { return colour ? b.color(colour) : 0xFFFFFFFFu; };
            EXPECT_EQ(shown(back, gotStyle.font.colorIndex), shown(book, wantStyle.font.colorIndex))
                << cellName(position);
            gotStyle.font.colorIndex = wantStyle.font.colorIndex;
            EXPECT_EQ(gotStyle.font, wantStyle.font) << cellName(position);
            EXPECT_EQ(gotStyle.horizontal, wantStyle.horizontal) << cellName(position);
            EXPECT_EQ(gotStyle.wrapText, wantStyle.wrapText) << cellName(position);
            EXPECT_EQ(shown(back, gotStyle.fillColorIndex), shown(book, wantStyle.fillColorIndex))
                << cellName(position);
            for (std::size_t side = 0; side < 4; ++side)
                EXPECT_EQ(gotStyle.edges[side].line, wantStyle.edges[side].line) << cellName(position);
        });
        std::vector<Region> wantMerged = want.mergedAreas();
        EXPECT_EQ(got.mergedAreas(), wantMerged);
        const PageSetup& page = want.pageSetup();
        const PageSetup& gotPage = got.pageSetup();
        EXPECT_EQ(gotPage.printArea, page.printArea);
        EXPECT_EQ(gotPage.orientation, page.orientation);
        EXPECT_EQ(gotPage.paperSize, page.paperSize);
        EXPECT_EQ(gotPage.zoomPercent, page.zoomPercent);
        EXPECT_DOUBLE_EQ(gotPage.leftMarginInches, page.leftMarginInches);
        EXPECT_DOUBLE_EQ(gotPage.topMarginInches, page.topMarginInches);
        for (int column = 1; column <= 12; ++column)
            EXPECT_NEAR(got.effectiveColumnWidth(column), want.effectiveColumnWidth(column), 0.02) << column;
        for (int row = 1; row <= 8; ++row)
            EXPECT_NEAR(got.effectiveRowHeight(row), want.effectiveRowHeight(row), 0.05) << row;
    }
}

} // namespace
} // namespace penmoor::xls
