#include "tests/report/cashflowstatement.h"

#include "model/itemrules.h"
#include "report/columnletters.h"
#include "report/sheetlayout.h"
#include "tests/report/sheetdump.h"

namespace penmoor::test {

CashFlowStatement::CashFlowStatement(const Options& options, int lastColumn)
    : m_options(options)
    , m_lastColumn(lastColumn)
{
}

void CashFlowStatement::typeEntries(xl::Application& application)
{
    const int openingCash = position(kCashOnHand);
    for (int item = 1; item <= m_options.count(); ++item) {
        const TemplateItem& record = m_options.item(item);
        if (record.section || (!record.linkage.empty() && item != openingCash)) {
            continue;
        }
        const int lastColumn = item == openingCash ? kPreStartupColumn : m_lastColumn;
        for (int column = kPreStartupColumn; column <= lastColumn; ++column) {
            const double number = (item * 131 + column * 17) % 997 + 1;
            application.Range(ColumnLetters(column) + std::to_string(record.sheetRow))
                ->setFormulaR1C1(numberKey(number));
            m_typed[{ item, column }] = number;
        }
    }
}

std::vector<ExpectedTotal> CashFlowStatement::expectedTotals() const
{
    std::vector<ExpectedTotal> totals;
    const auto expect = [&](std::string_view name, int column, double value) {
        const int row = m_options.item(position(name)).sheetRow;
        totals.push_back({ ColumnLetters(column) + std::to_string(row), row, column, std::string(name), value });
    };
    double previousPosition = 0;
    for (int column = kPreStartupColumn; column <= m_lastColumn; ++column) {
        const double opening = column == kPreStartupColumn ? typed(position(kCashOnHand), column) : previousPosition;
        const double receipts = linesBetween(kCashSales, kTotalCashReceipts, column, true);
        const double available
            = opening + receipts + linesBetween(kTotalCashReceipts, kTotalCashAvailable, column, false);
        const double subtotal = linesBetween(kPurchasesMerchandise, kSubtotal, column, true);
        const double paidOut = subtotal + linesBetween(kSubtotal, kTotalCashPaidOut, column, false);
        const double cashPosition = available - paidOut;

        expect(kCashOnHand, column, opening);
        expect(kTotalCashReceipts, column, receipts);
        expect(kTotalCashAvailable, column, available);
        expect(kSubtotal, column, subtotal);
        expect(kTotalCashPaidOut, column, paidOut);
        expect(kCashPosition, column, cashPosition);
        previousPosition = cashPosition;
    }
    return totals;
}

double CashFlowStatement::typed(int item, int column) const
{
    const auto found = m_typed.find({ item, column });
    return found == m_typed.end() ? 0 : found->second;
}

// The typed lines after the item named first (from it, when inclusive) up to the one before the
// item named last.
double CashFlowStatement::linesBetween(std::string_view first, std::string_view last, int column, bool inclusive) const
{
    double sum = 0;
    for (int item = position(first) + (inclusive ? 0 : 1); item < position(last); ++item) {
        sum += typed(item, column);
    }
    return sum;
}

} // namespace penmoor::test
