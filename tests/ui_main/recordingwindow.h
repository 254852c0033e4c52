#pragma once

#include "automation/mainwindow.h"
#include "model/memorywindowview.h"

#include <string>
#include <vector>

namespace penmoor::testing {

// The main window in memory for the editor's tests: the boxes and the list of a
// MemoryWindowView, and a drawing lock that notes whether each update of the list came while
// it was held.
class RecordingWindow final : public MainWindowView, public MainWindow {
public:
    void replaceListEntries(std::vector<std::string> names) override
    {
        events.push_back(m_locked ? "relist while locked" : "relist while drawing");
        m_view.replaceListEntries(std::move(names));
    }
    int listEntryCount() const override { return m_view.listEntryCount(); }
    void setSelectedListIndex(int index) override
    {
        events.push_back(m_locked ? "select while locked" : "select while drawing");
        m_view.setSelectedListIndex(index);
    }
    int selectedListIndex() const override { return m_view.selectedListIndex(); }
    std::string text(TextBox box) const override { return m_view.text(box); }
    void setText(TextBox box, std::string_view text) override { m_view.setText(box, text); }
    bool isOptionOn(OptionButton button) const override { return m_view.isOptionOn(button); }
    void setOptionOn(OptionButton button, bool on) override { m_view.setOptionOn(button, on); }

    void lockDrawing() override
    {
        m_locked = true;
        events.push_back("lock");
    }
    void unlockDrawing() override
    {
        m_locked = false;
        events.push_back("unlock");
    }
    void setMousePointer(MousePointer) override { }
    bool CheckPeriodOptions() override { return false; }
    void show() override { }
    void hide() override { }

    bool locked() const { return m_locked; }
    const std::vector<std::string>& entries() const { return m_view.listEntries(); }

    std::vector<std::string> events;

private:
    MemoryWindowView m_view;
    bool m_locked = false;
};

} // namespace penmoor::testing
