#include "ui/main/itemlist.h"

#include <stdexcept>

#include <QAbstractListModel>

namespace penmoor {

class ItemListModel : public QAbstractListModel {
public:
    using QAbstractListModel::QAbstractListModel;

    void replace(std::vector<std::string> names)
    {
        beginResetModel();
        m_names = std::move(names);
        endResetModel();
    }

    const std::vector<std::string>& names() const { return m_names; }

    int rowCount(const QModelIndex& parent = QModelIndex()) const override
    {
        return parent.isValid() ? 0 : static_cast<int>(m_names.size());
    }

    QVariant data(const QModelIndex& index, int role) const override
    {
        if (!index.isValid() || index.row() >= rowCount() || (role != Qt::DisplayRole && role != Qt::ToolTipRole)) {
            return {};
        }
        const std::string& name = m_names[static_cast<std::size_t>(index.row())];
        return QString::fromUtf8(name.data(), static_cast<qsizetype>(name.size()));
    }

private:
    std::vector<std::string> m_names;
};

ItemList::ItemList(QWidget* parent)
    : QListView(parent)
    , m_model(new ItemListModel(this))
{
    setModel(m_model);
    setSelectionMode(QAbstractItemView::SingleSelection);
    setEditTriggers(QAbstractItemView::NoEditTriggers);
    // Every row is one line of text, so the view never measures more than the rows it shows.
    setUniformItemSizes(true);
    setLayoutMode(QListView::SinglePass);
    setTextElideMode(Qt::ElideNone);
}

ItemList::~ItemList() = default;

void ItemList::replaceEntries(std::vector<std::string> names)
{
    m_model->replace(std::move(names));
}

int ItemList::entryCount() const
{
    return m_model->rowCount();
}

const std::string& ItemList::entry(int index) const
{
    if (index < 0 || index >= entryCount()) {
        throw std::out_of_range("List1 has no entry " + std::to_string(index));
    }
    return m_model->names()[static_cast<std::size_t>(index)];
}

void ItemList::setSelectedIndex(int index)
{
    if (index < -1 || index >= entryCount()) {
        throw std::out_of_range(
            "List1 has no entry " + std::to_string(index) + " among " + std::to_string(entryCount()));
    }
    if (index == -1) {
        selectionModel()->clearSelection();
        return;
    }
    const QModelIndex modelIndex = m_model->index(index);
    selectionModel()->setCurrentIndex(modelIndex, QItemSelectionModel::ClearAndSelect);
    scrollTo(modelIndex);
}

int ItemList::selectedIndex() const
{
    const QModelIndexList selected = selectionModel()->selectedIndexes();
    return selected.isEmpty() ? -1 : selected.front().row();
}

QItemSelectionModel::SelectionFlags ItemList::selectionCommand(const QModelIndex& index, const QEvent* event) const
{
    const QItemSelectionModel::SelectionFlags command = QListView::selectionCommand(index, event);
    if (command.testFlag(QItemSelectionModel::Deselect) && selectionModel()->isSelected(index)) {
        return QItemSelectionModel::NoUpdate;
    }
    return command;
}

} // namespace penmoor
