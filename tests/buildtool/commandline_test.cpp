#include "app/buildtool/commandline.h"
#include "tests/support/temporaryfolder.h"

#include <fstream>

#include <gtest/gtest.h>

namespace penmoor {
namespace {

namespace fs = std::filesystem;
using testing::TemporaryFolder;

constexpr int kThisYear = 2024;

class CommandLineTest : public ::testing::Test {
protected:
    // The arguments with "OUT" and "PIC" standing for files in the test's own folder.
    std::vector<std::string> arguments(std::vector<std::string> args) const
    {
        for (std::string& arg : args) {
            if (arg == "OUT") {
                arg = (m_folder / "plan.xls").string();
            } else if (arg == "PIC") {
                arg = (m_folder / "plan.png").string();
            }
        }
        return args;
    }
    BuildRequest parsed(std::vector<std::string> args) const
    {
        return parseCommandLine(arguments(std::move(args)), kThisYear).request;
    }
    std::string refusal(std::vector<std::string> args) const
    {
        try {
            parseCommandLine(arguments(std::move(args)), kThisYear);
        } catch (const UsageError& problem) {
            return problem.what();
        }
        return "(accepted)";
    }

    TemporaryFolder m_folder;
};

TEST_F(CommandLineTest, DefaultsToByMonthOverTheCurrentYearWithoutCompany)
{
    const BuildRequest request = parsed({ "-o", "OUT" });
    EXPECT_EQ(request.mode, PeriodMode::ByMonth);
    EXPECT_EQ(request.firstYear, kThisYear);
    EXPECT_EQ(request.lastYear, kThisYear);
    EXPECT_EQ(request.company, "");
    EXPECT_TRUE(request.items.empty());
    EXPECT_FALSE(request.picture);
    EXPECT_EQ(request.output, m_folder / "plan.xls");
}

TEST_F(CommandLineTest, TakesEveryOptionInAnyOrder)
{
    const BuildRequest byYear
        = parsed({ "-o", "OUT", "--by-year", "1990", "2090", "--company", "-Harlenby & Sons ", "--picture", "PIC" });
    EXPECT_EQ(byYear.mode, PeriodMode::ByYear);
    EXPECT_EQ(byYear.firstYear, 1990);
    EXPECT_EQ(byYear.lastYear, 2090);
    EXPECT_EQ(byYear.company, "-Harlenby & Sons ");
    EXPECT_EQ(byYear.picture, m_folder / "plan.png");

    const BuildRequest byWeek = parsed({ "--by-week", "100", "-o", "OUT" });
    EXPECT_EQ(byWeek.mode, PeriodMode::ByWeek);
    EXPECT_EQ(byWeek.weeks, 100);

    // Two-digit years stand for this century, as the main window reads them.
    const BuildRequest byMonth = parsed({ "--by-month", "13", "0023", "-o", "OUT" });
    EXPECT_EQ(byMonth.mode, PeriodMode::ByMonth);
    EXPECT_EQ(byMonth.firstYear, 2013);
    EXPECT_EQ(byMonth.lastYear, 2023);
}

TEST_F(CommandLineTest, HelpWinsOverEverythingElse)
{
    EXPECT_TRUE(parseCommandLine({ "--by-week", "0", "--help" }, kThisYear).helpWanted);
    const std::string help = usageText();
    for (const char* mentioned : { "--company", "--by-year", "--by-month", "--by-week", "--items", "--picture", "-o",
             "--help", "Exit status", "TOTAL CASH RECEIPTS", "Cash Position (end of month)" }) {
        EXPECT_NE(help.find(mentioned), std::string::npos) << mentioned;
    }
}

TEST_F(CommandLineTest, RefusesWhatTheMainWindowWouldCorrectOrRefuse)
{
    struct Case {
        std::vector<std::string> args;
        std::string problem;
    };
    const Case cases[] = {
        { { "--by-year", "2015", "2013", "-o", "OUT" }, "--by-year: the first year 2015 is after the last year 2013." },
        { { "--by-year", "1990", "2095", "-o", "OUT" },
            "--by-year: the last year may be at most 100 years after the first, but 2095 is 105 years after 1990." },
        { { "--by-month", "2013", "2024", "-o", "OUT" },
            "--by-month: the last year may be at most 10 years after the first, but 2024 is 11 years after 2013." },
        { { "--by-year", "1969", "2013", "-o", "OUT" }, "--by-year: the year 1969 is before 1970." },
        { { "--by-month", "2013", "10000", "-o", "OUT" }, "--by-month: the year 10000 is after 9999." },
        { { "--by-year", "2013abc", "2014", "-o", "OUT" },
            "--by-year: \"2013abc\" is not a year (a whole number such as 2013)." },
        { { "--by-year", "", "2014", "-o", "OUT" }, "--by-year: \"\" is not a year (a whole number such as 2013)." },
        { { "--by-year", "-5", "2014", "-o", "OUT" },
            "--by-year: \"-5\" is not a year (a whole number such as 2013)." },
        { { "--by-week", "0", "-o", "OUT" }, "--by-week: \"0\" is not a number of weeks from 1 to 100." },
        { { "--by-week", "101", "-o", "OUT" }, "--by-week: \"101\" is not a number of weeks from 1 to 100." },
        { { "--by-week", "5.5", "-o", "OUT" }, "--by-week: \"5.5\" is not a number of weeks from 1 to 100." },
        { { "--by-week", "99999999999", "-o", "OUT" },
            "--by-week: \"99999999999\" is not a number of weeks from 1 to 100." },
        { { "--company", "\xC3\x28", "-o", "OUT" }, "--company: the name is not UTF-8 text." },
        { { "--company", std::string(32768, 'x'), "-o", "OUT" },
            "--company: the name is longer than a cell can hold." },
        { {}, "-o is missing: name the workbook to write, such as -o plan.xls." },
        { { "-o" }, "-o needs a value." },
        { { "-o", "OUT", "--by-year", "2013" }, "--by-year needs 2 values." },
        { { "-o", "OUT", "-o", "OUT" }, "-o is given twice." },
        { { "-o", "OUT", "--by-week", "3", "--by-year", "2013", "2014" },
            "choose one of --by-year, --by-month and --by-week, not --by-week and --by-year." },
        { { "-o", "OUT", "--verbose" }, "unknown option \"--verbose\"." },
        { { "-o", "OUT", "extra.xls" }, "unexpected argument \"extra.xls\"." },
    };
    for (const Case& c : cases) {
        EXPECT_EQ(refusal(c.args), c.problem) << ::testing::PrintToString(c.args);
    }
}

TEST_F(CommandLineTest, RefusesOutputsThatCannotBeWritten)
{
    fs::create_directory(m_folder / "folder.xls");
    const std::string folder = m_folder.path().string();
    struct Case {
        std::vector<std::string> args;
        std::string problem;
    };
    const Case cases[] = {
        { { "-o", folder + "/missing/plan.xls" },
            "-o \"" + folder + "/missing/plan.xls\": the folder \"" + folder + "/missing\" does not exist." },
        { { "-o", folder + "/folder.xls" }, "-o \"" + folder + "/folder.xls\": that is a folder." },
        { { "-o", folder + "/plan.xlsx" },
            "-o \"" + folder + "/plan.xlsx\": the name must end in .xls (an Excel 97-2003 workbook)." },
        { { "-o", ".xls" }, "-o \".xls\": the name must end in .xls (an Excel 97-2003 workbook)." },
        { { "-o", "OUT", "--picture", folder + "/plan.bmp" },
            "--picture \"" + folder + "/plan.bmp\": the name must end in .png (a PNG picture)." },
        { { "-o", "OUT", "--picture", folder + "/missing/plan.png" },
            "--picture \"" + folder + "/missing/plan.png\": the folder \"" + folder + "/missing\" does not exist." },
    };
    for (const Case& c : cases) {
        EXPECT_EQ(refusal(c.args), c.problem) << ::testing::PrintToString(c.args);
    }
    // Letter case does not matter, and a name without a folder goes to the current one.
    EXPECT_EQ(parsed({ "-o", folder + "/PLAN.XLS" }).output, m_folder / "PLAN.XLS");
    EXPECT_EQ(parsed({ "-o", "plan.xls" }).output, fs::path("plan.xls"));
}

TEST_F(CommandLineTest, ReadsTheItemsFileItNames)
{
    const fs::path missing = m_folder / "missing.txt";
    EXPECT_EQ(refusal({ "--items", missing.string(), "-o", "OUT" }),
        "--items \"" + missing.string() + "\": the file cannot be read: No such file or directory.");
    EXPECT_EQ(refusal({ "--items", m_folder.path().string(), "-o", "OUT" }),
        "--items \"" + m_folder.path().string() + "\": that is a folder, not a file.");
    const fs::path empty = m_folder / "empty.txt";
    std::ofstream(empty).flush();
    EXPECT_EQ(refusal({ "--items", empty.string(), "-o", "OUT" }),
        "--items \"" + empty.string()
            + "\": the system row \"Cash on Hand (beginning of month)\" is missing; it must be written exactly so.");
}

} // namespace
} // namespace penmoor
