#include "spreadsheet/builtin/builtinworksheet.h"

#include "automation/contract/error.h"
#include "spreadsheet/builtin/builtinpagesetup.h"
#include "spreadsheet/builtin/builtinrange.h"

namespace penmoor::engine {

BuiltinWorksheet::BuiltinWorksheet(SheetHandle sheet)
    : m_sheet(std::move(sheet))
{
}

std::string BuiltinWorksheet::Name() const
{
    return m_sheet.sheet().name();
}

void BuiltinWorksheet::setName(const std::string& name)
{
    m_sheet.workbook().renameSheet(m_sheet.index(), name);
}

void BuiltinWorksheet::Select()
{
    m_sheet.workbook().setActiveSheet(m_sheet.index());
}

void BuiltinWorksheet::Delete()
{
    m_sheet.workbook().removeSheet(m_sheet.index());
}

std::unique_ptr<xl::Range> BuiltinWorksheet::UsedRange()
{
    return std::make_unique<BuiltinRange>(m_sheet, m_sheet.sheet().usedRange());
}

std::unique_ptr<xl::PageSetup> BuiltinWorksheet::PageSetup()
{
    m_sheet.sheet();
    return std::make_unique<BuiltinPageSetup>(m_sheet);
}

BuiltinSheets::BuiltinSheets(WorkbookHandle workbook)
    : m_workbook(std::move(workbook))
{
}

int BuiltinSheets::count() const
{
    return m_workbook.workbook().sheetCount();
}

std::unique_ptr<xl::Worksheet> BuiltinSheets::Item(int index)
{
    Workbook& workbook = m_workbook.workbook();
    if (index < 1 || index > workbook.sheetCount())
        throw xl::Error("The workbook \"" + m_workbook.name() + "\" has no sheet " + std::to_string(index) + " (it has "
            + std::to_string(workbook.sheetCount()) + ").");
    return std::make_unique<BuiltinWorksheet>(SheetHandle(m_workbook, workbook.sheet(index - 1).id()));
}

} // namespace penmoor::engine
