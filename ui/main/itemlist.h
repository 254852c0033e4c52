#pragma once

#include <string>
#include <vector>

#include <QListView>

namespace penmoor {

class ItemListModel;

// List1: the names of the item list in list order, one entry selected. The entries are kept
// as the model hands them over and turned into display text only for the rows on screen, so
// replacing all of them costs next to nothing even for the longest list.
class ItemList : public QListView {
    Q_OBJECT
public:
    explicit ItemList(QWidget* parent = nullptr);
    ~ItemList() override;

    // Replaces every entry in one update; no entry is selected afterwards.
    void replaceEntries(std::vector<std::string> names);
    int entryCount() const;
    const std::string& entry(int index) const;

    // Selects the entry (and scrolls to it), deselecting the one before; -1 deselects all.
    // Throws std::out_of_range for an index outside -1 .. entryCount() - 1.
    void setSelectedIndex(int index);
    // The selected entry, -1 when none is.
    int selectedIndex() const;

protected:
    // A single-selection list lets Ctrl+click clear its one selected entry; this one keeps it,
    // because every command of the editor works on the selected entry.
    QItemSelectionModel::SelectionFlags selectionCommand(
        const QModelIndex& index, const QEvent* event = nullptr) const override;

private:
    ItemListModel* m_model;
};

} // namespace penmoor
