#include "ui/preview/form2.h"

#include "shell/applicationicon.h"
#include "shell/errorreport.h"
#include "shell/fileutils.h"
#include "shell/handpointer.h"
#include "shell/windowutils.h"
#include "ui/preview/picturebox.h"
#include "ui/preview/pictureimage.h"
#include "ui/preview/saveresults.h"

#include <algorithm>
#include <cstdlib>
#include <exception>
#include <utility>

#include <QCloseEvent>
#include <QCoreApplication>
#include <QGroupBox>
#include <QPushButton>
#include <QScrollBar>
#include <QSignalBlocker>
#include <QWheelEvent>

namespace penmoor {

namespace {

// Design positions in pixels, in the client area (the zoom buttons in Frame1).
constexpr QRect kPicture2Rect { 8, 8, 622, 495 };
constexpr QRect kVScroll1Rect { 630, 8, 17, 495 };
constexpr QRect kHScroll1Rect { 8, 503, 622, 17 };
constexpr QRect kFrame1Rect { 8, 524, 640, 57 };
constexpr QRect kPushButton1Rect { 16, 20, 296, 27 };
constexpr QRect kPushButton2Rect { 320, 20, 304, 27 };
constexpr QRect kPushButton8Rect { 8, 590, 312, 27 };
constexpr QRect kPushButton6Rect { 328, 590, 320, 27 };

template <typename Control, typename... Arguments>
Control* placed(QWidget* parent, const char* name, QRect rect, Arguments&&... arguments)
{
    auto* control = new Control(std::forward<Arguments>(arguments)..., parent);
    control->setObjectName(QString::fromLatin1(name));
    control->setGeometry(rect);
    return control;
}

void showBar(QScrollBar& bar, const PictureScrollBar& state, int viewportExtent)
{
    const QSignalBlocker quiet(bar); // the geometry already knows; only the screen follows
    bar.setEnabled(state.enabled);
    bar.setRange(0, state.maximum);
    bar.setValue(state.value);
    bar.setSingleStep(1);
    // A page is about one viewport, which also gives the thumb its proportion.
    bar.setPageStep(std::max(1, viewportExtent / std::max(1, state.step)));
}

} // namespace

Form2::Form2(MainWindow& mainWindow, Dialogs& dialogs, SettingsWriter writeSettings,
    const std::filesystem::path& programFolder, QWidget* parent)
    : QWidget(parent, Qt::Window)
    , m_mainWindow(mainWindow)
    , m_dialogs(dialogs)
    , m_writeSettings(std::move(writeSettings))
    , m_handPointer(loadHandPointer(programFolder))
    , m_geometry({ kPicture2Rect.width(), kPicture2Rect.height() })
{
    setObjectName(QStringLiteral("Form2"));
    setWindowTitle(QStringLiteral("Preview"));
    setFixedSize(kClientWidth, kClientHeight);
    createControls();
    connectControls();

    SetStandardColors(*this);
    CenterForm(*this);
    setWindowIcon(applicationIcon());
    showGeometry();
}

void Form2::createControls()
{
    m_picture2 = placed<QWidget>(this, "Picture2", kPicture2Rect);
    // The area around a picture smaller than the viewport, a shade darker than the window.
    QPalette backdrop = m_picture2->palette();
    backdrop.setColor(QPalette::Window, backdrop.color(QPalette::Mid));
    m_picture2->setPalette(backdrop);
    m_picture2->setAutoFillBackground(true);
    m_picture2->installEventFilter(this);

    m_picture1 = placed<PictureBox>(m_picture2, "Picture1", QRect());
    m_vScroll1 = placed<QScrollBar>(this, "VScroll1", kVScroll1Rect, Qt::Vertical);
    m_hScroll1 = placed<QScrollBar>(this, "HScroll1", kHScroll1Rect, Qt::Horizontal);
    // The picture moves when a dragged thumb is let go, not while it is dragged.
    m_vScroll1->setTracking(false);
    m_hScroll1->setTracking(false);

    m_frame1 = placed<QGroupBox>(this, "Frame1", kFrame1Rect, QStringLiteral("Zoom:"));
    m_pushButton1 = placed<QPushButton>(m_frame1, "PushButton1", kPushButton1Rect, QStringLiteral("Zoom In"));
    m_pushButton2 = placed<QPushButton>(m_frame1, "PushButton2", kPushButton2Rect, QStringLiteral("Zoom Out"));
    m_pushButton8 = placed<QPushButton>(this, "PushButton8", kPushButton8Rect, QStringLiteral("< Back"));
    m_pushButton6
        = placed<QPushButton>(this, "PushButton6", kPushButton6Rect, QStringLiteral("Save Results To Excel File"));
    for (QPushButton* button : { m_pushButton1, m_pushButton2, m_pushButton8, m_pushButton6 }) {
        button->setCursor(m_handPointer);
    }
}

void Form2::connectControls()
{
    connect(m_pushButton1, &QPushButton::clicked, this,
        [this] { zoomClicked(ZoomDirection::In, errorlocation::Form2PushButton1Click); });
    connect(m_pushButton2, &QPushButton::clicked, this,
        [this] { zoomClicked(ZoomDirection::Out, errorlocation::Form2PushButton2Click); });
    connect(m_pushButton6, &QPushButton::clicked, this, &Form2::PushButton6_Click);
    connect(m_pushButton8, &QPushButton::clicked, this, &Form2::PushButton8_Click);

    connect(m_hScroll1, &QScrollBar::valueChanged, this, [this](int value) {
        m_geometry.scrollTo(Axis::Horizontal, value);
        showGeometry();
    });
    connect(m_vScroll1, &QScrollBar::valueChanged, this, [this](int value) {
        m_geometry.scrollTo(Axis::Vertical, value);
        showGeometry();
    });

    connect(m_picture1, &PictureBox::pressed, this, [this](QPoint at) { m_geometry.press({ at.x(), at.y() }); });
    connect(m_picture1, &PictureBox::dragged, this, [this](QPoint at) {
        m_geometry.dragTo({ at.x(), at.y() });
        showGeometry();
    });
    connect(m_picture1, &PictureBox::released, this, [this] {
        m_geometry.release();
        showGeometry();
    });
}

void Form2::setPicture(xl::Picture picture)
{
    showPicture(toImage(picture));
}

void Form2::showPicture(const QImage& picture)
{
    m_zoomOri = picture;
    m_geometry.setUp({ picture.width(), picture.height() });
    m_picture1->setImage(picture);
    showGeometry();
}

void Form2::setTempWorkbookPath(const std::filesystem::path& path)
{
    m_tempWorkbookPath = path;
}

void Form2::show()
{
    QWidget::show();
    raise();
    activateWindow();
}

void Form2::zoomClicked(ZoomDirection direction, std::string_view location)
{
    ReportingProcedure procedure(m_dialogs, location);
    procedure.step(100, [&] { ZoomBy(direction); });
}

void Form2::ZoomBy(ZoomDirection direction)
{
    // The step is taken on a copy, so a picture that cannot be drawn leaves everything as it was.
    PreviewGeometry next = m_geometry;
    if (next.ZoomBy(direction)) {
        m_picture1->setImage(stretched(m_zoomOri, { next.zoomed().width, next.zoomed().height }));
    }
    m_geometry = next;
    showGeometry();
}

void Form2::showGeometry()
{
    const PixelPoint at = m_geometry.position();
    const PixelSize size = m_geometry.picture();
    m_picture1->setGeometry(at.x, at.y, size.width, size.height);
    showBar(*m_hScroll1, m_geometry.bar(Axis::Horizontal), m_geometry.viewport().width);
    showBar(*m_vScroll1, m_geometry.bar(Axis::Vertical), m_geometry.viewport().height);
}

void Form2::PushButton6_Click()
{
    saveResults(m_dialogs, m_tempWorkbookPath);
}

void Form2::PushButton8_Click()
{
    ReportingProcedure procedure(m_dialogs, errorlocation::Form2PushButton8Click);
    procedure.step(100, [&] { deleteTempWorkbook(); });
    procedure.step(102, [&] { m_mainWindow.show(); });
    procedure.step(104, [&] { hide(); });
    // The picture shows a workbook that is gone; a later build that brings no picture must
    // not show it again.
    procedure.step(106, [&] { showPicture({}); });
}

void Form2::deleteTempWorkbook() const
{
    if (FileExists(m_tempWorkbookPath)) {
        DeleteFile(m_tempWorkbookPath);
    }
}

void Form2::closeEvent(QCloseEvent* event)
{
    deleteTempWorkbook();
    writeSettingsBeforeTheEnd();
    // Lets the window disappear before the program ends; input is left alone, so no button
    // of the closing window can start anything now.
    for (int round = 0; round < 2; ++round) {
        QCoreApplication::processEvents(QEventLoop::ExcludeUserInputEvents);
    }
    event->accept();
    // At once: the main window, hidden behind this one, runs no close of its own.
    QCoreApplication::exit(0);
}

void Form2::writeSettingsBeforeTheEnd()
{
    try {
        m_writeSettings();
    } catch (const std::exception& failure) {
        m_dialogs.showMessage({ failure.what(), MessageButtons::Ok, MessageIcon::Exclamation, "" });
    }
}

bool Form2::eventFilter(QObject* watched, QEvent* event)
{
    // The wheel over the picture scrolls it as over its bars: sideways when the wheel turns so.
    if (watched == m_picture2 && event->type() == QEvent::Wheel) {
        const QPoint turn = static_cast<QWheelEvent*>(event)->angleDelta();
        QScrollBar* bar = std::abs(turn.x()) > std::abs(turn.y()) ? m_hScroll1 : m_vScroll1;
        if (bar->isEnabled()) {
            QCoreApplication::sendEvent(bar, event);
        }
        return true;
    }
    return QWidget::eventFilter(watched, event);
}

} // namespace penmoor
