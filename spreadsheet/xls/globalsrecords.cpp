#include "spreadsheet/xls/globalsrecords.h"

#include "spreadsheet/xls/biffrecords.h"
#include "spreadsheet/xls/biffstrings.h"
#include "spreadsheet/xls/bytereader.h"
#include "spreadsheet/xls/formaterror.h"

namespace penmoor::xls {

namespace {

constexpr std::uint16_t kBuild = 0x0DBB;
constexpr std::uint16_t kBuildYear = 0x07CC;
constexpr std::uint32_t kLowestBiffVersion = 0x06;

constexpr std::uint16_t kFontBoldFlag = 0x0001; // only readers look at it, but xlrd reads only this
constexpr std::uint16_t kFontItalic = 0x0002;
constexpr std::uint16_t kFontStrikeout = 0x0008;
constexpr std::uint16_t kWeightNormal = 400;
constexpr std::uint16_t kWeightBold = 700;

constexpr std::uint16_t kNameBuiltin = 0x0020;
constexpr std::uint8_t kBuiltinPrintArea = 0x06;
constexpr std::uint8_t kPtgArea3d = 0x3B;
constexpr std::uint8_t kPtgRef3d = 0x3A;
constexpr std::uint16_t kSupBookSelf = 0x0401;
constexpr std::uint16_t kColumnMask = 0x00FF;

} // namespace

void writeBof(RecordWriter& writer, std::uint16_t kind)
{
    writer.begin(biff::kBof);
    ByteBuffer& out = writer.out();
    out.u16(biff::kBiff8Version);
    out.u16(kind);
    out.u16(kBuild);
    out.u16(kBuildYear);
    out.u32(0);
    out.u32(kLowestBiffVersion);
    writer.end();
}

std::uint16_t parseBof(std::span<const std::uint8_t> body)
{
    ByteReader in(body, "the BOF record");
    const std::uint16_t version = in.u16();
    const std::uint16_t kind = in.u16();
    if (version != biff::kBiff8Version)
        throw FormatError("it is an older Excel format (before Excel 97), which is not supported");
    return kind;
}

void writeFont(RecordWriter& writer, const FontRecord& font)
{
    writer.begin(biff::kFont);
    ByteBuffer& out = writer.out();
    out.u16(font.heightTwips);
    out.u16(static_cast<std::uint16_t>(
        (font.bold ? kFontBoldFlag : 0) | (font.italic ? kFontItalic : 0) | (font.strikeout ? kFontStrikeout : 0)));
    out.u16(font.colour);
    out.u16(font.bold ? kWeightBold : kWeightNormal);
    out.u16(0); // no super- or subscript
    out.u8(font.underline);
    out.u8(0); // font family: not specified
    out.u8(0); // character set: ANSI
    out.u8(0);
    writeShortString(out, font.name);
    writer.end();
}

FontRecord parseFont(std::span<const std::uint8_t> body)
{
    ByteReader in(body, "a FONT record");
    FontRecord font;
    font.heightTwips = in.u16();
    const std::uint16_t flags = in.u16();
    font.colour = in.u16();
    const std::uint16_t weight = in.u16();
    in.u16();
    font.underline = in.u8();
    in.skip(3);
    font.name = readShortString(in);
    font.bold = weight >= 600;
    font.italic = (flags & kFontItalic) != 0;
    font.strikeout = (flags & kFontStrikeout) != 0;
    return font;
}

void writeFormat(RecordWriter& writer, const FormatRecord& format)
{
    writer.begin(biff::kFormat);
    writer.out().u16(format.index);
    writeString(writer.out(), format.text);
    writer.end();
}

FormatRecord parseFormat(std::span<const std::uint8_t> body)
{
    ByteReader in(body, "a FORMAT record");
    FormatRecord format;
    format.index = in.u16();
    format.text = readString(in);
    return format;
}

void writeXf(RecordWriter& writer, const XfRecord& xf)
{
    writer.begin(biff::kXf);
    ByteBuffer& out = writer.out();
    out.u16(xf.font);
    out.u16(xf.format);
    out.u16(static_cast<std::uint16_t>((xf.locked ? 0x0001 : 0) | (xf.isStyle ? 0x0004 : 0) | (xf.parent << 4)));
    out.u8(static_cast<std::uint8_t>((xf.horizontal & 0x07) | (xf.wrap ? 0x08 : 0) | ((xf.vertical & 0x07) << 4)));
    out.u8(0); // no rotation
    out.u8(0); // no indent, no shrink to fit
    out.u8(xf.usedAttributes);
    const auto& style = xf.borderStyle;
    const auto& colour = xf.borderColour;
    out.u32(std::uint32_t { style[XfRecord::kLeft] } | (std::uint32_t { style[XfRecord::kRight] } << 4)
        | (std::uint32_t { style[XfRecord::kTop] } << 8) | (std::uint32_t { style[XfRecord::kBottom] } << 12)
        | (std::uint32_t { colour[XfRecord::kLeft] & 0x7Fu } << 16)
        | (std::uint32_t { colour[XfRecord::kRight] & 0x7Fu } << 23));
    out.u32(std::uint32_t { colour[XfRecord::kTop] & 0x7Fu }
        | (std::uint32_t { colour[XfRecord::kBottom] & 0x7Fu } << 7) | (std::uint32_t { xf.pattern & 0x3Fu } << 26));
    out.u16(static_cast<std::uint16_t>((xf.patternColour & 0x7F) | ((xf.patternBackground & 0x7F) << 7)));
    writer.end();
}

XfRecord parseXf(std::span<const std::uint8_t> body)
{
    ByteReader in(body, "an XF record");
    XfRecord xf;
    xf.font = in.u16();
    xf.format = in.u16();
    const std::uint16_t protection = in.u16();
    xf.locked = (protection & 0x0001) != 0;
    xf.isStyle = (protection & 0x0004) != 0;
    xf.parent = static_cast<std::uint16_t>(protection >> 4);
    const std::uint8_t alignment = in.u8();
    xf.horizontal = alignment & 0x07;
    xf.wrap = (alignment & 0x08) != 0;
    xf.vertical = (alignment >> 4) & 0x07;
    in.skip(2);
    xf.usedAttributes = in.u8();
    const std::uint32_t lines = in.u32();
    const std::uint32_t more = in.u32();
    const std::uint16_t fill = in.u16();
    xf.borderStyle = { static_cast<std::uint8_t>(lines & 0x0F), static_cast<std::uint8_t>((lines >> 4) & 0x0F),
        static_cast<std::uint8_t>((lines >> 8) & 0x0F), static_cast<std::uint8_t>((lines >> 12) & 0x0F) };
    xf.borderColour
        = { static_cast<std::uint8_t>((lines >> 16) & 0x7F), static_cast<std::uint8_t>((lines >> 23) & 0x7F),
              static_cast<std::uint8_t>(more & 0x7F), static_cast<std::uint8_t>((more >> 7) & 0x7F) };
    xf.pattern = static_cast<std::uint8_t>((more >> 26) & 0x3F);
    xf.patternColour = fill & 0x7F;
    xf.patternBackground = (fill >> 7) & 0x7F;
    return xf;
}

void writeBuiltinStyle(RecordWriter& writer, std::uint16_t xf, std::uint8_t builtinStyle)
{
    writer.begin(biff::kStyle);
    writer.out().u16(static_cast<std::uint16_t>(xf | 0x8000));
    writer.out().u8(builtinStyle);
    writer.out().u8(0xFF); // no outline level
    writer.end();
}

void writePalette(RecordWriter& writer, const Palette& palette)
{
    writer.begin(biff::kPalette);
    writer.out().u16(kPaletteSize);
    for (std::uint32_t rgb : palette) {
        writer.out().u8(static_cast<std::uint8_t>(rgb));
        writer.out().u8(static_cast<std::uint8_t>(rgb >> 8));
        writer.out().u8(static_cast<std::uint8_t>(rgb >> 16));
        writer.out().u8(0);
    }
    writer.end();
}

Palette parsePalette(std::span<const std::uint8_t> body)
{
    ByteReader in(body, "the PALETTE record");
    const std::uint16_t count = in.u16();
    if (count != kPaletteSize)
        throw FormatError("the palette holds " + std::to_string(count) + " colours instead of 56");
    Palette palette {};
    for (std::uint32_t& rgb : palette) {
        const auto bytes = in.bytes(4);
        rgb = std::uint32_t { bytes[0] } | (std::uint32_t { bytes[1] } << 8) | (std::uint32_t { bytes[2] } << 16);
    }
    return palette;
}

std::size_t writeBoundSheet(RecordWriter& writer, std::u16string_view name)
{
    writer.begin(biff::kBoundSheet);
    const std::size_t position = writer.offset();
    writer.out().u32(0);
    writer.out().u8(0); // visible
    writer.out().u8(0); // worksheet
    writeShortString(writer.out(), name);
    writer.end();
    return position;
}

BoundSheetRecord parseBoundSheet(std::span<const std::uint8_t> body)
{
    ByteReader in(body, "a BOUNDSHEET record");
    BoundSheetRecord sheet;
    sheet.position = in.u32();
    sheet.visibility = in.u8();
    sheet.kind = in.u8();
    sheet.name = readShortString(in);
    return sheet;
}

void writeInternalSupBook(RecordWriter& writer, std::uint16_t sheetCount)
{
    writer.begin(biff::kSupBook);
    writer.out().u16(sheetCount);
    writer.out().u16(kSupBookSelf);
    writer.end();
}

void writeExternSheet(RecordWriter& writer, std::span<const std::uint16_t> sheets)
{
    writer.begin(biff::kExternSheet);
    writer.out().u16(static_cast<std::uint16_t>(sheets.size()));
    for (std::uint16_t sheet : sheets) {
        writer.out().u16(0); // the SUPBOOK of the workbook itself
        writer.out().u16(sheet);
        writer.out().u16(sheet);
    }
    writer.end();
}

std::vector<std::uint16_t> parseExternSheet(std::span<const std::uint8_t> body)
{
    ByteReader in(body, "the EXTERNSHEET record");
    const std::size_t count = in.u16();
    if (count * 6 > in.remaining())
        throw FormatError("the EXTERNSHEET record is cut short");
    std::vector<std::uint16_t> sheets;
    for (std::size_t i = 0; i < count; ++i) {
        in.u16();
        sheets.push_back(in.u16());
        in.u16();
    }
    return sheets;
}

void writePrintAreaName(RecordWriter& writer, std::uint16_t sheet, std::uint16_t externEntry, const CellArea& area)
{
    writer.begin(biff::kName);
    ByteBuffer& out = writer.out();
    out.u16(kNameBuiltin);
    out.u8(0); // no keyboard shortcut
    out.u8(1); // the name is one character: the built-in code
    out.u16(11); // formula size
    out.u16(0);
    out.u16(static_cast<std::uint16_t>(sheet + 1));
    out.zeros(4); // no menu, description, help or status texts
    out.u8(0);
    out.u8(kBuiltinPrintArea);
    out.u8(kPtgArea3d);
    out.u16(externEntry);
    out.u16(static_cast<std::uint16_t>(area.firstRow));
    out.u16(static_cast<std::uint16_t>(area.lastRow));
    out.u16(static_cast<std::uint16_t>(area.firstColumn));
    out.u16(static_cast<std::uint16_t>(area.lastColumn));
    writer.end();
}

std::optional<PrintAreaName> parsePrintAreaName(std::span<const std::uint8_t> body)
{
    ByteReader in(body, "a NAME record");
    const std::uint16_t flags = in.u16();
    in.u8();
    const std::size_t nameLength = in.u8();
    const std::size_t formulaLength = in.u16();
    in.u16();
    const std::uint16_t sheet = in.u16();
    in.skip(4);
    const std::u16string name = readCharacters(in, nameLength, (in.u8() & biff::kStringHighByte) != 0);
    if (!(flags & kNameBuiltin) || name != std::u16string(1, kBuiltinPrintArea) || sheet == 0)
        return std::nullopt;
    ByteReader formula(in.bytes(formulaLength), "a print area");
    if (formulaLength == 0)
        return std::nullopt;
    const std::uint8_t token = formula.u8();
    const std::uint8_t base = (token & 0x1F) | 0x20;
    if (base != kPtgArea3d && base != kPtgRef3d)
        return std::nullopt;
    PrintAreaName result;
    result.sheet = static_cast<std::uint16_t>(sheet - 1);
    result.externEntry = formula.u16();
    if (base == kPtgArea3d) {
        result.area.firstRow = formula.u16();
        result.area.lastRow = formula.u16();
        result.area.firstColumn = formula.u16() & kColumnMask;
        result.area.lastColumn = formula.u16() & kColumnMask;
    } else {
        result.area.firstRow = result.area.lastRow = formula.u16();
        result.area.firstColumn = result.area.lastColumn = formula.u16() & kColumnMask;
    }
    if (result.area.firstRow > result.area.lastRow || result.area.firstColumn > result.area.lastColumn)
        throw FormatError("the print area of sheet " + std::to_string(sheet) + " is inverted");
    return result;
}

} // namespace penmoor::xls
