#pragma once

#include <array>
#include <cstdint>

namespace penmoor {

struct PaletteColour {
    std::uint8_t red = 0;
    std::uint8_t green = 0;
    std::uint8_t blue = 0;

    // The 32-bit colour value the workbook's palette takes: red + 256 * green + 65536 * blue.
    constexpr std::uint32_t value() const { return red + 256u * green + 65536u * blue; }

    friend constexpr bool operator==(const PaletteColour&, const PaletteColour&) = default;
};

// The workbook's 56 palette colours; entry 0 is colour number 1.
using PaletteTable = std::array<PaletteColour, 56>;

// The fixed look of every workbook: the colour indexes the sheet builder uses (heading shade,
// total rows, title colour) refer to this table.
inline constexpr PaletteTable kPaletteColours = { {
    { 0, 0, 0 }, { 255, 255, 255 }, { 255, 0, 0 }, { 0, 255, 0 }, // 1-4
    { 104, 150, 206 }, { 255, 255, 0 }, { 255, 0, 255 }, { 0, 255, 255 }, // 5-8
    { 128, 0, 0 }, { 84, 125, 146 }, { 184, 203, 214 }, { 55, 82, 95 }, // 9-12
    { 59, 59, 59 }, { 0, 128, 128 }, { 224, 224, 224 }, { 128, 128, 128 }, // 13-16
    { 153, 153, 255 }, { 8, 132, 131 }, { 249, 247, 105 }, { 204, 255, 255 }, // 17-20
    { 102, 0, 102 }, { 255, 128, 128 }, { 0, 102, 204 }, { 204, 204, 255 }, // 21-24
    { 0, 0, 128 }, { 255, 0, 255 }, { 255, 255, 0 }, { 0, 255, 255 }, // 25-28
    { 128, 0, 128 }, { 128, 0, 0 }, { 0, 128, 128 }, { 0, 0, 255 }, // 29-32
    { 0, 204, 255 }, { 254, 252, 242 }, { 204, 255, 204 }, { 255, 231, 189 }, // 33-36
    { 252, 250, 242 }, { 255, 153, 204 }, { 224, 255, 215 }, { 253, 247, 223 }, // 37-40
    { 51, 102, 255 }, { 51, 204, 204 }, { 177, 255, 209 }, { 255, 204, 0 }, // 41-44
    { 255, 153, 0 }, { 255, 102, 0 }, { 251, 248, 239 }, { 207, 207, 207 }, // 45-48
    { 190, 190, 190 }, { 51, 153, 102 }, { 115, 158, 211 }, { 236, 245, 215 }, // 49-52
    { 153, 51, 0 }, { 153, 51, 102 }, { 204, 255, 204 }, { 51, 51, 51 }, // 53-56
} };

} // namespace penmoor
