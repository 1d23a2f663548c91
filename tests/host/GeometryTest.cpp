#include "host/Geometry.h"
#include <gtest/gtest.h>
#include <type_traits>

typedef OS::RectBase<OS::RectTag> FloatingRect;

// Both lie in binary resource records as they stand.
static_assert(sizeof(Point) == 4 && std::is_trivial<Point>::value && std::is_standard_layout<Point>::value,
              "");
static_assert(sizeof(Rect) == 8 && std::is_trivial<Rect>::value && std::is_standard_layout<Rect>::value, "");
static_assert(!std::is_convertible<Point, OS::Point>::value, "only when asked for: v and h change places");
static_assert(std::is_convertible<Rect const &, FloatingRect>::value,
              "whole rectangles go where floating ones do");

TEST(Geometry, APointHasItsVerticalPlaceFirst) {
    Point const point = {3, 4};
    EXPECT_EQ(point.v, 3);
    EXPECT_EQ(point.h, 4);
}

TEST(Geometry, ARectangleGoesRoundFromTheTop) {
    Rect const rect = {1, 2, 3, 4};
    EXPECT_EQ(rect.top, 1);
    EXPECT_EQ(rect.left, 2);
    EXPECT_EQ(rect.bottom, 3);
    EXPECT_EQ(rect.right, 4);
}

TEST(Geometry, FloatingShapesAreZeroByDefault) {
    OS::Point const point;
    OS::Size const size;
    FloatingRect const rect;
    EXPECT_EQ(point.x, 0.0);
    EXPECT_EQ(point.y, 0.0);
    EXPECT_EQ(size.width, 0.0);
    EXPECT_EQ(size.height, 0.0);
    EXPECT_EQ(rect.origin.x, 0.0);
    EXPECT_EQ(rect.origin.y, 0.0);
    EXPECT_EQ(rect.size.width, 0.0);
    EXPECT_EQ(rect.size.height, 0.0);
}

TEST(Geometry, AFloatingPointTakesHAsXAndVAsY) {
    Point const whole = {-7, 12};
    OS::Point const point(whole);
    EXPECT_EQ(point.x, 12.0);
    EXPECT_EQ(point.y, -7.0);
}

TEST(Geometry, AFloatingRectangleTakesOriginAndSizeOfAWholeOne) {
    Rect const whole = {10, 20, 40, 70};
    FloatingRect const rect = whole;
    EXPECT_EQ(rect.origin.x, 20.0);
    EXPECT_EQ(rect.origin.y, 10.0);
    EXPECT_EQ(rect.size.width, 50.0);
    EXPECT_EQ(rect.size.height, 30.0);
}

TEST(Geometry, TheSizeOfTheLargestWholeRectangleDoesNotOverflow) {
    Rect const whole = {-32768, -32768, 32767, 32767};
    FloatingRect const rect = whole;
    EXPECT_EQ(rect.size.width, 65535.0);
    EXPECT_EQ(rect.size.height, 65535.0);
}

TEST(Geometry, AnUpsideDownRectangleHasANegativeSize) {
    Rect const whole = {10, 10, 5, 2};
    FloatingRect const rect = whole;
    EXPECT_EQ(rect.size.width, -8.0);
    EXPECT_EQ(rect.size.height, -5.0);
}

TEST(Geometry, AFloatingRectangleIsMadeOfXYWidthHeight) {
    FloatingRect const rect(1.5, 2.5, -3.0, 4.0);
    EXPECT_EQ(rect.origin.x, 1.5);
    EXPECT_EQ(rect.origin.y, 2.5);
    EXPECT_EQ(rect.size.width, -3.0);
    EXPECT_EQ(rect.size.height, 4.0);
}
