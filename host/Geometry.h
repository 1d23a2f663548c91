#pragma once

struct Point { short v, h; };
struct Rect { short top, left, bottom, right; };

namespace OS {

struct Point {
    double x, y;
    Point() : x(0), y(0) {}
    Point(double x_, double y_) : x(x_), y(y_) {}

    explicit Point(::Point p) : x(p.h), y(p.v) {}
};

struct Size {
    double width, height;
    Size() : width(0), height(0) {}
    Size(double w, double h) : width(w), height(h) {}
};

struct RectTag;

template <class Tag> struct RectBase {
    Point origin;
    Size size;
    RectBase() {}
    RectBase(double x, double y, double w, double h) : origin(x, y), size(w, h) {}

    RectBase(::Rect const &r)
        : origin(r.left, r.top), size(r.right - r.left, r.bottom - r.top) {}
};

}
