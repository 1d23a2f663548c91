#include "graphics/ThreeDPane.h"
#include "graphics/LineAngle.h"
#include "graphics/WholeNumber.h"
#include "host/GlogLayout.h"
#include "host/VelaDrawing.h"
#include "scrolling/Truncation.h"
#include <algorithm>
#include <cmath>
#include <limits>
#include <memory>
#include <new>
#include <utility>

namespace {

double const kPi = 3.14159265358979, kHalfTurn = 180.0; // degrees
double const kLow = -1.0, kHigh = 1.0;                  // ends of the cube
double const kGreatest = std::numeric_limits<double>::max();

short Pixel(double place) { return static_cast<short>(WholeNumber(place)); }

// The extent of what has been added.
struct Bounds {
    double xMin = kGreatest, xMax = -kGreatest, yMin = kGreatest, yMax = -kGreatest;

    void Add(Matrix3D::Image const &image) {
        xMin = std::min(xMin, image.x);
        xMax = std::max(xMax, image.x);
        yMin = std::min(yMin, image.y);
        yMax = std::max(yMax, image.y);
    }
};

Bounds BoundsOfCube(Matrix3D const &matrix, double reach) {
    Bounds bounds;
    for (double x : {-reach, reach})
        for (double y : {-reach, reach})
            for (double z : {-reach, reach})
                bounds.Add(matrix.Project({x, y, z}));
    return bounds;
}

} // namespace

ThreeDPane::ThreeDPane()
    : hook(nullptr)
    , hookArgument(nullptr)
    , radius(0.0) {}

ThreeDPane::~ThreeDPane() {}

ThreeDPane *ThreeDPane::NewThreeDPane(glogRec *owner, short id, double angle, Point3D viewpoint,
                                      double ballRadius, Rect margins) {
    std::unique_ptr<ThreeDPane> pane(new (std::nothrow) ThreeDPane);
    if (!pane || !pane->ThreeDPaneInit(owner, id, angle, viewpoint, ballRadius, margins))
        return nullptr;
    return pane.release();
}

ThreeDPane *ThreeDPane::ThreeDPaneInit(glogRec *owner, short id, double angle, Point3D viewpoint,
                                       double ballRadius, Rect margins) {
    if (!GlogPaneInit(owner, id))
        return nullptr;
    radius = ballRadius;
    WithPerformLayoutRectUpdate const layout(this);
    BuildMatrix(angle, viewpoint, margins);
    MakeWallsPath();
    return this;
}

// One scale for both directions keeps the proportions; what is left over is at the right or below.
void ThreeDPane::BuildMatrix(double angle, Point3D viewpoint, Rect margins) {
    Matrix3D const turned = Matrix3D::Rotation(angle * kPi / kHalfTurn) *
                            Matrix3D::Translation(-viewpoint.x, -viewpoint.y, -viewpoint.z) *
                            Matrix3D::MirrorY() * Matrix3D::Perspective(1.0);
    Bounds const cube = BoundsOfCube(turned, kHigh + radius);
    Rect box;
    GetBox(&box);
    double const left = box.left + margins.left, top = box.top + margins.top;
    double const right = box.right - margins.right, bottom = box.bottom - margins.bottom;
    double const s =
        std::min((right - left) / (cube.xMax - cube.xMin), (bottom - top) / (cube.yMax - cube.yMin));
    projection = turned * Matrix3D::Scale(s, s, 1.0) *
                 Matrix3D::Translation(left - s * cube.xMin, top - s * cube.yMin, 1.0);
}

void ThreeDPane::MakeWallsPath() {
    walls.Clear();
    AddWallToPath(kAxisX, kLow, walls);
    AddWallToPath(kAxisY, kLow, walls);
    AddWallToPath(kAxisZ, kHigh, walls);
}

void ThreeDPane::AddWallToPath(Axis3D axis, double wall, OSPath &path) const {
    Axis3D const a = axis == kAxisX ? kAxisZ : axis == kAxisY ? kAxisX : kAxisY;
    Axis3D const b = axis == kAxisX ? kAxisY : axis == kAxisY ? kAxisZ : kAxisX;
    OSPath outline;
    Point3D p;
    p[axis] = wall;
    p[a] = p[b] = kLow;
    MoveTo3D(outline, p);
    for (auto [moved, end] :
         {std::pair(b, kHigh), std::pair(a, kHigh), std::pair(b, kLow), std::pair(a, kLow)}) {
        p[moved] = end;
        LineTo3D(outline, p);
    }
    path.AddPath(outline, 0.0, 0.0);
    path.AddPath(outline, 1.0, 0.0);
    path.AddPath(outline, -1.0, 1.0);
}

// Value

void ThreeDPane::InstallHook(void (*newHook)(void *), void *argument) {
    hook = newHook;
    hookArgument = argument;
}

// The hook comes last: it may delete the pane.
void ThreeDPane::SetValue(Point3D newValue) {
    if (newValue == value)
        return;
    value = newValue;
    Inval();
    if (hook)
        hook(hookArgument);
}

void ThreeDPane::SetOneCoordinate(Axis3D axis, double coordinate) {
    Point3D changed = value;
    changed[axis] = coordinate;
    // Only this one counts: others that are no numbers have not changed.
    if (coordinate != value[axis])
        SetValue(changed);
}

// Projection

Point ThreeDPane::Project(Point3D point) const {
    Matrix3D::Image const image = projection.Project(point);
    return {Pixel(image.y), Pixel(image.x)};
}

Point ThreeDPane::AxisZeroPoint(Axis3D axis) const {
    Point3D point = value;
    point[axis] = 0.0;
    return Project(point);
}

void ThreeDPane::ProjectLine(Axis3D axis, Point *a, Point *b) const {
    Point3D point = value;
    point[axis] = kLow;
    *a = Project(point);
    point[axis] = kHigh;
    *b = Project(point);
}

void ThreeDPane::MoveTo3D(OSPath &path, Point3D point) const {
    Point const pixel = Project(point);
    path.CreateSubpath(pixel.h, pixel.v);
}

void ThreeDPane::LineTo3D(OSPath &path, Point3D point) const {
    Point const pixel = Project(point);
    path.AddLine(pixel.h, pixel.v);
}

// Measures

double ThreeDPane::DistanceFromAxis(Point p, Axis3D axis) const {
    Point a, b;
    ProjectLine(axis, &a, &b);
    double const v = p.v - a.v, h = p.h - a.h, lineV = b.v - a.v, lineH = b.h - a.h;
    // Lines at 45 degrees take a short cut, on purpose longer than the true distance; so does a point.
    if (lineH == lineV)
        return std::abs(h - v);
    if (lineH == -lineV)
        return std::abs(v + h);
    double const t = (v * lineV + h * lineH) / (lineV * lineV + lineH * lineH);
    if (t < 0.0)
        return std::sqrt(v * v + h * h);
    if (t > 1.0)
        return std::sqrt((v - lineV) * (v - lineV) + (h - lineH) * (h - lineH));
    return std::sqrt((v - lineV * t) * (v - lineV * t) + (h - lineH * t) * (h - lineH * t));
}

void ThreeDPane::GetIndicatorBox(Rect *box) const {
    VelaDrawing::Pt2Rect(Project({value.x + radius, value.y + radius, value.z}),
                         Project({value.x - radius, value.y - radius, value.z}), box);
}

short ThreeDPane::ZAxisAngle() const {
    Point a, b;
    ProjectLine(kAxisZ, &a, &b);
    Point const beyond = {Pixel16(2 * b.v - a.v), Pixel16(2 * b.h - a.h)};
    Rect ball;
    GetIndicatorBox(&ball);
    return AngleOfLine(ball, beyond);
}

double ThreeDPane::SearchForPoint(Point p, bool useH, Axis3D axis) const {
    Point a, b;
    ProjectLine(axis, &a, &b);
    short const c = useH ? p.h : p.v, ca = useH ? a.h : a.v, cb = useH ? b.h : b.v;
    bool const descending = cb < ca;
    if (descending ? c >= ca : c <= ca)
        return kLow;
    if (descending ? c <= cb : c >= cb)
        return kHigh;
    return SearchInternal(c, useH, axis, kLow, kHigh, ca, cb);
}

// The longer coordinate of a line meets each pixel between its ends; where the projection is none, the search
// ends when there is nothing left to divide.
double ThreeDPane::SearchInternal(short c, bool useH, Axis3D axis, double lo, double hi, short clo,
                                  short chi) const {
    for (;;) {
        double const mid = (lo + hi) * 0.5;
        Point3D point = value;
        point[axis] = mid;
        Point const pixel = Project(point);
        short const m = useH ? pixel.h : pixel.v;
        // The pixel that holds zero gives zero.
        if (c == m)
            return lo < 0.0 && hi > 0.0 ? 0.0 : mid;
        if (mid == lo || mid == hi)
            return mid;
        bool const descending = chi < clo;
        if (descending ? c > m : c < m) {
            hi = mid;
            chi = m;
        } else {
            lo = mid;
            clo = m;
        }
    }
}
