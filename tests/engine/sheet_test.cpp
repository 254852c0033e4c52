#include "spreadsheet/workbook/formatting.h"
#include "spreadsheet/workbook/workbook.h"

#include <gtest/gtest.h>

namespace penmoor::engine {
namespace {

class SheetContents : public ::testing::Test {
protected:
    StyleId styleWithFill(int colorIndex)
    {
        CellStyle style;
        style.fillColorIndex = static_cast<std::uint8_t>(colorIndex);
        return workbook.styles().intern(style);
    }

    Workbook workbook = Workbook::withDefaultSheets();
    Sheet& sheet = workbook.sheet(0);
};

TEST_F(SheetContents, StoresReplacesAndRemovesContent)
{
    sheet.setContent({ 2, 3 }, 2013.0);
    sheet.setContent({ 2, 1 }, std::string("Label"));
    sheet.setContent({ 2, 2 }, true);
    sheet.setContent({ 2, 3 }, xl::ErrorValue::Div0);
    ASSERT_NE(sheet.content({ 2, 3 }), nullptr);
    EXPECT_EQ(std::get<xl::ErrorValue>(*sheet.content({ 2, 3 })), xl::ErrorValue::Div0);
    EXPECT_EQ(sheet.rowData(2)->cells.size(), 3u);
    EXPECT_EQ(sheet.rowData(2)->cells[0].column, 1);

    sheet.setContent({ 2, 2 }, std::monostate {});
    EXPECT_EQ(sheet.content({ 2, 2 }), nullptr);
    sheet.setContent({ 900, 2 }, std::monostate {});
    EXPECT_EQ(sheet.lastStoredRow(), 2);

    sheet.clearContents(Region::rows(1, 2));
    EXPECT_EQ(sheet.content({ 2, 1 }), nullptr);
    EXPECT_EQ(sheet.usedRange(), Region::cell(1, 1));
}

TEST_F(SheetContents, ContentChangesAskForRecalculation)
{
    EXPECT_FALSE(sheet.needsRecalculation());
    sheet.setContent({ 1, 1 }, 1.0);
    EXPECT_TRUE(sheet.needsRecalculation());
    sheet.markCalculated();
    EXPECT_FALSE(sheet.needsRecalculation());
    sheet.setCellStyle({ 1, 1 }, styleWithFill(3));
    EXPECT_FALSE(sheet.needsRecalculation());
    sheet.clearContents(Region::cell(1, 1));
    EXPECT_TRUE(sheet.needsRecalculation());
}

TEST_F(SheetContents, SpansListEveryExistingCellInColumnOrder)
{
    const StyleId red = styleWithFill(3);
    const StyleId blue = styleWithFill(5);
    sheet.setRowStyle(4, blue);
    sheet.setCellStyles(4, 2, 6, red);
    sheet.setContent({ 4, 4 }, 7.0); // inside the run
    sheet.setContent({ 4, 9 }, std::string("x")); // inherits the row's format

    std::vector<CellSpan> spans;
    sheet.cellSpans(4, spans);
    ASSERT_EQ(spans.size(), 4u);
    const auto expect = [&](std::size_t i, int first, int last, StyleId style, bool content) {
        EXPECT_EQ(spans[i].firstColumn, first) << i;
        EXPECT_EQ(spans[i].lastColumn, last) << i;
        EXPECT_EQ(spans[i].style, style) << i;
        EXPECT_EQ(spans[i].content != nullptr, content) << i;
    };
    expect(0, 2, 3, red, false);
    expect(1, 4, 4, red, true);
    expect(2, 5, 6, red, false);
    expect(3, 9, 9, blue, true);

    sheet.cellSpans(5, spans);
    EXPECT_TRUE(spans.empty());
}

TEST_F(SheetContents, UsedRangeCoversContentOwnFormatsAndSetSizes)
{
    // The cash-flow sheet's shape: widths A to L, heights from row 1, formats to row 53.
    for (int column = 1; column <= 12; ++column)
        sheet.setColumnWidth(column, 8.33);
    sheet.setRowHeight(1, 11.25);
    sheet.setSheetStyle(styleWithFill(2));
    sheet.setCellStyles(53, 3, 12, styleWithFill(4));
    sheet.setContent({ 2, 2 }, std::string("Cash flow"));
    EXPECT_EQ(sheet.usedRange(), (Region { 1, 1, 53, 12 }));

    Sheet other("Other", 99);
    other.setContent({ 7, 5 }, 1.0);
    EXPECT_EQ(other.usedRange(), Region::cell(7, 5));
}

TEST_F(SheetContents, MergingReplacesTheAreasItTouches)
{
    sheet.merge({ 2, 8, 2, 10 });
    EXPECT_EQ(sheet.mergedAreas(), std::vector<Region>({ { 2, 8, 2, 10 } }));

    sheet.merge(Region::cell(5, 5));
    EXPECT_EQ(sheet.mergedAreas().size(), 1u);

    sheet.merge({ 1, 10, 3, 11 });
    EXPECT_EQ(sheet.mergedAreas(), std::vector<Region>({ { 1, 10, 3, 11 } }));
    sheet.unmerge(Region::cell(2, 11));
    EXPECT_TRUE(sheet.mergedAreas().empty());
}

TEST_F(SheetContents, SelectionKeepsItsActiveCellInside)
{
    sheet.select({ 4, 2, 51, 16 }, { 5, 3 });
    EXPECT_EQ(sheet.activeCell(), (CellPosition { 5, 3 }));
    sheet.select(Region::rows(8, 8), { 2, 2 });
    EXPECT_EQ(sheet.activeCell(), (CellPosition { 8, 1 }));
}

} // namespace
} // namespace penmoor::engine
