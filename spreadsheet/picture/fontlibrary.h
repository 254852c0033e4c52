#pragma once

#include "spreadsheet/picture/sheetregion.h"

#include <QFont>

namespace penmoor::picture {

// The fonts of the picture. The metric-compatible Liberation fonts built into the program stand
// in for Arial (and, where installed, for Times New Roman and Courier New), so the picture looks
// the same whatever fonts the machine has. Sizes follow 96 dots per inch: 10 points are 13 pixels.
// Needs a QGuiApplication.
QFont pictureFont(const FontSpec& spec);

} // namespace penmoor::picture
