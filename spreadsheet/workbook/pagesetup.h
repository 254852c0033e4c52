#pragma once

#include "spreadsheet/workbook/address.h"

#include <cstdint>
#include <optional>

namespace penmoor::engine {

enum class Orientation : std::uint8_t {
    Portrait,
    Landscape,
};

enum class CommentPrinting : std::uint8_t {
    None,
    InPlace,
    AtEnd,
};

// How a sheet prints. The defaults are those of a new sheet in the desktop application.
struct PageSetup {
    std::optional<Region> printArea;
    double leftMarginInches = 0.75;
    double rightMarginInches = 0.75;
    double topMarginInches = 1.0;
    double bottomMarginInches = 1.0;
    double headerMarginInches = 0.5;
    double footerMarginInches = 0.5;
    Orientation orientation = Orientation::Portrait;
    int paperSize = 1; // the .xls paper code: 1 Letter, 9 A4, ...
    // Scaling in percent; empty when the print area is fitted to the pages below instead.
    std::optional<int> zoomPercent = 100;
    int fitToPagesWide = 1;
    int fitToPagesTall = 1;
    CommentPrinting comments = CommentPrinting::None;

    bool operator==(const PageSetup&) const = default;
};

} // namespace penmoor::engine
