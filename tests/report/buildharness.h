#pragma once

#include "model/memorysettingsstore.h"
#include "model/memorywindowview.h"
#include "model/options.h"

#include <string>

namespace penmoor::test {

// The model and main window a build reads, started with the default item list and set to one
// period mode at a time.
struct BuildHarness {
    MemorySettingsStore store;
    MemoryWindowView view;
    Options options { store, view, [] { return 2031; } };

    BuildHarness() { options.LoadOptions(LoadMode::RestoreDefaults); }

    void byYear(const std::string& first, const std::string& last)
    {
        view.setOptionOn(OptionButton::Option1, true);
        view.setText(TextBox::Text2, first);
        view.setText(TextBox::Text3, last);
    }
    void byMonth(const std::string& first, const std::string& last)
    {
        view.setOptionOn(OptionButton::Option3, true);
        view.setText(TextBox::Text6, first);
        view.setText(TextBox::Text7, last);
    }
    void byWeek(const std::string& weeks)
    {
        view.setOptionOn(OptionButton::Option2, true);
        view.setText(TextBox::Text4, weeks);
    }
    void company(const std::string& name) { view.setText(TextBox::Text1, name); }
};

} // namespace penmoor::test
