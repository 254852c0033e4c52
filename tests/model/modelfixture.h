#pragma once

#include "model/memorysettingsstore.h"
#include "model/memorywindowview.h"
#include "model/options.h"

#include <array>
#include <string>
#include <vector>

namespace penmoor::test {

inline constexpr int kTestYear = 2031;

// The default item list as the product's users know it, written out here so that the model's
// own table is checked against it rather than against itself.
inline const std::array<std::string, 44> kExpectedDefaultNames = {
    "Cash on Hand (beginning of month)",
    "CASH RECEIPTS",
    "Cash Sales",
    "Collections from CR accounts",
    "Loan or other cash injection",
    "TOTAL CASH RECEIPTS",
    "Total Cash Available (before cash out)",
    "CASH PAID OUT",
    "Purchases (merchandise)",
    "Purchases (specify)",
    "_Purchases (specify)",
    "Gross wages (exact withdrawal)",
    "Payroll expenses (taxes, etc.)",
    "Outside services",
    "Supplies (office & operating)",
    "Repairs & maintenance",
    "Advertising",
    "Car, delivery & travel",
    "Accounting & legal",
    "Rent",
    "Telephone",
    "Utilities",
    "Insurance",
    "Taxes (real estate, etc.)",
    "Interest",
    "Other expenses (specify)",
    "Other (specify)",
    "_Other (specify)",
    "Miscellaneous",
    "SUBTOTAL",
    "Loan principal payment",
    "Capital purchase (specify)",
    "Other startup costs",
    "Reserve and/or Escrow",
    "Owners' Withdrawal",
    "TOTAL CASH PAID OUT",
    "Cash Position (end of month)",
    "ESSENTIAL OPERATING DATA (non cash flow information)",
    "Sales Volume (dollars)",
    "Accounts Receivable",
    "Bad Debt (end of month)",
    "Inventory on hand (end of month)",
    "Accounts Payable (end of month)",
    "Depreciation",
};

// "first,first+1,...,last".
inline std::string positionRun(int first, int last)
{
    std::string text;
    for (int position = first; position <= last; ++position) {
        text += (text.empty() ? "" : ",") + std::to_string(position);
    }
    return text;
}

// A store holding a saved list with these names, as a close of the program leaves it.
inline void storeList(MemorySettingsStore& store, const std::vector<std::string>& names)
{
    for (std::size_t i = 0; i < names.size(); ++i) {
        store.write("Field" + std::to_string(i + 1), names[i]);
    }
    store.write("System Value - Rows", std::to_string(names.size()));
    store.write("System Value - Saved", "True");
}

// A model with its store and window, started as the program starts.
struct ModelHarness {
    MemorySettingsStore store;
    MemoryWindowView view;
    Options options { store, view, [] { return kTestYear; } };

    std::vector<std::string> names() const
    {
        std::vector<std::string> result;
        for (int position = 1; position <= options.count(); ++position) {
            result.push_back(options.item(position).name);
        }
        return result;
    }
};

} // namespace penmoor::test
