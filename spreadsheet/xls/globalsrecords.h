#pragma once

#include "spreadsheet/xls/recordwriter.h"

#include <array>
#include <cstdint>
#include <optional>
#include <span>
#include <string>
#include <vector>

// The records of the workbook globals substream that carry content, each as a plain value with
// one writer and one parser. Parsers raise FormatError for a body that is too short.
namespace penmoor::xls {

// Colour indexes (icv) of fonts, borders and fills: 0-7 fixed colours, 8-63 the palette
// entries 0-55 (Excel's ColorIndex k is icv k + 7), and the system colours below.
inline constexpr std::uint16_t kIcvPaletteFirst = 8;
inline constexpr std::uint16_t kIcvPaletteLast = 63;
inline constexpr std::uint16_t kIcvWindowText = 0x40;
inline constexpr std::uint16_t kIcvWindowBackground = 0x41;
inline constexpr std::uint16_t kIcvAutomaticFont = 0x7FFF;
inline constexpr std::size_t kPaletteSize = 56;

// BOF 0x0809: version, substream kind and the build that wrote it.
void writeBof(RecordWriter& writer, std::uint16_t kind);
// The substream kind of a BOF body; FormatError unless it is BIFF8.
std::uint16_t parseBof(std::span<const std::uint8_t> body);

// FONT 0x0031: height in twips, flags, colour, weight, name.
struct FontRecord {
    std::uint16_t heightTwips = 200;
    bool bold = false;
    bool italic = false;
    bool strikeout = false;
    std::uint8_t underline = 0;
    std::uint16_t colour = kIcvAutomaticFont;
    std::u16string name = u"Arial";

    bool operator==(const FontRecord&) const = default;
};
void writeFont(RecordWriter& writer, const FontRecord& font);
FontRecord parseFont(std::span<const std::uint8_t> body);

// FORMAT 0x041E: a number format string under its index.
struct FormatRecord {
    std::uint16_t index = 0;
    std::u16string text;
};
void writeFormat(RecordWriter& writer, const FormatRecord& format);
FormatRecord parseFormat(std::span<const std::uint8_t> body);

// XF 0x00E0: one cell or style format. Edges in the order left, right, top, bottom.
struct XfRecord {
    enum Edge { kLeft, kRight, kTop, kBottom };

    std::uint16_t font = 0;
    std::uint16_t format = 0;
    bool locked = true;
    bool isStyle = false;
    std::uint16_t parent = 0; // 0xFFF for style XFs
    std::uint8_t horizontal = 0; // 0 general, 1 left, 2 centre, 3 right, ...
    std::uint8_t vertical = 2; // 0 top, 1 centre, 2 bottom, ...
    bool wrap = false;
    std::uint8_t usedAttributes = 0; // bits 0x04 format ... 0x80 protection, bits 2-7 of byte 9
    std::array<std::uint8_t, 4> borderStyle {};
    std::array<std::uint8_t, 4> borderColour {};
    std::uint8_t pattern = 0; // 0 none, 1 solid
    std::uint8_t patternColour = kIcvWindowText;
    std::uint8_t patternBackground = kIcvWindowBackground;

    bool operator==(const XfRecord&) const = default;
};
inline constexpr std::uint16_t kXfNoParent = 0xFFF;
void writeXf(RecordWriter& writer, const XfRecord& xf);
XfRecord parseXf(std::span<const std::uint8_t> body);

// STYLE 0x0293 for a built-in style (0 = Normal) on a style XF.
void writeBuiltinStyle(RecordWriter& writer, std::uint16_t xf, std::uint8_t builtinStyle);

// PALETTE 0x0092: the 56 custom colours, each red + 256 * green + 65536 * blue.
using Palette = std::array<std::uint32_t, kPaletteSize>;
void writePalette(RecordWriter& writer, const Palette& palette);
Palette parsePalette(std::span<const std::uint8_t> body);

// BOUNDSHEET 0x0085: where a sheet's substream starts, its visibility and its name. The writer
// returns the stream offset of the position field, to be patched once the sheet is laid out.
std::size_t writeBoundSheet(RecordWriter& writer, std::u16string_view name);
struct BoundSheetRecord {
    std::uint32_t position = 0;
    std::uint8_t visibility = 0;
    std::uint8_t kind = 0; // 0 worksheet
    std::u16string name;
};
BoundSheetRecord parseBoundSheet(std::span<const std::uint8_t> body);

// A block of cells by 0-based rows and columns, last ones included.
struct CellArea {
    int firstRow = 0;
    int lastRow = 0;
    int firstColumn = 0;
    int lastColumn = 0;

    bool operator==(const CellArea&) const = default;
};

// SUPBOOK 0x01AE for the workbook's own sheets, and EXTERNSHEET 0x0017 with one entry per sheet
// that a name refers to: names point at sheets through these entries.
void writeInternalSupBook(RecordWriter& writer, std::uint16_t sheetCount);
void writeExternSheet(RecordWriter& writer, std::span<const std::uint16_t> sheets);
// The sheet of each EXTERNSHEET entry (the first sheet of its range).
std::vector<std::uint16_t> parseExternSheet(std::span<const std::uint8_t> body);

// NAME 0x0018 for the built-in Print_Area of a sheet: local to the sheet (1-based in the
// record), an absolute 3-D area through an EXTERNSHEET entry.
void writePrintAreaName(RecordWriter& writer, std::uint16_t sheet, std::uint16_t externEntry, const CellArea& area);
struct PrintAreaName {
    std::uint16_t sheet = 0; // 0-based
    std::uint16_t externEntry = 0;
    CellArea area;
};
// The print area a NAME record defines, or nothing when it is another name or a form of the
// print area that is not a single 3-D area.
std::optional<PrintAreaName> parsePrintAreaName(std::span<const std::uint8_t> body);

} // namespace penmoor::xls
