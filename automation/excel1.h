#pragma once

#include "automation/contract/application.h"
#include "shell/dialogs.h"

#include <filesystem>
#include <memory>
#include <optional>

namespace penmoor {

// The instance routines of a build. The application objects they obtain are their own and
// never go into the shared application reference.

// A new instance in which Workbooks.Open(path) has been called; no switch is set and the
// instance stays hidden. When the file cannot be opened, the new instance is quit before the
// failure goes on to the caller, so no hidden instance is left running.
std::unique_ptr<xl::Application> OpenWorkbookInNewInstance(
    xl::ApplicationFactory& factory, const std::filesystem::path& path);

// True when an instance is running whose default value is "Microsoft Excel". Every failure
// (none running, none reachable, no value) gives false. The instance is left running.
bool IsSpreadsheetRunning(xl::ApplicationFactory& factory);

// When an instance is running, asks whether to go on anyway; true means the build must not
// go on.
bool CheckSpreadsheetOpen(xl::ApplicationFactory& factory, Dialogs& dialogs);

// The question CheckSpreadsheetOpen asks: Yes and No, no icon, the application's title.
MessageRequest spreadsheetOpenQuestion();

// The picture of the used range of the workbook's active sheet, or none when the used range
// ends in row 1 (nothing but the top row to show).
std::optional<xl::Picture> SheetPicture(xl::Workbook& workbook);

// Writes SheetPicture as the picture file, replacing a file there; writes nothing when there
// is no picture.
void SaveSheetPicture(xl::Workbook& workbook, const std::filesystem::path& file);

} // namespace penmoor
