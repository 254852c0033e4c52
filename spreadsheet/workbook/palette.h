#pragma once

#include <array>
#include <cstdint>

namespace penmoor::engine {

inline constexpr int kPaletteSize = 56;

// Colours as red + 256 * green + 65536 * blue, for colour indexes 1 to 56.
using Palette = std::array<std::uint32_t, kPaletteSize>;

// The palette of a new workbook in the desktop application.
const Palette& defaultPalette();

} // namespace penmoor::engine
