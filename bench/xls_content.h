#pragma once

#include "spreadsheet/workbook/workbook.h"

#include <string>

// The content every writer in the .xls benchmarks writes, ours and the peers alike
// (bench/peers/): one sheet of `rows` by `columns` cells, all of them formatted.
//   - the whole sheet white (palette colour 2) in Arial 10;
//   - column A 1 character wide, B 32, the others 8.33; every row 18 points high;
//   - from column B to the last column: thin borders in colour 16 on every edge, "#,##0",
//     vertically centred;
//   - column B: the label "Item <row>";
//   - the other columns: in every tenth row (from row 10) the formula R[-2]C+R[-1]C, in the
//     other even rows the number row * column + 0.5, in odd rows nothing.
namespace penmoor::bench {

struct XlsContent {
    int rows = 44;
    int columns = 16;

    static bool isFormulaRow(int row) { return row % 10 == 0; }
    static double number(int row, int column) { return row * column + 0.5; }
    // The value a cell shows (0 for an empty one), so formulas get their cached results.
    static double value(int row, int column);
    static std::string label(int row) { return "Item " + std::to_string(row); }
};

// The content as a workbook model, formula results included.
engine::Workbook buildWorkbook(const XlsContent& content);

} // namespace penmoor::bench
