#include "automation/contract/constants.h"
#include "spreadsheet/builtin/builtinapplication.h"
#include "spreadsheet/picture/enginepicturerenderer.h"
#include "spreadsheet/picture/geometry.h"
#include "spreadsheet/picture/picturelayout.h"
#include "spreadsheet/picture/sheetpainter.h"

#include <QImage>

#include <gtest/gtest.h>

namespace penmoor::picture {
namespace {

// CopyPicture through the contract, as the build driver asks for it: the built-in application
// recalculates and hands the used range to the renderer.
TEST(CopyPictureTest, UsedRangeOfASheetWrittenThroughTheContract)
{
    engine::BuiltinApplicationFactory factory(std::make_shared<EnginePictureRenderer>());
    const std::unique_ptr<xl::Application> application = factory.create();
    application->Workbooks()->Add();
    application->Columns("A:A")->setColumnWidth(1.0);
    application->Columns("B:B")->setColumnWidth(32.0);
    application->Rows("2:2")->setRowHeight(27.75);
    application->Range("B2")->setFormulaR1C1("7");
    application->Range("C2")->setFormulaR1C1("=RC[-1]*1000");
    auto shaded = application->Range("C2");
    shaded->Interior()->setColorIndex(6);
    shaded->setNumberFormat("#,##0");

    const std::unique_ptr<xl::Range> used = application->ActiveSheet()->UsedRange();
    const QImage image = toImage(used->CopyPicture());
    EXPECT_EQ(image.width(), 12 + 229 + 64 + 1);
    EXPECT_EQ(image.height(), 37 + 1); // the used range starts at row 2, its first row with content
    const QRgb fill = paletteRgb(application->ActiveWorkbook()->Colors(6));
    EXPECT_EQ(image.pixel(12 + 229 + 5, 5) & 0xFFFFFF, fill);

    // The formula's result "7,000" shows at the right of C2: ink there, none at its left.
    auto inkIn = [&](const QRect& area) {
        int count = 0;
        for (int y = area.top(); y <= area.bottom(); ++y) {
            for (int x = area.left(); x <= area.right(); ++x) {
                count += qGray(image.pixel(x, y)) < 128 ? 1 : 0;
            }
        }
        return count;
    };
    EXPECT_GT(inkIn(QRect(12 + 229 + 25, 1, 36, 36)), 10);
    EXPECT_EQ(inkIn(QRect(12 + 229 + 2, 1, 20, 36)), 0);
}

} // namespace
} // namespace penmoor::picture
