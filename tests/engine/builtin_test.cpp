#include "automation/contract/constants.h"
#include "automation/contract/error.h"
#include "spreadsheet/builtin/builtinapplication.h"

#include <functional>

#include <gtest/gtest.h>

namespace penmoor::engine {
namespace {

std::string failure(const std::function<void()>& action)
{
    try {
        action();
    } catch (const xl::Error& error) {
        return error.what();
    }
    return "no error";
}

class Builtin : public ::testing::Test {
protected:
    void SetUp() override
    {
        app = BuiltinApplicationFactory().create();
        book = app->Workbooks()->Add();
    }

    // The builder's primitives, as select-then-act sequences.
    void select(const std::string& address) { app->Range(address)->Select(); }
    void setBorder(int edge, int colorIndex)
    {
        auto border = app->Selection()->Borders(edge);
        border->setWeight(xl::kWeightThin);
        border->setColorIndex(colorIndex);
    }
    void clearBorder(int edge) { app->Selection()->Borders(edge)->setLineStyle(xl::kLineStyleNone); }
    void setAllBorders()
    {
        for (int edge = xl::kEdgeLeft; edge <= xl::kInsideHorizontal; ++edge)
            setBorder(edge, 16);
    }
    int lineAt(const std::string& address, int edge) { return app->Range(address)->Borders(edge)->LineStyle(); }
    void putCell(const std::string& address, const std::string& text)
    {
        select(address);
        app->ActiveCell()->setFormulaR1C1(text);
        app->Selection()->Merge();
    }

    std::unique_ptr<xl::Application> app;
    std::unique_ptr<xl::Workbook> book;
};

TEST_F(Builtin, ANewWorkbookHasThreeSheetsThatTheBuildReducesToOne)
{
    auto sheets = app->Sheets();
    ASSERT_EQ(sheets->count(), 3);
    EXPECT_EQ(sheets->Item(3)->Name(), "Sheet3");
    while (app->Sheets()->count() > 1)
        app->Sheets()->Item(2)->Delete();
    app->Sheets()->Item(app->Sheets()->count())->setName("CashFlow");
    EXPECT_EQ(app->ActiveSheet()->Name(), "CashFlow");
    EXPECT_EQ(failure([&] { app->Sheets()->Item(1)->Delete(); }),
        "The sheet \"CashFlow\" cannot be deleted: a workbook must keep at least one sheet.");
    EXPECT_NE(failure([&] { app->Sheets()->Item(2); }).find("has no sheet 2"), std::string::npos);
}

TEST_F(Builtin, RefusesUnknownSwitchValuesAndStartsWithoutAPrintArea)
{
    EXPECT_NE(failure([&] { app->setCursor(99); }), "no error");
    EXPECT_NE(failure([&] { app->setEnableCancelKey(3); }), "no error");
    EXPECT_DOUBLE_EQ(app->InchesToPoints(0.7), 50.4);
    EXPECT_EQ(app->ActiveSheet()->PageSetup()->PrintArea(), "");
    EXPECT_EQ(app->ActiveSheet()->PageSetup()->Zoom(), 100);
}

TEST_F(Builtin, ObjectsFailCleanlyOnceTheirWorkbookOrApplicationIsGone)
{
    auto range = app->Range("C5");
    auto sheet = app->Sheets()->Item(2);
    sheet->Delete();
    EXPECT_NE(failure([&] { sheet->Name(); }).find("has been deleted"), std::string::npos);

    book->Close();
    EXPECT_EQ(failure([&] { range->setFormulaR1C1("1"); }),
        "The workbook \"Book1\" has been closed; its objects can no longer be used.");
    EXPECT_EQ(failure([&] { app->Range("A1"); }), "No workbook is open in the spreadsheet application.");
    EXPECT_EQ(app->Workbooks()->count(), 0);

    auto second = app->Workbooks()->Add();
    auto font = app->Range("A1")->Font();
    app->Quit();
    const std::string gone = "The spreadsheet application has quit; its objects can no longer be used.";
    EXPECT_EQ(failure([&] { font->setName("Arial"); }), gone);
    EXPECT_EQ(failure([&] { second->Colors(1); }), gone);
    EXPECT_EQ(failure([&] { app->Visible(); }), gone);
    EXPECT_EQ(failure([&] { app->Quit(); }), gone);
}

TEST_F(Builtin, ThereIsNeverARunningInstanceToAttachTo)
{
    BuiltinApplicationFactory factory;
    EXPECT_THROW(factory.attachRunning(), xl::Error);
    EXPECT_NE(factory.create(), nullptr);
}

TEST_F(Builtin, SelectMovesTheSelectionAndTheActiveCell)
{
    select("b4:p51");
    EXPECT_EQ(app->Selection()->Address(), "$B$4:$P$51");
    EXPECT_EQ(app->ActiveCell()->Address(), "$B$4");
    app->Rows("8:8")->Select();
    EXPECT_EQ(app->Selection()->Address(), "$8:$8");
    EXPECT_EQ(app->Selection()->count(), 256);
    app->Columns("C")->Select();
    EXPECT_EQ(app->ActiveCell()->Address(), "$C$1");
    app->Cells()->Select();
    EXPECT_EQ(app->Selection()->Address(), "$1:$65536");

    // Only ranges of the active sheet can be selected.
    auto other = app->Sheets()->Item(2);
    auto otherRange = other->UsedRange();
    EXPECT_NE(failure([&] { otherRange->Select(); }).find("is not the active sheet"), std::string::npos);
    other->Select();
    otherRange->Select();
    EXPECT_EQ(app->ActiveSheet()->Name(), "Sheet2");
}

TEST_F(Builtin, AddressesOutsideTheSheetAreRejectedByName)
{
    EXPECT_EQ(failure([&] { app->Rows("65537"); }),
        "The address \"65537\" is outside the sheet (columns A to IV, rows 1 to 65536).");
    EXPECT_NE(failure([&] { app->Columns("A1B"); }).find("\"A1B\" is not a valid"), std::string::npos);
    EXPECT_EQ(app->Rows("3")->Address(), "$3:$3");
    EXPECT_EQ(app->Range("A1:B2")->Item(5)->Address(), "$A$3");
    EXPECT_EQ(app->Range("A1:B2")->Rows()->Item(2)->count(), 1);
    EXPECT_EQ(app->Columns("B2:C9")->Address(), "$B:$C");
}

// What the sheet builder's frame reads back through the contract beyond what the whole-sheet
// dumps of the report tests show: lines seen from the neighbouring cells, a block's inside
// lines, and the used range once widths and heights reach A1.
TEST_F(Builtin, TheTableFrameOfTheCashFlowSheet)
{
    select("B4:P51");
    setAllBorders();
    select("B4");
    clearBorder(xl::kEdgeTop);
    select("C5:P53");
    app->Selection()->setNumberFormat("#,##0");

    EXPECT_EQ(lineAt("P52", xl::kEdgeTop), xl::kLineStyleContinuous); // the line under P51
    EXPECT_EQ(lineAt("Q20", xl::kEdgeLeft), xl::kLineStyleContinuous);
    EXPECT_EQ(lineAt("Q20", xl::kEdgeRight), xl::kLineStyleNone);
    EXPECT_EQ(app->Range("C4")->Borders(xl::kEdgeTop)->ColorIndex(), 16);
    EXPECT_EQ(app->Range("C4")->Borders(xl::kEdgeTop)->Weight(), xl::kWeightThin);
    EXPECT_EQ(app->Range("B4")->Borders(xl::kEdgeTop)->ColorIndex(), xl::kColorIndexNone);
    EXPECT_EQ(app->Range("B4:C5")->Borders(xl::kInsideVertical)->LineStyle(), xl::kLineStyleContinuous);

    EXPECT_EQ(app->ActiveSheet()->UsedRange()->Address(), "$B$4:$P$53");
    // With the widths of A to P and the height of row 1 set, it starts at A1.
    for (int column = 1; column <= 16; ++column) {
        const std::string letter(1, static_cast<char>('A' + column - 1));
        app->Columns(letter + ":" + letter)->Select();
        app->Selection()->setColumnWidth(column == 1 ? 1 : 8.33);
    }
    app->Rows("1:1")->Select();
    app->Selection()->setRowHeight(11.25);
    auto used = app->ActiveSheet()->UsedRange();
    EXPECT_EQ(used->Address(), "$A$1:$P$53");
    auto rows = used->Rows();
    EXPECT_EQ(rows->count(), 53);
    EXPECT_EQ(rows->Item(rows->count())->Row(), 53);
    EXPECT_EQ(used->Columns()->Item(used->Columns()->count())->Column(), 16);
    EXPECT_EQ(app->Range("A1")->ColumnWidth(), 1.0);
    EXPECT_EQ(app->Range("Q1")->ColumnWidth(), 8.43);
}

// Where row and column formats meet is the sheet format tests' concern; here, the names of
// font styles.
TEST_F(Builtin, FontStylesGoByTheApplicationsNames)
{
    app->Rows("6:6")->Select();
    app->Selection()->Font()->setFontStyle("Bold");
    EXPECT_EQ(app->Range("X6")->Font()->FontStyle(), "Bold");
    EXPECT_EQ(app->Range("X7")->Font()->FontStyle(), "Regular");
    EXPECT_EQ(failure([&] { app->Selection()->Font()->setFontStyle("Heavy"); }),
        "The font style \"Heavy\" is not one of Regular, Bold, Italic and Bold Italic.");
}

// How typed text becomes content is the cell entry tests' concern; here, that an entry
// recalculates its dependants and that a refused formula leaves the cell as it was.
TEST_F(Builtin, EntriesRecalculateTheirDependantsAndRefusedOnesChangeNothing)
{
    putCell("C7", "2013");
    putCell("C8", "=R[-1]C[0]+1");
    EXPECT_EQ(app->Range("C8")->Value(), xl::Value(2014.0));
    EXPECT_EQ(app->Range("C8")->FormulaR1C1(), "=R[-1]C+1");
    putCell("C7", "'2013");
    EXPECT_EQ(app->Range("C8")->Value(), xl::Value(2014.0)); // text that reads as a number
    putCell("C7", "Week 1");
    EXPECT_EQ(app->Range("C8")->Value(), xl::Value(xl::ErrorValue::Value));

    EXPECT_EQ(failure([&] { app->Range("B11")->setFormulaR1C1("=SUM(R1C1"); }),
        "The formula \"=SUM(R1C1\" is not valid: the call of SUM is never closed.");
    EXPECT_EQ(app->Range("B11")->Value(), xl::Value());
}

TEST_F(Builtin, EnteringIntoABlockFillsEachCellWithRelativeFormulas)
{
    app->Range("A1:A3")->setFormulaR1C1("2");
    app->Range("B1:B3")->setFormulaR1C1("=RC[-1]*10");
    EXPECT_EQ(app->Range("B3")->Value(), xl::Value(20.0));
    EXPECT_NE(failure([&] { app->Range("A:Q")->setFormulaR1C1("1"); }), "no error");
    app->Range("B1:B3")->Clear();
    EXPECT_EQ(app->Range("B2")->FormulaR1C1(), "");
}

TEST_F(Builtin, PropertiesRejectValuesOutsideTheirRanges)
{
    const std::pair<std::function<void()>, const char*> cases[] = {
        { [&] { app->Range("A1")->setRowHeight(410); }, "The row height 410 is not valid" },
        { [&] { app->Range("A1")->setColumnWidth(-1); }, "The column width -1 is not valid" },
        { [&] { app->Range("A1")->Borders(5); }, "The border index 5 is not supported." },
        { [&] { app->Range("A1")->Borders(7)->setWeight(3); }, "The border weight 3 is not supported." },
        { [&] { app->Range("A1")->Borders(7)->setLineStyle(-4115); }, "line style -4115 is not supported" },
        { [&] { app->Range("A1")->Interior()->setColorIndex(57); }, "fill colour index 57" },
        { [&] { app->Range("A1")->Font()->setColorIndex(0); }, "font colour index 0" },
        { [&] { app->Range("A1")->Font()->setSize(0); }, "font size" },
        { [&] { app->Range("A1")->setHorizontalAlignment(5); }, "horizontal alignment 5" },
        { [&] { app->Range("A1")->Item(0); }, "has no item 0" },
        { [&] { app->Range("A65536")->Item(2); }, "has no item 2" },
        { [&] { app->Range("A65536:B65536")->Item(3); }, "has no item 3" },
        { [&] { book->Colors(57); }, "The colour index 57 is outside the palette (1 to 56)." },
        { [&] { book->SaveAs("no such folder/out.xls"); }, "cannot be saved as \"no such folder/out.xls\"" },
        { [&] { app->Range("A1")->CopyPicture(); }, "no sheet pictures" },
        { [&] { app->ActiveSheet()->PageSetup()->setZoom(5); }, "zoom of 5%" },
        { [&] { app->ActiveSheet()->PageSetup()->setOrientation(3); }, "page orientation 3" },
        { [&] { app->ActiveSheet()->PageSetup()->setPrintArea("A1:IW2"); }, "\"A1:IW2\" is outside the sheet" },
        { [&] { app->ActiveSheet()->PageSetup()->setLeftMargin(-1); }, "left margin of -1 points" },
    };
    for (const auto& [action, message] : cases)
        EXPECT_NE(failure(action).find(message), std::string::npos) << message << ": " << failure(action);
}

// Hands back a picture whose size tells what was asked, and what D1 showed when it was asked.
class RecordingRenderer : public PictureRenderer {
public:
    xl::Picture renderPicture(const Workbook&, const Sheet& sheet, const Region& block) override
    {
        const CellContent* content = sheet.content({ 1, 4 });
        shownValue = content ? std::get<Formula>(*content).cachedValue : xl::Value();
        return { block.columnCount(), block.rowCount(), std::vector<std::uint32_t>(block.cellCount(), 0xFFFFFFFF) };
    }
    xl::Value shownValue;
};

TEST(BuiltinPicture, CopyPictureHandsTheRangeToTheRendererWithCurrentResults)
{
    auto renderer = std::make_shared<RecordingRenderer>();
    auto app = BuiltinApplicationFactory(renderer).create();
    app->Workbooks()->Add();
    app->Range("A1")->setFormulaR1C1("2");
    app->Range("D1")->setFormulaR1C1("=RC[-3]*21");
    const xl::Picture picture = app->Range("A1:D3")->CopyPicture();
    EXPECT_EQ(picture.width, 4);
    EXPECT_EQ(picture.height, 3);
    EXPECT_EQ(renderer->shownValue, xl::Value(42.0));
}

} // namespace
} // namespace penmoor::engine
