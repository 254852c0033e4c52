#include "app/desktop/desktopprogram.h"
#include "model/qsettingsstore.h"
#include "shell/qtpaths.h"
#include "tests/support/scripteddialogs.h"
#include "tests/support/temporaryfolder.h"
#include "ui/preview/saveresults.h"

#include <fstream>
#include <iterator>
#include <memory>
#include <string>

#include <QApplication>
#include <QLineEdit>
#include <QPushButton>
#include <QRadioButton>
#include <QTest>

#include <gtest/gtest.h>

namespace penmoor::testing {
namespace {

namespace fs = std::filesystem;
using namespace std::chrono_literals;

std::string bytesOf(const fs::path& path)
{
    std::ifstream in(path, std::ios::binary);
    return { std::istreambuf_iterator<char>(in), {} };
}

// The desktop program as main() wires it, with its settings in a temporary INI file, its
// builds in a temporary folder and scripted dialogs.
class DesktopSessionTest : public ::testing::Test {
protected:
    DesktopSessionTest() { restart(); }

    // A new run of the program on the same settings file.
    void restart()
    {
        program.reset();
        store = std::make_unique<QSettingsStore>(toQString(config / "Penmoor.ini"));
        program
            = std::make_unique<DesktopProgram>(DesktopSetup { *store, dialogs, programFolder.path(), temporary.path(),
                [] { return 2031; }, [] { return 0.5; }, seededUnitRandom(), [](std::string_view) {}, 20ms });
        program->start();
        QApplication::setActiveWindow(&form1());
        ASSERT_TRUE(QTest::qWaitForWindowActive(&form1()));
    }

    Form1& form1() { return program->mainWindow(); }
    Form2& form2()
    {
        Form2* preview = program->previewWindow();
        EXPECT_NE(preview, nullptr) << "no build has reached the preview window";
        return *preview;
    }

    template <typename Control = QPushButton> Control* control(QWidget& window, const char* name)
    {
        auto* found = window.findChild<Control*>(QLatin1String(name));
        EXPECT_NE(found, nullptr) << name;
        return found;
    }
    void click(QWidget& window, const char* button)
    {
        QTest::mouseClick(control<QAbstractButton>(window, button), Qt::LeftButton);
    }
    QPushButton* insertButton()
    {
        for (QPushButton* button : form1().findChildren<QPushButton*>(QStringLiteral("PushButton2"))) {
            if (button->property("index").toInt() == ItemEditor::InsertNewBelowSelected) {
                return button;
            }
        }
        ADD_FAILURE() << "no PushButton2(0)";
        return nullptr;
    }
    QSize picture1() { return control<QWidget>(form2(), "Picture1")->size(); }

    TemporaryFolder programFolder;
    TemporaryFolder config;
    TemporaryFolder temporary;
    ScriptedDialogs dialogs;
    std::unique_ptr<QSettingsStore> store;
    std::unique_ptr<DesktopProgram> program;
};

TEST_F(DesktopSessionTest, BuildZoomSaveBackAndASecondBuildInTheSamePreviewWindow)
{
    EXPECT_EQ(program->previewWindow(), nullptr) << "the preview window is created by the first build";
    click(form1(), "PushButton22");

    Form2* preview = &form2();
    EXPECT_TRUE(preview->isVisible());
    EXPECT_FALSE(form1().isVisible());
    const fs::path firstWorkbook = preview->TempWorkbookPath();
    EXPECT_EQ(firstWorkbook.parent_path(), temporary.path());
    EXPECT_TRUE(fs::is_regular_file(firstWorkbook));
    const QSize unzoomed = picture1();
    EXPECT_GT(unzoomed.width(), 600);
    EXPECT_GT(unzoomed.height(), 200);

    click(*preview, "PushButton1");
    EXPECT_EQ(picture1(), QSize(unzoomed.width() * 5 / 4, unzoomed.height() * 5 / 4));

    const fs::path saved = temporary / "plan.xls";
    dialogs.expect(SaveFileRequest { std::string(kSaveDialogTitle), std::string(kSaveDialogFilter) }, saved.string());
    dialogs.expect(MessageRequest::plain("Done."));
    click(*preview, "PushButton6");
    EXPECT_EQ(bytesOf(saved), bytesOf(firstWorkbook));

    click(*preview, "PushButton8");
    EXPECT_FALSE(fs::exists(firstWorkbook));
    EXPECT_TRUE(fs::exists(saved));
    EXPECT_TRUE(form1().isVisible());
    EXPECT_FALSE(preview->isVisible());

    click(form1(), "PushButton22");
    EXPECT_EQ(&form2(), preview);
    EXPECT_TRUE(preview->isVisible());
    EXPECT_NE(preview->TempWorkbookPath(), firstWorkbook);
    EXPECT_TRUE(fs::is_regular_file(preview->TempWorkbookPath()));
    EXPECT_EQ(picture1(), unzoomed) << "each build's picture starts at zoom 1";
}

TEST_F(DesktopSessionTest, APeriodProblemKeepsTheMainWindowAndBuildsNothing)
{
    click(form1(), "Option1");
    control<QLineEdit>(form1(), "Text2")->setText("2015");
    control<QLineEdit>(form1(), "Text3")->setText("2013");
    dialogs.expect(MessageRequest::inputProblem(
        "Start year can't be greater then end year.\r\nPlease change year to necessary value."));
    click(form1(), "PushButton22");

    EXPECT_EQ(program->previewWindow(), nullptr);
    EXPECT_TRUE(fs::is_empty(temporary.path()));
    EXPECT_TRUE(form1().isVisible());
    EXPECT_TRUE(form1().updatesEnabled());
    EXPECT_EQ(form1().mousePointer(), MousePointer::Default);
}

TEST_F(DesktopSessionTest, ClosingThePreviewKeepsTheListEditsAndRemovesTheWorkbook)
{
    form1().setSelectedListIndex(form1().options().FindItemRow("Rent") - 1);
    dialogs.expect(InputRequest { "Enter new row: ", "Input New Row", "" }, "Grants");
    QTest::mouseClick(insertButton(), Qt::LeftButton);
    click(form1(), "PushButton22");
    const fs::path workbook = form2().TempWorkbookPath();
    ASSERT_TRUE(fs::is_regular_file(workbook));

    form2().close();
    EXPECT_FALSE(fs::exists(workbook));

    restart();
    EXPECT_EQ(form1().options().FindItemRow("Grants"), form1().options().FindItemRow("Rent") + 1);
}

} // namespace
} // namespace penmoor::testing
