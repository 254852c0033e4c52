#include "spreadsheet/formula/cellentry.h"
#include "spreadsheet/formula/recalculation.h"
#include "spreadsheet/workbook/sheet.h"

#include <gtest/gtest.h>

namespace penmoor::engine {
namespace {

// A sheet filled by typing entries into cells, as the application would.
class FormulaSheet {
public:
    FormulaSheet& enter(const std::string& address, const std::string& text)
    {
        const CellPosition position = parseAddress(address).topLeft();
        m_sheet.setContent(position, parseCellEntry(text, "General").content);
        return *this;
    }
    xl::Value value(const std::string& address)
    {
        recalculate(m_sheet);
        const CellContent* content = m_sheet.content(parseAddress(address).topLeft());
        if (!content)
            return {};
        return cellValue(*content);
    }
    Sheet& sheet() { return m_sheet; }

private:
    Sheet m_sheet { "Sheet1", 1 };
};

struct Case {
    const char* cell;
    const char* formula;
    xl::Value expected;
};

// Values around the formulas: numbers in B1:B3, text, a boolean, an error, a number as text.
FormulaSheet neighbourhood()
{
    FormulaSheet sheet;
    sheet.enter("B1", "10").enter("B2", "20").enter("B3", "30");
    sheet.enter("C1", "text").enter("C2", "TRUE").enter("C3", "#DIV/0!").enter("C4", "'5");
    sheet.enter("D1", "1/1/2013");
    return sheet;
}

void expectValues(FormulaSheet& sheet, std::initializer_list<Case> cases)
{
    for (const Case& c : cases)
        sheet.enter(c.cell, c.formula);
    for (const Case& c : cases)
        EXPECT_EQ(sheet.value(c.cell), c.expected) << c.formula << " in " << c.cell;
}

using xl::ErrorValue;

TEST(Evaluation, ArithmeticAndTheOperatorsConversions)
{
    FormulaSheet sheet = neighbourhood();
    expectValues(sheet,
        {
            { "E1", "=R[-7]C[0]", ErrorValue::Ref },
            { "E2", "=1+2*3-4/2", 5.0 },
            { "E3", "=-2^2", 4.0 },
            { "E4", "=2^3^2", 64.0 },
            { "E5", "=50%*R1C2", 5.0 },
            { "E6", "=R1C2/0", ErrorValue::Div0 },
            { "E7", "=R1C3+1", ErrorValue::Value },
            { "E8", "=R4C3+1", 6.0 },
            { "E9", "=R2C3+1", 2.0 },
            { "E10", "=R3C3+1", ErrorValue::Div0 },
            { "E11", "=R99C9+1", 1.0 },
            { "E12", "=\"1,000\"*2", 2000.0 },
            { "E13", "=\"\"+1", ErrorValue::Value },
            { "E14", "=0^0", ErrorValue::Num },
            { "E15", "=(-8)^(1/3)", ErrorValue::Num },
            { "E16", "=1E308*10", ErrorValue::Num },
            { "E17", "=R1C2&\"x\"&TRUE&R99C9&0.1", std::string("10xTRUE0.1") },
            { "E18", "=NoSuchFunction(1)", ErrorValue::Name },
            { "E19", "=A1+1", ErrorValue::Name },
            { "F2", "=R1C2:R3C2", 20.0 },
            { "E21", "=R1C2:R1C3", ErrorValue::Value },
            { "E22", "=R99C9", 0.0 },
            { "E23", "=\"1/1/2013\"+0", 41275.0 },
        });
}

TEST(Evaluation, ComparisonsOrderNumbersTextAndBooleans)
{
    FormulaSheet sheet = neighbourhood();
    expectValues(sheet,
        {
            { "E1", "=1<2", true },
            { "E2", "=\"abc\"=\"ABC\"", true },
            { "E3", "=\"a\"<\"b\"", true },
            { "E4", "=99<\"a\"", true },
            { "E5", "=\"z\"<FALSE", true },
            { "E6", "=R99C9=0", true },
            { "E7", "=R99C9=\"\"", true },
            { "E8", "=R99C9=FALSE", true },
            { "E9", "=R3C3=1", ErrorValue::Div0 },
            { "E10", "=2>=2", true },
            { "E11", "=2<>2", false },
        });
}

TEST(Evaluation, ReferencesThatLeaveTheSheetGiveRefAtEveryEdge)
{
    FormulaSheet sheet;
    expectValues(sheet,
        {
            { "A1", "=R[-1]C", ErrorValue::Ref },
            { "B1", "=RC[-2]", ErrorValue::Ref },
            { "IV2", "=RC[1]", ErrorValue::Ref },
            { "C65536", "=R[1]C", ErrorValue::Ref },
            { "D1", "=SUM(R[-1]C:R[2]C)", ErrorValue::Ref },
            { "B2", "=R[-1]C[1]", 0.0 },
            { "A3", "=R65536C256+1", 1.0 },
            { "IV3", "=RC[-255]+1", 2.0 },
        });
}

TEST(Evaluation, FunctionsFollowTheApplicationsArgumentRules)
{
    FormulaSheet sheet = neighbourhood();
    expectValues(sheet,
        {
            { "E1", "=SUM(R1C2:R3C2)", 60.0 },
            { "E2", "=SUM(R1C2:R2C3)", 30.0 }, // text and TRUE in the block are passed over
            { "E3", "=SUM(R1C2,\"5\",TRUE)", 16.0 },
            { "E4", "=SUM(\"five\")", ErrorValue::Value },
            { "E5", "=SUM(R1C2:R3C3)", ErrorValue::Div0 },
            { "E6", "=SUM(R50C1:R60C1)", 0.0 },
            { "E7", "=AVERAGE(R1C2:R3C2)", 20.0 },
            { "E8", "=AVERAGE(R50C1)", ErrorValue::Div0 },
            { "E9", "=MIN(R1C2:R3C2,5)", 5.0 },
            { "E10", "=MAX(R1C2:R3C2)", 30.0 },
            { "E11", "=COUNT(R1C2:R4C3,1,\"x\")", 4.0 },
            { "E12", "=IF(R1C2>5,\"big\",\"small\")", std::string("big") },
            { "E13", "=IF(0,1)", false },
            { "E14", "=IF(1,,2)", 0.0 },
            { "E15", "=IF(R3C3,1,2)", ErrorValue::Div0 },
            { "E16", "=SUM(IF(1,R1C2:R2C2,0))", 30.0 },
            { "E17", "=AND(R2C3,1)", true },
            { "E18", "=OR(R50C1:R51C1)", ErrorValue::Value },
            { "E19", "=NOT(0)", true },
            { "E20", "=ABS(-3)+INT(-2.5)", 0.0 },
            { "E21", "=TRUE()", true },
        });
}

TEST(Evaluation, DatesUseThe1900SystemWithItsPhantomLeapDay)
{
    FormulaSheet sheet = neighbourhood();
    expectValues(sheet,
        {
            { "E1", "=DATE(2013,1,1)", 41275.0 },
            { "E2", "=DATE(1900,2,29)", 60.0 },
            { "E3", "=DATE(1900,3,1)", 61.0 },
            { "E4", "=DATE(1900,1,0)", 0.0 },
            { "E5", "=DATE(113,1,1)", 41275.0 },
            { "E6", "=DATE(2013,13,1)", 41640.0 },
            { "E7", "=DATE(2013,0,1)", 41244.0 },
            { "E8", "=DATE(2013,2,29)", 41334.0 },
            { "E9", "=DATE(10000,1,1)", ErrorValue::Num },
            { "E10", "=DATE(1900,1,-1)", ErrorValue::Num },
            { "E11", "=DATE(YEAR(R1C4),MONTH(R1C4)+1,1)", 41306.0 },
            { "E12", "=YEAR(60)*10000+MONTH(60)*100+DAY(60)", 19000229.0 },
            { "E13", "=DAY(0)", 0.0 },
            { "E14", "=MONTH(-1)", ErrorValue::Num },
            { "E15", "=YEAR(2958465)", 9999.0 },
            { "E16", "=YEAR(2958466)", ErrorValue::Num },
            { "E17", "=MONTH(\"1/1/2013\")", 1.0 },
            { "E18", "=DAY(\"soon\")", ErrorValue::Value },
            { "E19", "=DATE(2013,12,1)", 41609.0 },
        });
}

TEST(Recalculation, FormulaeThatReachThemselvesGiveRefInsteadOfLoopingForever)
{
    FormulaSheet sheet;
    expectValues(sheet,
        {
            { "A1", "=RC+1", ErrorValue::Ref },
            { "B1", "=R[1]C", ErrorValue::Ref },
            { "B2", "=R[-1]C+1", ErrorValue::Ref },
            { "C1", "=SUM(R1C1:R2C2)", ErrorValue::Ref },
            { "D1", "=IF(1,5,RC)", 5.0 },
            { "E1", "=5", 5.0 },
        });
    // Breaking the circle brings the values back.
    sheet.enter("B2", "7");
    EXPECT_EQ(sheet.value("B1"), xl::Value(7.0));
}

TEST(Recalculation, ChainsOfAnyLengthNeedNoDeepRecursion)
{
    // Every cell refers to the one below, so the first cell needs the whole chain first.
    FormulaSheet sheet;
    constexpr int kLength = 60000;
    const TokenArray next = std::get<Formula>(parseCellEntry("=R[1]C+1", "General").content).tokens;
    for (int row = 1; row < kLength; ++row)
        sheet.sheet().setContent({ row, 1 }, Formula { next, {} });
    sheet.enter("A" + std::to_string(kLength), "1");
    EXPECT_EQ(sheet.value("A1"), xl::Value(static_cast<double>(kLength)));

    // A change reaches the whole chain on the next read.
    sheet.enter("A" + std::to_string(kLength), "2");
    EXPECT_EQ(sheet.value("A1"), xl::Value(static_cast<double>(kLength + 1)));
}

} // namespace
} // namespace penmoor::engine
