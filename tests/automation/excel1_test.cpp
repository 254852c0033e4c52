#include "automation/contract/error.h"
#include "automation/excel1.h"
#include "automation/picturefile.h"
#include "tests/automation/recordingapplication.h"
#include "tests/support/scripteddialogs.h"
#include "tests/support/temporaryfolder.h"

#include <fstream>

#include <gtest/gtest.h>

namespace penmoor {
namespace {

namespace fs = std::filesystem;
using testing::RecordingFactory;
using testing::ScriptedDialogs;
using testing::TemporaryFolder;

TEST(IsSpreadsheetRunning, IsTrueOnlyForARunningInstanceThatNamesItself)
{
    struct Case {
        std::string runningValue;
        bool valueFails;
        bool expected;
    };
    const Case cases[] = {
        { "", false, false }, // nothing to attach to
        { "Microsoft Excel", false, true }, { "Penmoor spreadsheet", false, false },
        { "microsoft excel", false, false }, { "Microsoft Excel", true, false }, // its value cannot be read
    };
    for (const Case& c : cases) {
        RecordingFactory factory;
        factory.recorder().runningValue = c.runningValue;
        if (c.valueFails) {
            factory.recorder().failing.insert("Value");
        }
        EXPECT_EQ(IsSpreadsheetRunning(factory), c.expected) << c.runningValue;
        for (const std::string& entry : factory.log()) {
            EXPECT_NE(entry, "Quit") << "the running instance is the user's and must stay";
        }
    }
}

TEST(CheckSpreadsheetOpen, AsksOnlyWhenOneIsRunningAndStopsUnlessTheAnswerIsYes)
{
    const std::string question = "Excel may be open. It is recommended that you close Excel first.\r\n\r\n"
                                 "Would you like to proceed anyway?";
    const MessageRequest asked = spreadsheetOpenQuestion();
    EXPECT_EQ(asked.text, question);
    EXPECT_EQ(asked.buttons, MessageButtons::YesNo);
    EXPECT_EQ(asked.icon, MessageIcon::None);
    EXPECT_EQ(shownTitle(asked.title), "Penmoor");

    {
        RecordingFactory factory;
        ScriptedDialogs dialogs;
        EXPECT_FALSE(CheckSpreadsheetOpen(factory, dialogs));
    }
    for (const DialogAnswer answer : { DialogAnswer::Yes, DialogAnswer::No }) {
        RecordingFactory factory;
        factory.recorder().runningValue = "Microsoft Excel";
        ScriptedDialogs dialogs;
        dialogs.expect(asked, answer);
        EXPECT_EQ(CheckSpreadsheetOpen(factory, dialogs), answer == DialogAnswer::No);
    }
}

TEST(OpenWorkbookInNewInstance, QuitsTheNewInstanceWhenTheFileCannotBeOpened)
{
    TemporaryFolder folder;
    RecordingFactory factory;
    EXPECT_THROW(OpenWorkbookInNewInstance(factory, folder / "missing.xls"), xl::Error);
    EXPECT_EQ(factory.log(), (std::vector<std::string> { "create", "Workbooks.Open missing.xls", "Quit" }));
}

// A built-in application with a new workbook whose first sheet holds values at the cells.
std::unique_ptr<xl::Application> sheetWith(RecordingFactory& factory, const std::vector<std::string>& cells)
{
    std::unique_ptr<xl::Application> application = factory.create();
    application->Workbooks()->Add();
    for (const std::string& cell : cells) {
        application->Range(cell)->setFormulaR1C1("1");
    }
    return application;
}

TEST(SaveSheetPicture, WritesThePictureOfTheUsedRangeOnlyWhenItEndsBelowRowOne)
{
    struct Case {
        std::vector<std::string> cells;
        int expectedWidth; // 0: no picture file
        int expectedHeight;
    };
    // The test renderer draws 2 x 2 pixels per cell of the used range.
    const Case cases[] = {
        { {}, 0, 0 },
        { { "A1", "E1" }, 0, 0 },
        { { "A2" }, 2, 2 },
        { { "B4", "P51" }, 30, 96 },
    };
    for (const Case& c : cases) {
        TemporaryFolder folder;
        RecordingFactory factory;
        const std::unique_ptr<xl::Application> application = sheetWith(factory, c.cells);
        const fs::path file = folder / "temp.bmp";
        SaveSheetPicture(*application->ActiveWorkbook(), file);
        if (c.expectedWidth == 0) {
            EXPECT_FALSE(fs::exists(file)) << c.cells.size();
            continue;
        }
        const xl::Picture picture = loadPictureFile(file);
        EXPECT_EQ(picture.width, c.expectedWidth) << c.cells.back();
        EXPECT_EQ(picture.height, c.expectedHeight) << c.cells.back();
    }
}

TEST(SaveSheetPicture, ReplacesAFileOfThatName)
{
    TemporaryFolder folder;
    const fs::path file = folder / "temp.bmp";
    std::ofstream(file) << "an older file of that name";
    RecordingFactory factory;
    SaveSheetPicture(*sheetWith(factory, { "B3" })->ActiveWorkbook(), file);
    EXPECT_EQ(loadPictureFile(file).width, 2);
}

} // namespace
} // namespace penmoor
