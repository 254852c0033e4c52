#pragma once

#include <cstdint>
#include <vector>

namespace xl {

// A picture of a range as the spreadsheet application shows it at 96 dots per inch:
// 32-bit pixels 0xAARRGGBB, row by row from the top. It travels in-process, never through
// the system clipboard.
struct Picture {
    int width = 0;
    int height = 0;
    std::vector<std::uint32_t> pixels;

    bool isNull() const { return width <= 0 || height <= 0; }
};

} // namespace xl
