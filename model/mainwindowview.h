#pragma once

#include <string>
#include <string_view>
#include <vector>

namespace penmoor {

// The boxes of the main window that the model reads and writes.
enum class TextBox {
    Text1, // company name
    Text2, // first year, By Year
    Text3, // last year, By Year
    Text4, // number of weeks, By Week
    Text6, // first year, By Month
    Text7, // last year, By Month
};

// The period option group; exactly one of them is on once the window has started.
enum class OptionButton {
    Option1, // By Year
    Option2, // By Week
    Option3, // By Month
};

enum class PeriodMode { ByYear, ByMonth, ByWeek };

// The main window as the model and the sheet builder see it. The desktop window implements it
// with its widgets; MemoryWindowView is the plain implementation for tests and headless builds.
class MainWindowView {
public:
    virtual ~MainWindowView() = default;

    // List1, a single-selection list of the item names in list order (index = position - 1).
    // Replaces every entry at once, with no entry selected; a list of any length is one update.
    virtual void replaceListEntries(std::vector<std::string> names) = 0;
    virtual int listEntryCount() const = 0;
    // Selecting an entry deselects the one selected before; -1 deselects all.
    // An index outside -1 .. count - 1 is a programming error and throws std::out_of_range.
    virtual void setSelectedListIndex(int index) = 0;
    // The selected entry, -1 when none is.
    virtual int selectedListIndex() const = 0;

    virtual std::string text(TextBox box) const = 0;
    virtual void setText(TextBox box, std::string_view text) = 0;

    // Turning one button on turns the other two off; turning one off touches no other.
    virtual bool isOptionOn(OptionButton button) const = 0;
    virtual void setOptionOn(OptionButton button, bool on) = 0;
};

// The control's own name ("Text2", "Option3"), which is also its settings key.
std::string_view controlName(TextBox box);
std::string_view controlName(OptionButton button);

// By Year when Option1 is on, else By Month when Option3 is on, else By Week.
PeriodMode periodMode(const MainWindowView& view);

} // namespace penmoor
