#include "model/itemindex.h"

#include "model/namematching.h"

#include <algorithm>

namespace penmoor {

void ItemIndex::rebuild(const std::vector<TemplateItem>& items)
{
    m_lastByKey.clear();
    m_lastByKey.reserve(items.size());
    m_previousSameKey.assign(items.size(), 0);
    for (std::size_t i = 0; i < items.size(); ++i) {
        const int position = static_cast<int>(i) + 1;
        auto [entry, inserted] = m_lastByKey.try_emplace(nameMatchKey(items[i].name), position);
        if (!inserted) {
            m_previousSameKey[i] = entry->second;
            entry->second = position;
        }
    }
}

int ItemIndex::lastPosition(std::string_view name) const
{
    const auto entry = m_lastByKey.find(nameMatchKey(name));
    return entry == m_lastByKey.end() ? 0 : entry->second;
}

std::vector<int> ItemIndex::positions(std::string_view name) const
{
    std::vector<int> found;
    for (int position = lastPosition(name); position != 0; position = m_previousSameKey[position - 1]) {
        found.push_back(position);
    }
    std::reverse(found.begin(), found.end());
    return found;
}

} // namespace penmoor
