#pragma once

#include <cstdint>

namespace penmoor::xls {

// Column widths: the model counts characters of the standard font's digit (Arial 10: 7 pixels),
// without the 5 pixels of padding a column has; the file counts 1/256 of a digit with the
// padding. The file's resolution (1/256 character) is finer than the 1/100 the program sets
// widths in, so a width with two decimals comes back exactly.
std::uint16_t columnWidthToFile(double characters);
double columnWidthFromFile(std::uint16_t width);

// Row heights and font sizes: points in the model, twips (1/20 point) in the file.
std::uint16_t pointsToTwips(double points);
double twipsToPoints(std::uint16_t twips);

} // namespace penmoor::xls
