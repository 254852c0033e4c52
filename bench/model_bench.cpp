// One editing operation on the largest item list, each including the recomputation of every
// derived field and the full relist into List1.
#include "model/defaultlist.h"
#include "model/memorysettingsstore.h"
#include "model/memorywindowview.h"
#include "model/options.h"

#include <string>

#include <benchmark/benchmark.h>

namespace penmoor {
namespace {

// The default list grown to size items with expense lines before SUBTOTAL, loaded as a start
// of the program would load it, so the totals stay long: SUBTOTAL combines almost every item.
struct LargeList {
    explicit LargeList(int size)
    {
        int position = 0;
        const auto storeName
            = [&](const std::string& name) { store.write("Field" + std::to_string(++position), name); };
        for (const std::string_view name : kDefaultItemNames) {
            if (name == kSubtotal) {
                for (int line = 0; line < size - static_cast<int>(kDefaultItemNames.size()); ++line) {
                    storeName("Expense line " + std::to_string(line));
                }
            }
            storeName(std::string(name));
        }
        store.write("System Value - Rows", std::to_string(size));
        store.write("System Value - Saved", "True");
        options.LoadOptions(LoadMode::FromStore);
    }

    MemorySettingsStore store;
    MemoryWindowView view;
    Options options { store, view, [] { return 2031; } };
};

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
