#include "model/windowsettings.h"
#include "tests/model/modelfixture.h"

#include <map>
#include <stdexcept>

#include <gtest/gtest.h>

namespace penmoor::test {
namespace {

using StoredEntries = std::map<std::string, std::string, std::less<>>;

TEST(CloseSequence, FirstRunThenCloseStoresListAndOptions)
{
    ModelHarness model;
    model.options.LoadOptions(LoadMode::FromStore);
    model.options.SaveOptions();

    StoredEntries expected = {
        { "System Value - Saved", "True" },
        { "System Value - Rows", "44" },
        { "System Value - Columns", "7" },
        { "Company", "" },
        { "Year", "2031" },
        { "Year1", "2031" },
        { "Weeks", "5" },
        { "IsYear", "False" },
        { "IsMonth", "True" },
    };
    for (std::size_t i = 0; i < kExpectedDefaultNames.size(); ++i) {
        expected["Field" + std::to_string(i + 1)] = kExpectedDefaultNames[i];
        // Only the entry selected at start, the first, is marked.
        expected[kExpectedDefaultNames[i]] = i == 0 ? "True" : "False";
    }
    EXPECT_EQ(model.store.entries(), expected);
}

TEST(CloseSequence, RestartShowsWhatWasClosed)
{
    ModelHarness first;
    first.options.LoadOptions(LoadMode::FromStore);
    first.options.InsertItem("Grants", 5);
    first.options.RenameItem("Office rent", first.options.FindItemRow("Rent"));
    first.view.setText(TextBox::Text1, "Harlenby & Co");
    first.view.setText(TextBox::Text2, "2015");
    first.view.setText(TextBox::Text3, "2018abc");
    first.view.setText(TextBox::Text4, "");
    first.view.setOptionOn(OptionButton::Option1, true);
    first.options.SaveOptions();

    ModelHarness second;
    second.store = first.store;
    second.options.LoadOptions(LoadMode::FromStore);
    EXPECT_EQ(second.names(), first.names());
    EXPECT_EQ(second.view.listEntries(), first.view.listEntries());
    EXPECT_EQ(second.view.selectedListIndex(), 0);
    EXPECT_EQ(second.options.item(8).linkage, "1,7");
    EXPECT_FALSE(second.options.item(6).included) << "Grants was not the selected entry";
    EXPECT_EQ(second.view.text(TextBox::Text1), "Harlenby & Co");
    EXPECT_EQ(second.view.text(TextBox::Text2), "2015");
    EXPECT_EQ(second.view.text(TextBox::Text3), "2018");
    EXPECT_EQ(second.view.text(TextBox::Text4), "0");
    EXPECT_EQ(periodMode(second.view), PeriodMode::ByYear);
}

TEST(CloseSequence, ByWeekIsStoredAsNeitherYearNorMonth)
{
    ModelHarness first;
    first.options.LoadOptions(LoadMode::FromStore);
    first.view.setOptionOn(OptionButton::Option2, true);
    first.options.SaveOptions();
    EXPECT_EQ(first.store.read("IsYear", ""), "False");
    EXPECT_EQ(first.store.read("IsMonth", ""), "False"); // read back as By Week: see StoredMode
}

TEST(CloseSequence, KeysOfDeletedItemsStay)
{
    ModelHarness model;
    model.options.LoadOptions(LoadMode::FromStore);
    model.options.SaveOptions();
    model.view.setSelectedListIndex(19);
    model.options.SaveOptions(); // "Rent" now stored as the selected entry
    model.options.DeleteItem(20);
    model.options.SaveOptions();

    EXPECT_EQ(model.store.read("System Value - Rows", ""), "43");
    EXPECT_EQ(model.store.read("Field20", ""), "Telephone");
    EXPECT_EQ(model.store.read("Field43", ""), "Depreciation");
    EXPECT_EQ(model.store.read("Field44", ""), "Depreciation") << "the old last position keeps its text";
    EXPECT_EQ(model.store.read("Rent", ""), "True");
}

TEST(CloseSequence, ItemsNamedLikeProgramKeysDoNotOverwriteThem)
{
    ModelHarness first;
    first.store.write("Text6", "2014");
    first.store.write("ShowAgain", "1");
    first.options.LoadOptions(LoadMode::FromStore);
    for (const char* name : { "Text6", "ShowAgain", "Company", "Field3", "System Value - Saved" }) {
        first.options.InsertItem(name, first.options.count());
    }
    first.view.setText(TextBox::Text1, "Acme");
    first.options.SaveOptions();

    EXPECT_EQ(first.store.read("Text6", ""), "2014");
    EXPECT_EQ(first.store.read("ShowAgain", ""), "1");
    EXPECT_EQ(first.store.read("Company", ""), "Acme");
    EXPECT_EQ(first.store.read("Field3", ""), "Cash Sales");
    EXPECT_EQ(first.store.read("System Value - Saved", ""), "True");

    ModelHarness second;
    second.store = first.store;
    second.options.LoadOptions(LoadMode::FromStore);
    EXPECT_EQ(second.names(), first.names());
    for (int position = 45; position <= 49; ++position) {
        EXPECT_TRUE(second.options.item(position).included) << second.options.item(position).name;
    }
}

TEST(CloseSequence, ReportsAStoreThatCannotBeSaved)
{
    struct FailingStore final : SettingsStore {
        std::string read(const std::string&, const std::string& fallback) const override { return fallback; }
        void write(const std::string&, const std::string&) override { }
        void sync() override { throw SettingsError("The settings could not be saved to test.ini"); }
    } store;
    MemoryWindowView view;
    Options options(store, view, [] { return kTestYear; });
    options.LoadOptions(LoadMode::FromStore);
    EXPECT_THROW(options.SaveOptions(), SettingsError);
}

TEST(WindowSettings, StartUpReadsTheControlsOwnKeys)
{
    MemorySettingsStore store;
    MemoryWindowView view;
    LoadWindowSettings(store, view, kTestYear);
    EXPECT_EQ(view.text(TextBox::Text1), "");
    EXPECT_EQ(view.text(TextBox::Text4), "5");
    for (const TextBox box : { TextBox::Text2, TextBox::Text3, TextBox::Text6, TextBox::Text7 }) {
        EXPECT_EQ(view.text(box), "2031") << controlName(box);
    }
    EXPECT_EQ(periodMode(view), PeriodMode::ByMonth);

    store.write("Text6", "2013x");
    store.write("Text1", "Acme");
    store.write("Option3", "True");
    store.write("Option1", "1");
    LoadWindowSettings(store, view, kTestYear);
    EXPECT_EQ(view.text(TextBox::Text6), "2013x") << "texts as stored";
    EXPECT_EQ(view.text(TextBox::Text1), "Acme");
    EXPECT_EQ(periodMode(view), PeriodMode::ByYear) << "Option1 is read last";
}

TEST(WindowSettings, HandlersStoreUnderTheControlsNames)
{
    MemorySettingsStore store;
    MemoryWindowView view;
    view.setOptionOn(OptionButton::Option2, true);
    StoreOptionStates(store, view);
    StoreBoxText(store, TextBox::Text7, "");
    StoreBoxText(store, TextBox::Text4, "12");
    EXPECT_EQ(store.entries(),
        (StoredEntries { { "Option1", "False" }, { "Option2", "True" }, { "Option3", "False" }, { "Text4", "12" },
            { "Text7", "" } }));
    EXPECT_THROW(StoreBoxText(store, TextBox::Text1, "Acme"), std::invalid_argument);
}

} // namespace
} // namespace penmoor::test
