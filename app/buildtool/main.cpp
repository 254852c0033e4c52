// penmoor-build: the cash-flow workbook without a window. See usageText() for the interface.
#include "app/buildtool/arguments.h"
#include "app/buildtool/commandline.h"
#include "app/buildtool/headlessbuild.h"
#include "model/currentyear.h"
#include "spreadsheet/builtin/builtinapplication.h"
#include "spreadsheet/picture/enginepicturerenderer.h"
#include "spreadsheet/picture/sheetpainter.h"

#include <cstdlib>
#include <exception>
#include <iostream>
#include <memory>

#include <QGuiApplication>

namespace {

constexpr int kBuilt = 0;
constexpr int kBuildFailed = 1;
constexpr int kRefused = 2;

// Qt's notes about its environment (no runtime folder and the like) are no concern of the
// tool's user; only its critical messages reach standard error.
void showOnlyCriticalQtMessages(QtMsgType type, const QMessageLogContext&, const QString& message)
{
    if (type == QtCriticalMsg || type == QtFatalMsg) {
        std::cerr << "penmoor-build: " << message.toStdString() << "\n";
    }
}

// Painting needs a QGuiApplication; the offscreen platform serves without a display. Only
// a build with --picture pays for starting it.
int buildWithPicture(int argc, char** argv, const penmoor::BuildRequest& request, int year)
{
    qInstallMessageHandler(showOnlyCriticalQtMessages);
    qputenv("QT_QPA_PLATFORM", "offscreen");
    QGuiApplication application(argc, argv);
    penmoor::engine::BuiltinApplicationFactory spreadsheets(
        std::make_shared<penmoor::picture::EnginePictureRenderer>());
    penmoor::runHeadlessBuild(request, spreadsheets, penmoor::picture::encodePng, year);
    return kBuilt;
}

} // namespace

int main(int argc, char** argv)
{
    const int year = penmoor::currentCalendarYear();
    penmoor::CommandLine commandLine;
    try {
        commandLine = penmoor::parseCommandLine(penmoor::commandArguments(argc, argv), year);
    } catch (const penmoor::UsageError& problem) {
        std::cerr << "penmoor-build: " << problem.what() << "\nSee \"penmoor-build --help\" for what it takes.\n";
        return kRefused;
    }
    if (commandLine.helpWanted) {
        std::cout << penmoor::usageText();
        return kBuilt;
    }
    try {
        if (commandLine.request.picture) {
            return buildWithPicture(argc, argv, commandLine.request, year);
        }
        penmoor::engine::BuiltinApplicationFactory spreadsheets;
        penmoor::runHeadlessBuild(commandLine.request, spreadsheets, {}, year);
        return kBuilt;
    } catch (const std::exception& failure) {
        std::cerr << "penmoor-build: the build failed: " << failure.what() << "\n";
        return kBuildFailed;
    }
}
