#pragma once

#include "automation/mainwindow.h"
#include "model/mainwindowview.h"
#include "model/options.h"
#include "shell/dialogs.h"

#include <cstddef>
#include <string_view>

namespace penmoor {

class ReportingProcedure;

// A new or changed name needs this many characters (letters, not bytes), blanks included.
inline constexpr std::size_t kShortestItemName = 3;

// An answer that is empty once the blanks at its ends are gone: Cancel, or nothing typed.
// Such an answer is dropped silently; any other is used exactly as typed.
bool isBlankAnswer(std::string_view answer);
// Fewer than kShortestItemName characters, counted on the answer as typed.
bool isTooShortName(std::string_view answer);

// The four buttons of the "Template Items" frame. Each asks the user, checks the answer and
// changes the item list only through the Options, with the main window's drawing locked around
// each change. Every failure is shown in the error report of the clicked button.
class ItemEditor {
public:
    // The index of the PushButton2 control array.
    enum EditButton {
        InsertNewBelowSelected = 0,
        RenameSelected = 1,
        DeleteSelected = 2,
    };

    // Everything passed in must outlive the editor.
    ItemEditor(Options& options, MainWindowView& list, MainWindow& window, Dialogs& dialogs);

    // A click of PushButton2(index); an index outside the array does nothing.
    void PushButton2_Click(int index);
    // "Restore Default Template Items", also run by "Clear/Reset Data".
    void PushButton3_Click();

private:
    void insertNewBelowSelected(ReportingProcedure& procedure);
    void renameSelected(ReportingProcedure& procedure);
    void deleteSelected(ReportingProcedure& procedure);
    // "Such row exist already.", then the existing item becomes the selected entry.
    void showExisting(ReportingProcedure& procedure, int line, int position);
    // Three statements from line on: lock the drawing, change, release the lock. The release
    // runs even when the change failed and was reported. True when the change completed.
    template <typename Change> bool lockedStep(ReportingProcedure& procedure, int line, Change&& change);

    Options& m_options;
    MainWindowView& m_list;
    MainWindow& m_window;
    Dialogs& m_dialogs;
};

} // namespace penmoor
