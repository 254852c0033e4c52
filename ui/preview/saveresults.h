#pragma once

#include "shell/dialogs.h"

#include <filesystem>
#include <string_view>

namespace penmoor {

inline constexpr std::string_view kSaveDialogTitle = "Save File";
inline constexpr std::string_view kSaveDialogFilter = "Excel Files (*.xls)|*.xls|";

// "Save Results To Excel File": asks for a name and copies the workbook of the last build
// there, byte for byte, after asking before it replaces a file. The name is used exactly as the
// dialog returns it. The copy replaces an existing file only once it is complete, so a failed
// save leaves the file that was there. Failures are shown in the error report; "Done." ends
// every run. The workbook itself stays where it is.
void saveResults(Dialogs& dialogs, const std::filesystem::path& workbook);

} // namespace penmoor
