// How the mouse moves the point in the cube.
#include "graphics/LineAngle.h"
#include "graphics/ThreeDPane.h"
#include "host/EventRecordAdapter.h"
#include "host/PaneWatch.h"
#include "host/Services.h"
#include "host/VelaDrawing.h"
#include "host/glogRec.h"
#include "scrolling/Truncation.h"
#include <algorithm>
#include <cmath>
#include <cstdlib>

namespace {

int const kHandled = -1;
char const kCursorIsSet = 1;
short const kBallReach = 5;                   // pixels round the ball that count as the ball
double const kAxisReach = 6.0;                // pixels
double const kZeroReach = 5.0;                // pixels
double const kLongestReach = 72.0;            // pixels from the line that a drag may go
int const kQuarterTurn = 90, kHalfTurn = 180; // degrees

enum MoveCursor { kMoveX = 650, kMoveY = 651, kMoveZRising = 652, kMoveZFalling = 653 };
short const kAtZero = 4; // from each to the cursor that shows zero

bool SamePlace(Point a, Point b) { return a.v == b.v && a.h == b.h; }

Point WayFrom(Point from, Point to) { return {Pixel16(to.v - from.v), Pixel16(to.h - from.h)}; }

} // namespace

// What is under the mouse

bool ThreeDPane::PointOnIndicator(Point p) const {
    Rect ball;
    GetIndicatorBox(&ball);
    VelaDrawing::InsetRect(&ball, -kBallReach, -kBallReach);
    return VelaDrawing::PtInRect(p, &ball);
}

bool ThreeDPane::PointOnAxis(Point p, Axis3D *axis) const {
    double best = kAxisReach;
    bool found = false;
    for (Axis3D candidate : {kAxisX, kAxisY, kAxisZ}) {
        double const distance = DistanceFromAxis(p, candidate);
        if (distance < best) {
            best = distance;
            *axis = candidate;
            found = true;
        }
    }
    return found;
}

bool ThreeDPane::NearZero(Point p, Axis3D axis) const {
    Point const zero = AxisZeroPoint(axis);
    return std::hypot(p.h - zero.h, p.v - zero.v) < kZeroReach;
}

Axis3D ThreeDPane::GetDragAxis(Point p) const {
    Rect ball;
    GetIndicatorBox(&ball);
    int const angle = AngleOfLine(ball, p);
    int const fromX = std::abs(angle - kQuarterTurn);
    int const fromY = std::min(kHalfTurn - angle, angle);
    int const fromZ = std::abs(angle - ZAxisAngle());
    if (fromX < fromY && fromX < fromZ)
        return kAxisX;
    return fromY < fromZ ? kAxisY : kAxisZ;
}

// Cursors

void ThreeDPane::SetCursorForAxis(Axis3D axis, bool atZero) const {
    short cursor = kMoveX;
    if (axis == kAxisY)
        cursor = kMoveY;
    else if (axis == kAxisZ)
        cursor = ZAxisAngle() <= kQuarterTurn ? kMoveZRising : kMoveZFalling;
    CrsrMain(static_cast<short>(cursor + (atZero ? kAtZero : 0)));
}

char ThreeDPane::AdjustCursorAndDisplayHelp(Point p) {
    Axis3D axis = kAxisX;
    if (PointOnIndicator(p))
        SetCursorForAxis(GetDragAxis(p), false);
    else if (PointOnAxis(p, &axis))
        SetCursorForAxis(axis, NearZero(p, axis));
    return kCursorIsSet;
}

// Dragging

int ThreeDPane::HandleClick(EventRecordAdapter *event) {
    PaneWatch const watch(this); // asking for the button lets other things happen
    if (!OS::Services::StillDown() || !watch.PaneExists())
        return kHandled;
    Point const p = event->where;
    Axis3D axis = kAxisX;
    if (PointOnIndicator(p))
        TrackClick(GetDragAxis(p), WayFrom(p, Project(value)));
    else if (PointOnAxis(p, &axis))
        TrackClick(axis, NearZero(p, axis) ? WayFrom(p, AxisZeroPoint(axis)) : Point{0, 0});
    return kHandled;
}

void ThreeDPane::TrackClick(Axis3D axis, Point offset) {
    Point a, b;
    ProjectLine(axis, &a, &b);
    if (SamePlace(a, b))
        return; // seen end on
    bool const useH = std::abs(b.h - a.h) >= std::abs(b.v - a.v);
    double const start = value[axis];
    bool detached = false;
    PaneWatch const watch(this); // the hook and whatever runs in between may delete the pane
    Point p = {0, 0};
    Prepare();
    while (MouseIsDragging(&p, nullptr) && watch.PaneExists()) {
        if (DistanceFromAxis(p, axis) > kLongestReach) {
            if (!detached)
                SetOneCoordinate(axis, start);
            if (!watch.PaneExists())
                return;
            SetCursorForAxis(axis, false);
            detached = true;
        } else {
            VelaDrawing::AddPt(offset, &p);
            SetOneCoordinate(axis, SearchForPoint(p, useH, axis));
            if (!watch.PaneExists())
                return;
            SetCursorForAxis(axis, value[axis] == 0.0);
            detached = false;
        }
        UpdateGlog(GetGlog());
        if (!watch.PaneExists())
            return;
        Prepare();
    }
}
