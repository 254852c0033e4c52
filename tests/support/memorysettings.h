#pragma once

#include "model/settingsstore.h"

#include <map>
#include <string>

namespace penmoor::testing {

// A settings store in memory, for tests that must not touch the user's real store.
class MemorySettings : public SettingsStore {
public:
    std::string read(const std::string& key, const std::string& defaultValue) const override
    {
        const auto found = values.find(key);
        return found == values.end() ? defaultValue : found->second;
    }
    void write(const std::string& key, const std::string& value) override { values[key] = value; }

    // Public so that tests can seed and inspect the stored keys directly.
    std::map<std::string, std::string> values;
};

} // namespace penmoor::testing
