#include "spreadsheet/xls/globalsreader.h"

#include "spreadsheet/xls/biffrecords.h"
#include "spreadsheet/xls/bytereader.h"
#include "spreadsheet/xls/formaterror.h"
#include "spreadsheet/xls/numberformats.h"
#include "spreadsheet/xls/recordreader.h"
#include "spreadsheet/xls/sharedstrings.h"
#include "spreadsheet/xls/unicode.h"
#include "spreadsheet/xls/units.h"

#include <algorithm>
#include <cmath>

namespace penmoor::xls {

namespace {

using namespace engine;

constexpr std::uint8_t kSheetKindWorksheet = 0;
constexpr std::uint16_t kMissingFont = 4;

// The fixed colours of icv 0-7, as red + 256 * green + 65536 * blue.
constexpr std::uint32_t kFixedColours[]
    = { 0x000000, 0xFFFFFF, 0x0000FF, 0x00FF00, 0xFF0000, 0x00FFFF, 0xFF00FF, 0xFFFF00 };

LineStyle lineStyle(std::uint8_t code)
{
    switch (code) {
    case 0:
        return LineStyle::None;
    case 7:
        return LineStyle::Hair;
    case 2: // medium, and the medium dashed kinds
    case 8:
    case 10:
    case 12:
    case 13:
        return LineStyle::Medium;
    case 5:
    case 6: // thick and double
        return LineStyle::Thick;
    default: // thin, dashed and dotted
        return LineStyle::Thin;
    }
}

HorizontalAlignment horizontal(std::uint8_t code)
{
    switch (code) {
    case 1:
        return HorizontalAlignment::Left;
    case 2:
    case 6: // centred across the selection
        return HorizontalAlignment::Center;
    case 3:
        return HorizontalAlignment::Right;
    default:
        return HorizontalAlignment::General;
    }
}

VerticalAlignment vertical(std::uint8_t code)
{
    switch (code) {
    case 0:
        return VerticalAlignment::Top;
    case 1:
        return VerticalAlignment::Center;
    default:
        return VerticalAlignment::Bottom;
    }
}

} // namespace

WorkbookGlobals::WorkbookGlobals(std::span<const std::uint8_t> stream)
{
    RecordReader records(stream, 0);
    if (records.atEnd() || records.peekType() != biff::kBof)
        throw FormatError("the workbook stream does not start with a BOF record");
    if (parseBof(records.next().body) != biff::kBofGlobals)
        throw FormatError("the workbook stream does not start with the workbook globals");
    std::vector<int> worksheetOfBoundSheet; // -1 for sheets other than worksheets
    std::optional<std::uint16_t> activeTab;
    for (;;) {
        if (records.atEnd())
            throw FormatError("the workbook globals have no EOF record");
        const Record record = records.next();
        switch (record.type) {
        case biff::kEof:
            break;
        case biff::kFont:
            m_fonts.push_back(parseFont(record.body));
            continue;
        case biff::kFormat: {
            const FormatRecord format = parseFormat(record.body);
            m_formats[format.index] = utf16ToUtf8(format.text);
            continue;
        }
        case biff::kXf:
            m_xfs.push_back(parseXf(record.body));
            continue;
        case biff::kPalette:
            m_palette = parsePalette(record.body);
            continue;
        case biff::kDateMode:
            m_dates1904 = ByteReader(record.body, "the DATEMODE record").u16() == 1;
            continue;
        case biff::kWindow1: {
            ByteReader in(record.body, "the WINDOW1 record");
            in.skip(10);
            activeTab = in.u16();
            continue;
        }
        case biff::kBoundSheet: {
            const BoundSheetRecord sheet = parseBoundSheet(record.body);
            if (sheet.kind == kSheetKindWorksheet) {
                worksheetOfBoundSheet.push_back(static_cast<int>(m_worksheets.size()));
                m_worksheets.push_back({ sheet.name, sheet.position });
            } else {
                worksheetOfBoundSheet.push_back(-1);
            }
            continue;
        }
        case biff::kName:
            if (const auto area = parsePrintAreaName(record.body)) {
                if (area->sheet < worksheetOfBoundSheet.size() && worksheetOfBoundSheet[area->sheet] >= 0)
                    m_printAreas[worksheetOfBoundSheet[area->sheet]] = area->area;
            }
            continue;
        case biff::kSst: {
            ContinuedReader in(record, records);
            m_strings = readSharedStrings(in);
            continue;
        }
        default:
            continue; // records that carry nothing the model keeps
        }
        break;
    }
    if (activeTab && *activeTab < worksheetOfBoundSheet.size() && worksheetOfBoundSheet[*activeTab] >= 0)
        m_activeWorksheet = worksheetOfBoundSheet[*activeTab];
    m_styleOfXf.resize(m_xfs.size());
}

StyleId WorkbookGlobals::style(std::uint16_t xf, StyleTable& styles)
{
    if (xf >= m_xfs.size())
        throw FormatError("a cell refers to format " + std::to_string(xf) + ", but the file defines only "
            + std::to_string(m_xfs.size()));
    if (!m_styleOfXf[xf])
        m_styleOfXf[xf] = styles.intern(convert(xf));
    return *m_styleOfXf[xf];
}

std::string WorkbookGlobals::numberFormat(std::uint16_t xf) const
{
    const std::uint16_t index = xf < m_xfs.size() ? m_xfs[xf].format : 0;
    if (const auto it = m_formats.find(index); it != m_formats.end())
        return it->second;
    // An index neither defined nor known (a locale's own built-in) shows as General.
    return builtinFormatText(index).value_or("General");
}

CellStyle WorkbookGlobals::convert(std::uint16_t index) const
{
    const XfRecord& xf = m_xfs[index];
    if (xf.font == kMissingFont || xf.font >= m_fonts.size() + (xf.font > kMissingFont ? 1 : 0))
        throw FormatError("a format uses font " + std::to_string(xf.font) + ", which the file does not define");
    const FontRecord& font = m_fonts[xf.font > kMissingFont ? xf.font - 1 : xf.font];
    CellStyle style;
    style.font.name = utf16ToUtf8(font.name);
    style.font.sizePoints = twipsToPoints(font.heightTwips);
    style.font.bold = font.bold;
    style.font.italic = font.italic;
    style.font.colorIndex = colourIndex(font.colour);
    style.numberFormat = numberFormat(index);
    style.horizontal = horizontal(xf.horizontal);
    style.vertical = vertical(xf.vertical);
    style.wrapText = xf.wrap;
    for (std::size_t side = 0; side < 4; ++side) {
        style.edges[side].line = lineStyle(xf.borderStyle[side]);
        if (style.edges[side].line != LineStyle::None)
            style.edges[side].colorIndex = colourIndex(xf.borderColour[side]);
    }
    if (xf.pattern != 0)
        style.fillColorIndex = colourIndex(xf.patternColour);
    return style;
}

// Palette entries are icv 8-63; the fixed colours 0-7 map to the first palette entry of the
// same colour; the system colours and anything else are automatic.
std::uint8_t WorkbookGlobals::colourIndex(std::uint16_t icv) const
{
    if (icv >= kIcvPaletteFirst && icv <= kIcvPaletteLast)
        return static_cast<std::uint8_t>(icv - 7);
    if (icv < kIcvPaletteFirst)
        return fixedColourIndex(icv);
    return kAutomaticColor;
}

std::uint8_t WorkbookGlobals::fixedColourIndex(std::uint16_t icv) const
{
    if (m_palette) {
        const auto it = std::find(m_palette->begin(), m_palette->end(), kFixedColours[icv]);
        if (it != m_palette->end())
            return static_cast<std::uint8_t>(it - m_palette->begin() + 1);
    }
    // Without a match: the default palette holds the fixed colours first, in the same order.
    return static_cast<std::uint8_t>(icv + 1);
}

} // namespace penmoor::xls
