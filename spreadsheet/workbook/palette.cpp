#include "spreadsheet/workbook/palette.h"

namespace penmoor::engine {

namespace {

constexpr std::uint32_t rgb(std::uint32_t red, std::uint32_t green, std::uint32_t blue)
{
    return red + 256 * green + 65536 * blue;
}

} // namespace

const Palette& defaultPalette()
{
    static constexpr Palette kPalette {
        rgb(0, 0, 0), rgb(255, 255, 255), rgb(255, 0, 0), rgb(0, 255, 0), // 1-4
        rgb(0, 0, 255), rgb(255, 255, 0), rgb(255, 0, 255), rgb(0, 255, 255), // 5-8
        rgb(128, 0, 0), rgb(0, 128, 0), rgb(0, 0, 128), rgb(128, 128, 0), // 9-12
        rgb(128, 0, 128), rgb(0, 128, 128), rgb(192, 192, 192), rgb(128, 128, 128), // 13-16
        rgb(153, 153, 255), rgb(153, 51, 102), rgb(255, 255, 204), rgb(204, 255, 255), // 17-20
        rgb(102, 0, 102), rgb(255, 128, 128), rgb(0, 102, 204), rgb(204, 204, 255), // 21-24
        rgb(0, 0, 128), rgb(255, 0, 255), rgb(255, 255, 0), rgb(0, 255, 255), // 25-28
        rgb(128, 0, 128), rgb(128, 0, 0), rgb(0, 128, 128), rgb(0, 0, 255), // 29-32
        rgb(0, 204, 255), rgb(204, 255, 255), rgb(204, 255, 204), rgb(255, 255, 153), // 33-36
        rgb(153, 204, 255), rgb(255, 153, 204), rgb(204, 153, 255), rgb(255, 204, 153), // 37-40
        rgb(51, 102, 255), rgb(51, 204, 204), rgb(153, 204, 0), rgb(255, 204, 0), // 41-44
        rgb(255, 153, 0), rgb(255, 102, 0), rgb(102, 102, 153), rgb(150, 150, 150), // 45-48
        rgb(0, 51, 102), rgb(51, 153, 102), rgb(0, 51, 0), rgb(51, 51, 0), // 49-52
        rgb(153, 51, 0), rgb(153, 51, 102), rgb(51, 51, 153), rgb(51, 51, 51), // 53-56
    };
    return kPalette;
}

} // namespace penmoor::engine
