#include "report/totalformula.h"

#include "report/itemreferences.h"

namespace penmoor {

namespace {

char operatorOf(Combination combination)
{
    return combination == Combination::Sum ? '+' : '-';
}

std::string sameColumn(int rowOffset)
{
    return relativeReference(rowOffset, 0);
}

// The chain of single references, or nothing once it grows beyond the limit.
std::string chainFormula(Combination combination, std::span<const int> rowOffsets)
{
    std::string text = "=";
    for (const int offset : rowOffsets) {
        if (text.size() > 1) {
            text += operatorOf(combination);
        }
        text += sameColumn(offset);
        if (text.size() > kMaxFormulaLength) {
            return {};
        }
    }
    return text;
}

std::string foldedFormula(Combination combination, std::span<const int> rowOffsets)
{
    std::string text = "=";
    std::size_t next = 0;
    // The first cell of a difference is the one the others are taken from, so it stands alone.
    if (combination == Combination::Difference) {
        text += sameColumn(rowOffsets[0]);
        next = 1;
    }
    while (next < rowOffsets.size()) {
        std::size_t end = next + 1;
        while (end < rowOffsets.size() && rowOffsets[end] == rowOffsets[end - 1] + 1) {
            ++end;
        }
        if (text.size() > 1) {
            text += operatorOf(combination);
        }
        if (end - next == 1) {
            text += sameColumn(rowOffsets[next]);
        } else {
            text += "SUM(" + sameColumn(rowOffsets[next]) + ":" + sameColumn(rowOffsets[end - 1]) + ")";
        }
        next = end;
    }
    return text;
}

} // namespace

std::string totalFormula(Combination combination, std::span<const int> rowOffsets)
{
    std::string chain = chainFormula(combination, rowOffsets);
    return chain.empty() ? foldedFormula(combination, rowOffsets) : chain;
}

} // namespace penmoor
