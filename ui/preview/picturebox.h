#pragma once

#include <QImage>
#include <QWidget>

namespace penmoor {

// Picture1: shows the picture as last drawn on a white background, and reports the mouse so
// that the window can drag it. Positions are inside the box.
class PictureBox : public QWidget {
    Q_OBJECT

public:
    explicit PictureBox(QWidget* parent = nullptr);

    // What is drawn stays until the next drawing.
    void setImage(const QImage& image);
    const QImage& image() const { return m_image; }

signals:
    void pressed(QPoint position);
    // The pointer moved while at least one button is held.
    void dragged(QPoint position);
    void released();

protected:
    void paintEvent(QPaintEvent* event) override;
    void mousePressEvent(QMouseEvent* event) override;
    void mouseMoveEvent(QMouseEvent* event) override;
    void mouseReleaseEvent(QMouseEvent* event) override;

private:
    QImage m_image;
};

} // namespace penmoor
