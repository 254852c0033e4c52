#include "ui/preview/picturebox.h"

#include <QMouseEvent>
#include <QPainter>

namespace penmoor {

PictureBox::PictureBox(QWidget* parent)
    : QWidget(parent)
{
    // Every pixel is painted here, so nothing behind the box needs painting first.
    setAttribute(Qt::WA_OpaquePaintEvent);
}

void PictureBox::setImage(const QImage& image)
{
    m_image = image;
    update();
}

void PictureBox::paintEvent(QPaintEvent* event)
{
    QPainter painter(this);
    painter.fillRect(event->rect(), Qt::white);
    painter.drawImage(event->rect().topLeft(), m_image, event->rect());
}

void PictureBox::mousePressEvent(QMouseEvent* event)
{
    emit pressed(event->position().toPoint());
}

void PictureBox::mouseMoveEvent(QMouseEvent* event)
{
    if (event->buttons() != Qt::NoButton) {
        emit dragged(event->position().toPoint());
    }
}

void PictureBox::mouseReleaseEvent(QMouseEvent*)
{
    emit released();
}

} // namespace penmoor
