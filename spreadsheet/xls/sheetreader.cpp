#include "spreadsheet/xls/sheetreader.h"

#include "spreadsheet/xls/biffrecords.h"
#include "spreadsheet/xls/biffstrings.h"
#include "spreadsheet/xls/bytereader.h"
#include "spreadsheet/xls/formaterror.h"
#include "spreadsheet/xls/formulatokens.h"
#include "spreadsheet/xls/recordreader.h"
#include "spreadsheet/xls/rk.h"
#include "spreadsheet/xls/sheetrecords.h"
#include "spreadsheet/xls/unicode.h"
#include "spreadsheet/xls/units.h"

#include <algorithm>
#include <array>
#include <cmath>
#include <map>

namespace penmoor::xls {

namespace {

using namespace engine;

constexpr std::uint8_t kPtgExp = 0x01;
constexpr std::uint16_t kWindow2Active = 0x0400;
constexpr double kMaxRowHeightPoints = 409;
constexpr double kMaxMarginInches = 49;
constexpr int kMinZoom = 10;
constexpr int kMaxZoom = 400;
// Merging checks every existing area, so a file may hold only this many.
constexpr std::size_t kMaxMergedAreas = 10000;
// Days from 1 January 1900 to 1 January 1904 in the 1900 date system.
constexpr double k1904Offset = 1462;

std::optional<xl::ErrorValue> errorValue(std::uint8_t code)
{
    for (xl::ErrorValue value : { xl::ErrorValue::Null, xl::ErrorValue::Div0, xl::ErrorValue::Value,
             xl::ErrorValue::Ref, xl::ErrorValue::Name, xl::ErrorValue::Num, xl::ErrorValue::NA }) {
        if (static_cast<std::uint8_t>(value) == code)
            return value;
    }
    return std::nullopt;
}

// Whether a number format shows dates or times: any of d, m, y, h, s outside quoted text,
// escaped characters and bracketed colours or conditions.
bool isDateFormat(const std::string& format)
{
    bool quoted = false;
    for (std::size_t i = 0; i < format.size(); ++i) {
        const char c = format[i];
        if (c == '"') {
            quoted = !quoted;
        } else if (quoted) {
            continue;
        } else if (c == '\\' || c == '_' || c == '*') {
            ++i;
        } else if (c == '[') {
            const std::size_t end = format.find(']', i);
            const std::string inside = format.substr(i + 1, end == std::string::npos ? std::string::npos : end - i - 1);
            if (!inside.empty() && std::string("hHmMsS").find(inside[0]) != std::string::npos)
                return true; // elapsed time: [h], [mm], [ss]
            if (end == std::string::npos)
                return false;
            i = end;
        } else if (std::string("dDmMyYhHsS").find(c) != std::string::npos) {
            return true;
        }
    }
    return false;
}

xl::Value cachedValue(const CachedResult& result)
{
    if (const double* number = std::get_if<double>(&result))
        return *number;
    if (const CachedText* text = std::get_if<CachedText>(&result))
        return utf16ToUtf8(text->text);
    if (const bool* flag = std::get_if<bool>(&result))
        return *flag;
    return errorValue(std::get<CachedError>(result).code).value_or(xl::ErrorValue::NA);
}

CellContent cachedContent(const CachedResult& result)
{
    return std::visit([](const auto& value) -> CellContent { return value; }, cachedValue(result));
}

struct ColumnInfo {
    std::optional<double> width;
    std::optional<std::uint16_t> xf;
};

struct PendingFormula {
    CellPosition position;
    CachedResult result;
};

class SheetReader {
public:
    SheetReader(std::span<const std::uint8_t> stream, WorkbookGlobals& globals, Workbook& book, Sheet& sheet)
        : m_stream(stream)
        , m_globals(globals)
        , m_book(book)
        , m_sheet(sheet)
    {
    }

    bool read(std::uint32_t position)
    {
        RecordReader records(m_stream, position);
        if (records.atEnd() || records.peekType() != biff::kBof)
            throw FormatError("a sheet's position does not point at a BOF record");
        if (parseBof(records.next().body) != biff::kBofWorksheet)
            throw FormatError("a sheet's position points at something other than a worksheet");
        for (;;) {
            if (records.atEnd())
                throw FormatError("a worksheet has no EOF record");
            const Record record = records.next();
            if (record.type == biff::kEof)
                break;
            if (record.type == biff::kBof)
                skipSubstream(records);
            else
                handle(record);
        }
        finishColumns();
        finish();
        return m_active;
    }

private:
    // An embedded substream (a chart on the sheet) up to its own EOF.
    static void skipSubstream(RecordReader& records)
    {
        int depth = 1;
        while (depth > 0) {
            if (records.atEnd())
                throw FormatError("an embedded object in a worksheet has no EOF record");
            const std::uint16_t type = records.next().type;
            depth += type == biff::kBof ? 1 : type == biff::kEof ? -1 : 0;
        }
    }

    void handle(const Record& record)
    {
        switch (record.type) {
        case biff::kDefaultRowHeight: {
            ByteReader in(record.body, "the DEFAULTROWHEIGHT record");
            in.u16();
            const double points = twipsToPoints(in.u16());
            if (points > 0 && points <= kMaxRowHeightPoints)
                m_sheet.setDefaultRowHeight(points);
            return;
        }
        case biff::kDefColWidth: {
            // Excel rounds the default width of n digits plus padding up to a multiple of 8 pixels.
            const int digits = std::min<int>(ByteReader(record.body, "the DEFCOLWIDTH record").u16(), 255);
            const double pixels = std::ceil((digits * 7 + 5) / 8.0) * 8;
            m_defaultWidth = std::round((pixels - 5) / 7 * 100) / 100;
            m_sheet.setDefaultColumnWidth(m_defaultWidth);
            return;
        }
        case biff::kColInfo:
            columnInfo(parseColInfo(record.body));
            return;
        case biff::kRow:
            finishColumns();
            row(parseRow(record.body));
            return;
        case biff::kBlank:
            finishColumns();
            blank(parseCellHeader(record.body));
            return;
        case biff::kMulBlank:
            finishColumns();
            mulBlank(record.body);
            return;
        case biff::kNumber: {
            finishColumns();
            const CellHeader cell = parseCellHeader(record.body);
            ByteReader in(record.body.subspan(6), "a NUMBER record");
            number(cell, in.f64());
            return;
        }
        case biff::kRk: {
            finishColumns();
            const CellHeader cell = parseCellHeader(record.body);
            ByteReader in(record.body.subspan(6), "an RK record");
            number(cell, decodeRk(in.u32()));
            return;
        }
        case biff::kMulRk:
            finishColumns();
            mulRk(record.body);
            return;
        case biff::kLabelSst: {
            finishColumns();
            const CellHeader cell = parseCellHeader(record.body);
            ByteReader in(record.body.subspan(6), "a LABELSST record");
            const std::uint32_t index = in.u32();
            if (index >= m_globals.strings().size())
                throw FormatError("a text cell refers to shared string " + std::to_string(index) + " of "
                    + std::to_string(m_globals.strings().size()));
            content(cell, m_globals.strings()[index]);
            return;
        }
        case biff::kLabel:
        case biff::kRString: {
            finishColumns();
            const CellHeader cell = parseCellHeader(record.body);
            ByteReader in(record.body.subspan(6), "a LABEL record");
            content(cell, utf16ToUtf8(readString(in)));
            return;
        }
        case biff::kBoolErr: {
            finishColumns();
            const CellHeader cell = parseCellHeader(record.body);
            ByteReader in(record.body.subspan(6), "a BOOLERR record");
            const std::uint8_t value = in.u8();
            if (in.u8() != 0)
                content(cell, errorValue(value).value_or(xl::ErrorValue::NA));
            else
                content(cell, value != 0);
            return;
        }
        case biff::kFormula:
            finishColumns();
            formula(parseFormula(record.body));
            return;
        case biff::kShrFmla:
            sharedFormula(record.body);
            return;
        case biff::kString: {
            ByteReader in(record.body, "a STRING record");
            formulaText(utf16ToUtf8(readString(in)));
            return;
        }
        case biff::kMergedCells: {
            const auto areas = parseMergedCells(record.body);
            m_merged.insert(m_merged.end(), areas.begin(), areas.end());
            if (m_merged.size() > kMaxMergedAreas)
                throw FormatError("a worksheet has more than " + std::to_string(kMaxMergedAreas) + " merged areas");
            return;
        }
        case biff::kWindow2:
            m_active = (ByteReader(record.body, "the WINDOW2 record").u16() & kWindow2Active) != 0;
            return;
        case biff::kSelection:
            m_selection = parseSelection(record.body);
            return;
        case biff::kLeftMargin:
        case biff::kRightMargin:
        case biff::kTopMargin:
        case biff::kBottomMargin:
            margin(record.type, parseDouble(record.body, "a margin record"));
            return;
        case biff::kSetup:
            m_setup = parseSetup(record.body);
            return;
        case biff::kWsBool:
            m_fitToPage = parseFitToPage(record.body);
            return;
        default:
            return;
        }
    }

    void columnInfo(const ColInfoRecord& info)
    {
        const std::uint16_t defaultWidth = columnWidthToFile(m_defaultWidth);
        for (int column = info.firstColumn; column <= info.lastColumn; ++column) {
            ColumnInfo& target = m_columns[static_cast<std::size_t>(column)];
            if (info.hidden)
                target.width = 0.0;
            else if (info.userSet || info.width != defaultWidth)
                target.width = columnWidthFromFile(info.width);
            target.xf = info.xf;
        }
    }

    // Column formats are known once the first row or cell comes. A format on every column is
    // taken as the whole sheet's (the file cannot tell them apart): the most common one.
    void finishColumns()
    {
        if (m_columnsDone)
            return;
        m_columnsDone = true;
        std::map<StyleId, int> uses;
        bool everyColumn = true;
        std::array<std::optional<StyleId>, kMaxColumns> styles {};
        for (int column = 0; column < kMaxColumns; ++column) {
            const ColumnInfo& info = m_columns[static_cast<std::size_t>(column)];
            if (info.width)
                m_sheet.setColumnWidth(column + 1, info.width);
            if (!info.xf) {
                everyColumn = false;
                continue;
            }
            styles[static_cast<std::size_t>(column)] = m_globals.style(*info.xf, m_book.styles());
            ++uses[*styles[static_cast<std::size_t>(column)]];
        }
        StyleId sheetStyle = kDefaultStyleId;
        if (everyColumn) {
            sheetStyle = std::max_element(uses.begin(), uses.end(), [](const auto& a, const auto& b) {
                return a.second < b.second;
            })->first;
            m_sheet.setSheetStyle(sheetStyle);
        }
        for (int column = 0; column < kMaxColumns; ++column) {
            const auto& style = styles[static_cast<std::size_t>(column)];
            if (style && *style != sheetStyle)
                m_sheet.setColumnStyle(column + 1, style);
        }
    }

    void row(const RowRecord& record)
    {
        const int row = record.row + 1;
        if (record.hidden)
            m_sheet.setRowHeight(row, 0.0);
        else if (record.customHeight)
            m_sheet.setRowHeight(row, std::min(twipsToPoints(record.heightTwips), kMaxRowHeightPoints));
        if (record.xf)
            m_sheet.setRowStyle(row, m_globals.style(*record.xf, m_book.styles()));
    }

    // Gives the cells their format where it differs from what they inherit, as runs.
    void style(int row, int firstColumn, std::span<const std::uint16_t> xfs)
    {
        const std::optional<StyleId> rowStyle = m_sheet.rowStyle(row + 1);
        int runFirst = firstColumn;
        std::optional<StyleId> runStyle;
        auto flush = [&](int end) {
            if (runStyle)
                m_sheet.setCellStyles(row + 1, runFirst + 1, end, *runStyle);
        };
        for (std::size_t i = 0; i < xfs.size(); ++i) {
            const int column = firstColumn + static_cast<int>(i);
            const StyleId own = m_globals.style(xfs[i], m_book.styles());
            const StyleId inherited = rowStyle.value_or(m_sheet.columnStyle(column + 1).value_or(m_sheet.sheetStyle()));
            const std::optional<StyleId> wanted = own == inherited ? std::nullopt : std::optional<StyleId>(own);
            if (runStyle && wanted == runStyle)
                continue;
            flush(column);
            runFirst = column;
            runStyle = wanted;
        }
        flush(firstColumn + static_cast<int>(xfs.size()));
    }

    void blank(const CellHeader& cell)
    {
        const std::uint16_t xf[] = { cell.xf };
        style(cell.row, cell.column, xf);
    }

    void mulBlank(std::span<const std::uint8_t> body)
    {
        ByteReader in(body, "a MULBLANK record");
        const int row = in.u16();
        const int first = in.u16();
        if (body.size() < 6 || (body.size() - 6) % 2 != 0)
            throw FormatError("a MULBLANK record has a wrong length");
        const std::size_t count = (body.size() - 6) / 2;
        std::vector<std::uint16_t> xfs(count);
        for (std::uint16_t& xf : xfs)
            xf = in.u16();
        if (in.u16() != first + static_cast<int>(count) - 1 || first + count > kMaxColumns)
            throw FormatError("a MULBLANK record's columns do not match its length");
        style(row, first, xfs);
    }

    void mulRk(std::span<const std::uint8_t> body)
    {
        ByteReader in(body, "a MULRK record");
        const int row = in.u16();
        const int first = in.u16();
        if (body.size() < 6 || (body.size() - 6) % 6 != 0)
            throw FormatError("a MULRK record has a wrong length");
        const std::size_t count = (body.size() - 6) / 6;
        if (loadU16(body.data() + body.size() - 2) != first + static_cast<int>(count) - 1
            || first + count > kMaxColumns)
            throw FormatError("a MULRK record's columns do not match its length");
        for (std::size_t i = 0; i < count; ++i) {
            const std::uint16_t xf = in.u16();
            number({ row, first + static_cast<int>(i), xf }, decodeRk(in.u32()));
        }
    }

    void number(const CellHeader& cell, double value)
    {
        if (m_globals.dates1904() && isDateFormat(m_globals.numberFormat(cell.xf)))
            value += k1904Offset;
        content(cell, value);
    }

    void content(const CellHeader& cell, CellContent value)
    {
        blank(cell);
        m_sheet.setContent({ cell.row + 1, cell.column + 1 }, std::move(value));
    }

    void formula(const FormulaRecord& record)
    {
        const CellPosition position { record.cell.row + 1, record.cell.column + 1 };
        blank(record.cell);
        m_textFor.reset();
        if (record.textFollows)
            m_textFor = position;
        if (!record.tokens.empty() && record.tokens[0] == kPtgExp) {
            ByteReader in(record.tokens.subspan(1), "a shared formula reference");
            const std::pair<int, int> anchor { in.u16(), in.u16() };
            if (const auto it = m_shared.find(anchor); it != m_shared.end())
                store(position, decodeFormula(it->second, position), record.result);
            else
                m_pending[anchor].push_back({ position, record.result });
            return;
        }
        store(position, decodeFormula(record.tokens, position), record.result);
    }

    void store(CellPosition position, std::optional<TokenArray> tokens, const CachedResult& result)
    {
        if (tokens)
            m_sheet.setContent(position, Formula { std::move(*tokens), cachedValue(result) });
        else
            m_sheet.setContent(position, cachedContent(result)); // keeps what the cell showed
    }

    void sharedFormula(std::span<const std::uint8_t> body)
    {
        ByteReader in(body, "a SHRFMLA record");
        const int firstRow = in.u16();
        in.u16();
        const int firstColumn = in.u8();
        in.skip(3);
        const std::size_t length = in.u16();
        const auto tokens = in.bytes(length);
        const std::pair<int, int> anchor { firstRow, firstColumn };
        m_shared[anchor] = tokens;
        if (const auto it = m_pending.find(anchor); it != m_pending.end()) {
            for (const PendingFormula& cell : it->second)
                store(cell.position, decodeFormula(tokens, cell.position), cell.result);
            m_pending.erase(it);
        }
    }

    // The text result of the formula just read.
    void formulaText(std::string text)
    {
        if (!m_textFor)
            return;
        if (Formula* formula = m_sheet.formula(*m_textFor))
            formula->cachedValue = std::move(text);
        else if (m_sheet.content(*m_textFor))
            m_sheet.setContent(*m_textFor, std::move(text));
        m_textFor.reset();
    }

    void margin(std::uint16_t type, double inches)
    {
        if (!std::isfinite(inches) || inches < 0 || inches > kMaxMarginInches)
            return;
        PageSetup& page = m_sheet.pageSetup();
        (type == biff::kLeftMargin           ? page.leftMarginInches
                : type == biff::kRightMargin ? page.rightMarginInches
                : type == biff::kTopMargin   ? page.topMarginInches
                                             : page.bottomMarginInches)
            = inches;
    }

    void finish()
    {
        for (auto& [anchor, cells] : m_pending) {
            for (const PendingFormula& cell : cells)
                store(cell.position, std::nullopt, cell.result);
        }
        finishPage();
        finishMerges();
        if (m_selection && !m_selection->areas.empty()) {
            const std::size_t chosen
                = m_selection->activeArea < m_selection->areas.size() ? m_selection->activeArea : 0;
            const CellArea& area = m_selection->areas[chosen];
            const Region region { area.firstRow + 1, area.firstColumn + 1, area.lastRow + 1, area.lastColumn + 1 };
            const CellPosition active { m_selection->activeRow + 1, m_selection->activeColumn + 1 };
            if (region.isValid())
                m_sheet.select(region.contains(active) ? region : Region::cell(region.topLeft()),
                    region.contains(active) ? active : region.topLeft());
        }
    }

    void finishPage()
    {
        PageSetup& page = m_sheet.pageSetup();
        if (m_setup) {
            if (m_setup->orientationKnown) {
                page.orientation = m_setup->landscape ? Orientation::Landscape : Orientation::Portrait;
                page.paperSize = m_setup->paperSize;
                page.zoomPercent = std::clamp<int>(m_setup->scale, kMinZoom, kMaxZoom);
            }
            page.fitToPagesWide = m_setup->fitWidth;
            page.fitToPagesTall = m_setup->fitHeight;
            page.comments = !m_setup->printNotes ? CommentPrinting::None
                : m_setup->notesAtEnd            ? CommentPrinting::AtEnd
                                                 : CommentPrinting::InPlace;
            for (auto [value, target] : { std::pair { m_setup->headerMargin, &page.headerMarginInches },
                     std::pair { m_setup->footerMargin, &page.footerMarginInches } }) {
                if (std::isfinite(value) && value >= 0 && value <= kMaxMarginInches)
                    *target = value;
            }
        }
        if (m_fitToPage)
            page.zoomPercent.reset();
    }

    // Merged areas must not overlap. Sorted by first row, the areas still open at a row can
    // only share it if their columns differ, so at most 256 are open at a time.
    void finishMerges()
    {
        std::sort(m_merged.begin(), m_merged.end(),
            [](const CellArea& a, const CellArea& b) { return a.firstRow < b.firstRow; });
        std::vector<CellArea> open;
        for (const CellArea& area : m_merged) {
            std::erase_if(open, [&](const CellArea& other) { return other.lastRow < area.firstRow; });
            for (const CellArea& other : open) {
                if (other.firstColumn <= area.lastColumn && area.firstColumn <= other.lastColumn)
                    throw FormatError("two merged areas of a worksheet overlap");
            }
            open.push_back(area);
        }
        for (const CellArea& area : m_merged)
            m_sheet.merge({ area.firstRow + 1, area.firstColumn + 1, area.lastRow + 1, area.lastColumn + 1 });
    }

    std::span<const std::uint8_t> m_stream;
    WorkbookGlobals& m_globals;
    Workbook& m_book;
    Sheet& m_sheet;
    std::array<ColumnInfo, kMaxColumns> m_columns {};
    double m_defaultWidth = kDefaultColumnWidthCharacters;
    bool m_columnsDone = false;
    bool m_active = false;
    std::optional<CellPosition> m_textFor;
    std::map<std::pair<int, int>, std::span<const std::uint8_t>> m_shared;
    std::map<std::pair<int, int>, std::vector<PendingFormula>> m_pending;
    std::vector<CellArea> m_merged;
    std::optional<SelectionRecord> m_selection;
    std::optional<SetupRecord> m_setup;
    bool m_fitToPage = false;
};

} // namespace

bool readSheet(std::span<const std::uint8_t> stream, std::uint32_t position, WorkbookGlobals& globals, Workbook& book,
    Sheet& sheet)
{
    return SheetReader(stream, globals, book, sheet).read(position);
}

} // namespace penmoor::xls
