#include "spreadsheet/builtin/session.h"

#include "automation/contract/error.h"

namespace penmoor::engine {

void ApplicationState::checkRunning() const
{
    if (!running)
        throw xl::Error("The spreadsheet application has quit; its objects can no longer be used.");
}

WorkbookHandle::WorkbookHandle(std::shared_ptr<ApplicationState> application, std::shared_ptr<Document> document)
    : m_application(std::move(application))
    , m_document(std::move(document))
{
}

Workbook& WorkbookHandle::workbook() const
{
    m_application->checkRunning();
    if (!m_document->model)
        throw xl::Error(
            "The workbook \"" + m_document->name + "\" has been closed; its objects can no longer be used.");
    return *m_document->model;
}

SheetHandle::SheetHandle(WorkbookHandle workbook, std::uint64_t sheetId)
    : m_workbook(std::move(workbook))
    , m_sheetId(sheetId)
{
}

int SheetHandle::index() const
{
    const int index = workbook().sheetIndex(m_sheetId);
    if (index < 0)
        throw xl::Error("A sheet of the workbook \"" + m_workbook.name()
            + "\" has been deleted; its objects can no longer be used.");
    return index;
}

Sheet& SheetHandle::sheet() const
{
    return workbook().sheet(index());
}

bool SheetHandle::isActive() const
{
    const int position = index();
    return m_workbook.application()->activeDocument == m_workbook.document()
        && workbook().activeSheetIndex() == position;
}

WorkbookHandle activeWorkbook(const std::shared_ptr<ApplicationState>& application)
{
    application->checkRunning();
    if (!application->activeDocument)
        throw xl::Error("No workbook is open in the spreadsheet application.");
    return WorkbookHandle(application, application->activeDocument);
}

SheetHandle activeSheet(const std::shared_ptr<ApplicationState>& application)
{
    WorkbookHandle workbook = activeWorkbook(application);
    Workbook& model = workbook.workbook();
    const std::uint64_t id = model.sheet(model.activeSheetIndex()).id();
    return SheetHandle(std::move(workbook), id);
}

} // namespace penmoor::engine
