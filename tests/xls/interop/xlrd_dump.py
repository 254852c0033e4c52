# Prints what Debian's python3-xlrd reads from an .xls file with formatting information, one
# fact per line, so that a test can compare it with what the workbook model says. Texts are
# printed as the hex of their UTF-8 bytes, numbers with 17 significant digits.
#   palette <icv> <RRGGBB>                          (icv 8 to 63)
#   sheet <index> <name>
#   cell <sheet> <row> <col> <type> <value>         (every cell record, blanks included)
#   format <sheet> <row> <col> <format>             (the cell's font, fill, edges, alignment, number format)
#   row <sheet> <row> <twips> <custom> <hidden> <format or ->
#   column <sheet> <col> <width> <hidden> <format>
#   merged <sheet> <first row> <last row> <first col> <last col>
#   name <name> <scope> <sheet> <first row> <last row> <first col> <last col>
# Rows and columns count from 0; last rows and columns are inclusive.
import sys

import xlrd

TYPES = {xlrd.XL_CELL_TEXT: "text", xlrd.XL_CELL_NUMBER: "number", xlrd.XL_CELL_DATE: "number",
         xlrd.XL_CELL_BOOLEAN: "boolean", xlrd.XL_CELL_ERROR: "error", xlrd.XL_CELL_BLANK: "blank"}
ALIGN_H = {0: "general", 1: "left", 2: "center", 3: "right"}
ALIGN_V = {0: "top", 1: "center", 2: "bottom"}


def hexed(text):
    return text.encode("utf-8").hex() or "-"


def colour(book, index):
    rgb = book.colour_map.get(index)
    return "auto" if rgb is None else "%02X%02X%02X" % rgb


def value_text(cell):
    if cell.ctype == xlrd.XL_CELL_TEXT:
        return hexed(cell.value)
    if cell.ctype in (xlrd.XL_CELL_NUMBER, xlrd.XL_CELL_DATE):
        return "%.17g" % float(cell.value)
    if cell.ctype in (xlrd.XL_CELL_BOOLEAN, xlrd.XL_CELL_ERROR):
        return str(int(cell.value))
    return "-"


def format_text(book, xf_index):
    xf = book.xf_list[xf_index]
    font = book.font_list[xf.font_index]
    fill = colour(book, xf.background.pattern_colour_index) if xf.background.fill_pattern else "none"
    b = xf.border
    edges = ["%s=%d:%s" % (name, style, colour(book, index) if style else "-")
             for name, style, index in (("left", b.left_line_style, b.left_colour_index),
                                        ("right", b.right_line_style, b.right_colour_index),
                                        ("top", b.top_line_style, b.top_colour_index),
                                        ("bottom", b.bottom_line_style, b.bottom_colour_index))]
    return " ".join(
        ["font=%s/%d/%s/%s/%s" % (hexed(font.name), font.height, "bold" if font.bold else "regular",
                                  "italic" if font.italic else "upright", colour(book, font.colour_index)),
         "fill=" + fill] + edges +
        ["align=%s/%s/%s" % (ALIGN_H.get(xf.alignment.hor_align, "other"),
                             ALIGN_V.get(xf.alignment.vert_align, "other"),
                             "wrap" if xf.alignment.text_wrapped else "nowrap"),
         "numfmt=" + hexed(book.format_map[xf.format_key].format_str)])


def main(path):
    book = xlrd.open_workbook(path, formatting_info=True)
    for index in range(8, 64):
        print("palette %d %s" % (index, colour(book, index)))
    for index, sheet in enumerate(book.sheets()):
        print("sheet %d %s" % (index, hexed(sheet.name)))
        for row in range(sheet.nrows):
            for col in range(sheet.row_len(row)):
                cell = sheet.cell(row, col)
                if cell.ctype == xlrd.XL_CELL_EMPTY:
                    continue
                print("cell %d %d %d %s %s" % (index, row, col, TYPES[cell.ctype], value_text(cell)))
                print("format %d %d %d %s" % (index, row, col, format_text(book, cell.xf_index)))
        for row, info in sorted(sheet.rowinfo_map.items()):
            print("row %d %d %d %d %d %s" % (index, row, info.height, info.height_mismatch, info.hidden,
                                             format_text(book, info.xf_index) if info.has_default_xf_index else "-"))
        for col, info in sorted(sheet.colinfo_map.items()):
            print("column %d %d %d %d %s" % (index, col, info.width, info.hidden, format_text(book, info.xf_index)))
        for rlo, rhi, clo, chi in sheet.merged_cells:
            print("merged %d %d %d %d %d" % (index, rlo, rhi - 1, clo, chi - 1))
    for name in book.name_obj_list:
        sheet, rlo, rhi, clo, chi = name.area2d()
        print("name %s %d %d %d %d %d %d" % (name.name, name.scope, sheet.number, rlo, rhi - 1, clo, chi - 1))


main(sys.argv[1])
