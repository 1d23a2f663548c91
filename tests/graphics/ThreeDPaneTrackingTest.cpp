#include "desktop/windows/SimulatedWindowSystem.h"
#include "host/PaneWatch.h"
#include "tests/graphics/CubeTest.h"
#include <cmath>

namespace {

class ThreeDPaneTrackingTest : public CubeTest {
protected:
    // Writes down each value that the hook hears of.
    struct Log {
        explicit Log(ThreeDPane *cube)
            : pane(cube) {
            cube->InstallHook(Note, this);
        }
        static void Note(void *self) {
            Log &log = *static_cast<Log *>(self);
            log.values.push_back(log.pane->GetValue());
        }
        ThreeDPane *pane;
        std::vector<Point3D> values;
    };

    // Drags along the axis while the script is played, wherever the press is.
    void Track(Cube &cube, Axis3D axis, std::string const &script) {
        cube.onClick = [&, axis] { cube.TrackClick(axis, {0, 0}); };
        desktop.Play(script);
    }

    int Cursor() { return static_cast<SimulatedWindowSystem &>(desktop.Windows()).Cursor(); }
    int CursorAt(Point p) {
        desktop.Play("move " + Spot(p));
        return Cursor();
    }
    static std::string Spot(Point p, int right = 0, int down = 0) {
        return std::to_string(p.h + right) + ' ' + std::to_string(p.v + down);
    }
    static Point Middle(Cube const &cube) { return cube.Project(cube.GetValue()); }
};

} // namespace

// What is under the mouse

TEST_F(ThreeDPaneTrackingTest, TheBallIsTakenUpToFivePixelsBesideIt) {
    Cube *const cube = FromTheFront(0.2); // the ball is from 90 to 110
    EXPECT_TRUE(cube->PointOnIndicator({100, 85}));
    EXPECT_FALSE(cube->PointOnIndicator({100, 84}));
    EXPECT_TRUE(cube->PointOnIndicator({114, 114}));
    EXPECT_FALSE(cube->PointOnIndicator({115, 100}));
}

TEST_F(ThreeDPaneTrackingTest, ALineIsTakenLessThanSixPixelsBesideIt) {
    Cube *const cube = FromTheFront();
    Axis3D axis = kAxisZ;
    EXPECT_TRUE(cube->PointOnAxis({105, 130}, &axis));
    EXPECT_EQ(axis, kAxisX);
    EXPECT_TRUE(cube->PointOnAxis({60, 95}, &axis));
    EXPECT_EQ(axis, kAxisY);
    axis = kAxisZ;
    EXPECT_FALSE(cube->PointOnAxis({106, 130}, &axis));
    EXPECT_EQ(axis, kAxisZ) << "nothing is written";
}

TEST_F(ThreeDPaneTrackingTest, TheEarlierOfTwoLinesAtTheSameDistanceCounts) {
    Cube *const cube = FromTheFront();
    cube->SetValue({0.3, 0.3, 0.0}); // the lines of x and y meet at 80, 120; that of z is out of reach
    Axis3D axis = kAxisZ;
    EXPECT_TRUE(cube->PointOnAxis({75, 115}, &axis));
    EXPECT_EQ(axis, kAxisX);
}

TEST_F(ThreeDPaneTrackingTest, ZeroIsNearLessThanFivePixelsAway) {
    Cube *const cube = FromTheFront();
    EXPECT_TRUE(cube->NearZero({100, 104}, kAxisX));
    EXPECT_FALSE(cube->NearZero({100, 105}, kAxisX));
    EXPECT_FALSE(cube->NearZero({103, 104}, kAxisX)) << "in a straight line";
    EXPECT_TRUE(cube->NearZero({103, 103}, kAxisX));
}

TEST_F(ThreeDPaneTrackingTest, ADragGoesWhereTheMouseIsFromTheBall) {
    Cube *const cube = AsInDialogs();
    Point const middle = Middle(*cube);
    auto const axisAt = [&](int right, int down) {
        return cube->GetDragAxis({static_cast<short>(middle.v + down), static_cast<short>(middle.h + right)});
    };
    EXPECT_EQ(axisAt(9, 0), kAxisX);
    EXPECT_EQ(axisAt(-9, 0), kAxisX);
    EXPECT_EQ(axisAt(0, 9), kAxisY);
    EXPECT_EQ(axisAt(0, -9), kAxisY);
    EXPECT_EQ(axisAt(6, -6), kAxisZ) << "it rises to the right";
    EXPECT_EQ(axisAt(-6, 6), kAxisZ);
}

TEST_F(ThreeDPaneTrackingTest, WhereItIsUndecidedADragGoesAlongZ) {
    Cube *const cube =
        FromTheFront(0.2); // the ball's middle is at 100, 100; z has no direction, which counts as up
    EXPECT_EQ(cube->GetDragAxis({90, 110}), kAxisZ) << "as far from level as from upright";
    EXPECT_EQ(cube->GetDragAxis({92, 110}), kAxisX);
    EXPECT_EQ(cube->GetDragAxis({90, 108}), kAxisZ) << "as far from upright as from z";
}

// Cursors

TEST_F(ThreeDPaneTrackingTest, CursorsTellTheAxisAndZero) {
    Cube *const cube = AsInDialogs(); // z rises
    Show();
    struct Case {
        Axis3D axis;
        bool atZero;
        int cursor;
    };
    for (Case c : {Case{kAxisX, false, 650}, Case{kAxisY, false, 651}, Case{kAxisZ, false, 652},
                   Case{kAxisX, true, 654}, Case{kAxisY, true, 655}, Case{kAxisZ, true, 656}}) {
        cube->SetCursorForAxis(c.axis, c.atZero);
        EXPECT_EQ(Cursor(), c.cursor);
    }
    Cube *const falling = Made({0, 0, 238, 224}, 20.0, {-1.2, 1.8, -5.5}, 0.16);
    ASSERT_GT(falling->ZAxisAngle(), 90);
    falling->SetCursorForAxis(kAxisZ, false);
    EXPECT_EQ(Cursor(), 653);
    falling->SetCursorForAxis(kAxisZ, true);
    EXPECT_EQ(Cursor(), 657);
}

TEST_F(ThreeDPaneTrackingTest, ALevelZCountsAsRising) {
    Cube *const cube = FromTheFront();
    cube->SetValue({0.9, 0.0, 0.5});
    ASSERT_EQ(cube->ZAxisAngle(), 90);
    Show();
    cube->SetCursorForAxis(kAxisZ, false);
    EXPECT_EQ(Cursor(), 652);
}

TEST_F(ThreeDPaneTrackingTest, TheCursorTellsWhatIsUnderTheMouse) {
    Cube *const cube = AsInDialogs();
    cube->SetValue({0.6, 0.0, 0.0});
    Show();
    Point const middle = Middle(*cube), zero = cube->AxisZeroPoint(kAxisX), end = cube->Project({-0.9, 0, 0});
    EXPECT_EQ(CursorAt({middle.v, static_cast<short>(middle.h + 6)}), 650) << "on the ball";
    EXPECT_EQ(CursorAt({static_cast<short>(middle.v - 6), middle.h}), 651);
    EXPECT_EQ(CursorAt(zero), 654) << "on the line at its zero";
    EXPECT_EQ(CursorAt(end), 650) << "on the line elsewhere";
}

TEST_F(ThreeDPaneTrackingTest, BesideEverythingTheCursorIsAnArrow) {
    Cube *const cube = AsInDialogs();
    Show();
    Point const middle = Middle(*cube);
    EXPECT_EQ(CursorAt({static_cast<short>(middle.v - 6), middle.h}), 651);
    EXPECT_EQ(CursorAt({230, 10}), 0);
    EXPECT_EQ(cube->AdjustCursorAndDisplayHelp({230, 10}), 1);
}

// Dragging

TEST_F(ThreeDPaneTrackingTest, AClickThatIsOverDoesNothing) {
    Cube *const cube = AsInDialogs();
    Show();
    Log const log(cube);
    EXPECT_EQ(ResultOfClick("click " + Spot(cube->Project({0.7, 0.0, 0.0}))), -1);
    EXPECT_TRUE(log.values.empty());
}

TEST_F(ThreeDPaneTrackingTest, TheBallDoesNotJumpWhenItIsTakenOffItsMiddle) {
    Cube *const cube = AsInDialogs();
    cube->SetValue({0.3, 0.2, -0.4});
    Show();
    Log const log(cube);
    Point const middle = Middle(*cube), other = cube->Project({0.8, 0.2, -0.4});
    int const way = other.h - middle.h;
    EXPECT_EQ(ResultOfClick("press " + Spot(middle, 6, 0) + "\nmove " + Spot(middle, 6 + way, 0)), -1);
    ASSERT_EQ(log.values.size(), 1u);
    EXPECT_EQ(Middle(*cube).h, other.h);
    EXPECT_EQ(cube->GetOneCoordinate(kAxisY), 0.2);
    EXPECT_EQ(cube->GetOneCoordinate(kAxisZ), -0.4);
}

TEST_F(ThreeDPaneTrackingTest, OnALineThePointJumpsToTheMouse) {
    Cube *const cube = AsInDialogs();
    cube->SetValue({-0.6, 0.2, 0.1});
    Show();
    Point const there = cube->Project({0.7, 0.2, 0.1});
    desktop.Play("press " + Spot(there, 0, 3) + "\nmove " + Spot(there, 1, 3));
    EXPECT_EQ(Middle(*cube).h, there.h + 1);
    EXPECT_NEAR(cube->GetOneCoordinate(kAxisX), 0.7, 0.05);
}

TEST_F(ThreeDPaneTrackingTest, NearZeroThePointIsDraggedFromZero) {
    Cube *const cube = AsInDialogs();
    cube->SetValue({-0.6, 0.2, 0.1});
    Show();
    Log const log(cube);
    Point const zero = cube->AxisZeroPoint(kAxisX);
    desktop.Play("press " + Spot(zero, 3, 1) + "\nmove " + Spot(zero, 3, 2) + "\nmove " + Spot(zero, 13, 2));
    ASSERT_EQ(log.values.size(), 2u);
    EXPECT_EQ(log.values[0].x, 0.0) << "exactly";
    EXPECT_EQ(Middle(*cube).h, zero.h + 10);
}

TEST_F(ThreeDPaneTrackingTest, OverZeroTheCoordinateIsExactlyZeroAndTheCursorTells) {
    Cube *const cube = AsInDialogs();
    cube->SetValue({0.5, 0.2, 0.1});
    Show();
    std::vector<int> cursors;
    Point const zero = cube->AxisZeroPoint(kAxisX), middle = Middle(*cube);
    int const way = zero.h - middle.h;
    desktop.Play("press " + Spot(middle, 4, 0) + "\nmove " + Spot(middle, 4 + way, 0));
    EXPECT_EQ(cube->GetOneCoordinate(kAxisX), 0.0);
    EXPECT_EQ(Cursor(), 654);
    desktop.Play("press " + Spot(zero, 4, 0) + "\nmove " + Spot(zero, 14, 0));
    EXPECT_EQ(Cursor(), 650);
}

TEST_F(ThreeDPaneTrackingTest, UprightAxesFollowTheMouseUpAndDown) {
    Cube *const cube = AsInDialogs();
    Show();
    Point const middle = Middle(*cube), up = cube->Project({0.0, 0.8, 0.0});
    desktop.Play("press " + Spot(middle, 0, -5) + "\nmove " + Spot(up, 20, -5));
    EXPECT_EQ(Middle(*cube).v, up.v);
    EXPECT_EQ(cube->GetOneCoordinate(kAxisX), 0.0);
}

TEST_F(ThreeDPaneTrackingTest, DragsEndAtTheEndsOfTheCube) {
    Cube *const cube = AsInDialogs();
    Show();
    Point const middle = Middle(*cube);
    desktop.Play("press " + Spot(middle, 6, 0) + "\nmove " + Spot(cube->Project({1.0, 0.0, 0.0}), 40, 0));
    EXPECT_EQ(cube->GetOneCoordinate(kAxisX), 1.0);
    desktop.Play("press " + Spot(Middle(*cube), 6, 0) + "\nmove " +
                 Spot(cube->Project({-1.0, 0.0, 0.0}), -40, 0));
    EXPECT_EQ(cube->GetOneCoordinate(kAxisX), -1.0);
}

TEST_F(ThreeDPaneTrackingTest, FarFromItsLineTheCoordinateGoesBackAndComesAgain) {
    Cube *const cube = AsInDialogs();
    cube->SetValue({0.3, 0.2, 0.0});
    Show();
    Log const log(cube);
    Point const middle = Middle(*cube), other = cube->Project({0.8, 0.2, 0.0});
    int const way = other.h - middle.h;
    // A point 90 pixels below the line, and off its ends: more than 72 from it.
    desktop.Play("press " + Spot(middle, 6, 0) + "\nmove " + Spot(middle, 6 + way, 0) + "\nmove " +
                 Spot(middle, 6 + way, 90) + "\nmove " + Spot(middle, 7 + way, 91) + "\nmove " +
                 Spot(middle, 6 + way, 0) + "\nmove " + Spot(middle, 6 + way, 90));
    ASSERT_EQ(log.values.size(), 4u) << "there, back, there again, and back again";
    EXPECT_NE(log.values[0].x, 0.3);
    EXPECT_EQ(log.values[1].x, 0.3);
    EXPECT_EQ(log.values[2].x, log.values[0].x);
    EXPECT_EQ(log.values[3].x, 0.3);
}

TEST_F(ThreeDPaneTrackingTest, FarFromItsLineTheCursorIsThatOfMovingAgain) {
    Cube *const cube = AsInDialogs();
    cube->SetValue({0.5, 0.2, 0.1});
    Show();
    Point const zero = cube->AxisZeroPoint(kAxisX), middle = Middle(*cube);
    int const way = zero.h - middle.h;
    std::string const toZero = "press " + Spot(middle, 4, 0) + "\nmove " + Spot(middle, 4 + way, 0);
    desktop.Play(toZero);
    ASSERT_EQ(Cursor(), 654);
    cube->SetValue({0.5, 0.2, 0.1});
    desktop.Play(toZero + "\nmove " + Spot(middle, 4 + way, 95));
    EXPECT_EQ(cube->GetOneCoordinate(kAxisX), 0.5);
    EXPECT_EQ(Cursor(), 650);
}

TEST_F(ThreeDPaneTrackingTest, ADragIsDetachedBeyondSeventyTwoPixels) {
    Cube *const cube = FromTheFront(0.2);
    cube->SetValue({0.0, 0.5, 0.0}); // the line along x is level
    Show();
    Log const log(cube);
    Point const middle = Middle(*cube);
    desktop.Play("press " + Spot(middle, 8, 0) + "\nmove " + Spot(middle, 28, 0) + "\nmove " +
                 Spot(middle, 28, 72));
    EXPECT_EQ(log.values.size(), 1u) << "72 pixels below the line";
    double const placed = cube->GetOneCoordinate(kAxisX);
    EXPECT_NE(placed, 0.0);
    desktop.Play("press " + Spot(middle, 28, 0) + "\nmove " + Spot(middle, 38, 0) + "\nmove " +
                 Spot(middle, 38, 73));
    EXPECT_EQ(log.values.size(), 3u);
    EXPECT_EQ(cube->GetOneCoordinate(kAxisX), placed) << "released while it is detached";
    EXPECT_EQ(Cursor(), 650);
}

TEST_F(ThreeDPaneTrackingTest, AnAxisSeenEndOnIsNotDragged) {
    Cube *const cube = FromTheFront(0.2);
    Show();
    Log const log(cube);
    Track(*cube, kAxisZ, "press 107 107\nmove 150 150");
    EXPECT_TRUE(log.values.empty());
}

TEST_F(ThreeDPaneTrackingTest, ElsewhereNothingIsDragged) {
    Cube *const cube = AsInDialogs();
    Show();
    Log const log(cube);
    EXPECT_EQ(ResultOfClick("press 10 190\nmove 150 150"), -1);
    EXPECT_TRUE(log.values.empty());
}

TEST_F(ThreeDPaneTrackingTest, EveryStepIsDrawnAtOnce) {
    Cube *const cube = AsInDialogs();
    Show();
    Point const middle = Middle(*cube);
    desktop.TakePresented(glog);
    desktop.Play("press " + Spot(middle, 6, 0) + "\nmove " + Spot(middle, 16, 0) + "\nmove " +
                 Spot(middle, 26, 0));
    EXPECT_EQ(desktop.TakePresented(glog).size(), 2u);
}

TEST_F(ThreeDPaneTrackingTest, TheHookMayDeleteThePaneInTheMiddleOfADrag) {
    Cube *const cube = AsInDialogs();
    Show();
    PaneWatch const watch(cube);
    cube->InstallHook([](void *pane) { delete static_cast<Cube *>(pane); }, cube);
    Point const middle = Middle(*cube);
    EXPECT_EQ(ResultOfClick("press " + Spot(middle, 6, 0) + "\nmove " + Spot(middle, 16, 0) + "\nmove " +
                            Spot(middle, 26, 0)),
              -1);
    EXPECT_FALSE(watch.PaneExists());
}

TEST_F(ThreeDPaneTrackingTest, TheHookMayCloseTheWindowInTheMiddleOfADrag) {
    Cube *const cube = AsInDialogs();
    Show();
    cube->InstallHook([](void *pane) { DisposeGlog(static_cast<Cube *>(pane)->GetGlog()); }, cube);
    Point const middle = Middle(*cube);
    PaneWatch const watch(cube);
    desktop.Play("press " + Spot(middle, 6, 0) + "\nmove " + Spot(middle, 16, 0));
    EXPECT_FALSE(watch.PaneExists());
}
