#pragma once

#include "spreadsheet/workbook/palette.h"
#include "spreadsheet/workbook/sheet.h"
#include "spreadsheet/workbook/style.h"

#include <cstdint>
#include <memory>
#include <string>
#include <string_view>
#include <vector>

namespace penmoor::engine {

// A workbook: its palette, its shared formats, and its sheets in order with the active one.
class Workbook {
public:
    // No sheets yet (a file reader adds them); the default palette.
    Workbook();
    // A new workbook as the desktop application makes it: Sheet1, Sheet2 and Sheet3.
    static Workbook withDefaultSheets();

    Workbook(Workbook&&) = default;
    Workbook& operator=(Workbook&&) = default;

    const Palette& palette() const { return m_palette; }
    // Raise xl::Error for an index outside 1 to 56 or a colour above 0xFFFFFF.
    std::uint32_t color(int colorIndex) const;
    void setColor(int colorIndex, std::uint32_t rgb);

    StyleTable& styles() { return m_styles; }
    const StyleTable& styles() const { return m_styles; }

    // Sheets by 0-based position.
    int sheetCount() const { return static_cast<int>(m_sheets.size()); }
    Sheet& sheet(int index) { return *m_sheets.at(static_cast<std::size_t>(index)); }
    const Sheet& sheet(int index) const { return *m_sheets.at(static_cast<std::size_t>(index)); }
    // The position of the sheet with this id, or -1 when it is not (or no longer) in the workbook.
    int sheetIndex(std::uint64_t sheetId) const;
    // Appends a sheet; raises xl::Error when the name breaks the sheet-name rules.
    Sheet& addSheet(const std::string& name);
    void renameSheet(int index, const std::string& name);
    // Raises xl::Error for the last sheet: a workbook keeps at least one.
    void removeSheet(int index);

    int activeSheetIndex() const { return m_activeSheet; }
    void setActiveSheet(int index);

private:
    void checkSheetName(const std::string& name, int renamedIndex) const;

    Palette m_palette;
    StyleTable m_styles;
    std::vector<std::unique_ptr<Sheet>> m_sheets;
    int m_activeSheet = 0;
    std::uint64_t m_nextSheetId = 1;
};

} // namespace penmoor::engine
