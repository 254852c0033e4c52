#include "model/itemrules.h"
#include "report/columnletters.h"
#include "tests/report/sheetbuild.h"
#include "tests/report/sheetdump.h"

#include <functional>
#include <map>
#include <string>

#include <gtest/gtest.h>

namespace penmoor::test {
namespace {

// The built sheet as a cash-flow statement. Numbers are typed into every entry cell (every row
// without a formula of its own, and the opening cash of the pre-startup column); then, column by
// column, the totals must come out as the statement requires, and each period's opening cash
// must be the previous period's cash position.
class Statement {
public:
    Statement(SheetBuild& sheet, int lastColumn)
        : m_sheet(sheet)
        , m_lastColumn(lastColumn)
    {
    }

    void typeEntries()
    {
        const int openingCash = position(kCashOnHand);
        for (int item = 1; item <= m_sheet.options.count(); ++item) {
            const TemplateItem& record = m_sheet.options.item(item);
            if (record.section || (!record.linkage.empty() && item != openingCash)) {
                continue;
            }
            const int lastColumn = item == openingCash ? 3 : m_lastColumn;
            for (int column = 3; column <= lastColumn; ++column) {
                const double number = (item * 131 + column * 17) % 997 + 1;
                m_sheet.app->Range(cell(item, column))->setFormulaR1C1(numberKey(number));
                m_typed[{ item, column }] = number;
            }
        }
    }

    void expectTotals() const
    {
        double previousPosition = 0;
        for (int column = 3; column <= m_lastColumn; ++column) {
            const double opening = column == 3 ? typed(position(kCashOnHand), column) : previousPosition;
            const double receipts = linesBetween(kCashSales, kTotalCashReceipts, column, true);
            const double available = opening + receipts + linesBetween(kTotalCashReceipts, kTotalCashAvailable, column);
            const double subtotal = linesBetween(kPurchasesMerchandise, kSubtotal, column, true);
            const double paidOut = subtotal + linesBetween(kSubtotal, kTotalCashPaidOut, column);
            const double cashPosition = available - paidOut;

            expectValue(kCashOnHand, column, opening);
            expectValue(kTotalCashReceipts, column, receipts);
            expectValue(kTotalCashAvailable, column, available);
            expectValue(kSubtotal, column, subtotal);
            expectValue(kTotalCashPaidOut, column, paidOut);
            expectValue(kCashPosition, column, cashPosition);
            previousPosition = cashPosition;
        }
    }

private:
    int position(std::string_view name) const { return m_sheet.options.FindItemRow(name); }

    std::string cell(int item, int column) const
    {
        return ColumnLetters(column) + std::to_string(m_sheet.options.item(item).sheetRow);
    }

    double typed(int item, int column) const
    {
        const auto found = m_typed.find({ item, column });
        return found == m_typed.end() ? 0 : found->second;
    }

    // The typed lines after the item named first (from it, when inclusive) up to the one before
    // the item named last.
    double linesBetween(std::string_view first, std::string_view last, int column, bool inclusive = false) const
    {
        double sum = 0;
        for (int item = position(first) + (inclusive ? 0 : 1); item < position(last); ++item) {
            sum += typed(item, column);
        }
        return sum;
    }

    void expectValue(std::string_view name, int column, double expected) const
    {
        const std::string address = cell(position(name), column);
        EXPECT_EQ(m_sheet.value(address), xl::Value(expected)) << name << " in " << address;
    }

    SheetBuild& m_sheet;
    int m_lastColumn;
    std::map<std::pair<int, int>, double> m_typed;
};

struct StatementCase {
    const char* what;
    std::function<void(SheetBuild&)> setUp;
    int lastColumn;
};

TEST(CashFlowStatement, AddsUpWithNumbersInEveryEntryCell)
{
    const std::vector<StatementCase> cases = {
        { "the default list over the months of one year", [](SheetBuild& s) { s.byMonth("2031", "2031"); }, 16 },
        { "an edited list over three years",
            [](SheetBuild& s) {
                s.byYear("2020", "2022");
                s.options.InsertItem("Grants", 5);
                s.options.InsertItem("Owner loan", 7); // between the receipts total and the cash available
                s.options.InsertItem("Not in any total", 10); // below CASH PAID OUT, above the purchases
                s.options.DeleteItem(s.options.FindItemRow("Rent"));
                s.options.DeleteItem(s.options.FindItemRow("CASH RECEIPTS"));
            },
            7 },
        { "a thousand more expense lines, whose subtotal folds into a range",
            [](SheetBuild& s) {
                s.byWeek("3");
                for (int line = 1000; line >= 1; --line) {
                    s.options.InsertItem("Expense " + std::to_string(line), 29);
                }
            },
            7 },
    };
    for (const StatementCase& c : cases) {
        SCOPED_TRACE(c.what);
        SheetBuild sheet;
        c.setUp(sheet);
        sheet.build();
        Statement statement(sheet, c.lastColumn);
        statement.typeEntries();
        statement.expectTotals();
    }
}

TEST(CashFlowStatement, ALongSubtotalStaysWithinTheFormulaLimit)
{
    SheetBuild sheet;
    sheet.byWeek("3");
    for (int line = 1; line <= 1000; ++line) {
        sheet.options.InsertItem("Expense " + std::to_string(line), 29);
    }
    sheet.build();
    const int subtotalRow = sheet.options.item(sheet.options.FindItemRow(kSubtotal)).sheetRow;
    for (const char* column : { "C", "E", "G" }) {
        EXPECT_EQ(sheet.entry(column + std::to_string(subtotalRow)), "=SUM(R[-1021]C:R[-1]C)") << column;
    }
}

} // namespace
} // namespace penmoor::test
