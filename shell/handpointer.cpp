#include "shell/handpointer.h"

#include "shell/fileutils.h"
#include "shell/qtpaths.h"

#include <QFile>
#include <QImage>
#include <QPixmap>

namespace penmoor {

namespace {

// A cursor file starts with a directory: reserved (0), type (2 for cursors), image count,
// then one 16-byte entry per image, whose bytes 4 to 7 hold the hot spot's x and y.
constexpr qsizetype kDirectorySize = 6;
constexpr qsizetype kEntrySize = 16;
constexpr quint16 kCursorType = 2;

quint16 readWord(const QByteArray& bytes, qsizetype offset)
{
    return static_cast<quint16>(static_cast<quint8>(bytes[offset]) | static_cast<quint8>(bytes[offset + 1]) << 8);
}

bool isCursorFile(const QByteArray& bytes)
{
    return bytes.size() >= kDirectorySize + kEntrySize && readWord(bytes, 0) == 0 && readWord(bytes, 2) == kCursorType
        && readWord(bytes, 4) > 0;
}

} // namespace

QCursor loadHandPointer(const std::filesystem::path& programFolder)
{
    const QCursor hand(Qt::PointingHandCursor);
    const std::filesystem::path file = programFolder / kHandPointerFileName;
    if (!FileExists(file)) {
        return hand;
    }
    QFile source(toQString(file));
    if (!source.open(QIODevice::ReadOnly)) {
        return hand;
    }
    const QByteArray bytes = source.readAll();
    if (!isCursorFile(bytes)) {
        return hand;
    }
    const QImage image = QImage::fromData(bytes, "CUR");
    if (image.isNull()) {
        return hand;
    }
    const int hotX = readWord(bytes, kDirectorySize + 4);
    const int hotY = readWord(bytes, kDirectorySize + 6);
    return QCursor(QPixmap::fromImage(image), qMin(hotX, image.width() - 1), qMin(hotY, image.height() - 1));
}

} // namespace penmoor
