#include "tests/report/sheetbuild.h"
#include "tests/report/sheetdump.h"

#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <functional>
#include <sstream>

#include <gtest/gtest.h>

namespace penmoor::test {
namespace {

// Each whole sheet is compared with a checked-in text dump; PENMOOR_REWRITE_GOLDEN=1 writes the
// dumps anew, and the review reads their diff.
struct GoldenCase {
    const char* name;
    std::function<void(SheetBuild&)> setUp;

    friend void PrintTo(const GoldenCase& golden, std::ostream* out) { *out << golden.name; }
};

std::string readFile(const std::filesystem::path& path)
{
    std::ifstream in(path, std::ios::binary);
    std::ostringstream text;
    text << in.rdbuf();
    return text.str();
}

class GoldenSheet : public ::testing::TestWithParam<GoldenCase> { };

TEST_P(GoldenSheet, MatchesItsDump)
{
    SheetBuild sheet;
    GetParam().setUp(sheet);
    sheet.build();
    const std::string dump = dumpActiveSheet(*sheet.app);

    const std::filesystem::path golden
        = std::filesystem::path(PENMOOR_REPORT_GOLDEN_DIR) / (std::string(GetParam().name) + ".txt");
    const char* rewrite = std::getenv("PENMOOR_REWRITE_GOLDEN");
    if (rewrite && std::string(rewrite) == "1") {
        std::filesystem::create_directories(golden.parent_path());
        std::ofstream out(golden, std::ios::binary);
        out << dump;
        ASSERT_TRUE(out.flush()) << "cannot write " << golden;
        GTEST_SKIP() << "rewrote " << golden.filename();
    }
    ASSERT_TRUE(std::filesystem::exists(golden)) << "no dump " << golden << "; run with PENMOOR_REWRITE_GOLDEN=1";
    EXPECT_EQ(dump, readFile(golden)) << "the sheet differs from " << golden.filename();
}

INSTANTIATE_TEST_SUITE_P(Builder, GoldenSheet,
    ::testing::Values(
        // The default list over the twelve months of one year: L is P.
        GoldenCase { "month_one_year",
            [](SheetBuild& s) {
                s.byMonth("2031", "2031");
                s.company("Penrose Bakery");
            } },
        // Five years put the row-2 label into H2, over the company name: L is I.
        GoldenCase { "year_five_years",
            [](SheetBuild& s) {
                s.byYear("2020", "2024");
                s.company("Penrose Bakery");
            } },
        // One week: D is the only period, E the total column.
        GoldenCase { "week_one_week", [](SheetBuild& s) { s.byWeek("1"); } },
        // An edited list over one year: a receipt line inserted, an expense line and the receipts
        // heading deleted, labels that look like formulas, numbers and dates, underscored names,
        // a company name that looks like a percentage.
        GoldenCase { "year_edited_list",
            [](SheetBuild& s) {
                s.byYear("2031", "2031");
                s.company("10%");
                s.options.InsertItem("Grants", 5);
                s.options.DeleteItem(21); // Rent
                s.options.DeleteItem(2); // CASH RECEIPTS
                s.options.InsertItem("=1+1", 8);
                s.options.InsertItem("1-2", 9);
                s.options.InsertItem("2013", 10);
                s.options.InsertItem("1/1/2013", 11);
                s.options.InsertItem("_", 12);
                s.options.InsertItem("_X", 13);
            } }),
    [](const ::testing::TestParamInfo<GoldenCase>& param) { return std::string(param.param.name); });

} // namespace
} // namespace penmoor::test
