#pragma once

#include "automation/contract/picture.h"

#include <cstdint>
#include <vector>

namespace penmoor::picture {

// The picture as the bytes of a Windows bitmap file: 24 bits per pixel, uncompressed, rows
// from the bottom up, each padded to a multiple of 4 bytes, 96 dots per inch. Raises xl::Error
// for an empty picture, which no bitmap file can hold.
std::vector<std::uint8_t> encodeBmp(const xl::Picture& picture);

} // namespace penmoor::picture
