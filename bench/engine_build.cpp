// The built-in application at the largest scale the program builds: a 32,768-row by
// 136-column table with a grid, a fill and a number format over all of it, a label in every
// row and a few thousand total formulas, built through the spreadsheet contract as the sheet
// builder drives it; and the recalculation of that sheet.
#include "automation/contract/constants.h"
#include "spreadsheet/builtin/builtinapplication.h"
#include "spreadsheet/workbook/address.h"

#include <string>

#include <benchmark/benchmark.h>

namespace {

using penmoor::engine::BuiltinApplicationFactory;

constexpr int kFirstRow = 5;
constexpr int kLastRow = 32771; // 32,768 rows including the heading row 4
constexpr int kLastColumn = 137; // B to EG: 136 columns
constexpr int kTotalEvery = 512; // a total row every so many rows: 64 rows of 135 formulas

std::string letters(int column)
{
    return penmoor::engine::columnLetters(column);
}

void buildLargeSheet(xl::Application& app)
{
    app.Workbooks()->Add();
    app.Cells()->Select();
    app.Cells()->Clear();
    app.Selection()->Font()->setName("Arial");
    app.Selection()->Interior()->setColorIndex(2);

    const std::string last = letters(kLastColumn);
    app.Range("B4:" + last + std::to_string(kLastRow))->Select();
    for (int edge = xl::kEdgeLeft; edge <= xl::kInsideHorizontal; ++edge) {
        auto border = app.Selection()->Borders(edge);
        border->setWeight(xl::kWeightThin);
        border->setColorIndex(16);
    }
    app.Selection()->setVerticalAlignment(xl::kAlignCenter);
    app.Range("C5:" + last + std::to_string(kLastRow))->Select();
    app.Selection()->setNumberFormat("#,##0");

    for (int row = kFirstRow; row <= kLastRow; ++row) {
        const std::string r = std::to_string(row);
        app.Range("B" + r)->Select();
        app.ActiveCell()->setLiteralText("Item " + r);
        app.Selection()->Merge();
        if (row % kTotalEvery != 0)
            continue;
        app.Range("B" + r)->Select();
        app.Selection()->Font()->setFontStyle("Bold");
        app.Range("C" + r + ":" + last + r)->Select();
        app.Selection()->Interior()->setColorIndex(39);
        for (int column = 3; column <= kLastColumn; ++column) {
            app.Range(letters(column) + r)->Select();
            app.ActiveCell()->setFormulaR1C1("=SUM(R[-511]C:R[-1]C)");
        }
    }
}

void BM_BuildLargeSheetThroughTheContract(benchmark::State& state)
{
    for (auto _ : state) {
        auto app = BuiltinApplicationFactory().create();
        buildLargeSheet(*app);
        benchmark::DoNotOptimize(app->ActiveSheet()->UsedRange()->count());
        app->Quit();
    }
}
BENCHMARK(BM_BuildLargeSheetThroughTheContract)->Unit(benchmark::kMillisecond);

void BM_RecalculateLargeSheet(benchmark::State& state)
{
    auto app = BuiltinApplicationFactory().create();
    buildLargeSheet(*app);
    auto input = app->Range("C6");
    auto total = app->Range("C512");
    double figure = 0;
    for (auto _ : state) {
        // One changed figure makes the next read recalculate the whole sheet.
        input->setFormulaR1C1(std::to_string(++figure));
        benchmark::DoNotOptimize(total->Value());
    }
}
BENCHMARK(BM_RecalculateLargeSheet)->Unit(benchmark::kMillisecond);

} // namespace

BENCHMARK_MAIN();
