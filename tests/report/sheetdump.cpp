#include "tests/report/sheetdump.h"

#include "automation/contract/constants.h"

#include <array>
#include <cstdio>
#include <functional>
#include <sstream>
#include <vector>

namespace penmoor::test {

namespace {

// What a new sheet gives a cell; the dump names only what differs.
constexpr char kDefaultFont[] = "Arial";
constexpr double kDefaultFontSize = 10;
constexpr double kDefaultRowHeight = 12.75;
constexpr double kDefaultColumnWidth = 8.43;

std::string letters(int column)
{
    std::string text;
    for (; column > 0; column = (column - 1) / 26) {
        text.insert(text.begin(), static_cast<char>('A' + (column - 1) % 26));
    }
    return text;
}

std::string cellName(int row, int column)
{
    return letters(column) + std::to_string(row);
}

std::string span(int row, int firstColumn, int lastColumn)
{
    const std::string first = cellName(row, firstColumn);
    return firstColumn == lastColumn ? first : first + ":" + cellName(row, lastColumn);
}

std::string alignmentName(int alignment)
{
    switch (alignment) {
    case xl::kAlignCenter:
        return "center";
    case xl::kAlignRight:
        return "right";
    case xl::kAlignLeft:
        return "left";
    case xl::kAlignTop:
        return "top";
    default:
        return std::to_string(alignment);
    }
}

std::string valueText(const xl::Value& value)
{
    struct Visitor {
        std::string operator()(std::monostate) const { return "empty"; }
        std::string operator()(double number) const { return numberKey(number); }
        std::string operator()(const std::string& text) const { return "\"" + text + "\""; }
        std::string operator()(bool flag) const { return flag ? "TRUE" : "FALSE"; }
        std::string operator()(xl::ErrorValue error) const
        {
            return "error " + std::to_string(static_cast<int>(error));
        }
    };
    return std::visit(Visitor {}, value);
}

std::string kindOf(const std::string& entry, const xl::Value& value)
{
    // Text that merely looks like a formula reads back as itself.
    const auto* text = std::get_if<std::string>(&value);
    if (!entry.empty() && entry.front() == '=' && !(text && *text == entry)) {
        return "formula";
    }
    if (std::holds_alternative<double>(value)) {
        return "number";
    }
    return text ? "text" : "value";
}

struct Run {
    int firstColumn;
    int lastColumn;
    std::string key;

    bool operator==(const Run&) const = default;
};

struct Block {
    int firstRow;
    int lastRow;
    int firstColumn;
    int lastColumn;
};

Block usedBlock(xl::Application& application)
{
    const std::unique_ptr<xl::Range> used = application.ActiveSheet()->UsedRange();
    const std::unique_ptr<xl::Range> rows = used->Rows();
    const std::unique_ptr<xl::Range> columns = used->Columns();
    return { used->Row(), rows->Item(rows->count())->Row(), used->Column(), columns->Item(columns->count())->Column() };
}

// Consecutive columns of a row with the same key.
std::vector<Run> runsOf(const Block& block, const std::function<std::string(int column)>& keyAt)
{
    std::vector<Run> runs;
    for (int column = block.firstColumn; column <= block.lastColumn; ++column) {
        std::string key = keyAt(column);
        if (!runs.empty() && runs.back().key == key) {
            runs.back().lastColumn = column;
        } else {
            runs.push_back({ column, column, std::move(key) });
        }
    }
    return runs;
}

std::string contentKey(xl::Range& cell)
{
    const std::string entry = cell.FormulaR1C1();
    const xl::Value value = cell.Value();
    if (entry.empty() && std::holds_alternative<std::monostate>(value)) {
        return {};
    }
    return kindOf(entry, value) + " " + entry + " -> " + valueText(value);
}

void dumpContents(xl::Application& application, const Block& block, std::ostream& out)
{
    out << "[contents]\n";
    for (int row = block.firstRow; row <= block.lastRow; ++row) {
        const std::vector<Run> runs
            = runsOf(block, [&](int column) { return contentKey(*application.Range(cellName(row, column))); });
        for (const Run& run : runs) {
            if (!run.key.empty()) {
                out << span(row, run.firstColumn, run.lastColumn) << ' ' << run.key << '\n';
            }
        }
    }
}

std::vector<Run> styleRuns(xl::Application& application, const Block& block, int row)
{
    return runsOf(block, [&](int column) { return styleKey(*application.Range(cellName(row, column))); });
}

void dumpFormats(xl::Application& application, const Block& block, std::ostream& out)
{
    out << "[formats]\n";
    int groupStart = block.firstRow;
    std::vector<Run> groupRuns = styleRuns(application, block, block.firstRow);
    const auto flush = [&](int lastRow) {
        out << groupStart;
        if (lastRow != groupStart) {
            out << ':' << lastRow;
        }
        for (const Run& run : groupRuns) {
            out << " | " << letters(run.firstColumn);
            if (run.lastColumn != run.firstColumn) {
                out << ':' << letters(run.lastColumn);
            }
            out << ' ' << (run.key.empty() ? "-" : run.key);
        }
        out << '\n';
    };
    for (int row = block.firstRow + 1; row <= block.lastRow; ++row) {
        std::vector<Run> runs = styleRuns(application, block, row);
        if (runs != groupRuns) {
            flush(row - 1);
            groupStart = row;
            groupRuns = std::move(runs);
        }
    }
    flush(block.lastRow);
}

// Consecutive rows or columns with the same size that differs from the default.
template <typename Name, typename Size>
void dumpSizes(const char* title, int first, int last, double defaultSize, Name name, Size size, std::ostream& out)
{
    out << '[' << title << "]\n";
    int start = first;
    for (int index = first; index <= last; ++index) {
        const double value = size(index);
        if (index == last || size(index + 1) != value) {
            if (value != defaultSize) {
                out << name(start) << (index == start ? "" : ":" + name(index)) << ' ' << numberKey(value) << '\n';
            }
            start = index + 1;
        }
    }
}

void dumpPage(xl::Application& application, std::ostream& out)
{
    const std::unique_ptr<xl::PageSetup> page = application.ActiveSheet()->PageSetup();
    const std::optional<int> zoom = page->Zoom();
    out << "[page]\n"
        << "print area " << page->PrintArea() << '\n'
        << "margins left " << numberKey(page->LeftMargin()) << " right " << numberKey(page->RightMargin()) << " top "
        << numberKey(page->TopMargin()) << " bottom " << numberKey(page->BottomMargin()) << " header "
        << numberKey(page->HeaderMargin()) << " footer " << numberKey(page->FooterMargin()) << '\n'
        << "comments " << page->PrintComments() << " orientation " << page->Orientation() << " paper "
        << page->PaperSize() << '\n'
        << "zoom " << (zoom ? std::to_string(*zoom) : "off") << " fit " << page->FitToPagesWide() << " wide "
        << page->FitToPagesTall() << " tall\n";
    out << "[selection]\n"
        << application.Selection()->Address() << " active " << application.ActiveCell()->Address() << '\n';
}

} // namespace

std::string numberKey(double value)
{
    std::array<char, 32> text {};
    std::snprintf(text.data(), text.size(), "%.15g", value);
    return text.data();
}

std::string styleKey(xl::Range& cell)
{
    std::string key;
    const auto add = [&](const std::string& token) { key += (key.empty() ? "" : " ") + token; };

    const std::unique_ptr<xl::Font> font = cell.Font();
    if (font->Name() != kDefaultFont) {
        add("font:" + font->Name());
    }
    if (font->FontStyle() != "Regular") {
        add(font->FontStyle());
    }
    if (font->Size() != kDefaultFontSize) {
        add(numberKey(font->Size()) + "pt");
    }
    if (font->ColorIndex() != xl::kColorIndexAutomatic) {
        add("ink" + std::to_string(font->ColorIndex()));
    }
    if (const int fill = cell.Interior()->ColorIndex(); fill != xl::kColorIndexNone) {
        add("fill" + std::to_string(fill));
    }
    if (cell.HorizontalAlignment() != xl::kAlignGeneral) {
        add("h:" + alignmentName(cell.HorizontalAlignment()));
    }
    if (cell.VerticalAlignment() != xl::kAlignBottom) {
        add("v:" + alignmentName(cell.VerticalAlignment()));
    }
    if (cell.WrapText()) {
        add("wrap");
    }
    if (cell.NumberFormat() != "General") {
        add("fmt:" + cell.NumberFormat());
    }
    constexpr std::array<std::pair<int, char>, 4> kEdges
        = { { { xl::kEdgeLeft, 'L' }, { xl::kEdgeTop, 'T' }, { xl::kEdgeBottom, 'B' }, { xl::kEdgeRight, 'R' } } };
    for (const auto& [edge, name] : kEdges) {
        const std::unique_ptr<xl::Border> border = cell.Borders(edge);
        if (border->LineStyle() != xl::kLineStyleNone) {
            add(std::string(1, name) + std::to_string(border->ColorIndex())
                + (border->Weight() == xl::kWeightThin ? "" : "w" + std::to_string(border->Weight())));
        }
    }
    return key;
}

std::string dumpActiveSheet(xl::Application& application)
{
    const Block block = usedBlock(application);
    std::ostringstream out;
    out << "[used range] " << application.ActiveSheet()->UsedRange()->Address() << '\n';
    dumpContents(application, block, out);
    dumpFormats(application, block, out);
    dumpSizes(
        "row heights", block.firstRow, block.lastRow, kDefaultRowHeight, [](int row) { return std::to_string(row); },
        [&](int row) { return application.Rows(std::to_string(row) + ":" + std::to_string(row))->RowHeight(); }, out);
    dumpSizes(
        "column widths", block.firstColumn, block.lastColumn, kDefaultColumnWidth, letters,
        [&](int column) { return application.Columns(letters(column) + ":" + letters(column))->ColumnWidth(); }, out);
    dumpPage(application, out);
    return out.str();
}

} // namespace penmoor::test
