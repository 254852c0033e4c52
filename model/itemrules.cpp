#include "model/itemrules.h"

#include "model/namematching.h"

#include <algorithm>

namespace penmoor {

bool IsSystemItem(std::string_view name)
{
    return std::any_of(kSystemItemNames.begin(), kSystemItemNames.end(),
        [&](std::string_view systemName) { return namesMatch(name, systemName); });
}

bool IsHeadingItem(std::string_view name)
{
    return name == kCashReceiptsHeading || name == kCashPaidOutHeading || name == kOperatingDataHeading;
}

TotalKind ItemOperation(std::string_view name)
{
    if (name == kCashOnHand) {
        return TotalKind::Other;
    }
    if (name == kTotalCashReceipts || name == kTotalCashAvailable || name == kSubtotal || name == kTotalCashPaidOut) {
        return TotalKind::Sum;
    }
    if (name == kCashPosition) {
        return TotalKind::Dif;
    }
    return TotalKind::None;
}

} // namespace penmoor
