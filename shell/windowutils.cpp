#include "shell/windowutils.h"

#include <QApplication>
#include <QCheckBox>
#include <QGroupBox>
#include <QLabel>
#include <QRadioButton>
#include <QScreen>

namespace penmoor {

void CenterForm(QWidget& window)
{
    const QScreen* screen = window.screen() ? window.screen() : QGuiApplication::primaryScreen();
    if (!screen) {
        return;
    }
    const QRect area = screen->availableGeometry();
    const QSize outer = window.frameGeometry().size();
    window.move(area.x() + (area.width() - outer.width()) / 2, area.y() + (area.height() - outer.height()) / 2);
}

namespace {

void paintBackground(QWidget& widget, const QColor& colour)
{
    QPalette palette = widget.palette();
    palette.setColor(QPalette::Window, colour);
    widget.setPalette(palette);
    widget.setAutoFillBackground(true);
}

bool takesStandardColour(const QWidget* widget)
{
    return qobject_cast<const QLabel*>(widget) || qobject_cast<const QRadioButton*>(widget)
        || qobject_cast<const QCheckBox*>(widget) || qobject_cast<const QGroupBox*>(widget);
}

} // namespace

void SetStandardColors(QWidget& window)
{
    const QColor buttonFace = QApplication::palette().color(QPalette::Button);
    paintBackground(window, buttonFace);
    for (QWidget* child : window.findChildren<QWidget*>()) {
        // Children of a dialog owned by this window belong to that dialog.
        if (child->window() == &window && takesStandardColour(child)) {
            paintBackground(*child, buttonFace);
        }
    }
}

} // namespace penmoor
