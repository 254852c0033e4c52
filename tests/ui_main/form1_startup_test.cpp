#include "automation/contract/error.h"
#include "shell/makerpage.h"
#include "tests/support/memorysettings.h"
#include "tests/ui_main/form1fixture.h"

#include <fstream>

#include <QBuffer>
#include <QImage>
#include <QLineEdit>
#include <QSignalSpy>
#include <QTimer>

namespace penmoor::testing {
namespace {

const std::vector<std::pair<TextBox, std::string>> kFirstStartBoxes = {
    { TextBox::Text1, "" },
    { TextBox::Text2, "2031" },
    { TextBox::Text3, "2031" },
    { TextBox::Text4, "5" },
    { TextBox::Text6, "2031" },
    { TextBox::Text7, "2031" },
};

TEST_F(Form1Test, FirstStartShowsTheDefaultsAndKeepsTheControlKeysInStep)
{
    Form1& form = start();
    EXPECT_EQ(form.windowTitle(), "Penmoor");
    EXPECT_FALSE(form.windowIcon().isNull());
    EXPECT_TRUE(form.updatesEnabled()) << "the drawing lock of the load step is released";
    EXPECT_FALSE(form.isVisible()) << "the program shows the window once it is loaded";

    ASSERT_EQ(form.listEntryCount(), 44);
    EXPECT_EQ(selectedEntry(), "Cash on Hand (beginning of month)");
    for (const auto& [box, text] : kFirstStartBoxes) {
        EXPECT_EQ(form.text(box), text) << controlName(box);
    }
    EXPECT_TRUE(form.isOptionOn(OptionButton::Option3));
    EXPECT_FALSE(form.isOptionOn(OptionButton::Option1));
    EXPECT_FALSE(form.isOptionOn(OptionButton::Option2));

    // What the boxes and options showed was written by their own handlers.
    EXPECT_EQ(stored("Text2"), "2031");
    EXPECT_EQ(stored("Text4"), "5");
    EXPECT_EQ(stored("Text7"), "2031");
    EXPECT_EQ(stored("Option3"), "True");
    EXPECT_EQ(stored("Option1"), "False");
    EXPECT_EQ(stored("Option2"), "False");
    EXPECT_EQ(stored("Text1"), "<absent>");
    EXPECT_EQ(stored("System Value - Saved"), "<absent>") << "the list is stored at the close only";
    EXPECT_TRUE(opened.empty());
}

TEST_F(Form1Test, ClosingWritesTheListAndOptionsAndEndsTheProgram)
{
    Form1& form = start();
    QSignalSpy unloaded(&form, &Form1::unloaded);
    form.show();
    EXPECT_TRUE(form.close());
    EXPECT_EQ(unloaded.count(), 1);

    openStore();
    EXPECT_EQ(stored("System Value - Saved"), "True");
    EXPECT_EQ(stored("System Value - Rows"), "44");
    EXPECT_EQ(stored("System Value - Columns"), "7");
    EXPECT_EQ(stored("Field1"), "Cash on Hand (beginning of month)");
    EXPECT_EQ(stored("Field44"), "Depreciation");
    EXPECT_EQ(stored("Cash on Hand (beginning of month)"), "True");
    EXPECT_EQ(stored("Rent"), "False");
    EXPECT_EQ(stored("Company"), "");
    EXPECT_EQ(stored("Year"), "2031");
    EXPECT_EQ(stored("Year1"), "2031");
    EXPECT_EQ(stored("Weeks"), "5");
    EXPECT_EQ(stored("IsYear"), "False");
    EXPECT_EQ(stored("IsMonth"), "True");
}

TEST_F(Form1Test, ARestartBringsBackWhatTheLastRunLeft)
{
    Form1& first = start();
    showActive();
    QTest::keyClicks(control<QLineEdit>("Text1"), "Acme & Sons");
    first.setSelectedListIndex(first.options().FindItemRow("Rent") - 1);
    dialogs.expect(MessageRequest::question("Do you really want delete this row ?\r\n(Rent)"), DialogAnswer::Yes);
    click(editButton(ItemEditor::DeleteSelected));
    click(control<QRadioButton>("Option2"));
    control<QLineEdit>("Text4")->setText("12");
    control<QLineEdit>("Text2")->clear();
    first.setSelectedListIndex(first.options().FindItemRow("Advertising") - 1);
    first.close();

    openStore();
    Form1& next = start();
    ASSERT_EQ(next.listEntryCount(), 43);
    EXPECT_EQ(next.options().FindItemRow("Rent"), 0);
    EXPECT_EQ(selectedEntry(), "Cash on Hand (beginning of month)") << "every start selects the first entry";
    EXPECT_TRUE(next.isOptionOn(OptionButton::Option2));
    EXPECT_FALSE(next.isOptionOn(OptionButton::Option3));
    EXPECT_EQ(next.text(TextBox::Text1), "Acme & Sons");
    EXPECT_EQ(next.text(TextBox::Text4), "12");
    EXPECT_EQ(next.text(TextBox::Text2), "0") << "an emptied year comes back as its number";
    EXPECT_EQ(next.text(TextBox::Text3), "2031");
    EXPECT_EQ(stored("Advertising"), "True");
    EXPECT_EQ(stored("Option2"), "True");
    EXPECT_EQ(stored("Text2"), "0");
}

TEST_F(Form1Test, SplashShowsBeforeTheWindowUnlessSwitchedOff)
{
    std::filesystem::create_directory(program / "Splash");
    QImage picture(120, 80, QImage::Format_RGB32);
    picture.fill(Qt::darkCyan);
    ASSERT_TRUE(picture.save(toQString(program / "Splash" / "splash.png")));

    for (const std::string showAgain : { "0", "1" }) {
        SCOPED_TRACE("ShowAgain " + showAgain);
        store->write("ShowAgain", showAgain);
        bool splashSeen = false;
        bool windowSeen = false;
        // Runs while the load step waits with the splash window up, or after it when none showed.
        QTimer::singleShot(0, [&] {
            for (QWidget* top : QApplication::topLevelWidgets()) {
                splashSeen |= top->objectName() == "Splash" && top->isVisible();
                windowSeen |= top->objectName() == "Form1" && top->isVisible();
            }
        });
        start();
        QApplication::processEvents();
        EXPECT_EQ(splashSeen, showAgain == "0");
        EXPECT_FALSE(windowSeen);
    }
}

class NoSpreadsheets : public xl::ApplicationFactory {
public:
    std::unique_ptr<xl::Application> create() override { throw xl::Error("no spreadsheet application"); }
    std::unique_ptr<xl::Application> attachRunning() override { throw xl::Error("none running"); }
};

TEST_F(Form1Test, WithoutASpreadsheetApplicationTheLoadSaysSoAndGoesOn)
{
    NoSpreadsheets none;
    window = std::make_unique<Form1>(setup(*store, none));
    dialogs.expect(MessageRequest::plain(
        "Excel is not installed on this computer. You need to have it installed to use this software."));
    window->load();
    EXPECT_EQ(window->listEntryCount(), 44);
}

TEST_F(Form1Test, OneStartInAHundredOpensTheMakersPage)
{
    draw = 0.0654;
    start();
    EXPECT_EQ(opened, std::vector<std::string> { std::string(kMakerPageAddress) });
}

TEST_F(Form1Test, TheSkinFileStylesTheWindow)
{
    std::filesystem::create_directory(program / "x");
    std::ofstream(program / "x" / "o.cjs") << "QGroupBox { font-weight: bold; }";
    EXPECT_TRUE(start().styleSheet().contains("font-weight"));
}

// A Windows cursor file: an icon file of type 2 whose entry holds the hot spot.
QByteArray cursorFile(QPoint hotSpot)
{
    QImage picture(32, 32, QImage::Format_ARGB32);
    picture.fill(Qt::red);
    QByteArray data;
    QBuffer buffer(&data);
    buffer.open(QIODevice::WriteOnly);
    EXPECT_TRUE(picture.save(&buffer, "ico"));
    data[2] = 2;
    data[10] = static_cast<char>(hotSpot.x());
    data[12] = static_cast<char>(hotSpot.y());
    return data;
}

TEST_F(Form1Test, ButtonsShowTheHandPointerAndTheHourglassCoversEverything)
{
    const QByteArray cursor = cursorFile({ 7, 1 });
    std::ofstream(program / "HAND-M.CUR", std::ios::binary).write(cursor.data(), cursor.size());
    Form1& form = start();
    auto* build = control<QPushButton>("PushButton22");
    EXPECT_EQ(build->cursor().shape(), Qt::BitmapCursor);
    EXPECT_EQ(build->cursor().hotSpot(), QPoint(7, 1));
    EXPECT_EQ(control("List1")->cursor().shape(), Qt::ArrowCursor);

    form.setMousePointer(MousePointer::Hourglass);
    form.setMousePointer(MousePointer::Hourglass);
    EXPECT_EQ(form.mousePointer(), MousePointer::Hourglass);
    EXPECT_EQ(build->cursor().shape(), Qt::WaitCursor);
    EXPECT_EQ(control("Text2")->cursor().shape(), Qt::WaitCursor);
    form.setMousePointer(MousePointer::Default);
    EXPECT_EQ(build->cursor().shape(), Qt::BitmapCursor);
    EXPECT_EQ(control("Text2")->cursor().shape(), Qt::IBeamCursor);
    EXPECT_EQ(form.cursor().shape(), Qt::ArrowCursor);
}

class UnsavableSettings : public MemorySettings {
public:
    void sync() override { throw SettingsError("The settings could not be saved to /nowhere."); }
};

TEST_F(Form1Test, SettingsThatCannotBeSavedAreToldAndTheWindowClosesAnyway)
{
    UnsavableSettings settings;
    window = std::make_unique<Form1>(setup(settings));
    window->load();
    QSignalSpy unloaded(window.get(), &Form1::unloaded);
    window->show();
    dialogs.expect({ "The settings could not be saved to /nowhere.", MessageButtons::Ok, MessageIcon::Exclamation,
        "Penmoor", DialogAnswer::Ok });
    EXPECT_TRUE(window->close());
    EXPECT_FALSE(window->isVisible());
    EXPECT_EQ(unloaded.count(), 1);
    EXPECT_EQ(settings.values["System Value - Saved"], "True") << "what could be written was";
}

} // namespace
} // namespace penmoor::testing
