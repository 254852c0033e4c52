#include "spreadsheet/xls/units.h"

#include <algorithm>
#include <cmath>

namespace penmoor::xls {

namespace {

constexpr double kDigitPixels = 7;
constexpr double kPaddingPixels = 5;

} // namespace

std::uint16_t columnWidthToFile(double characters)
{
    const double width = std::trunc((characters * kDigitPixels + kPaddingPixels) / kDigitPixels * 256);
    return static_cast<std::uint16_t>(std::clamp(width, 0.0, 65535.0));
}

double columnWidthFromFile(std::uint16_t width)
{
    const double characters = (width / 256.0 * kDigitPixels - kPaddingPixels) / kDigitPixels;
    return std::max(0.0, std::round(characters * 100) / 100);
}

std::uint16_t pointsToTwips(double points)
{
    return static_cast<std::uint16_t>(std::clamp(std::lround(points * 20), 0L, 65535L));
}

double twipsToPoints(std::uint16_t twips)
{
    return twips / 20.0;
}

} // namespace penmoor::xls
