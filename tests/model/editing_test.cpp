#include "model/itemrules.h"
#include "tests/model/modelfixture.h"

#include <algorithm>
#include <cctype>
#include <functional>
#include <stdexcept>

#include <gtest/gtest.h>

namespace penmoor::test {
namespace {

struct Derived {
    int position;
    std::string name;
    TotalKind kind;
    std::string linkage;
    bool section;
};

// Every item not listed must carry no linkage, no total kind and no section flag.
void expectDerived(const Options& options, const std::vector<Derived>& special)
{
    for (int position = 1; position <= options.count(); ++position) {
        const TemplateItem& item = options.item(position);
        SCOPED_TRACE("position " + std::to_string(position) + " " + item.name);
        const auto expected
            = std::find_if(special.begin(), special.end(), [&](const Derived& d) { return d.position == position; });
        if (expected == special.end()) {
            EXPECT_EQ(item.linkage, "");
            EXPECT_EQ(item.totalKind, TotalKind::None);
            EXPECT_FALSE(item.section);
        } else {
            EXPECT_EQ(item.name, expected->name);
            EXPECT_EQ(item.totalKind, expected->kind);
            EXPECT_EQ(item.linkage, expected->linkage);
            EXPECT_EQ(item.section, expected->section);
        }
    }
}

TEST(DerivedFields, DefaultListCombinesEachLineOnce)
{
    ModelHarness model;
    model.options.LoadOptions(LoadMode::FromStore);
    ASSERT_EQ(model.options.count(), 44);
    expectDerived(model.options,
        {
            { 1, "Cash on Hand (beginning of month)", TotalKind::Other, "37", false },
            { 2, "CASH RECEIPTS", TotalKind::None, "", true },
            { 6, "TOTAL CASH RECEIPTS", TotalKind::Sum, "3,4,5", false },
            // Opening cash plus the receipts total; the receipt lines are not added twice.
            { 7, "Total Cash Available (before cash out)", TotalKind::Sum, "1,6", false },
            { 8, "CASH PAID OUT", TotalKind::None, "", true },
            { 30, "SUBTOTAL", TotalKind::Sum, positionRun(9, 29), false },
            { 36, "TOTAL CASH PAID OUT", TotalKind::Sum, "30,31,32,33,34,35", false },
            { 37, "Cash Position (end of month)", TotalKind::Dif, "7,36", false },
            { 38, "ESSENTIAL OPERATING DATA (non cash flow information)", TotalKind::None, "", true },
        });
}

struct EditCase {
    const char* description;
    std::function<void(Options&)> edit;
    int expectedCount;
    int expectedSelection;
    // position, name, linkage
    std::vector<std::tuple<int, std::string, std::string>> expectedItems;
};

class Editing : public testing::TestWithParam<EditCase> { };

TEST_P(Editing, KeepsTotalsHeadingsAndSelectionRight)
{
    const EditCase& edit = GetParam();
    ModelHarness model;
    model.options.LoadOptions(LoadMode::FromStore);
    edit.edit(model.options);

    EXPECT_EQ(model.options.count(), edit.expectedCount);
    EXPECT_EQ(model.view.listEntries(), model.names());
    EXPECT_EQ(model.view.selectedListIndex(), edit.expectedSelection);
    for (const auto& [position, name, linkage] : edit.expectedItems) {
        SCOPED_TRACE(name);
        EXPECT_EQ(model.options.item(position).name, name);
        EXPECT_EQ(model.options.item(position).linkage, linkage);
    }
}

INSTANTIATE_TEST_SUITE_P(ItemList, Editing,
    testing::Values(
        EditCase { "insert below a receipt line joins the receipts", [](Options& o) { o.InsertItem("Grants", 5); }, 45,
            5,
            { { 6, "Grants", "" }, { 7, "TOTAL CASH RECEIPTS", "3,4,5,6" },
                { 8, "Total Cash Available (before cash out)", "1,7" }, { 38, "Cash Position (end of month)", "8,37" },
                { 1, "Cash on Hand (beginning of month)", "38" } } },
        EditCase { "insert directly below the receipts total joins the cash available",
            [](Options& o) { o.InsertItem("Owner top-up", 6); }, 45, 6,
            { { 7, "Owner top-up", "" }, { 8, "Total Cash Available (before cash out)", "1,6,7" } } },
        EditCase { "insert above the expenses start belongs to no range", [](Options& o) { o.InsertItem("Note", 8); },
            45, 8,
            { { 9, "Note", "" }, { 10, "Purchases (merchandise)", "" }, { 31, "SUBTOTAL", positionRun(10, 30) } } },
        EditCase { "insert at the start belongs to no range", [](Options& o) { o.InsertItem("Memo line", 0); }, 45, 0,
            { { 1, "Memo line", "" }, { 2, "Cash on Hand (beginning of month)", "38" },
                { 7, "TOTAL CASH RECEIPTS", "4,5,6" }, { 8, "Total Cash Available (before cash out)", "2,7" } } },
        EditCase { "insert below the last item appends it", [](Options& o) { o.InsertItem("Loan balance", 44); }, 45,
            44, { { 45, "Loan balance", "" }, { 37, "Cash Position (end of month)", "7,36" } } },
        EditCase { "delete an expense line", [](Options& o) { o.DeleteItem(20); }, 43, 19,
            { { 20, "Telephone", "" }, { 29, "SUBTOTAL", positionRun(9, 28) },
                { 35, "TOTAL CASH PAID OUT", "29,30,31,32,33,34" }, { 36, "Cash Position (end of month)", "7,35" } } },
        EditCase { "delete the last item selects the new last", [](Options& o) { o.DeleteItem(44); }, 43, 42,
            { { 43, "Accounts Payable (end of month)", "" } } },
        EditCase { "delete the first item",
            [](Options& o) {
                o.InsertItem("Memo line", 0);
                o.DeleteItem(1);
            },
            44, 0,
            { { 1, "Cash on Hand (beginning of month)", "37" },
                { 7, "Total Cash Available (before cash out)", "1,6" } } },
        EditCase { "delete a heading", [](Options& o) { o.DeleteItem(2); }, 43, 1,
            { { 2, "Cash Sales", "" }, { 5, "TOTAL CASH RECEIPTS", "2,3,4" },
                { 6, "Total Cash Available (before cash out)", "1,5" } } },
        EditCase { "rename in the middle keeps the item in its ranges",
            [](Options& o) { o.RenameItem("Office rent", 20); }, 44, 19,
            { { 20, "Office rent", "" }, { 30, "SUBTOTAL", positionRun(9, 29) } } },
        EditCase { "rename the first and the last item",
            [](Options& o) {
                o.InsertItem("Memo line", 0);
                o.RenameItem("Memo", 1);
                o.RenameItem("Amortisation", 45);
            },
            45, 44, { { 1, "Memo", "" }, { 45, "Amortisation", "" } } }),
    [](const testing::TestParamInfo<EditCase>& param) {
        std::string name = param.param.description;
        std::replace_if(
            name.begin(), name.end(), [](char c) { return !std::isalnum(static_cast<unsigned char>(c)); }, '_');
        return name;
    });

TEST(DerivedFields, SectionFlagFollowsTheHeadingName)
{
    ModelHarness model;
    model.options.LoadOptions(LoadMode::FromStore);

    model.options.RenameItem("Payments", 8);
    EXPECT_FALSE(model.options.item(8).section);

    model.options.RenameItem("CASH PAID OUT", 20);
    EXPECT_TRUE(model.options.item(20).section);
    // Headings compare exactly: the "&" rule does not apply to them.
    model.options.RenameItem("CASH &RECEIPTS", 2);
    EXPECT_FALSE(model.options.item(2).section);
}

TEST(NameMatching, IgnoresOnlyTheFirstAmpersandAndKeepsCase)
{
    ModelHarness model;
    model.options.LoadOptions(LoadMode::FromStore);
    model.options.InsertItem("R&D", 44);

    EXPECT_EQ(model.options.FindItemRow("R&D"), 45);
    EXPECT_EQ(model.options.FindItemRow("RD"), 45);
    EXPECT_EQ(model.options.FindItemRow("&RD"), 45);
    EXPECT_EQ(model.options.FindItemRow("R&&D"), 0);
    EXPECT_EQ(model.options.FindItemRow("rd"), 0);
    EXPECT_EQ(model.options.FindItemRow("Repairs  maintenance"), 16);
    EXPECT_EQ(model.options.FindItemRow("Repairs & maintenance "), 0);
    EXPECT_EQ(model.options.FindItemRow(""), 0);

    EXPECT_TRUE(IsSystemItem("Cash Sales"));
    EXPECT_TRUE(IsSystemItem("Cash &Sales"));
    EXPECT_TRUE(IsSystemItem("&SUBTOTAL"));
    EXPECT_FALSE(IsSystemItem("&&SUBTOTAL"));
    EXPECT_FALSE(IsSystemItem("cash sales"));
    EXPECT_FALSE(IsSystemItem("CASH RECEIPTS"));
}

TEST(NameMatching, LastMatchWinsAndRulesUseEveryMatch)
{
    // Lists written from outside the program may repeat names.
    ModelHarness model;
    std::vector<std::string> names(kExpectedDefaultNames.begin(), kExpectedDefaultNames.end());
    names.push_back("Rent");
    names.push_back("Cash Position (end of month)");
    storeList(model.store, names);
    model.options.LoadOptions(LoadMode::FromStore);

    EXPECT_EQ(model.options.FindItemRow("Rent"), 45);
    EXPECT_EQ(model.options.item(1).linkage, "37,46");
    // Each position of a range is taken once, however often its name occurs.
    EXPECT_EQ(model.options.item(30).linkage, positionRun(9, 29));
}

TEST(DerivedFields, RulesWhoseItemsAreMissingLeaveThemOut)
{
    // Only a list written from outside can lack system rows.
    ModelHarness model;
    storeList(model.store,
        { "Cash on Hand (beginning of month)", "Cash Sales", "Total Cash Available (before cash out)",
            "Cash Position (end of month)" });
    model.options.LoadOptions(LoadMode::FromStore);

    EXPECT_EQ(model.options.item(3).linkage, "1");
    EXPECT_EQ(model.options.item(4).linkage, "3");
    EXPECT_EQ(model.options.ItemLinks("TOTAL CASH RECEIPTS"), "");
    EXPECT_EQ(model.options.ItemLinks("SUBTOTAL"), "");
}

TEST(TakeListMarks, OnlyTheSelectedEntryIsIncluded)
{
    ModelHarness model;
    model.options.LoadOptions(LoadMode::FromStore);
    model.view.setSelectedListIndex(4);
    model.options.TakeListMarks();
    for (int position = 1; position <= model.options.count(); ++position) {
        EXPECT_EQ(model.options.item(position).included, position == 5) << position;
    }

    model.options.InsertItem("Grants", 40);
    EXPECT_TRUE(model.options.item(41).included);
    EXPECT_EQ(model.view.selectedListIndex(), 40);
}

TEST(Editing, RefusesPositionsOutsideTheListWithoutChangingIt)
{
    ModelHarness model;
    model.options.LoadOptions(LoadMode::FromStore);
    model.view.setSelectedListIndex(3);

    EXPECT_THROW(model.options.InsertItem("Grants", -1), std::out_of_range);
    EXPECT_THROW(model.options.InsertItem("Grants", 45), std::out_of_range);
    EXPECT_THROW(model.options.RenameItem("Grants", 0), std::out_of_range);
    EXPECT_THROW(model.options.DeleteItem(45), std::out_of_range);
    EXPECT_THROW((void)model.options.item(0), std::out_of_range);

    EXPECT_EQ(model.names(), std::vector<std::string>(kExpectedDefaultNames.begin(), kExpectedDefaultNames.end()));
    EXPECT_EQ(model.view.selectedListIndex(), 3);
}

TEST(Editing, AFullListRefusesAnInsertionAndStaysIntact)
{
    ModelHarness model;
    std::vector<std::string> names(kExpectedDefaultNames.begin(), kExpectedDefaultNames.end());
    for (int i = static_cast<int>(names.size()); i < kMaximumItemCount; ++i) {
        names.push_back("Line " + std::to_string(i));
    }
    storeList(model.store, names);
    model.options.LoadOptions(LoadMode::FromStore);
    ASSERT_EQ(model.options.count(), kMaximumItemCount);
    model.view.setSelectedListIndex(100);

    try {
        model.options.InsertItem("One too many", 100);
        FAIL() << "a full list took another item";
    } catch (const std::length_error& error) {
        EXPECT_NE(std::string(error.what()).find("full"), std::string::npos) << error.what();
    }
    EXPECT_EQ(model.options.count(), kMaximumItemCount);
    EXPECT_EQ(model.view.listEntryCount(), kMaximumItemCount);
    EXPECT_EQ(model.view.selectedListIndex(), 100);

    model.options.DeleteItem(kMaximumItemCount);
    model.options.InsertItem("Back to full", 0);
    EXPECT_EQ(model.options.count(), kMaximumItemCount);
    EXPECT_EQ(model.options.item(8).linkage, "2,7");
}

TEST(Editing, DeletingEveryItemLeavesNothingSelected)
{
    ModelHarness model;
    storeList(model.store, { "Only line" });
    model.options.LoadOptions(LoadMode::FromStore);
    model.options.DeleteItem(1);
    EXPECT_EQ(model.options.count(), 0);
    EXPECT_EQ(model.view.selectedListIndex(), -1);
    model.options.InsertItem("New first", 0);
    EXPECT_EQ(model.view.selectedListIndex(), 0);
}

} // namespace
} // namespace penmoor::test
