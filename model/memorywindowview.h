#pragma once

#include "model/mainwindowview.h"

#include <array>

namespace penmoor {

// The main window held in memory: what tests and the headless builder use in its place.
class MemoryWindowView final : public MainWindowView {
public:
    void replaceListEntries(std::vector<std::string> names) override;
    int listEntryCount() const override;
    void setSelectedListIndex(int index) override;
    int selectedListIndex() const override;

    std::string text(TextBox box) const override;
    void setText(TextBox box, std::string_view text) override;

    bool isOptionOn(OptionButton button) const override;
    void setOptionOn(OptionButton button, bool on) override;

    const std::vector<std::string>& listEntries() const { return m_entries; }

private:
    std::vector<std::string> m_entries;
    int m_selected = -1;
    std::array<std::string, 6> m_texts;
    std::array<bool, 3> m_options {};
};

} // namespace penmoor
