# Prints what LibreOffice made of a workbook, from the flat OpenDocument file it converted it to:
#   page <sheet> <property>=<value> ...   (the page layout of each sheet's page style, by property name)
#   value <sheet> <row> <col> <type> <value>   (every cell with a value, after LibreOffice's recalculation)
import sys
import xml.etree.ElementTree as ET

NS = {
    "office": "urn:oasis:names:tc:opendocument:xmlns:office:1.0",
    "style": "urn:oasis:names:tc:opendocument:xmlns:style:1.0",
    "table": "urn:oasis:names:tc:opendocument:xmlns:table:1.0",
    "fo": "urn:oasis:names:tc:opendocument:xmlns:xsl-fo-compatible:1.0",
}


def q(prefix, name):
    return "{%s}%s" % (NS[prefix], name)


def main(path):
    root = ET.parse(path).getroot()
    layouts = {}
    for layout in root.iter(q("style", "page-layout")):
        props = layout.find("style:page-layout-properties", NS)
        layouts[layout.get(q("style", "name"))] = props.attrib if props is not None else {}
    masters = {m.get(q("style", "name")): m.get(q("style", "page-layout-name"))
               for m in root.iter(q("style", "master-page"))}
    table_styles = {}
    for st in root.iter(q("style", "style")):
        if st.get(q("style", "family")) == "table":
            table_styles[st.get(q("style", "name"))] = st.get(q("style", "master-page-name"))
    for index, table in enumerate(root.iter(q("table", "table"))):
        master = table_styles.get(table.get(q("table", "style-name")))
        props = layouts.get(masters.get(master), {})
        wanted = ["print-orientation", "page-width", "page-height", "margin-left", "margin-right", "margin-top",
                  "margin-bottom", "scale-to", "scale-to-X", "scale-to-Y", "scale-to-pages"]
        local = {key.split("}")[1]: value for key, value in props.items()}
        fields = ["%s=%s" % (key, value) for key, value in sorted(local.items()) if key in wanted]
        print("page %d %s" % (index, " ".join(fields)))
        row = 0
        for row_el in table.iter(q("table", "table-row")):
            rows = int(row_el.get(q("table", "number-rows-repeated"), "1"))
            col = 0
            for cell in row_el:
                if cell.tag not in (q("table", "table-cell"), q("table", "covered-table-cell")):
                    continue
                cols = int(cell.get(q("table", "number-columns-repeated"), "1"))
                kind = cell.get(q("office", "value-type"))
                if kind is not None and rows == 1:
                    if kind in ("float", "percentage", "currency"):
                        value = cell.get(q("office", "value"))
                    elif kind == "date":
                        value = cell.get(q("office", "date-value"))
                    elif kind == "boolean":
                        value = cell.get(q("office", "boolean-value"))
                    else:
                        value = repr("".join(cell.itertext()).strip())
                    for k in range(cols):
                        print("value %d %d %d %s %s" % (index, row, col + k, kind, value))
                col += cols
            row += rows


main(sys.argv[1])
