#pragma once

#include "shell/dialogs.h"

#include <QPointer>
#include <QStringList>
#include <QWidget>

namespace penmoor {

// The save dialog's filter ("Excel Files (*.xls)|*.xls|") as Qt name filters.
QStringList nameFiltersFromPairs(std::string_view filter);

// The dialogs as the user sees them: QMessageBox, QInputDialog and QFileDialog, modal over
// the given window, or over the active window when none is given.
class QtDialogs : public Dialogs {
public:
    explicit QtDialogs(QWidget* parent = nullptr);

    DialogAnswer showMessage(const MessageRequest& request) override;
    std::string askText(const InputRequest& request) override;
    std::string askSavePath(const SaveFileRequest& request) override;

private:
    QWidget* owner() const;

    QPointer<QWidget> m_parent;
};

} // namespace penmoor
