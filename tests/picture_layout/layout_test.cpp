#include "spreadsheet/picture/picturelayout.h"
#include "tests/picture_layout/fakemetrics.h"
#include "tests/picture_layout/syntheticregion.h"

#include <algorithm>
#include <iterator>

#include <gtest/gtest.h>

namespace penmoor::picture {
namespace {

using Orientation = LineSegment::Orientation;

// Columns of 10 characters (75 pixels: lines at 0, 75, 150, ...) and rows of 15 points
// (20 pixels: lines at 0, 20, 40, ...), unless a test says otherwise.
class LayoutTest : public ::testing::Test {
protected:
    void makeSheet(int rows, int columns, double width = 10.0, double height = 15.0)
    {
        region = test::syntheticRegion(rows, columns, width, height);
    }
    void setFormat(int row, int column, const CellFormat& format) { test::setCellFormat(region, row, column, format); }
    void setValue(int row, int column, const xl::Value& value) { test::setCellValue(region, row, column, value); }

    PictureLayout layout() const { return layOutPicture(region, metrics); }

    std::uint32_t palette(int index) const { return paletteRgb(region.palette[static_cast<std::size_t>(index - 1)]); }

    static const LineSegment* lineAt(
        const std::vector<LineSegment>& lines, Orientation orientation, int position, int along)
    {
        for (const LineSegment& line : lines) {
            if (line.orientation == orientation && line.position == position && line.from <= along
                && along <= line.to) {
                return &line;
            }
        }
        return nullptr;
    }

    static std::vector<const TextLine*> textsIn(const PictureLayout& picture, const std::string& text)
    {
        std::vector<const TextLine*> found;
        for (const TextLine& line : picture.texts) {
            if (line.text == text) {
                found.push_back(&line);
            }
        }
        return found;
    }

    SheetRegion region;
    FakeMetrics metrics;
};

TEST_F(LayoutTest, PictureSizeFollowsWidthsAndHeights)
{
    makeSheet(4, 3);
    region.columnWidths = { 1.0, 32.0, 8.33 };
    region.rowHeights = { 11.25, 27.75, 3.75, 24.75 };
    const PictureLayout picture = layout();
    EXPECT_EQ(picture.width, 12 + 229 + 63 + 1);
    EXPECT_EQ(picture.height, 15 + 37 + 5 + 33 + 1);
}

TEST_F(LayoutTest, FillsCoverTheirCellsAndHideTheGridThere)
{
    makeSheet(2, 3);
    CellFormat shaded;
    shaded.fillColorIndex = 43;
    setFormat(0, 1, shaded);
    setFormat(0, 2, shaded);
    const PictureLayout picture = layout();

    // Neighbouring cells of one colour share one box, lines included.
    ASSERT_EQ(picture.fills.size(), 1u);
    EXPECT_EQ(picture.fills[0].rect, (PixelRect { 75, 0, 226, 21 }));
    EXPECT_EQ(picture.fills[0].rgb, palette(43));

    EXPECT_EQ(lineAt(picture.gridlines, Orientation::Vertical, 75, 10), nullptr);
    EXPECT_EQ(lineAt(picture.gridlines, Orientation::Vertical, 150, 10), nullptr);
    EXPECT_EQ(lineAt(picture.gridlines, Orientation::Horizontal, 20, 100), nullptr);
    EXPECT_NE(lineAt(picture.gridlines, Orientation::Vertical, 75, 30), nullptr);
    EXPECT_NE(lineAt(picture.gridlines, Orientation::Horizontal, 20, 30), nullptr);
    EXPECT_NE(lineAt(picture.gridlines, Orientation::Vertical, 0, 10), nullptr);

    region.showGridlines = false;
    EXPECT_TRUE(layout().gridlines.empty());
}

TEST_F(LayoutTest, SharedBorderEdgesAreDrawnOnce)
{
    makeSheet(3, 3);
    CellFormat rightLine;
    rightLine.right = { BorderWeight::Thin, 16 };
    CellFormat leftLine;
    leftLine.left = { BorderWeight::Thin, 3 };
    // Row 0: only the left cell sets the shared edge; row 1: both do; row 2: only the right one.
    setFormat(0, 0, rightLine);
    setFormat(1, 0, rightLine);
    setFormat(1, 1, leftLine);
    setFormat(2, 1, leftLine);
    CellFormat boxed;
    boxed.top = { BorderWeight::Medium, 16 };
    boxed.bottom = { BorderWeight::Thin, kAutomaticColor };
    setFormat(2, 2, boxed);
    const PictureLayout picture = layout();

    std::vector<LineSegment> atX75;
    std::copy_if(picture.borders.begin(), picture.borders.end(), std::back_inserter(atX75),
        [](const LineSegment& l) { return l.orientation == Orientation::Vertical && l.position == 75; });
    // Rows 0 and 1 join into one line in colour 16; row 2 follows in colour 3.
    ASSERT_EQ(atX75.size(), 2u);
    EXPECT_EQ(atX75[0].from, 0);
    EXPECT_EQ(atX75[0].to, 40);
    EXPECT_EQ(atX75[0].rgb, palette(16));
    EXPECT_EQ(atX75[1].from, 40);
    EXPECT_EQ(atX75[1].to, 60);
    EXPECT_EQ(atX75[1].rgb, palette(3));

    const LineSegment* top = lineAt(picture.borders, Orientation::Horizontal, 40, 200);
    ASSERT_NE(top, nullptr);
    EXPECT_EQ(top->weight, BorderWeight::Medium);
    EXPECT_EQ(top->from, 150);
    EXPECT_EQ(top->to, 225);
    const LineSegment* bottom = lineAt(picture.borders, Orientation::Horizontal, 60, 200);
    ASSERT_NE(bottom, nullptr);
    EXPECT_EQ(bottom->rgb, 0x000000u); // automatic
}

TEST_F(LayoutTest, TextSitsInItsCellWithGeneralAlignment)
{
    makeSheet(2, 2);
    setValue(0, 0, std::string("abc"));
    setValue(0, 1, 42.0);
    setValue(1, 0, true);
    const PictureLayout picture = layout();
    ASSERT_EQ(picture.texts.size(), 3u);

    const TextLine& text = *textsIn(picture, "abc").at(0);
    EXPECT_EQ(text.x, 3); // left: 2 pixels after the line
    EXPECT_EQ(text.baseline, 16); // bottom: descent ends a pixel above the line at 20
    EXPECT_EQ(text.clip, (PixelRect { 1, 1, 75, 20 }));

    const TextLine& number = *textsIn(picture, "42").at(0);
    EXPECT_EQ(number.x, 150 - 2 - 14); // right: ends 2 pixels before the line
    const TextLine& flag = *textsIn(picture, "TRUE").at(0);
    EXPECT_EQ(flag.x, 3 + (70 - 28) / 2); // centred
    EXPECT_EQ(flag.baseline, 36);
}

TEST_F(LayoutTest, ExplicitAlignmentsAndColours)
{
    makeSheet(1, 1, 10.0, 30.0); // 40 pixels high
    CellFormat format;
    format.horizontal = HorizontalAlignment::Right;
    format.vertical = VerticalAlignment::Top;
    format.fontColorIndex = 12;
    setFormat(0, 0, format);
    setValue(0, 0, std::string("ab"));
    PictureLayout picture = layout();
    ASSERT_EQ(picture.texts.size(), 1u);
    EXPECT_EQ(picture.texts[0].x, 75 - 2 - 14);
    EXPECT_EQ(picture.texts[0].baseline, 1 + 10);
    EXPECT_EQ(picture.texts[0].rgb, palette(12));

    format.vertical = VerticalAlignment::Center;
    format.numberFormat = "[Blue]0";
    setFormat(0, 0, format);
    region.values.clear();
    setValue(0, 0, 5.0);
    picture = layout();
    ASSERT_EQ(picture.texts.size(), 1u);
    EXPECT_EQ(picture.texts[0].baseline, 1 + (39 - 13) / 2 + 10);
    EXPECT_EQ(picture.texts[0].rgb, 0x0000FFu);
}

TEST_F(LayoutTest, UnwrappedTextSpillsIntoEmptyNeighboursOnly)
{
    makeSheet(3, 4);
    const std::string longText(15, 'x'); // 105 pixels in a 70-pixel box
    setValue(0, 0, longText); // spills into column 1
    setValue(1, 0, longText);
    setValue(1, 1, std::string("b")); // blocks it
    CellFormat right;
    right.horizontal = HorizontalAlignment::Right;
    setFormat(2, 3, right);
    setValue(2, 3, longText); // spills to the left
    const PictureLayout picture = layout();

    const auto spilled = textsIn(picture, longText);
    ASSERT_EQ(spilled.size(), 3u);
    EXPECT_EQ(spilled[0]->clip, (PixelRect { 1, 1, 150, 20 }));
    EXPECT_EQ(spilled[1]->clip, (PixelRect { 1, 21, 75, 40 }));
    EXPECT_EQ(spilled[2]->clip, (PixelRect { 151, 41, 300, 60 }));
    EXPECT_EQ(spilled[2]->x, 300 - 2 - 105);

    // No grid line where the text runs across; it stays where the text is clipped.
    EXPECT_EQ(lineAt(picture.gridlines, Orientation::Vertical, 75, 10), nullptr);
    EXPECT_NE(lineAt(picture.gridlines, Orientation::Vertical, 75, 30), nullptr);
    EXPECT_EQ(lineAt(picture.gridlines, Orientation::Vertical, 225, 50), nullptr);
    EXPECT_NE(lineAt(picture.gridlines, Orientation::Vertical, 150, 50), nullptr);
}

TEST_F(LayoutTest, CentredTextSpillsBothWays)
{
    makeSheet(1, 3);
    CellFormat centred;
    centred.horizontal = HorizontalAlignment::Center;
    setFormat(0, 1, centred);
    setValue(0, 1, std::string(14, 'x')); // 98 pixels, 28 more than the box
    const PictureLayout picture = layout();
    ASSERT_EQ(picture.texts.size(), 1u);
    EXPECT_EQ(picture.texts[0].clip, (PixelRect { 1, 1, 225, 20 }));
    EXPECT_EQ(picture.texts[0].x, 78 + (70 - 98) / 2);
}

TEST_F(LayoutTest, NumbersShortenOrShowHashSignsInsteadOfSpilling)
{
    makeSheet(3, 2, 5.0); // 40 pixels: a box of 35, five characters
    setValue(0, 0, 1234.5678); // General: shortened
    CellFormat thousands;
    thousands.numberFormat = "#,##0";
    setFormat(1, 0, thousands);
    setValue(1, 0, 1234567.0); // "1,234,567" does not fit
    CellFormat date;
    date.numberFormat = "m/d/yyyy";
    setFormat(2, 0, date);
    setValue(2, 0, -1.0); // no date at all
    const PictureLayout picture = layout();
    EXPECT_EQ(textsIn(picture, "1235").size(), 1u);
    EXPECT_EQ(textsIn(picture, "#####").size(), 2u);
    for (const TextLine& line : picture.texts) {
        EXPECT_LE(line.clip.right, 40);
    }
}

TEST_F(LayoutTest, WrappedTextBreaksBetweenWordsAndStaysInItsCell)
{
    makeSheet(1, 2, 10.0, 30.0);
    CellFormat wrapped;
    wrapped.wrap = true;
    wrapped.vertical = VerticalAlignment::Center;
    setFormat(0, 0, wrapped);
    setValue(0, 0, std::string("alpha beta gamma"));
    const PictureLayout picture = layout();
    ASSERT_EQ(picture.texts.size(), 2u);
    EXPECT_EQ(picture.texts[0].text, "alpha beta");
    EXPECT_EQ(picture.texts[1].text, "gamma");
    EXPECT_EQ(picture.texts[0].baseline, 1 + (39 - 26) / 2 + 10);
    EXPECT_EQ(picture.texts[1].baseline, picture.texts[0].baseline + 13);
    EXPECT_EQ(picture.texts[0].clip.right, 75);
}

TEST_F(LayoutTest, MergedAreasDrawAsOneCell)
{
    makeSheet(3, 3);
    region.merges.push_back({ 0, 1, 1, 2 });
    CellFormat merged;
    merged.fillColorIndex = 55;
    merged.horizontal = HorizontalAlignment::Center;
    merged.vertical = VerticalAlignment::Center;
    merged.top = { BorderWeight::Thin, 16 };
    setFormat(0, 1, merged);
    setFormat(0, 2, merged);
    setValue(0, 1, std::string("Title"));
    setValue(1, 2, std::string("hidden"));
    const PictureLayout picture = layout();

    ASSERT_EQ(picture.texts.size(), 1u);
    EXPECT_EQ(picture.texts[0].clip, (PixelRect { 76, 1, 225, 40 }));
    EXPECT_EQ(picture.texts[0].x, 78 + (145 - 35) / 2);
    ASSERT_EQ(picture.fills.size(), 1u);
    EXPECT_EQ(picture.fills[0].rect, (PixelRect { 75, 0, 226, 41 }));
    EXPECT_EQ(lineAt(picture.borders, Orientation::Vertical, 150, 10), nullptr);
    EXPECT_NE(lineAt(picture.borders, Orientation::Horizontal, 0, 200), nullptr);
}

TEST_F(LayoutTest, OnlyTheBoundedTopLeftIsLaidOut)
{
    makeSheet(100, 2, 10.0, 409.0); // 545 pixels a row: 61 rows reach the bound
    for (int row = 0; row < 100; ++row) {
        setValue(row, 0, static_cast<double>(row));
    }
    region.rowHeights[5] = 0.0; // a hidden row shows nothing
    const PictureLayout picture = layout();
    EXPECT_EQ(picture.height, kMaxPictureSide);
    EXPECT_EQ(picture.texts.size(), 60u);
    EXPECT_TRUE(textsIn(picture, "5").empty());
    for (const TextLine& line : picture.texts) {
        EXPECT_LE(line.clip.bottom, kMaxPictureSide);
    }
    for (const LineSegment& line : picture.gridlines) {
        EXPECT_LT(line.position, line.orientation == Orientation::Vertical ? picture.width : picture.height);
    }
}

} // namespace
} // namespace penmoor::picture
