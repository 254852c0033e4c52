#pragma once

#include "automation/builddriver.h"
#include "model/memorysettingsstore.h"
#include "model/memorywindowview.h"
#include "model/options.h"
#include "tests/automation/recordingapplication.h"
#include "tests/automation/recordingwindows.h"
#include "tests/automation/scriptedrandom.h"
#include "tests/support/scripteddialogs.h"
#include "tests/support/temporaryfolder.h"

#include <gtest/gtest.h>

namespace penmoor::testing {

// A build driver over the built-in application (wrapped to record its switches, workbooks and
// sheets), the default item list in By Month 2013, recording windows and scripted dialogs.
// Every temporary name is drawn from the digit 5: the workbook is "qarnet55555555.xls" and the
// picture folder "penmoor-555555555555", both in the test's own temporary folder.
class BuildFixture : public ::testing::Test {
protected:
    BuildFixture()
        : options(store, view, [] { return 2013; })
        , driver(BuildSetup { factory, options, view, temporaryFolder.path(), scriptedRandom({ 0.5 }) }, mainWindow,
              preview, dialogs)
    {
        options.LoadOptions(LoadMode::FromStore);
        view.setText(TextBox::Text6, "2013");
        view.setText(TextBox::Text7, "2013");
    }

    std::filesystem::path temporaryWorkbook() const { return temporaryFolder / "qarnet55555555.xls"; }
    std::filesystem::path pictureFolder() const { return temporaryFolder / "penmoor-555555555555"; }

    TemporaryFolder temporaryFolder;
    MemorySettingsStore store;
    MemoryWindowView view;
    Options options;
    RecordingFactory factory;
    ScriptedDialogs dialogs;
    std::vector<std::string> windowLog;
    RecordingMainWindow mainWindow { windowLog };
    RecordingPreview preview { windowLog };
    BuildDriver driver;
};

} // namespace penmoor::testing
