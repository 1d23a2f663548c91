#include "Canvas.h"
#include <limits>
#include <memory>

TEST(OSRgn, ANewRegionIsEmptyAndHasZeroBounds) {
    OSRgn region;
    EXPECT_TRUE(Region::IsEmpty(region));
    EXPECT_EQ(CarbonUtils::GetRgnBounds(&region), (Rect{0, 0, 0, 0}));
}

TEST(OSRgn, BoundsOfNoRegionAreTheWholePlane) {
    EXPECT_EQ(CarbonUtils::GetRgnBounds(nullptr), (Rect{-32768, -32768, 32767, 32767}));
}

TEST(OSRgn, EmptyAndInvertedRectanglesGiveEmptyRegions) {
    EXPECT_TRUE(Region::IsEmpty(OSRgn(Rect{5, 5, 5, 9})));
    EXPECT_TRUE(Region::IsEmpty(OSRgn(Rect{9, 9, 5, 5})));
    OSRgn region(Rect{0, 0, 4, 4});
    Region::UniteRect(region, {9, 9, 5, 5});
    EXPECT_EQ(Region::Area(region), 16);
    Region::IntersectRect(region, {3, 3, 3, 3});
    EXPECT_TRUE(Region::IsEmpty(region));
}

TEST(OSRgn, TheRightAndBottomEdgesAreOutside) {
    OSRgn const region(Rect{10, 20, 30, 40});
    EXPECT_TRUE(region.Contains({10, 20}));
    EXPECT_TRUE(region.Contains({29, 39}));
    EXPECT_FALSE(region.Contains({30, 39}));
    EXPECT_FALSE(region.Contains({29, 40}));
}

TEST(OSRgn, OffsetRoundsItsFractionsAndSurvivesWhatIsNotANumber) {
    OSRgn region(Rect{0, 0, 10, 10});
    region.Offset(2.6, -3.4);
    EXPECT_EQ(Region::Bounds(region), (Rect{-3, 3, 7, 13}));
    region.Offset(std::numeric_limits<double>::quiet_NaN(), 0);
    EXPECT_EQ(Region::Bounds(region), (Rect{-3, 3, 7, 13}));
    region.Offset(1e30, -1e30);
    EXPECT_EQ(Region::Bounds(region).right, 32767);
    EXPECT_EQ(Region::Bounds(region).top, -32768);
}

TEST(OSRgn, CopiesAreIndependent) {
    OSRgn a(Rect{0, 0, 10, 10});
    OSRgn b(a);
    b.Offset(100, 100);
    EXPECT_TRUE(a.Contains({0, 0}));
    a = b;
    a = *&a;
    EXPECT_TRUE(Region::Equal(a, b));
    EXPECT_EQ(Region::Bounds(a), (Rect{100, 100, 110, 110}));
}

TEST(OSRgn, IsOneRectangleOnlyWhenItHasNoOtherPixels) {
    Rect const r = {2, 3, 8, 9};
    OSRgn region(r);
    EXPECT_TRUE(Region::Is(region, r));
    EXPECT_FALSE(Region::Is(region, {2, 3, 8, 10}));
    Region::Subtract(region, OSRgn(Rect{4, 4, 5, 5}));
    EXPECT_FALSE(Region::Is(region, r)) << "it has a hole";
    EXPECT_FALSE(Region::Is(OSRgn(), {0, 0, 0, 0})) << "no pixels are no rectangle";
}

TEST(OSRgn, UnionAndDifferenceMayWriteIntoAnOperand) {
    TempRgn a, b;
    VelaDrawing::RectRgn(a, std::unique_ptr<Rect>(new Rect{0, 0, 10, 10}).get());
    Rect const corner = {5, 5, 15, 15};
    VelaDrawing::RectRgn(b, &corner);
    VelaDrawing::UnionRgn(a, b, a);
    EXPECT_EQ(Region::Area(*a), 175);
    VelaDrawing::DiffRgn(a, b, b);
    EXPECT_EQ(Region::Area(*b), 75);
    EXPECT_FALSE((*b).Contains({7, 7}));
}

TEST(OSRgn, ARectangleTouchesTheRegionWhenTheyShareAPixel) {
    OSRgn const region = RegionOf({{0, 0, 10, 10}, {20, 20, 30, 30}});
    OSRgn copy(region);
    Rect const between = {10, 10, 20, 20}, corner = {9, 9, 21, 21}, empty = {3, 3, 3, 9};
    EXPECT_FALSE(VelaDrawing::RectInRgn(&between, &copy));
    EXPECT_TRUE(VelaDrawing::RectInRgn(&corner, &copy));
    EXPECT_FALSE(VelaDrawing::RectInRgn(&empty, &copy));
    EXPECT_TRUE(VelaDrawing::RectInRgn(&between, nullptr));
}

TEST(OSRgn, RectanglesComeFromTopToBottomThenFromLeftToRight) {
    OSRgn const region = RegionOf({{20, 0, 30, 10}, {0, 50, 10, 60}, {0, 0, 10, 10}});
    std::vector<Rect> const rects = Region::Rects(region);
    ASSERT_EQ(rects.size(), 3u);
    EXPECT_EQ(rects[0], (Rect{0, 0, 10, 10}));
    EXPECT_EQ(rects[1], (Rect{0, 50, 10, 60}));
    EXPECT_EQ(rects[2], (Rect{20, 0, 30, 10}));
}

TEST(AutoRgnHandle, CopyKeepsAnOwnCopyAndNullClears) {
    AutoRgnHandle handle;
    EXPECT_EQ(handle.get(), nullptr);
    {
        OSRgn original(Rect{0, 0, 3, 3});
        handle.Copy(&original);
    }
    ASSERT_NE(handle.get(), nullptr);
    EXPECT_EQ(Region::Area(*handle.get()), 9);
    handle.Copy(nullptr);
    EXPECT_EQ(handle.get(), nullptr);
    OSRgn *given = VelaDrawing::NewRgn();
    handle.reset(given);
    handle.reset(given); // the same again must not free it
    EXPECT_EQ(handle.get(), given);
    VelaDrawing::DisposeRgn(nullptr);
}
