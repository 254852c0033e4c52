#include "tests/report/cashflowstatement.h"
#include "tests/report/sheetbuild.h"

#include <functional>
#include <string>
#include <vector>

#include <gtest/gtest.h>

namespace penmoor::test {
namespace {

struct StatementCase {
    const char* what;
    std::function<void(SheetBuild&)> setUp;
    int lastColumn;
};

TEST(SheetAddsUp, AddsUpWithNumbersInEveryEntryCell)
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
        // Unfolded, the subtotal's formula would be longer than a formula may be.
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
        CashFlowStatement statement(sheet.options, c.lastColumn);
        statement.typeEntries(*sheet.app);
        for (const ExpectedTotal& total : statement.expectedTotals()) {
            EXPECT_EQ(sheet.value(total.address), xl::Value(total.value)) << total.item << " in " << total.address;
        }
    }
}

} // namespace
} // namespace penmoor::test
