#include "spreadsheet/picture/geometry.h"
#include "spreadsheet/picture/workbookregion.h"

#include <gtest/gtest.h>

namespace penmoor::picture {
namespace {

class WorkbookRegionTest : public ::testing::Test {
protected:
    engine::Workbook workbook;
    engine::Sheet& sheet = workbook.addSheet("CashFlow");
};

TEST_F(WorkbookRegionTest, SizesFormatsValuesAndMergesOfTheBlock)
{
    sheet.setColumnWidth(2, 32.0);
    sheet.setRowHeight(3, 27.75);
    engine::CellStyle style;
    style.font.bold = true;
    style.font.sizePoints = 19.0;
    style.font.colorIndex = 12;
    style.fillColorIndex = 43;
    style.numberFormat = "#,##0";
    style.edge(engine::EdgeSide::Right) = { engine::LineStyle::Thin, 16 };
    style.edge(engine::EdgeSide::Top) = { engine::LineStyle::Hair, engine::kAutomaticColor };
    style.horizontal = engine::HorizontalAlignment::Right;
    style.vertical = engine::VerticalAlignment::Center;
    style.wrapText = true;
    sheet.setCellStyle({ 3, 2 }, workbook.styles().intern(style));
    sheet.setContent({ 3, 2 }, engine::CellContent(1234.0));
    sheet.setContent({ 4, 3 }, engine::CellContent(std::string("label")));
    engine::Formula formula;
    formula.cachedValue = 42.0;
    sheet.setContent({ 2, 3 }, engine::CellContent(formula));
    sheet.setContent({ 9, 9 }, engine::CellContent(true)); // outside the block
    sheet.merge({ 4, 3, 5, 4 });

    const SheetRegion region = sheetRegion(workbook, sheet, { 2, 2, 5, 4 });
    EXPECT_EQ(region.columnWidths, (std::vector<double> { 32.0, engine::kDefaultColumnWidthCharacters, 8.43 }));
    EXPECT_EQ(region.rowHeights, (std::vector<double> { 12.75, 27.75, 12.75, 12.75 }));
    EXPECT_EQ(region.palette[0], workbook.palette()[0]);
    ASSERT_EQ(region.formatIds.size(), 12u);

    const CellFormat& format = region.formatAt(1, 0);
    EXPECT_TRUE(format.font.bold);
    EXPECT_EQ(format.font.sizePoints, 19.0);
    EXPECT_EQ(format.fontColorIndex, 12);
    EXPECT_EQ(format.fillColorIndex, 43);
    EXPECT_EQ(format.numberFormat, "#,##0");
    EXPECT_EQ(format.right, (Edge { BorderWeight::Thin, 16 }));
    EXPECT_EQ(format.top, (Edge { BorderWeight::Hairline, kAutomaticColor }));
    EXPECT_FALSE(format.left.isSet());
    EXPECT_EQ(format.horizontal, HorizontalAlignment::Right);
    EXPECT_EQ(format.vertical, VerticalAlignment::Center);
    EXPECT_TRUE(format.wrap);
    EXPECT_EQ(region.formatAt(0, 0), CellFormat {});

    ASSERT_EQ(region.values.size(), 3u);
    EXPECT_EQ(region.values[0].row, 0);
    EXPECT_EQ(region.values[0].column, 1);
    EXPECT_EQ(region.values[0].value, xl::Value(42.0)); // a formula shows its result
    EXPECT_EQ(region.values[1].value, xl::Value(1234.0));
    EXPECT_EQ(region.values[2].value, xl::Value(std::string("label")));

    ASSERT_EQ(region.merges.size(), 1u);
    EXPECT_EQ(region.merges[0].firstRow, 2);
    EXPECT_EQ(region.merges[0].firstColumn, 1);
    EXPECT_EQ(region.merges[0].lastRow, 3);
    EXPECT_EQ(region.merges[0].lastColumn, 2);
}

TEST_F(WorkbookRegionTest, AWholeSheetIsCutToWhatThePictureCanHold)
{
    const SheetRegion region = sheetRegion(workbook, sheet, engine::Region::wholeSheet());
    // 256 default columns of 64 pixels fit; the 2^28-pixel bound then leaves 16,383 pixels of
    // height, which 964 rows of 17 pixels reach.
    EXPECT_EQ(region.columnCount(), 256);
    const long long height = kMaxPicturePixels / (256 * 64 + 1);
    EXPECT_EQ(region.rowCount(), static_cast<int>((height + 16) / 17));
    EXPECT_EQ(region.formatIds.size(), static_cast<std::size_t>(region.rowCount()) * 256u);
}

} // namespace
} // namespace penmoor::picture
