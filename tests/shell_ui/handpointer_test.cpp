#include "shell/handpointer.h"
#include "tests/support/temporaryfolder.h"

#include <filesystem>
#include <fstream>

#include <QBuffer>
#include <QImage>
#include <QImageWriter>

#include <gtest/gtest.h>

namespace penmoor {
namespace {

// The bytes of a 32 x 32 icon file, the form Qt writes.
QByteArray iconBytes()
{
    QImage image(32, 32, QImage::Format_ARGB32);
    image.fill(Qt::darkBlue);
    QByteArray bytes;
    QBuffer buffer(&bytes);
    buffer.open(QIODevice::WriteOnly);
    EXPECT_TRUE(QImageWriter(&buffer, "ico").write(image));
    return bytes;
}

// A cursor file differs from an icon file in its type word and in the hot spot that takes the
// place of the icon's planes and bit count.
QByteArray cursorBytes(int hotX, int hotY)
{
    QByteArray bytes = iconBytes();
    bytes[2] = 2;
    bytes[10] = static_cast<char>(hotX);
    bytes[11] = 0;
    bytes[12] = static_cast<char>(hotY);
    bytes[13] = 0;
    return bytes;
}

class HandPointerTest : public ::testing::Test {
protected:
    void writePointerFile(const QByteArray& bytes)
    {
        std::ofstream out(folder / std::string(kHandPointerFileName), std::ios::binary);
        out.write(bytes.constData(), bytes.size());
    }

    testing::TemporaryFolder folder;
};

TEST_F(HandPointerTest, WithoutThePointerFileTheSystemHandIsUsed)
{
    EXPECT_EQ(loadHandPointer(folder.path()).shape(), Qt::PointingHandCursor);
}

TEST_F(HandPointerTest, ThePointerFileGivesItsImageAndHotSpot)
{
    writePointerFile(cursorBytes(5, 7));

    const QCursor pointer = loadHandPointer(folder.path());

    ASSERT_EQ(pointer.shape(), Qt::BitmapCursor);
    EXPECT_EQ(pointer.pixmap().size(), QSize(32, 32));
    EXPECT_EQ(pointer.hotSpot(), QPoint(5, 7));

    // A hot spot outside the image is kept on it.
    writePointerFile(cursorBytes(200, 40));
    EXPECT_EQ(loadHandPointer(folder.path()).hotSpot(), QPoint(31, 31));
}

TEST_F(HandPointerTest, FilesThatAreNoCursorGiveTheSystemHand)
{
    const QByteArray cursor = cursorBytes(1, 1);
    const struct {
        const char* what;
        QByteArray bytes;
    } cases[] = {
        { "an icon file", iconBytes() },
        { "an empty file", QByteArray() },
        { "a cut-off directory", cursor.left(12) },
        { "a directory without image data", cursor.left(22) },
        { "text", QByteArray("not a cursor at all, just some words in a file") },
    };
    for (const auto& c : cases) {
        writePointerFile(c.bytes);
        EXPECT_EQ(loadHandPointer(folder.path()).shape(), Qt::PointingHandCursor) << c.what;
    }
}

TEST_F(HandPointerTest, AFolderOfThePointerFilesNameIsNoPointerFile)
{
    std::filesystem::create_directory(folder / std::string(kHandPointerFileName));

    EXPECT_EQ(loadHandPointer(folder.path()).shape(), Qt::PointingHandCursor);
}

} // namespace
} // namespace penmoor
