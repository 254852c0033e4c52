#include "bench/xls_content.h"

#include "spreadsheet/workbook/formatting.h"

namespace penmoor::bench {

using namespace engine;

double XlsContent::value(int row, int column)
{
    if (row < 1 || row % 2 == 1)
        return 0;
    if (isFormulaRow(row))
        return value(row - 2, column) + value(row - 1, column);
    return number(row, column);
}

Workbook buildWorkbook(const XlsContent& content)
{
    Workbook book;
    Sheet& sheet = book.addSheet("Bench");
    applyFormat(book.styles(), sheet, Region::wholeSheet(), [](CellStyle& style) { style.fillColorIndex = 2; });
    const Region table { 1, 2, content.rows, content.columns };
    applyFormat(book.styles(), sheet, table, [](CellStyle& style) {
        for (Edge& edge : style.edges)
            edge = { LineStyle::Thin, 16 };
        style.numberFormat = "#,##0";
        style.vertical = VerticalAlignment::Center;
    });
    sheet.setColumnWidth(1, 1);
    sheet.setColumnWidth(2, 32);
    for (int column = 3; column <= content.columns; ++column)
        sheet.setColumnWidth(column, 8.33);
    const ReferenceToken twoUp { { { -2, true }, { 0, true } } };
    const ReferenceToken oneUp { { { -1, true }, { 0, true } } };
    for (int row = 1; row <= content.rows; ++row) {
        sheet.setRowHeight(row, 18);
        sheet.setContent({ row, 2 }, XlsContent::label(row));
        if (row % 2 == 1)
            continue;
        for (int column = 3; column <= content.columns; ++column) {
            if (XlsContent::isFormulaRow(row))
                sheet.setContent({ row, column },
                    Formula { { twoUp, oneUp, OperatorToken { Operator::Add } }, XlsContent::value(row, column) });
            else
                sheet.setContent({ row, column }, XlsContent::number(row, column));
        }
    }
    return book;
}

} // namespace penmoor::bench
