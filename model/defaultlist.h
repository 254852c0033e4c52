#pragma once

#include "model/itemrules.h"

#include <array>
#include <string_view>

namespace penmoor {

// The 44 items of a first start and of every restore of the defaults, in list order.
// "Purchases (specify)" and "_Purchases (specify)" (and the two "Other (specify)") are distinct
// items that print the same label, so a plan can carry two lines to specify.
inline constexpr std::array<std::string_view, 44> kDefaultItemNames = {
    kCashOnHand,
    kCashReceiptsHeading,
    kCashSales,
    "Collections from CR accounts",
    "Loan or other cash injection",
    kTotalCashReceipts,
    kTotalCashAvailable,
    kCashPaidOutHeading,
    kPurchasesMerchandise,
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
    kSubtotal,
    "Loan principal payment",
    "Capital purchase (specify)",
    "Other startup costs",
    "Reserve and/or Escrow",
    "Owners' Withdrawal",
    kTotalCashPaidOut,
    kCashPosition,
    kOperatingDataHeading,
    "Sales Volume (dollars)",
    "Accounts Receivable",
    "Bad Debt (end of month)",
    "Inventory on hand (end of month)",
    "Accounts Payable (end of month)",
    "Depreciation",
};

} // namespace penmoor
