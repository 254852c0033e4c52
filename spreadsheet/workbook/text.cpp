#include "spreadsheet/workbook/text.h"

#include <algorithm>

namespace penmoor::engine {

bool equalsIgnoringCase(std::string_view a, std::string_view b)
{
    return std::equal(
        a.begin(), a.end(), b.begin(), b.end(), [](char x, char y) { return toAsciiUpper(x) == toAsciiUpper(y); });
}

int compareIgnoringCase(std::string_view a, std::string_view b)
{
    const auto [x, y] = std::mismatch(
        a.begin(), a.end(), b.begin(), b.end(), [](char p, char q) { return toAsciiUpper(p) == toAsciiUpper(q); });
    if (x == a.end())
        return y == b.end() ? 0 : -1;
    if (y == b.end())
        return 1;
    return static_cast<unsigned char>(toAsciiUpper(*x)) < static_cast<unsigned char>(toAsciiUpper(*y)) ? -1 : 1;
}

std::size_t characterCount(std::string_view text)
{
    return static_cast<std::size_t>(
        std::count_if(text.begin(), text.end(), [](char c) { return (static_cast<unsigned char>(c) & 0xC0) != 0x80; }));
}

} // namespace penmoor::engine
