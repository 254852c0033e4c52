#include "bench/picturesheet.h"
#include "spreadsheet/picture/sheetpainter.h"
#include "ui/preview/pictureimage.h"

#include <string>

#include <QGuiApplication>

#include <benchmark/benchmark.h>

namespace {

// The picture of a sheet the size of the default one, drawn at a zoom factor in hundredths:
// what one click of "Zoom In" or "Zoom Out" costs.
void BM_ZoomDefaultSheetPicture(benchmark::State& state)
{
    const QImage source = penmoor::toImage(penmoor::picture::paintSheetRegion(penmoor::bench::cashFlowLikeRegion(3)));
    const double factor = static_cast<double>(state.range(0)) / 100.0;
    const QSize size(static_cast<int>(factor * source.width()), static_cast<int>(factor * source.height()));
    for (auto _ : state) {
        benchmark::DoNotOptimize(penmoor::stretched(source, size));
    }
    state.SetLabel(std::to_string(size.width()) + " x " + std::to_string(size.height()));
}
BENCHMARK(BM_ZoomDefaultSheetPicture)->Arg(25)->Arg(125)->Arg(275)->Unit(benchmark::kMillisecond);

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
