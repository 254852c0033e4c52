#include "report/itemrows.h"

#include "automation/contract/constants.h"
#include "automation/contract/error.h"
#include "model/itemrules.h"
#include "report/columnletters.h"
#include "report/itemreferences.h"
#include "report/sheetlayout.h"
#include "report/sheetlook.h"
#include "report/totalformula.h"

#include <charconv>
#include <string_view>
#include <vector>

namespace penmoor {

namespace {

constexpr double kSpacerRowHeight = 8;
constexpr double kItemRowHeight = 18;
constexpr double kTotalRowHeight = 24;

// The name on the sheet: a leading "_" lets two items print the same label.
std::string labelOf(const std::string& name)
{
    return !name.empty() && name.front() == '_' ? name.substr(1) : name;
}

void setRowHeight(SheetWriter& sheet, const std::string& row, double height)
{
    sheet.SetRowHeight(row + ":" + row, height);
}

// The opening balance of each period is the cash position of the period before, in the column
// to the left. The item of the opening balance is the first one in every list the editor makes,
// unless a line was inserted above it; its row carries the balance over all the same.
std::string openingCashFormula(const Options& options, int position)
{
    // Without that item FindItemRow gives 0, which RelativeRef refuses as no item of the list.
    std::string formula = "=";
    formula += RelativeRef(options, options.FindItemRow(kCashPosition), position, -1);
    return formula;
}

// The positions that the linkage list of the item at position names, in list order. Raises
// xl::Error for an element that is not a number; RowOffset refuses positions outside the list.
std::vector<int> linkedPositions(const Options& options, int position)
{
    const TemplateItem& item = options.item(position);
    std::vector<int> positions;
    std::string_view rest = item.linkage;
    for (;;) {
        const std::size_t comma = rest.find(',');
        const std::string_view element = rest.substr(0, comma);
        int linked = 0;
        const auto [end, error] = std::from_chars(element.data(), element.data() + element.size(), linked);
        if (element.empty() || error != std::errc() || end != element.data() + element.size()) {
            throw xl::Error("The total \"" + item.name + "\" combines \"" + std::string(element)
                + "\", which is not the number of an item.");
        }
        positions.push_back(linked);
        if (comma == std::string_view::npos) {
            return positions;
        }
        rest.remove_prefix(comma + 1);
    }
}

std::string combinedFormula(const Options& options, int position, Combination combination)
{
    std::vector<int> rowOffsets;
    for (const int linked : linkedPositions(options, position)) {
        rowOffsets.push_back(RowOffset(options, linked, position));
    }
    return totalFormula(combination, rowOffsets);
}

// The formula of the total at position, the same text for every column of its row.
std::string totalRowFormula(const Options& options, int position)
{
    switch (options.item(position).totalKind) {
    case TotalKind::Other:
        return openingCashFormula(options, position);
    case TotalKind::Sum:
        return combinedFormula(options, position, Combination::Sum);
    case TotalKind::Dif:
        return combinedFormula(options, position, Combination::Difference);
    case TotalKind::None:
        break;
    }
    return {};
}

void writeTotalFormulas(
    SheetWriter& sheet, const Options& options, int position, const std::string& row, int lastColumn)
{
    const std::string formula = totalRowFormula(options, position);
    if (formula.empty()) {
        return;
    }
    // The pre-startup column has no period before it: its opening cash is typed in.
    const bool carriedOver = options.item(position).totalKind == TotalKind::Other;
    const int firstColumn = carriedOver ? kFirstPeriodColumn : kPreStartupColumn;
    for (int column = firstColumn; column <= lastColumn; ++column) {
        sheet.PutCell(ColumnLetters(column) + row, formula, true);
    }
}

// A thin row above a section heading, without vertical lines.
void writeSpacerRow(SheetWriter& sheet, const std::string& row)
{
    setRowHeight(sheet, row, kSpacerRowHeight);
    sheet.ClearBorder(xl::kEdgeLeft);
    sheet.ClearBorder(xl::kEdgeRight);
    sheet.ClearBorder(xl::kInsideVertical);
}

} // namespace

int numberItemRows(Options& options)
{
    int rowCounter = 0;
    for (int position = 1; position <= options.count(); ++position) {
        if (options.item(position).section) {
            ++rowCounter;
        }
        ++rowCounter;
        options.setSheetRow(position, rowCounter + kHeaderRows);
    }
    return rowCounter;
}

void writeItemRows(SheetWriter& sheet, const Options& options, int lastColumn)
{
    const std::string last = ColumnLetters(lastColumn);
    int rowCounter = 0;
    for (int position = 1; position <= options.count(); ++position) {
        const TemplateItem& item = options.item(position);
        if (item.section) {
            ++rowCounter;
            writeSpacerRow(sheet, std::to_string(rowCounter + kHeaderRows));
        }
        ++rowCounter;
        const std::string row = std::to_string(rowCounter + kHeaderRows);
        const bool isTotal = !item.linkage.empty();

        setRowHeight(sheet, row, kItemRowHeight);
        sheet.PutCell("B" + row, labelOf(item.name), true, CellEntry::Literal);
        if (item.section) {
            // A heading row is shaded across the table, without inner vertical lines.
            sheet.SetFill("B" + row + ":" + last + row, kSectionHeadingColor);
            sheet.ClearBorder(xl::kInsideVertical);
        }
        if (item.section || isTotal) {
            sheet.Select("B" + row);
            sheet.SetFont(kBold, kHeadingFontSize, xl::kColorIndexAutomatic);
        }
        if (isTotal) {
            sheet.SetAlignment(false, true, true);
            sheet.SetFill({}, kColumnHeadingColor);
            setRowHeight(sheet, row, kTotalRowHeight);
            sheet.SetFill("C" + row + ":" + last + row, kTotalFiguresColor);
            writeTotalFormulas(sheet, options, position, row, lastColumn);
        }
    }
}

} // namespace penmoor
