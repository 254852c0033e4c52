#pragma once

#include <string>
#include <string_view>

namespace penmoor {

// The keys of the settings store besides the item keys (each item's name is the key of its
// included flag).

// The stored item list, written when the main window closes.
inline constexpr char kRowsKey[] = "System Value - Rows";
inline constexpr char kColumnsKey[] = "System Value - Columns";
inline constexpr char kSavedKey[] = "System Value - Saved";
// "Field" + position holds the name at that position.
std::string fieldKey(int position);

// The options at the last close of the main window.
inline constexpr char kCompanyKey[] = "Company";
inline constexpr char kYearKey[] = "Year";
inline constexpr char kYear1Key[] = "Year1";
inline constexpr char kWeeksKey[] = "Weeks";
inline constexpr char kIsYearKey[] = "IsYear";
inline constexpr char kIsMonthKey[] = "IsMonth";

// The boxes and option buttons also store themselves under their own names ("Text2",
// "Option3", ...) on every change.

// True when key is one of the program's own keys, including every "Field" key. An item whose
// name is such a key keeps no included flag of its own in the store: writing it would destroy
// the value the program keeps there (the By Month years under "Text6" and "Text7", the splash
// choice under "ShowAgain"), and reading it would take that foreign value as the flag.
bool isProgramKey(std::string_view key);

} // namespace penmoor
