#pragma once

#include "model/defaultlist.h"
#include "model/memorysettingsstore.h"
#include "model/memorywindowview.h"
#include "model/options.h"

#include <string>

namespace penmoor::bench {

// The default list grown to size items with expense lines before SUBTOTAL, loaded as a start
// of the program would load it, so the totals stay long: SUBTOTAL combines almost every item.
struct LargeItemList {
    explicit LargeItemList(int size)
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

} // namespace penmoor::bench
