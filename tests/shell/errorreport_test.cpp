#include "shell/errorreport.h"
#include "tests/support/scripteddialogs.h"

#include <filesystem>
#include <stdexcept>
#include <vector>

#include <gtest/gtest.h>

namespace penmoor {
namespace {

using testing::ScriptedDialogs;

TEST(ErrorReportText, IsComposedByteForByte)
{
    struct Case {
        std::string description;
        std::string_view location;
        int line;
        std::string expected;
    };
    const std::vector<Case> cases = {
        { "Permission denied", errorlocation::Form2PushButton6Click, 104,
            "Permission denied\r\nin Quarrytab11/7/2013.Form2.PushButton6_Click at line 104\r\r"
            "Please email screenshot of this message to support@penmoor.example" },
        { "", errorlocation::GenerateReport0, 112,
            "\r\nin Quarrytab11/7/2013.TwelveMonthCashFlow.GenerateReport0 at line 112\r\r"
            "Please email screenshot of this message to support@penmoor.example" },
        { "Subscript out of range", errorlocation::Form1PushButton2Click, 0,
            "Subscript out of range\r\nin Quarrytab11/7/2013.Form1.PushButton2_Click at line 0\r\r"
            "Please email screenshot of this message to support@penmoor.example" },
        { "Zahl zu groß", errorlocation::Form2PushButton1Click, 1000,
            "Zahl zu groß\r\nin Quarrytab11/7/2013.Form2.PushButton1_Click at line 1000\r\r"
            "Please email screenshot of this message to support@penmoor.example" },
    };
    for (const Case& c : cases) {
        EXPECT_EQ(composeErrorReport(c.description, c.location, c.line), c.expected) << c.description;
    }
}

TEST(ErrorReportText, IsShownAsAnExclamationBoxWithOk)
{
    const MessageRequest request = errorReportRequest("Oops", errorlocation::Form1PushButton5Click, 102);
    EXPECT_EQ(request.text, composeErrorReport("Oops", errorlocation::Form1PushButton5Click, 102));
    EXPECT_EQ(request.title, "Application Error");
    EXPECT_EQ(request.icon, MessageIcon::Exclamation);
    EXPECT_EQ(request.buttons, MessageButtons::Ok);
    EXPECT_EQ(request.defaultButton, DialogAnswer::Ok);
}

// A routine without a report of its own that fails at its second statement.
void failingHelper(std::vector<int>& trace, bool fail)
{
    trace.push_back(1);
    if (fail) {
        throw std::runtime_error("Helper failed");
    }
    trace.push_back(2);
}

class ReportingProcedureTest : public ::testing::Test {
protected:
    ScriptedDialogs dialogs;
    ReportingProcedure procedure { dialogs, errorlocation::Form2PushButton6Click };
    std::vector<int> trace;
};

TEST_F(ReportingProcedureTest, RunsEveryStatementWithoutAReportWhenNothingFails)
{
    EXPECT_TRUE(procedure.step(100, [&] { trace.push_back(100); }));
    EXPECT_TRUE(procedure.step(102, [&] { trace.push_back(102); }));
    EXPECT_EQ(trace, (std::vector<int> { 100, 102 }));
    EXPECT_TRUE(dialogs.log().empty());
}

TEST_F(ReportingProcedureTest, ReportsEachFailureAndGoesOnWithTheNextStatement)
{
    dialogs.expectErrorReport("first", errorlocation::Form2PushButton6Click, 102)
        .expectErrorReport("second", errorlocation::Form2PushButton6Click, 106);

    procedure.step(100, [&] { trace.push_back(100); });
    EXPECT_FALSE(procedure.step(102, [&] { throw std::runtime_error("first"); }));
    procedure.step(104, [&] { trace.push_back(104); });
    EXPECT_FALSE(procedure.step(106, [&] { throw std::runtime_error("second"); }));
    procedure.step(108, [&] { trace.push_back(108); });

    EXPECT_EQ(trace, (std::vector<int> { 100, 104, 108 }));
    EXPECT_EQ(dialogs.pending(), 0u);
}

TEST_F(ReportingProcedureTest, AFailureInTheLastStatementIsReportedAndTheProcedureReturns)
{
    dialogs.expectErrorReport("last", errorlocation::Form2PushButton6Click, 104);
    procedure.step(100, [&] { trace.push_back(100); });
    procedure.step(102, [&] { trace.push_back(102); });
    procedure.step(104, [&] { throw std::runtime_error("last"); });
    EXPECT_EQ(trace, (std::vector<int> { 100, 102 }));
}

TEST_F(ReportingProcedureTest, AFailureInsideACalledRoutineCarriesTheCallersLine)
{
    dialogs.expectErrorReport("Helper failed", errorlocation::Form2PushButton6Click, 102);
    procedure.step(100, [&] { trace.push_back(100); });
    procedure.step(102, [&] { failingHelper(trace, true); });
    procedure.step(104, [&] { trace.push_back(104); });
    // The helper ran up to its failing statement; the caller went on after the call.
    EXPECT_EQ(trace, (std::vector<int> { 100, 1, 104 }));
}

TEST_F(ReportingProcedureTest, AValueAFailedStatementWasToProduceKeepsItsPreviousContents)
{
    dialogs.expectErrorReport("no value", errorlocation::Form2PushButton6Click, 102);
    std::string path = "before";
    procedure.step(102, [&] { path = [&]() -> std::string { throw std::runtime_error("no value"); }(); });
    EXPECT_EQ(path, "before");
}

TEST_F(ReportingProcedureTest, DescribesEveryKindOfFailure)
{
    const std::filesystem::path missing = std::filesystem::path(::testing::TempDir()) / "penmoor-missing" / "a.xls";
    std::string systemText;
    try {
        std::filesystem::copy_file(missing, missing.parent_path() / "b.xls");
    } catch (const std::filesystem::filesystem_error& e) {
        systemText = e.what();
    }
    ASSERT_FALSE(systemText.empty());

    dialogs.expectErrorReport(systemText, errorlocation::Form2PushButton6Click, 100)
        .expectErrorReport("Unknown failure", errorlocation::Form2PushButton6Click, 102);
    procedure.step(100, [&] { std::filesystem::copy_file(missing, missing.parent_path() / "b.xls"); });
    procedure.step(102, [] { throw 42; });
}

TEST_F(ReportingProcedureTest, ANestedReportingProcedureReportsItsOwnFailures)
{
    dialogs.expectErrorReport("inner", errorlocation::Form1PushButton3Click, 104);
    procedure.step(100, [&] {
        ReportingProcedure inner(dialogs, errorlocation::Form1PushButton3Click);
        inner.step(104, [] { throw std::runtime_error("inner"); });
        inner.step(106, [&] { trace.push_back(106); });
    });
    procedure.step(102, [&] { trace.push_back(102); });
    EXPECT_EQ(trace, (std::vector<int> { 106, 102 }));
}

} // namespace
} // namespace penmoor
