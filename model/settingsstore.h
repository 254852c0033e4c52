#pragma once

#include <string>

namespace penmoor {

// The per-user settings store: plain texts addressed by key, all under the application
// "Harlenby" and the section "Penmoor". Keys are arbitrary texts (item names among them) and
// must come back exactly as written. Reading never fails: an absent key gives the default.
class SettingsStore {
public:
    virtual ~SettingsStore() = default;

    virtual std::string read(const std::string& key, const std::string& defaultValue) const = 0;
    virtual void write(const std::string& key, const std::string& value) = 0;
};

} // namespace penmoor
