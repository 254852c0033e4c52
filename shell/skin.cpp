#include "shell/skin.h"

#include "shell/fileutils.h"
#include "shell/qtpaths.h"
#include "shell/windowutils.h"

#include <QFile>
#include <QWidget>

namespace penmoor {

bool ApplySkin(QWidget& mainWindow, const std::filesystem::path& programFolder)
{
    const std::filesystem::path path = programFolder / "x" / "o.cjs";
    if (!FileExists(path)) {
        return false;
    }
    QFile file(toQString(path));
    if (!file.open(QIODevice::ReadOnly)) {
        return false;
    }
    const QString styleSheet = QString::fromUtf8(file.readAll());
    SetStandardColors(mainWindow);
    mainWindow.setStyleSheet(styleSheet);
    return true;
}

} // namespace penmoor
