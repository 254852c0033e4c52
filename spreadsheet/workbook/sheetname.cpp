#include "spreadsheet/workbook/sheetname.h"

#include "automation/contract/error.h"
#include "spreadsheet/workbook/text.h"

#include <algorithm>
#include <optional>
#include <string>

namespace penmoor::engine {

namespace {

constexpr int kMaxSheetNameLength = 31; // in UTF-16 units, as the .xls sheet record stores it
constexpr std::string_view kForbiddenCharacters = ":\\/?*[]";

// The name's length in UTF-16 units, or nothing when it is not valid UTF-8.
std::optional<int> utf16Length(std::string_view text)
{
    int units = 0;
    for (std::size_t i = 0; i < text.size();) {
        const auto lead = static_cast<unsigned char>(text[i]);
        int length = 0;
        std::uint32_t codePoint = 0;
        if (lead < 0x80) {
            length = 1;
            codePoint = lead;
        } else if ((lead & 0xE0) == 0xC0) {
            length = 2;
            codePoint = lead & 0x1Fu;
        } else if ((lead & 0xF0) == 0xE0) {
            length = 3;
            codePoint = lead & 0x0Fu;
        } else if ((lead & 0xF8) == 0xF0) {
            length = 4;
            codePoint = lead & 0x07u;
        } else {
            return std::nullopt;
        }
        if (i + static_cast<std::size_t>(length) > text.size())
            return std::nullopt;
        for (int k = 1; k < length; ++k) {
            const auto next = static_cast<unsigned char>(text[i + static_cast<std::size_t>(k)]);
            if ((next & 0xC0) != 0x80)
                return std::nullopt;
            codePoint = codePoint << 6 | (next & 0x3Fu);
        }
        static constexpr std::uint32_t kSmallest[] = { 0, 0, 0x80, 0x800, 0x10000 };
        if (codePoint < kSmallest[length] || codePoint > 0x10FFFF || (codePoint >= 0xD800 && codePoint <= 0xDFFF))
            return std::nullopt;
        units += codePoint >= 0x10000 ? 2 : 1;
        i += static_cast<std::size_t>(length);
    }
    return units;
}

} // namespace

void checkSheetNameRules(std::string_view name)
{
    const std::string quoted = std::string("\"").append(name).append("\"");
    if (name.empty())
        throw xl::Error("A sheet name cannot be empty.");
    const std::optional<int> length = utf16Length(name);
    if (!length)
        throw xl::Error("The sheet name " + quoted + " is not valid UTF-8 text.");
    if (*length > kMaxSheetNameLength)
        throw xl::Error("The sheet name " + quoted + " is longer than 31 characters.");
    const auto forbidden = std::find_if(name.begin(), name.end(), [](char c) {
        return kForbiddenCharacters.find(c) != std::string_view::npos || static_cast<unsigned char>(c) < 0x20;
    });
    if (forbidden != name.end())
        throw xl::Error("The sheet name " + quoted
            + " contains a character that sheet names cannot contain (: \\ / ? * [ ] or a control character).");
    if (name.front() == '\'' || name.back() == '\'')
        throw xl::Error("The sheet name " + quoted + " cannot begin or end with an apostrophe.");
}

bool sameSheetName(std::string_view a, std::string_view b)
{
    return equalsIgnoringCase(a, b);
}

} // namespace penmoor::engine
