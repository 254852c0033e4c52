#pragma once

#include "automation/contract/application.h"
#include "model/options.h"

#include <map>
#include <string>
#include <utility>
#include <vector>

namespace penmoor::test {

// A total cell of the built sheet and what it must show.
struct ExpectedTotal {
    std::string address; // A1 form, such as "P43"
    int row = 0; // 1-based
    int column = 0; // 1-based
    std::string item; // the total's name
    double value = 0;
};

// The built sheet as a cash-flow statement. Numbers are typed into every entry cell (every row
// without a formula of its own, and the opening cash of the pre-startup column); then, column
// by column, each total, the cash available and the cash position must come out as the
// statement requires, and each period's opening cash must be the previous period's position.
// The expected values are worked out here from the typed numbers, not read from the sheet.
class CashFlowStatement {
public:
    CashFlowStatement(const Options& options, int lastColumn);

    // Types the numbers into the active sheet through the contract.
    void typeEntries(xl::Application& application);
    // The six totals of every column from C to the total column.
    std::vector<ExpectedTotal> expectedTotals() const;

private:
    int position(std::string_view name) const { return m_options.FindItemRow(name); }
    double typed(int item, int column) const;
    double linesBetween(std::string_view first, std::string_view last, int column, bool inclusive) const;

    const Options& m_options;
    int m_lastColumn;
    std::map<std::pair<int, int>, double> m_typed; // by item position and column
};

} // namespace penmoor::test
