#include "model/settingskeys.h"

#include <algorithm>
#include <array>

namespace penmoor {

std::string fieldKey(int position)
{
    return "Field" + std::to_string(position);
}

bool isProgramKey(std::string_view key)
{
    static constexpr auto fixedKeys = std::to_array<std::string_view>({
        kRowsKey, kColumnsKey, kSavedKey, kCompanyKey, kYearKey, kYear1Key, kWeeksKey, kIsYearKey, kIsMonthKey, "Text1",
        "Text2", "Text3", "Text4", "Text6", "Text7", "Option1", "Option2", "Option3",
        "ShowAgain", // the splash screen's "Hide this at next startup"
    });
    if (std::find(fixedKeys.begin(), fixedKeys.end(), key) != fixedKeys.end()) {
        return true;
    }
    constexpr std::string_view fieldPrefix = "Field";
    if (!key.starts_with(fieldPrefix) || key.size() == fieldPrefix.size()) {
        return false;
    }
    const std::string_view digits = key.substr(fieldPrefix.size());
    return digits.front() != '0'
        && std::all_of(digits.begin(), digits.end(), [](char c) { return c >= '0' && c <= '9'; });
}

} // namespace penmoor
