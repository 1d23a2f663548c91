// How logical pixels become device pixels.
#pragma once
#include "host/Geometry.h"

// A rectangle in device pixels; right and bottom edges are outside it.
struct DeviceRect {
    int left, top, right, bottom;
    int Width() const { return right - left; }
    int Height() const { return bottom - top; }
    bool Empty() const { return right <= left || bottom <= top; }
};

// The factor between logical and device pixels: 1, 1.25, 1.5, 2 or any other from 0.5 to 4. Every edge is rounded to the
// nearest device pixel by itself, so that rectangles that adjoin in logical pixels adjoin in device pixels too.
class DeviceScale {
public:
    explicit DeviceScale(double factor_ = 1.0) : factor(factor_) {}
    double Factor() const { return factor; }
    bool IsWhole() const { return factor == static_cast<int>(factor); }
    // Rounds half up, so that -0.5 gives 0 and the spacing of edges does not depend on their sign.
    int Edge(int logical) const { return Floor(logical * factor + 0.5); }
    DeviceRect ToDevice(int left, int top, int right, int bottom) const {
        return {Edge(left), Edge(top), Edge(right), Edge(bottom)};
    }
    // The logical pixel that holds the device pixel.
    int ToLogical(int device) const { return Floor(device / factor); }

private:
    static int Floor(double value) {
        int truncated = static_cast<int>(value);
        return truncated > value ? truncated - 1 : truncated;
    }
    double factor;
};
