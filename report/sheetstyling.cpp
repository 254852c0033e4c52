#include "report/sheetstyling.h"

#include "automation/contract/constants.h"
#include "report/columnletters.h"
#include "report/sheetlayout.h"
#include "report/sheetlook.h"

namespace penmoor {

namespace {

// The print area and the number format take in two rows below the last item row.
constexpr int kRowsBelowTable = 2;

void setWidth(SheetWriter& sheet, int column, double width)
{
    const std::string letters = ColumnLetters(column);
    sheet.SetColumnWidth(letters + ":" + letters, width);
}

} // namespace

void copyPalette(xl::Application& application, const PaletteTable& palette)
{
    const std::unique_ptr<xl::Workbook> workbook = application.ActiveWorkbook();
    for (int k = 1; k <= static_cast<int>(palette.size()); ++k) {
        workbook->setColors(k, palette[static_cast<std::size_t>(k - 1)].value());
    }
}

void resetSheet(SheetWriter& sheet)
{
    xl::Application& application = sheet.application();
    application.Cells()->Select();
    application.Cells()->Clear();
    application.Selection()->Font()->setName("Arial");
}

void setSheetSizes(SheetWriter& sheet, int lastColumn)
{
    sheet.SetFill({}, kBackgroundColor);

    sheet.SetColumnWidth("A:A", 1);
    sheet.SetColumnWidth("B:B", 32);
    sheet.SetColumnWidth("C:C", 10.83);
    for (int column = kFirstPeriodColumn; column < lastColumn; ++column) {
        setWidth(sheet, column, 8.33);
    }
    setWidth(sheet, lastColumn, 9.17);

    sheet.SetRowHeight("1:1", 11.25);
    sheet.SetRowHeight("2:2", 27.75);
    sheet.SetRowHeight("3:3", 3.75);
    sheet.SetRowHeight("4:4", 24.75);
}

std::string drawTableFrame(SheetWriter& sheet, int lastColumn, int rowCount)
{
    const std::string last = ColumnLetters(lastColumn);
    const int lastItemRow = rowCount + kHeaderRows;
    const std::string belowTable = std::to_string(lastItemRow + kRowsBelowTable);

    sheet.Select("B4:" + last + std::to_string(lastItemRow));
    sheet.SetAllBorders();
    sheet.SetAlignment(false, true, false);

    std::string printArea = "A1:" + last + belowTable;

    // The empty corner above the labels has no top and left lines.
    sheet.Select("B4");
    sheet.ClearBorder(xl::kEdgeTop);
    sheet.ClearBorder(xl::kEdgeLeft);

    sheet.SetNumberFormat("C5:" + last + belowTable, "#,##0");

    sheet.SetFill("C4:" + last + "4", kColumnHeadingColor);
    sheet.SetAlignment(true, true, true);
    return printArea;
}

} // namespace penmoor
