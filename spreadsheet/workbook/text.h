#pragma once

#include <cstddef>
#include <string_view>

namespace penmoor::engine {

// Names, keywords and format codes compare without regard to the case of ASCII letters.
constexpr char toAsciiUpper(char c)
{
    return c >= 'a' && c <= 'z' ? static_cast<char>(c - 'a' + 'A') : c;
}
bool equalsIgnoringCase(std::string_view a, std::string_view b);
// Negative, zero or positive as a sorts before, with or after b, ignoring ASCII letter case.
int compareIgnoringCase(std::string_view a, std::string_view b);

// The number of characters (code points) of UTF-8 text.
std::size_t characterCount(std::string_view text);

} // namespace penmoor::engine
