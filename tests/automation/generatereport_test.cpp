#include "automation/contract/error.h"
#include "report/twelvemonthcashflow.h"
#include "spreadsheet/builtin/builtinapplication.h"
#include "tests/automation/buildfixture.h"

#include <fstream>

namespace penmoor {
namespace {

namespace fs = std::filesystem;
using testing::BuildFixture;

std::vector<std::string> folderContents(const fs::path& folder)
{
    std::vector<std::string> names;
    for (const fs::directory_entry& entry : fs::directory_iterator(folder)) {
        names.push_back(entry.path().filename().string());
    }
    std::sort(names.begin(), names.end());
    return names;
}

// The application-level operations of a whole build that succeeds, in order.
std::vector<std::string> buildSteps(int sheetDeletions)
{
    std::vector<std::string> steps = { "create", "Visible=False", "ScreenUpdating=False", "DisplayAlerts=False",
        "EnableEvents=False", "EnableCancelKey=0", "Cursor=2", "Workbooks.Add" };
    steps.insert(steps.end(), static_cast<std::size_t>(sheetDeletions), "Sheets(2).Delete");
    const std::vector<std::string> rest
        = { "Sheets(1).Name=CashFlow", "Sheets(1).Select", "Cursor=-4143", "ScreenUpdating=True", "DisplayAlerts=True",
              "EnableEvents=True", "EnableCancelKey=1", "SaveAs qarnet55555555.xls", "DisplayAlerts=False", "Close",
              "Quit", "create", "Workbooks.Open qarnet55555555.xls", "DisplayAlerts=False", "Close", "Quit" };
    steps.insert(steps.end(), rest.begin(), rest.end());
    return steps;
}

class GenerateReport0Test : public BuildFixture { };

TEST_F(GenerateReport0Test, RunsItsStepsInOrderAndRestoresTheSwitchesBeforeSaving)
{
    driver.GenerateReport0();

    EXPECT_EQ(factory.log(), buildSteps(2));
    EXPECT_TRUE(driver.sharedApplication().isEmpty());
    ASSERT_EQ(windowLog.size(), 6u);
    EXPECT_EQ(windowLog[0], "pointer 11");
    EXPECT_EQ(windowLog[1], "pointer 0");
    EXPECT_EQ(windowLog[2].rfind("preview picture ", 0), 0u) << windowLog[2];
    EXPECT_EQ((std::vector<std::string>(windowLog.begin() + 3, windowLog.end())),
        (std::vector<std::string> { "preview path qarnet55555555.xls", "preview show", "hide" }));
}

TEST_F(GenerateReport0Test, LeavesOneSheetNamedCashFlowWhateverANewWorkbookHolds)
{
    for (const int sheets : { 1, 2, 3 }) {
        testing::RecordingFactory oneFactory;
        oneFactory.recorder().sheetsInNewWorkbook = sheets;
        std::vector<std::string> log;
        testing::RecordingMainWindow main(log);
        testing::RecordingPreview shown(log);
        BuildDriver oneDriver(BuildSetup { oneFactory, options, view, temporaryFolder / std::to_string(sheets),
                                  testing::scriptedRandom({ 0.5 }) },
            main, shown, dialogs);
        fs::create_directory(temporaryFolder / std::to_string(sheets));
        oneDriver.GenerateReport0();
        EXPECT_EQ(oneFactory.log(), buildSteps(sheets - 1)) << sheets;

        engine::BuiltinApplication reader;
        const std::unique_ptr<xl::Workbook> saved = reader.Workbooks()->Open(shown.tempWorkbookPath.string());
        ASSERT_EQ(saved->Sheets()->count(), 1);
        EXPECT_EQ(saved->Sheets()->Item(1)->Name(), "CashFlow");
    }
}

TEST_F(GenerateReport0Test, HandsOverThePictureOfTheSavedSheetAndKeepsOnlyTheWorkbook)
{
    // A file of the user's that happens to carry the picture file's name stays untouched.
    std::ofstream(temporaryFolder / "temp.bmp") << "the user's own";
    driver.GenerateReport0();

    EXPECT_EQ(preview.tempWorkbookPath, temporaryWorkbook());
    EXPECT_GT(fs::file_size(temporaryWorkbook()), 0u);
    EXPECT_EQ(folderContents(temporaryFolder.path()), (std::vector<std::string> { "qarnet55555555.xls", "temp.bmp" }));
    std::ifstream userFile(temporaryFolder / "temp.bmp");
    EXPECT_EQ(std::string(std::istreambuf_iterator<char>(userFile), {}), "the user's own");

    // The test renderer draws 2 x 2 pixels for each cell of the used range of the saved sheet.
    engine::BuiltinApplication reader;
    const std::unique_ptr<xl::Workbook> saved = reader.Workbooks()->Open(temporaryWorkbook().string());
    const std::unique_ptr<xl::Range> used = saved->ActiveSheet()->UsedRange();
    EXPECT_EQ(preview.picture.width, 2 * used->Columns()->count());
    EXPECT_EQ(preview.picture.height, 2 * used->Rows()->count());
    EXPECT_EQ(used->Rows()->Item(1)->Row(), 1);
}

TEST_F(GenerateReport0Test, DrawsANewNameWhenTheFirstIsTaken)
{
    std::ofstream(temporaryFolder / "qarnet11111111.xls") << "someone's";
    std::vector<double> draws = testing::drawsForDigits("11111111");
    const std::vector<double> second = testing::drawsForDigits("22222222");
    draws.insert(draws.end(), second.begin(), second.end());
    BuildDriver clashing(BuildSetup { factory, options, view, temporaryFolder.path(), testing::scriptedRandom(draws) },
        mainWindow, preview, dialogs);
    clashing.GenerateReport0();
    EXPECT_EQ(preview.tempWorkbookPath, temporaryFolder / "qarnet22222222.xls");
    std::ifstream kept(temporaryFolder / "qarnet11111111.xls");
    EXPECT_EQ(std::string(std::istreambuf_iterator<char>(kept), {}), "someone's");
}

TEST_F(GenerateReport0Test, WithoutASpreadsheetApplicationReportsEachLaterStepAndStillOpensThePreview)
{
    factory.recorder().failing.insert("create");
    const std::string created = "create failed on purpose.";
    const auto missing = [](const char* what) {
        return "The " + std::string(what) + " is not available, because the step that was to provide it failed.";
    };
    const std::string application = missing("spreadsheet application");
    const std::string pictureFile = (pictureFolder() / "temp.bmp").string();
    const std::vector<std::pair<int, std::string>> reports = {
        { 102, created },
        { 104, application },
        { 106, application },
        { 108, application },
        { 110, application },
        { 112, application },
        { 114, application },
        { 116, application },
        { 118, application },
        { 122, application },
        { 124, application },
        { 126, application },
        { 128, application },
        { 130, application },
        { 132, application },
        { 134, application },
        { 136, application },
        { 138, application },
        { 142, missing("build workbook") },
        { 144, application },
        { 146, missing("build workbook") },
        { 148, application },
        { 152, created },
        { 156, missing("second spreadsheet application") },
        { 160, missing("reopened workbook") },
        { 162, missing("second spreadsheet application") },
        { 164, missing("reopened workbook") },
        { 166, missing("second spreadsheet application") },
        { 170, "The sheet picture \"" + pictureFile + "\" cannot be loaded: No such file or directory." },
    };
    for (const auto& [line, description] : reports) {
        dialogs.expectErrorReport(description, errorlocation::GenerateReport0, line);
    }

    driver.GenerateReport0();

    const auto& first = std::get<MessageRequest>(dialogs.log().at(0));
    EXPECT_EQ(first.text,
        "create failed on purpose.\r\nin Quarrytab11/7/2013.TwelveMonthCashFlow.GenerateReport0 at line 102\r\r"
        "Please email screenshot of this message to support@penmoor.example");
    EXPECT_EQ(first.title, "Application Error");
    EXPECT_EQ(first.icon, MessageIcon::Exclamation);
    // The preview still takes the temporary workbook's name, but the claim that no save filled
    // is gone, so saving the results reports the missing file instead of copying an empty one.
    EXPECT_EQ(windowLog,
        (std::vector<std::string> {
            "pointer 11", "pointer 0", "preview path qarnet55555555.xls", "preview show", "hide" }));
    EXPECT_FALSE(fs::exists(temporaryWorkbook()));
    EXPECT_FALSE(fs::exists(pictureFolder()));
    EXPECT_TRUE(driver.sharedApplication().isEmpty());
}

TEST_F(GenerateReport0Test, AFailureInsideTheSheetBuilderIsReportedAtItsCallAndTheBuildGoesOn)
{
    // By Month from year 0 asks the builder for far more columns than a sheet has.
    view.setText(TextBox::Text6, "");
    std::string builderFailure;
    {
        engine::BuiltinApplication alone;
        alone.Workbooks()->Add();
        try {
            TwelveMonthCashFlow(alone, options, view).WriteCashFlowSheet();
        } catch (const xl::Error& e) {
            builderFailure = e.what();
        }
    }
    ASSERT_FALSE(builderFailure.empty());
    dialogs.expectErrorReport(builderFailure, errorlocation::GenerateReport0, 124);
    // The builder stopped before writing below row 1, so there is no picture to load.
    dialogs.expectErrorReport("The sheet picture \"" + (pictureFolder() / "temp.bmp").string()
            + "\" cannot be loaded: No such file or directory.",
        errorlocation::GenerateReport0, 170);

    driver.GenerateReport0();

    // Every later step ran: the workbook was saved, reopened and handed over.
    EXPECT_EQ(factory.log(), buildSteps(2));
    EXPECT_TRUE(fs::exists(temporaryWorkbook()));
    EXPECT_EQ(windowLog,
        (std::vector<std::string> {
            "pointer 11", "pointer 0", "preview path qarnet55555555.xls", "preview show", "hide" }));
}

} // namespace
} // namespace penmoor
