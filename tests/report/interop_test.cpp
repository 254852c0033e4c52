// The built workbook saved as .xls and opened by independent readers: xlrd reads the cells and
// formats the sheet shows, LibreOffice recalculates every formula from the file and must arrive
// at the cash-flow statement's totals.
#include "report/columnletters.h"
#include "tests/report/cashflowstatement.h"
#include "tests/report/sheetbuild.h"
#include "tests/xls/support/readers.h"
#include "tests/xls/support/tempdir.h"

#include <cstdio>
#include <filesystem>
#include <functional>
#include <map>
#include <sstream>
#include <string>
#include <vector>

#include <gtest/gtest.h>

namespace penmoor::test {
namespace {

using xls::test::TempDir;

std::string hexOf(const std::string& text)
{
    std::string hex;
    for (const unsigned char c : text) {
        char digits[3];
        std::snprintf(digits, sizeof digits, "%02x", c);
        hex += digits;
    }
    return hex.empty() ? "-" : hex;
}

// A built sheet with numbers typed into every entry cell, saved as .xls, with the totals the
// statement expects.
struct SavedSheet {
    SheetBuild sheet;
    TempDir folder;
    std::filesystem::path file = folder.file("cashflow.xls");
    std::vector<ExpectedTotal> totals;

    SavedSheet(const std::function<void(SheetBuild&)>& setUp, int lastColumn)
    {
        setUp(sheet);
        sheet.build();
        CashFlowStatement statement(sheet.options, lastColumn);
        statement.typeEntries(*sheet.app);
        totals = statement.expectedTotals();
        sheet.app->ActiveWorkbook()->SaveAs(file.string());
    }
};

void defaultMonths(SheetBuild& sheet)
{
    sheet.byMonth("2031", "2031");
    sheet.company("Bäckerei Penrose & Söhne");
    sheet.options.InsertItem("=1+1", 4); // labels that must stay text in the file
    sheet.options.InsertItem("10%", 5);
}

// xlrd's facts by their first words: "cell 0 4 1" -> "text 43617368...", "row 0 5" -> "...".
std::map<std::string, std::string> xlrdFacts(const std::filesystem::path& file)
{
    std::map<std::string, std::string> facts;
    for (const std::string& line : xls::test::lines(xls::test::runPythonScript("xlrd_dump.py", { file.string() }))) {
        std::istringstream words(line);
        std::string kind;
        words >> kind;
        // The words that name the fact: sheet, row and column of a cell; sheet and row of a row.
        const std::map<std::string, int> keyWordCounts
            = { { "cell", 3 }, { "format", 3 }, { "row", 2 }, { "column", 2 } };
        const auto counted = keyWordCounts.find(kind);
        int keyWords = counted == keyWordCounts.end() ? 1 : counted->second;
        std::string key = kind;
        for (std::string word; keyWords > 0 && words >> word; --keyWords) {
            key += " " + word;
        }
        std::string rest;
        std::getline(words, rest);
        facts[key] = rest.empty() ? rest : rest.substr(1);
    }
    return facts;
}

std::string cellKey(const char* kind, int row, int column)
{
    return std::string(kind) + " 0 " + std::to_string(row - 1) + " " + std::to_string(column - 1);
}

TEST(BuiltWorkbookInterop, XlrdReadsTheCellsAndTheLook)
{
    PENMOOR_NEED_READER(xls::test::hasPythonModule("xlrd"), "python3-xlrd");
    SavedSheet saved(defaultMonths, 16);
    const auto facts = xlrdFacts(saved.file);

    // Every cell as the application holds it: labels as text, figures and totals as numbers.
    int cells = 0;
    for (int row = 1; row <= 55; ++row) {
        for (int column = 1; column <= 16; ++column) {
            const std::string address = ColumnLetters(column) + std::to_string(row);
            const xl::Value value = saved.sheet.value(address);
            const auto found = facts.find(cellKey("cell", row, column));
            if (std::holds_alternative<std::monostate>(value)) {
                EXPECT_TRUE(found == facts.end() || found->second == "blank -") << address << " is empty";
                continue;
            }
            ASSERT_NE(found, facts.end()) << "xlrd misses " << address;
            if (const auto* text = std::get_if<std::string>(&value)) {
                EXPECT_EQ(found->second, "text " + hexOf(*text)) << address;
            } else {
                std::istringstream shown(found->second);
                std::string type;
                double number = 0;
                shown >> type >> number;
                EXPECT_EQ(type, "number") << address;
                EXPECT_EQ(number, std::get<double>(value)) << address;
            }
            ++cells;
        }
    }
    EXPECT_GT(cells, 300);

    for (int k = 1; k <= 56; ++k) {
        const PaletteColour colour = saved.sheet.options.palette()[static_cast<std::size_t>(k - 1)];
        char rgb[8];
        std::snprintf(rgb, sizeof rgb, "%02X%02X%02X", colour.red, colour.green, colour.blue);
        EXPECT_EQ(facts.at("palette " + std::to_string(k + 7)), rgb) << "colour " << k;
    }

    const std::string grid = "left=1:808080 right=1:808080 top=1:808080 bottom=1:808080";
    const std::vector<std::pair<std::string, std::string>> formats = {
        { cellKey("format", 2, 2), "font=417269616c/380/bold/upright/37525F fill=FFFFFF" }, // title
        { cellKey("format", 4, 3), "fill=CCFFCC " + grid + " align=center/center/wrap" }, // column heading
        { cellKey("format", 7, 2), "font=417269616c/180/bold/upright/auto fill=B1FFD1" }, // section heading
        { cellKey("format", 13, 2),
            "font=417269616c/180/bold/upright/auto fill=CCFFCC " + grid + " align=general/center/wrap" }, // total label
        { cellKey("format", 13, 16), "fill=E0FFD7 " + grid + " align=general/center/nowrap numfmt=232c232330" },
        { cellKey("format", 20, 5), "fill=FFFFFF " + grid + " align=general/center/nowrap numfmt=232c232330" },
    };
    for (const auto& [key, expected] : formats) {
        ASSERT_TRUE(facts.count(key)) << key;
        std::istringstream words(expected);
        for (std::string word; words >> word;) {
            EXPECT_NE((" " + facts.at(key) + " ").find(" " + word + " "), std::string::npos)
                << key << " lacks " << word << ": " << facts.at(key);
        }
    }

    // Heights in twips: header rows, a spacer, an item row, a total row.
    const std::vector<std::pair<int, int>> heights
        = { { 1, 225 }, { 2, 555 }, { 3, 75 }, { 4, 495 }, { 6, 160 }, { 10, 360 }, { 13, 480 } };
    for (const auto& [row, twips] : heights) {
        const std::string fact
            = facts.count("row 0 " + std::to_string(row - 1)) ? facts.at("row 0 " + std::to_string(row - 1)) : "";
        EXPECT_EQ(fact.substr(0, fact.find(' ')), std::to_string(twips)) << "row " << row;
    }
    // The print area: rows 1 to 55 (two below the last item row), columns A to P.
    ASSERT_TRUE(facts.count("name Print_Area"));
    EXPECT_TRUE(facts.at("name Print_Area").ends_with(" 0 0 54 0 15")) << facts.at("name Print_Area");
    for (const auto& [key, fact] : facts) {
        EXPECT_NE(key.rfind("merged", 0), 0u) << "no cell of the sheet is merged: " << key << " " << fact;
    }
}

// LibreOffice's view of a saved sheet: cell values after its own recalculation, by "row column"
// (0-based), and the page line.
struct LibreOfficeView {
    std::map<std::string, std::string> values;
    std::string page;
};

LibreOfficeView libreOfficeView(const SavedSheet& saved)
{
    LibreOfficeView view;
    const auto converted = xls::test::convertWithLibreOffice(saved.file, "fods", saved.folder.path());
    if (converted.empty()) {
        return view;
    }
    for (const std::string& line :
        xls::test::lines(xls::test::runPythonScript("lo_fods_dump.py", { converted.string() }))) {
        std::istringstream words(line);
        std::string kind, sheet, row, column, type, value;
        words >> kind >> sheet;
        if (sheet != "0") {
            continue; // the workbook's other, empty sheets
        }
        if (kind == "page") {
            view.page = line;
        } else if (kind == "value" && words >> row >> column >> type >> value) {
            view.values[row + " " + column] = value;
        }
    }
    return view;
}

void expectRecalculatedTotals(const SavedSheet& saved, const LibreOfficeView& view)
{
    for (const ExpectedTotal& total : saved.totals) {
        const auto shown = view.values.find(std::to_string(total.row - 1) + " " + std::to_string(total.column - 1));
        ASSERT_NE(shown, view.values.end()) << "LibreOffice shows nothing in " << total.address;
        EXPECT_EQ(std::stod(shown->second), total.value) << total.item << " in " << total.address;
    }
}

// With a thousand more expense lines, whose subtotal folds into a range.
TEST(BuiltWorkbookInterop, LibreOfficeRecalculatesTheStatementAndKeepsThePage)
{
    PENMOOR_NEED_READER(xls::test::hasProgram("soffice"), "LibreOffice (libreoffice-calc-nogui)");
    const auto thousandLines = [](SheetBuild& sheet) {
        defaultMonths(sheet);
        for (int line = 1; line <= 1000; ++line) {
            sheet.options.InsertItem("Expense " + std::to_string(line), 31);
        }
    };
    SavedSheet saved(thousandLines, 16);
    const LibreOfficeView view = libreOfficeView(saved);
    expectRecalculatedTotals(saved, view);
    // Landscape A4 with the margins in inches, fitted to one page wide and one tall.
    EXPECT_EQ(view.page,
        "page 0 margin-bottom=0.5in margin-left=0.7in margin-right=0.7in margin-top=0.5in "
        "page-height=8.2681in page-width=11.6929in print-orientation=landscape scale-to-X=1 "
        "scale-to-Y=1");
}

} // namespace
} // namespace penmoor::test
