#include "automation/temporaryworkbook.h"

#include "shell/newentry.h"

#include <algorithm>

namespace penmoor {

std::string temporaryWorkbookName(const UnitRandom& random)
{
    constexpr int kDigitCount = 8;
    std::string name = "qarnet";
    for (int i = 0; i < kDigitCount; ++i) {
        // r < 1 gives 1 to 9; the clamp keeps a product r * 9 rounded up to 9 from giving a 10.
        const int digit = std::clamp(static_cast<int>(random() * 9.0) + 1, 1, 9);
        name += static_cast<char>('0' + digit);
    }
    return name + ".xls";
}

std::filesystem::path claimTemporaryWorkbook(const std::filesystem::path& folder, const UnitRandom& random)
{
    return createUnderFreshName(
        folder, [&] { return temporaryWorkbookName(random); }, createNewFile, "the temporary workbook");
}

} // namespace penmoor
