#include "tests/xls/support/expecteddump.h"

#include <algorithm>
#include <cmath>
#include <cstdio>
#include <set>

namespace penmoor::xls::test {

namespace {

using namespace engine;

std::string hexed(const std::string& text)
{
    if (text.empty())
        return "-";
    std::string out;
    char digits[3];
    for (unsigned char c : text) {
        std::snprintf(digits, sizeof digits, "%02x", c);
        out += digits;
    }
    return out;
}

std::string number(double value)
{
    char text[40];
    std::snprintf(text, sizeof text, "%.17g", value);
    return text;
}

std::string rgb(const Workbook& book, int colorIndex)
{
    if (colorIndex == kAutomaticColor)
        return "auto";
    char text[8];
    const std::uint32_t colour = book.color(colorIndex);
    std::snprintf(text, sizeof text, "%02X%02X%02X", colour & 0xFF, (colour >> 8) & 0xFF, (colour >> 16) & 0xFF);
    return text;
}

int lineCode(LineStyle line)
{
    switch (line) {
    case LineStyle::None:
        return 0;
    case LineStyle::Thin:
        return 1;
    case LineStyle::Medium:
        return 2;
    case LineStyle::Thick:
        return 5;
    case LineStyle::Hair:
        return 7;
    }
    return -1;
}

std::string formatText(const Workbook& book, StyleId id)
{
    const CellStyle& style = book.styles().style(id);
    std::string text = "font=" + hexed(style.font.name) + "/" + std::to_string(std::lround(style.font.sizePoints * 20))
        + "/" + (style.font.bold ? "bold" : "regular") + "/" + (style.font.italic ? "italic" : "upright") + "/"
        + rgb(book, style.font.colorIndex);
    text += " fill=" + (style.fillColorIndex == kNoFill ? std::string("none") : rgb(book, style.fillColorIndex));
    const char* names[] = { "left", "right", "top", "bottom" };
    for (std::size_t side = 0; side < 4; ++side) {
        const Edge& edge = style.edges[side];
        text += std::string(" ") + names[side] + "=" + std::to_string(lineCode(edge.line)) + ":"
            + (edge.line == LineStyle::None ? std::string("-") : rgb(book, edge.colorIndex));
    }
    const char* horizontal[] = { "general", "left", "center", "right" };
    const char* vertical[] = { "top", "center", "bottom" };
    text += std::string(" align=") + horizontal[static_cast<int>(style.horizontal)] + "/"
        + vertical[static_cast<int>(style.vertical)] + "/" + (style.wrapText ? "wrap" : "nowrap");
    return text + " numfmt=" + hexed(style.numberFormat);
}

std::string valueText(const xl::Value& value)
{
    if (const double* n = std::get_if<double>(&value))
        return "number " + number(*n);
    if (const std::string* s = std::get_if<std::string>(&value))
        return "text " + hexed(*s);
    if (const bool* b = std::get_if<bool>(&value))
        return std::string("boolean ") + (*b ? "1" : "0");
    if (const xl::ErrorValue* e = std::get_if<xl::ErrorValue>(&value))
        return "error " + std::to_string(static_cast<int>(*e));
    return "number 0";
}

std::string contentText(const CellContent& content)
{
    if (const double* n = std::get_if<double>(&content))
        return valueText(*n);
    if (const std::string* s = std::get_if<std::string>(&content))
        return valueText(*s);
    if (const bool* b = std::get_if<bool>(&content))
        return valueText(*b);
    if (const xl::ErrorValue* e = std::get_if<xl::ErrorValue>(&content))
        return valueText(*e);
    if (const Formula* f = std::get_if<Formula>(&content))
        return valueText(f->cachedValue);
    return "blank -";
}

// Column widths in 1/256 of the digit width with Excel's 5-pixel padding, a 7-pixel digit.
int fileWidth(double characters)
{
    return static_cast<int>(std::trunc((characters * 7 + 5) / 7 * 256));
}

} // namespace

std::vector<std::string> expectedXlrdDump(const Workbook& book)
{
    std::vector<std::string> lines;
    for (int icv = 8; icv < 64; ++icv)
        lines.push_back("palette " + std::to_string(icv) + " " + rgb(book, icv - 7));
    std::vector<CellSpan> spans;
    for (int index = 0; index < book.sheetCount(); ++index) {
        const Sheet& sheet = book.sheet(index);
        const std::string s = std::to_string(index);
        lines.push_back("sheet " + s + " " + hexed(sheet.name()));
        for (int row = 1; row <= sheet.lastStoredRow(); ++row) {
            const RowData* data = sheet.rowData(row);
            if (!data || data->isEmpty())
                continue;
            const std::string r = std::to_string(row - 1);
            sheet.cellSpans(row, spans);
            for (const CellSpan& span : spans) {
                for (int column = span.firstColumn; column <= span.lastColumn; ++column) {
                    const std::string cell = s + " " + r + " " + std::to_string(column - 1);
                    lines.push_back("cell " + cell + " " + (span.content ? contentText(*span.content) : "blank -"));
                    lines.push_back("format " + cell + " " + formatText(book, span.style));
                }
            }
            const double height = data->heightPoints.value_or(sheet.defaultRowHeight());
            const bool hidden = height == 0;
            const long twips = std::lround((hidden ? sheet.defaultRowHeight() : height) * 20);
            lines.push_back("row " + s + " " + r + " " + std::to_string(twips) + " " + (data->heightPoints ? "1" : "0")
                + " " + (hidden ? "1" : "0") + " " + (data->style ? formatText(book, *data->style) : "-"));
        }
        for (int column = 1; column <= kMaxColumns; ++column) {
            const auto width = sheet.columnWidth(column);
            const auto style = sheet.columnStyle(column);
            if (!width && !style && sheet.sheetStyle() == kDefaultStyleId)
                continue;
            const bool hidden = width && *width == 0;
            const double characters = hidden ? sheet.defaultColumnWidth() : width.value_or(sheet.defaultColumnWidth());
            lines.push_back("column " + s + " " + std::to_string(column - 1) + " "
                + std::to_string(fileWidth(characters)) + " " + (hidden ? "1" : "0") + " "
                + formatText(book, style.value_or(sheet.sheetStyle())));
        }
        for (const Region& area : sheet.mergedAreas()) {
            lines.push_back("merged " + s + " " + std::to_string(area.firstRow - 1) + " "
                + std::to_string(area.lastRow - 1) + " " + std::to_string(area.firstColumn - 1) + " "
                + std::to_string(area.lastColumn - 1));
        }
    }
    for (int index = 0; index < book.sheetCount(); ++index) {
        if (const auto& area = book.sheet(index).pageSetup().printArea) {
            const std::string s = std::to_string(index);
            lines.push_back("name Print_Area " + s + " " + s + " " + std::to_string(area->firstRow - 1) + " "
                + std::to_string(area->lastRow - 1) + " " + std::to_string(area->firstColumn - 1) + " "
                + std::to_string(area->lastColumn - 1));
        }
    }
    return lines;
}

std::string lineDifferences(const std::vector<std::string>& expected, const std::vector<std::string>& actual)
{
    const std::multiset<std::string> want(expected.begin(), expected.end());
    const std::multiset<std::string> got(actual.begin(), actual.end());
    std::vector<std::string> missing;
    std::vector<std::string> extra;
    std::set_difference(want.begin(), want.end(), got.begin(), got.end(), std::back_inserter(missing));
    std::set_difference(got.begin(), got.end(), want.begin(), want.end(), std::back_inserter(extra));
    // At most a screenful, each line cut short: long texts would bury the point.
    std::string text;
    int shown = 0;
    auto show = [&](const char* label, const std::string& line) {
        if (++shown <= 40)
            text += label + line.substr(0, 200) + (line.size() > 200 ? "..." : "") + "\n";
    };
    for (const std::string& line : missing)
        show("  expected: ", line);
    for (const std::string& line : extra)
        show("  but read: ", line);
    if (shown > 40)
        text += "  (" + std::to_string(shown - 40) + " more differences)\n";
    return text;
}

} // namespace penmoor::xls::test
