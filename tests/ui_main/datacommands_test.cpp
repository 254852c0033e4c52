#include "automation/contract/error.h"
#include "model/memorysettingsstore.h"
#include "model/options.h"
#include "spreadsheet/builtin/builtinapplication.h"
#include "tests/support/scripteddialogs.h"
#include "tests/ui_main/recordingwindow.h"
#include "ui/main/datacommands.h"
#include "ui/main/itemeditor.h"
#include "ui/main/spreadsheetcheck.h"

#include <gtest/gtest.h>

namespace penmoor {
namespace {

const MessageRequest kRestoreQuestion = MessageRequest::question("Do you really want restore default settings ?");
const std::vector<TextBox> kAllBoxes
    = { TextBox::Text1, TextBox::Text2, TextBox::Text3, TextBox::Text4, TextBox::Text6, TextBox::Text7 };

class DataCommandsTest : public ::testing::Test {
protected:
    void SetUp() override
    {
        options.LoadOptions(LoadMode::FromStore);
        options.DeleteItem(20);
        for (const TextBox box : kAllBoxes) {
            window.setText(box, "1999");
        }
        window.setOptionOn(OptionButton::Option2, true);
    }

    MemorySettingsStore store;
    testing::RecordingWindow window;
    Options options { store, window, [] { return 2031; } };
    testing::ScriptedDialogs dialogs;
    ItemEditor editor { options, window, window, dialogs };
};

TEST_F(DataCommandsTest, ClearAnsweredNoLeavesEveryBoxEmptyAndTheListAsItWas)
{
    dialogs.expect(kRestoreQuestion, DialogAnswer::No);
    ClearResetData(window, editor, dialogs);
    for (const TextBox box : kAllBoxes) {
        EXPECT_EQ(window.text(box), "") << controlName(box);
    }
    EXPECT_EQ(options.count(), 43);
    EXPECT_TRUE(window.isOptionOn(OptionButton::Option2));
}

TEST_F(DataCommandsTest, ClearAnsweredYesRestoresAllButTheByMonthYears)
{
    dialogs.expect(kRestoreQuestion, DialogAnswer::Yes)
        .expect(MessageRequest::information("Default settings restored."));
    ClearResetData(window, editor, dialogs);
    EXPECT_EQ(window.text(TextBox::Text1), "");
    EXPECT_EQ(window.text(TextBox::Text2), "2031");
    EXPECT_EQ(window.text(TextBox::Text3), "2031");
    EXPECT_EQ(window.text(TextBox::Text4), "5");
    EXPECT_EQ(window.text(TextBox::Text6), "");
    EXPECT_EQ(window.text(TextBox::Text7), "");
    EXPECT_TRUE(window.isOptionOn(OptionButton::Option3));
    EXPECT_EQ(options.count(), 44);
}

TEST_F(DataCommandsTest, SampleDataIsOneYearByMonthForTheSampleCompany)
{
    LoadSampleData(window, dialogs);
    EXPECT_EQ(window.text(TextBox::Text1), "Harlenby");
    EXPECT_EQ(window.text(TextBox::Text6), "2013");
    EXPECT_EQ(window.text(TextBox::Text7), "2013");
    EXPECT_TRUE(window.isOptionOn(OptionButton::Option3));
    EXPECT_FALSE(window.isOptionOn(OptionButton::Option2));
    EXPECT_EQ(window.text(TextBox::Text2), "1999");
    EXPECT_EQ(window.text(TextBox::Text4), "1999");
    EXPECT_EQ(options.count(), 43);
}

class NoSpreadsheets : public xl::ApplicationFactory {
public:
    std::unique_ptr<xl::Application> create() override { throw xl::Error("Cannot create the application"); }
    std::unique_ptr<xl::Application> attachRunning() override { throw xl::Error("None is running"); }
};

TEST(SpreadsheetCheck, SaysOnceThatNoneCanBeCreatedAndGoesOn)
{
    testing::ScriptedDialogs dialogs;
    NoSpreadsheets none;
    dialogs.expect(MessageRequest::plain(
        "Excel is not installed on this computer. You need to have it installed to use this software."));
    EXPECT_FALSE(CheckExcelInstalled(none, dialogs));

    engine::BuiltinApplicationFactory builtin;
    EXPECT_TRUE(CheckExcelInstalled(builtin, dialogs));
}

} // namespace
} // namespace penmoor
