#include "automation/builddriver.h"

#include "automation/excel1.h"
#include "automation/statements.h"
#include "shell/errorreport.h"

#include <utility>

namespace penmoor {

BuildDriver::BuildDriver(BuildSetup setup, MainWindow& mainWindow, PreviewWindow& preview, Dialogs& dialogs)
    : m_setup(std::move(setup))
    , m_mainWindow(mainWindow)
    , m_preview(preview)
    , m_dialogs(dialogs)
{
}

void BuildDriver::StartCreatingTemplate()
{
    ReportingStatements statements(m_dialogs, errorlocation::Form1PushButton22Click);
    // A check that fails instead of answering counts as a problem: no build on its account.
    bool stop = true;

    statements.run(100, [&] { m_mainWindow.lockDrawing(); });
    statements.run(102, [&] { stop = m_mainWindow.CheckPeriodOptions(); });
    if (stop) {
        statements.run(104, [&] { m_mainWindow.unlockDrawing(); });
        return;
    }
    stop = true;
    statements.run(106, [&] { stop = CheckSpreadsheetOpen(m_setup.spreadsheets, m_dialogs); });
    if (stop) {
        statements.run(108, [&] { m_mainWindow.unlockDrawing(); });
        return;
    }
    statements.run(110, [&] { m_mainWindow.setMousePointer(MousePointer::Hourglass); });
    statements.run(112, [&] { m_mainWindow.unlockDrawing(); });
    statements.run(114, [&] { GenerateReport0(); });
    statements.run(116, [&] { m_mainWindow.setMousePointer(MousePointer::Default); });
    statements.run(118, [&] { m_mainWindow.unlockDrawing(); });
}

void BuildDriver::GenerateReport0()
{
    ReportingStatements statements(m_dialogs, errorlocation::GenerateReport0);
    TemplateBuild build(m_setup, m_shared);
    build.writeTemporaryWorkbook(statements);
    build.showInPreview(statements, m_mainWindow, m_preview);
}

} // namespace penmoor
