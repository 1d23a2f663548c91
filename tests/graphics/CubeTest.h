// What the tests of the point in a cube share.
#pragma once
#include "desktop/panes/Glog.h"
#include "graphics/ThreeDPane.h"
#include "tests/PaneTest.h"
#include <memory>

inline std::ostream &operator<<(std::ostream &out, Point3D const &p) {
    return out << "{x " << p.x << ", y " << p.y << ", z " << p.z << "}";
}

// A cube whose inner workings can be called.
class Cube : public ThreeDPane {
public:
    Cube(glogRec *glog, double angle, Point3D viewpoint, double radius, Rect margins) {
        ThreeDPaneInit(glog, 7, angle, viewpoint, radius, margins);
    }
    using ThreeDPane::AddWallToPath;
    using ThreeDPane::AdjustCursorAndDisplayHelp;
    using ThreeDPane::DistanceFromAxis;
    using ThreeDPane::DrawBackHalfOfZLine;
    using ThreeDPane::DrawFrontHalfOfZLine;
    using ThreeDPane::DrawIndicator;
    using ThreeDPane::DrawShadow;
    using ThreeDPane::DrawWall;
    using ThreeDPane::DrawWallLine;
    using ThreeDPane::GetDragAxis;
    using ThreeDPane::GetIndicatorBox;
    using ThreeDPane::NearZero;
    using ThreeDPane::PointOnAxis;
    using ThreeDPane::PointOnIndicator;
    using ThreeDPane::SearchForPoint;
    using ThreeDPane::SetCursorForAxis;
    using ThreeDPane::TrackClick;
    using ThreeDPane::ZAxisAngle;

    int HandleClick(EventRecordAdapter *event) override {
        if (!onClick)
            return ThreeDPane::HandleClick(event);
        onClick();
        return -1;
    }
    std::function<void()> onClick; // instead of what the pane does
};

class CubeTest : public PaneTest {
protected:
    static constexpr short kNumber = 7;
    static constexpr Rect kNoMargins = {0, 0, 0, 0};

    // A cube in the box.
    Cube *Made(Rect const &box, double angle, Point3D viewpoint, double radius = 0.0,
               Rect margins = kNoMargins) {
        Glog::From(glog).DescribeItem(kNumber, box);
        return new Cube(glog, angle, viewpoint, radius, margins);
    }
    // Straight from the front at a distance of 3, in 200 pixels: a point is at 100 + 200 x / (z + 3) across
    // and at 100 - 200 y / (z + 3) down.
    Cube *FromTheFront(double radius = 0.0) { return Made({0, 0, 200, 200}, 0.0, {0.0, 0.0, -3.0}, radius); }
    // As in dialogs, with the cube's picture.
    Cube *AsInDialogs() { return Made({0, 0, 238, 224}, -20.0, {1.2, 1.8, -5.5}, 0.16, {7, 7, 7, 7}); }
};
