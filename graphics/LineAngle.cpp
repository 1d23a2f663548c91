#include "graphics/LineAngle.h"
#include "host/VelaDrawing.h"

static short const kHalfTurn = 180; // degrees

short AngleOfLine(Rect const &rect, Point p) {
    short angle = 0;
    VelaDrawing::PtToAngle(&rect, p, &angle);
    return angle >= kHalfTurn ? static_cast<short>(angle - kHalfTurn) : angle;
}
