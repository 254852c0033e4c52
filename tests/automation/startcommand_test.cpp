#include "automation/excel1.h"
#include "tests/automation/buildfixture.h"

#include <stdexcept>

namespace penmoor {
namespace {

using testing::BuildFixture;

class StartCommandTest : public BuildFixture { };

TEST_F(StartCommandTest, BuildsUnderTheHourglassWithDrawingUnlocked)
{
    driver.StartCreatingTemplate();
    ASSERT_EQ(windowLog.size(), 12u);
    const std::vector<std::string> before(windowLog.begin(), windowLog.begin() + 6);
    EXPECT_EQ(
        before, (std::vector<std::string> { "lock", "check", "pointer 11", "unlock", "pointer 11", "pointer 0" }));
    const std::vector<std::string> after(windowLog.begin() + 7, windowLog.end());
    EXPECT_EQ(after,
        (std::vector<std::string> {
            "preview path qarnet55555555.xls", "preview show", "hide", "pointer 0", "unlock" }));
    // The build asked for no running instance beyond the one check.
    EXPECT_EQ(factory.log().front(), "attachRunning");
    EXPECT_EQ(factory.log().at(1), "create");
}

// A period check that reports a problem, or that fails itself (reported at its call).
TEST_F(StartCommandTest, BuildsNothingWhenThePeriodCheckStopsIt)
{
    mainWindow.checkPeriodOptions = [] { return true; };
    driver.StartCreatingTemplate();
    mainWindow.checkPeriodOptions = []() -> bool { throw std::runtime_error("The boxes cannot be read."); };
    dialogs.expectErrorReport("The boxes cannot be read.", errorlocation::Form1PushButton22Click, 102);
    driver.StartCreatingTemplate();
    EXPECT_EQ(windowLog, (std::vector<std::string> { "lock", "check", "unlock", "lock", "check", "unlock" }));
    EXPECT_TRUE(factory.log().empty());
}

TEST_F(StartCommandTest, AsksWhenASpreadsheetApplicationRunsAndBuildsOnlyAfterYes)
{
    factory.recorder().runningValue = "Microsoft Excel";
    dialogs.expect(spreadsheetOpenQuestion(), DialogAnswer::No);
    driver.StartCreatingTemplate();
    // Unlocked, and the pointer never left the default.
    EXPECT_EQ(windowLog, (std::vector<std::string> { "lock", "check", "unlock" }));
    EXPECT_EQ(factory.log(), (std::vector<std::string> { "attachRunning", "Value" }));

    windowLog.clear();
    dialogs.expect(spreadsheetOpenQuestion(), DialogAnswer::Yes);
    driver.StartCreatingTemplate();
    EXPECT_EQ(windowLog.back(), "unlock");
    EXPECT_NE(std::find(windowLog.begin(), windowLog.end(), "preview show"), windowLog.end());
}

} // namespace
} // namespace penmoor
