#include "spreadsheet/builtin/builtinworkbook.h"

#include "automation/contract/error.h"
#include "spreadsheet/builtin/builtinworksheet.h"
#include "spreadsheet/formula/recalculation.h"
#include "spreadsheet/xls/xlsfile.h"

#include <algorithm>
#include <filesystem>

namespace penmoor::engine {

BuiltinWorkbook::BuiltinWorkbook(WorkbookHandle workbook)
    : m_workbook(std::move(workbook))
{
}

void BuiltinWorkbook::SaveAs(const std::string& path)
{
    engine::Workbook& workbook = m_workbook.workbook();
    // The file carries every formula's result, so they must be current.
    recalculate(workbook);
    xls::saveXlsFile(workbook, path);
}

void BuiltinWorkbook::Close()
{
    m_workbook.workbook();
    closeDocument(*m_workbook.application(), m_workbook.document());
}

std::unique_ptr<xl::Worksheet> BuiltinWorkbook::ActiveSheet()
{
    engine::Workbook& workbook = m_workbook.workbook();
    return std::make_unique<BuiltinWorksheet>(
        SheetHandle(m_workbook, workbook.sheet(workbook.activeSheetIndex()).id()));
}

std::unique_ptr<xl::Sheets> BuiltinWorkbook::Sheets()
{
    m_workbook.workbook();
    return std::make_unique<BuiltinSheets>(m_workbook);
}

std::uint32_t BuiltinWorkbook::Colors(int k) const
{
    return m_workbook.workbook().color(k);
}

void BuiltinWorkbook::setColors(int k, std::uint32_t rgb)
{
    m_workbook.workbook().setColor(k, rgb);
}

BuiltinWorkbooks::BuiltinWorkbooks(std::shared_ptr<ApplicationState> application)
    : m_application(std::move(application))
{
}

std::unique_ptr<xl::Workbook> BuiltinWorkbooks::Add()
{
    m_application->checkRunning();
    auto document = std::make_shared<Document>();
    document->name = "Book" + std::to_string(m_application->nextBookNumber++);
    document->model = std::make_unique<engine::Workbook>(engine::Workbook::withDefaultSheets());
    m_application->documents.push_back(document);
    m_application->activeDocument = document;
    return std::make_unique<BuiltinWorkbook>(WorkbookHandle(m_application, document));
}

std::unique_ptr<xl::Workbook> BuiltinWorkbooks::Open(const std::string& path)
{
    m_application->checkRunning();
    auto document = std::make_shared<Document>();
    document->model = std::make_unique<engine::Workbook>(xls::openXlsFile(path));
    // Named after the file, as the desktop application shows it.
    const std::u8string fileName = std::filesystem::path(std::u8string(path.begin(), path.end())).filename().u8string();
    document->name.assign(fileName.begin(), fileName.end());
    m_application->documents.push_back(document);
    m_application->activeDocument = document;
    return std::make_unique<BuiltinWorkbook>(WorkbookHandle(m_application, document));
}

int BuiltinWorkbooks::count() const
{
    m_application->checkRunning();
    return static_cast<int>(m_application->documents.size());
}

std::unique_ptr<xl::Workbook> BuiltinWorkbooks::Item(int index)
{
    const int open = count();
    if (index < 1 || index > open)
        throw xl::Error(
            "There is no open workbook " + std::to_string(index) + " (" + std::to_string(open) + " are open).");
    return std::make_unique<BuiltinWorkbook>(
        WorkbookHandle(m_application, m_application->documents[static_cast<std::size_t>(index - 1)]));
}

void closeDocument(ApplicationState& application, const std::shared_ptr<Document>& document)
{
    std::erase(application.documents, document);
    document->model.reset();
    if (application.activeDocument == document)
        application.activeDocument = application.documents.empty() ? nullptr : application.documents.back();
}

} // namespace penmoor::engine
