#include "model/memorysettingsstore.h"

namespace penmoor {

std::string MemorySettingsStore::read(const std::string& key, const std::string& defaultValue) const
{
    const auto entry = m_entries.find(key);
    return entry == m_entries.end() ? defaultValue : entry->second;
}

void MemorySettingsStore::write(const std::string& key, const std::string& value)
{
    m_entries[key] = value;
}

} // namespace penmoor
