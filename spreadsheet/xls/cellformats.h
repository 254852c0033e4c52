#pragma once

#include "spreadsheet/workbook/workbook.h"
#include "spreadsheet/xls/globalsrecords.h"

#include <cstdint>
#include <map>
#include <string>
#include <vector>

namespace penmoor::xls {

// The workbook's formats as the file keeps them: fonts, number formats and one cell XF per
// format the sheets use, shared by every cell, row and column with that format. Formats the
// model keeps but no sheet uses are left out: the writer announces each one it meets.
class CellFormatTable {
public:
    explicit CellFormatTable(const engine::StyleTable& styles);

    // Gives a format its XF on first use. Raises WriteError when the sheets use more formats
    // or fonts than the file can hold.
    void use(engine::StyleId style);
    // The XF of a format announced with use().
    std::uint16_t xf(engine::StyleId style) const { return m_xfOfStyle[style]; }

    // FONT, FORMAT, XF and STYLE records, in the order the globals need them.
    void write(RecordWriter& writer) const;

private:
    void addXf(const engine::CellStyle& style, engine::StyleId id);
    std::uint16_t fontIndex(const engine::Font& font);
    std::uint16_t formatIndex(const std::string& text);

    std::vector<std::uint16_t> m_xfOfStyle; // by style id; unused ones stay kUnused
    std::vector<FontRecord> m_fonts; // past the four default fonts
    std::map<std::string, std::uint16_t> m_customFormats;
    std::vector<XfRecord> m_cellXfs; // past the 16 default XFs
    const engine::StyleTable& m_styles;
};

// Colour index conversions between the model (1 to 56 in the palette, 0 automatic) and the file.
std::uint16_t fontColourIcv(std::uint8_t colorIndex);
std::uint8_t edgeColourIcv(std::uint8_t colorIndex);

} // namespace penmoor::xls
