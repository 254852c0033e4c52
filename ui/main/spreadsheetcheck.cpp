#include "ui/main/spreadsheetcheck.h"

#include <exception>

namespace penmoor {

bool CheckExcelInstalled(xl::ApplicationFactory& spreadsheets, Dialogs& dialogs)
{
    bool created = false;
    try {
        created = spreadsheets.create() != nullptr;
    } catch (const std::exception&) {
        // Any failure to create one means the same to the user: there is none to use.
        created = false;
    }
    if (!created) {
        dialogs.showMessage(MessageRequest::plain(
            "Excel is not installed on this computer. You need to have it installed to use this software."));
    }
    return created;
}

} // namespace penmoor
