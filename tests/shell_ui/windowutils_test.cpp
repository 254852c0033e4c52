#include "shell/skin.h"
#include "shell/windowutils.h"
#include "tests/support/temporaryfolder.h"

#include <fstream>

#include <QApplication>
#include <QCheckBox>
#include <QDialog>
#include <QGroupBox>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>
#include <QRadioButton>
#include <QScreen>

#include <gtest/gtest.h>

namespace penmoor {
namespace {

// A window with one control of each kind, and a dialog it owns.
struct TestWindow {
    TestWindow()
    {
        auto* frame = new QGroupBox("Company Name", &window);
        label = new QLabel("to", frame);
        option = new QRadioButton("By Month", frame);
        check = new QCheckBox("Hide", &window);
        edit = new QLineEdit(&window);
        button = new QPushButton("Start", &window);
        dialog = new QDialog(&window);
        dialogLabel = new QLabel("inside a dialog", dialog);
        groupBox = frame;
    }

    QWidget window;
    QGroupBox* groupBox;
    QLabel* label;
    QRadioButton* option;
    QCheckBox* check;
    QLineEdit* edit;
    QPushButton* button;
    QDialog* dialog;
    QLabel* dialogLabel;
};

class WindowUtilsTest : public ::testing::Test {
protected:
    void SetUp() override
    {
        saved = QApplication::palette();
        QPalette distinct = saved;
        distinct.setColor(QPalette::Button, buttonFace);
        QApplication::setPalette(distinct);
    }
    void TearDown() override { QApplication::setPalette(saved); }

    static bool hasStandardColour(const QWidget* widget)
    {
        return widget->testAttribute(Qt::WA_SetPalette) && widget->autoFillBackground()
            && widget->palette().color(QPalette::Window) == buttonFace;
    }

    static inline const QColor buttonFace { 0x12, 0x34, 0x56 };
    QPalette saved;
};

TEST_F(WindowUtilsTest, CenterFormPlacesTheWindowInTheMiddleOfTheScreen)
{
    QWidget window;
    window.resize(300, 200);
    CenterForm(window);
    const QPoint centre = window.screen()->availableGeometry().center();
    EXPECT_LE(std::abs(window.frameGeometry().center().x() - centre.x()), 1);
    EXPECT_LE(std::abs(window.frameGeometry().center().y() - centre.y()), 1);
}

TEST_F(WindowUtilsTest, StandardColoursReachOnlyTheWindowAndItsLabelsOptionsChecksAndFrames)
{
    TestWindow w;
    SetStandardColors(w.window);
    for (const QWidget* widget :
        std::initializer_list<const QWidget*> { &w.window, w.groupBox, w.label, w.option, w.check }) {
        EXPECT_TRUE(hasStandardColour(widget)) << widget->metaObject()->className();
    }
    for (const QWidget* widget : std::initializer_list<const QWidget*> { w.edit, w.button, w.dialogLabel }) {
        EXPECT_FALSE(widget->testAttribute(Qt::WA_SetPalette)) << widget->metaObject()->className();
    }
}

TEST_F(WindowUtilsTest, ApplySkinNeedsTheSkinFile)
{
    testing::TemporaryFolder program;
    {
        TestWindow w;
        EXPECT_FALSE(ApplySkin(w.window, program.path()));
        EXPECT_TRUE(w.window.styleSheet().isEmpty());
        EXPECT_FALSE(w.window.testAttribute(Qt::WA_SetPalette));
    }
    std::filesystem::create_directories(program / "x" / "o.cjs");
    {
        TestWindow w;
        EXPECT_FALSE(ApplySkin(w.window, program.path())) << "a folder of that name is no skin";
        EXPECT_FALSE(w.window.testAttribute(Qt::WA_SetPalette));
    }
    std::filesystem::remove(program / "x" / "o.cjs");
    const std::string sheet = "QPushButton { color: #a01010; } /* Grün */";
    std::ofstream(program / "x" / "o.cjs") << sheet;
    TestWindow w;
    EXPECT_TRUE(ApplySkin(w.window, program.path()));
    EXPECT_EQ(w.window.styleSheet().toStdString(), sheet);
    EXPECT_TRUE(hasStandardColour(&w.window));
    EXPECT_TRUE(hasStandardColour(w.label));
}

} // namespace
} // namespace penmoor
