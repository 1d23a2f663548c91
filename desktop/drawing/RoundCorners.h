// The corners of rounded rectangles, drawn once and used often.
#pragma once
#include "desktop/drawing/DeviceScale.h"
#include "desktop/drawing/ShapeMask.h"
#include "host/RGBColor.h"

class PixelScope;

// Rounded rectangles are masks at their corners only; all else is whole pixels. Lengths are device pixels.
class RoundCorners {
public:
    double radiusH, radiusV;
    int line; // width of a frame; 0: filled

    // Draws the rectangle, or the frame inside it.
    void Draw(PixelScope &, DeviceRect const &, OS::RGBAColor const &) const;

    // The outlines, for a context whose fill rule becomes the one that they need.
    void AppendPath(cairo_t *, DeviceRect const &) const;

private:
    // The smallest rectangle with such corners, the four of them side by side.
    ShapeMask const &MaskFor(int width, int height) const;
    void DrawStraightParts(PixelScope &, DeviceRect const &outer, DeviceRect const &middle,
                           OS::RGBAColor const &) const;
};
