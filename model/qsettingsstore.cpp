#include "model/qsettingsstore.h"

#include "model/settingskeycodec.h"

#include <QSettings>
#include <QStringList>
#include <QVariant>

namespace penmoor {

namespace {

QString qtKey(std::string_view key)
{
    return QString::fromLatin1(encodeSettingsKey(key));
}

QString qtText(std::string_view text)
{
    return QString::fromUtf8(text.data(), static_cast<qsizetype>(text.size()));
}

} // namespace

QSettingsStore::QSettingsStore()
    : m_settings(std::make_unique<QSettings>(QSettings::NativeFormat, QSettings::UserScope, "Harlenby", "Penmoor"))
{
}

QSettingsStore::QSettingsStore(const QString& iniFilePath)
    : m_settings(std::make_unique<QSettings>(iniFilePath, QSettings::IniFormat))
{
}

QSettingsStore::~QSettingsStore() = default;

std::string QSettingsStore::read(const std::string& key, const std::string& defaultValue) const
{
    const QVariant value = m_settings->value(qtKey(key));
    if (!value.isValid()) {
        return defaultValue;
    }
    // An INI line with unquoted commas, which the program never writes, reads as a list.
    if (value.typeId() == QMetaType::QStringList) {
        return value.toStringList().join(',').toStdString();
    }
    if (!value.canConvert<QString>()) {
        return defaultValue;
    }
    return value.toString().toStdString();
}

void QSettingsStore::write(const std::string& key, const std::string& value)
{
    m_settings->setValue(qtKey(key), qtText(value));
}

void QSettingsStore::sync()
{
    m_settings->sync();
    // A FormatError only says that what was there before could not all be read; the values
    // written are saved all the same.
    if (m_settings->status() == QSettings::AccessError) {
        throw SettingsError(
            "The settings could not be saved to " + location().toStdString() + ": the program may not write there.");
    }
}

QString QSettingsStore::location() const
{
    return m_settings->fileName();
}

} // namespace penmoor
