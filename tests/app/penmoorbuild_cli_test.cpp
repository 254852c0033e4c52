#include "tests/app/penmoorbuild.h"
#include "tests/support/temporaryfolder.h"
#include "tests/xls/support/files.h"

#include <gtest/gtest.h>

namespace penmoor {
namespace {

namespace fs = std::filesystem;
using testing::runPenmoorBuild;
using testing::TemporaryFolder;
using xls::test::folderContents;
using xls::test::readFile;
using xls::test::writeFile;

TEST(PenmoorBuildCli, HelpDocumentsTheInterfaceAndWritesNothing)
{
    const auto result = runPenmoorBuild({ "--help" });
    EXPECT_EQ(result.exitCode, 0);
    EXPECT_EQ(result.output.rfind("Usage: penmoor-build [--company TEXT]", 0), 0u) << result.output;
    EXPECT_EQ(result.errors, "");
}

TEST(PenmoorBuildCli, RefusesBadInputWithStatusTwoBeforeWritingAnything)
{
    TemporaryFolder folder;
    const std::string out = (folder / "plan.xls").string();
    writeFile(folder / "items.txt", "Cash on Hand (beginning of month)\nab\n");
    // One refusal of each kind; the command line tests check every message.
    struct Case {
        std::vector<std::string> args;
        std::string problem;
    };
    const std::vector<Case> cases = {
        { { "--by-week", "0", "-o", out }, "--by-week: \"0\" is not a number of weeks from 1 to 100." },
        { { "--items", (folder / "items.txt").string(), "-o", out }, "line 2: the name \"ab\" is shorter than 3" },
        { { "-o", (folder / "missing" / "plan.xls").string() }, "/missing\" does not exist." },
    };
    for (const Case& c : cases) {
        const auto result = runPenmoorBuild(c.args);
        EXPECT_EQ(result.exitCode, 2) << c.problem;
        EXPECT_EQ(result.errors.rfind("penmoor-build: ", 0), 0u) << result.errors;
        EXPECT_NE(result.errors.find(c.problem), std::string::npos) << result.errors;
        EXPECT_EQ(result.output, "");
        EXPECT_EQ(folderContents(folder.path()), (std::vector<std::string> { "items.txt" })) << c.problem;
    }
}

TEST(PenmoorBuildCli, WritesTheWorkbookAndNothingElse)
{
    TemporaryFolder folder;
    writeFile(folder / "plan.xls", "an older plan");
    const auto result = runPenmoorBuild({ "--company", "Harlenby", "-o", (folder / "plan.xls").string() });
    EXPECT_EQ(result.exitCode, 0) << result.errors;
    EXPECT_EQ(result.errors, "");
    EXPECT_EQ(folderContents(folder.path()), (std::vector<std::string> { "plan.xls" }));
    // Replaced by a compound file, which starts with its signature.
    const auto written = readFile(folder / "plan.xls");
    ASSERT_GE(written.size(), 8u);
    EXPECT_EQ(std::vector(written.begin(), written.begin() + 8),
        (std::vector<std::uint8_t> { 0xD0, 0xCF, 0x11, 0xE0, 0xA1, 0xB1, 0x1A, 0xE1 }));
}

TEST(PenmoorBuildCli, AFailingBuildExitsWithStatusOneAndLeavesNoPartialOutput)
{
    TemporaryFolder folder;
    writeFile(folder / "plan.xls", "an older plan");
    // Nothing can be created in /proc, so the picture fails after the workbook was saved.
    const auto result
        = runPenmoorBuild({ "--picture", "/proc/penmoor-build-test.png", "-o", (folder / "plan.xls").string() });
    EXPECT_EQ(result.exitCode, 1);
    EXPECT_EQ(
        result.errors.rfind("penmoor-build: the build failed: Could not write \"/proc/penmoor-build-test.png\": ", 0),
        0u)
        << result.errors;
    EXPECT_EQ(folderContents(folder.path()), (std::vector<std::string> { "plan.xls" }));
    EXPECT_EQ(readFile(folder / "plan.xls"), xls::test::bytesOf("an older plan"));
}

} // namespace
} // namespace penmoor
