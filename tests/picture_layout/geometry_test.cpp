#include "spreadsheet/picture/geometry.h"

#include <gtest/gtest.h>

namespace penmoor::picture {
namespace {

TEST(GeometryTest, ColumnWidthsInCharactersBecomePixels)
{
    struct Case {
        double characters;
        int pixels;
    };
    const Case cases[] = {
        { 8.43, 64 }, // the default width
        { 1.0, 12 },
        { 32.0, 229 },
        { 0.5, 6 },
        { 0.08, 1 },
        { 0.0, 0 },
        { 255.0, 1790 },
        { -1.0, 0 },
    };
    for (const Case& c : cases) {
        EXPECT_EQ(columnWidthToPixels(c.characters), c.pixels) << c.characters << " characters";
    }
}

TEST(GeometryTest, RowHeightsInPointsBecomePixels)
{
    struct Case {
        double points;
        int pixels;
    };
    const Case cases[] = {
        { 12.75, 17 },
        { 11.25, 15 },
        { 3.75, 5 },
        { 8.0, 11 },
        { 0.0, 0 },
        { 409.0, 545 },
    };
    for (const Case& c : cases) {
        EXPECT_EQ(rowHeightToPixels(c.points), c.pixels) << c.points << " points";
    }
}

TEST(GeometryTest, LinesAndRectanglesOfCells)
{
    const GridGeometry grid({ 12, 229, 80 }, { 15, 37 });
    EXPECT_EQ(grid.lineX(0), 0);
    EXPECT_EQ(grid.lineX(1), 12);
    EXPECT_EQ(grid.lineX(3), 321);
    EXPECT_EQ(grid.lineY(2), 52);
    // The picture holds the closing lines too.
    EXPECT_EQ(grid.pictureWidth(), 322);
    EXPECT_EQ(grid.pictureHeight(), 53);
    EXPECT_EQ(grid.blockRect(1, 1, 1, 2), (PixelRect { 12, 15, 322, 53 }));
    EXPECT_EQ(grid.blockInterior(1, 1, 1, 1), (PixelRect { 13, 16, 241, 52 }));
    EXPECT_EQ(grid.visibleColumnCount(), 3);
    EXPECT_EQ(grid.visibleRowCount(), 2);
}

TEST(GeometryTest, LargeBlocksAreBoundedFromTheTopLeft)
{
    // 256 columns of 255 characters are far wider than one picture may be.
    const GridGeometry wide(std::vector<int>(256, 1790), std::vector<int>(10, 17));
    EXPECT_EQ(wide.pictureWidth(), kMaxPictureSide);
    EXPECT_EQ(wide.pictureHeight(), 171);
    EXPECT_EQ(wide.visibleColumnCount(), 19); // 18 * 1790 = 32220 < 32767 <= 19 * 1790

    // Both sides at the limit would exceed 2^28 pixels: the height gives way.
    const GridGeometry huge(std::vector<int>(256, 1790), std::vector<int>(65536, 545));
    EXPECT_EQ(huge.pictureWidth(), kMaxPictureSide);
    EXPECT_EQ(huge.pictureHeight(), static_cast<int>(kMaxPicturePixels / kMaxPictureSide));
    EXPECT_LE(static_cast<long long>(huge.pictureWidth()) * huge.pictureHeight(), kMaxPicturePixels);
    EXPECT_EQ(huge.visibleRowCount(), (huge.pictureHeight() + 544) / 545);

    const GridGeometry empty({}, {});
    EXPECT_EQ(empty.pictureWidth(), 1);
    EXPECT_EQ(empty.visibleColumnCount(), 0);
}

} // namespace
} // namespace penmoor::picture
