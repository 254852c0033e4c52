#pragma once

#include "spreadsheet/workbook/workbook.h"
#include "spreadsheet/xls/globalsrecords.h"

#include <cstdint>
#include <map>
#include <optional>
#include <span>
#include <string>
#include <vector>

namespace penmoor::xls {

struct SheetEntry {
    std::u16string name;
    std::uint32_t position = 0;
};

// What the globals substream says about the whole workbook, and the mapping of its cell
// formats (XF records) onto the model's formats.
class WorkbookGlobals {
public:
    // Reads the globals from the start of the Workbook stream up to their EOF. Raises
    // FormatError on a record that breaks the format.
    explicit WorkbookGlobals(std::span<const std::uint8_t> stream);

    const std::vector<SheetEntry>& worksheets() const { return m_worksheets; }
    const std::vector<std::string>& strings() const { return m_strings; }
    std::optional<Palette> palette() const { return m_palette; }
    bool dates1904() const { return m_dates1904; }
    // The worksheet (index into worksheets()) shown first, if the file says.
    std::optional<int> activeWorksheet() const { return m_activeWorksheet; }
    // Print areas by worksheet index, 0-based rows and columns.
    const std::map<int, CellArea>& printAreas() const { return m_printAreas; }

    // The model's format for an XF, interned in `styles` on first use; FormatError for an XF,
    // font or colour the file does not define.
    engine::StyleId style(std::uint16_t xf, engine::StyleTable& styles);
    // The number format text of an XF.
    std::string numberFormat(std::uint16_t xf) const;

private:
    engine::CellStyle convert(std::uint16_t xf) const;
    std::uint8_t colourIndex(std::uint16_t icv) const;
    std::uint8_t fixedColourIndex(std::uint16_t icv) const;

    std::vector<FontRecord> m_fonts;
    std::map<std::uint16_t, std::string> m_formats;
    std::vector<XfRecord> m_xfs;
    std::vector<std::optional<engine::StyleId>> m_styleOfXf;
    std::optional<Palette> m_palette;
    std::vector<SheetEntry> m_worksheets;
    std::vector<std::string> m_strings;
    std::map<int, CellArea> m_printAreas;
    std::optional<int> m_activeWorksheet;
    bool m_dates1904 = false;
};

} // namespace penmoor::xls
