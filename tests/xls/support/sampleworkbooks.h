#pragma once

#include "spreadsheet/workbook/workbook.h"

namespace penmoor::xls::test {

// A small cash-flow sheet made through the model the way the sheet builder shapes it: a custom
// palette, a white whole-sheet fill in Arial, column widths and row heights, a bold coloured
// title, a shaded and wrapped heading row with "mmm-yy" dates that follow by formula, a thin
// grid with a cleared corner, "#,##0" figures with sum and difference formulas (their cached
// results worked out by hand), any-Unicode labels, a merged title, a print area and a
// landscape A4 page fitted to one page.
engine::Workbook cashFlowSample();

// A second sheet with what the cash-flow sheet lacks: booleans, errors, text results, a long
// text that needs CONTINUE records, whole-row and whole-column formats, hidden rows and
// columns, a portrait page with a zoom.
void addOddsAndEnds(engine::Workbook& workbook);

// The grid of the large benchmark: rows x columns of bordered, filled, "#,##0" cells with a
// label in column B and a formula in every tenth row.
engine::Workbook largeSample(int rows, int columns);

} // namespace penmoor::xls::test
