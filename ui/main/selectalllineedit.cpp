#include "ui/main/selectalllineedit.h"

#include <QFocusEvent>
#include <QMouseEvent>

namespace penmoor {

void SelectAllLineEdit::focusInEvent(QFocusEvent* event)
{
    QLineEdit::focusInEvent(event);
    selectAll();
    m_keepSelectionOnClick = event->reason() == Qt::MouseFocusReason;
}

void SelectAllLineEdit::mousePressEvent(QMouseEvent* event)
{
    if (m_keepSelectionOnClick && event->button() == Qt::LeftButton) {
        event->accept();
        return;
    }
    m_keepSelectionOnClick = false;
    QLineEdit::mousePressEvent(event);
}

void SelectAllLineEdit::mouseReleaseEvent(QMouseEvent* event)
{
    if (m_keepSelectionOnClick && event->button() == Qt::LeftButton) {
        m_keepSelectionOnClick = false;
        event->accept();
        return;
    }
    QLineEdit::mouseReleaseEvent(event);
}

} // namespace penmoor
