#include "tests/app/penmoorbuild.h"
#include "tests/support/temporaryfolder.h"

#include <fstream>

#include <gtest/gtest.h>

namespace penmoor {
namespace {

namespace fs = std::filesystem;
using testing::folderContents;
using testing::runPenmoorBuild;
using testing::TemporaryFolder;

std::string readText(const fs::path& path)
{
    std::ifstream in(path, std::ios::binary);
    return { std::istreambuf_iterator<char>(in), std::istreambuf_iterator<char>() };
}

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
    std::ofstream(folder / "items.txt") << "Cash on Hand (beginning of month)\nab\n";
    struct Case {
        std::vector<std::string> args;
        std::string problem;
    };
    const std::vector<Case> cases = {
        { { "--by-year", "2015", "2013", "-o", out }, "--by-year: the first year 2015 is after the last year 2013." },
        { { "--by-week", "0", "-o", out }, "--by-week: \"0\" is not a number of weeks from 1 to 100." },
        { { "--by-month", "2013", "2030", "-o", out }, "--by-month: the last year may be at most 10 years" },
        { { "--items", (folder / "items.txt").string(), "-o", out }, "line 2: the name \"ab\" is shorter than 3" },
        { { "--items", (folder / "none.txt").string(), "-o", out }, "No such file or directory" },
        { { "-o", (folder / "missing" / "plan.xls").string() }, "/missing\" does not exist." },
        { { "--company", "Harlenby" }, "-o is missing" },
        { { "-o", out, "--colour", "red" }, "unknown option \"--colour\"." },
        { { "-o", out, "--picture", (folder / "plan.bmp").string() }, "the name must end in .png" },
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
    std::ofstream(folder / "plan.xls") << "an older plan";
    const auto result = runPenmoorBuild({ "--company", "Harlenby", "-o", (folder / "plan.xls").string() });
    EXPECT_EQ(result.exitCode, 0) << result.errors;
    EXPECT_EQ(result.errors, "");
    EXPECT_EQ(folderContents(folder.path()), (std::vector<std::string> { "plan.xls" }));
    // Replaced by a compound file, which starts with its signature.
    EXPECT_EQ(readText(folder / "plan.xls").substr(0, 8), "\xD0\xCF\x11\xE0\xA1\xB1\x1A\xE1");
}

TEST(PenmoorBuildCli, AFailingBuildExitsWithStatusOneAndLeavesNoPartialOutput)
{
    TemporaryFolder folder;
    std::ofstream(folder / "plan.xls") << "an older plan";
    // Nothing can be created in /proc, so the picture fails after the workbook was saved.
    const auto result
        = runPenmoorBuild({ "--picture", "/proc/penmoor-build-test.png", "-o", (folder / "plan.xls").string() });
    EXPECT_EQ(result.exitCode, 1);
    EXPECT_EQ(
        result.errors.rfind("penmoor-build: the build failed: Could not write \"/proc/penmoor-build-test.png\": ", 0),
        0u)
        << result.errors;
    EXPECT_EQ(folderContents(folder.path()), (std::vector<std::string> { "plan.xls" }));
    EXPECT_EQ(readText(folder / "plan.xls"), "an older plan");
}

} // namespace
} // namespace penmoor
