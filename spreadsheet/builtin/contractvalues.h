#pragma once

#include "spreadsheet/workbook/formatting.h"
#include "spreadsheet/workbook/pagesetup.h"
#include "spreadsheet/workbook/style.h"

#include <cstdint>
#include <string>

namespace penmoor::engine {

// Conversions between the contract's enumeration values (automation/contract/constants.h) and
// the workbook model, each raising xl::Error with a text that names the rejected value.

HorizontalAlignment horizontalAlignmentFrom(int value);
int toContract(HorizontalAlignment alignment);
VerticalAlignment verticalAlignmentFrom(int value);
int toContract(VerticalAlignment alignment);

// Borders(edge) index 7 to 12.
BorderIndex borderIndexFrom(int edge);
// A border Weight; LineStyle::None is not a weight.
LineStyle lineWeightFrom(int weight);
int weightToContract(LineStyle line);

// Colour indexes 1 to 56, or automatic (fonts, borders); none (fills).
std::uint8_t fontColorFrom(int colorIndex);
std::uint8_t borderColorFrom(int colorIndex);
std::uint8_t fillColorFrom(int colorIndex);
int fontColorToContract(std::uint8_t colorIndex);
int fillColorToContract(std::uint8_t colorIndex);

// "Regular", "Bold", "Italic" or "Bold Italic" in either letter case.
void applyFontStyle(const std::string& style, Font& font);
std::string fontStyleName(const Font& font);

Orientation orientationFrom(int value);
int toContract(Orientation orientation);
CommentPrinting commentPrintingFrom(int value);
int toContract(CommentPrinting comments);

} // namespace penmoor::engine
