#include "shell/errorreport.h"
#include "shell/qtdialogs.h"
#include "tests/shell_ui/modalhelper.h"
#include "tests/support/temporaryfolder.h"

#include <fstream>
#include <vector>

#include <QFileDialog>
#include <QInputDialog>
#include <QMessageBox>
#include <QPushButton>
#include <QTest>

#include <gtest/gtest.h>

namespace penmoor {
namespace {

using testing::whenModalAppears;

struct ShownBox {
    QString title;
    QString text;
    Qt::TextFormat format = Qt::AutoText;
    QMessageBox::Icon icon = QMessageBox::NoIcon;
    QMessageBox::StandardButtons buttons;
    QMessageBox::StandardButton defaultButton = QMessageBox::NoButton;
};

// Shows the request, records what the box showed and closes it with the given button.
std::pair<ShownBox, DialogAnswer> showAndPress(const MessageRequest& request, QMessageBox::StandardButton press)
{
    ShownBox shown;
    whenModalAppears([&](QWidget* modal) {
        auto* box = qobject_cast<QMessageBox*>(modal);
        ASSERT_TRUE(box);
        shown = { box->windowTitle(), box->text(), box->textFormat(), box->icon(), box->standardButtons(),
            box->standardButton(box->defaultButton()) };
        box->button(press)->click();
    });
    QtDialogs dialogs;
    const DialogAnswer answer = dialogs.showMessage(request);
    return { shown, answer };
}

TEST(QtDialogs, MessageBoxesShowExactlyWhatTheRequestSays)
{
    struct Case {
        MessageRequest request;
        QMessageBox::StandardButton press;
        ShownBox expected;
        DialogAnswer answer;
    };
    MessageRequest untitled;
    untitled.text = "Done.";
    const std::vector<Case> cases = {
        { MessageRequest::question("Do you really want delete this row ?\r\n(Rent)"), QMessageBox::Yes,
            { "Question", "Do you really want delete this row ?\n(Rent)", Qt::PlainText, QMessageBox::Question,
                QMessageBox::Yes | QMessageBox::No, QMessageBox::No },
            DialogAnswer::Yes },
        { MessageRequest::question("Sure?"), QMessageBox::No,
            { "Question", "Sure?", Qt::PlainText, QMessageBox::Question, QMessageBox::Yes | QMessageBox::No,
                QMessageBox::No },
            DialogAnswer::No },
        { MessageRequest::information("Such row exist already."), QMessageBox::Ok,
            { "Information", "Such row exist already.", Qt::PlainText, QMessageBox::Information, QMessageBox::Ok,
                QMessageBox::Ok },
            DialogAnswer::Ok },
        { MessageRequest::inputProblem("Year can't be less then 1970.\r\nPlease change year to necessary value."),
            QMessageBox::Ok,
            { "Error", "Year can't be less then 1970.\nPlease change year to necessary value.", Qt::PlainText,
                QMessageBox::Information, QMessageBox::Ok, QMessageBox::Ok },
            DialogAnswer::Ok },
        { MessageRequest::plain("Excel may be open.\r\n\r\nProceed?", MessageButtons::YesNo), QMessageBox::No,
            { "Penmoor", "Excel may be open.\n\nProceed?", Qt::PlainText, QMessageBox::NoIcon,
                QMessageBox::Yes | QMessageBox::No, QMessageBox::Yes },
            DialogAnswer::No },
        { untitled, QMessageBox::Ok,
            { "Penmoor", "Done.", Qt::PlainText, QMessageBox::NoIcon, QMessageBox::Ok, QMessageBox::Ok },
            DialogAnswer::Ok },
        { errorReportRequest("Bad <b>name</b>", errorlocation::Form2PushButton6Click, 104), QMessageBox::Ok,
            { "Application Error",
                "Bad <b>name</b>\nin Quarrytab11/7/2013.Form2.PushButton6_Click at line 104\n\n"
                "Please email screenshot of this message to support@penmoor.example",
                Qt::PlainText, QMessageBox::Warning, QMessageBox::Ok, QMessageBox::Ok },
            DialogAnswer::Ok },
    };
    for (const Case& c : cases) {
        SCOPED_TRACE(c.request.text);
        const auto [shown, answer] = showAndPress(c.request, c.press);
        EXPECT_EQ(shown.title, c.expected.title);
        EXPECT_EQ(shown.text, c.expected.text);
        EXPECT_EQ(shown.format, c.expected.format);
        EXPECT_EQ(shown.icon, c.expected.icon);
        EXPECT_EQ(shown.buttons, c.expected.buttons);
        EXPECT_EQ(shown.defaultButton, c.expected.defaultButton);
        EXPECT_EQ(answer, c.answer);
    }
}

TEST(QtDialogs, EscapeAnswersNoAndEnterTakesTheDefault)
{
    QtDialogs dialogs;
    whenModalAppears([](QWidget* box) { QTest::keyClick(box, Qt::Key_Escape); });
    EXPECT_EQ(dialogs.showMessage(MessageRequest::question("Sure?")), DialogAnswer::No);

    MessageRequest yesFirst = MessageRequest::question("Sure?");
    yesFirst.defaultButton = DialogAnswer::Yes;
    whenModalAppears([](QWidget* box) { QTest::keyClick(box, Qt::Key_Return); });
    EXPECT_EQ(dialogs.showMessage(yesFirst), DialogAnswer::Yes);

    whenModalAppears([](QWidget* box) { QTest::keyClick(box, Qt::Key_Return); });
    EXPECT_EQ(dialogs.showMessage(MessageRequest::question("Sure?")), DialogAnswer::No);
}

TEST(QtDialogs, InputBoxReturnsTheTypedTextOrNothingOnCancel)
{
    QtDialogs dialogs;
    QString title, label, initial;
    whenModalAppears([&](QWidget* modal) {
        auto* dialog = qobject_cast<QInputDialog*>(modal);
        ASSERT_TRUE(dialog);
        title = dialog->windowTitle();
        label = dialog->labelText();
        initial = dialog->textValue();
        dialog->setTextValue(QStringLiteral("  Büro  "));
        dialog->accept();
    });
    EXPECT_EQ(dialogs.askText({ "Enter new row: ", "Input New Row", "" }), "  Büro  ");
    EXPECT_EQ(title, "Input New Row");
    EXPECT_EQ(label, "Enter new row: ");
    EXPECT_EQ(initial, "");

    whenModalAppears([&](QWidget* modal) {
        title = modal->windowTitle();
        qobject_cast<QInputDialog*>(modal)->reject();
    });
    EXPECT_EQ(dialogs.askText({ "Rename selected row to: ", "", "old" }), "");
    EXPECT_EQ(title, "Penmoor");
}

TEST(QtDialogs, SaveDialogReturnsThePathAsGivenWithoutAskingAboutOverwriting)
{
    testing::TemporaryFolder folder;
    std::ofstream(folder / "existing.xls") << "old";
    QtDialogs dialogs;
    const SaveFileRequest request { "Save File", "Excel Files (*.xls)|*.xls|" };

    for (const std::string name : { "plan", "existing.xls" }) {
        const QString chosen = QString::fromStdString((folder / name).string());
        QStringList filters;
        bool confirms = true;
        whenModalAppears([&](QWidget* modal) {
            auto* dialog = qobject_cast<QFileDialog*>(modal);
            ASSERT_TRUE(dialog);
            EXPECT_EQ(dialog->windowTitle(), "Save File");
            EXPECT_EQ(dialog->acceptMode(), QFileDialog::AcceptSave);
            EXPECT_TRUE(dialog->defaultSuffix().isEmpty());
            filters = dialog->nameFilters();
            confirms = !dialog->testOption(QFileDialog::DontConfirmOverwrite);
            dialog->selectFile(chosen);
            static_cast<QDialog*>(dialog)->accept();
        });
        EXPECT_EQ(dialogs.askSavePath(request), chosen.toStdString());
        EXPECT_EQ(filters, QStringList { "Excel Files (*.xls)" });
        EXPECT_FALSE(confirms);
    }

    whenModalAppears([](QWidget* modal) { qobject_cast<QDialog*>(modal)->reject(); });
    EXPECT_EQ(dialogs.askSavePath(request), "");
}

TEST(QtDialogs, FilterPairsBecomeQtNameFilters)
{
    struct Case {
        std::string filter;
        QStringList expected;
    };
    const std::vector<Case> cases = {
        { "Excel Files (*.xls)|*.xls|", { "Excel Files (*.xls)" } },
        { "Excel Files (*.xls)|*.xls", { "Excel Files (*.xls)" } },
        { "Workbooks|*.xls;*.xlt|All Files|*.*|", { "Workbooks (*.xls *.xlt)", "All Files (*.*)" } },
        { "Old (*.xls)|*.xlt|", { "Old (*.xls) (*.xlt)" } },
        { "", {} },
        { "Lonely description|", {} },
    };
    for (const Case& c : cases) {
        EXPECT_EQ(nameFiltersFromPairs(c.filter), c.expected) << c.filter;
    }
}

} // namespace
} // namespace penmoor
