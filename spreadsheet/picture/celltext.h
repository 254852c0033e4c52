#pragma once

#include "spreadsheet/picture/numberformat.h"
#include "spreadsheet/picture/textmetrics.h"

#include <string>
#include <string_view>
#include <vector>

namespace penmoor::picture {

// The text of one form with its repeated fill character spread over the box ("*-" formats).
std::string expandFill(const ShownForm& form, const FontSpec& font, int boxWidth, const TextMetrics& metrics);

// The one line a number shows in a box: the first of its forms that fits, or as many "#" signs as
// fit when none does, as the spreadsheet application shows a number too wide for its column.
std::string fitNumber(const ShownValue& shown, const FontSpec& font, int boxWidth, const TextMetrics& metrics);

// Text broken into lines no wider than the box: at line feeds, between words, and inside a word
// that is wider than the box on its own.
std::vector<std::string> wrapText(
    std::string_view text, const FontSpec& font, int boxWidth, const TextMetrics& metrics);

} // namespace penmoor::picture
