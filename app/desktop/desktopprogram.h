#pragma once

#include "app/desktop/previewonfirstuse.h"
#include "automation/builddriver.h"
#include "model/currentyear.h"
#include "model/settingsstore.h"
#include "shell/dialogs.h"
#include "shell/makerpage.h"
#include "shell/unitrandom.h"
#include "spreadsheet/builtin/builtinapplication.h"
#include "ui/main/form1.h"
#include "ui/preview/form2.h"

#include <chrono>
#include <filesystem>
#include <optional>

namespace penmoor {

// What the desktop program runs with. Everything referred to must outlive the program.
struct DesktopSetup {
    SettingsStore& settings;
    Dialogs& dialogs;
    // The folder of the optional program files: "Splash", the pointer and the skin.
    std::filesystem::path programFolder;
    // Where builds put their temporary workbook and picture folder.
    std::filesystem::path temporaryFolder;
    YearSource currentYear = currentCalendarYear;
    // The start's draw for the maker's page, and the draws of the temporary names.
    UnitRandom makerPageDraw;
    UnitRandom temporaryNames;
    AddressOpener openAddress;
    // How long the splash stays; none: 4 seconds, or 0.4 in development.
    std::optional<std::chrono::milliseconds> splashTime;
};

// The desktop program's windows and build driver, wired once: the main window starts builds
// through the driver, which hands each result over to the preview window; "< Back" returns
// to the main window. Closing either window writes the settings and ends the program.
class DesktopProgram {
public:
    explicit DesktopProgram(DesktopSetup setup);

    // The main window's load step, then the window shows; the event loop does the rest.
    void start();

    Form1& mainWindow() { return m_form1; }
    // The preview window, or null before the first build reached it.
    Form2* previewWindow() const { return m_preview.created(); }

private:
    engine::BuiltinApplicationFactory m_spreadsheets;
    Form1 m_form1;
    PreviewOnFirstUse<Form2> m_preview;
    BuildDriver m_driver;
};

} // namespace penmoor
