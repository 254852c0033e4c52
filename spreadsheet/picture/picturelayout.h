#pragma once

#include "spreadsheet/picture/geometry.h"
#include "spreadsheet/picture/sheetregion.h"
#include "spreadsheet/picture/textmetrics.h"

#include <cstdint>
#include <string>
#include <vector>

namespace penmoor::picture {

// What the picture of a block is made of, in pixels and 0xRRGGBB colours, in drawing order:
// the white page, fills, grid lines, text, then borders on top.

struct FillBox {
    PixelRect rect;
    std::uint32_t rgb = 0;
};

// A straight line along one row of pixels (horizontal) or one column of pixels (vertical), from
// `from` to `to` inclusive. Medium (2 pixels) and thick (3 pixels) lines are centred on the
// position, the extra pixel of a medium line falling before it.
struct LineSegment {
    enum class Orientation { Horizontal, Vertical };
    Orientation orientation = Orientation::Horizontal;
    int position = 0;
    int from = 0;
    int to = 0;
    std::uint32_t rgb = 0;
    BorderWeight weight = BorderWeight::Thin;
};

// One line of text at its pen position, drawn only inside its clip rectangle.
struct TextLine {
    std::string text;
    FontSpec font;
    std::uint32_t rgb = 0;
    int x = 0;
    int baseline = 0;
    PixelRect clip;
};

struct PictureLayout {
    int width = 0;
    int height = 0;
    std::vector<FillBox> fills;
    std::vector<LineSegment> gridlines;
    std::vector<TextLine> texts;
    std::vector<LineSegment> borders;
};

inline constexpr std::uint32_t kPageColor = 0xFFFFFF;
inline constexpr std::uint32_t kGridlineColor = 0xC0C0C0;

// The layout of a whole block, bounded as GridGeometry bounds it.
PictureLayout layOutPicture(const SheetRegion& region, const TextMetrics& metrics);

// A palette entry (red + 256 * green + 65536 * blue) as 0xRRGGBB.
std::uint32_t paletteRgb(std::uint32_t paletteValue);

} // namespace penmoor::picture
