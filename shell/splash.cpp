#include "shell/splash.h"

#include "shell/developmentrun.h"
#include "shell/fileutils.h"
#include "shell/qtpaths.h"
#include "shell/splashrules.h"
#include "shell/windowutils.h"

#include <QCheckBox>
#include <QEventLoop>
#include <QGuiApplication>
#include <QPainter>
#include <QScreen>
#include <QTimer>

namespace penmoor {

namespace {

using std::chrono::milliseconds;

milliseconds standardWaitTime(const std::filesystem::path& programFolder)
{
    return IsInIDE(programFolder) ? milliseconds(400) : milliseconds(4000);
}

// A picture larger than the screen is shown scaled down, so the check box stays reachable.
QPixmap fittedToScreen(const QPixmap& picture, const QScreen* screen)
{
    if (!screen) {
        return picture;
    }
    const QSize room = screen->availableGeometry().size() - QSize(0, Splash::kStripHeight);
    if (picture.width() <= room.width() && picture.height() <= room.height()) {
        return picture;
    }
    return picture.scaled(room, Qt::KeepAspectRatio, Qt::SmoothTransformation);
}

} // namespace

Splash::Splash(
    SettingsStore& settings, std::filesystem::path programFolder, std::optional<milliseconds> waitTime, QWidget* parent)
    : QWidget(parent, Qt::SplashScreen | Qt::FramelessWindowHint)
    , m_settings(settings)
    , m_programFolder(std::move(programFolder))
    , m_waitTime(waitTime.value_or(standardWaitTime(m_programFolder)))
    , m_check(new QCheckBox(tr("Hide this at next startup"), this))
{
    setObjectName(QStringLiteral("Splash"));
    m_check->setObjectName(QStringLiteral("Check1"));
    connect(m_check, &QCheckBox::clicked, this,
        [this](bool ticked) { m_settings.write(std::string(kShowAgainKey), ticked ? "1" : "0"); });
}

bool Splash::SplashShow()
{
    if (m_used) {
        return false;
    }
    m_used = true;
    if (!isSplashWanted(m_settings)) {
        return false;
    }
    const std::filesystem::path picturePath = splashPicturePath(m_programFolder);
    if (!FileExists(picturePath) || !m_picture.load(toQString(picturePath))) {
        return false;
    }
    setWindowTitle(QStringLiteral("Penmoor"));
    m_picture = fittedToScreen(m_picture, screen());

    const int width = m_picture.width();
    const int height = m_picture.height() + kStripHeight;
    setFixedSize(width, height);
    // The check box sits in the strip, one pixel above the bottom frame line.
    const int checkHeight = std::min(m_check->sizeHint().height(), kStripHeight - 1);
    m_check->setGeometry(4, height - checkHeight - 1, std::min(m_check->sizeHint().width(), width - 8), checkHeight);

    CenterForm(*this);
    show();
    WaitSeconds();
    hide();
    return true;
}

void Splash::WaitSeconds()
{
    // A timer ends the wait, so the processor sleeps while the window waits and repaints,
    // and the check box works; the timer's clock never jumps at midnight.
    QEventLoop loop;
    QTimer::singleShot(m_waitTime, &loop, &QEventLoop::quit);
    loop.exec();
}

void Splash::paintEvent(QPaintEvent*)
{
    QPainter painter(this);
    painter.drawPixmap(0, 0, m_picture);
    // The frame: one line along each edge of the window.
    painter.setPen(palette().color(QPalette::WindowText));
    const QRect edges = rect();
    painter.drawLine(edges.topLeft(), edges.bottomLeft());
    painter.drawLine(edges.topLeft(), edges.topRight());
    painter.drawLine(edges.topRight(), edges.bottomRight());
    painter.drawLine(edges.bottomLeft(), edges.bottomRight());
}

} // namespace penmoor
