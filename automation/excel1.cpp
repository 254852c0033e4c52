#include "automation/excel1.h"

#include "automation/picturefile.h"
#include "shell/utf8path.h"

namespace penmoor {

namespace {

constexpr char kRunningValue[] = "Microsoft Excel";

} // namespace

std::unique_ptr<xl::Application> OpenWorkbookInNewInstance(
    xl::ApplicationFactory& factory, const std::filesystem::path& path)
{
    std::unique_ptr<xl::Application> instance = factory.create();
    try {
        instance->Workbooks()->Open(utf8Text(path));
    } catch (...) {
        try {
            instance->Quit();
        } catch (...) {
            // The failure to report is the one of Open; an instance that will not quit has
            // nothing to add to it.
        }
        throw;
    }
    return instance;
}

bool IsSpreadsheetRunning(xl::ApplicationFactory& factory)
{
    try {
        return factory.attachRunning()->Value() == kRunningValue;
    } catch (...) {
        // No running instance, one that cannot be reached or one without a value: in each
        // case the build may go ahead without asking.
        return false;
    }
}

MessageRequest spreadsheetOpenQuestion()
{
    return MessageRequest::plain("Excel may be open. It is recommended that you close Excel first.\r\n\r\n"
                                 "Would you like to proceed anyway?",
        MessageButtons::YesNo);
}

bool CheckSpreadsheetOpen(xl::ApplicationFactory& factory, Dialogs& dialogs)
{
    if (!IsSpreadsheetRunning(factory)) {
        return false;
    }
    return dialogs.showMessage(spreadsheetOpenQuestion()) != DialogAnswer::Yes;
}

std::optional<xl::Picture> SheetPicture(xl::Workbook& workbook)
{
    const std::unique_ptr<xl::Range> used = workbook.ActiveSheet()->UsedRange();
    const std::unique_ptr<xl::Range> rows = used->Rows();
    const int lastRow = rows->Item(rows->count())->Row();
    if (lastRow <= 1) {
        return std::nullopt;
    }
    return used->CopyPicture();
}

void SaveSheetPicture(xl::Workbook& workbook, const std::filesystem::path& file)
{
    if (const std::optional<xl::Picture> picture = SheetPicture(workbook)) {
        writePictureFile(file, *picture);
    }
}

} // namespace penmoor
