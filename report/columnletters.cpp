#include "report/columnletters.h"

namespace penmoor {

namespace {

constexpr int kLetterCount = 26;
static_assert(kLastLetteredColumn == kLetterCount * kLetterCount + kLetterCount);

char letter(int number) // 1 for A
{
    return static_cast<char>('A' + number - 1);
}

} // namespace

std::string ColumnLetters(int column)
{
    if (column < 1 || column > kLastLetteredColumn) {
        return {};
    }
    if (column <= kLetterCount) {
        return std::string(1, letter(column));
    }
    // Two letters in bijective base 26: the second runs A to Z, so a multiple of 26 ends in Z.
    const int first = (column - 1) / kLetterCount;
    const int second = column - first * kLetterCount;
    return { letter(first), letter(second) };
}

} // namespace penmoor
