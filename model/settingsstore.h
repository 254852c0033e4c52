#pragma once

#include <stdexcept>
#include <string>

namespace penmoor {

// A failure to keep the settings; what() names the store and the reason in words for the user.
class SettingsError : public std::runtime_error {
public:
    using std::runtime_error::runtime_error;
};

// The per-user settings store: plain texts addressed by key, all under the application
// "Harlenby" and the section "Penmoor". Keys are arbitrary texts (item names among them) and
// must come back exactly as written. Reading never fails: an absent key gives the default.
class SettingsStore {
public:
    virtual ~SettingsStore() = default;

    virtual std::string read(const std::string& key, const std::string& defaultValue) const = 0;
    virtual void write(const std::string& key, const std::string& value) = 0;
    // Puts every write so far into permanent storage; throws SettingsError when that fails.
    // A store that keeps nothing beyond the run has nothing to do.
    virtual void sync() { }
};

} // namespace penmoor
