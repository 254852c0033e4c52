#pragma once

#include "model/settingsstore.h"

#include <memory>

#include <QString>

class QSettings;

namespace penmoor {

// The settings store on QSettings. Keys pass through encodeSettingsKey, so any text is a key;
// values are stored as texts. A value that another program put there in some other form reads
// as its text where it has one, and as absent (the default) where it has none.
class QSettingsStore final : public SettingsStore {
public:
    // The current user's store: the application "Harlenby" with its section "Penmoor", i.e.
    // HKEY_CURRENT_USER\Software\Harlenby\Penmoor on Windows, Harlenby/Penmoor.conf in the
    // user's configuration folder elsewhere.
    QSettingsStore();
    // A store in the INI file at iniFilePath.
    explicit QSettingsStore(const QString& iniFilePath);
    ~QSettingsStore() override;

    std::string read(const std::string& key, const std::string& defaultValue) const override;
    void write(const std::string& key, const std::string& value) override;
    void sync() override;

    // Where the store keeps its values: a file name or a registry path.
    QString location() const;

private:
    std::unique_ptr<QSettings> m_settings;
};

} // namespace penmoor
