#include "Canvas.h"
#include "desktop/drawing/WholePixels.h"
#include <limits>

namespace {
short AngleTo(Rect const &r, Point p) {
    short angle = -1;
    VelaDrawing::PtToAngle(&r, p, &angle);
    return angle;
}
double const kNan = std::numeric_limits<double>::quiet_NaN();
} // namespace

TEST(WholePixels, HalvesRoundUpAndTheEndsStandForAllBeyond) {
    EXPECT_EQ(WholePixel(2.5), 3);
    EXPECT_EQ(WholePixel(-2.5), -2);
    EXPECT_EQ(WholePixel(1e300), 32767);
    EXPECT_EQ(WholePixel(-std::numeric_limits<double>::infinity()), -32768);
    EXPECT_EQ(WholePixel(kNan), 0);
}

TEST(WholePixels, ARectangleOfNegativeSizeHasItsEdgesExchanged) {
    EXPECT_EQ(WholeRect({10, 20, -5, -8}), (Rect{12, 5, 20, 10}));
    EXPECT_EQ(WholeRect({kNan, 0, 4, kNan}), (Rect{0, 0, 0, 0}));
    EXPECT_EQ(WholeRect({0.4, 0.6, 1, 1}), (Rect{1, 0, 2, 1}));
}

TEST(Geometry, InsetAndOffsetStopAtTheEndsOfThePlane) {
    Rect r = {0, 0, 10, 20};
    VelaDrawing::InsetRect(&r, 2, 3);
    EXPECT_EQ(r, (Rect{3, 2, 7, 18}));
    VelaDrawing::InsetRect(&r, -1, -1);
    EXPECT_EQ(r, (Rect{2, 1, 8, 19}));
    VelaDrawing::OffsetRect(&r, 32767, -32768);
    EXPECT_EQ(r, (Rect{-32766, 32767, -32760, 32767}));
}

TEST(Geometry, SectRectWritesZerosWhenNothingIsShared) {
    Rect a = {0, 0, 10, 10};
    Rect const b = {5, 6, 20, 20}, apart = {10, 0, 20, 10};
    Rect out;
    EXPECT_TRUE(VelaDrawing::SectRect(&a, &b, &out));
    EXPECT_EQ(out, (Rect{5, 6, 10, 10}));
    EXPECT_FALSE(VelaDrawing::SectRect(&a, &apart, &out));
    EXPECT_EQ(out, (Rect{0, 0, 0, 0}));
    EXPECT_TRUE(VelaDrawing::SectRect(&a, &b, &a));
    EXPECT_EQ(a, (Rect{5, 6, 10, 10}));
}

TEST(Geometry, PointsAndRectangles) {
    Rect const r = {0, 0, 10, 20};
    EXPECT_TRUE(VelaDrawing::PtInRect({0, 0}, &r));
    EXPECT_FALSE(VelaDrawing::PtInRect({10, 0}, &r));
    EXPECT_FALSE(VelaDrawing::PtInRect({0, 20}, &r));
    Rect spanned;
    VelaDrawing::Pt2Rect({9, 1}, {2, 7}, &spanned);
    EXPECT_EQ(spanned, (Rect{2, 1, 9, 7}));
    Point sum = {1, 2};
    VelaDrawing::AddPt({30000, 5}, &sum);
    VelaDrawing::AddPt({30000, 5}, &sum);
    EXPECT_EQ(sum.v, 32767);
    EXPECT_EQ(sum.h, 12);
    Rect const flat = {5, 0, 5, 9};
    EXPECT_TRUE(VelaDrawing::EmptyRect(&flat));
    EXPECT_FALSE(VelaDrawing::EmptyRect(&r));
}

TEST(Geometry, AnglesRunClockwiseFromTheTopInTheRectanglesProportions) {
    Rect const wide = {0, 0, 100, 400};
    EXPECT_EQ(AngleTo(wide, {0, 200}), 0);
    EXPECT_EQ(AngleTo(wide, {0, 400}), 45);
    EXPECT_EQ(AngleTo(wide, {50, 400}), 90);
    EXPECT_EQ(AngleTo(wide, {100, 400}), 135);
    EXPECT_EQ(AngleTo(wide, {100, 200}), 180);
    EXPECT_EQ(AngleTo(wide, {50, 0}), 270);
    EXPECT_EQ(AngleTo(wide, {0, 0}), 315);
    EXPECT_EQ(AngleTo(wide, {50, 200}), 0);
    EXPECT_EQ(AngleTo({3, 3, 3, 3}, {3, 9}), 90);
    EXPECT_EQ(AngleTo({0, 0, 1000, 1000}, {0, 499}), 0); // -0.1 degrees is 0, not 360
}

TEST(Geometry, ScreenPointsAreTheWindowsPlaceAndTheOriginAway) {
    Canvas canvas(50, 50);
    canvas.port.SetScreenPlace([] { return Point{100, 200}; });
    canvas.port.SetOrigin(7, 9);
    Point p = {1, 2};
    VelaDrawing::LocalToGlobal(&p);
    EXPECT_EQ(p.v, 110);
    EXPECT_EQ(p.h, 209);
    VelaDrawing::GlobalToLocal(&p);
    EXPECT_EQ(p.v, 1);
    EXPECT_EQ(p.h, 2);
}

TEST(Geometry, ThePortsRectangleIsItsContentInLocalCoordinates) {
    Canvas canvas(50, 40, 2);
    canvas.port.SetOrigin(10, 5);
    EXPECT_EQ(GetLocalPortRect(OSPort::GetCurrent()), (Rect{-5, -10, 35, 40}));
}
