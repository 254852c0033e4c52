// SaveAs and Open through the spreadsheet contract, on the build's main road: a sheet made the
// way the sheet builder makes it, saved, then opened by a second instance of the application.
#include "automation/contract/constants.h"
#include "automation/contract/error.h"
#include "spreadsheet/builtin/builtinapplication.h"
#include "tests/xls/support/files.h"
#include "tests/xls/support/tempdir.h"

#include <gtest/gtest.h>

namespace penmoor::xls {
namespace {

using test::utf8;

// A little cash-flow sheet through the contract, saved at `path`.
void buildAndSave(const std::string& path)
{
    auto app = engine::BuiltinApplicationFactory().create();
    auto book = app->Workbooks()->Add();
    book->setColors(55, 0xCCFFCC);
    app->Cells()->Select();
    app->Selection()->Font()->setName("Arial");
    app->Selection()->Interior()->setColorIndex(2);
    app->Columns("B:B")->Select();
    app->Selection()->setColumnWidth(32);
    app->Rows("4:4")->Select();
    app->Selection()->setRowHeight(24.75);
    app->Range("D4")->Select();
    app->ActiveCell()->setFormulaR1C1("1/1/2013");
    app->Range("E4")->Select();
    app->ActiveCell()->setFormulaR1C1("=DATE(YEAR(RC[-1]),MONTH(RC[-1])+1,1)");
    app->Range("D4:E4")->Select();
    app->Selection()->setNumberFormat("mmm-yy");
    app->Selection()->Interior()->setColorIndex(55);
    app->Range("C5")->Select();
    app->ActiveCell()->setFormulaR1C1("100");
    app->Range("C6")->Select();
    app->ActiveCell()->setFormulaR1C1("250");
    app->Range("C7")->Select();
    app->ActiveCell()->setFormulaR1C1("=R[-2]C[0]+R[-1]C[0]");
    auto page = app->ActiveSheet()->PageSetup();
    page->setPrintArea("A1:P53");
    page->setLeftMargin(app->InchesToPoints(0.7));
    page->setTopMargin(app->InchesToPoints(0.5));
    page->setOrientation(xl::kOrientationLandscape);
    page->setPaperSize(xl::kPaperA4);
    page->setZoom(std::nullopt);
    page->setFitToPagesWide(1);
    page->setFitToPagesTall(1);
    app->Range("C5")->Select();
    book->SaveAs(path);
    book->Close();
    app->Quit();
}

TEST(BuiltinSaveOpen, ASavedWorkbookOpensAsItWasMade)
{
    test::TempDir folder;
    const std::string path = utf8(folder.file("qarnet12345678.xls"));
    buildAndSave(path);

    auto app = engine::BuiltinApplicationFactory().create();
    auto opened = app->Workbooks()->Open(path);
    EXPECT_EQ(app->Workbooks()->count(), 1);
    EXPECT_EQ(opened->Colors(55), 0xCCFFCCu);
    EXPECT_EQ(app->ActiveSheet()->Name(), "Sheet1");
    EXPECT_EQ(app->ActiveCell()->Address(), "$C$5") << "the selection is kept";
    EXPECT_EQ(app->Range("E4")->FormulaR1C1(), "=DATE(YEAR(RC[-1]),MONTH(RC[-1])+1,1)");
    EXPECT_EQ(app->Range("E4")->Value(), xl::Value { 41306.0 });
    EXPECT_EQ(app->Range("E4")->NumberFormat(), "mmm-yy");
    EXPECT_EQ(app->Range("E4")->Interior()->ColorIndex(), 55);
    EXPECT_EQ(app->Range("C7")->Value(), xl::Value { 350.0 });
    EXPECT_EQ(app->Range("Z99")->Interior()->ColorIndex(), 2) << "the whole sheet stays white";
    EXPECT_EQ(app->Range("B1")->ColumnWidth(), 32);
    EXPECT_EQ(app->Range("A4")->RowHeight(), 24.75);
    auto page = app->ActiveSheet()->PageSetup();
    EXPECT_EQ(page->PrintArea(), "$A$1:$P$53");
    EXPECT_DOUBLE_EQ(page->LeftMargin(), 50.4);
    EXPECT_DOUBLE_EQ(page->TopMargin(), 36);
    EXPECT_EQ(page->Orientation(), xl::kOrientationLandscape);
    EXPECT_EQ(page->PaperSize(), xl::kPaperA4);
    EXPECT_EQ(page->Zoom(), std::nullopt);
    EXPECT_EQ(page->FitToPagesWide(), 1);
    EXPECT_EQ(page->FitToPagesTall(), 1);

    // The opened workbook works like any other: a change recalculates, and it saves again.
    app->Range("C5")->Select();
    app->ActiveCell()->setFormulaR1C1("1000");
    EXPECT_EQ(app->Range("C7")->Value(), xl::Value { 1250.0 });
    opened->SaveAs(path);
    auto again = app->Workbooks()->Open(path);
    EXPECT_EQ(app->Workbooks()->count(), 2);
    EXPECT_EQ(app->Range("C7")->Value(), xl::Value { 1250.0 });
    app->Quit();
}

TEST(BuiltinSaveOpen, AFileThatIsNoWorkbookIsNamedInTheError)
{
    test::TempDir folder;
    const std::string path = utf8(folder.file("notes.xls"));
    test::writeFile(folder.file("notes.xls"), "not a workbook");
    auto app = engine::BuiltinApplicationFactory().create();
    try {
        app->Workbooks()->Open(path);
        FAIL() << "a text file opened as a workbook";
    } catch (const xl::Error& error) {
        EXPECT_EQ(std::string(error.what()),
            path + " is not a readable .xls workbook: the file is too short to be a compound file (14 bytes).");
    }
    EXPECT_EQ(app->Workbooks()->count(), 0);
}

} // namespace
} // namespace penmoor::xls
