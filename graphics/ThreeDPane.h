// A point in a cube, drawn in perspective: a ball, its shadow on the floor, and three lines through it.
//
// The cube runs from -1.0 to 1.0 on each axis; y is up. The mouse moves the point along one axis at a time:
// pressed on the ball, along the axis that lies nearest to the direction from the ball's centre; pressed on a
// line, along that, and the point jumps to the mouse unless it is near the line's zero. Over the pixel that
// holds zero the coordinate is exactly 0.0. A mouse that goes more than 72 pixels away from the line puts the
// coordinate back to where it was until it returns.
#pragma once
#include "graphics/Matrix3D.h"
#include "graphics/Point3D.h"
#include "host/GlogPane.h"
#include "host/OSPath.h"

class ThreeDPane : public GlogPane {
public:
    // Makes a pane, which the glog owns, in the box that the glog's resource has for the number; null when
    // memory or glog is wanting. The cube is turned about y by the angle, in degrees, and seen from the
    // viewpoint, in its own units. It is drawn as large as it fits into the box less the margins with all of
    // the ball, whose radius is in cube units, and at their top left.
    static ThreeDPane *NewThreeDPane(glogRec *, short id, double angle, Point3D viewpoint, double radius,
                                     Rect margins);
    ~ThreeDPane() override;

    // Is called with the argument whenever the value has changed, also in the middle of a drag; there is one
    // at a time, null for none. It may change the value and delete the pane.
    void InstallHook(void (*newHook)(void *), void *argument);

    // The point, (0.0, 0.0, 0.0) at first. Setters invalidate the pane and then call the hook, for another
    // value only; coordinates outside of the cube are taken as they are.
    Point3D GetValue() const { return value; }
    double GetOneCoordinate(Axis3D axis) const { return value[axis]; } // one of its numbers
    void SetValue(Point3D);
    void SetOneCoordinate(Axis3D, double);

    // Where things lie, in pixels of the pane. What cannot be seen from the viewpoint gives any pixel.

    Point Project(Point3D) const; // of a place in the cube
    // Of the value with the coordinate 0.0 instead of its own.
    Point AxisZeroPoint(Axis3D) const;
    // The ends of the line through the value along the axis: a at -1.0, b at 1.0.
    void ProjectLine(Axis3D, Point *a, Point *b) const;
    // Begin a subpath at the point's pixel, and continue it to there.
    void MoveTo3D(OSPath &, Point3D) const;
    void LineTo3D(OSPath &, Point3D) const;

protected:
    ThreeDPane();
    // The rest of NewThreeDPane; null when the pane cannot be attached.
    ThreeDPane *ThreeDPaneInit(glogRec *, short id, double angle, Point3D viewpoint, double radius,
                               Rect margins);
    // Both once more for another box or view; the pane is not invalidated.
    void BuildMatrix(double angle, Point3D viewpoint, Rect margins); // from the box as it is
    void MakeWallsPath();                                            // from the matrix as it is

    // Geometry

    // From the line through the value along the axis, in pixels; beyond its ends, from the nearer end. Along
    // lines at 45 degrees it is the larger by the square root of 2.
    double DistanceFromAxis(Point, Axis3D) const;
    void GetIndicatorBox(Rect *) const; // the ball
    // The direction of the z axis on the screen: degrees from 0 to 179, clockwise, 0 upward.
    short ZAxisAngle() const;
    // The coordinate at which the value would lie under the point, by its h or its v; at the ends of the line
    // and beyond -1.0 and 1.0.
    double SearchForPoint(Point, bool useH, Axis3D) const;
    // The same between two coordinates whose pixels are known.
    double SearchInternal(short c, bool useH, Axis3D, double lo, double hi, short clo, short chi) const;
    // Appends the outline of the wall on which the axis has the value, a pixel wider round about.
    void AddWallToPath(Axis3D, double wall, OSPath &) const;

    // Drawing, all on the current port

    void DrawLine(Axis3D) const;       // through the value
    void DrawBackHalfOfZLine() const;  // from the ball to the back wall
    void DrawFrontHalfOfZLine() const; // from the ball to the front; nothing when it touches that
    void DrawIndicator() const;        // the ball
    void DrawShadow() const;           // of the ball, within the walls
    // Appends the grid of a wall, in steps of 0.25, and makes the colour a green; for subclasses that draw
    // the cube themselves.
    void DrawWall(OSPath &, Axis3D, double wall) const;
    // Appends the line along which two axes have these values.
    void DrawWallLine(OSPath &, Axis3D fixed, Axis3D step, double stepValue, double fixedValue) const;

    // The mouse

    bool PointOnIndicator(Point) const;      // or up to 5 pixels beside it
    bool PointOnAxis(Point, Axis3D *) const; // the nearest axis less than 6 pixels away; null is not allowed
    bool NearZero(Point, Axis3D) const;      // less than 5 pixels from the axis's zero
    Axis3D GetDragAxis(Point) const;         // along which a drag from there goes
    void SetCursorForAxis(Axis3D, bool atZero) const; // of moving along it, or of moving at its zero
    // Follows the mouse until its button is up; the offset, in pixels, is from the mouse to the point that is
    // dragged.
    void TrackClick(Axis3D, Point offset);

    // Overridden operations of panes.
    char AdjustCursorAndDisplayHelp(Point) override; // always true
    int HandleClick(EventRecordAdapter *) override;  // always -1
    void DrawGuts(OSRgn *updateRegion) override;

private:
    void (*hook)(void *);
    void *hookArgument;
    Matrix3D projection;
    OSPath walls;  // outline of the three that are seen
    double radius; // of the ball, in cube units
    Point3D value;
};
