#pragma once

#include "automation/contract/picture.h"

#include <filesystem>

namespace penmoor {

// The sheet picture file of a build: a Windows bitmap, 24 bits per pixel.

// Writes the picture to path, replacing a file there. Raises std::runtime_error with the
// system's reason, or xl::Error for a picture that no bitmap can hold.
void writePictureFile(const std::filesystem::path& path, const xl::Picture& picture);

// Loads a picture file as writePictureFile writes it (uncompressed, 24 bits per pixel, rows
// from the bottom up). Raises std::runtime_error when the file is missing, cannot be read
// or holds anything else.
xl::Picture loadPictureFile(const std::filesystem::path& path);

} // namespace penmoor
