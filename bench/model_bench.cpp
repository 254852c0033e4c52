// One editing operation on the largest item list, each including the recomputation of every
// derived field and the full relist into List1.
#include "bench/largeitemlist.h"

#include <string>

#include <benchmark/benchmark.h>

namespace penmoor {
namespace {

using LargeList = bench::LargeItemList;

void BM_InsertItem(benchmark::State& state)
{
    LargeList list(kMaximumItemCount - 1);
    const int middle = list.options.count() / 2;
    for (auto _ : state) {
        list.options.InsertItem("Inserted line", middle);
        state.PauseTiming();
        list.options.DeleteItem(middle + 1);
        state.ResumeTiming();
    }
}

void BM_RenameItem(benchmark::State& state)
{
    LargeList list(kMaximumItemCount);
    const int middle = list.options.count() / 2;
    bool flip = false;
    for (auto _ : state) {
        list.options.RenameItem(flip ? "Renamed line A" : "Renamed line B", middle);
        flip = !flip;
    }
}

void BM_DeleteItem(benchmark::State& state)
{
    LargeList list(kMaximumItemCount);
    const int middle = list.options.count() / 2;
    for (auto _ : state) {
        list.options.DeleteItem(middle);
        state.PauseTiming();
        list.options.InsertItem("Deleted line", middle - 1);
        state.ResumeTiming();
    }
}

BENCHMARK(BM_InsertItem)->Unit(benchmark::kMillisecond);
BENCHMARK(BM_RenameItem)->Unit(benchmark::kMillisecond);
BENCHMARK(BM_DeleteItem)->Unit(benchmark::kMillisecond);

} // namespace
} // namespace penmoor
