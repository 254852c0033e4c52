#include "spreadsheet/picture/picturelayout.h"

#include "spreadsheet/picture/celltext.h"
#include "spreadsheet/picture/numberformat.h"

#include <algorithm>
#include <unordered_map>

namespace penmoor::picture {

namespace {

// Text keeps 2 pixels from the grid line on the left and 2 from the one on the right: with the
// line itself these are the 5 pixels of padding that every column adds to its characters.
constexpr int kTextInsetLeft = 3;
constexpr int kTextInsetRight = 2;

class LayoutBuilder {
public:
    LayoutBuilder(const SheetRegion& region, const TextMetrics& metrics)
        : m_region(region)
        , m_metrics(metrics)
        , m_grid(pixelSizes(region.columnWidths, columnWidthToPixels), pixelSizes(region.rowHeights, rowHeightToPixels))
        , m_rows(std::min(region.rowCount(), m_grid.visibleRowCount()))
        , m_columns(std::min(region.columnCount(), m_grid.visibleColumnCount()))
    {
        m_layout.width = m_grid.pictureWidth();
        m_layout.height = m_grid.pictureHeight();
        indexMerges();
        indexValues();
        m_spilledEdges.assign(static_cast<std::size_t>(m_rows) * static_cast<std::size_t>(m_columns + 1), false);
    }

    PictureLayout build()
    {
        layOutFills();
        for (const CellValue* cell : m_values) {
            layOutText(*cell);
        }
        if (m_region.showGridlines) {
            layOutGridlines();
        }
        layOutBorders();
        return std::move(m_layout);
    }

private:
    template <typename Convert> static std::vector<int> pixelSizes(const std::vector<double>& sizes, Convert convert)
    {
        std::vector<int> pixels;
        pixels.reserve(sizes.size());
        for (double size : sizes) {
            pixels.push_back(convert(size));
        }
        return pixels;
    }

    std::size_t cellIndex(int row, int column) const
    {
        return static_cast<std::size_t>(row) * static_cast<std::size_t>(m_columns) + static_cast<std::size_t>(column);
    }

    int clampX(long long x) const { return static_cast<int>(std::clamp<long long>(x, 0, m_layout.width)); }
    int clampY(long long y) const { return static_cast<int>(std::clamp<long long>(y, 0, m_layout.height)); }
    bool hasWidth(int column) const { return m_grid.lineX(column + 1) > m_grid.lineX(column); }
    bool hasHeight(int row) const { return m_grid.lineY(row + 1) > m_grid.lineY(row); }

    void indexMerges()
    {
        if (m_region.merges.empty()) {
            return;
        }
        m_mergeAt.assign(static_cast<std::size_t>(m_rows) * static_cast<std::size_t>(m_columns), -1);
        for (std::size_t k = 0; k < m_region.merges.size(); ++k) {
            const CellBlock& block = m_region.merges[k];
            for (int row = std::max(block.firstRow, 0); row <= std::min(block.lastRow, m_rows - 1); ++row) {
                for (int column = std::max(block.firstColumn, 0); column <= std::min(block.lastColumn, m_columns - 1);
                     ++column) {
                    int& slot = m_mergeAt[cellIndex(row, column)];
                    if (slot < 0) {
                        slot = static_cast<int>(k);
                    }
                }
            }
        }
    }

    void indexValues()
    {
        for (const CellValue& cell : m_region.values) {
            if (cell.row >= 0 && cell.row < m_rows && cell.column >= 0 && cell.column < m_columns
                && !std::holds_alternative<std::monostate>(cell.value)) {
                m_values.push_back(&cell);
            }
        }
        std::stable_sort(m_values.begin(), m_values.end(), [](const CellValue* a, const CellValue* b) {
            return a->row != b->row ? a->row < b->row : a->column < b->column;
        });
        m_rowStart.assign(static_cast<std::size_t>(m_rows) + 1, 0);
        for (const CellValue* cell : m_values) {
            ++m_rowStart[static_cast<std::size_t>(cell->row) + 1];
        }
        for (std::size_t row = 1; row < m_rowStart.size(); ++row) {
            m_rowStart[row] += m_rowStart[row - 1];
        }
    }

    bool hasValue(int row, int column) const
    {
        const auto first = m_values.begin() + static_cast<long>(m_rowStart[static_cast<std::size_t>(row)]);
        const auto last = m_values.begin() + static_cast<long>(m_rowStart[static_cast<std::size_t>(row) + 1]);
        const auto found = std::lower_bound(
            first, last, column, [](const CellValue* cell, int wanted) { return cell->column < wanted; });
        return found != last && (*found)->column == column;
    }

    int mergeAt(int row, int column) const { return m_mergeAt.empty() ? -1 : m_mergeAt[cellIndex(row, column)]; }

    // The cell, or the merged area it belongs to, cut to the visible part.
    CellBlock spanOf(int row, int column) const
    {
        const int merge = mergeAt(row, column);
        if (merge < 0) {
            return { row, column, row, column };
        }
        const CellBlock& block = m_region.merges[static_cast<std::size_t>(merge)];
        return { std::max(block.firstRow, 0), std::max(block.firstColumn, 0), std::min(block.lastRow, m_rows - 1),
            std::min(block.lastColumn, m_columns - 1) };
    }

    // The format that decides fill and text of a cell: a merged area's top-left cell.
    const CellFormat& leadingFormat(int row, int column) const
    {
        const CellBlock span = spanOf(row, column);
        return m_region.formatAt(span.firstRow, span.firstColumn);
    }

    bool isFilled(int row, int column) const { return leadingFormat(row, column).fillColorIndex != kNoFill; }

    std::uint32_t colorOf(int colorIndex) const
    {
        if (colorIndex < 1 || colorIndex > static_cast<int>(m_region.palette.size())) {
            return 0x000000; // automatic
        }
        return paletteRgb(m_region.palette[static_cast<std::size_t>(colorIndex - 1)]);
    }

    const NumberFormat& numberFormat(const std::string& code)
    {
        auto found = m_numberFormats.find(code);
        if (found == m_numberFormats.end()) {
            found = m_numberFormats.emplace(code, NumberFormat(code)).first;
        }
        return found->second;
    }

    void layOutFills()
    {
        for (int row = 0; row < m_rows; ++row) {
            if (!hasHeight(row)) {
                continue;
            }
            int runStart = -1;
            int runColor = kNoFill;
            auto closeRun = [&](int endColumn) {
                if (runStart >= 0) {
                    addFill(m_grid.blockRect(row, runStart, row, endColumn), runColor);
                }
                runStart = -1;
            };
            for (int column = 0; column < m_columns; ++column) {
                const CellBlock span = spanOf(row, column);
                const bool merged = span.lastRow > span.firstRow || span.lastColumn > span.firstColumn;
                const int color = m_region.formatAt(span.firstRow, span.firstColumn).fillColorIndex;
                if (merged || color == kNoFill || color != runColor) {
                    closeRun(column - 1);
                }
                if (merged) {
                    if (row == span.firstRow && column == span.firstColumn && color != kNoFill) {
                        addFill(
                            m_grid.blockRect(span.firstRow, span.firstColumn, span.lastRow, span.lastColumn), color);
                    }
                } else if (color != kNoFill && runStart < 0) {
                    runStart = column;
                    runColor = color;
                }
            }
            closeRun(m_columns - 1);
        }
    }

    void addFill(const PixelRect& rect, int colorIndex)
    {
        PixelRect clipped { clampX(rect.left), clampY(rect.top), clampX(rect.right), clampY(rect.bottom) };
        if (!clipped.isEmpty()) {
            m_layout.fills.push_back({ clipped, colorOf(colorIndex) });
        }
    }

    bool canSpillInto(int row, int column) const
    {
        return column >= 0 && column < m_columns && !hasValue(row, column) && mergeAt(row, column) < 0;
    }

    // How far unwrapped text that needs `room` more pixels on one side runs into empty
    // neighbours: the last column it reaches.
    int spill(int row, int column, int room, int step)
    {
        int reached = column;
        auto gained = [&] {
            return step > 0 ? m_grid.lineX(reached + 1) - m_grid.lineX(column + 1)
                            : m_grid.lineX(column) - m_grid.lineX(reached);
        };
        while (room > 0 && gained() < room && canSpillInto(row, reached + step)) {
            reached += step;
            const int edge = step > 0 ? reached : reached + 1;
            m_spilledEdges[static_cast<std::size_t>(row) * static_cast<std::size_t>(m_columns + 1)
                + static_cast<std::size_t>(edge)]
                = true;
        }
        return reached;
    }

    void layOutText(const CellValue& cell)
    {
        const int merge = mergeAt(cell.row, cell.column);
        const CellBlock span = spanOf(cell.row, cell.column);
        if (merge >= 0 && (cell.row != span.firstRow || cell.column != span.firstColumn)) {
            return; // hidden under a merged area
        }
        if (!hasHeight(cell.row) || !hasWidth(cell.column)) {
            return;
        }
        const CellFormat& format = m_region.formatAt(cell.row, cell.column);
        const ShownValue shown = numberFormat(format.numberFormat).show(cell.value);
        const long long boxLeft = m_grid.lineX(span.firstColumn) + kTextInsetLeft;
        const long long boxRight = m_grid.lineX(span.lastColumn + 1) - kTextInsetRight;
        const int boxWidth = static_cast<int>(std::max<long long>(boxRight - boxLeft, 0));

        std::vector<std::string> lines;
        if (shown.isNumber) {
            lines.push_back(fitNumber(shown, format.font, boxWidth, m_metrics));
        } else if (!shown.forms.empty()) {
            std::string text = expandFill(shown.forms.front(), format.font, boxWidth, m_metrics);
            if (format.wrap) {
                lines = wrapText(text, format.font, boxWidth, m_metrics);
            } else {
                std::erase_if(text, [](char c) { return c == '\n' || c == '\r'; });
                lines.push_back(std::move(text));
            }
        }
        if (lines.empty()) {
            return;
        }

        HorizontalAlignment side = format.horizontal;
        if (side == HorizontalAlignment::General) {
            const GeneralSide general = generalSide(cell.value);
            side = general == GeneralSide::Right ? HorizontalAlignment::Right
                : general == GeneralSide::Center ? HorizontalAlignment::Center
                                                 : HorizontalAlignment::Left;
        }

        PixelRect clip = m_grid.blockInterior(span.firstRow, span.firstColumn, span.lastRow, span.lastColumn);
        const bool single = merge < 0;
        if (!shown.isNumber && !format.wrap && single) {
            const int overflow = m_metrics.width(format.font, lines.front()) - boxWidth;
            if (overflow > 0) {
                const int right = side == HorizontalAlignment::Left ? overflow
                    : side == HorizontalAlignment::Center           ? (overflow + 1) / 2
                                                                    : 0;
                const int left = side == HorizontalAlignment::Right ? overflow
                    : side == HorizontalAlignment::Center           ? (overflow + 1) / 2
                                                                    : 0;
                const int lastColumn = spill(cell.row, cell.column, right, +1);
                const int firstColumn = spill(cell.row, cell.column, left, -1);
                clip.left = static_cast<int>(std::min<long long>(m_grid.lineX(firstColumn) + 1, clip.left));
                clip.right = static_cast<int>(std::min<long long>(m_grid.lineX(lastColumn + 1), kMaxPictureSide));
            }
        }
        clip = { clampX(clip.left), clampY(clip.top), clampX(clip.right), clampY(clip.bottom) };
        if (clip.isEmpty()) {
            return;
        }

        const int ascent = m_metrics.ascent(format.font);
        const int descent = m_metrics.descent(format.font);
        const int lineHeight = ascent + descent;
        const int blockHeight = lineHeight * static_cast<int>(lines.size());
        const long long top = m_grid.lineY(span.firstRow) + 1;
        const long long bottom = m_grid.lineY(span.lastRow + 1);
        long long baseline = 0;
        switch (format.vertical) {
        case VerticalAlignment::Top:
            baseline = top + ascent;
            break;
        case VerticalAlignment::Center:
            baseline = top + (bottom - top - blockHeight) / 2 + ascent;
            break;
        case VerticalAlignment::Bottom:
            baseline = bottom - 1 - descent - static_cast<long long>(blockHeight - lineHeight);
            break;
        }

        std::uint32_t rgb = colorOf(format.fontColorIndex);
        if (shown.color.kind == FormatColor::Kind::Rgb) {
            rgb = shown.color.value;
        } else if (shown.color.kind == FormatColor::Kind::Palette) {
            rgb = colorOf(static_cast<int>(shown.color.value));
        }

        for (std::string& line : lines) {
            if (!line.empty() && baseline - ascent < clip.bottom && baseline + descent > clip.top) {
                const int width = m_metrics.width(format.font, line);
                long long x = boxLeft;
                if (side == HorizontalAlignment::Right) {
                    x = boxRight - width;
                } else if (side == HorizontalAlignment::Center) {
                    x = boxLeft + (boxWidth - width) / 2;
                }
                m_layout.texts.push_back(
                    { std::move(line), format.font, rgb, static_cast<int>(x), static_cast<int>(baseline), clip });
            }
            baseline += lineHeight;
        }
    }

    bool sameMerge(int rowA, int columnA, int rowB, int columnB) const
    {
        const int merge = mergeAt(rowA, columnA);
        return merge >= 0 && merge == mergeAt(rowB, columnB);
    }

    // Appends a one-cell piece of a line, joining it to the previous piece where they continue.
    static void addPiece(std::vector<LineSegment>& lines, LineSegment piece)
    {
        if (!lines.empty()) {
            LineSegment& last = lines.back();
            if (last.orientation == piece.orientation && last.position == piece.position && last.rgb == piece.rgb
                && last.weight == piece.weight && last.to >= piece.from - 1 && last.to < piece.to) {
                last.to = piece.to;
                return;
            }
        }
        lines.push_back(piece);
    }

    bool gridlineHiddenVertical(int row, int edge) const
    {
        const bool hasLeft = edge > 0;
        const bool hasRight = edge < m_columns;
        if ((hasLeft && isFilled(row, edge - 1)) || (hasRight && isFilled(row, edge))) {
            return true;
        }
        if (hasLeft && hasRight && sameMerge(row, edge - 1, row, edge)) {
            return true;
        }
        return m_spilledEdges[static_cast<std::size_t>(row) * static_cast<std::size_t>(m_columns + 1)
            + static_cast<std::size_t>(edge)];
    }

    bool gridlineHiddenHorizontal(int edge, int column) const
    {
        const bool hasAbove = edge > 0;
        const bool hasBelow = edge < m_rows;
        if ((hasAbove && isFilled(edge - 1, column)) || (hasBelow && isFilled(edge, column))) {
            return true;
        }
        return hasAbove && hasBelow && sameMerge(edge - 1, column, edge, column);
    }

    void layOutGridlines()
    {
        using Orientation = LineSegment::Orientation;
        for (int edge = 0; edge <= m_columns; ++edge) {
            for (int row = 0; row < m_rows; ++row) {
                if (hasHeight(row) && !gridlineHiddenVertical(row, edge)) {
                    addPiece(m_layout.gridlines,
                        { Orientation::Vertical, clampX(m_grid.lineX(edge)), clampY(m_grid.lineY(row)),
                            clampY(m_grid.lineY(row + 1)), kGridlineColor, BorderWeight::Thin });
                }
            }
        }
        for (int edge = 0; edge <= m_rows; ++edge) {
            for (int column = 0; column < m_columns; ++column) {
                if (hasWidth(column) && !gridlineHiddenHorizontal(edge, column)) {
                    addPiece(m_layout.gridlines,
                        { Orientation::Horizontal, clampY(m_grid.lineY(edge)), clampX(m_grid.lineX(column)),
                            clampX(m_grid.lineX(column + 1)), kGridlineColor, BorderWeight::Thin });
                }
            }
        }
        dropOutside(m_layout.gridlines);
    }

    // A shared edge shows a line if either cell sets one; the cell before it (left or above)
    // decides the look when both do.
    static const Edge* chooseEdge(const Edge* before, const Edge* after)
    {
        if (before && before->isSet()) {
            return before;
        }
        if (after && after->isSet()) {
            return after;
        }
        return nullptr;
    }

    void layOutBorders()
    {
        using Orientation = LineSegment::Orientation;
        for (int edge = 0; edge <= m_columns; ++edge) {
            for (int row = 0; row < m_rows; ++row) {
                if (!hasHeight(row) || (edge > 0 && edge < m_columns && sameMerge(row, edge - 1, row, edge))) {
                    continue;
                }
                const Edge* line = chooseEdge(edge > 0 ? &m_region.formatAt(row, edge - 1).right : nullptr,
                    edge < m_columns ? &m_region.formatAt(row, edge).left : nullptr);
                if (line) {
                    addPiece(m_layout.borders,
                        { Orientation::Vertical, clampX(m_grid.lineX(edge)), clampY(m_grid.lineY(row)),
                            clampY(m_grid.lineY(row + 1)), colorOf(line->colorIndex), line->weight });
                }
            }
        }
        for (int edge = 0; edge <= m_rows; ++edge) {
            for (int column = 0; column < m_columns; ++column) {
                if (!hasWidth(column) || (edge > 0 && edge < m_rows && sameMerge(edge - 1, column, edge, column))) {
                    continue;
                }
                const Edge* line = chooseEdge(edge > 0 ? &m_region.formatAt(edge - 1, column).bottom : nullptr,
                    edge < m_rows ? &m_region.formatAt(edge, column).top : nullptr);
                if (line) {
                    addPiece(m_layout.borders,
                        { Orientation::Horizontal, clampY(m_grid.lineY(edge)), clampX(m_grid.lineX(column)),
                            clampX(m_grid.lineX(column + 1)), colorOf(line->colorIndex), line->weight });
                }
            }
        }
        dropOutside(m_layout.borders);
    }

    // Lines that fall on or beyond the bounded picture's edge are not drawn.
    void dropOutside(std::vector<LineSegment>& lines) const
    {
        std::erase_if(lines, [this](const LineSegment& line) {
            const int limit = line.orientation == LineSegment::Orientation::Vertical ? m_layout.width : m_layout.height;
            return line.position >= limit;
        });
    }

    const SheetRegion& m_region;
    const TextMetrics& m_metrics;
    GridGeometry m_grid;
    int m_rows;
    int m_columns;
    std::vector<int> m_mergeAt; // merge index per visible cell, -1 outside; empty without merges
    std::vector<const CellValue*> m_values; // visible cells with a value, row by row
    std::vector<std::size_t> m_rowStart; // where each row's values begin in m_values
    std::vector<bool> m_spilledEdges; // vertical edges crossed by spilled text, per row
    std::unordered_map<std::string, NumberFormat> m_numberFormats;
    PictureLayout m_layout;
};

} // namespace

std::uint32_t paletteRgb(std::uint32_t paletteValue)
{
    const std::uint32_t red = paletteValue & 0xFF;
    const std::uint32_t green = (paletteValue >> 8) & 0xFF;
    const std::uint32_t blue = (paletteValue >> 16) & 0xFF;
    return (red << 16) | (green << 8) | blue;
}

PictureLayout layOutPicture(const SheetRegion& region, const TextMetrics& metrics)
{
    return LayoutBuilder(region, metrics).build();
}

} // namespace penmoor::picture
