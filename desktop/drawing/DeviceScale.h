// How logical pixels become device pixels.
#pragma once
#include "host/Geometry.h"
#include <cmath>
#include <cstdint>

// A rectangle in device pixels; right and bottom edges are outside it.
struct DeviceRect {
    int left, top, right, bottom;
    int Width() const { return right - left; }
    int Height() const { return bottom - top; }
    bool Empty() const { return right <= left || bottom <= top; }
    bool Contains(DeviceRect const &r) const {
        return r.left >= left && r.top >= top && r.right <= right && r.bottom <= bottom;
    }
    DeviceRect Intersected(DeviceRect const &r) const {
        return {left > r.left ? left : r.left, top > r.top ? top : r.top, right < r.right ? right : r.right,
                bottom < r.bottom ? bottom : r.bottom};
    }
    DeviceRect United(DeviceRect const &r) const {
        return {left < r.left ? left : r.left, top < r.top ? top : r.top, right > r.right ? right : r.right,
                bottom > r.bottom ? bottom : r.bottom};
    }
};

// The factor between logical and device pixels: 1, 1.25, 1.5, 2 or any other from 0.5 to 4, kept in
// thousandths so that all rounding is exact. Every edge is rounded to the nearest device pixel by itself, so
// that rectangles that adjoin in logical pixels adjoin in device pixels too.
class DeviceScale {
public:
    // Factors beyond the range are cut to it; what is not a number counts as 1.
    explicit DeviceScale(double factor = 1.0)
        : thousandths(Thousandths(factor))
        , whole(thousandths % kOne == 0 ? thousandths / kOne : 0) {}
    double Factor() const { return thousandths / static_cast<double>(kOne); }
    int Thousandths() const { return thousandths; }
    bool IsWhole() const { return whole != 0; }
    // Rounds half up, so that -0.5 gives 0 and the spacing of edges does not depend on their sign.
    int Edge(int logical) const {
        return whole != 0 ? logical * whole : RoundedDown(Scaled(logical) + kOne / 2, kOne);
    }
    DeviceRect ToDevice(int left, int top, int right, int bottom) const {
        if (whole != 0)
            return {left * whole, top * whole, right * whole, bottom * whole};
        return {Edge(left), Edge(top), Edge(right), Edge(bottom)};
    }
    // The logical pixel that covers the device pixel, by the same rounding of edges.
    int ToLogical(int device) const {
        return RoundedDown(static_cast<std::int64_t>(device) * kOne + kOne / 2 - 1, thousandths);
    }
    // Whether moving by the distance moves every edge by the same number of device pixels.
    bool MovesExactly(int logicalDistance) const { return Scaled(logicalDistance) % kOne == 0; }
    bool operator==(DeviceScale const &other) const { return thousandths == other.thousandths; }
    bool operator!=(DeviceScale const &other) const { return thousandths != other.thousandths; }

private:
    static constexpr int kOne = 1000;
    static constexpr double kLeast = 0.5, kGreatest = 4.0;

    static int Thousandths(double factor) {
        if (!(factor >= kLeast)) // also true for what is not a number
            return factor < kLeast ? static_cast<int>(kLeast * kOne) : kOne;
        return static_cast<int>(std::lround((factor > kGreatest ? kGreatest : factor) * kOne));
    }
    std::int64_t Scaled(int logical) const { return static_cast<std::int64_t>(logical) * thousandths; }
    static int RoundedDown(std::int64_t dividend, int divisor) {
        std::int64_t quotient = dividend / divisor;
        return static_cast<int>(dividend % divisor < 0 ? quotient - 1 : quotient);
    }
    int thousandths;
    int whole; // the factor when it is a whole number, else 0
};
