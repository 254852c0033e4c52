#include "spreadsheet/builtin/contractvalues.h"

#include "automation/contract/constants.h"
#include "automation/contract/error.h"
#include "spreadsheet/workbook/text.h"

#include <algorithm>
#include <array>
#include <utility>

namespace penmoor::engine {

namespace {

// Looks a contract value up in a table of pairs, raising the error text when it is missing.
template <class Model, std::size_t N>
Model fromTable(const std::array<std::pair<int, Model>, N>& table, int value, const std::string& what)
{
    const auto it = std::find_if(table.begin(), table.end(), [&](const auto& entry) { return entry.first == value; });
    if (it == table.end())
        throw xl::Error("The " + what + " " + std::to_string(value) + " is not supported.");
    return it->second;
}

template <class Model, std::size_t N> int toTable(const std::array<std::pair<int, Model>, N>& table, Model model)
{
    const auto it = std::find_if(table.begin(), table.end(), [&](const auto& entry) { return entry.second == model; });
    return it->first;
}

constexpr std::array<std::pair<int, HorizontalAlignment>, 4> kHorizontal { {
    { xl::kAlignGeneral, HorizontalAlignment::General },
    { xl::kAlignLeft, HorizontalAlignment::Left },
    { xl::kAlignCenter, HorizontalAlignment::Center },
    { xl::kAlignRight, HorizontalAlignment::Right },
} };

constexpr std::array<std::pair<int, VerticalAlignment>, 3> kVertical { {
    { xl::kAlignTop, VerticalAlignment::Top },
    { xl::kAlignCenter, VerticalAlignment::Center },
    { xl::kAlignBottom, VerticalAlignment::Bottom },
} };

constexpr std::array<std::pair<int, BorderIndex>, 6> kBorders { {
    { xl::kEdgeLeft, BorderIndex::EdgeLeft },
    { xl::kEdgeTop, BorderIndex::EdgeTop },
    { xl::kEdgeBottom, BorderIndex::EdgeBottom },
    { xl::kEdgeRight, BorderIndex::EdgeRight },
    { xl::kInsideVertical, BorderIndex::InsideVertical },
    { xl::kInsideHorizontal, BorderIndex::InsideHorizontal },
} };

constexpr std::array<std::pair<int, LineStyle>, 4> kWeights { {
    { xl::kWeightHairline, LineStyle::Hair },
    { xl::kWeightThin, LineStyle::Thin },
    { xl::kWeightMedium, LineStyle::Medium },
    { xl::kWeightThick, LineStyle::Thick },
} };

constexpr std::array<std::pair<int, Orientation>, 2> kOrientations { {
    { xl::kOrientationPortrait, Orientation::Portrait },
    { xl::kOrientationLandscape, Orientation::Landscape },
} };

constexpr std::array<std::pair<int, CommentPrinting>, 3> kComments { {
    { xl::kPrintNoComments, CommentPrinting::None },
    { xl::kPrintCommentsInPlace, CommentPrinting::InPlace },
    { xl::kPrintCommentsAtEnd, CommentPrinting::AtEnd },
} };

std::uint8_t paletteIndex(int colorIndex, const std::string& what)
{
    if (colorIndex < 1 || colorIndex > 56)
        throw xl::Error("The " + what + " " + std::to_string(colorIndex)
            + " is not a colour of the palette (1 to 56) or automatic.");
    return static_cast<std::uint8_t>(colorIndex);
}

} // namespace

HorizontalAlignment horizontalAlignmentFrom(int value)
{
    return fromTable(kHorizontal, value, "horizontal alignment");
}
int toContract(HorizontalAlignment alignment)
{
    return toTable(kHorizontal, alignment);
}
VerticalAlignment verticalAlignmentFrom(int value)
{
    return fromTable(kVertical, value, "vertical alignment");
}
int toContract(VerticalAlignment alignment)
{
    return toTable(kVertical, alignment);
}

BorderIndex borderIndexFrom(int edge)
{
    return fromTable(kBorders, edge, "border index");
}
LineStyle lineWeightFrom(int weight)
{
    return fromTable(kWeights, weight, "border weight");
}
int weightToContract(LineStyle line)
{
    return line == LineStyle::None ? xl::kWeightThin : toTable(kWeights, line);
}

std::uint8_t fontColorFrom(int colorIndex)
{
    return colorIndex == xl::kColorIndexAutomatic ? kAutomaticColor : paletteIndex(colorIndex, "font colour index");
}

std::uint8_t borderColorFrom(int colorIndex)
{
    return colorIndex == xl::kColorIndexAutomatic ? kAutomaticColor : paletteIndex(colorIndex, "border colour index");
}

std::uint8_t fillColorFrom(int colorIndex)
{
    if (colorIndex == xl::kColorIndexNone || colorIndex == xl::kColorIndexAutomatic)
        return kNoFill;
    return paletteIndex(colorIndex, "fill colour index");
}

int fontColorToContract(std::uint8_t colorIndex)
{
    return colorIndex == kAutomaticColor ? xl::kColorIndexAutomatic : colorIndex;
}

int fillColorToContract(std::uint8_t colorIndex)
{
    return colorIndex == kNoFill ? xl::kColorIndexNone : colorIndex;
}

void applyFontStyle(const std::string& style, Font& font)
{
    if (equalsIgnoringCase(style, "Regular")) {
        font.bold = font.italic = false;
    } else if (equalsIgnoringCase(style, "Bold")) {
        font.bold = true;
        font.italic = false;
    } else if (equalsIgnoringCase(style, "Italic")) {
        font.bold = false;
        font.italic = true;
    } else if (equalsIgnoringCase(style, "Bold Italic")) {
        font.bold = font.italic = true;
    } else {
        throw xl::Error("The font style \"" + style + "\" is not one of Regular, Bold, Italic and Bold Italic.");
    }
}

std::string fontStyleName(const Font& font)
{
    if (font.bold)
        return font.italic ? "Bold Italic" : "Bold";
    return font.italic ? "Italic" : "Regular";
}

Orientation orientationFrom(int value)
{
    return fromTable(kOrientations, value, "page orientation");
}
int toContract(Orientation orientation)
{
    return toTable(kOrientations, orientation);
}
CommentPrinting commentPrintingFrom(int value)
{
    return fromTable(kComments, value, "comment printing mode");
}
int toContract(CommentPrinting comments)
{
    return toTable(kComments, comments);
}

} // namespace penmoor::engine
