#include "Canvas.h"
#include "host/OSPath.h"
#include <limits>

namespace {
void PaintAll() {
    Rect const everything = {-32768, -32768, 32767, 32767};
    VelaDrawing::PaintRect(&everything);
}
} // namespace

TEST(Clip, DrawingStaysInside) {
    Canvas canvas(6, 4);
    Rect const r = {1, 2, 3, 5};
    VelaDrawing::ClipRect(&r);
    PaintAll();
    EXPECT_EQ(canvas.Picture(), (Rows{"......", "..###.", "..###.", "......"}));
}

TEST(Clip, AClipMayHaveHoles) {
    Canvas canvas(6, 4);
    canvas.port.SetClip(RegionOf({{0, 0, 4, 2}, {0, 4, 4, 6}, {1, 0, 2, 6}}));
    PaintAll();
    EXPECT_EQ(canvas.Picture(), (Rows{"##..##", "######", "##..##", "##..##"}));
}

TEST(Clip, CurvesRespectTheSameClipAsPixels) {
    for (double factor : {1.0, 1.5, 2.0}) {
        Canvas canvas(12, 12, factor);
        canvas.port.SetClip(RegionOf({{1, 1, 5, 5}, {3, 3, 9, 9}}));
        OSPort::Current().PaintRoundRect({-40, -40, 100, 100}, {1, 1});
        Rows const curves = canvas.Picture();
        canvas.Wipe(Canvas::kWhite);
        PaintAll();
        EXPECT_EQ(curves, canvas.Picture()) << factor;
    }
}

TEST(Clip, CurvesFollowEveryChangeOfTheClip) {
    Canvas canvas(12, 12);
    canvas.port.SetClip(OSRgn(Rect{0, 0, 2, 2}));
    OSPort::Current().PaintRoundRect({-9, -9, 60, 60}, {1, 1});
    canvas.port.SetClip(OSRgn(Rect{8, 8, 12, 12}));
    OSPort::Current().PaintRoundRect({-9, -9, 60, 60}, {1, 1});
    EXPECT_EQ(canvas.Count(Canvas::kBlack), 4 + 16);
    OSPort::Current().NarrowClip({0, 0, 9, 9});
    OSPort::Current().SetForeColor(OS::RGBAColor(1, 0, 0, 1));
    OSPort::Current().PaintRoundRect({-9, -9, 60, 60}, {1, 1});
    EXPECT_EQ(canvas.Count(Canvas::kRed), 1);
}

TEST(Clip, WhatIsSetIsCutToTheBoundary) {
    Canvas canvas(6, 6);
    canvas.port.SetBoundary(OSRgn(Rect{0, 0, 3, 3}));
    Rect const r = {1, 1, 6, 6};
    VelaDrawing::ClipRect(&r);
    PaintAll();
    EXPECT_EQ(canvas.Count(Canvas::kBlack), 4);
}

TEST(Clip, TheExtentCutsTheBoundary) {
    Canvas canvas(6, 6);
    canvas.port.SetBoundary(OSRgn(Rect{-50, -50, 50, 50}));
    EXPECT_EQ(Region::Bounds(canvas.port.Boundary()), (Rect{0, 0, 6, 6}));
}

TEST(Clip, ClipsAreInLocalCoordinates) {
    Canvas canvas(8, 8);
    canvas.port.SetOrigin(3, 2);
    Rect const r = {0, 0, 2, 2};
    VelaDrawing::ClipRect(&r);
    EXPECT_EQ(Region::Bounds(canvas.port.Clip()), (Rect{2, 3, 4, 5}));
    TempRgn kept;
    VelaDrawing::GetClip(kept);
    EXPECT_EQ(Region::Bounds(*kept), (Rect{0, 0, 2, 2}));
    Rect const other = {1, 1, 4, 4};
    VelaDrawing::NarrowClipToRect(&other);
    EXPECT_EQ(Region::Bounds(canvas.port.Clip()), (Rect{3, 4, 4, 5}));
    VelaDrawing::SetClip(kept);
    EXPECT_EQ(Region::Bounds(canvas.port.Clip()), (Rect{2, 3, 4, 5}));
}

TEST(Clip, NarrowingByNoRegionDoesNothing) {
    Canvas canvas(8, 8);
    VelaDrawing::NarrowClip(nullptr);
    EXPECT_EQ(Region::Area(canvas.port.Clip()), 64);
    TempRgn half;
    Rect const r = {0, 0, 4, 8};
    VelaDrawing::RectRgn(half, &r);
    VelaDrawing::NarrowClip(half);
    EXPECT_EQ(Region::Area(canvas.port.Clip()), 32);
}

TEST(Clip, PortClipsAreRounded) {
    Canvas canvas(8, 8);
    OSPort::Current().NarrowClip({0.6, 0.4, 3.0, 2.2});
    EXPECT_EQ(Region::Bounds(canvas.port.Clip()), (Rect{0, 1, 3, 4}));
}

TEST(Clip, VisibleTellsWhetherAnythingCouldShow) {
    Canvas canvas(8, 8);
    canvas.port.SetClip(RegionOf({{0, 0, 2, 2}, {6, 6, 8, 8}}));
    EXPECT_TRUE(canvas.port.Visible({0, 0, 8, 8}));
    EXPECT_FALSE(canvas.port.Visible({3, 3, 5, 5}));
    EXPECT_FALSE(canvas.port.Visible({1, 1, 1, 8}));
    canvas.port.SetOrigin(-3, -3);
    EXPECT_TRUE(canvas.port.Visible({3, 3, 5, 5}));
}

TEST(ClipPath, LimitsPixelsToThoseWithTheirCentreInside) {
    Canvas canvas(6, 6);
    OSPath triangle;
    triangle.CreateSubpath(0, 0);
    triangle.AddLine(6, 0);
    triangle.AddLine(0, 6);
    OSPort::Current().NarrowClipPath(triangle);
    PaintAll();
    Rows const picture = canvas.Picture();
    for (int v = 0; v < 6; ++v) {
        for (int h = 0; h < 6; ++h) {
            if (h + v == 5)
                continue; // on the edge itself either will do
            EXPECT_EQ(picture[static_cast<std::size_t>(v)][static_cast<std::size_t>(h)],
                      h + v < 5 ? '#' : '.');
        }
    }
}

TEST(ClipPath, CurvesGetSmoothEdges) {
    Canvas canvas(20, 20, 2);
    OSPath slope;
    slope.CreateSubpath(0, 0);
    slope.AddLine(20, 7);
    slope.AddLine(20, 20);
    slope.AddLine(0, 20);
    OSPort::Current().NarrowClipPath(slope);
    OSPort::Current().PaintRoundRect({-9, -9, 60, 60}, {1, 1});
    EXPECT_EQ(canvas.At(1, 39), Canvas::kBlack);
    EXPECT_EQ(canvas.At(39, 1), Canvas::kWhite);
    EXPECT_GT(40 * 40 - canvas.Count(Canvas::kBlack) - canvas.Count(Canvas::kWhite), 10);
}

TEST(ClipPath, PathsMeetAndSettingTheClipForgetsThem) {
    Canvas canvas(8, 8);
    OSPath left, top;
    left.CreateSubpath(0, 0);
    left.AddLine(4, 0);
    left.AddLine(4, 8);
    left.AddLine(0, 8);
    top.AddPath(left, 0, 0);
    OSPort::Current().NarrowClipPath(left);
    canvas.port.SetOrigin(2, 4);
    OSPort::Current().NarrowClipPath(top);
    canvas.port.SetOrigin(0, 0);
    PaintAll();
    EXPECT_EQ(canvas.Count(Canvas::kBlack), 2 * 4);
    EXPECT_EQ(canvas.At(2, 4), Canvas::kBlack);
    TempRgn clip;
    VelaDrawing::GetClip(clip);
    VelaDrawing::SetClip(clip);
    PaintAll();
    EXPECT_EQ(canvas.Count(Canvas::kBlack), 64);
}

TEST(ClipPath, AnEmptyPathLeavesNothing) {
    Canvas canvas(8, 8);
    OSPath path;
    OSPort::Current().NarrowClipPath(path);
    PaintAll();
    OSPort::Current().PaintOval({0, 0, 8, 8});
    EXPECT_EQ(canvas.Count(Canvas::kBlack), 0);
}

TEST(Damage, IsCollectedInWindowCoordinatesAndCutToTheContent) {
    Canvas canvas(20, 20);
    canvas.port.SetOrigin(5, 5);
    Rect const r = {0, 0, 4, 100};
    VelaDrawing::InvalRect(&r);
    EXPECT_EQ(Region::Bounds(canvas.port.GetDamage()), (Rect{5, 5, 9, 20}));
    Rect const outside = {-90, -90, -80, -80};
    VelaDrawing::InvalRect(&outside);
    EXPECT_EQ(Region::Area(canvas.port.GetDamage()), 4 * 15);
    TempRgn region;
    Rect const corner = {-5, -5, -4, -4};
    VelaDrawing::RectRgn(region, &corner);
    VelaDrawing::InvalRgn(region);
    EXPECT_TRUE(canvas.port.GetDamage().Contains({0, 0}));
    EXPECT_EQ(Region::Area(canvas.port.TakeDamage()), 61);
    EXPECT_TRUE(Region::IsEmpty(canvas.port.GetDamage()));
}

TEST(Damage, IsNotLimitedByTheClip) {
    Canvas canvas(20, 20);
    Rect const clip = {0, 0, 2, 2}, r = {10, 10, 12, 12};
    VelaDrawing::ClipRect(&clip);
    VelaDrawing::InvalRect(&r);
    EXPECT_EQ(Region::Area(canvas.port.GetDamage()), 4);
}

TEST(Damage, AShrinkingWindowForgetsWhatLiesOutside) {
    Canvas canvas(20, 20);
    canvas.port.Damage({0, 0, 20, 20});
    canvas.port.SetExtent(10, 5);
    EXPECT_EQ(Region::Bounds(canvas.port.GetDamage()), (Rect{0, 0, 5, 10}));
}

TEST(Touched, BoxesCoverWhatWasDrawnAndNothingElseOnce) {
    Canvas canvas(400, 400);
    EXPECT_TRUE(canvas.port.TakeTouched().empty());
    Rect const a = {0, 0, 10, 10}, b = {300, 300, 310, 310};
    VelaDrawing::PaintRect(&a);
    VelaDrawing::PaintRect(&a);
    VelaDrawing::PaintRect(&b);
    std::vector<DeviceRect> const touched = canvas.port.TakeTouched();
    ASSERT_EQ(touched.size(), 2u);
    EXPECT_TRUE(touched[0].Contains({0, 0, 10, 10}));
    EXPECT_EQ(touched[0].Width() * touched[0].Height(), 100);
    EXPECT_TRUE(touched[1].Contains({300, 300, 310, 310}));
    EXPECT_TRUE(canvas.port.TakeTouched().empty());
}

TEST(Touched, CurvesAndLinesCountToo) {
    Canvas canvas(100, 100, 2);
    OSPort::Current().PaintOval({10, 10, 5, 5});
    std::vector<DeviceRect> touched = canvas.port.TakeTouched();
    ASSERT_EQ(touched.size(), 1u);
    EXPECT_TRUE(touched[0].Contains({20, 20, 30, 30}));
    EXPECT_LT(touched[0].Width(), 20);
    VelaDrawing::MoveTo(3, 4);
    VelaDrawing::LineTo(8, 9);
    touched = canvas.port.TakeTouched();
    ASSERT_EQ(touched.size(), 1u);
    EXPECT_TRUE(touched[0].Contains({6, 8, 18, 20}));
}

TEST(Touched, ManyPlacesAreMergedIntoAFewBoxes) {
    Canvas canvas(1000, 1000);
    std::vector<DeviceRect> drawn;
    for (int i = 0; i < 100; ++i) {
        short const h = static_cast<short>(i * 373 % 990), v = static_cast<short>(i * 197 % 990);
        Rect const r = {v, h, static_cast<short>(v + 8), static_cast<short>(h + 8)};
        VelaDrawing::PaintRect(&r);
        drawn.push_back({h, v, h + 8, v + 8});
    }
    std::vector<DeviceRect> const touched = canvas.port.TakeTouched();
    EXPECT_LE(touched.size(), 16u);
    for (DeviceRect const &r : drawn) {
        bool covered = false;
        for (DeviceRect const &box : touched)
            covered = covered || box.Contains(r);
        EXPECT_TRUE(covered);
    }
}
