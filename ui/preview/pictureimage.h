#pragma once

#include "automation/contract/picture.h"

#include <QImage>
#include <QSize>

namespace penmoor {

// The sheet picture as a QImage; a null picture gives a null image. Throws
// std::invalid_argument when its pixels do not fill its size.
QImage toImage(const xl::Picture& picture);

// The whole image stretched to size, smoothly; an empty size gives a null image. Throws
// std::runtime_error when there is no memory for an image that large.
QImage stretched(const QImage& image, QSize size);

} // namespace penmoor
