#include "automation/contract/error.h"
#include "spreadsheet/picture/bmpfile.h"
#include "spreadsheet/picture/qttextmetrics.h"
#include "spreadsheet/picture/sheetpainter.h"
#include "tests/picture_layout/syntheticregion.h"

#include <gtest/gtest.h>

namespace penmoor::picture {
namespace {

// Paints small synthetic sheets and probes pixels; paint_main.cpp provides the application.
class PaintTest : public ::testing::Test {
protected:
    // Columns of 10 characters (75 pixels) and rows of 15 points (20 pixels), every palette
    // index a colour of its own.
    void makeSheet(int rows, int columns) { region = test::syntheticRegion(rows, columns); }
    void setFormat(int row, int column, const CellFormat& format) { test::setCellFormat(region, row, column, format); }
    void setValue(int row, int column, const xl::Value& value) { test::setCellValue(region, row, column, value); }

    QImage paint() const { return toImage(paintSheetRegion(region)); }

    // Pixels clearly darker than the page: glyphs.
    static int inkIn(const QImage& image, const QRect& area)
    {
        int count = 0;
        for (int y = area.top(); y <= area.bottom(); ++y) {
            for (int x = area.left(); x <= area.right(); ++x) {
                count += qGray(image.pixel(x, y)) < 160 ? 1 : 0;
            }
        }
        return count;
    }

    SheetRegion region;
};

TEST_F(PaintTest, ArialIsDrawnWithTheBuiltInLiberationSans)
{
    const QtTextMetrics metrics;
    const FontSpec arial;
    EXPECT_EQ(metrics.font(arial).family(), QStringLiteral("Liberation Sans"));
    EXPECT_EQ(metrics.font(arial).pixelSize(), 13);
    // The widest digit of Arial 10 is what column widths count in.
    for (const char* digit : { "0", "4", "8" }) {
        EXPECT_EQ(metrics.width(arial, digit), 7) << digit;
    }
    FontSpec bold;
    bold.bold = true;
    bold.sizePoints = 19.0;
    EXPECT_EQ(metrics.font(bold).pixelSize(), 25);
    EXPECT_GT(metrics.width(bold, "Cash flow"), metrics.width(arial, "Cash flow"));
}

TEST_F(PaintTest, ImageSizeFillAndBorderPixels)
{
    makeSheet(2, 3);
    CellFormat shaded;
    shaded.fillColorIndex = 55;
    shaded.right = { BorderWeight::Thin, 16 };
    setFormat(1, 1, shaded);
    const QImage image = paint();
    EXPECT_EQ(image.width(), 3 * 75 + 1);
    EXPECT_EQ(image.height(), 2 * 20 + 1);
    EXPECT_EQ(image.dotsPerMeterX(), 3780);

    const QRgb fill = paletteRgb(region.palette[54]);
    EXPECT_EQ(image.pixel(112, 30) & 0xFFFFFF, fill);
    // The border line sits on the line between columns 1 and 2, one pixel wide.
    const QRgb line = paletteRgb(region.palette[15]);
    EXPECT_EQ(image.pixel(150, 30) & 0xFFFFFF, line);
    EXPECT_EQ(image.pixel(149, 30) & 0xFFFFFF, fill);
    EXPECT_EQ(image.pixel(151, 30) & 0xFFFFFF, kPageColor);
    // Grid lines where nothing is filled, none around the filled cell.
    EXPECT_EQ(image.pixel(75, 10) & 0xFFFFFF, kGridlineColor);
    EXPECT_EQ(image.pixel(75, 30) & 0xFFFFFF, fill);
    EXPECT_EQ(image.pixel(30, 30) & 0xFFFFFF, kPageColor);
}

TEST_F(PaintTest, TextInkStaysInItsCellOrSpillsIntoEmptyNeighbours)
{
    makeSheet(3, 3);
    setValue(0, 0, std::string("Short"));
    const std::string longText = "A label far wider than its column";
    setValue(1, 0, longText);
    setValue(2, 0, longText);
    setValue(2, 1, std::string(" ")); // content without ink: the spill stops here
    const QImage image = paint();

    EXPECT_GT(inkIn(image, QRect(1, 1, 74, 19)), 20);
    EXPECT_EQ(inkIn(image, QRect(76, 1, 74, 19)), 0);
    EXPECT_GT(inkIn(image, QRect(76, 21, 74, 19)), 20); // spilled
    EXPECT_EQ(inkIn(image, QRect(76, 41, 149, 19)), 0); // clipped at the neighbour
    EXPECT_GT(inkIn(image, QRect(1, 41, 74, 19)), 20);
}

TEST_F(PaintTest, FontColourAndFormatColour)
{
    makeSheet(2, 1);
    CellFormat coloured;
    coloured.fontColorIndex = 12;
    coloured.font.bold = true;
    coloured.font.sizePoints = 12.0;
    setFormat(0, 0, coloured);
    setValue(0, 0, std::string("HHHH"));
    CellFormat red;
    red.numberFormat = "[Red]0";
    setFormat(1, 0, red);
    setValue(1, 0, 8888.0);
    const QImage image = paint();
    auto darkestIn = [&](const QRect& area) {
        QRgb best = 0xFFFFFFFF;
        for (int y = area.top(); y <= area.bottom(); ++y) {
            for (int x = area.left(); x <= area.right(); ++x) {
                if (qGray(image.pixel(x, y)) < qGray(best)) {
                    best = image.pixel(x, y);
                }
            }
        }
        return best & 0xFFFFFF;
    };
    EXPECT_EQ(darkestIn(QRect(1, 1, 74, 19)), paletteRgb(region.palette[11]));
    EXPECT_EQ(darkestIn(QRect(1, 21, 74, 19)), 0xFF0000u);
}

TEST_F(PaintTest, PngAndBitmapFilesReadBackAsPainted)
{
    makeSheet(2, 2);
    CellFormat shaded;
    shaded.fillColorIndex = 43;
    setFormat(0, 1, shaded);
    setValue(1, 0, std::string("Text"));
    const xl::Picture picture = paintSheetRegion(region);
    const QImage painted = toImage(picture);

    for (const auto& [name, bytes] :
        { std::pair { "PNG", encodePng(picture) }, std::pair { "BMP", encodeBmp(picture) } }) {
        QImage loaded;
        ASSERT_TRUE(loaded.loadFromData(bytes.data(), static_cast<int>(bytes.size()), name)) << name;
        ASSERT_EQ(loaded.size(), painted.size()) << name;
        EXPECT_EQ(loaded.convertToFormat(QImage::Format_RGB32), painted.convertToFormat(QImage::Format_RGB32)) << name;
    }
    EXPECT_THROW(encodePng(xl::Picture {}), xl::Error);
}

} // namespace
} // namespace penmoor::picture
