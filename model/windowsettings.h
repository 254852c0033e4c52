#pragma once

#include "model/mainwindowview.h"
#include "model/settingsstore.h"

#include <string_view>

namespace penmoor {

// The settings the main window keeps under its controls' own names,
// written at once on every change (the item list and the options at close are Options').

// Start-up, before LoadOptions: "Text1", "Text4", "Text2", "Text3", "Text6", "Text7" as stored
// (the year boxes default to currentYear, "Text4" to "5"), then "Option3" (default on),
// "Option2" and "Option1" (default off) read as booleans, in this order.
void LoadWindowSettings(const SettingsStore& store, MainWindowView& view, int currentYear);

// A change of Text2, Text3, Text4, Text6 or Text7 stores the new text under the box's name.
// Text1 has no such handler (its text is stored as "Company" at close): passing it throws
// std::invalid_argument.
void StoreBoxText(SettingsStore& store, TextBox box, std::string_view text);

// A click of any option button stores "Option3", "Option1" and "Option2", in this order,
// each with its own button's state.
void StoreOptionStates(SettingsStore& store, const MainWindowView& view);

} // namespace penmoor
