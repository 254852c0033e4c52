#pragma once

#include <vector>

namespace penmoor::picture {

// Sheet units to screen pixels at 96 dots per inch, as the spreadsheet application converts them.
// Column widths count characters of the standard font: the widest digit of Arial 10 is 7 pixels
// and every column adds 5 pixels of padding and grid line, so w characters are trunc(w * 7 + 5)
// pixels; below one character the width shrinks in proportion to the 12 pixels of a
// one-character column. Row heights are points, 72 to the inch.
inline constexpr int kMaxDigitWidth = 7;
inline constexpr int kColumnPadding = 5;
inline constexpr int kMaxPictureSide = 32767;
inline constexpr long long kMaxPicturePixels = 1LL << 28;

int columnWidthToPixels(double characters);
int rowHeightToPixels(double points);

// A rectangle of pixels, right and bottom exclusive.
struct PixelRect {
    int left = 0;
    int top = 0;
    int right = 0;
    int bottom = 0;

    int width() const { return right - left; }
    int height() const { return bottom - top; }
    bool isEmpty() const { return right <= left || bottom <= top; }
    friend bool operator==(const PixelRect&, const PixelRect&) = default;
};

// Where the lines between the columns and rows of a block lie. The line before column c is at
// x = lineX(c), the sum of the widths of the columns before it; the closing line of the block is
// at lineX(columnCount()). A picture of the block is one pixel wider and taller than the sum of
// the sizes, so that the closing lines are part of it, and is bounded to kMaxPictureSide pixels a
// side and kMaxPicturePixels pixels in all, keeping its top-left part.
class GridGeometry {
public:
    GridGeometry(const std::vector<int>& columnPixels, const std::vector<int>& rowPixels);

    int columnCount() const { return static_cast<int>(m_x.size()) - 1; }
    int rowCount() const { return static_cast<int>(m_y.size()) - 1; }
    long long lineX(int column) const { return m_x[static_cast<std::size_t>(column)]; }
    long long lineY(int row) const { return m_y[static_cast<std::size_t>(row)]; }

    // The size of the picture, after the bound.
    int pictureWidth() const { return m_pictureWidth; }
    int pictureHeight() const { return m_pictureHeight; }
    // Columns and rows that show at least partly in the bounded picture.
    int visibleColumnCount() const;
    int visibleRowCount() const;

    // The cells from (firstRow, firstColumn) to (lastRow, lastColumn), lines included.
    PixelRect blockRect(int firstRow, int firstColumn, int lastRow, int lastColumn) const;
    // The inside of those cells, without the lines around them.
    PixelRect blockInterior(int firstRow, int firstColumn, int lastRow, int lastColumn) const;

private:
    std::vector<long long> m_x;
    std::vector<long long> m_y;
    int m_pictureWidth = 0;
    int m_pictureHeight = 0;
};

} // namespace penmoor::picture
