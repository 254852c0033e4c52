#include "tests/ui_main/form1fixture.h"

#include <QGroupBox>
#include <QLabel>
#include <QLineEdit>
#include <QListView>
#include <QScreen>

namespace penmoor::testing {
namespace {

const std::string kYearTooEarly = "Year can't be less then 1970.\r\nPlease change year to necessary value.";
const std::string kTooFewWeeks = "Week number can't be less then 1.\r\nPlease change week's number to necessary value.";
const std::string kTooManyWeeks
    = "Week number can't be greater then 100.\r\nPlease change week's number to necessary value.";

class Form1EventsTest : public Form1Test {
protected:
    void SetUp() override
    {
        start();
        showActive();
    }

    // Types text into the box as a user would: focus in, whole text replaced.
    void typeInto(const char* name, const QString& text)
    {
        auto* box = control<QLineEdit>(name);
        box->setFocus(Qt::TabFocusReason);
        QTest::keyClick(box, Qt::Key_A, Qt::ControlModifier);
        QTest::keyClick(box, Qt::Key_Delete);
        QTest::keyClicks(box, text);
    }

    // Moves the focus on with the Tab key and lets the focus settle.
    void tabOn()
    {
        QTest::keyClick(QApplication::focusWidget(), Qt::Key_Tab);
        QApplication::processEvents();
    }

    QWidget* focused() const { return QApplication::focusWidget(); }
};

TEST_F(Form1EventsTest, LeavingAYearOrWeeksBoxChecksIt)
{
    struct Case {
        const char* box;
        QString typed;
        QString corrected;
        std::optional<std::string> problem;
    };
    const std::vector<Case> cases = {
        { "Text2", "13", "2013", std::nullopt },
        { "Text2", "", "2000", std::nullopt },
        { "Text3", "0", "2000", std::nullopt },
        { "Text2", "2013abc", "2013", std::nullopt },
        { "Text3", "1969", "2031", kYearTooEarly },
        { "Text4", "-3", "1", kTooFewWeeks },
        { "Text4", "250", "100", kTooManyWeeks },
        { "Text4", "5.5", "6", std::nullopt },
        { "Text4", "6.5", "6", std::nullopt },
        // The By Month years have no check of their own.
        { "Text6", "1969", "1969", std::nullopt },
        { "Text7", "x", "x", std::nullopt },
    };
    for (const Case& c : cases) {
        SCOPED_TRACE(std::string(c.box) + " \"" + c.typed.toStdString() + "\"");
        typeInto(c.box, c.typed);
        if (c.problem) {
            dialogs.expect(MessageRequest::inputProblem(*c.problem));
        }
        tabOn();
        EXPECT_EQ(dialogs.pending(), 0U);
        auto* box = control<QLineEdit>(c.box);
        EXPECT_EQ(box->text(), c.corrected);
        EXPECT_EQ(stored(c.box), c.corrected.toStdString()) << "the corrected text is stored";
        // A reported problem keeps the focus in the box, whole text selected for retyping.
        EXPECT_EQ(focused() == box, c.problem.has_value());
        if (c.problem) {
            EXPECT_EQ(box->selectedText(), c.corrected);
        }
    }
}

TEST_F(Form1EventsTest, ACommandClickedOffABoxWithAProblemDoesNotRun)
{
    int builds = 0;
    window->setStartCommand([&] { ++builds; });
    typeInto("Text4", "0");
    dialogs.expect(MessageRequest::inputProblem(kTooFewWeeks));
    click(control<QPushButton>("PushButton22"));
    QApplication::processEvents();
    EXPECT_EQ(builds, 0);
    EXPECT_EQ(control<QLineEdit>("Text4")->text(), "1");
    EXPECT_EQ(focused(), control("Text4"));

    // Corrected, the next click runs the command.
    click(control<QPushButton>("PushButton22"));
    QApplication::processEvents();
    EXPECT_EQ(builds, 1);
}

TEST_F(Form1EventsTest, BoxesAndOptionsStoreThemselvesOnEveryChange)
{
    typeInto("Text6", "2020");
    EXPECT_EQ(stored("Text6"), "2020");
    typeInto("Text7", "2021");
    EXPECT_EQ(stored("Text7"), "2021");
    typeInto("Text1", "Acme");
    EXPECT_EQ(stored("Text1"), "<absent>") << "the company is stored at the close, as Company";

    click(control<QRadioButton>("Option1"));
    EXPECT_EQ(stored("Option1"), "True");
    EXPECT_EQ(stored("Option2"), "False");
    EXPECT_EQ(stored("Option3"), "False");
    click(control<QRadioButton>("Option2"));
    EXPECT_EQ(stored("Option1"), "False");
    EXPECT_EQ(stored("Option2"), "True");
    // The mode changes no box: every box stays enabled and shown.
    for (const char* box : { "Text2", "Text3", "Text4", "Text6", "Text7" }) {
        EXPECT_TRUE(control(box)->isEnabled() && control(box)->isVisible()) << box;
    }
}

TEST_F(Form1EventsTest, EnteringABoxSelectsItsWholeText)
{
    auto* company = control<QLineEdit>("Text1");
    company->setText("Harlenby Ltd");
    control("List1")->setFocus(Qt::TabFocusReason);
    QTest::keyClick(focused(), Qt::Key_Backtab);
    EXPECT_EQ(focused(), company);
    EXPECT_EQ(company->selectedText(), "Harlenby Ltd");

    auto* weeks = control<QLineEdit>("Text4");
    weeks->setText("12");
    QTest::mouseClick(weeks, Qt::LeftButton, {}, weeks->rect().center());
    QApplication::processEvents();
    EXPECT_EQ(focused(), weeks);
    EXPECT_EQ(weeks->selectedText(), "12");
    // A second click, with the focus already there, places the cursor as usual.
    QTest::mouseClick(weeks, Qt::LeftButton, {}, weeks->rect().center());
    EXPECT_EQ(weeks->selectedText(), "");
}

TEST_F(Form1EventsTest, EveryButtonRunsItsCommand)
{
    int builds = 0;
    window->setStartCommand([&] { ++builds; });
    window->setSelectedListIndex(window->options().FindItemRow("Rent") - 1);

    dialogs.expect(InputRequest { "Enter new row: ", "Input New Row", "" }, "Grants");
    click(editButton(ItemEditor::InsertNewBelowSelected));
    EXPECT_EQ(window->listEntryCount(), 45);
    EXPECT_EQ(selectedEntry(), "Grants");

    dialogs.expect(InputRequest { "Rename selected row to: ", "Rename Selected Row", "" }, "Grants received");
    click(editButton(ItemEditor::RenameSelected));
    EXPECT_EQ(selectedEntry(), "Grants received");
    auto* list = control<QListView>("List1");
    EXPECT_EQ(list->model()->data(list->model()->index(20, 0)).toString(), "Grants received");

    dialogs.expect(
        MessageRequest::question("Do you really want delete this row ?\r\n(Grants received)"), DialogAnswer::Yes);
    click(editButton(ItemEditor::DeleteSelected));
    EXPECT_EQ(window->listEntryCount(), 44);

    const MessageRequest restore = MessageRequest::question("Do you really want restore default settings ?");
    dialogs.expect(restore, DialogAnswer::No);
    click(control<QPushButton>("PushButton3"));

    click(control<QPushButton>("PushButton6"));
    EXPECT_EQ(window->text(TextBox::Text1), "Harlenby");
    EXPECT_EQ(window->text(TextBox::Text6), "2013");
    EXPECT_EQ(stored("Text7"), "2013");

    dialogs.expect(restore, DialogAnswer::No);
    click(control<QPushButton>("PushButton5"));
    for (const char* box : { "Text1", "Text2", "Text3", "Text4", "Text6", "Text7" }) {
        EXPECT_EQ(control<QLineEdit>(box)->text(), "") << box;
    }
    EXPECT_EQ(stored("Text3"), "");

    click(control<QPushButton>("PushButton22"));
    EXPECT_EQ(builds, 1);
}

TEST_F(Form1EventsTest, TheListAlwaysKeepsOneEntrySelected)
{
    auto* list = control<QListView>("List1");
    const auto clickRow = [&](int row, Qt::KeyboardModifiers modifiers = {}) {
        QTest::mouseClick(
            list->viewport(), Qt::LeftButton, modifiers, list->visualRect(list->model()->index(row, 0)).center());
    };
    clickRow(2);
    EXPECT_EQ(window->selectedListIndex(), 2);
    clickRow(2, Qt::ControlModifier);
    EXPECT_EQ(window->selectedListIndex(), 2) << "Ctrl+click does not clear the selection";
    clickRow(4, Qt::ControlModifier);
    EXPECT_EQ(window->selectedListIndex(), 4);
    QTest::keyClick(list, Qt::Key_Down);
    EXPECT_EQ(window->selectedListIndex(), 5);
}

TEST_F(Form1EventsTest, TheDrawingLockSuspendsPaintingUntilReleased)
{
    window->lockDrawing();
    EXPECT_FALSE(window->updatesEnabled());
    window->unlockDrawing();
    EXPECT_TRUE(window->updatesEnabled());
    window->unlockDrawing();
    EXPECT_TRUE(window->updatesEnabled());
}

TEST_F(Form1EventsTest, BuildsAndBackHideAndShowTheWindow)
{
    window->hide();
    EXPECT_FALSE(window->isVisible());
    window->show();
    EXPECT_TRUE(window->isVisible());
}

TEST_F(Form1EventsTest, EveryCaptionFitsAndTheWindowFitsAScaledScreen)
{
    const std::vector<std::pair<const char*, QString>> captions = {
        { "Frame6", "Company Name" },
        { "Frame4", "Template Items" },
        { "Frame1", "How often?" },
        { "Option3", "By Month" },
        { "Option1", "By Year" },
        { "Option2", "By Week" },
        { "Label2", "to" },
        { "Label3", "to" },
        { "PushButton3", "Restore Default Template Items" },
        { "PushButton5", "Clear/Reset Data" },
        { "PushButton6", "Load Sample/Example Data" },
        { "PushButton22", "Start Creating Template" },
    };
    for (const auto& [name, caption] : captions) {
        QWidget* widget = control(name);
        const QString shown = qobject_cast<QGroupBox*>(widget) ? static_cast<QGroupBox*>(widget)->title()
            : qobject_cast<QLabel*>(widget)                    ? static_cast<QLabel*>(widget)->text()
                                                               : static_cast<QAbstractButton*>(widget)->text();
        EXPECT_EQ(shown, caption) << name;
        EXPECT_GE(widget->width(), widget->minimumSizeHint().width()) << name;
        EXPECT_GE(widget->height(), widget->minimumSizeHint().height()) << name;
    }
    const std::vector<std::pair<int, QString>> editCaptions
        = { { 0, "Insert New Below Selected" }, { 1, "Rename Selected" }, { 2, "Delete Selected" } };
    for (const auto& [index, caption] : editCaptions) {
        EXPECT_EQ(editButton(index)->text(), caption);
        EXPECT_GE(editButton(index)->width(), editButton(index)->sizeHint().width()) << caption.toStdString();
    }
    // The containment of the controls.
    EXPECT_EQ(control("Text1")->parentWidget(), control("Frame6"));
    EXPECT_EQ(control("List1")->parentWidget(), control("Frame4"));
    EXPECT_EQ(editButton(2)->parentWidget(), control("Frame4"));
    for (const char* inFrame1 :
        { "Option3", "Text6", "Label2", "Text7", "Option1", "Text2", "Text3", "Option2", "Text4" }) {
        EXPECT_EQ(control(inFrame1)->parentWidget(), control("Frame1")) << inFrame1;
    }
    // A screen of 1280 x 1024 pixels at 150 % offers 853 x 682 of the window's units.
    EXPECT_LE(window->frameGeometry().width(), 853);
    EXPECT_LE(window->frameGeometry().height(), 682);
}

} // namespace
} // namespace penmoor::testing
