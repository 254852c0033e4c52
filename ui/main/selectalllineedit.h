#pragma once

#include <QLineEdit>

namespace penmoor {

// A text box that selects its whole text whenever it takes the focus, also when a click puts
// the focus there, so that typing replaces the value.
class SelectAllLineEdit : public QLineEdit {
    Q_OBJECT
public:
    using QLineEdit::QLineEdit;

protected:
    void focusInEvent(QFocusEvent* event) override;
    void mousePressEvent(QMouseEvent* event) override;
    void mouseReleaseEvent(QMouseEvent* event) override;

private:
    // Set by a focus that a mouse press brought: that press and its release keep the
    // selection instead of placing the cursor.
    bool m_keepSelectionOnClick = false;
};

} // namespace penmoor
