#pragma once

#include "spreadsheet/workbook/cell.h"

#include <optional>
#include <string>
#include <string_view>

namespace penmoor::engine {

// What typing a text into a cell gives.
struct EnteredContent {
    CellContent content;
    // The number format the cell takes on with it, if any (a date gets a date format, 10% a
    // percentage format, 1,000 a format with thousands separators).
    std::optional<std::string> numberFormat;
};

// The application's entry rules: "=" starts an R1C1 formula (raising xl::Error when it is
// malformed); a leading apostrophe makes the rest text; TRUE, FALSE and error literals such as
// #N/A are those values; a number, a percentage or a date such as 1/1/2013 (month/day/year)
// becomes a number; anything else is text, and an empty text empties the cell. A date gets the
// date format "m/d/yyyy" unless the cell's format already shows dates; percentages,
// thousands separators and exponents give their formats only to cells in General format.
EnteredContent parseCellEntry(std::string_view text, std::string_view currentFormat);

// Whether a number format shows numbers as dates or times.
bool isDateFormat(std::string_view format);

// What reading a cell's formula gives: "=" and the R1C1 formula, or the constant as it would
// be typed (a date in m/d/yyyy form, a percentage with its % sign).
std::string entryText(const CellContent& content, std::string_view numberFormat);

} // namespace penmoor::engine
