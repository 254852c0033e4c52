#include "ui/main/itemeditor.h"

#include "model/itemrules.h"
#include "model/numbertext.h"
#include "shell/errorreport.h"

#include <algorithm>
#include <string>

namespace penmoor {

namespace {

const InputRequest kInsertPrompt { "Enter new row: ", "Input New Row", "" };
const InputRequest kRenamePrompt { "Rename selected row to: ", "Rename Selected Row", "" };
constexpr char kExistsAlready[] = "Such row exist already.";

// Letters, not bytes: every byte of UTF-8 text that does not continue a letter starts one.
std::size_t letterCount(std::string_view text)
{
    return static_cast<std::size_t>(
        std::count_if(text.begin(), text.end(), [](char c) { return (static_cast<unsigned char>(c) & 0xC0) != 0x80; }));
}

} // namespace

bool isBlankAnswer(std::string_view answer)
{
    return std::all_of(answer.begin(), answer.end(), isBlank);
}

bool isTooShortName(std::string_view answer)
{
    return letterCount(answer) < kShortestItemName;
}

ItemEditor::ItemEditor(Options& options, MainWindowView& list, MainWindow& window, Dialogs& dialogs)
    : m_options(options)
    , m_list(list)
    , m_window(window)
    , m_dialogs(dialogs)
{
}

template <typename Change> bool ItemEditor::lockedStep(ReportingProcedure& procedure, int line, Change&& change)
{
    procedure.step(line, [&] { m_window.lockDrawing(); });
    const bool changed = procedure.step(line + 2, std::forward<Change>(change));
    procedure.step(line + 4, [&] { m_window.unlockDrawing(); });
    return changed;
}

void ItemEditor::PushButton2_Click(int index)
{
    ReportingProcedure procedure(m_dialogs, errorlocation::Form1PushButton2Click);
    switch (index) {
    case InsertNewBelowSelected:
        insertNewBelowSelected(procedure);
        break;
    case RenameSelected:
        renameSelected(procedure);
        break;
    case DeleteSelected:
        deleteSelected(procedure);
        break;
    default:
        break;
    }
}

void ItemEditor::insertNewBelowSelected(ReportingProcedure& procedure)
{
    std::string answer;
    procedure.step(100, [&] { answer = m_dialogs.askText(kInsertPrompt); });
    if (isBlankAnswer(answer)) {
        return;
    }
    if (isTooShortName(answer)) {
        procedure.step(102, [&] { m_dialogs.showMessage(MessageRequest::plain("Length of new row is too small.")); });
        return;
    }
    const int existing = m_options.FindItemRow(answer);
    if (existing != 0) {
        showExisting(procedure, 104, existing);
        return;
    }
    const int selectedPosition = m_list.selectedListIndex() + 1;
    lockedStep(procedure, 112, [&] { m_options.InsertItem(answer, selectedPosition); });
}

void ItemEditor::renameSelected(ReportingProcedure& procedure)
{
    std::string answer;
    procedure.step(120, [&] { answer = m_dialogs.askText(kRenamePrompt); });
    if (isBlankAnswer(answer)) {
        return;
    }
    const int selectedPosition = m_list.selectedListIndex() + 1;
    bool systemItem = true;
    if (!procedure.step(122, [&] { systemItem = IsSystemItem(m_options.item(selectedPosition).name); })) {
        return;
    }
    if (systemItem) {
        procedure.step(124, [&] {
            m_dialogs.showMessage(
                MessageRequest::information("You can't rename this row.\r\nIt is reserved for system use."));
        });
        return;
    }
    if (isTooShortName(answer)) {
        procedure.step(126, [&] {
            m_dialogs.showMessage(
                MessageRequest::information("Length of new row too small.\r\nPlease, enter more then few simbols."));
        });
        return;
    }
    const int existing = m_options.FindItemRow(answer);
    if (existing != 0) {
        showExisting(procedure, 128, existing);
        return;
    }
    lockedStep(procedure, 136, [&] { m_options.RenameItem(answer, selectedPosition); });
}

void ItemEditor::deleteSelected(ReportingProcedure& procedure)
{
    const int selectedPosition = m_list.selectedListIndex() + 1;
    std::string name;
    if (!procedure.step(150, [&] { name = m_options.item(selectedPosition).name; })) {
        return;
    }
    if (IsSystemItem(name)) {
        procedure.step(152, [&] {
            m_dialogs.showMessage(
                MessageRequest::information("You can't delete this row.\r\nIt is reserved for system use."));
        });
        return;
    }
    DialogAnswer answer = DialogAnswer::No;
    procedure.step(154, [&] {
        answer
            = m_dialogs.showMessage(MessageRequest::question("Do you really want delete this row ?\r\n(" + name + ")"));
    });
    if (answer != DialogAnswer::Yes) {
        return;
    }
    lockedStep(procedure, 156, [&] { m_options.DeleteItem(selectedPosition); });
}

void ItemEditor::showExisting(ReportingProcedure& procedure, int line, int position)
{
    procedure.step(line, [&] { m_dialogs.showMessage(MessageRequest::information(kExistsAlready)); });
    lockedStep(procedure, line + 2, [&] { m_list.setSelectedListIndex(position - 1); });
}

void ItemEditor::PushButton3_Click()
{
    ReportingProcedure procedure(m_dialogs, errorlocation::Form1PushButton3Click);
    DialogAnswer answer = DialogAnswer::No;
    procedure.step(100, [&] {
        answer = m_dialogs.showMessage(MessageRequest::question("Do you really want restore default settings ?"));
    });
    if (answer != DialogAnswer::Yes) {
        return;
    }
    // A restore that failed has been reported; confirming it as well would tell the user the
    // opposite of what happened.
    if (lockedStep(procedure, 102, [&] { m_options.LoadOptions(LoadMode::RestoreDefaults); })) {
        procedure.step(108, [&] { m_dialogs.showMessage(MessageRequest::information("Default settings restored.")); });
    }
}

} // namespace penmoor
