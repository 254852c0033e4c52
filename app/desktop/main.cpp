// penmoor: the desktop program. Sets up the application, the user's settings store and the
// dialogs, then runs the main window until the program ends with one of its windows.
#include "app/desktop/desktopprogram.h"
#include "model/qsettingsstore.h"
#include "shell/applicationicon.h"
#include "shell/desktop.h"
#include "shell/qtdialogs.h"
#include "shell/qtpaths.h"

#include <QApplication>
#include <QDir>

int main(int argc, char** argv)
{
    using namespace penmoor;

    QApplication application(argc, argv);
    QApplication::setApplicationName(QStringLiteral("Penmoor"));
    QGuiApplication::setDesktopFileName(QStringLiteral("penmoor"));
    QApplication::setWindowIcon(applicationIcon());

    QSettingsStore settings;
    QtDialogs dialogs;
    // The platform's temporary folder (TMPDIR here, TEMP on Windows); Qt always names one.
    DesktopProgram program({ settings, dialogs, programFolder(), toPath(QDir::tempPath()), currentCalendarYear,
        seededUnitRandom(), seededUnitRandom(), openAddressOnDesktop, std::nullopt });
    program.start();
    return QApplication::exec();
}
