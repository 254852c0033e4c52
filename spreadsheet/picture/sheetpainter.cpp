#include "spreadsheet/picture/sheetpainter.h"

#include "automation/contract/error.h"

#include <cstring>

#include <QBuffer>
#include <QGuiApplication>
#include <QPainter>
#include <QString>

namespace penmoor::picture {

namespace {

constexpr int kDotsPerMetre = 3780; // 96 dots per inch

int lineThickness(BorderWeight weight)
{
    switch (weight) {
    case BorderWeight::Medium:
        return 2;
    case BorderWeight::Thick:
        return 3;
    default:
        return 1;
    }
}

void paintLine(QPainter& painter, const LineSegment& line)
{
    const QColor color = QColor::fromRgb(line.rgb);
    const int thickness = lineThickness(line.weight);
    const int start = line.position - (thickness > 1 ? 1 : 0);
    const bool vertical = line.orientation == LineSegment::Orientation::Vertical;
    if (line.weight == BorderWeight::Hairline) {
        // Dotted: every other pixel.
        for (int along = line.from; along <= line.to; along += 2) {
            painter.fillRect(vertical ? QRect(line.position, along, 1, 1) : QRect(along, line.position, 1, 1), color);
        }
        return;
    }
    const int length = line.to - line.from + 1;
    painter.fillRect(
        vertical ? QRect(start, line.from, thickness, length) : QRect(line.from, start, length, thickness), color);
}

QRect toQRect(const PixelRect& rect)
{
    return QRect(rect.left, rect.top, rect.width(), rect.height());
}

// Fonts and their metrics need the application object; fail with a clear error instead.
void requireGuiApplication()
{
    if (!QGuiApplication::instance()) {
        throw xl::Error("The sheet picture cannot be drawn: the program's graphics services are not running.");
    }
}

} // namespace

QImage paintLayout(const PictureLayout& layout, const QtTextMetrics& metrics)
{
    requireGuiApplication();
    QImage image(std::max(layout.width, 1), std::max(layout.height, 1), QImage::Format_RGB32);
    if (image.isNull()) {
        throw xl::Error("There is not enough memory for a picture of the sheet.");
    }
    image.setDotsPerMeterX(kDotsPerMetre);
    image.setDotsPerMeterY(kDotsPerMetre);
    image.fill(QColor::fromRgb(kPageColor));

    QPainter painter(&image);
    for (const FillBox& fill : layout.fills) {
        painter.fillRect(toQRect(fill.rect), QColor::fromRgb(fill.rgb));
    }
    for (const LineSegment& line : layout.gridlines) {
        paintLine(painter, line);
    }
    painter.setRenderHint(QPainter::TextAntialiasing, true);
    for (const TextLine& text : layout.texts) {
        painter.setClipRect(toQRect(text.clip));
        painter.setFont(metrics.font(text.font));
        painter.setPen(QColor::fromRgb(text.rgb));
        painter.drawText(QPoint(text.x, text.baseline),
            QString::fromUtf8(text.text.data(), static_cast<qsizetype>(text.text.size())));
    }
    painter.setClipping(false);
    for (const LineSegment& line : layout.borders) {
        paintLine(painter, line);
    }
    painter.end();
    return image;
}

xl::Picture paintSheetRegion(const SheetRegion& region)
{
    requireGuiApplication();
    const QtTextMetrics metrics;
    return toPicture(paintLayout(layOutPicture(region, metrics), metrics));
}

xl::Picture toPicture(const QImage& source)
{
    const QImage image = source.format() == QImage::Format_RGB32 || source.format() == QImage::Format_ARGB32
        ? source
        : source.convertToFormat(QImage::Format_ARGB32);
    xl::Picture picture;
    picture.width = image.width();
    picture.height = image.height();
    picture.pixels.resize(static_cast<std::size_t>(picture.width) * static_cast<std::size_t>(picture.height));
    for (int y = 0; y < picture.height; ++y) {
        std::memcpy(picture.pixels.data() + static_cast<std::size_t>(y) * static_cast<std::size_t>(picture.width),
            image.constScanLine(y), static_cast<std::size_t>(picture.width) * sizeof(std::uint32_t));
    }
    return picture;
}

QImage toImage(const xl::Picture& picture)
{
    if (picture.isNull()
        || picture.pixels.size()
            != static_cast<std::size_t>(picture.width) * static_cast<std::size_t>(picture.height)) {
        return {};
    }
    QImage image(picture.width, picture.height, QImage::Format_ARGB32);
    if (image.isNull()) {
        throw xl::Error("There is not enough memory for a picture of the sheet.");
    }
    for (int y = 0; y < picture.height; ++y) {
        std::memcpy(image.scanLine(y),
            picture.pixels.data() + static_cast<std::size_t>(y) * static_cast<std::size_t>(picture.width),
            static_cast<std::size_t>(picture.width) * sizeof(std::uint32_t));
    }
    image.setDotsPerMeterX(kDotsPerMetre);
    image.setDotsPerMeterY(kDotsPerMetre);
    return image;
}

std::vector<std::uint8_t> encodePng(const xl::Picture& picture)
{
    const QImage image = toImage(picture);
    if (image.isNull()) {
        throw xl::Error("The sheet picture is empty, so no PNG file can be written.");
    }
    QByteArray bytes;
    QBuffer buffer(&bytes);
    buffer.open(QIODevice::WriteOnly);
    if (!image.save(&buffer, "PNG")) {
        throw xl::Error("The sheet picture could not be encoded as PNG.");
    }
    return std::vector<std::uint8_t>(bytes.begin(), bytes.end());
}

} // namespace penmoor::picture
