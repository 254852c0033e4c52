# The benchmark content (bench/xls_content.h) written with Debian's python3-xlwt, a peer to
# compare our writer with: /usr/bin/python3 xlwt_peer.py ROWS COLUMNS OUT.xls
import sys

import xlwt


def column_name(column):
    name = ""
    while column > 0:
        column, rest = divmod(column - 1, 26)
        name = chr(ord("A") + rest) + name
    return name


def width(characters):
    return int((characters * 7 + 5) / 7 * 256)


def main(rows, columns, path):
    book = xlwt.Workbook()
    sheet = book.add_sheet("Bench")
    white = xlwt.easyxf("pattern: pattern solid, fore_colour white")
    table = xlwt.easyxf(
        "pattern: pattern solid, fore_colour white; "
        "borders: left thin, right thin, top thin, bottom thin, "
        "left_colour grey50, right_colour grey50, top_colour grey50, bottom_colour grey50; "
        "align: vert centre", num_format_str="#,##0")
    for column in range(256):
        sheet.col(column).set_style(white)
        sheet.col(column).width = width(1 if column == 0 else 32 if column == 1 else 8.33 if column < columns else 8.43)
    for row in range(1, rows + 1):
        r = row - 1
        sheet.row(r).height_mismatch = True
        sheet.row(r).height = 360
        sheet.write(r, 1, "Item %d" % row, table)
        for column in range(3, columns + 1):
            c = column - 1
            if row % 2 == 1:
                sheet.write(r, c, None, table)
            elif row % 10 == 0:
                name = column_name(column)
                sheet.write(r, c, xlwt.Formula("%s%d+%s%d" % (name, row - 2, name, row - 1)), table)
            else:
                sheet.write(r, c, row * column + 0.5, table)
    book.save(path)


main(int(sys.argv[1]), int(sys.argv[2]), sys.argv[3])
