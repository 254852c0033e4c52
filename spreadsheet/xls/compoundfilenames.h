#pragma once

#include <string_view>

namespace penmoor::xls::cfb {

// Entry names compare without regard to letter case. Only ASCII letters are folded: every name
// this program writes or looks up is ASCII, and folding more would need the full Unicode tables.
inline char16_t foldEntryNameUnit(char16_t unit)
{
    return (unit >= u'a' && unit <= u'z') ? static_cast<char16_t>(unit - u'a' + u'A') : unit;
}

inline bool sameEntryName(std::u16string_view a, std::u16string_view b)
{
    if (a.size() != b.size())
        return false;
    for (std::size_t i = 0; i < a.size(); ++i) {
        if (foldEntryNameUnit(a[i]) != foldEntryNameUnit(b[i]))
            return false;
    }
    return true;
}

// The order of the directory's sibling trees: a shorter name is smaller; names of equal length
// compare unit by unit after folding.
inline bool entryNameLess(std::u16string_view a, std::u16string_view b)
{
    if (a.size() != b.size())
        return a.size() < b.size();
    for (std::size_t i = 0; i < a.size(); ++i) {
        const char16_t x = foldEntryNameUnit(a[i]);
        const char16_t y = foldEntryNameUnit(b[i]);
        if (x != y)
            return x < y;
    }
    return false;
}

} // namespace penmoor::xls::cfb
