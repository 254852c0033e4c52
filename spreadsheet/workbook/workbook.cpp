#include "spreadsheet/workbook/workbook.h"

#include "automation/contract/error.h"
#include "spreadsheet/workbook/sheetname.h"

#include <algorithm>

namespace penmoor::engine {

Workbook::Workbook()
    : m_palette(defaultPalette())
{
}

Workbook Workbook::withDefaultSheets()
{
    Workbook workbook;
    for (const char* name : { "Sheet1", "Sheet2", "Sheet3" })
        workbook.addSheet(name);
    return workbook;
}

std::uint32_t Workbook::color(int colorIndex) const
{
    if (colorIndex < 1 || colorIndex > kPaletteSize)
        throw xl::Error("The colour index " + std::to_string(colorIndex) + " is outside the palette (1 to 56).");
    return m_palette[static_cast<std::size_t>(colorIndex - 1)];
}

void Workbook::setColor(int colorIndex, std::uint32_t rgb)
{
    color(colorIndex); // checks the index
    if (rgb > 0xFFFFFFu)
        throw xl::Error("The colour value " + std::to_string(rgb) + " for palette entry " + std::to_string(colorIndex)
            + " is not a colour (red + 256 * green + 65536 * blue, at most 16777215).");
    m_palette[static_cast<std::size_t>(colorIndex - 1)] = rgb;
}

int Workbook::sheetIndex(std::uint64_t sheetId) const
{
    const auto it = std::find_if(
        m_sheets.begin(), m_sheets.end(), [&](const std::unique_ptr<Sheet>& sheet) { return sheet->id() == sheetId; });
    return it == m_sheets.end() ? -1 : static_cast<int>(it - m_sheets.begin());
}

void Workbook::checkSheetName(const std::string& name, int renamedIndex) const
{
    checkSheetNameRules(name);
    for (int index = 0; index < sheetCount(); ++index) {
        if (index != renamedIndex && sameSheetName(sheet(index).name(), name))
            throw xl::Error("A sheet named \"" + sheet(index).name() + "\" already exists in this workbook.");
    }
}

Sheet& Workbook::addSheet(const std::string& name)
{
    checkSheetName(name, -1);
    m_sheets.push_back(std::make_unique<Sheet>(name, m_nextSheetId++));
    return *m_sheets.back();
}

void Workbook::renameSheet(int index, const std::string& name)
{
    Sheet& renamed = sheet(index);
    checkSheetName(name, index);
    renamed.m_name = name;
}

void Workbook::removeSheet(int index)
{
    sheet(index); // checks the index
    if (sheetCount() == 1)
        throw xl::Error(
            "The sheet \"" + sheet(index).name() + "\" cannot be deleted: a workbook must keep at least one sheet.");
    m_sheets.erase(m_sheets.begin() + index);
    // The sheet after the deleted one becomes active, or the new last one.
    if (m_activeSheet > index || m_activeSheet >= sheetCount())
        m_activeSheet = std::max(0, m_activeSheet - 1);
}

void Workbook::setActiveSheet(int index)
{
    sheet(index); // checks the index
    m_activeSheet = index;
}

} // namespace penmoor::engine
