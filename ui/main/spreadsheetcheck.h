#pragma once

#include "automation/contract/application.h"
#include "shell/dialogs.h"

namespace penmoor {

// The start-up check: when no spreadsheet application can be created, says so once; the
// program goes on either way. An instance that could be created is released at once.
// True when one could be created.
bool CheckExcelInstalled(xl::ApplicationFactory& spreadsheets, Dialogs& dialogs);

} // namespace penmoor
