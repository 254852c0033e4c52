#pragma once

#include "model/templateitem.h"

#include <array>
#include <string_view>

namespace penmoor {

// The names the cash-flow rules refer to. The eight system rows are the six totals and
// balances, and the two lines where the added-up receipts and expenses begin.
inline constexpr std::string_view kCashOnHand = "Cash on Hand (beginning of month)";
inline constexpr std::string_view kCashSales = "Cash Sales";
inline constexpr std::string_view kTotalCashReceipts = "TOTAL CASH RECEIPTS";
inline constexpr std::string_view kTotalCashAvailable = "Total Cash Available (before cash out)";
inline constexpr std::string_view kPurchasesMerchandise = "Purchases (merchandise)";
inline constexpr std::string_view kSubtotal = "SUBTOTAL";
inline constexpr std::string_view kTotalCashPaidOut = "TOTAL CASH PAID OUT";
inline constexpr std::string_view kCashPosition = "Cash Position (end of month)";

inline constexpr std::array<std::string_view, 8> kSystemItemNames = {
    kCashOnHand,
    kCashPosition,
    kTotalCashReceipts,
    kCashSales,
    kTotalCashAvailable,
    kSubtotal,
    kPurchasesMerchandise,
    kTotalCashPaidOut,
};

// The three section headings of the default list. They are not system rows: given another
// name, a heading is an ordinary line.
inline constexpr std::string_view kCashReceiptsHeading = "CASH RECEIPTS";
inline constexpr std::string_view kCashPaidOutHeading = "CASH PAID OUT";
inline constexpr std::string_view kOperatingDataHeading = "ESSENTIAL OPERATING DATA (non cash flow information)";

// True when name matches one of the eight system rows under the item name matching; the editor
// neither renames nor deletes those.
bool IsSystemItem(std::string_view name);

// The section flag for a name: exactly one of the three headings, compared exactly.
bool IsHeadingItem(std::string_view name);

// The total kind for a name, compared exactly.
TotalKind ItemOperation(std::string_view name);

} // namespace penmoor
