// Points, sizes and rectangles, in whole and in floating coordinates.
//
// Coordinates are pixels, h or x to the right and v or y downward, counted between pixels: a rectangle's
// bottom and right edges are outside of it.
#pragma once

// Whole pixels. Point and Rect lie in binary resource records as they stand, so they stay plain, of 4 and 8
// bytes.
struct Point {
    short v, h; // down, and to the right
};
struct Rect {                       // edges; the right and the bottom one are outside
    short top, left, bottom, right; // pixels
};

namespace OS {

struct Point {   // a place in the plane
    double x, y; // to the right, and down

    Point()
        : x(0)
        , y(0) {}
    Point(double x_, double y_)
        : x(x_)
        , y(y_) {}
    explicit Point(::Point p)
        : x(p.h)
        , y(p.v) {}
};

struct Size {             // of a rectangle in the plane
    double width, height; // to the right, and down

    Size()
        : width(0)
        , height(0) {}
    Size(double w, double h)
        : width(w)
        , height(h) {}
};

// Marks rectangles as rectangles in the plane, as opposed to those of some other kind of space.
struct RectTag;

// A rectangle by its origin and size. Width and height may be negative: the origin is then the right or
// bottom edge.
template <class Tag> struct RectBase {
    Point origin;
    Size size;

    RectBase() {}
    RectBase(double x, double y, double w, double h)
        : origin(x, y)
        , size(w, h) {}
    // Not explicit: calls that take floating rectangles are given whole ones as well.
    RectBase(::Rect const &r)
        : origin(r.left, r.top)
        , size(r.right - r.left, r.bottom - r.top) {}
};

} // namespace OS
