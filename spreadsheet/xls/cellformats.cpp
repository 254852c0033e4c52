#include "spreadsheet/xls/cellformats.h"

#include "spreadsheet/xls/formaterror.h"
#include "spreadsheet/xls/numberformats.h"
#include "spreadsheet/xls/unicode.h"

#include <algorithm>
#include <cmath>

namespace penmoor::xls {

namespace {

using namespace engine;

constexpr std::uint16_t kUnused = 0xFFFF;
// XF 0-14 are style XFs; XF 15 is the default cell format; the workbook's own start at 16.
constexpr std::uint16_t kDefaultXfCount = 16;
constexpr std::uint16_t kDefaultCellXf = 15;
// Excel 97-2003 holds about 4000 distinct cell formats and should have at most 510 fonts.
constexpr std::size_t kMaxCellFormats = 4000;
constexpr std::size_t kMaxFonts = 510;
// Font index 4 does not exist in the file: the fifth font record is index 5.
constexpr std::uint16_t kDefaultFontCount = 4;
constexpr std::uint16_t kFirstAddedFont = 5;
// Every attribute of a cell XF is its own, not the parent style's.
constexpr std::uint8_t kAllAttributesOwn = 0xFC;
constexpr std::uint8_t kStyleXfAttributes = 0xF4;
constexpr std::uint8_t kNormalStyle = 0;

FontRecord fontRecord(const Font& font)
{
    FontRecord record;
    record.heightTwips = static_cast<std::uint16_t>(std::lround(font.sizePoints * 20));
    record.bold = font.bold;
    record.italic = font.italic;
    record.colour = fontColourIcv(font.colorIndex);
    record.name = utf8ToUtf16(font.name);
    return record;
}

std::uint8_t lineCode(LineStyle line)
{
    switch (line) {
    case LineStyle::None:
        return 0;
    case LineStyle::Thin:
        return 1;
    case LineStyle::Medium:
        return 2;
    case LineStyle::Thick:
        return 5;
    case LineStyle::Hair:
        return 7;
    }
    return 0;
}

std::uint8_t horizontalCode(HorizontalAlignment alignment)
{
    switch (alignment) {
    case HorizontalAlignment::General:
        return 0;
    case HorizontalAlignment::Left:
        return 1;
    case HorizontalAlignment::Center:
        return 2;
    case HorizontalAlignment::Right:
        return 3;
    }
    return 0;
}

std::uint8_t verticalCode(VerticalAlignment alignment)
{
    switch (alignment) {
    case VerticalAlignment::Top:
        return 0;
    case VerticalAlignment::Center:
        return 1;
    case VerticalAlignment::Bottom:
        return 2;
    }
    return 2;
}

XfRecord defaultXf(std::uint16_t index)
{
    XfRecord xf;
    if (index == kDefaultCellXf)
        return xf;
    xf.isStyle = true;
    xf.parent = kXfNoParent;
    xf.usedAttributes = index == 0 ? 0 : kStyleXfAttributes;
    xf.font = (index == 1 || index == 2) ? 1 : (index == 3 || index == 4) ? 2 : 0;
    return xf;
}

} // namespace

std::uint16_t fontColourIcv(std::uint8_t colorIndex)
{
    return colorIndex == kAutomaticColor ? kIcvAutomaticFont : static_cast<std::uint16_t>(colorIndex + 7);
}

std::uint8_t edgeColourIcv(std::uint8_t colorIndex)
{
    return colorIndex == kAutomaticColor ? static_cast<std::uint8_t>(kIcvWindowText)
                                         : static_cast<std::uint8_t>(colorIndex + 7);
}

CellFormatTable::CellFormatTable(const StyleTable& styles)
    : m_xfOfStyle(styles.size(), kUnused)
    , m_styles(styles)
{
    // The default format is the default cell XF itself.
    m_xfOfStyle[kDefaultStyleId] = kDefaultCellXf;
}

void CellFormatTable::use(StyleId style)
{
    if (m_xfOfStyle[style] == kUnused)
        addXf(m_styles.style(style), style);
}

void CellFormatTable::addXf(const CellStyle& style, StyleId id)
{
    if (m_cellXfs.size() == kMaxCellFormats)
        throw WriteError("the workbook uses more than 4000 different cell formats, more than an .xls file can hold");
    XfRecord xf;
    xf.font = fontIndex(style.font);
    xf.format = formatIndex(style.numberFormat);
    xf.horizontal = horizontalCode(style.horizontal);
    xf.vertical = verticalCode(style.vertical);
    xf.wrap = style.wrapText;
    xf.usedAttributes = kAllAttributesOwn;
    // The model's edges and the file's are both in the order left, right, top, bottom.
    for (std::size_t side = 0; side < 4; ++side) {
        const Edge& edge = style.edges[side];
        xf.borderStyle[side] = lineCode(edge.line);
        xf.borderColour[side] = edge.line == LineStyle::None ? 0 : edgeColourIcv(edge.colorIndex);
    }
    if (style.fillColorIndex != kNoFill) {
        xf.pattern = 1;
        xf.patternColour = static_cast<std::uint8_t>(style.fillColorIndex + 7);
        xf.patternBackground = kIcvWindowText;
    }
    m_xfOfStyle[id] = static_cast<std::uint16_t>(kDefaultXfCount + m_cellXfs.size());
    m_cellXfs.push_back(xf);
}

std::uint16_t CellFormatTable::fontIndex(const Font& font)
{
    const FontRecord record = fontRecord(font);
    if (record == FontRecord {})
        return 0;
    const auto it = std::find(m_fonts.begin(), m_fonts.end(), record);
    if (it != m_fonts.end())
        return static_cast<std::uint16_t>(kFirstAddedFont + (it - m_fonts.begin()));
    if (m_fonts.size() + kDefaultFontCount == kMaxFonts)
        throw WriteError("the workbook uses more than 506 different fonts, more than an .xls file can hold");
    m_fonts.push_back(record);
    return static_cast<std::uint16_t>(kFirstAddedFont + m_fonts.size() - 1);
}

std::uint16_t CellFormatTable::formatIndex(const std::string& text)
{
    if (const auto builtin = builtinFormatIndex(text))
        return *builtin;
    const auto [it, added]
        = m_customFormats.try_emplace(text, static_cast<std::uint16_t>(kFirstCustomFormat + m_customFormats.size()));
    if (added && it->second > kLastCustomFormat)
        throw WriteError("the workbook uses more number formats than an .xls file can hold");
    return it->second;
}

void CellFormatTable::write(RecordWriter& writer) const
{
    for (std::uint16_t i = 0; i < kDefaultFontCount; ++i)
        writeFont(writer, FontRecord {});
    for (const FontRecord& font : m_fonts)
        writeFont(writer, font);

    for (const LocaleFormat& format : currencyFormats())
        writeFormat(writer, { format.index, utf8ToUtf16(format.text) });
    // By index, so the records come out in a fixed order.
    std::vector<std::pair<std::uint16_t, const std::string*>> custom;
    for (const auto& [text, index] : m_customFormats)
        custom.emplace_back(index, &text);
    std::sort(custom.begin(), custom.end());
    for (const auto& [index, text] : custom)
        writeFormat(writer, { index, utf8ToUtf16(*text) });

    for (std::uint16_t i = 0; i < kDefaultXfCount; ++i)
        writeXf(writer, defaultXf(i));
    for (const XfRecord& xf : m_cellXfs)
        writeXf(writer, xf);
    writeBuiltinStyle(writer, 0, kNormalStyle);
}

} // namespace penmoor::xls
