#include "bench/picturesheet.h"
#include "spreadsheet/picture/picturelayout.h"
#include "spreadsheet/picture/qttextmetrics.h"
#include "spreadsheet/picture/sheetpainter.h"

#include <QGuiApplication>

#include <benchmark/benchmark.h>

namespace {

// 47 item rows and 16 columns, the size of the default sheet.
constexpr int kDefaultSections = 3;

void BM_PictureLayoutOfDefaultSheet(benchmark::State& state)
{
    const auto region = penmoor::bench::cashFlowLikeRegion(kDefaultSections);
    const penmoor::picture::QtTextMetrics metrics;
    for (auto _ : state) {
        benchmark::DoNotOptimize(penmoor::picture::layOutPicture(region, metrics));
    }
}
BENCHMARK(BM_PictureLayoutOfDefaultSheet)->Unit(benchmark::kMillisecond);

void BM_PictureOfDefaultSheet(benchmark::State& state)
{
    const auto region = penmoor::bench::cashFlowLikeRegion(kDefaultSections);
    for (auto _ : state) {
        benchmark::DoNotOptimize(penmoor::picture::paintSheetRegion(region));
    }
}
BENCHMARK(BM_PictureOfDefaultSheet)->Unit(benchmark::kMillisecond);

// Growth with the number of rows (355 pixels a section); 64 sections stay below the bound.
void BM_PictureOfLongSheet(benchmark::State& state)
{
    const auto region = penmoor::bench::cashFlowLikeRegion(static_cast<int>(state.range(0)));
    for (auto _ : state) {
        benchmark::DoNotOptimize(penmoor::picture::paintSheetRegion(region));
    }
    state.SetComplexityN(state.range(0));
}
BENCHMARK(BM_PictureOfLongSheet)->RangeMultiplier(2)->Range(8, 64)->Unit(benchmark::kMillisecond)->Complexity();

} // namespace

int main(int argc, char** argv)
{
    if (qEnvironmentVariableIsEmpty("QT_QPA_PLATFORM")) {
        qputenv("QT_QPA_PLATFORM", "offscreen");
    }
    QGuiApplication application(argc, argv);
    benchmark::Initialize(&argc, argv);
    benchmark::RunSpecifiedBenchmarks();
    benchmark::Shutdown();
    return 0;
}
