// The sheet builder writing a whole cash-flow sheet into the built-in spreadsheet application,
// in memory: the default sheet, and the largest list over ten years of months.
#include "bench/largeitemlist.h"
#include "report/twelvemonthcashflow.h"
#include "spreadsheet/builtin/builtinapplication.h"

#include <benchmark/benchmark.h>

namespace penmoor {
namespace {

void buildSheets(benchmark::State& state, bench::LargeItemList& list)
{
    engine::BuiltinApplicationFactory factory;
    for (auto _ : state) {
        state.PauseTiming();
        const std::unique_ptr<xl::Application> application = factory.create();
        application->Workbooks()->Add();
        state.ResumeTiming();
        TwelveMonthCashFlow(*application, list.options, list.view).WriteCashFlowSheet();
    }
}

// 44 items over the twelve months of one year: 16 columns, 53 rows.
void BM_DefaultSheet(benchmark::State& state)
{
    bench::LargeItemList list(44);
    list.view.setOptionOn(OptionButton::Option3, true);
    list.view.setText(TextBox::Text6, "2031");
    list.view.setText(TextBox::Text7, "2031");
    buildSheets(state, list);
}

// 32,768 items over the months of 2020 to 2030: 136 columns, 32,777 rows.
void BM_LargestSheet(benchmark::State& state)
{
    bench::LargeItemList list(kMaximumItemCount);
    list.view.setOptionOn(OptionButton::Option3, true);
    list.view.setText(TextBox::Text6, "2020");
    list.view.setText(TextBox::Text7, "2030");
    buildSheets(state, list);
}

BENCHMARK(BM_DefaultSheet)->Unit(benchmark::kMillisecond);
BENCHMARK(BM_LargestSheet)->Unit(benchmark::kMillisecond);

} // namespace
} // namespace penmoor
