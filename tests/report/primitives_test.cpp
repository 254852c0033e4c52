#include "automation/contract/error.h"
#include "report/columnletters.h"
#include "report/itemreferences.h"
#include "report/itemrows.h"
#include "report/periodcolumns.h"
#include "report/totalformula.h"
#include "tests/report/buildharness.h"

#include <string>
#include <vector>

#include <gtest/gtest.h>

namespace penmoor::test {
namespace {

std::vector<int> offsetsFrom(int first, int last)
{
    std::vector<int> offsets;
    for (int offset = first; offset <= last; ++offset) {
        offsets.push_back(offset);
    }
    return offsets;
}

TEST(ColumnLetters, FollowsTheSheetsLettersUpToZZAndHasNoneBeyond)
{
    const std::vector<std::pair<int, std::string>> cases = {
        { 1, "A" },
        { 26, "Z" },
        { 27, "AA" },
        { 52, "AZ" },
        { 53, "BA" },
        { 136, "EF" },
        { 256, "IV" },
        { 676, "YZ" },
        { 677, "ZA" },
        { 702, "ZZ" },
        // No letters: any address made from them is malformed, so the application rejects it.
        { 703, "" },
        { 0, "" },
    };
    for (const auto& [column, letters] : cases) {
        EXPECT_EQ(ColumnLetters(column), letters) << "column " << column;
    }
}

TEST(PeriodSettings, TotalColumnOfEachModeFromTheMainWindowsBoxes)
{
    struct Case {
        const char* what;
        void (*set)(BuildHarness&);
        int lastColumn;
    };
    const std::vector<Case> cases = {
        { "one year", [](BuildHarness& h) { h.byYear("2031", "2031"); }, 5 },
        { "five years", [](BuildHarness& h) { h.byYear("2020", "2024"); }, 9 },
        { "years rounded half to even: 2020 to 2024", [](BuildHarness& h) { h.byYear("2020.5", "2023.5"); }, 9 },
        { "years that do not begin with a number count as 0", [](BuildHarness& h) { h.byYear("x", "3"); }, 8 },
        { "one month's year", [](BuildHarness& h) { h.byMonth("2031", "2031"); }, 16 },
        { "ten years of months", [](BuildHarness& h) { h.byMonth("2020", "2030"); }, 136 },
        { "half a year of months", [](BuildHarness& h) { h.byMonth("2031", "2031.5"); }, 22 },
        // 0 to 2013 would be 24172 columns: beyond every column with letters.
        { "an empty first year of months", [](BuildHarness& h) { h.byMonth("", "2013"); }, 703 },
        { "one week", [](BuildHarness& h) { h.byWeek("1"); }, 5 },
        { "a hundred weeks", [](BuildHarness& h) { h.byWeek("100"); }, 104 },
        { "weeks far beyond the sheet", [](BuildHarness& h) { h.byWeek("99999999999"); }, 703 },
        { "last year far before the first", [](BuildHarness& h) { h.byYear("2031", "-99999999999"); }, 0 },
    };
    for (const Case& c : cases) {
        BuildHarness harness;
        c.set(harness);
        EXPECT_EQ(PeriodSettings::read(harness.view).lastColumn(), c.lastColumn) << c.what;
    }
}

TEST(ItemReferences, CountRowsAsTheBuilderNumberedThem)
{
    BuildHarness harness;
    // 44 items and a spacer above each of the three headings.
    ASSERT_EQ(numberItemRows(harness.options), 47);
    EXPECT_EQ(harness.options.item(1).sheetRow, 5);
    EXPECT_EQ(harness.options.item(2).sheetRow, 7); // a heading, below its spacer
    EXPECT_EQ(harness.options.item(44).sheetRow, 51);

    EXPECT_EQ(RowOffset(harness.options, 3, 6), -3);
    EXPECT_EQ(RelativeRef(harness.options, 3, 6, 0), "R[-3]C[0]");
    EXPECT_EQ(RelativeRef(harness.options, 37, 1, -1), "R[38]C[-1]");
    EXPECT_EQ(RelativeRef(harness.options, 7, 7, 0), "R[0]C[0]");
    EXPECT_THROW(RowOffset(harness.options, 0, 1), xl::Error);
    EXPECT_THROW(RelativeRef(harness.options, 1, 45, 0), xl::Error);
}

TEST(TotalFormula, ChainOfSingleReferencesWhileItFitsTheFormatsLimit)
{
    EXPECT_EQ(totalFormula(Combination::Sum, std::vector { -7, -6, -5 }), "=R[-7]C[0]+R[-6]C[0]+R[-5]C[0]");
    EXPECT_EQ(totalFormula(Combination::Sum, std::vector { -1 }), "=R[-1]C[0]");
    EXPECT_EQ(totalFormula(Combination::Difference, std::vector { -24, -2 }), "=R[-24]C[0]-R[-2]C[0]");
    EXPECT_EQ(totalFormula(Combination::Difference, std::vector { 3 }), "=R[3]C[0]");

    // Exactly 1,024 characters still make the plain chain; one more folds.
    const std::string longest = totalFormula(Combination::Sum, offsetsFrom(-177, -92));
    EXPECT_EQ(longest.size(), 1024u);
    EXPECT_EQ(longest.substr(0, 24), "=R[-177]C[0]+R[-176]C[0]");
    EXPECT_EQ(totalFormula(Combination::Sum, offsetsFrom(-178, -93)), "=SUM(R[-178]C[0]:R[-93]C[0])");
}

TEST(TotalFormula, FoldsRunsOfConsecutiveRowsBeyondTheLimit)
{
    struct Case {
        const char* what;
        Combination combination;
        std::vector<int> offsets;
        std::string formula;
    };
    std::vector<int> withGap = offsetsFrom(-980, -3);
    withGap.push_back(-1);
    std::vector<int> difference = { -1200 };
    const std::vector<int> paidOut = offsetsFrom(-1100, -2);
    difference.insert(difference.end(), paidOut.begin(), paidOut.end());
    std::vector<int> lonely(100, -50); // repeated rows never fold together
    lonely.push_back(-49);

    const std::vector<Case> cases = {
        { "one run and a single row", Combination::Sum, withGap, "=SUM(R[-980]C[0]:R[-3]C[0])+R[-1]C[0]" },
        { "a difference keeps its first term apart", Combination::Difference, difference,
            "=R[-1200]C[0]-SUM(R[-1100]C[0]:R[-2]C[0])" },
    };
    for (const Case& c : cases) {
        EXPECT_EQ(totalFormula(c.combination, c.offsets), c.formula) << c.what;
    }

    const std::string repeated = totalFormula(Combination::Sum, lonely);
    EXPECT_TRUE(repeated.ends_with("C[0]+R[-50]C[0]+SUM(R[-50]C[0]:R[-49]C[0])")) << repeated;
    EXPECT_EQ(repeated.size(), 1 + 99 * 11 + 26u);
}

} // namespace
} // namespace penmoor::test
