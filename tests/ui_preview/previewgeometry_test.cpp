#include "ui/preview/previewgeometry.h"

#include <vector>

#include <gtest/gtest.h>

namespace penmoor {

void PrintTo(const PixelSize& size, std::ostream* out)
{
    *out << size.width << " x " << size.height;
}

void PrintTo(const PixelPoint& point, std::ostream* out)
{
    *out << "(" << point.x << ", " << point.y << ")";
}

void PrintTo(const PictureScrollBar& bar, std::ostream* out)
{
    *out << (bar.enabled ? "enabled" : "disabled") << ", maximum " << bar.maximum << ", value " << bar.value
         << ", step " << bar.step;
}

namespace {

constexpr PixelSize kViewport { 622, 495 };

PreviewGeometry geometryFor(PixelSize picture)
{
    PreviewGeometry geometry(kViewport);
    geometry.setUp(picture);
    return geometry;
}

// Drags with the pointer given in viewport coordinates, as the user moves it; the geometry
// sees it inside Picture1, which moves under it.
void drag(PreviewGeometry& geometry, PixelPoint from, const std::vector<PixelPoint>& path)
{
    const auto inPicture = [&](PixelPoint p) {
        return PixelPoint { p.x - geometry.position().x, p.y - geometry.position().y };
    };
    geometry.press(inPicture(from));
    for (const PixelPoint& p : path) {
        geometry.dragTo(inPicture(p));
    }
}

TEST(PreviewZoomTest, StepsStopAtTheirLimitsWithoutComplaint)
{
    PreviewGeometry geometry = geometryFor({ 400, 300 });
    for (const float expected : { 1.25f, 1.5f, 1.75f, 2.0f, 2.25f, 2.5f, 2.75f }) {
        EXPECT_TRUE(geometry.ZoomBy(ZoomDirection::In));
        EXPECT_EQ(geometry.zoomFactor(), expected);
    }
    EXPECT_FALSE(geometry.ZoomBy(ZoomDirection::In));
    EXPECT_EQ(geometry.zoomFactor(), 2.75f);
    EXPECT_EQ(geometry.picture(), (PixelSize { 1100, 825 }));

    geometry.setUp({ 400, 300 });
    for (const float expected : { 0.75f, 0.5f, 0.25f }) {
        EXPECT_TRUE(geometry.ZoomBy(ZoomDirection::Out));
        EXPECT_EQ(geometry.zoomFactor(), expected);
    }
    EXPECT_FALSE(geometry.ZoomBy(ZoomDirection::Out));
    EXPECT_EQ(geometry.zoomFactor(), 0.25f);
    EXPECT_EQ(geometry.picture(), (PixelSize { 100, 75 }));

    for (const float factor : { 0.0f, 0.2f, 2.8f, -1.0f }) {
        EXPECT_FALSE(geometry.SetZoom(factor)) << factor;
        EXPECT_EQ(geometry.zoomFactor(), 0.25f) << factor;
    }
}

TEST(PreviewZoomTest, ZoomedSizesAreTheFloorOfFactorTimesSource)
{
    const struct {
        PixelSize source;
        float factor;
        PixelSize drawn;
    } cases[] = {
        { { 1000, 800 }, 2.75f, { 2750, 2200 } },
        { { 1000, 800 }, 0.25f, { 250, 200 } },
        { { 333, 101 }, 1.25f, { 416, 126 } },
        { { 3, 1 }, 0.25f, { 0, 0 } },
    };
    for (const auto& c : cases) {
        PreviewGeometry geometry = geometryFor(c.source);
        EXPECT_TRUE(geometry.SetZoom(c.factor));
        EXPECT_EQ(geometry.zoomed(), c.drawn) << c.factor;
        EXPECT_EQ(geometry.picture(), c.drawn) << c.factor;
        EXPECT_EQ(geometry.source(), c.source);
    }
}

TEST(PreviewZoomTest, AStepBeyondTheSizeLimitsIsNotDrawnAndZoomStartsAgainFromOne)
{
    PreviewGeometry geometry = geometryFor({ 1600, 600 });
    for (int step = 0; step < 5; ++step) {
        ASSERT_TRUE(geometry.ZoomBy(ZoomDirection::In));
    }
    EXPECT_EQ(geometry.zoomFactor(), 2.25f);
    EXPECT_EQ(geometry.picture(), (PixelSize { 3600, 1350 }));

    // 2.5 would be 4000 pixels wide.
    EXPECT_FALSE(geometry.ZoomBy(ZoomDirection::In));
    EXPECT_EQ(geometry.zoomFactor(), 1.0f);
    EXPECT_EQ(geometry.zoomed(), (PixelSize { 1600, 600 }));
    EXPECT_EQ(geometry.picture(), (PixelSize { 3600, 1350 }));
    EXPECT_EQ(geometry.position(), (PixelPoint { 0, 0 }));
    EXPECT_EQ(geometry.bar(Axis::Horizontal).maximum, 298);

    EXPECT_TRUE(geometry.ZoomBy(ZoomDirection::In));
    EXPECT_EQ(geometry.zoomFactor(), 1.25f);
    EXPECT_EQ(geometry.picture(), (PixelSize { 2000, 750 }));

    // Heights stop below 9000 pixels.
    geometry.setUp({ 400, 3600 });
    EXPECT_TRUE(geometry.SetZoom(2.25f));
    EXPECT_FALSE(geometry.SetZoom(2.5f));
    EXPECT_EQ(geometry.picture(), (PixelSize { 900, 8100 }));
}

TEST(PreviewZoomTest, APictureTooLargeToDrawIsShownAtItsOwnSizeAndCanOnlyShrink)
{
    PreviewGeometry geometry = geometryFor({ 5000, 300 });
    EXPECT_EQ(geometry.picture(), (PixelSize { 5000, 300 }));
    EXPECT_TRUE(geometry.bar(Axis::Horizontal).enabled);

    EXPECT_FALSE(geometry.ZoomBy(ZoomDirection::In));
    EXPECT_EQ(geometry.zoomFactor(), 1.0f);
    EXPECT_TRUE(geometry.ZoomBy(ZoomDirection::Out));
    EXPECT_EQ(geometry.picture(), (PixelSize { 3750, 225 }));
}

TEST(PreviewScrollBarTest, OverflowsDecideMaximumAndStep)
{
    const struct {
        int overflow;
        PictureScrollBar expected;
    } cases[] = {
        { -200, { false, 0, 0, 0 } },
        { 0, { false, 0, 0, 0 } },
        { 1, { true, 1, 0, 1 } },
        { 100, { true, 100, 0, 1 } },
        { 101, { true, 10, 0, 10 } },
        { 105, { true, 10, 0, 10 } },
        { 115, { true, 12, 0, 10 } },
        { 125, { true, 12, 0, 10 } },
        { 3000, { true, 300, 0, 10 } },
    };
    for (const auto& c : cases) {
        const PreviewGeometry wide = geometryFor({ kViewport.width + c.overflow, 10 });
        EXPECT_EQ(wide.bar(Axis::Horizontal), c.expected) << "overflow " << c.overflow;
        EXPECT_FALSE(wide.bar(Axis::Vertical).enabled);

        const PreviewGeometry tall = geometryFor({ 10, kViewport.height + c.overflow });
        EXPECT_EQ(tall.bar(Axis::Vertical), c.expected) << "overflow " << c.overflow;
        EXPECT_FALSE(tall.bar(Axis::Horizontal).enabled);
    }
}

TEST(PreviewScrollBarTest, PercentagesGiveValuesRoundedHalfToEvenAndWithinRange)
{
    const struct {
        int maximum;
        std::int16_t percent;
        std::optional<int> value;
    } cases[] = {
        { 21, 50, 10 },
        { 23, 50, 12 },
        { 30, 0, 0 },
        { 30, 100, 30 },
        { 30, 150, 30 },
        { 30, 32767, 30 },
        { 30, -1, std::nullopt },
        { 0, 50, 0 },
        { 12, 33, 4 },
    };
    for (const auto& c : cases) {
        EXPECT_EQ(scrollValueAtPercent(c.maximum, c.percent), c.value) << c.percent << "% of " << c.maximum;
    }

    PreviewGeometry geometry = geometryFor({ kViewport.width + 300, kViewport.height + 80 });
    geometry.SetHScrollbarByPercent(50);
    geometry.SetVScrollbarByPercent(25);
    EXPECT_EQ(geometry.position(), (PixelPoint { -150, -20 }));
    geometry.SetVScrollbarByPercent(-3);
    EXPECT_EQ(geometry.bar(Axis::Vertical).value, 20);
}

TEST(PreviewDragTest, ALargePictureNeverLeavesAGapInTheViewport)
{
    // 1000 x 800 in 622 x 495: the picture's left edge stays within -378 .. 0, its top -305 .. 0.
    const struct {
        PixelPoint from;
        std::vector<PixelPoint> path;
        PixelPoint expected;
    } cases[] = {
        { { 100, 100 }, { { 150, 120 } }, { 0, 0 } },
        { { 500, 400 }, { { 100, 50 } }, { -378, -305 } },
        { { 300, 300 }, { { 250, 280 } }, { -50, -20 } },
        // Step by step, the grabbed point stays under the pointer.
        { { 300, 300 }, { { 290, 295 }, { 270, 290 }, { 250, 280 } }, { -50, -20 } },
        { { 300, 300 }, { { 0, 0 }, { 400, 100 } }, { 0, -200 } },
    };
    for (const auto& c : cases) {
        PreviewGeometry geometry = geometryFor({ 1000, 800 });
        drag(geometry, c.from, c.path);
        EXPECT_EQ(geometry.position(), c.expected);
    }
}

TEST(PreviewDragTest, APictureSmallerThanTheViewportSitsAtOneOfItsEdges)
{
    PreviewGeometry geometry = geometryFor({ 300, 200 });
    drag(geometry, { 100, 100 }, { { 90, 95 } });
    EXPECT_EQ(geometry.position(), (PixelPoint { 322, 295 }));

    geometry.release();
    EXPECT_EQ(geometry.position(), (PixelPoint { 322, 295 }));
    EXPECT_EQ(geometry.bar(Axis::Horizontal), PictureScrollBar {});

    drag(geometry, { 400, 400 }, { { 410, 420 } });
    EXPECT_EQ(geometry.position(), (PixelPoint { 0, 0 }));
}

TEST(PreviewDragTest, OnReleaseTheBarsTakeThePositionAndThePictureSettlesOnTheirGrid)
{
    const struct {
        PixelSize picture;
        PixelPoint draggedTo;
        int horizontalValue;
        int verticalValue;
        PixelPoint settled;
    } cases[] = {
        // Overflow 300 (ten pixels a unit): 157 is 52 %, 15.6 units, so 16.
        { { 922, 795 }, { -157, -157 }, 16, 16, { -160, -160 } },
        // Overflow 80 (one pixel a unit) keeps the pixel.
        { { 702, 575 }, { -37, -80 }, 37, 80, { -37, -80 } },
        // Overflow 115: twelve units reach 120 pixels.
        { { 737, 610 }, { -115, 0 }, 12, 0, { -120, 0 } },
        // As wide as the viewport: no percentage, nothing moves; the other bar still works.
        { { 622, 795 }, { 0, -33 }, 0, 3, { 0, -30 } },
    };
    for (const auto& c : cases) {
        PreviewGeometry geometry = geometryFor(c.picture);
        drag(geometry, { 300, 300 }, { { 300 + c.draggedTo.x, 300 + c.draggedTo.y } });
        ASSERT_EQ(geometry.position(), c.draggedTo);

        geometry.release();
        EXPECT_EQ(geometry.bar(Axis::Horizontal).value, c.horizontalValue);
        EXPECT_EQ(geometry.bar(Axis::Vertical).value, c.verticalValue);
        EXPECT_EQ(geometry.position(), c.settled);
    }
}

TEST(PreviewDragTest, AReleaseThatKeepsTheBarsValueStillSettlesThePicture)
{
    PreviewGeometry geometry = geometryFor({ 922, 400 });
    geometry.scrollTo(Axis::Horizontal, 16);
    drag(geometry, { 300, 300 }, { { 302, 300 } });
    ASSERT_EQ(geometry.position().x, -158);

    geometry.release();
    EXPECT_EQ(geometry.bar(Axis::Horizontal).value, 16);
    EXPECT_EQ(geometry.position().x, -160);
}

TEST(PreviewSetUpTest, EveryNewPictureStartsAfreshAtZoomOne)
{
    PreviewGeometry geometry = geometryFor({ 1000, 800 });
    geometry.SetZoom(2.0f);
    geometry.scrollTo(Axis::Horizontal, 50);

    geometry.setUp({ 700, 400 });
    EXPECT_EQ(geometry.zoomFactor(), 1.0f);
    EXPECT_EQ(geometry.source(), (PixelSize { 700, 400 }));
    EXPECT_EQ(geometry.picture(), (PixelSize { 700, 400 }));
    EXPECT_EQ(geometry.position(), (PixelPoint { 0, 0 }));
    EXPECT_EQ(geometry.bar(Axis::Horizontal), (PictureScrollBar { true, 78, 0, 1 }));
    EXPECT_FALSE(geometry.bar(Axis::Vertical).enabled);

    geometry.ZoomBy(ZoomDirection::In);
    EXPECT_EQ(geometry.picture(), (PixelSize { 875, 500 }));
}

TEST(PreviewSetUpTest, WithoutAPictureNothingScrollsAndZoomingDrawsNothing)
{
    PreviewGeometry geometry = geometryFor({ 0, 0 });
    EXPECT_FALSE(geometry.bar(Axis::Horizontal).enabled);
    EXPECT_FALSE(geometry.bar(Axis::Vertical).enabled);
    EXPECT_TRUE(geometry.ZoomBy(ZoomDirection::In));
    EXPECT_EQ(geometry.picture(), (PixelSize { 0, 0 }));
    drag(geometry, { 0, 0 }, { { 10, 10 } });
    geometry.release();
    EXPECT_EQ(geometry.position(), (PixelPoint { 0, 0 }));
}

} // namespace
} // namespace penmoor
