#pragma once

#include "automation/contract/picture.h"
#include "spreadsheet/picture/picturelayout.h"
#include "spreadsheet/picture/qttextmetrics.h"
#include "spreadsheet/picture/sheetregion.h"

#include <cstdint>
#include <vector>

#include <QImage>

namespace penmoor::picture {

// Paints a laid-out picture onto a white 96-dpi image with the fonts the metrics measured.
// Needs a QGuiApplication (the offscreen platform serves); raises xl::Error without one, or when
// the image cannot be allocated.
QImage paintLayout(const PictureLayout& layout, const QtTextMetrics& metrics);

// Lays out and paints a block of a sheet in one go.
xl::Picture paintSheetRegion(const SheetRegion& region);

// Conversions between the in-process picture and Qt's image, and the image files.
xl::Picture toPicture(const QImage& image);
QImage toImage(const xl::Picture& picture);
std::vector<std::uint8_t> encodePng(const xl::Picture& picture);

} // namespace penmoor::picture
