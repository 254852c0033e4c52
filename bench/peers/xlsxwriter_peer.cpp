// The benchmark content (bench/xls_content.h) written with libxlsxwriter, a peer to compare
// our writer with: xlsxwriter_peer ROWS COLUMNS OUT.xlsx
#include <cstdio>
#include <cstdlib>
#include <string>
#include <xlsxwriter.h>

namespace {

std::string columnName(int column)
{
    std::string name;
    for (int c = column; c > 0; c = (c - 1) / 26)
        name.insert(name.begin(), static_cast<char>('A' + (c - 1) % 26));
    return name;
}

double value(int row, int column)
{
    if (row < 1 || row % 2 == 1)
        return 0;
    if (row % 10 == 0)
        return value(row - 2, column) + value(row - 1, column);
    return row * column + 0.5;
}

} // namespace

int main(int argc, char** argv)
{
    if (argc != 4) {
        std::fprintf(stderr, "usage: %s ROWS COLUMNS OUT.xlsx\n", argv[0]);
        return 2;
    }
    const int rows = std::atoi(argv[1]);
    const int columns = std::atoi(argv[2]);
    lxw_workbook* workbook = workbook_new(argv[3]);
    lxw_worksheet* sheet = workbook_add_worksheet(workbook, "Bench");
    lxw_format* white = workbook_add_format(workbook);
    format_set_bg_color(white, 0xFFFFFF);
    format_set_pattern(white, LXW_PATTERN_SOLID);
    lxw_format* table = workbook_add_format(workbook);
    format_set_bg_color(table, 0xFFFFFF);
    format_set_pattern(table, LXW_PATTERN_SOLID);
    format_set_border(table, LXW_BORDER_THIN);
    format_set_border_color(table, 0x808080);
    format_set_num_format(table, "#,##0");
    format_set_align(table, LXW_ALIGN_VERTICAL_CENTER);

    worksheet_set_column(sheet, 0, 0, 1, white);
    worksheet_set_column(sheet, 1, 1, 32, white);
    worksheet_set_column(sheet, 2, static_cast<lxw_col_t>(columns - 1), 8.33, white);
    worksheet_set_column(sheet, static_cast<lxw_col_t>(columns), 255, 8.43, white);
    for (int row = 1; row <= rows; ++row) {
        const auto r = static_cast<lxw_row_t>(row - 1);
        worksheet_set_row(sheet, r, 18, nullptr);
        worksheet_write_string(sheet, r, 1, ("Item " + std::to_string(row)).c_str(), table);
        for (int column = 3; column <= columns; ++column) {
            const auto c = static_cast<lxw_col_t>(column - 1);
            if (row % 2 == 1) {
                worksheet_write_blank(sheet, r, c, table);
            } else if (row % 10 == 0) {
                const std::string name = columnName(column);
                const std::string formula = "=" + name + std::to_string(row - 2) + "+" + name + std::to_string(row - 1);
                worksheet_write_formula_num(sheet, r, c, formula.c_str(), table, value(row, column));
            } else {
                worksheet_write_number(sheet, r, c, row * column + 0.5, table);
            }
        }
    }
    return workbook_close(workbook) == LXW_NO_ERROR ? 0 : 1;
}
