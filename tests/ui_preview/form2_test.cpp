#include "model/settingsstore.h"
#include "shell/errorreport.h"
#include "tests/support/scripteddialogs.h"
#include "tests/support/temporaryfolder.h"
#include "ui/preview/form2.h"
#include "ui/preview/picturebox.h"

#include <fstream>
#include <stdexcept>

#include <QApplication>
#include <QGroupBox>
#include <QMouseEvent>
#include <QPushButton>
#include <QScrollBar>
#include <QTimer>
#include <QtTest/QTest>

#include <gtest/gtest.h>

namespace penmoor {
namespace {

namespace fs = std::filesystem;
using testing::ScriptedDialogs;

constexpr std::uint32_t kRed = 0xFFFF0000;
constexpr std::uint32_t kBlue = 0xFF0000FF;

// A picture whose left half is left and whose right half is right.
xl::Picture picture(int width, int height, std::uint32_t left = kRed, std::uint32_t right = kBlue)
{
    xl::Picture result { width, height, {} };
    for (int y = 0; y < height; ++y) {
        for (int x = 0; x < width; ++x) {
            result.pixels.push_back(x < width / 2 ? left : right);
        }
    }
    return result;
}

// The main window as the preview sees it; it can be told to fail when shown.
class FakeMainWindow : public MainWindow {
public:
    void lockDrawing() override { }
    void unlockDrawing() override { }
    void setMousePointer(MousePointer) override { }
    bool CheckPeriodOptions() override { return false; }
    void show() override
    {
        ++shown;
        if (failToShow) {
            throw std::runtime_error("The main window cannot be shown.");
        }
    }
    void hide() override { }

    int shown = 0;
    bool failToShow = false;
};

class Form2Test : public ::testing::Test {
protected:
    Form2Test() { std::ofstream(workbook, std::ios::binary) << "built workbook"; }

    // A build's hand-over.
    void handOver(const xl::Picture& shown, const fs::path& path)
    {
        form.setPicture(shown);
        form.setTempWorkbookPath(path);
        form.show();
    }

    template <typename Control> Control& control(const char* name)
    {
        auto* found = form.findChild<Control*>(QString::fromLatin1(name));
        EXPECT_NE(found, nullptr) << name;
        return *found;
    }
    PictureBox& picture1() { return control<PictureBox>("Picture1"); }
    QScrollBar& bar(const char* name) { return control<QScrollBar>(name); }
    void click(const char* button) { QTest::mouseClick(&control<QPushButton>(button), Qt::LeftButton); }

    // Mouse events on Picture1 at positions inside it, as the system sends them.
    void mouse(QEvent::Type type, QPoint at, Qt::MouseButtons held)
    {
        QMouseEvent event(type, at, picture1().mapToGlobal(at), Qt::LeftButton, held, Qt::NoModifier);
        QApplication::sendEvent(&picture1(), &event);
    }

    testing::TemporaryFolder folder;
    const fs::path workbook = folder / "qarnet12345678.xls";
    ScriptedDialogs dialogs;
    FakeMainWindow mainWindow;
    int settingsWritten = 0;
    std::function<void()> writeSettings = [this] { ++settingsWritten; };
    Form2 form { mainWindow, dialogs, [this] { writeSettings(); }, folder.path() };
};

TEST_F(Form2Test, EveryControlHasItsCaptionAndDesignPosition)
{
    EXPECT_EQ(form.windowTitle(), "Preview");
    EXPECT_EQ(form.size(), QSize(656, 626));
    EXPECT_FALSE(form.windowIcon().isNull());

    const struct {
        const char* name;
        QRect rect;
        const char* caption;
    } controls[] = {
        { "Picture2", { 8, 8, 622, 495 }, nullptr },
        { "VScroll1", { 630, 8, 17, 495 }, nullptr },
        { "HScroll1", { 8, 503, 622, 17 }, nullptr },
        { "Frame1", { 8, 524, 640, 57 }, "Zoom:" },
        { "PushButton1", { 16, 20, 296, 27 }, "Zoom In" },
        { "PushButton2", { 320, 20, 304, 27 }, "Zoom Out" },
        { "PushButton8", { 8, 590, 312, 27 }, "< Back" },
        { "PushButton6", { 328, 590, 320, 27 }, "Save Results To Excel File" },
    };
    for (const auto& c : controls) {
        const QWidget& widget = control<QWidget>(c.name);
        EXPECT_EQ(widget.geometry(), c.rect) << c.name;
        if (const auto* button = qobject_cast<const QPushButton*>(&widget)) {
            EXPECT_EQ(button->text(), c.caption);
            EXPECT_EQ(button->cursor().shape(), Qt::PointingHandCursor) << c.name;
        }
    }
    EXPECT_EQ(control<QGroupBox>("Frame1").title(), "Zoom:");
    EXPECT_EQ(control<QPushButton>("PushButton1").parentWidget()->objectName(), "Frame1");
    EXPECT_EQ(picture1().parentWidget()->objectName(), "Picture2");
    EXPECT_FALSE(bar("HScroll1").hasTracking());
    EXPECT_FALSE(bar("VScroll1").hasTracking());
}

TEST_F(Form2Test, AHandedOverPictureShowsAtItsOwnSizeWithItsBars)
{
    handOver(picture(722, 600), workbook);

    EXPECT_TRUE(form.isVisible());
    EXPECT_EQ(form.TempWorkbookPath(), workbook);
    EXPECT_EQ(picture1().geometry(), QRect(0, 0, 722, 600));
    EXPECT_EQ(picture1().image().pixel(10, 10), kRed);
    EXPECT_TRUE(bar("HScroll1").isEnabled());
    EXPECT_EQ(bar("HScroll1").maximum(), 100);
    EXPECT_TRUE(bar("VScroll1").isEnabled());
    EXPECT_EQ(bar("VScroll1").maximum(), 10);

    handOver(picture(300, 200), workbook);
    EXPECT_EQ(picture1().geometry(), QRect(0, 0, 300, 200));
    EXPECT_FALSE(bar("HScroll1").isEnabled());
    EXPECT_FALSE(bar("VScroll1").isEnabled());
}

TEST_F(Form2Test, ZoomButtonsRedrawThePictureStretched)
{
    handOver(picture(400, 300), workbook);

    click("PushButton1");
    EXPECT_EQ(picture1().size(), QSize(500, 375));
    EXPECT_EQ(picture1().image().size(), QSize(500, 375));
    EXPECT_EQ(picture1().image().pixel(5, 5), kRed);
    EXPECT_EQ(picture1().image().pixel(495, 370), kBlue);

    click("PushButton2");
    click("PushButton2");
    EXPECT_EQ(picture1().size(), QSize(300, 225));
    EXPECT_EQ(dialogs.log().size(), 0U);
}

TEST_F(Form2Test, ScrollBarsMoveThePictureByTheirSteps)
{
    handOver(picture(922, 575), workbook);

    bar("HScroll1").setValue(7);
    bar("VScroll1").setValue(33);
    EXPECT_EQ(picture1().pos(), QPoint(-70, -33));

    click("PushButton2");
    EXPECT_EQ(picture1().pos(), QPoint(0, 0));
    EXPECT_EQ(bar("HScroll1").value(), 0);
}

TEST_F(Form2Test, DraggingStaysInBoundsAndSettlesOnTheBarsOnRelease)
{
    handOver(picture(1000, 800), workbook);

    // Far to the left and up: the right and bottom edges stop at the viewport's.
    mouse(QEvent::MouseButtonPress, { 500, 400 }, Qt::LeftButton);
    mouse(QEvent::MouseMove, { 50, 20 }, Qt::LeftButton);
    EXPECT_EQ(picture1().pos(), QPoint(-378, -305));

    // On release the bars take the position, at ten pixels a unit: 37.8 units round up to 38,
    // 30.5 down to 30.
    mouse(QEvent::MouseButtonRelease, { 428, 325 }, Qt::NoButton);
    EXPECT_EQ(bar("HScroll1").value(), 38);
    EXPECT_EQ(bar("VScroll1").value(), 30);
    EXPECT_EQ(picture1().pos(), QPoint(-380, -300));

    // Moving without a button held drags nothing.
    mouse(QEvent::MouseMove, { 900, 700 }, Qt::NoButton);
    EXPECT_EQ(picture1().pos(), QPoint(-380, -300));
}

TEST_F(Form2Test, BackDeletesTheWorkbookShowsTheMainWindowAndHides)
{
    handOver(picture(400, 300), workbook);

    click("PushButton8");

    EXPECT_FALSE(fs::exists(workbook));
    EXPECT_EQ(mainWindow.shown, 1);
    EXPECT_FALSE(form.isVisible());
    EXPECT_EQ(settingsWritten, 0);
}

TEST_F(Form2Test, AfterBackTheNextBuildsPictureIsTheOneThatZooms)
{
    handOver(picture(400, 300, kRed, kRed), workbook);
    click("PushButton1");
    click("PushButton8");

    const fs::path second = folder / "qarnet98765432.xls";
    std::ofstream(second) << "second build";
    handOver(picture(900, 700, kBlue, kBlue), second);
    EXPECT_EQ(picture1().geometry(), QRect(0, 0, 900, 700));
    EXPECT_EQ(bar("HScroll1").maximum(), 28);

    click("PushButton1");
    EXPECT_EQ(picture1().size(), QSize(1125, 875));
    EXPECT_EQ(picture1().image().pixel(600, 600), kBlue);
    EXPECT_EQ(form.TempWorkbookPath(), second);
}

TEST_F(Form2Test, ABuildWithoutAPictureAfterBackShowsNoOldPicture)
{
    handOver(picture(400, 300), workbook);
    click("PushButton8");

    form.setTempWorkbookPath(folder / "qarnet11111111.xls");
    form.show();

    EXPECT_EQ(picture1().size(), QSize(0, 0));
    EXPECT_FALSE(bar("HScroll1").isEnabled());
}

TEST_F(Form2Test, AFailureInBackIsReportedAndTheRestStillRuns)
{
    handOver(picture(400, 300), workbook);
    mainWindow.failToShow = true;
    dialogs.expectErrorReport("The main window cannot be shown.", errorlocation::Form2PushButton8Click, 102);

    click("PushButton8");

    EXPECT_FALSE(fs::exists(workbook));
    EXPECT_FALSE(form.isVisible());
}

TEST_F(Form2Test, SaveCopiesTheHandedOverWorkbook)
{
    handOver(picture(400, 300), workbook);
    const fs::path target = folder / "plan.xls";
    dialogs.expect(SaveFileRequest { "Save File", "Excel Files (*.xls)|*.xls|" }, target.string());
    dialogs.expect(MessageRequest::plain("Done."));

    click("PushButton6");

    std::ifstream saved(target, std::ios::binary);
    EXPECT_EQ(std::string(std::istreambuf_iterator<char>(saved), {}), "built workbook");
    EXPECT_TRUE(fs::exists(workbook));
}

// Closes the window from inside the event loop, as the user does, and gives the loop's exit
// code: 0 when the window ended the program.
int closeInEventLoop(Form2& form)
{
    QTimer::singleShot(0, &form, &QWidget::close);
    QTimer giveUp;
    giveUp.setSingleShot(true);
    QObject::connect(&giveUp, &QTimer::timeout, [] { QCoreApplication::exit(1); });
    giveUp.start(10000);
    return QCoreApplication::exec();
}

TEST_F(Form2Test, ClosingDeletesTheWorkbookWritesTheSettingsAndEndsTheProgram)
{
    handOver(picture(400, 300), workbook);

    EXPECT_EQ(closeInEventLoop(form), 0);

    EXPECT_FALSE(fs::exists(workbook));
    EXPECT_EQ(settingsWritten, 1);
    EXPECT_EQ(mainWindow.shown, 0);
    EXPECT_FALSE(form.isVisible());
}

TEST_F(Form2Test, SettingsThatCannotBeWrittenAreToldAndTheProgramEndsAllTheSame)
{
    handOver(picture(400, 300), workbook);
    writeSettings = [] { throw SettingsError("The settings could not be saved to plan.conf."); };
    dialogs.expect(MessageRequest {
        "The settings could not be saved to plan.conf.", MessageButtons::Ok, MessageIcon::Exclamation, "" });

    EXPECT_EQ(closeInEventLoop(form), 0);

    EXPECT_FALSE(fs::exists(workbook));
}

} // namespace
} // namespace penmoor
