#include "automation/contract/error.h"
#include "report/columnletters.h"
#include "tests/report/sheetbuild.h"
#include "tests/report/sheetdump.h"

#include <chrono>
#include <functional>
#include <string>
#include <vector>

#include <gtest/gtest.h>

namespace penmoor::test {
namespace {

// The serial number of the first day of a month in the 1900 date system, worked out with the
// standard calendar rather than with the engine's own date code.
double firstOfMonthSerial(int year, int month)
{
    using namespace std::chrono;
    const sys_days day = std::chrono::year { year } / std::chrono::month { static_cast<unsigned>(month) } / 1;
    return (day - sys_days { 1899y / December / 30 }).count();
}

std::string valueKey(const xl::Value& value)
{
    if (const auto* number = std::get_if<double>(&value)) {
        return numberKey(*number);
    }
    if (const auto* text = std::get_if<std::string>(&value)) {
        return "\"" + *text + "\"";
    }
    return std::holds_alternative<std::monostate>(value) ? "empty" : "other";
}

struct Expected {
    std::string cell;
    std::string entry;
    std::string value;
};

struct HeaderCase {
    const char* what;
    std::function<void(SheetBuild&)> setUp;
    std::vector<Expected> cells;
};

// The edges that the whole-sheet dumps do not show.
TEST(PeriodHeader, EachModeAtItsEdges)
{
    const std::vector<HeaderCase> cases = {
        { "four years put the first year over the company name",
            [](SheetBuild& s) {
                s.byYear("2020", "2023");
                s.company("Penrose Bakery");
            },
            { { "G2", "Fiscal Period Begins:", "\"Fiscal Period Begins:\"" }, { "H2", "2020", "2020" },
                { "D4", "=R[-2]C[4]", "2020" }, { "E4", "=RC[-1]+1", "2021" }, { "G4", "=RC[-1]+1", "2023" },
                { "H4", "Total Item EST", "\"Total Item EST\"" } } },
        { "a hundred weeks", [](SheetBuild& s) { s.byWeek("100"); },
            { { "CY2", "Fiscal Period Begins:", "\"Fiscal Period Begins:\"" }, { "CZ2", "Week 1", "\"Week 1\"" },
                { "D4", "Week 1", "\"Week 1\"" }, { "CY4", "Week 100", "\"Week 100\"" },
                { "CZ4", "Total Item EST", "\"Total Item EST\"" } } },
    };
    for (const HeaderCase& c : cases) {
        SheetBuild sheet;
        c.setUp(sheet);
        sheet.build();
        for (const Expected& cell : c.cells) {
            EXPECT_EQ(sheet.entry(cell.cell), cell.entry) << c.what << ", " << cell.cell;
            EXPECT_EQ(valueKey(sheet.value(cell.cell)), cell.value) << c.what << ", " << cell.cell;
        }
    }
}

TEST(PeriodHeader, MonthsOverTenYearsFollowEachOtherUpToColumnEF)
{
    SheetBuild sheet;
    sheet.byMonth("2020", "2030");
    sheet.build();

    ASSERT_EQ(sheet.entry("EF4"), "Total Item EST");
    EXPECT_EQ(sheet.entry("EE2"), "Fiscal Year Begins:");
    EXPECT_EQ(sheet.entry("D4"), "=R[-2]C[132]");
    for (int column = 4; column <= 135; ++column) {
        const int month = column - 4;
        const std::string cell = ColumnLetters(column) + "4";
        EXPECT_EQ(valueKey(sheet.value(cell)), numberKey(firstOfMonthSerial(2020 + month / 12, month % 12 + 1)))
            << cell;
        EXPECT_EQ(sheet.app->Range(cell)->NumberFormat(), "mmm-yy") << cell;
        EXPECT_EQ(sheet.app->Range(cell)->ColumnWidth(), 8.33) << cell;
    }
    EXPECT_EQ(sheet.app->Range("EF1")->ColumnWidth(), 9.17);
    EXPECT_EQ(sheet.app->ActiveSheet()->PageSetup()->PrintArea(), "$A$1:$EF$53");
}

TEST(TotalRows, TheOpeningCashIsCarriedOverWhereverItsItemStands)
{
    SheetBuild sheet;
    sheet.byYear("2031", "2031");
    sheet.options.InsertItem("Notes", 0); // nothing was selected in the editor
    sheet.build();

    EXPECT_EQ(sheet.entry("B5"), "Notes");
    EXPECT_EQ(sheet.entry("D5"), "");
    EXPECT_EQ(sheet.app->Range("B5")->Font()->FontStyle(), "Regular");
    EXPECT_EQ(sheet.entry("B6"), "Cash on Hand (beginning of month)");
    EXPECT_EQ(sheet.entry("C6"), "");
    EXPECT_EQ(sheet.entry("D6"), "=R[38]C[-1]");
    EXPECT_EQ(sheet.entry("E6"), "=R[38]C[-1]");
    EXPECT_EQ(sheet.entry("B44"), "Cash Position (end of month)");
}

// Labels and the company name are stored exactly as typed, whatever they look like.
TEST(Labels, AreNeverReadAsFormulasNumbersOrDates)
{
    SheetBuild sheet;
    sheet.byYear("2031", "2031");
    sheet.company("=SUM(1,2)");
    const std::vector<std::string> names = { "=1+1", "1-2", "10%", "2013", "1/1/2013", "TRUE", "'quoted", "#N/A" };
    for (std::size_t i = 0; i < names.size(); ++i) {
        sheet.options.InsertItem(names[i], static_cast<int>(i) + 9);
    }
    sheet.options.InsertItem("_", 9);
    sheet.options.InsertItem("__twice", 9);
    sheet.build();

    EXPECT_EQ(sheet.value("H2"), xl::Value(std::string("=SUM(1,2)")));
    EXPECT_EQ(sheet.value("B16"), xl::Value(std::string("_twice")));
    EXPECT_EQ(sheet.value("B17"), xl::Value()); // "_" prints as an empty label
    for (std::size_t i = 0; i < names.size(); ++i) {
        const std::string cell = "B" + std::to_string(18 + i);
        EXPECT_EQ(sheet.value(cell), xl::Value(names[i])) << cell;
    }
}

TEST(Palette, IsTheWorkbooksWhateverItWasBefore)
{
    SheetBuild sheet;
    const std::unique_ptr<xl::Workbook> workbook = sheet.app->ActiveWorkbook();
    workbook->setColors(2, 0x000000);
    workbook->setColors(55, 0x0000FF);
    sheet.build();
    for (int k = 1; k <= 56; ++k) {
        EXPECT_EQ(workbook->Colors(k), sheet.options.palette()[static_cast<std::size_t>(k - 1)].value()) << k;
    }
}

TEST(Build, MarksEveryItemIncludedAndNumbersItsRow)
{
    SheetBuild sheet;
    sheet.options.TakeListMarks(); // only the selected entry's item is included now
    sheet.build();
    for (int position = 1; position <= sheet.options.count(); ++position) {
        const TemplateItem& item = sheet.options.item(position);
        EXPECT_TRUE(item.included) << position;
        const std::string label = item.name.front() == '_' ? item.name.substr(1) : item.name;
        EXPECT_EQ(sheet.value("B" + std::to_string(item.sheetRow)), xl::Value(label)) << position;
    }
}

// The first failure ends the build and reaches the caller; what was written stays.
TEST(Build, StopsAtAColumnBeyondTheSheetWithWhatWasWrittenLeft)
{
    SheetBuild sheet;
    sheet.byMonth("2000", "2030"); // 376 columns, the sheet has 256
    try {
        sheet.build();
        FAIL() << "the build went through";
    } catch (const xl::Error& error) {
        EXPECT_NE(std::string(error.what()).find("IW"), std::string::npos) << error.what();
    }
    EXPECT_EQ(sheet.app->Range("IV1")->ColumnWidth(), 8.33);
    EXPECT_EQ(sheet.app->Range("A1")->Interior()->ColorIndex(), 2);
    EXPECT_EQ(sheet.entry("B2"), ""); // the title block comes after the widths
    EXPECT_TRUE(sheet.options.item(1).included);
    EXPECT_EQ(sheet.options.item(1).sheetRow, 0);
}

TEST(Build, StopsAtALabelTheApplicationRefuses)
{
    SheetBuild sheet;
    sheet.byYear("2031", "2031");
    sheet.options.InsertItem(std::string(40000, 'x'), 9);
    EXPECT_THROW(sheet.build(), xl::Error);
    EXPECT_EQ(sheet.entry("B15"), "Purchases (merchandise)");
    EXPECT_EQ(sheet.entry("B16"), "");
    EXPECT_EQ(sheet.entry("B17"), "");
    EXPECT_EQ(sheet.app->Range("A17")->RowHeight(), 12.75);
    // The frame was drawn, the page was never set up.
    EXPECT_EQ(sheet.app->Range("C17")->NumberFormat(), "#,##0");
    EXPECT_EQ(sheet.app->ActiveSheet()->PageSetup()->PrintArea(), "");
}

} // namespace
} // namespace penmoor::test
