// Writing and reading .xls files of the benchmark content (bench/xls_content.h): the cash-flow
// size (44 x 16) and the large sheet (32,768 x 136). The side-by-side run against the peer
// writers is bench/xls_peers.sh.
#include "bench/xls_content.h"
#include "spreadsheet/xls/xlsreader.h"
#include "spreadsheet/xls/xlswriter.h"

#include <benchmark/benchmark.h>

namespace {

using penmoor::bench::XlsContent;

void writeXls(benchmark::State& state)
{
    const auto book
        = penmoor::bench::buildWorkbook({ static_cast<int>(state.range(0)), static_cast<int>(state.range(1)) });
    std::size_t bytes = 0;
    for (auto _ : state) {
        const auto file = penmoor::xls::writeXls(book);
        bytes = file.size();
        benchmark::DoNotOptimize(file.data());
    }
    state.SetBytesProcessed(static_cast<std::int64_t>(bytes * state.iterations()));
    state.counters["file_bytes"] = static_cast<double>(bytes);
}

void readXls(benchmark::State& state)
{
    const auto file = penmoor::xls::writeXls(
        penmoor::bench::buildWorkbook({ static_cast<int>(state.range(0)), static_cast<int>(state.range(1)) }));
    for (auto _ : state) {
        const auto book = penmoor::xls::readXls(file);
        benchmark::DoNotOptimize(&book);
    }
    state.SetBytesProcessed(static_cast<std::int64_t>(file.size() * state.iterations()));
}

} // namespace

BENCHMARK(writeXls)->Args({ 44, 16 })->Args({ 32768, 136 })->Unit(benchmark::kMillisecond);
BENCHMARK(readXls)->Args({ 44, 16 })->Args({ 32768, 136 })->Unit(benchmark::kMillisecond);
BENCHMARK_MAIN();
