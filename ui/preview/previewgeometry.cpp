#include "ui/preview/previewgeometry.h"

#include <algorithm>
#include <cmath>
#include <limits>

namespace penmoor {

namespace {

// Rounds to the nearest whole number, halves to the even one (10.5 gives 10, 11.5 gives 12),
// as the scroll ranges and percentages of the preview are defined; kept within [low, high].
int roundHalfEven(double value, int low, int high)
{
    // nearbyint rounds in the current mode, which is round-to-nearest-even unless changed.
    const double rounded = std::nearbyint(value);
    return static_cast<int>(std::clamp(rounded, static_cast<double>(low), static_cast<double>(high)));
}

int scaled(float factor, int size)
{
    const double product = std::floor(static_cast<double>(factor) * size);
    return static_cast<int>(std::min(product, static_cast<double>(std::numeric_limits<int>::max())));
}

} // namespace

std::optional<int> scrollValueAtPercent(int maximum, std::int16_t percent)
{
    if (percent < 0) {
        return std::nullopt;
    }
    return roundHalfEven(percent / 100.0 * maximum, 0, std::max(maximum, 0));
}

PreviewGeometry::PreviewGeometry(PixelSize viewport)
    : m_viewport(viewport)
{
}

void PreviewGeometry::setUp(PixelSize picture)
{
    m_picture = { std::max(picture.width, 0), std::max(picture.height, 0) };
    m_zoomFactor = 1.0f;
    m_source = m_picture;
    m_zoomed = m_source;
    DrawZoomed();
    SetupScrollbars();
}

bool PreviewGeometry::ZoomBy(ZoomDirection direction)
{
    return SetZoom(direction == ZoomDirection::In ? m_zoomFactor + kZoomStep : m_zoomFactor - kZoomStep);
}

bool PreviewGeometry::SetZoom(float factor)
{
    if (!(factor >= kMinimumZoom && factor <= kMaximumZoom)) {
        return false;
    }
    m_zoomFactor = factor;
    const bool drawn = DrawZoomed();
    SetupScrollbars();
    return drawn;
}

bool PreviewGeometry::DrawZoomed()
{
    m_zoomed = { scaled(m_zoomFactor, m_source.width), scaled(m_zoomFactor, m_source.height) };
    if (m_zoomed.width < kDrawnWidthLimit && m_zoomed.height < kDrawnHeightLimit) {
        m_picture = m_zoomed;
        setBarValue(Axis::Horizontal, 0);
        setBarValue(Axis::Vertical, 0);
        return true;
    }
    // Too large to draw: the next step starts from 1.0 again, the picture stays as it was.
    m_zoomFactor = 1.0f;
    m_zoomed = m_source;
    return false;
}

void PreviewGeometry::SetupScrollbars()
{
    m_position = {};
    setUpBar(Axis::Horizontal);
    setUpBar(Axis::Vertical);
}

void PreviewGeometry::setUpBar(Axis axis)
{
    PictureScrollBar& bar = m_bars[index(axis)];
    const int overflow = extent(m_picture, axis) - extent(m_viewport, axis);
    if (overflow <= 0) {
        bar = {};
    } else if (overflow <= kFinestOverflow) {
        bar = { true, overflow, 0, 1 };
    } else {
        bar = { true, roundHalfEven(static_cast<double>(overflow) / kCoarseStep, 0, overflow), 0, kCoarseStep };
    }
}

void PreviewGeometry::setBarValue(Axis axis, int value)
{
    PictureScrollBar& bar = m_bars[index(axis)];
    bar.value = std::clamp(value, 0, bar.maximum);
    coordinate(axis) = -(bar.step * bar.value);
}

void PreviewGeometry::scrollTo(Axis axis, int value)
{
    setBarValue(axis, value);
}

void PreviewGeometry::SetHScrollbarByPercent(std::int16_t percent)
{
    setScrollbarByPercent(Axis::Horizontal, percent);
}

void PreviewGeometry::SetVScrollbarByPercent(std::int16_t percent)
{
    setScrollbarByPercent(Axis::Vertical, percent);
}

void PreviewGeometry::setScrollbarByPercent(Axis axis, std::int16_t percent)
{
    if (const std::optional<int> value = scrollValueAtPercent(bar(axis).maximum, percent)) {
        setBarValue(axis, *value);
    }
}

void PreviewGeometry::press(PixelPoint pointer)
{
    m_dragStart = pointer;
}

void PreviewGeometry::dragTo(PixelPoint pointer)
{
    const PixelPoint wanted { m_position.x - m_dragStart.x + pointer.x, m_position.y - m_dragStart.y + pointer.y };
    m_position = { boundedDrag(Axis::Horizontal, wanted.x), boundedDrag(Axis::Vertical, wanted.y) };
}

int PreviewGeometry::boundedDrag(Axis axis, int wanted) const
{
    // Never right of (or below) the viewport's edge, never leaving a gap at the far edge. A
    // picture smaller than the viewport thus sits at one of the two edges.
    if (wanted > 0) {
        return 0;
    }
    return std::max(wanted, extent(m_viewport, axis) - extent(m_picture, axis));
}

void PreviewGeometry::release()
{
    const std::optional<std::int16_t> horizontal = draggedPercent(Axis::Horizontal);
    const std::optional<std::int16_t> vertical = draggedPercent(Axis::Vertical);
    if (horizontal) {
        SetHScrollbarByPercent(*horizontal);
    }
    if (vertical) {
        SetVScrollbarByPercent(*vertical);
    }
}

std::optional<std::int16_t> PreviewGeometry::draggedPercent(Axis axis) const
{
    const int overflow = extent(m_picture, axis) - extent(m_viewport, axis);
    if (overflow <= 0) {
        return std::nullopt;
    }
    const int moved = std::abs(along(m_position, axis));
    return static_cast<std::int16_t>(roundHalfEven(static_cast<double>(moved) / overflow * 100,
        std::numeric_limits<std::int16_t>::min(), std::numeric_limits<std::int16_t>::max()));
}

} // namespace penmoor
