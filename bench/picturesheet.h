#pragma once

#include "spreadsheet/picture/sheetregion.h"

#include <string>

namespace penmoor::bench {

// A block that looks like the cash-flow sheet: margin, label, pre-startup, monthly and total
// columns; title block and shaded heading row; item rows in a thin grid with section headings
// and shaded total rows; whole numbers in "#,##0". Each section adds a spacer, a heading, items
// per section plus a total row, so the block grows in rows while keeping its look. Three
// sections of twelve items give the 47 item rows of the default sheet.
inline picture::SheetRegion cashFlowLikeRegion(int sections, int itemsPerSection = 12, int periodColumns = 12)
{
    using namespace picture;
    SheetRegion region;
    const int lastColumn = periodColumns + 3; // A label, B pre-startup, periods, total (0-based)
    region.columnWidths = { 1.0, 32.0, 10.83 };
    for (int k = 0; k < periodColumns; ++k) {
        region.columnWidths.push_back(8.33);
    }
    region.columnWidths.push_back(9.17);
    region.rowHeights = { 11.25, 27.75, 3.75, 24.75 };
    for (std::size_t k = 0; k < region.palette.size(); ++k) {
        region.palette[k] = 0xFFFFFF;
    }
    region.palette[11] = 95 << 16 | 82 << 8 | 55; // title text
    region.palette[15] = 0x808080; // grid
    region.palette[38] = 215 << 16 | 255 << 8 | 224; // total figures
    region.palette[42] = 153 << 16 | 204 << 8 | 255; // section headings
    region.palette[54] = 204 << 16 | 255 << 8 | 204; // headings and total labels

    CellFormat page;
    page.fillColorIndex = 2;
    const Edge grid { BorderWeight::Thin, 16 };
    CellFormat gridded = page;
    gridded.left = gridded.right = gridded.top = gridded.bottom = grid;
    gridded.vertical = VerticalAlignment::Center;
    CellFormat figure = gridded;
    figure.numberFormat = "#,##0";
    CellFormat heading = gridded;
    heading.fillColorIndex = 55;
    heading.font = { "Arial", 9.0, true };
    heading.horizontal = HorizontalAlignment::Center;
    heading.wrap = true;
    CellFormat month = heading;
    month.numberFormat = "mmm-yy";
    CellFormat section = gridded;
    section.fillColorIndex = 43;
    section.font = { "Arial", 9.0, true };
    CellFormat totalLabel = heading;
    totalLabel.horizontal = HorizontalAlignment::General;
    CellFormat totalFigure = figure;
    totalFigure.fillColorIndex = 39;
    CellFormat title = page;
    title.font = { "Arial", 19.0, true };
    title.fontColorIndex = 12;
    region.formats.resize(1);
    for (const CellFormat* format :
        { &page, &gridded, &figure, &heading, &month, &section, &totalLabel, &totalFigure, &title }) {
        region.formats.push_back(*format);
    }
    enum : std::uint32_t { Page = 1, Gridded, Figure, Heading, Month, Section, TotalLabel, TotalFigure, Title };

    std::vector<std::vector<std::uint32_t>> rows;
    auto addRow = [&](double height, std::uint32_t label, std::uint32_t figures) {
        region.rowHeights.push_back(height);
        std::vector<std::uint32_t> row(static_cast<std::size_t>(lastColumn + 1), Page);
        row[1] = label;
        for (int column = 2; column <= lastColumn; ++column) {
            row[static_cast<std::size_t>(column)] = figures;
        }
        rows.push_back(row);
    };
    auto put = [&](int row, int column, xl::Value value) {
        CellValue cell;
        cell.row = row;
        cell.column = column;
        cell.value = std::move(value);
        region.values.push_back(std::move(cell));
    };
    for (int k = 0; k < 4; ++k) {
        rows.emplace_back(static_cast<std::size_t>(lastColumn + 1), Page);
    }
    rows[1][1] = Title;
    put(1, 1, std::string("Cash flow"));
    put(1, 7, std::string("Harlenby Joinery Ltd"));
    for (int column = 2; column <= lastColumn; ++column) {
        rows[3][static_cast<std::size_t>(column)] = column > 2 && column < lastColumn ? Month : Heading;
    }
    put(3, 2, std::string("Pre-Startup EST"));
    for (int column = 3; column < lastColumn; ++column) {
        put(3, column, 41275.0 + 30.5 * (column - 3));
    }
    put(3, lastColumn, std::string("Total Item EST"));

    for (int s = 0; s < sections; ++s) {
        addRow(8.0, Page, Page);
        addRow(18.0, Section, Section);
        put(static_cast<int>(rows.size()) - 1, 1, "Section " + std::to_string(s + 1));
        for (int item = 0; item < itemsPerSection; ++item) {
            addRow(18.0, Gridded, Figure);
            put(static_cast<int>(rows.size()) - 1, 1, "Item " + std::to_string(item + 1) + " of the section");
            put(static_cast<int>(rows.size()) - 1, 3 + item % periodColumns, 1250.0 * (item + 1));
        }
        addRow(24.0, TotalLabel, TotalFigure);
        put(static_cast<int>(rows.size()) - 1, 1, std::string("TOTAL OF THE SECTION (before cash out)"));
        for (int column = 2; column <= lastColumn; ++column) {
            put(static_cast<int>(rows.size()) - 1, column, column % 2 == 0 ? 0.0 : 123456.0);
        }
    }
    addRow(12.75, Page, Figure);
    addRow(12.75, Page, Figure);
    for (const auto& row : rows) {
        region.formatIds.insert(region.formatIds.end(), row.begin(), row.end());
    }
    return region;
}

} // namespace penmoor::bench
