#pragma once

struct RGBColor { unsigned short red, green, blue; };

namespace OS {

struct RGBAColor {
    double r, g, b, a;
    RGBAColor() : r(0), g(0), b(0), a(1.0) {}
    RGBAColor(double r_, double g_, double b_, double a_) : r(r_), g(g_), b(b_), a(a_) {}
};
}
