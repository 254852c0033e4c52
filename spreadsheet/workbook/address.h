#pragma once

#include <string>
#include <string_view>

namespace penmoor::engine {

// The limits of an .xls worksheet: columns A to IV, rows 1 to 65536.
inline constexpr int kMaxRows = 65536;
inline constexpr int kMaxColumns = 256;

// A cell of a sheet, 1-based.
struct CellPosition {
    int row = 1;
    int column = 1;

    bool operator==(const CellPosition&) const = default;
};

// A rectangular block of cells, 1-based and inclusive. Whole rows, whole columns and the whole
// sheet are blocks that reach the sheet's edges, so "A1:IV1" and "1:1" are the same region.
struct Region {
    int firstRow = 1;
    int firstColumn = 1;
    int lastRow = 1;
    int lastColumn = 1;

    static Region cell(int row, int column) { return { row, column, row, column }; }
    static Region cell(CellPosition position) { return cell(position.row, position.column); }
    static Region rows(int first, int last) { return { first, 1, last, kMaxColumns }; }
    static Region columns(int first, int last) { return { 1, first, kMaxRows, last }; }
    static Region wholeSheet() { return { 1, 1, kMaxRows, kMaxColumns }; }

    bool spansAllColumns() const { return firstColumn == 1 && lastColumn == kMaxColumns; }
    bool spansAllRows() const { return firstRow == 1 && lastRow == kMaxRows; }
    bool isWholeSheet() const { return spansAllColumns() && spansAllRows(); }
    bool isSingleCell() const { return firstRow == lastRow && firstColumn == lastColumn; }

    int rowCount() const { return lastRow - firstRow + 1; }
    int columnCount() const { return lastColumn - firstColumn + 1; }
    long long cellCount() const { return static_cast<long long>(rowCount()) * columnCount(); }
    CellPosition topLeft() const { return { firstRow, firstColumn }; }

    bool contains(CellPosition position) const
    {
        return position.row >= firstRow && position.row <= lastRow && position.column >= firstColumn
            && position.column <= lastColumn;
    }
    bool contains(const Region& other) const
    {
        return other.firstRow >= firstRow && other.lastRow <= lastRow && other.firstColumn >= firstColumn
            && other.lastColumn <= lastColumn;
    }
    bool intersects(const Region& other) const
    {
        return other.firstRow <= lastRow && other.lastRow >= firstRow && other.firstColumn <= lastColumn
            && other.lastColumn >= firstColumn;
    }
    // Whether every corner lies on the sheet and first <= last.
    bool isValid() const
    {
        return firstRow >= 1 && firstRow <= lastRow && lastRow <= kMaxRows && firstColumn >= 1
            && firstColumn <= lastColumn && lastColumn <= kMaxColumns;
    }

    bool operator==(const Region&) const = default;
};

enum class AddressStyle { Absolute, Relative };

// "A" for 1 ... "IV" for 256.
std::string columnLetters(int column);

// Parses an A1 address in either letter case, with or without "$": a cell ("C5"), a block
// ("B4:P51", corners in any order), whole rows ("1:1", "3:5") or whole columns ("A:A").
// Raises xl::Error whose text names the address when it is malformed or leaves the sheet.
Region parseAddress(std::string_view address);

// The whole rows of an address: "5", "3:5" and any cell or block address (its rows).
Region parseRowsAddress(std::string_view address);
// The whole columns of an address: "B", "A:C" and any cell or block address (its columns).
Region parseColumnsAddress(std::string_view address);

// "$B$4:$P$51", "$C$5", "$1:$1", "$A:$C", "$1:$65536" for the whole sheet (without the dollars
// for AddressStyle::Relative).
std::string formatAddress(const Region& region, AddressStyle style = AddressStyle::Absolute);

} // namespace penmoor::engine
