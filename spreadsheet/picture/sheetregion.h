#pragma once

#include "automation/contract/value.h"

#include <array>
#include <cstdint>
#include <string>
#include <vector>

namespace penmoor::picture {

// A block of a worksheet as the picture needs it, in plain values: sizes, the palette, one
// format per cell and the values that are not empty. Rows and columns count from 0 at the
// block's top-left cell. The workbook adapter fills it; tests build it by hand.

inline constexpr int kAutomaticColor = 0; // colour index of automatic fonts and borders
inline constexpr int kNoFill = 0;

enum class HorizontalAlignment { General, Left, Center, Right };
enum class VerticalAlignment { Top, Center, Bottom };
enum class BorderWeight { None, Hairline, Thin, Medium, Thick };

struct FontSpec {
    std::string name = "Arial";
    double sizePoints = 10.0;
    bool bold = false;
    bool italic = false;
    bool underline = false;
    bool strikeout = false;

    friend bool operator==(const FontSpec&, const FontSpec&) = default;
};

struct Edge {
    BorderWeight weight = BorderWeight::None;
    int colorIndex = kAutomaticColor; // 1 to 56, or kAutomaticColor

    bool isSet() const { return weight != BorderWeight::None; }
    friend bool operator==(const Edge&, const Edge&) = default;
};

struct CellFormat {
    FontSpec font;
    int fontColorIndex = kAutomaticColor;
    std::string numberFormat = "General";
    int fillColorIndex = kNoFill; // 1 to 56, or kNoFill
    Edge left;
    Edge top;
    Edge right;
    Edge bottom;
    HorizontalAlignment horizontal = HorizontalAlignment::General;
    VerticalAlignment vertical = VerticalAlignment::Bottom;
    bool wrap = false;

    friend bool operator==(const CellFormat&, const CellFormat&) = default;
};

struct CellValue {
    int row = 0;
    int column = 0;
    xl::Value value;
};

struct CellBlock {
    int firstRow = 0;
    int firstColumn = 0;
    int lastRow = 0;
    int lastColumn = 0;

    bool contains(int row, int column) const
    {
        return row >= firstRow && row <= lastRow && column >= firstColumn && column <= lastColumn;
    }
};

struct SheetRegion {
    std::vector<double> columnWidths; // characters of the standard font
    std::vector<double> rowHeights; // points
    std::array<std::uint32_t, 56> palette {}; // entry k-1 is colour k, red + 256 * green + 65536 * blue
    std::vector<CellFormat> formats { CellFormat {} }; // the format table; entry 0 is the default
    std::vector<std::uint32_t> formatIds; // one per cell, row by row; empty means all default
    std::vector<CellValue> values; // cells that hold a value, row by row and left to right
    std::vector<CellBlock> merges; // merged areas, each shown as one cell
    bool showGridlines = true;

    int rowCount() const { return static_cast<int>(rowHeights.size()); }
    int columnCount() const { return static_cast<int>(columnWidths.size()); }
    const CellFormat& formatAt(int row, int column) const
    {
        if (formatIds.empty()) {
            return formats.front();
        }
        const std::size_t index
            = static_cast<std::size_t>(row) * columnWidths.size() + static_cast<std::size_t>(column);
        return formats[formatIds[index]];
    }
};

} // namespace penmoor::picture
