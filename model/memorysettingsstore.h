#pragma once

#include "model/settingsstore.h"

#include <functional>
#include <map>
#include <string>

namespace penmoor {

// Settings held in memory for one run: for tests and for builds that must not touch the
// user's store.
class MemorySettingsStore final : public SettingsStore {
public:
    std::string read(const std::string& key, const std::string& defaultValue) const override;
    void write(const std::string& key, const std::string& value) override;

    const std::map<std::string, std::string, std::less<>>& entries() const { return m_entries; }

private:
    std::map<std::string, std::string, std::less<>> m_entries;
};

} // namespace penmoor
