#include "spreadsheet/picture/geometry.h"

#include <algorithm>
#include <cmath>

namespace penmoor::picture {

namespace {

int clampToInt(long long value)
{
    return static_cast<int>(std::clamp<long long>(value, 0, kMaxPictureSide + 1LL));
}

int countBelow(const std::vector<long long>& lines, long long limit)
{
    // Items whose leading line lies inside the picture.
    const auto end = std::lower_bound(lines.begin(), lines.end() - 1, limit);
    return static_cast<int>(end - lines.begin());
}

} // namespace

int columnWidthToPixels(double characters)
{
    if (!(characters > 0.0)) {
        return 0;
    }
    if (characters < 1.0) {
        return static_cast<int>(std::lround(characters * (kMaxDigitWidth + kColumnPadding)));
    }
    return static_cast<int>(std::trunc(characters * kMaxDigitWidth + kColumnPadding));
}

int rowHeightToPixels(double points)
{
    if (!(points > 0.0)) {
        return 0;
    }
    return static_cast<int>(std::lround(points * 96.0 / 72.0));
}

GridGeometry::GridGeometry(const std::vector<int>& columnPixels, const std::vector<int>& rowPixels)
{
    m_x.reserve(columnPixels.size() + 1);
    m_y.reserve(rowPixels.size() + 1);
    m_x.push_back(0);
    for (int width : columnPixels) {
        m_x.push_back(m_x.back() + std::max(width, 0));
    }
    m_y.push_back(0);
    for (int height : rowPixels) {
        m_y.push_back(m_y.back() + std::max(height, 0));
    }
    const long long fullWidth = m_x.back() + 1;
    const long long fullHeight = m_y.back() + 1;
    m_pictureWidth = static_cast<int>(std::min<long long>(fullWidth, kMaxPictureSide));
    m_pictureHeight = static_cast<int>(std::min<long long>(fullHeight, kMaxPictureSide));
    if (static_cast<long long>(m_pictureWidth) * m_pictureHeight > kMaxPicturePixels) {
        m_pictureHeight = static_cast<int>(kMaxPicturePixels / m_pictureWidth);
    }
}

int GridGeometry::visibleColumnCount() const
{
    return countBelow(m_x, m_pictureWidth);
}

int GridGeometry::visibleRowCount() const
{
    return countBelow(m_y, m_pictureHeight);
}

PixelRect GridGeometry::blockRect(int firstRow, int firstColumn, int lastRow, int lastColumn) const
{
    return { clampToInt(lineX(firstColumn)), clampToInt(lineY(firstRow)), clampToInt(lineX(lastColumn + 1) + 1),
        clampToInt(lineY(lastRow + 1) + 1) };
}

PixelRect GridGeometry::blockInterior(int firstRow, int firstColumn, int lastRow, int lastColumn) const
{
    return { clampToInt(lineX(firstColumn) + 1), clampToInt(lineY(firstRow) + 1), clampToInt(lineX(lastColumn + 1)),
        clampToInt(lineY(lastRow + 1)) };
}

} // namespace penmoor::picture
