#include "tests/xls/support/workbookcompare.h"

#include "spreadsheet/xls/formulatokens.h"
#include "tests/xls/support/recorddump.h"

#include <algorithm>
#include <sstream>

namespace penmoor::xls::test {

namespace {

using namespace engine;

std::string name(CellPosition position)
{
    return columnLetters(position.column) + std::to_string(position.row);
}

std::string valueText(const xl::Value& value)
{
    std::ostringstream out;
    out.precision(17);
    if (const double* n = std::get_if<double>(&value))
        out << "number " << *n;
    else if (const std::string* s = std::get_if<std::string>(&value))
        out << "text \"" << *s << "\"";
    else if (const bool* b = std::get_if<bool>(&value))
        out << (*b ? "TRUE" : "FALSE");
    else if (const xl::ErrorValue* e = std::get_if<xl::ErrorValue>(&value))
        out << "error " << static_cast<int>(*e);
    else
        out << "empty";
    return out.str();
}

std::string contentText(const CellContent* content, CellPosition position)
{
    if (!content)
        return "empty";
    if (const Formula* formula = std::get_if<Formula>(content)) {
        const auto bytes = encodeFormula(formula->tokens, position);
        return "formula [" + (bytes ? hex(*bytes) : std::string("not storable"))
            + "] = " + valueText(formula->cachedValue);
    }
    return std::visit(
        [](const auto& value) -> std::string {
            using T = std::decay_t<decltype(value)>;
            if constexpr (std::is_same_v<T, Formula>)
                return "";
            else
                return valueText(xl::Value { value });
        },
        *content);
}

// A colour index as itself, or as the colour it shows in this workbook.
std::string colourText(const Workbook& book, std::uint8_t index, ColourMatch match)
{
    if (match == ColourMatch::ByIndex || index == kAutomaticColor)
        return std::to_string(index);
    std::ostringstream out;
    out << "#" << std::hex << book.color(index);
    return out.str();
}

std::string styleText(const Workbook& book, const CellStyle& style, ColourMatch match)
{
    std::ostringstream out;
    out << style.font.name << " " << style.font.sizePoints << (style.font.bold ? " bold" : "")
        << (style.font.italic ? " italic" : "") << " colour " << colourText(book, style.font.colorIndex, match)
        << " fill " << (style.fillColorIndex == kNoFill ? "none" : colourText(book, style.fillColorIndex, match))
        << " format \"" << style.numberFormat << "\" align " << static_cast<int>(style.horizontal) << "/"
        << static_cast<int>(style.vertical) << (style.wrapText ? " wrap" : "") << " edges";
    for (const Edge& edge : style.edges) {
        out << " " << static_cast<int>(edge.line);
        if (edge.line != LineStyle::None)
            out << ":" << colourText(book, edge.colorIndex, match);
    }
    return out.str();
}

template <typename T> std::string optionalText(const std::optional<T>& value)
{
    if (!value)
        return "unset";
    std::ostringstream out;
    out << *value;
    return out.str();
}

std::string regionText(const Region& region)
{
    return formatAddress(region);
}

std::string pageText(const PageSetup& page)
{
    std::ostringstream out;
    out << "print area " << (page.printArea ? regionText(*page.printArea) : "none") << " margins "
        << page.leftMarginInches << " " << page.rightMarginInches << " " << page.topMarginInches << " "
        << page.bottomMarginInches << " " << page.headerMarginInches << " " << page.footerMarginInches
        << " orientation " << static_cast<int>(page.orientation) << " paper " << page.paperSize << " zoom "
        << optionalText(page.zoomPercent) << " fit " << page.fitToPagesWide << "x" << page.fitToPagesTall
        << " comments " << static_cast<int>(page.comments);
    return out.str();
}

class Differences {
public:
    static constexpr int kShown = 60;

    template <typename T> void check(const std::string& what, const T& expected, const T& actual)
    {
        if (expected == actual || m_count++ >= kShown)
            return;
        std::ostringstream out;
        out << what << ": expected " << expected << ", got " << actual << "\n";
        m_text += out.str();
    }
    std::string text() const
    {
        return m_count > kShown ? m_text + "(" + std::to_string(m_count - kShown) + " more)\n" : m_text;
    }

private:
    std::string m_text;
    int m_count = 0;
};

std::vector<std::string> mergedAreas(const Sheet& sheet)
{
    std::vector<std::string> areas;
    for (const Region& area : sheet.mergedAreas())
        areas.push_back(regionText(area));
    std::sort(areas.begin(), areas.end());
    return areas;
}

std::string joined(const std::vector<std::string>& items)
{
    std::string text;
    for (const std::string& item : items)
        text += item + " ";
    return text;
}

void compareSheets(Differences& diff, const Workbook& wantBook, const Sheet& want, const Workbook& gotBook,
    const Sheet& got, ColourMatch match)
{
    const std::string at = "sheet \"" + want.name() + "\" ";
    diff.check(at + "default row height", want.defaultRowHeight(), got.defaultRowHeight());
    diff.check(at + "default column width", want.defaultColumnWidth(), got.defaultColumnWidth());
    for (int column = 1; column <= kMaxColumns; ++column)
        diff.check(at + "width of column " + columnLetters(column), optionalText(want.columnWidth(column)),
            optionalText(got.columnWidth(column)));
    const int lastRow = std::min(kMaxRows, std::max(want.lastStoredRow(), got.lastStoredRow()) + 2);
    for (int row = 1; row <= lastRow; ++row) {
        diff.check(at + "height of row " + std::to_string(row), optionalText(want.rowHeight(row)),
            optionalText(got.rowHeight(row)));
        for (int column = 1; column <= kMaxColumns; ++column) {
            const CellPosition position { row, column };
            diff.check(at + name(position) + " format",
                styleText(wantBook, wantBook.styles().style(want.effectiveStyle(position)), match),
                styleText(gotBook, gotBook.styles().style(got.effectiveStyle(position)), match));
            diff.check(at + name(position), contentText(want.content(position), position),
                contentText(got.content(position), position));
        }
    }
    diff.check(at + "merged areas", joined(mergedAreas(want)), joined(mergedAreas(got)));
    diff.check(at + "page setup", pageText(want.pageSetup()), pageText(got.pageSetup()));
    diff.check(at + "selection", regionText(want.selection()) + " at " + name(want.activeCell()),
        regionText(got.selection()) + " at " + name(got.activeCell()));
}

} // namespace

std::string workbookDifferences(const Workbook& expected, const Workbook& actual, ColourMatch colours)
{
    Differences diff;
    diff.check("sheet count", expected.sheetCount(), actual.sheetCount());
    diff.check("active sheet", expected.activeSheetIndex(), actual.activeSheetIndex());
    for (int k = 1; k <= kPaletteSize && colours == ColourMatch::ByIndex; ++k)
        diff.check("palette colour " + std::to_string(k), expected.color(k), actual.color(k));
    for (int index = 0; index < std::min(expected.sheetCount(), actual.sheetCount()); ++index) {
        diff.check(
            "name of sheet " + std::to_string(index + 1), expected.sheet(index).name(), actual.sheet(index).name());
        compareSheets(diff, expected, expected.sheet(index), actual, actual.sheet(index), colours);
    }
    return diff.text();
}

} // namespace penmoor::xls::test
