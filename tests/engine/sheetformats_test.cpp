#include "spreadsheet/workbook/formatting.h"
#include "spreadsheet/workbook/workbook.h"

#include <gtest/gtest.h>

namespace penmoor::engine {
namespace {

class SheetFormats : public ::testing::Test {
protected:
    void fill(const Region& region, int colorIndex)
    {
        applyFormat(styles, sheet, region,
            [colorIndex](CellStyle& style) { style.fillColorIndex = static_cast<std::uint8_t>(colorIndex); });
    }
    void bold(const Region& region)
    {
        applyFormat(styles, sheet, region, [](CellStyle& style) { style.font.bold = true; });
    }
    void setBorder(const Region& region, BorderIndex border, LineStyle line)
    {
        const bool clearing = line == LineStyle::None;
        for (const EdgeTarget& target : borderTargets(region, border, clearing)) {
            applyFormat(styles, sheet, target.cells, [&](CellStyle& style) {
                style.edge(target.side) = { line, clearing ? kAutomaticColor : std::uint8_t(16) };
            });
        }
    }
    void setAllBorders(const Region& region)
    {
        for (BorderIndex border : { BorderIndex::EdgeLeft, BorderIndex::EdgeTop, BorderIndex::EdgeBottom,
                 BorderIndex::EdgeRight, BorderIndex::InsideVertical, BorderIndex::InsideHorizontal })
            setBorder(region, border, LineStyle::Thin);
    }
    const CellStyle& at(int row, int column) const { return styles.style(sheet.effectiveStyle({ row, column })); }
    int fillAt(int row, int column) const { return at(row, column).fillColorIndex; }
    std::size_t runsIn(int row) const
    {
        const RowData* data = sheet.rowData(row);
        return data ? data->styleRuns.size() : 0;
    }
    LineStyle edgeAt(int row, int column, EdgeSide side) const { return at(row, column).edge(side).line; }

    Workbook workbook = Workbook::withDefaultSheets();
    Sheet& sheet = workbook.sheet(0);
    StyleTable& styles = workbook.styles();
};

TEST_F(SheetFormats, WholeSheetFormatIsStoredOnceAndReachesEveryCell)
{
    fill(Region::wholeSheet(), 2);
    EXPECT_EQ(sheet.lastStoredRow(), 0);
    EXPECT_FALSE(sheet.columnStyle(1));
    EXPECT_EQ(fillAt(1, 1), 2);
    EXPECT_EQ(fillAt(65536, 256), 2);
    EXPECT_EQ(sheet.usedRange(), Region::cell(1, 1));
}

TEST_F(SheetFormats, LaterCommandsWinWhereRowAndColumnFormatsMeet)
{
    fill(Region::wholeSheet(), 2);
    fill(Region::columns(3, 3), 3);
    fill(Region::rows(5, 5), 4);
    bold(Region::columns(3, 4));

    struct Expected {
        int row, column, fill;
        bool bold;
    };
    for (const Expected& e : { Expected { 5, 3, 4, true }, Expected { 5, 4, 4, true }, Expected { 6, 3, 3, true },
             Expected { 6, 4, 2, true }, Expected { 5, 5, 4, false }, Expected { 6, 5, 2, false },
             Expected { 65536, 4, 2, true } }) {
        EXPECT_EQ(fillAt(e.row, e.column), e.fill) << e.row << "," << e.column;
        EXPECT_EQ(at(e.row, e.column).font.bold, e.bold) << e.row << "," << e.column;
    }
    // Row 5 carries one format of its own, and only C5:D5 need formats of their own.
    EXPECT_TRUE(sheet.rowStyle(5));
    ASSERT_EQ(runsIn(5), 1u);
    EXPECT_EQ(sheet.rowData(5)->styleRuns[0].firstColumn, 3);
    EXPECT_EQ(sheet.rowData(5)->styleRuns[0].lastColumn, 4);
    EXPECT_EQ(runsIn(6), 0u);
}

TEST_F(SheetFormats, CellsGetFormatsOfTheirOwnOnlyWhereTheResultDiffers)
{
    fill(Region::wholeSheet(), 2);
    fill({ 2, 2, 4, 4 }, 2);
    EXPECT_EQ(runsIn(2), 0u);
    EXPECT_EQ(sheet.usedRange(), Region::cell(1, 1));

    fill({ 2, 2, 4, 4 }, 5);
    fill(Region::cell(3, 3), 6);
    EXPECT_EQ(runsIn(2), 1u);
    EXPECT_EQ(runsIn(3), 3u);
    EXPECT_EQ(fillAt(3, 2), 5);
    EXPECT_EQ(fillAt(3, 3), 6);
    EXPECT_EQ(fillAt(3, 5), 2);
    // Back to one run once the middle cell matches its neighbours again.
    fill(Region::cell(3, 3), 5);
    EXPECT_EQ(runsIn(3), 1u);
    EXPECT_EQ(sheet.usedRange(), (Region { 2, 2, 4, 4 }));
}

TEST_F(SheetFormats, AFullyBorderedLargeTableCostsOneRunPerRow)
{
    const Region table { 4, 2, 32771, 137 };
    fill(Region::wholeSheet(), 2);
    setAllBorders(table);
    applyFormat(styles, sheet, table, [](CellStyle& style) { style.numberFormat = "#,##0"; });

    std::size_t runs = 0;
    for (int row = table.firstRow; row <= table.lastRow; ++row)
        runs += runsIn(row);
    EXPECT_EQ(runs, static_cast<std::size_t>(table.rowCount()));
    EXPECT_LT(styles.size(), 40u);
    const CellStyle& corner = at(4, 2);
    for (EdgeSide side : { EdgeSide::Left, EdgeSide::Right, EdgeSide::Top, EdgeSide::Bottom })
        EXPECT_EQ(corner.edge(side), (Edge { LineStyle::Thin, 16 }));
    EXPECT_EQ(corner.numberFormat, "#,##0");
    EXPECT_EQ(corner.fillColorIndex, 2);
    EXPECT_EQ(edgeAt(3, 2, EdgeSide::Bottom), LineStyle::None);
    EXPECT_EQ(sheet.usedRange(), table);
}

TEST_F(SheetFormats, ClearingABorderAlsoClearsTheNeighboursTouchingEdge)
{
    const Region grid { 4, 2, 10, 12 };
    setAllBorders(grid);
    // The corner cell above the labels loses its top and left lines.
    setBorder(Region::cell(4, 2), BorderIndex::EdgeTop, LineStyle::None);
    setBorder(Region::cell(4, 2), BorderIndex::EdgeLeft, LineStyle::None);
    EXPECT_EQ(edgeAt(4, 2, EdgeSide::Top), LineStyle::None);
    EXPECT_EQ(edgeAt(4, 2, EdgeSide::Left), LineStyle::None);
    EXPECT_EQ(edgeAt(4, 2, EdgeSide::Right), LineStyle::Thin);
    EXPECT_EQ(edgeAt(4, 3, EdgeSide::Top), LineStyle::Thin);

    // A spacer row inside the grid loses its left, right and inner vertical lines.
    for (BorderIndex border : { BorderIndex::EdgeLeft, BorderIndex::EdgeRight, BorderIndex::InsideVertical })
        setBorder(Region::rows(6, 6), border, LineStyle::None);
    for (int column = 2; column <= 12; ++column) {
        EXPECT_EQ(edgeAt(6, column, EdgeSide::Left), LineStyle::None) << column;
        EXPECT_EQ(edgeAt(6, column, EdgeSide::Right), LineStyle::None) << column;
        EXPECT_EQ(edgeAt(6, column, EdgeSide::Top), LineStyle::Thin) << column;
    }
    EXPECT_EQ(edgeAt(5, 2, EdgeSide::Left), LineStyle::Thin);
    EXPECT_FALSE(sheet.rowStyle(6));
    EXPECT_EQ(runsIn(6), 1u);

    // Clearing the left border of C5 takes B5's right line away too.
    setBorder(Region::cell(5, 3), BorderIndex::EdgeLeft, LineStyle::None);
    EXPECT_EQ(edgeAt(5, 2, EdgeSide::Right), LineStyle::None);
    EXPECT_EQ(visibleBorder(styles, sheet, Region::cell(5, 3), BorderIndex::EdgeLeft).line, LineStyle::None);
}

TEST_F(SheetFormats, VisibleBorderReadsTheNeighbourWhenTheCellHasNoEdge)
{
    setBorder(Region::cell(1, 1), BorderIndex::EdgeRight, LineStyle::Medium);
    EXPECT_EQ(visibleBorder(styles, sheet, Region::cell(1, 2), BorderIndex::EdgeLeft).line, LineStyle::Medium);
    EXPECT_EQ(visibleBorder(styles, sheet, { 1, 1, 1, 2 }, BorderIndex::InsideVertical).line, LineStyle::Medium);
    EXPECT_EQ(visibleBorder(styles, sheet, Region::cell(1, 1), BorderIndex::InsideVertical).line, LineStyle::None);
    EXPECT_EQ(visibleBorder(styles, sheet, Region::cell(1, 1), BorderIndex::EdgeLeft).line, LineStyle::None);
    EXPECT_EQ(visibleBorder(styles, sheet, Region::cell(1, 1), BorderIndex::EdgeTop).line, LineStyle::None);
}

TEST(BorderTargets, OutlineInsideAndNeighboursOfABlock)
{
    const Region block { 4, 2, 51, 16 };
    using T = EdgeTarget;
    const struct {
        BorderIndex border;
        bool neighbours;
        std::vector<EdgeTarget> expected;
    } cases[] = {
        { BorderIndex::EdgeLeft, false, { T { { 4, 2, 51, 2 }, EdgeSide::Left } } },
        { BorderIndex::EdgeLeft, true,
            { T { { 4, 2, 51, 2 }, EdgeSide::Left }, T { { 4, 1, 51, 1 }, EdgeSide::Right } } },
        { BorderIndex::EdgeRight, true,
            { T { { 4, 16, 51, 16 }, EdgeSide::Right }, T { { 4, 17, 51, 17 }, EdgeSide::Left } } },
        { BorderIndex::EdgeTop, true,
            { T { { 4, 2, 4, 16 }, EdgeSide::Top }, T { { 3, 2, 3, 16 }, EdgeSide::Bottom } } },
        { BorderIndex::EdgeBottom, false, { T { { 51, 2, 51, 16 }, EdgeSide::Bottom } } },
        { BorderIndex::InsideVertical, true,
            { T { { 4, 2, 51, 15 }, EdgeSide::Right }, T { { 4, 3, 51, 16 }, EdgeSide::Left } } },
        { BorderIndex::InsideHorizontal, false,
            { T { { 4, 2, 50, 16 }, EdgeSide::Bottom }, T { { 5, 2, 51, 16 }, EdgeSide::Top } } },
    };
    for (const auto& c : cases)
        EXPECT_EQ(borderTargets(block, c.border, c.neighbours), c.expected) << static_cast<int>(c.border);

    // At the sheet's edges there is no neighbour, and a single cell has no inside lines.
    EXPECT_EQ(borderTargets(Region::cell(1, 1), BorderIndex::EdgeLeft, true).size(), 1u);
    EXPECT_EQ(borderTargets(Region::cell(1, 1), BorderIndex::EdgeTop, true).size(), 1u);
    EXPECT_EQ(borderTargets(Region::cell(65536, 256), BorderIndex::EdgeRight, true).size(), 1u);
    EXPECT_TRUE(borderTargets(Region::cell(3, 3), BorderIndex::InsideVertical, true).empty());
    EXPECT_TRUE(borderTargets(Region::rows(3, 3), BorderIndex::InsideHorizontal, true).empty());
}

TEST_F(SheetFormats, ClearingFormatsShowsTheDefaultFormatButKeepsSizes)
{
    fill(Region::wholeSheet(), 2);
    fill(Region::columns(3, 3), 3);
    sheet.setRowHeight(2, 30.0);
    sheet.setColumnWidth(3, 20.0);

    applyFormat(styles, sheet, { 2, 2, 3, 3 }, [](CellStyle& style) { style.font.italic = true; });
    sheet.clearFormats({ 2, 3, 3, 3 });
    EXPECT_EQ(sheet.effectiveStyle({ 2, 3 }), kDefaultStyleId);
    EXPECT_EQ(fillAt(4, 3), 3);
    EXPECT_TRUE(at(2, 2).font.italic);

    sheet.clearFormats(Region::wholeSheet());
    EXPECT_EQ(sheet.effectiveStyle({ 2, 2 }), kDefaultStyleId);
    EXPECT_EQ(sheet.effectiveStyle({ 9, 3 }), kDefaultStyleId);
    EXPECT_EQ(sheet.rowHeight(2), 30.0);
    EXPECT_EQ(sheet.columnWidth(3), 20.0);
    EXPECT_EQ(sheet.usedRange(), Region::cell(2, 3));
}

} // namespace
} // namespace penmoor::engine
