#include "model/memorywindowview.h"

#include <stdexcept>
#include <utility>

namespace penmoor {

void MemoryWindowView::replaceListEntries(std::vector<std::string> names)
{
    m_entries = std::move(names);
    m_selected = -1;
}

int MemoryWindowView::listEntryCount() const
{
    return static_cast<int>(m_entries.size());
}

void MemoryWindowView::setSelectedListIndex(int index)
{
    if (index < -1 || index >= listEntryCount()) {
        throw std::out_of_range("List1 has no entry with index " + std::to_string(index));
    }
    m_selected = index;
}

int MemoryWindowView::selectedListIndex() const
{
    return m_selected;
}

std::string MemoryWindowView::text(TextBox box) const
{
    return m_texts[static_cast<std::size_t>(box)];
}

void MemoryWindowView::setText(TextBox box, std::string_view text)
{
    m_texts[static_cast<std::size_t>(box)] = text;
}

bool MemoryWindowView::isOptionOn(OptionButton button) const
{
    return m_options[static_cast<std::size_t>(button)];
}

void MemoryWindowView::setOptionOn(OptionButton button, bool on)
{
    if (on) {
        m_options.fill(false);
    }
    m_options[static_cast<std::size_t>(button)] = on;
}

} // namespace penmoor
