#pragma once

#include "automation/mainwindow.h"
#include "automation/previewwindow.h"
#include "automation/sharedapplication.h"
#include "automation/templatebuild.h"
#include "shell/dialogs.h"

namespace penmoor {

// The two procedures through which the main window starts a build. Everything runs on the
// calling thread, without yielding to the message loop, and nothing here fails to the caller:
// every failure is shown in the error report and the procedure goes on.
//
//     BuildDriver driver({ factory, options, form1, std::filesystem::temp_directory_path(),
//                            seededUnitRandom() },
//         form1, form2, dialogs);
//     driver.StartCreatingTemplate(); // on a click of PushButton22
class BuildDriver {
public:
    // setup, the windows and the dialogs must outlive the driver.
    BuildDriver(BuildSetup setup, MainWindow& mainWindow, PreviewWindow& preview, Dialogs& dialogs);

    // "Start Creating Template": the period check and the running-spreadsheet question with
    // the main window's drawing locked, then the build under the hourglass. Failures are
    // reported as the button's.
    void StartCreatingTemplate();

    // One whole build: from the item list and options to the preview window showing the
    // picture of the saved temporary workbook. Failures are reported as the build's.
    void GenerateReport0();

    // The shared application reference, empty outside a build.
    const SharedApplication& sharedApplication() const { return m_shared; }

private:
    BuildSetup m_setup;
    MainWindow& m_mainWindow;
    PreviewWindow& m_preview;
    Dialogs& m_dialogs;
    SharedApplication m_shared;
};

} // namespace penmoor
