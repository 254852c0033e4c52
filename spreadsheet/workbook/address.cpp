#include "spreadsheet/workbook/address.h"

#include "automation/contract/error.h"

#include <algorithm>
#include <optional>

namespace penmoor::engine {

namespace {

// One side of an address: column letters, row digits, or both.
struct AddressPart {
    std::optional<long long> column;
    std::optional<long long> row;
};

// Large enough to tell "outside the sheet" from any real index without overflowing.
constexpr long long kSaturated = 1'000'000'000;

[[noreturn]] void throwMalformed(std::string_view address)
{
    throw xl::Error("The address \"" + std::string(address)
        + "\" is not a valid cell, block, row or column address (such as C5, B4:P51, 1:1 or A:A).");
}

[[noreturn]] void throwOutside(std::string_view address)
{
    throw xl::Error(
        "The address \"" + std::string(address) + "\" is outside the sheet (columns A to IV, rows 1 to 65536).");
}

bool isLetter(char c)
{
    return (c >= 'A' && c <= 'Z') || (c >= 'a' && c <= 'z');
}
bool isDigit(char c)
{
    return c >= '0' && c <= '9';
}

std::optional<AddressPart> parsePart(std::string_view text)
{
    AddressPart part;
    std::size_t i = 0;
    const auto eat = [&](char c) {
        if (i < text.size() && text[i] == c) {
            ++i;
            return true;
        }
        return false;
    };

    eat('$');
    const std::size_t lettersStart = i;
    long long column = 0;
    while (i < text.size() && isLetter(text[i])) {
        const int letter = (text[i] & ~0x20) - 'A' + 1;
        column = column >= kSaturated ? kSaturated : column * 26 + letter;
        ++i;
    }
    if (i > lettersStart)
        part.column = column;

    // A "$" between letters and digits belongs to the row and needs both sides.
    const bool rowDollar = part.column && eat('$');
    const std::size_t digitsStart = i;
    long long row = 0;
    while (i < text.size() && isDigit(text[i])) {
        row = row >= kSaturated ? kSaturated : row * 10 + (text[i] - '0');
        ++i;
    }
    if (i > digitsStart)
        part.row = row;
    else if (rowDollar)
        return std::nullopt;

    if (i != text.size() || (!part.column && !part.row))
        return std::nullopt;
    return part;
}

bool columnOnSheet(long long column)
{
    return column >= 1 && column <= kMaxColumns;
}
bool rowOnSheet(long long row)
{
    return row >= 1 && row <= kMaxRows;
}

} // namespace

std::string columnLetters(int column)
{
    std::string letters;
    while (column > 0) {
        const int digit = (column - 1) % 26;
        letters.insert(letters.begin(), static_cast<char>('A' + digit));
        column = (column - 1) / 26;
    }
    return letters;
}

namespace {

// Parses `address`, naming `shown` in the error texts.
Region parseShownAddress(std::string_view address, std::string_view shown)
{
    const std::size_t colon = address.find(':');
    const std::string_view firstText = address.substr(0, colon);
    const std::optional<AddressPart> first = parsePart(firstText);
    if (!first)
        throwMalformed(shown);

    if (colon == std::string_view::npos) {
        // A lone cell; a lone row number or column name is not a range address.
        if (!first->column || !first->row)
            throwMalformed(shown);
        if (!columnOnSheet(*first->column) || !rowOnSheet(*first->row))
            throwOutside(shown);
        const int row = static_cast<int>(*first->row);
        const int column = static_cast<int>(*first->column);
        return Region::cell(row, column);
    }

    const std::optional<AddressPart> second = parsePart(address.substr(colon + 1));
    if (!second || first->column.has_value() != second->column.has_value()
        || first->row.has_value() != second->row.has_value())
        throwMalformed(shown);

    Region region = Region::wholeSheet();
    if (first->column) {
        if (!columnOnSheet(*first->column) || !columnOnSheet(*second->column))
            throwOutside(shown);
        const int a = static_cast<int>(*first->column);
        const int b = static_cast<int>(*second->column);
        region.firstColumn = std::min(a, b);
        region.lastColumn = std::max(a, b);
    }
    if (first->row) {
        if (!rowOnSheet(*first->row) || !rowOnSheet(*second->row))
            throwOutside(shown);
        const int a = static_cast<int>(*first->row);
        const int b = static_cast<int>(*second->row);
        region.firstRow = std::min(a, b);
        region.lastRow = std::max(a, b);
    }
    return region;
}

// A lone row number or column name, which stands for that whole row or column.
bool isLonePart(std::string_view address, bool (*isPartCharacter)(char))
{
    std::string_view rest = address;
    if (!rest.empty() && rest.front() == '$')
        rest.remove_prefix(1);
    return !rest.empty() && std::all_of(rest.begin(), rest.end(), isPartCharacter);
}

} // namespace

Region parseAddress(std::string_view address)
{
    return parseShownAddress(address, address);
}

Region parseRowsAddress(std::string_view address)
{
    const Region region = isLonePart(address, isDigit)
        ? parseShownAddress(std::string(address) + ":" + std::string(address), address)
        : parseAddress(address);
    return Region::rows(region.firstRow, region.lastRow);
}

Region parseColumnsAddress(std::string_view address)
{
    const Region region = isLonePart(address, isLetter)
        ? parseShownAddress(std::string(address) + ":" + std::string(address), address)
        : parseAddress(address);
    return Region::columns(region.firstColumn, region.lastColumn);
}

std::string formatAddress(const Region& region, AddressStyle style)
{
    const std::string dollar = style == AddressStyle::Absolute ? "$" : "";
    const auto rowText = [&](int row) { return dollar + std::to_string(row); };
    const auto columnText = [&](int column) { return dollar + columnLetters(column); };

    if (region.spansAllColumns())
        return rowText(region.firstRow) + ":" + rowText(region.lastRow);
    if (region.spansAllRows())
        return columnText(region.firstColumn) + ":" + columnText(region.lastColumn);
    const std::string topLeft = columnText(region.firstColumn) + rowText(region.firstRow);
    if (region.isSingleCell())
        return topLeft;
    return topLeft + ":" + columnText(region.lastColumn) + rowText(region.lastRow);
}

} // namespace penmoor::engine
