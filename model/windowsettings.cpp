#include "model/windowsettings.h"

#include "model/settingskeys.h"
#include "model/storedvalue.h"

#include <stdexcept>
#include <string>

namespace penmoor {

void LoadWindowSettings(const SettingsStore& store, MainWindowView& view, int currentYear)
{
    const std::string year = std::to_string(currentYear);
    const auto restore = [&](TextBox box, std::string_view fallback) {
        view.setText(box, store.read(std::string(controlName(box)), std::string(fallback)));
    };
    restore(TextBox::Text1, "");
    restore(TextBox::Text4, "5");
    restore(TextBox::Text2, year);
    restore(TextBox::Text3, year);
    restore(TextBox::Text6, year);
    restore(TextBox::Text7, year);
    const auto restoreOption = [&](OptionButton button, bool fallback) {
        view.setOptionOn(
            button, readStoredBoolean(store.read(std::string(controlName(button)), booleanText(fallback)), fallback));
    };
    restoreOption(OptionButton::Option3, true);
    restoreOption(OptionButton::Option2, false);
    restoreOption(OptionButton::Option1, false);
}

void StoreBoxText(SettingsStore& store, TextBox box, std::string_view text)
{
    if (box == TextBox::Text1) {
        throw std::invalid_argument("Text1 stores its text only when the main window closes");
    }
    store.write(std::string(controlName(box)), std::string(text));
}

void StoreOptionStates(SettingsStore& store, const MainWindowView& view)
{
    for (const OptionButton button : { OptionButton::Option3, OptionButton::Option1, OptionButton::Option2 }) {
        store.write(std::string(controlName(button)), booleanText(view.isOptionOn(button)));
    }
}

} // namespace penmoor
