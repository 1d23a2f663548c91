// Colours, by 16-bit components and by floating ones.
#pragma once

// An opaque colour: each component from 0 to 65535.
struct RGBColor {
    unsigned short red, green, blue;
};

namespace OS {

// A colour with opacity: each component from 0.0 to 1.0, not multiplied by alpha. Black and opaque by
// default. An RGBColor becomes one by dividing each component by 65535.0f in single precision and widening
// the quotient.
struct RGBAColor {
    double r, g, b, a;

    RGBAColor()
        : r(0)
        , g(0)
        , b(0)
        , a(1.0) {}
    RGBAColor(double r_, double g_, double b_, double a_)
        : r(r_)
        , g(g_)
        , b(b_)
        , a(a_) {}
};

} // namespace OS
