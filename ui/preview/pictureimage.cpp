#include "ui/preview/pictureimage.h"

#include <cstring>
#include <stdexcept>
#include <string>

namespace penmoor {

namespace {

std::string sizeText(int width, int height)
{
    return std::to_string(width) + " x " + std::to_string(height) + " pixels";
}

QImage allocated(QImage image, int width, int height)
{
    if (image.isNull()) {
        throw std::runtime_error("There is not enough memory to show the picture at " + sizeText(width, height) + ".");
    }
    return image;
}

} // namespace

QImage toImage(const xl::Picture& picture)
{
    if (picture.isNull()) {
        return {};
    }
    const std::size_t width = static_cast<std::size_t>(picture.width);
    if (picture.pixels.size() != width * static_cast<std::size_t>(picture.height)) {
        throw std::invalid_argument("The picture of the sheet is damaged: it has "
            + std::to_string(picture.pixels.size()) + " pixels for " + sizeText(picture.width, picture.height) + ".");
    }
    // Both hold 0xAARRGGBB per pixel, row by row from the top.
    QImage image
        = allocated(QImage(picture.width, picture.height, QImage::Format_ARGB32), picture.width, picture.height);
    for (int y = 0; y < picture.height; ++y) {
        std::memcpy(image.scanLine(y), picture.pixels.data() + static_cast<std::size_t>(y) * width,
            width * sizeof(std::uint32_t));
    }
    return image;
}

QImage stretched(const QImage& image, QSize size)
{
    if (size.isEmpty() || image.isNull()) {
        return {};
    }
    if (image.size() == size) {
        return image;
    }
    return allocated(image.scaled(size, Qt::IgnoreAspectRatio, Qt::SmoothTransformation), size.width(), size.height());
}

} // namespace penmoor
