#include "shell/qtpaths.h"

#include <QCoreApplication>

namespace penmoor {

std::filesystem::path toPath(const QString& text)
{
    return std::filesystem::path(text.toStdU16String());
}

QString toQString(const std::filesystem::path& path)
{
    return QString::fromStdU16String(path.u16string());
}

std::filesystem::path programFolder()
{
    return toPath(QCoreApplication::applicationDirPath());
}

} // namespace penmoor
