#include "spreadsheet/picture/sheetpainter.h"
#include "spreadsheet/picture/workbookregion.h"
#include "spreadsheet/xls/xlswriter.h"
#include "tests/xls/support/readers.h"
#include "tests/xls/support/tempdir.h"

#include <fstream>

#include <QImage>

#include <gtest/gtest.h>

namespace penmoor::picture {
namespace {

using xls::test::TempDir;

// A table in the cash-flow sheet's sizes with a black grid on every cell edge, a shaded and
// wrapped heading row, a label and a number; its last row and column stay empty, so that scan
// lines through them meet only grid lines.
engine::Workbook fidelityWorkbook()
{
    engine::Workbook workbook;
    engine::Sheet& sheet = workbook.addSheet("CashFlow");
    const double widths[] = { 32.0, 10.83, 8.33, 8.33, 8.33, 9.17 };
    for (int column = 1; column <= 6; ++column) {
        sheet.setColumnWidth(column, widths[column - 1]);
    }
    const double heights[] = { 24.75, 27.75, 18.0, 18.0, 24.0, 8.0, 18.0, 18.0 };
    for (int row = 1; row <= 8; ++row) {
        sheet.setRowHeight(row, heights[row - 1]);
    }
    engine::CellStyle grid;
    for (engine::Edge& edge : grid.edges) {
        edge = { engine::LineStyle::Thin, engine::kAutomaticColor };
    }
    grid.vertical = engine::VerticalAlignment::Center;
    engine::CellStyle heading = grid;
    heading.fillColorIndex = 35;
    heading.font.bold = true;
    heading.font.sizePoints = 9.0;
    heading.horizontal = engine::HorizontalAlignment::Center;
    heading.wrapText = true;
    engine::CellStyle figure = grid;
    figure.numberFormat = "#,##0";
    const engine::StyleId gridId = workbook.styles().intern(grid);
    for (int row = 1; row <= 8; ++row) {
        sheet.setCellStyles(row, 1, 6, row == 1 ? workbook.styles().intern(heading) : gridId);
    }
    sheet.setCellStyle({ 3, 3 }, workbook.styles().intern(figure));
    sheet.setContent({ 1, 2 }, engine::CellContent(std::string("Pre-Startup EST")));
    sheet.setContent({ 2, 1 }, engine::CellContent(std::string("Cash on Hand (beginning of month)")));
    sheet.setContent({ 3, 3 }, engine::CellContent(1234.0));
    return workbook;
}

bool isLine(QRgb pixel)
{
    return qGray(pixel) < 128;
}

// Centres of the runs of line pixels along one row or one column of an image.
std::vector<double> lineCentres(const QImage& image, bool alongRow, int at)
{
    std::vector<double> centres;
    const int length = alongRow ? image.width() : image.height();
    int runStart = -1;
    for (int k = 0; k <= length; ++k) {
        const bool line = k < length && isLine(alongRow ? image.pixel(k, at) : image.pixel(at, k));
        if (line && runStart < 0) {
            runStart = k;
        } else if (!line && runStart >= 0) {
            centres.push_back((runStart + k - 1) / 2.0);
            runStart = -1;
        }
    }
    return centres;
}

std::vector<double> gaps(const std::vector<double>& centres)
{
    std::vector<double> out;
    for (std::size_t k = 1; k < centres.size(); ++k) {
        out.push_back(centres[k] - centres[k - 1]);
    }
    return out;
}

struct TableLines {
    std::vector<double> columnLines;
    std::vector<double> rowLines;
};

// The grid of the table: the box around every line pixel, then scan lines just inside its
// bottom-right corner.
TableLines tableLines(const QImage& image)
{
    int left = image.width();
    int top = image.height();
    int right = -1;
    int bottom = -1;
    for (int y = 0; y < image.height(); ++y) {
        for (int x = 0; x < image.width(); ++x) {
            if (isLine(image.pixel(x, y))) {
                left = std::min(left, x);
                top = std::min(top, y);
                right = std::max(right, x);
                bottom = std::max(bottom, y);
            }
        }
    }
    if (right < 0) {
        return {};
    }
    return { lineCentres(image, true, bottom - 4), lineCentres(image, false, right - 4) };
}

TEST(PictureFidelityTest, AgreesWithLibreOfficesRenderingOfTheSavedWorkbook)
{
    PENMOOR_NEED_READER(xls::test::hasProgram("soffice"), "LibreOffice (soffice)");
    PENMOOR_NEED_READER(xls::test::hasProgram("pdftoppm"), "pdftoppm (poppler-utils)");

    const engine::Workbook workbook = fidelityWorkbook();
    const engine::Sheet& sheet = workbook.sheet(0);
    const QImage ours = toImage(paintSheetRegion(sheetRegion(workbook, sheet, sheet.usedRange())));

    TempDir folder;
    const auto xlsPath = folder.file("fidelity.xls");
    {
        const std::vector<std::uint8_t> bytes = xls::writeXls(workbook);
        std::ofstream out(xlsPath, std::ios::binary);
        out.write(reinterpret_cast<const char*>(bytes.data()), static_cast<std::streamsize>(bytes.size()));
    }
    const auto pdf = xls::test::convertWithLibreOffice(xlsPath, "pdf", folder.path());
    ASSERT_FALSE(pdf.empty());
    // At 96 dots per inch a printed point is a screen point, so the page shows the sheet at the
    // picture's scale.
    const auto raster = xls::test::runCommand(
        { "pdftoppm", "-r", "96", "-png", "-singlefile", pdf.string(), folder.file("page").string() });
    ASSERT_EQ(raster.exitCode, 0) << raster.errors;
    QImage theirs;
    ASSERT_TRUE(theirs.load(QString::fromStdString(folder.file("page.png").string())));
    ours.save(QString::fromStdString(folder.file("ours.png").string()));

    const TableLines mine = tableLines(ours);
    const TableLines reference = tableLines(theirs);
    ASSERT_EQ(mine.columnLines.size(), 7u);
    ASSERT_EQ(mine.rowLines.size(), 9u);
    ASSERT_EQ(reference.columnLines.size(), mine.columnLines.size());
    ASSERT_EQ(reference.rowLines.size(), mine.rowLines.size());

    // The picture is exactly the table, one pixel past its closing lines.
    EXPECT_EQ(mine.columnLines.front(), 0.0);
    EXPECT_EQ(mine.columnLines.back(), ours.width() - 1.0);
    EXPECT_EQ(mine.rowLines.back(), ours.height() - 1.0);

    // Row heights agree to the pixel; LibreOffice draws columns up to about 6 % wider than the
    // desktop application from the same stored widths.
    const auto myRows = gaps(mine.rowLines);
    const auto theirRows = gaps(reference.rowLines);
    for (std::size_t k = 0; k < myRows.size(); ++k) {
        EXPECT_NEAR(theirRows[k], myRows[k], 1.0) << "row " << k + 1;
    }
    const auto myColumns = gaps(mine.columnLines);
    const auto theirColumns = gaps(reference.columnLines);
    for (std::size_t k = 0; k < myColumns.size(); ++k) {
        EXPECT_GE(theirColumns[k] / myColumns[k], 0.97) << "column " << k + 1;
        EXPECT_LE(theirColumns[k] / myColumns[k], 1.10) << "column " << k + 1;
    }
}

} // namespace
} // namespace penmoor::picture
