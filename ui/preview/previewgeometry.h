#pragma once

#include <array>
#include <cstddef>
#include <cstdint>
#include <optional>

namespace penmoor {

struct PixelSize {
    int width = 0;
    int height = 0;

    friend bool operator==(const PixelSize&, const PixelSize&) = default;
};

struct PixelPoint {
    int x = 0;
    int y = 0;

    friend bool operator==(const PixelPoint&, const PixelPoint&) = default;
};

enum class Axis { Horizontal, Vertical };

enum class ZoomDirection { In, Out };

// One scroll bar of the preview: the picture moves step pixels per unit of value.
struct PictureScrollBar {
    bool enabled = false;
    int maximum = 0;
    int value = 0;
    int step = 0; // HScrollStep or VScrollStep: 0 (disabled), 1 or 10

    friend bool operator==(const PictureScrollBar&, const PictureScrollBar&) = default;
};

// The value of a bar of that maximum at percent of its length, halves to even; none for a
// negative percent. Never outside 0 .. maximum.
std::optional<int> scrollValueAtPercent(int maximum, std::int16_t percent);

// Zoom, scroll bars and dragging of the preview, in pixels and without any widget: the
// window forwards its events here and shows the result. Picture1 is the picture as drawn,
// Picture2 the viewport that clips it; neither has a border, so their inner and outer sizes
// are the same.
class PreviewGeometry {
public:
    static constexpr float kMinimumZoom = 0.25f;
    static constexpr float kMaximumZoom = 2.75f;
    static constexpr float kZoomStep = 0.25f;
    // A picture is drawn only below these sizes; a zoom step beyond them returns to 1.0.
    static constexpr int kDrawnWidthLimit = 4000;
    static constexpr int kDrawnHeightLimit = 9000;
    // Overflows up to this many pixels scroll one pixel per unit, larger ones ten.
    static constexpr int kFinestOverflow = 100;
    static constexpr int kCoarseStep = 10;

    explicit PreviewGeometry(PixelSize viewport);

    // The set-up for a new picture of that size: zoom 1.0, the picture at its own size in the
    // top left corner, the bars set up for it.
    void setUp(PixelSize picture);

    // One zoom step; true when the picture is to be drawn anew at zoomed().
    bool ZoomBy(ZoomDirection direction);
    // A factor outside kMinimumZoom .. kMaximumZoom changes nothing and gives false.
    bool SetZoom(float factor);

    // A bar's value changed, whoever changed it: the picture follows.
    void scrollTo(Axis axis, int value);
    void SetHScrollbarByPercent(std::int16_t percent);
    void SetVScrollbarByPercent(std::int16_t percent);

    // Dragging the picture, with the pointer's position inside Picture1.
    void press(PixelPoint pointer);
    void dragTo(PixelPoint pointer);
    // The bars take the position the picture was dragged to, and the picture settles on
    // their step grid.
    void release();

    PixelSize viewport() const { return m_viewport; }
    float zoomFactor() const { return m_zoomFactor; }
    PixelSize source() const { return m_source; }
    PixelSize zoomed() const { return m_zoomed; }
    // Picture1's size: the size at which the picture was last drawn.
    PixelSize picture() const { return m_picture; }
    // Picture1's top left corner inside the viewport.
    PixelPoint position() const { return m_position; }
    const PictureScrollBar& bar(Axis axis) const { return m_bars[index(axis)]; }

private:
    static std::size_t index(Axis axis) { return axis == Axis::Horizontal ? 0 : 1; }
    static int extent(PixelSize size, Axis axis) { return axis == Axis::Horizontal ? size.width : size.height; }
    static int along(PixelPoint point, Axis axis) { return axis == Axis::Horizontal ? point.x : point.y; }
    int& coordinate(Axis axis) { return axis == Axis::Horizontal ? m_position.x : m_position.y; }

    // True when drawn; otherwise the zoom returns to 1.0 and the picture keeps its size.
    bool DrawZoomed();
    void SetupScrollbars();
    void setUpBar(Axis axis);
    void setBarValue(Axis axis, int value);
    void setScrollbarByPercent(Axis axis, std::int16_t percent);
    int boundedDrag(Axis axis, int wanted) const;
    // The share of the overflow that the picture is moved by, as a whole percent; none when
    // the picture is not larger than the viewport on that axis.
    std::optional<std::int16_t> draggedPercent(Axis axis) const;

    PixelSize m_viewport;
    float m_zoomFactor = 1.0f;
    PixelSize m_source;
    PixelSize m_zoomed;
    PixelSize m_picture;
    PixelPoint m_position;
    std::array<PictureScrollBar, 2> m_bars;
    PixelPoint m_dragStart;
};

} // namespace penmoor
