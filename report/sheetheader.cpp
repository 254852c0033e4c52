#include "report/sheetheader.h"

#include "automation/contract/constants.h"
#include "model/numbertext.h"
#include "report/columnletters.h"
#include "report/sheetlook.h"

namespace penmoor {

namespace {

constexpr char kMonthFormat[] = "mmm-yy";

// A bold heading cell; every cell of rows 2 and 4 but the title and the company name is one.
void putHeading(SheetWriter& sheet, const std::string& cell, const std::string& text)
{
    sheet.PutCell(cell, text, true);
    sheet.SetFont(kBold, kHeadingFontSize, xl::kColorIndexAutomatic);
}

void alignRight(SheetWriter& sheet)
{
    sheet.application().Selection()->setHorizontalAlignment(xl::kAlignRight);
}

std::string cellOf(int column, int row)
{
    return ColumnLetters(column) + std::to_string(row);
}

// D4 shows the start value of row 2, which lies lastColumn - 4 columns to its right.
std::string firstPeriodFormula(int lastColumn)
{
    return "=R[-2]C[" + std::to_string(lastColumn - kFirstPeriodColumn) + "]";
}

void writeYearHeader(SheetWriter& sheet, const PeriodSettings& periods, int lastColumn)
{
    putHeading(sheet, cellOf(lastColumn - 1, 2), "Fiscal Period Begins:");
    alignRight(sheet);
    putHeading(sheet, cellOf(lastColumn, 2), std::to_string(periods.firstYear));
    putHeading(sheet, "D4", firstPeriodFormula(lastColumn));
    for (int column = kFirstPeriodColumn + 1; column < lastColumn; ++column) {
        putHeading(sheet, cellOf(column, 4), "=RC[-1]+1");
    }
}

void writeMonthHeader(SheetWriter& sheet, const PeriodSettings& periods, int lastColumn)
{
    putHeading(sheet, cellOf(lastColumn - 1, 2), "Fiscal Year Begins:");
    alignRight(sheet);
    // Entered as a date: January 1st of the first year.
    putHeading(sheet, cellOf(lastColumn, 2), "1/1/" + numberText(periods.firstMonthYear));
    sheet.SetNumberFormat({}, kMonthFormat);
    putHeading(sheet, "D4", firstPeriodFormula(lastColumn));
    sheet.SetNumberFormat({}, kMonthFormat);
    for (int column = kFirstPeriodColumn + 1; column < lastColumn; ++column) {
        // The first day of the month after the one on the left.
        putHeading(sheet, cellOf(column, 4), "=DATE(YEAR(RC[-1]),MONTH(RC[-1])+1,1)");
        sheet.SetNumberFormat({}, kMonthFormat);
    }
}

void writeWeekHeader(SheetWriter& sheet, int lastColumn)
{
    putHeading(sheet, cellOf(lastColumn - 1, 2), "Fiscal Period Begins:");
    alignRight(sheet);
    putHeading(sheet, cellOf(lastColumn, 2), "Week 1");
    alignRight(sheet);
    for (int column = kFirstPeriodColumn; column < lastColumn; ++column) {
        putHeading(sheet, cellOf(column, 4), "Week " + std::to_string(column - kFirstPeriodColumn + 1));
    }
}

} // namespace

void writeTitleBlock(SheetWriter& sheet, int lastColumn, const std::string& company)
{
    sheet.PutCell("B2", "Cash flow", true);
    sheet.SetFont(kBold, 19, kTitleColor);
    putHeading(sheet, "C4", "Pre-Startup EST");
    putHeading(sheet, cellOf(lastColumn, 4), "Total Item EST");
    sheet.PutCell("H2", company, true, CellEntry::Literal);
    sheet.SetFont(kBold, 12, xl::kColorIndexAutomatic);
}

void writePeriodHeader(SheetWriter& sheet, const PeriodSettings& periods, int lastColumn)
{
    switch (periods.mode) {
    case PeriodMode::ByYear:
        writeYearHeader(sheet, periods, lastColumn);
        break;
    case PeriodMode::ByMonth:
        writeMonthHeader(sheet, periods, lastColumn);
        break;
    case PeriodMode::ByWeek:
        writeWeekHeader(sheet, lastColumn);
        break;
    }
}

} // namespace penmoor
