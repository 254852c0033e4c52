#pragma once

#include "model/currentyear.h"
#include "model/itemindex.h"
#include "model/mainwindowview.h"
#include "model/palette.h"
#include "model/settingsstore.h"
#include "model/templateitem.h"

#include <string>
#include <string_view>
#include <vector>

namespace penmoor {

enum class LoadMode {
    FromStore, // start-up: the list and options stored at the last close, or the defaults
    RestoreDefaults, // "Restore Default Template Items": the defaults, whatever is stored
};

// The item list of the run with its derived fields, the palette, and the operations that load,
// edit and store them. It shows the list in the window's List1 and reads and writes the window's
// boxes and options through the view. Positions are 1-based throughout; List1's entry index is
// position - 1. Store and view must outlive the Options.
class Options {
public:
    Options(SettingsStore& store, MainWindowView& view, YearSource currentYear = currentCalendarYear);

    // Builds the item list, fills List1 and selects its first entry, sets Text1 to Text4 and
    // the three options, and fills the palette. Reads the store; writes nothing there.
    void LoadOptions(LoadMode mode);

    const PaletteTable& palette() const { return m_palette; }

    int count() const { return static_cast<int>(m_items.size()); }
    // Throws std::out_of_range for a position outside 1 .. count().
    const TemplateItem& item(int position) const;
    // The builder's changes to an item; names and positions change only by the editing below.
    void setIncluded(int position, bool included);
    void setSheetRow(int position, int row);

    // The highest position whose name matches name (first "&" of each ignored, letter case
    // significant); 0 when none does.
    int FindItemRow(std::string_view name) const;
    // The linkage list an item of that name gets in the current list.
    std::string ItemLinks(std::string_view name) const;
    // Sets linkage list, total kind and section flag of the item at position from its name.
    void RefreshDerivedFields(int position);
    // Recomputes every derived field and shows the list again in List1, as one update; the
    // selection is left on the last included item (the editing operations then select theirs).
    void RelistItems();

    // The editor has checked the name (3 characters or more, no match in the list) and that
    // the item renamed or deleted is no system row.
    // Inserts below position after (0 puts it first) and selects it. Throws std::length_error,
    // with a text for the user, when the list already holds kMaximumItemCount items.
    void InsertItem(const std::string& name, int after);
    // Gives the item at position at the new name and selects it.
    void RenameItem(const std::string& name, int at);
    // Removes the item at position at and selects the item that took its place, or the new
    // last item when it was the last.
    void DeleteItem(int at);
    // Before a build: each item's included flag becomes the selected state of its entry.
    void TakeListMarks();

    // The close of the main window: stores each entry's selected state under its item's name,
    // the options, the names and the list's size, then syncs the store (throws SettingsError
    // when that fails; the window closes all the same).
    void SaveOptions();

private:
    void checkPosition(int position, int lowest, int highest) const;
    // After every change of names or positions.
    void relistAndSelect(int listIndex);
    void loadStoredBoxes();
    void loadDefaultBoxes();

    SettingsStore& m_store;
    MainWindowView& m_view;
    YearSource m_currentYear;
    std::vector<TemplateItem> m_items;
    ItemIndex m_index;
    PaletteTable m_palette {};
};

} // namespace penmoor
