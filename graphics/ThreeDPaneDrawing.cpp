// How the point in the cube is drawn.
#include "graphics/ThreeDPane.h"
#include "host/Icons.h"
#include "host/OSPort.h"
#include "host/OSRgn.h"
#include "host/RGBColor.h"
#include "host/VelaDrawing.h"
#include "scrolling/Truncation.h"
#include <algorithm>

namespace {

short const kCubeFamily = 1607, kBallFamily = 1606;
int const kLeastBall = 13; // pixels of the family's first ball, each further one is a pixel larger
double const kLineWidth = 0.5;
double const kGridStep = 0.25;
RGBColor const kGridColor = {0x4000, 0xCCCC, 0x4000};

// Draws, and puts the clip back afterwards. When drawing throws, that is the host's matter.
template <class Drawing> void KeepClip(Drawing const &draw) {
    TempRgn clip;
    VelaDrawing::GetClip(clip);
    draw();
    VelaDrawing::SetClip(clip);
}

// Makes the rectangle round both points the clip, with room for the line between them.
void ClipBetween(Point a, Point b) {
    Rect const between = {Pixel16(std::min(a.v, b.v) - 1), std::min(a.h, b.h),
                          Pixel16(std::max(a.v, b.v) + 2), Pixel16(std::max(a.h, b.h) + 1)};
    VelaDrawing::ClipRect(&between);
}

void StrokeLine(Point a, Point b) {
    OSPath path;
    path.CreateSubpath(a.h, a.v);
    path.AddLine(b.h, b.v);
    path.CloseSubpath();
    OSPort *const port = OSPort::GetCurrent();
    port->SetForeColor(OS::RGBAColor(0.0, 0.0, 0.0, 1.0));
    port->SetLineWidth(kLineWidth);
    port->StrokePath(path);
}

} // namespace

// The z line comes in two halves, so that the ball hides it behind and is crossed by it in front.
void ThreeDPane::DrawGuts(OSRgn *) {
    Rect box;
    GetBox(&box);
    Draw1Icon(kCubeFamily, 0, box.left, box.top);
    DrawShadow();
    DrawLine(kAxisX);
    DrawLine(kAxisY);
    DrawBackHalfOfZLine();
    DrawIndicator();
    DrawFrontHalfOfZLine();
}

void ThreeDPane::DrawLine(Axis3D axis) const {
    Point a, b;
    ProjectLine(axis, &a, &b);
    StrokeLine(a, b);
}

void ThreeDPane::DrawBackHalfOfZLine() const {
    KeepClip([this] {
        Point a, b;
        ProjectLine(kAxisZ, &a, &b);
        ClipBetween(b, Project(value));
        StrokeLine(a, b);
    });
}

void ThreeDPane::DrawFrontHalfOfZLine() const {
    if (!(value.z + 1.0 > radius))
        return; // the ball touches the front
    KeepClip([this] {
        Point a, b;
        ProjectLine(kAxisZ, &a, &b);
        ClipBetween(a, Project({value.x, value.y, value.z - radius}));
        StrokeLine(a, b);
    });
}

void ThreeDPane::DrawIndicator() const {
    Rect ball;
    GetIndicatorBox(&ball);
    int const side = std::max(ball.right - ball.left, ball.bottom - ball.top);
    Draw1Icon(kBallFamily, static_cast<short>(side - kLeastBall), ball.left, ball.top);
}

// Grows, drifts and fades as the ball rises.
void ThreeDPane::DrawShadow() const {
    double const lift = (value.y + 1.0) * 0.5;
    double const spread = (lift * 2.2 + 0.8) * radius;
    double const floor = -1.0 - radius;
    double const dx = lift * 0.6 + 0.1, dz = lift * 0.3 + 0.15;
    Point const near = Project({value.x + dx + spread, floor, value.z + dz + spread});
    Point const far = Project({value.x + dx - spread, floor, value.z + dz - spread});
    Rect oval;
    VelaDrawing::Pt2Rect(far, near, &oval);
    float const alpha = static_cast<float>(1.0 - lift) * 0.27f + 0.13f;

    KeepClip([&] {
        OSPort *const port = OSPort::GetCurrent();
        port->NarrowClipPath(walls);
        port->SetForeColor(OS::RGBAColor(0.0, 0.0, 0.0, static_cast<double>(alpha)));
        port->PaintOval(oval);
    });
}

void ThreeDPane::DrawWall(OSPath &path, Axis3D axis, double wall) const {
    VelaDrawing::RGBForeColor(kGridColor);
    for (double t = -1.0; t <= 1.0; t += kGridStep) {
        for (Axis3D step : {kAxisX, kAxisY, kAxisZ}) {
            if (step != axis)
                DrawWallLine(path, axis, step, t, wall);
        }
    }
    VelaDrawing::PenNormal();
}

void ThreeDPane::DrawWallLine(OSPath &path, Axis3D fixed, Axis3D step, double stepValue,
                              double fixedValue) const {
    Axis3D const third = static_cast<Axis3D>(kAxisX + kAxisY + kAxisZ - fixed - step);
    Point3D point;
    point[fixed] = fixedValue;
    point[step] = stepValue;
    point[third] = -1.0;
    MoveTo3D(path, point);
    point[third] = 1.0;
    LineTo3D(path, point);
}
