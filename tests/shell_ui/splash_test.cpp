#include "shell/developmentrun.h"
#include "shell/splash.h"
#include "tests/support/memorysettings.h"
#include "tests/support/temporaryfolder.h"

#include <ctime>
#include <fstream>

#include <QCheckBox>
#include <QElapsedTimer>
#include <QImage>
#include <QScreen>
#include <QTimer>

#include <gtest/gtest.h>

namespace penmoor {
namespace {

using namespace std::chrono_literals;

const QColor kPictureColour(200, 40, 30);

class SplashTest : public ::testing::Test {
protected:
    void SetUp() override { std::filesystem::create_directory(program / "Splash"); }

    void addPicture(const std::string& name, QSize size)
    {
        QImage picture(size, QImage::Format_RGB32);
        picture.fill(kPictureColour);
        ASSERT_TRUE(picture.save(QString::fromStdString((program / "Splash" / name).string())));
    }

    // Runs check while the splash window is up.
    static void during(std::function<void()> check) { QTimer::singleShot(0, std::move(check)); }

    testing::TemporaryFolder program;
    testing::MemorySettings settings;
};

TEST_F(SplashTest, ShowsThePictureWithTheCheckBoxStripFramedAndCentred)
{
    addPicture("splash.png", { 400, 300 });
    Splash splash(settings, program.path(), 100ms);
    bool wasVisible = false;
    QImage shot;
    during([&] {
        wasVisible = splash.isVisible();
        shot = splash.grab().toImage();
    });
    EXPECT_TRUE(splash.SplashShow());
    EXPECT_TRUE(wasVisible);
    EXPECT_FALSE(splash.isVisible());

    EXPECT_EQ(splash.windowTitle(), "Penmoor");
    EXPECT_EQ(splash.frameGeometry().size(), QSize(400, 320));
    const QRect check = splash.findChild<QCheckBox*>("Check1")->geometry();
    EXPECT_GE(check.top(), 300);
    EXPECT_LE(check.bottom(), 318);
    EXPECT_EQ(splash.findChild<QCheckBox*>("Check1")->text(), "Hide this at next startup");

    const QPoint centre = splash.screen()->availableGeometry().center();
    EXPECT_LE(std::abs(splash.frameGeometry().center().x() - centre.x()), 1);
    EXPECT_LE(std::abs(splash.frameGeometry().center().y() - centre.y()), 1);

    ASSERT_EQ(shot.size(), QSize(400, 320));
    const QColor line = splash.palette().color(QPalette::WindowText);
    for (const QPoint edge : { QPoint(0, 150), QPoint(399, 150), QPoint(200, 0), QPoint(200, 319) }) {
        EXPECT_EQ(shot.pixelColor(edge), line) << edge.x() << "," << edge.y();
    }
    EXPECT_EQ(shot.pixelColor(200, 150), kPictureColour);
    EXPECT_EQ(shot.pixelColor(200, 299), kPictureColour);
    EXPECT_NE(shot.pixelColor(380, 310), kPictureColour) << "the strip below the picture";
}

TEST_F(SplashTest, TheCheckBoxWritesShowAgainWhileTheWindowIsUp)
{
    addPicture("splash.png", { 200, 100 });
    Splash first(settings, program.path(), 50ms);
    during([&] {
        auto* check = first.findChild<QCheckBox*>("Check1");
        check->click();
        EXPECT_EQ(settings.values["ShowAgain"], "1");
        check->click();
        EXPECT_EQ(settings.values["ShowAgain"], "0");
        check->click();
    });
    EXPECT_TRUE(first.SplashShow());
    EXPECT_EQ(settings.values["ShowAgain"], "1");

    // The next start shows nothing; clearing the setting brings the splash back.
    Splash next(settings, program.path(), 50ms);
    EXPECT_FALSE(next.SplashShow());
    settings.values["ShowAgain"] = "0";
    Splash after(settings, program.path(), 50ms);
    EXPECT_TRUE(after.SplashShow());
}

TEST_F(SplashTest, ShowsNothingWithoutALoadablePicture)
{
    {
        Splash splash(settings, program.path(), 50ms);
        EXPECT_FALSE(splash.SplashShow()) << "empty Splash folder";
    }
    std::ofstream(program / "Splash" / "a-notes.png") << "not a picture";
    addPicture("b.png", { 50, 50 });
    {
        Splash splash(settings, program.path(), 50ms);
        EXPECT_FALSE(splash.SplashShow()) << "the first file is not a picture";
    }
    testing::TemporaryFolder noFolder;
    Splash splash(settings, noFolder.path(), 50ms);
    EXPECT_FALSE(splash.SplashShow()) << "no Splash folder";
    EXPECT_TRUE(settings.values.empty());
}

TEST_F(SplashTest, IsShownOnceAndWaitsWithoutSpinning)
{
    addPicture("splash.png", { 100, 60 });
    Splash splash(settings, program.path(), 300ms);
    const std::clock_t cpuBefore = std::clock();
    QElapsedTimer elapsed;
    elapsed.start();
    EXPECT_TRUE(splash.SplashShow());
    const double cpuSeconds = double(std::clock() - cpuBefore) / CLOCKS_PER_SEC;
    EXPECT_GE(elapsed.elapsed(), 300);
    // An idle wait costs next to no processor time; a polling loop would use all of it.
    EXPECT_LT(cpuSeconds, 0.15);

    EXPECT_FALSE(splash.SplashShow()) << "the hidden window is not shown again";
}

TEST_F(SplashTest, WaitsFourTenthsOfASecondInDevelopment)
{
    addPicture("splash.png", { 100, 60 });
    std::ofstream(program / std::string(kBuildTreeMarker)) << "";
    const QByteArray saved = qgetenv("PENMOOR_IN_IDE");
    qunsetenv("PENMOOR_IN_IDE");
    Splash splash(settings, program.path());
    QElapsedTimer elapsed;
    elapsed.start();
    EXPECT_TRUE(splash.SplashShow());
    EXPECT_GE(elapsed.elapsed(), 400);
    if (!saved.isNull()) {
        qputenv("PENMOOR_IN_IDE", saved);
    }
}

} // namespace
} // namespace penmoor
