#pragma once

#include <string>
#include <string_view>

namespace penmoor {

// The form in which a key of the program (any text: item names included) is handed to QSettings.
// QSettings takes "/" and "\" as group separators, trims blanks, ignores an empty key, and on
// Windows compares keys without letter case, while the program's keys must stay apart exactly
// as written. So every key becomes a text of lower-case letters, digits, "-", "_" and ".",
// one-to-one:
//   a-z, 0-9, "-"   themselves
//   A-Z             "_" and the letter in lower case   ("Rent" -> "_rent")
//   any other byte  "." and two lower-case hex digits  (" " -> ".20", "/" -> ".2f", "é" -> ".c3.a9")
//   the empty key   "."
std::string encodeSettingsKey(std::string_view key);

} // namespace penmoor
