#include "tests/model/modelfixture.h"

#include <gtest/gtest.h>

namespace penmoor::test {
namespace {

std::vector<std::string> defaultNames()
{
    return { kExpectedDefaultNames.begin(), kExpectedDefaultNames.end() };
}

TEST(LoadOptions, FirstStartShowsTheDefaultsByMonth)
{
    ModelHarness model;
    model.options.LoadOptions(LoadMode::FromStore);

    EXPECT_EQ(model.names(), defaultNames());
    EXPECT_EQ(model.view.listEntries(), defaultNames());
    for (int position = 1; position <= 44; ++position) {
        EXPECT_TRUE(model.options.item(position).included) << position;
    }
    EXPECT_EQ(model.view.selectedListIndex(), 0);
    EXPECT_EQ(periodMode(model.view), PeriodMode::ByMonth);
    EXPECT_FALSE(model.view.isOptionOn(OptionButton::Option1));
    EXPECT_FALSE(model.view.isOptionOn(OptionButton::Option2));
    EXPECT_EQ(model.view.text(TextBox::Text2), "2031");
    EXPECT_EQ(model.view.text(TextBox::Text3), "2031");
    EXPECT_EQ(model.view.text(TextBox::Text4), "5");
    EXPECT_EQ(model.view.text(TextBox::Text1), "");
    EXPECT_TRUE(model.store.entries().empty()) << "loading writes nothing";
}

TEST(LoadOptions, ReadsAStoredListWithItsFlags)
{
    ModelHarness model;
    std::vector<std::string> names = defaultNames();
    names.insert(names.begin() + 5, "Grants");
    names.push_back("  Loan balance");
    storeList(model.store, names);
    model.store.write("Rent", "False");
    model.store.write("Grants", "false");
    model.store.write("Telephone", "0");
    model.store.write("Utilities", "maybe");

    model.options.LoadOptions(LoadMode::FromStore);
    EXPECT_EQ(model.names(), names);
    EXPECT_FALSE(model.options.item(model.options.FindItemRow("Rent")).included);
    EXPECT_FALSE(model.options.item(6).included);
    EXPECT_FALSE(model.options.item(model.options.FindItemRow("Telephone")).included);
    EXPECT_TRUE(model.options.item(model.options.FindItemRow("Utilities")).included);
    EXPECT_TRUE(model.options.item(46).included) << "no flag stored";
    EXPECT_EQ(model.options.item(8).linkage, "1,7");
    EXPECT_EQ(model.view.selectedListIndex(), 0);
}

TEST(LoadOptions, MissingFieldKeysGiveEmptyNames)
{
    ModelHarness model;
    model.store.write("System Value - Rows", "3");
    model.store.write("System Value - Saved", "True");
    model.store.write("Field2", "Middle");
    model.options.LoadOptions(LoadMode::FromStore);
    EXPECT_EQ(model.names(), (std::vector<std::string> { "", "Middle", "" }));
}

TEST(LoadOptions, ASavedListIsUsedOnlyWhenMarkedSaved)
{
    ModelHarness model;
    storeList(model.store, { "Only line" });
    model.store.write("System Value - Saved", "False");
    model.options.LoadOptions(LoadMode::FromStore);
    EXPECT_EQ(model.names(), defaultNames());
}

// Row counts that the program never writes: the stored list is not used.
class UnusableRowCount : public testing::TestWithParam<const char*> { };

TEST_P(UnusableRowCount, LoadsTheDefaultList)
{
    ModelHarness model;
    storeList(model.store, { "Only line" });
    model.store.write("System Value - Rows", GetParam());
    model.options.LoadOptions(LoadMode::FromStore);
    EXPECT_EQ(model.names(), defaultNames());
    EXPECT_EQ(model.view.selectedListIndex(), 0);
}

INSTANTIATE_TEST_SUITE_P(LoadOptions, UnusableRowCount,
    testing::Values("", "abc", "0", "-3", "1.5", "32769", "99999999999", "1e3", "1 line"));

TEST(LoadOptions, TheLargestStoredListLoadsWithoutFieldKeys)
{
    // 32,768 empty names: every one matches every other, which must stay cheap.
    ModelHarness model;
    model.store.write("System Value - Rows", "32768");
    model.store.write("System Value - Saved", "1");
    model.store.write("Field32768", "TOTAL CASH RECEIPTS");
    model.store.write("Field1", "Cash Sales");
    model.options.LoadOptions(LoadMode::FromStore);
    ASSERT_EQ(model.options.count(), 32768);
    EXPECT_EQ(model.options.item(32768).linkage, positionRun(1, 32767));
    EXPECT_EQ(model.options.FindItemRow(""), 32767);
}

struct StoredBoxesCase {
    const char* year;
    const char* weeks;
    const char* expectedYear;
    const char* expectedWeeks;
};

class StoredBoxes : public testing::TestWithParam<StoredBoxesCase> { };

TEST_P(StoredBoxes, ShowTheLeadingNumberOfWhatWasStored)
{
    ModelHarness model;
    model.store.write("Year", GetParam().year);
    model.store.write("Year1", GetParam().year);
    model.store.write("Weeks", GetParam().weeks);
    model.options.LoadOptions(LoadMode::FromStore);
    EXPECT_EQ(model.view.text(TextBox::Text2), GetParam().expectedYear);
    EXPECT_EQ(model.view.text(TextBox::Text3), GetParam().expectedYear);
    EXPECT_EQ(model.view.text(TextBox::Text4), GetParam().expectedWeeks);
}

INSTANTIATE_TEST_SUITE_P(LoadOptions, StoredBoxes,
    testing::Values(StoredBoxesCase { "2013", "12", "2013", "12" }, StoredBoxesCase { "", "", "0", "0" },
        StoredBoxesCase { "2013a", "7 weeks", "2013", "7" }, StoredBoxesCase { " 2013.5", "6.50", "2013.5", "6.5" },
        StoredBoxesCase { "-0", "+3", "0", "3" }, StoredBoxesCase { "abc", "x5", "0", "0" }));

struct StoredModeCase {
    const char* isYear; // nullptr: absent
    const char* isMonth;
    PeriodMode expected;
};

class StoredMode : public testing::TestWithParam<StoredModeCase> { };

TEST_P(StoredMode, TurnsOnExactlyOneOption)
{
    ModelHarness model;
    if (GetParam().isYear) {
        model.store.write("IsYear", GetParam().isYear);
    }
    if (GetParam().isMonth) {
        model.store.write("IsMonth", GetParam().isMonth);
    }
    model.options.LoadOptions(LoadMode::FromStore);
    EXPECT_EQ(periodMode(model.view), GetParam().expected);
    const int on = model.view.isOptionOn(OptionButton::Option1) + model.view.isOptionOn(OptionButton::Option2)
        + model.view.isOptionOn(OptionButton::Option3);
    EXPECT_EQ(on, 1);
}

INSTANTIATE_TEST_SUITE_P(LoadOptions, StoredMode,
    testing::Values(StoredModeCase { "True", "False", PeriodMode::ByYear },
        StoredModeCase { "False", "False", PeriodMode::ByWeek }, StoredModeCase { "True", "True", PeriodMode::ByMonth },
        StoredModeCase { nullptr, nullptr, PeriodMode::ByMonth }, StoredModeCase { "1", "0", PeriodMode::ByYear },
        StoredModeCase { "TRUE", "false", PeriodMode::ByYear }, StoredModeCase { "0", "yes", PeriodMode::ByMonth },
        StoredModeCase { "", "", PeriodMode::ByMonth }));

TEST(LoadOptions, RestoreBringsBackTheDefaultsAndLeavesTheStoreAlone)
{
    ModelHarness model;
    std::vector<std::string> names = defaultNames();
    names.erase(names.begin() + 19);
    storeList(model.store, names);
    model.store.write("Rent", "False");
    model.store.write("Telephone", "False");
    model.store.write("IsYear", "True");
    model.store.write("IsMonth", "False");
    model.store.write("Year", "1999");
    model.store.write("Company", "Acme");
    model.options.LoadOptions(LoadMode::FromStore);
    model.options.InsertItem("Grants", 3);
    model.view.setText(TextBox::Text4, "17");
    const auto storedBefore = model.store.entries();

    model.options.LoadOptions(LoadMode::RestoreDefaults);
    EXPECT_EQ(model.names(), defaultNames());
    for (int position = 1; position <= 44; ++position) {
        EXPECT_TRUE(model.options.item(position).included) << position;
    }
    EXPECT_EQ(model.view.listEntries(), defaultNames());
    EXPECT_EQ(model.view.selectedListIndex(), 0);
    EXPECT_EQ(model.options.item(7).linkage, "1,6");
    EXPECT_EQ(periodMode(model.view), PeriodMode::ByMonth);
    EXPECT_EQ(model.view.text(TextBox::Text2), "2031");
    EXPECT_EQ(model.view.text(TextBox::Text3), "2031");
    EXPECT_EQ(model.view.text(TextBox::Text4), "5");
    EXPECT_EQ(model.view.text(TextBox::Text1), "");
    EXPECT_EQ(model.store.entries(), storedBefore);
}

} // namespace
} // namespace penmoor::test
