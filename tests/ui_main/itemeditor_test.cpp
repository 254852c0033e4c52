#include "model/memorysettingsstore.h"
#include "model/options.h"
#include "shell/errorreport.h"
#include "tests/support/scripteddialogs.h"
#include "tests/ui_main/recordingwindow.h"
#include "ui/main/itemeditor.h"

#include <gtest/gtest.h>

namespace penmoor {
namespace {

const InputRequest kInsertPrompt { "Enter new row: ", "Input New Row", "" };
const InputRequest kRenamePrompt { "Rename selected row to: ", "Rename Selected Row", "" };
const MessageRequest kExists = MessageRequest::information("Such row exist already.");
const MessageRequest kRestoreQuestion = MessageRequest::question("Do you really want restore default settings ?");

MessageRequest deleteQuestion(const std::string& name)
{
    return MessageRequest::question("Do you really want delete this row ?\r\n(" + name + ")");
}

TEST(NameRules, BlankAnswersAreDroppedAndShortNamesCountLettersNotBytes)
{
    for (const std::string_view blank : { "", " ", "  \t ", "\t" }) {
        EXPECT_TRUE(isBlankAnswer(blank)) << "\"" << blank << "\"";
    }
    EXPECT_FALSE(isBlankAnswer(" a "));

    struct Case {
        std::string_view answer;
        bool tooShort;
    };
    for (const Case& c : std::initializer_list<Case> { { "ab", true }, { " a", true },
             { "\xC3\xA4\xC3\xB6", true }, // two letters in four bytes
             { "abc", false }, { " ab", false }, { "\xC3\xA4\xC3\xB6\xC3\xBC", false }, { "  a", false } }) {
        EXPECT_EQ(isTooShortName(c.answer), c.tooShort) << "\"" << c.answer << "\"";
    }
}

class EditorTest : public ::testing::Test {
protected:
    void SetUp() override
    {
        options.LoadOptions(LoadMode::FromStore);
        window.events.clear();
    }

    void select(std::string_view name)
    {
        const int position = options.FindItemRow(name);
        ASSERT_NE(position, 0) << name;
        window.setSelectedListIndex(position - 1);
        window.events.clear();
    }

    std::string selectedName() const
    {
        return window.entries().at(static_cast<std::size_t>(window.selectedListIndex()));
    }

    // The list changed exactly once, and only while the drawing was locked.
    void expectOneLockedChange() const
    {
        ASSERT_GE(window.events.size(), 3U);
        EXPECT_EQ(window.events.front(), "lock");
        EXPECT_EQ(window.events.back(), "unlock");
        for (std::size_t i = 1; i + 1 < window.events.size(); ++i) {
            EXPECT_NE(window.events[i].find("while locked"), std::string::npos) << window.events[i];
        }
        EXPECT_FALSE(window.locked());
    }

    void expectUntouched(int count) const
    {
        EXPECT_EQ(options.count(), count);
        EXPECT_TRUE(window.events.empty());
    }

    MemorySettingsStore store;
    testing::RecordingWindow window;
    Options options { store, window, [] { return 2031; } };
    testing::ScriptedDialogs dialogs;
    ItemEditor editor { options, window, window, dialogs };
};

TEST_F(EditorTest, BlankAnswersAndCancelChangeNothingAndSayNothing)
{
    select("Rent");
    for (const std::string blank : { "", "   ", " \t " }) {
        dialogs.expect(kInsertPrompt, blank);
        editor.PushButton2_Click(ItemEditor::InsertNewBelowSelected);
        dialogs.expect(kRenamePrompt, blank);
        editor.PushButton2_Click(ItemEditor::RenameSelected);
    }
    expectUntouched(44);
    EXPECT_EQ(selectedName(), "Rent");
}

TEST_F(EditorTest, InsertPutsTheNameAsTypedBelowTheSelectedItemAndSelectsIt)
{
    select("Loan or other cash injection");
    dialogs.expect(kInsertPrompt, " ab");
    editor.PushButton2_Click(ItemEditor::InsertNewBelowSelected);

    ASSERT_EQ(options.count(), 45);
    EXPECT_EQ(options.item(6).name, " ab");
    EXPECT_EQ(options.item(7).linkage, "3,4,5,6") << "the new line is a receipt of the total below it";
    EXPECT_EQ(window.selectedListIndex(), 5);
    expectOneLockedChange();
}

TEST_F(EditorTest, InsertBelowTheLastItemAppendsIt)
{
    select("Depreciation");
    dialogs.expect(kInsertPrompt, "Amortisation");
    editor.PushButton2_Click(ItemEditor::InsertNewBelowSelected);
    EXPECT_EQ(options.item(45).name, "Amortisation");
    EXPECT_EQ(window.selectedListIndex(), 44);
}

TEST_F(EditorTest, ShortNamesAreRefusedWithTheirOwnMessages)
{
    select("Rent");
    dialogs.expect(kInsertPrompt, "ab").expect(MessageRequest::plain("Length of new row is too small."));
    editor.PushButton2_Click(ItemEditor::InsertNewBelowSelected);
    dialogs.expect(kInsertPrompt, "\xC3\xA4\xC3\xB6").expect(MessageRequest::plain("Length of new row is too small."));
    editor.PushButton2_Click(ItemEditor::InsertNewBelowSelected);
    dialogs.expect(kRenamePrompt, " x")
        .expect(MessageRequest::information("Length of new row too small.\r\nPlease, enter more then few simbols."));
    editor.PushButton2_Click(ItemEditor::RenameSelected);
    expectUntouched(44);
}

TEST_F(EditorTest, ANameMatchingAnExistingItemSelectsThatItemInstead)
{
    // The first "&" of each name does not count, letter case does.
    for (const std::string duplicate : { "Rent", "&Rent", "Repairs  maintenance", "Cash Sales" }) {
        SCOPED_TRACE(duplicate);
        select("Depreciation");
        dialogs.expect(kInsertPrompt, duplicate).expect(kExists);
        editor.PushButton2_Click(ItemEditor::InsertNewBelowSelected);
        EXPECT_EQ(options.count(), 44);
        EXPECT_EQ(window.selectedListIndex(), options.FindItemRow(duplicate) - 1);
        EXPECT_EQ(window.events, (std::vector<std::string> { "lock", "select while locked", "unlock" }));
    }
    select("Depreciation");
    dialogs.expect(kInsertPrompt, "rent");
    editor.PushButton2_Click(ItemEditor::InsertNewBelowSelected);
    EXPECT_EQ(options.count(), 45);
}

TEST_F(EditorTest, RenameGivesTheSelectedItemTheNameAsTyped)
{
    select("Rent");
    dialogs.expect(kRenamePrompt, "Office rent ");
    editor.PushButton2_Click(ItemEditor::RenameSelected);
    EXPECT_EQ(options.item(20).name, "Office rent ");
    EXPECT_EQ(window.selectedListIndex(), 19);
    expectOneLockedChange();
}

TEST_F(EditorTest, RenamingToItsOwnNameIsADuplicate)
{
    select("Rent");
    dialogs.expect(kRenamePrompt, "Rent").expect(kExists);
    editor.PushButton2_Click(ItemEditor::RenameSelected);
    EXPECT_EQ(selectedName(), "Rent");
    EXPECT_EQ(options.count(), 44);
}

TEST_F(EditorTest, SystemRowsAreNeitherRenamedNorDeleted)
{
    const MessageRequest noRename
        = MessageRequest::information("You can't rename this row.\r\nIt is reserved for system use.");
    const MessageRequest noDelete
        = MessageRequest::information("You can't delete this row.\r\nIt is reserved for system use.");
    for (const std::string system : { "SUBTOTAL", "Cash Sales", "Cash Position (end of month)" }) {
        SCOPED_TRACE(system);
        select(system);
        // The answer comes first; only a real one is refused, even a short one.
        dialogs.expect(kRenamePrompt, "  ");
        editor.PushButton2_Click(ItemEditor::RenameSelected);
        dialogs.expect(kRenamePrompt, "Totals").expect(noRename);
        editor.PushButton2_Click(ItemEditor::RenameSelected);
        dialogs.expect(kRenamePrompt, "ab").expect(noRename);
        editor.PushButton2_Click(ItemEditor::RenameSelected);
        // Deleting is refused before any question.
        dialogs.expect(noDelete);
        editor.PushButton2_Click(ItemEditor::DeleteSelected);
        expectUntouched(44);
        EXPECT_EQ(selectedName(), system);
    }
}

TEST_F(EditorTest, SectionHeadingsMayBeRenamed)
{
    select("CASH PAID OUT");
    dialogs.expect(kRenamePrompt, "Expenses");
    editor.PushButton2_Click(ItemEditor::RenameSelected);
    EXPECT_EQ(options.item(8).name, "Expenses");
    EXPECT_FALSE(options.item(8).section);
}

TEST_F(EditorTest, DeleteAsksNamingTheItemAndOnlyYesDeletes)
{
    select("Rent");
    dialogs.expect(deleteQuestion("Rent"), DialogAnswer::No);
    editor.PushButton2_Click(ItemEditor::DeleteSelected);
    expectUntouched(44);

    dialogs.expect(deleteQuestion("Rent"), DialogAnswer::Yes);
    editor.PushButton2_Click(ItemEditor::DeleteSelected);
    EXPECT_EQ(options.count(), 43);
    EXPECT_EQ(options.FindItemRow("Rent"), 0);
    EXPECT_EQ(selectedName(), "Telephone") << "the item that took its place";
    expectOneLockedChange();

    select("Depreciation");
    dialogs.expect(deleteQuestion("Depreciation"), DialogAnswer::Yes);
    editor.PushButton2_Click(ItemEditor::DeleteSelected);
    EXPECT_EQ(selectedName(), "Accounts Payable (end of month)") << "the new last item";
}

TEST_F(EditorTest, DeleteQuestionDefaultsToNo)
{
    const MessageRequest question = deleteQuestion("_Other (specify)");
    EXPECT_EQ(question.defaultButton, DialogAnswer::No);
    EXPECT_EQ(question.icon, MessageIcon::Question);
    select("_Other (specify)");
    dialogs.expect(question, DialogAnswer::Yes);
    editor.PushButton2_Click(ItemEditor::DeleteSelected);
    EXPECT_EQ(options.FindItemRow("_Other (specify)"), 0);
    EXPECT_NE(options.FindItemRow("Other (specify)"), 0);
}

TEST_F(EditorTest, RestoreAnsweredNoKeepsTheListAndYesBringsBackTheDefaults)
{
    select("Rent");
    dialogs.expect(deleteQuestion("Rent"), DialogAnswer::Yes);
    editor.PushButton2_Click(ItemEditor::DeleteSelected);
    window.setText(TextBox::Text1, "Acme");
    window.setOptionOn(OptionButton::Option2, true);
    window.events.clear();

    dialogs.expect(kRestoreQuestion, DialogAnswer::No);
    editor.PushButton3_Click();
    expectUntouched(43);

    dialogs.expect(kRestoreQuestion, DialogAnswer::Yes)
        .expect(MessageRequest::information("Default settings restored."));
    editor.PushButton3_Click();
    EXPECT_EQ(options.count(), 44);
    EXPECT_EQ(options.FindItemRow("Rent"), 20);
    EXPECT_EQ(window.selectedListIndex(), 0);
    EXPECT_EQ(window.text(TextBox::Text1), "");
    EXPECT_TRUE(window.isOptionOn(OptionButton::Option3));
    expectOneLockedChange();
}

TEST_F(EditorTest, AFailingChangeIsReportedAndTheDrawingIsReleased)
{
    // The longest list the window can show.
    std::vector<std::string> names;
    for (int position = 1; position <= kMaximumItemCount; ++position) {
        names.push_back(position == 1 ? "Cash on Hand (beginning of month)" : "Line " + std::to_string(position));
    }
    for (std::size_t i = 0; i < names.size(); ++i) {
        store.write("Field" + std::to_string(i + 1), names[i]);
    }
    store.write("System Value - Rows", std::to_string(names.size()));
    store.write("System Value - Saved", "True");
    options.LoadOptions(LoadMode::FromStore);
    window.events.clear();

    dialogs.expect(kInsertPrompt, "One line too many")
        .expectErrorReport("The item list is full: it cannot hold more than 32768 items. Delete an item before "
                           "inserting a new one.",
            errorlocation::Form1PushButton2Click, 114);
    editor.PushButton2_Click(ItemEditor::InsertNewBelowSelected);
    EXPECT_EQ(options.count(), kMaximumItemCount);
    EXPECT_EQ(window.events, (std::vector<std::string> { "lock", "unlock" }));
}

TEST_F(EditorTest, ButtonsOutsideTheArrayDoNothing)
{
    editor.PushButton2_Click(3);
    editor.PushButton2_Click(-1);
    expectUntouched(44);
}

} // namespace
} // namespace penmoor
