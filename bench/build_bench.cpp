// A whole headless build as penmoor-build runs it, without the picture: item list, sheet
// builder, built-in application, save, and the move into place.
#include "app/buildtool/headlessbuild.h"
#include "spreadsheet/builtin/builtinapplication.h"

#include <filesystem>
#include <random>
#include <string>

#include <benchmark/benchmark.h>

namespace penmoor {
namespace {

namespace fs = std::filesystem;

// A folder of its own for the written workbooks, removed at the end.
struct BenchFolder {
    BenchFolder()
        : path(fs::temp_directory_path() / ("penmoor-bench-" + std::to_string(std::random_device {}())))
    {
        fs::create_directory(path);
    }
    ~BenchFolder()
    {
        std::error_code ignored;
        fs::remove_all(path, ignored);
    }
    fs::path path;
};

void runBuilds(benchmark::State& state, BuildRequest request)
{
    BenchFolder folder;
    request.output = folder.path / "plan.xls";
    engine::BuiltinApplicationFactory spreadsheets;
    for (auto _ : state) {
        runHeadlessBuild(request, spreadsheets, {}, 2013);
    }
}

void BM_HeadlessBuildDefaultList(benchmark::State& state)
{
    BuildRequest request;
    request.mode = PeriodMode::ByMonth;
    request.firstYear = request.lastYear = 2013;
    runBuilds(state, request);
}
BENCHMARK(BM_HeadlessBuildDefaultList)->Unit(benchmark::kMillisecond);

void BM_HeadlessBuildHundredWeeks(benchmark::State& state)
{
    BuildRequest request;
    request.mode = PeriodMode::ByWeek;
    request.weeks = 100;
    runBuilds(state, request);
}
BENCHMARK(BM_HeadlessBuildHundredWeeks)->Unit(benchmark::kMillisecond);

} // namespace
} // namespace penmoor
