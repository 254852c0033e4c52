#pragma once

#include <string>

namespace penmoor {

// ZZ, the last column that has letters.
inline constexpr int kLastLetteredColumn = 702;

// The letters of a 1-based column number: A for 1 to Z for 26, AA for 27 to ZZ for 702.
// Columns outside 1 to 702 have no letters: the result is empty, so every address made with it
// is malformed and the spreadsheet application rejects it, whatever its own column limit.
std::string ColumnLetters(int column);

} // namespace penmoor
