#pragma once

#include "automation/contract/application.h"
#include "automation/mainwindow.h"
#include "automation/previewwindow.h"
#include "automation/privatefolder.h"
#include "automation/sharedapplication.h"
#include "automation/statements.h"
#include "model/mainwindowview.h"
#include "model/options.h"
#include "shell/unitrandom.h"

#include <filesystem>
#include <memory>
#include <optional>

namespace penmoor {

// What a build works with; the program wires it once.
struct BuildSetup {
    // Where the build's spreadsheet applications come from.
    xl::ApplicationFactory& spreadsheets;
    // The item list, whose included flags and sheet rows the build sets.
    Options& options;
    // The boxes and options that the sheet builder reads.
    const MainWindowView& boxes;
    // Where the temporary workbook and the private picture folder go: the platform's
    // temporary folder for a build in the window.
    std::filesystem::path temporaryFolder;
    // Draws the temporary names.
    UnitRandom random;
};

// One build, as a numbered sequence of statements run through a StatementRunner: with a
// reporting runner each failing statement is reported and the next one runs; values that a
// failed statement was to produce stay empty, so later statements that need them fail too.
class TemplateBuild {
public:
    TemplateBuild(const BuildSetup& setup, SharedApplication& shared);

    // Lines 100 to 150: takes the list's marks into the items, writes the sheet in a new
    // hidden instance held by the shared reference, saves it under a fresh temporary name,
    // closes and quits, and empties the reference.
    void writeTemporaryWorkbook(StatementRunner& statements);

    // Lines 152 to 178: reopens the saved workbook in a second hidden instance, takes the
    // sheet picture through the picture file in a private folder, quits, and hands picture and
    // temporary workbook over to the preview window, which is shown while the main window
    // hides.
    void showInPreview(StatementRunner& statements, MainWindow& mainWindow, PreviewWindow& preview);

    // The temporary workbook, once claimed; empty before, or when no name could be claimed.
    const std::filesystem::path& temporaryWorkbook() const { return m_temporaryWorkbook; }

private:
    const BuildSetup& m_setup;
    SharedApplication& m_shared;
    std::unique_ptr<xl::Workbook> m_buildWorkbook;
    std::filesystem::path m_temporaryWorkbook;
};

} // namespace penmoor
