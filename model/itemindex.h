#pragma once

#include "model/templateitem.h"

#include <string>
#include <string_view>
#include <unordered_map>
#include <vector>

namespace penmoor {

// Finds items by name under the item name matching in constant time, so that lookups and the
// recomputation of every derived field stay linear in the list size. Rebuilt after every change
// of names or positions.
class ItemIndex {
public:
    void rebuild(const std::vector<TemplateItem>& items);

    // The highest 1-based position whose name matches name; 0 when none does.
    int lastPosition(std::string_view name) const;

    // Every 1-based position whose name matches name, ascending.
    std::vector<int> positions(std::string_view name) const;

private:
    // Match key -> highest position with that key.
    std::unordered_map<std::string, int> m_lastByKey;
    // For position p at index p - 1: the next lower position with the same key, 0 when none.
    std::vector<int> m_previousSameKey;
};

} // namespace penmoor
