#include "shell/qtdialogs.h"

#include <QApplication>
#include <QFileDialog>
#include <QInputDialog>
#include <QMessageBox>
#include <QPushButton>

namespace penmoor {

namespace {

QString fromUtf8(std::string_view text)
{
    return QString::fromUtf8(text.data(), static_cast<qsizetype>(text.size()));
}

// Texts join their lines with "\r\n" and the error report uses lone "\r"; both are breaks.
QString displayText(std::string_view text)
{
    return fromUtf8(text).replace(QStringLiteral("\r\n"), QStringLiteral("\n")).replace(u'\r', u'\n');
}

QString titleOf(std::string_view title)
{
    return fromUtf8(shownTitle(title));
}

QMessageBox::Icon qtIcon(MessageIcon icon)
{
    switch (icon) {
    case MessageIcon::Information:
        return QMessageBox::Information;
    case MessageIcon::Question:
        return QMessageBox::Question;
    case MessageIcon::Exclamation:
        return QMessageBox::Warning;
    case MessageIcon::None:
        break;
    }
    return QMessageBox::NoIcon;
}

} // namespace

QStringList nameFiltersFromPairs(std::string_view filter)
{
    QStringList parts = fromUtf8(filter).split(u'|');
    if (!parts.isEmpty() && parts.back().isEmpty()) {
        parts.removeLast();
    }
    QStringList filters;
    for (qsizetype i = 0; i + 1 < parts.size(); i += 2) {
        const QString description = parts[i].trimmed();
        const QString patterns = parts[i + 1].split(u';', Qt::SkipEmptyParts).join(u' ');
        // Qt reads the patterns from the parentheses that end the filter text.
        const QString suffix = QStringLiteral("(%1)").arg(patterns);
        filters.append(description.endsWith(suffix) ? description : description + u' ' + suffix);
    }
    return filters;
}

QtDialogs::QtDialogs(QWidget* parent)
    : m_parent(parent)
{
}

QWidget* QtDialogs::owner() const
{
    return m_parent ? m_parent.data() : QApplication::activeWindow();
}

DialogAnswer QtDialogs::showMessage(const MessageRequest& request)
{
    QMessageBox box(owner());
    box.setWindowTitle(titleOf(request.title));
    // Item names and failure texts are shown exactly as they are, never as markup.
    box.setTextFormat(Qt::PlainText);

    box.setText(displayText(request.text));
    box.setIcon(qtIcon(request.icon));
    if (request.buttons == MessageButtons::YesNo) {
        box.setStandardButtons(QMessageBox::Yes | QMessageBox::No);
        box.setDefaultButton(request.defaultButton == DialogAnswer::No ? QMessageBox::No : QMessageBox::Yes);
        box.setEscapeButton(QMessageBox::No);
    } else {
        box.setStandardButtons(QMessageBox::Ok);
        box.setDefaultButton(QMessageBox::Ok);
        box.setEscapeButton(QMessageBox::Ok);
    }
    box.exec();
    if (request.buttons == MessageButtons::Ok) {
        return DialogAnswer::Ok;
    }
    // Escape and the window's close button count as No.
    return box.standardButton(box.clickedButton()) == QMessageBox::Yes ? DialogAnswer::Yes : DialogAnswer::No;
}

std::string QtDialogs::askText(const InputRequest& request)
{
    QInputDialog dialog(owner());
    dialog.setWindowTitle(titleOf(request.title));
    dialog.setInputMode(QInputDialog::TextInput);
    dialog.setLabelText(fromUtf8(request.prompt));
    dialog.setTextValue(fromUtf8(request.defaultText));
    if (dialog.exec() != QDialog::Accepted) {
        return {};
    }
    return dialog.textValue().toStdString();
}

std::string QtDialogs::askSavePath(const SaveFileRequest& request)
{
    QFileDialog dialog(owner(), titleOf(request.title));
    dialog.setAcceptMode(QFileDialog::AcceptSave);
    dialog.setFileMode(QFileDialog::AnyFile);
    // The caller asks its own overwrite question, and the name is used exactly as typed.
    dialog.setOption(QFileDialog::DontConfirmOverwrite);
    const QStringList filters = nameFiltersFromPairs(request.filter);
    if (!filters.isEmpty()) {
        dialog.setNameFilters(filters);
    }
    if (dialog.exec() != QDialog::Accepted || dialog.selectedFiles().isEmpty()) {
        return {};
    }
    return dialog.selectedFiles().front().toStdString();
}

} // namespace penmoor
