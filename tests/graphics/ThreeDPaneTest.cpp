#include "host/OSPort.h"
#include "host/VelaDrawing.h"
#include "tests/graphics/CubeTest.h"
#include <cmath>
#include <limits>

namespace {

double const kInfinity = std::numeric_limits<double>::infinity();
double const kNoNumber = std::numeric_limits<double>::quiet_NaN();
Axis3D const kAxes[] = {kAxisX, kAxisY, kAxisZ};

class ThreeDPaneTest : public CubeTest {
protected:
    // Counts calls of the hook.
    struct Hooked {
        explicit Hooked(ThreeDPane *pane) { pane->InstallHook(Count, this); }
        static void Count(void *self) { ++static_cast<Hooked *>(self)->count; }
        int count = 0;
    };
    static Rect BallOf(Cube const &cube) {
        Rect ball;
        cube.GetIndicatorBox(&ball);
        return ball;
    }
};

} // namespace

// Projection

TEST_F(ThreeDPaneTest, FromTheFrontTheCubeFillsItsBox) {
    Cube *const cube = FromTheFront();
    EXPECT_EQ(cube->Project({-0.999, 0.999, -1.0}), (Point{0, 0}));
    EXPECT_EQ(cube->Project({0.996, -0.996, -1.0}), (Point{199, 199}));
}

TEST_F(ThreeDPaneTest, FromTheFrontWhatIsFurtherAwayIsSmaller) {
    Cube *const cube = FromTheFront();
    // 100 + 200 * 0.5 / 3 = 133.3 across, 100 + 200 * 0.25 / 3 = 116.6 down.
    EXPECT_EQ(cube->Project({0.5, -0.25, 0.0}), (Point{116, 133}));
    // 100 + 200 * 0.53 / 4 = 126.5, 100 + 200 * 0.25 / 4 = 112.5.
    EXPECT_EQ(cube->Project({0.53, -0.25, 1.0}), (Point{112, 126}));
    // 100 - 200 * 0.525 / 2 = 47.5, 100 - 200 * 0.333 / 2 = 66.7.
    EXPECT_EQ(cube->Project({-0.525, 0.333, -1.0}), (Point{66, 47}));
}

TEST_F(ThreeDPaneTest, FromTheSideAndAboveThePictureIsAtTheTopLeftOfTheBox) {
    // Across (x - 1) / (z + 4), down (2 - y) / (z + 4): from -2/3 to 0, and from 1/5 to 1. The height decides
    // the scale: 240 / 0.8 = 300.
    Cube *const cube = Made({10, 20, 250, 420}, 0.0, {1.0, 2.0, -4.0});
    // 20 + 300 * (2/3 - 1.1 / 4.1) = 139.5, 10 + 300 * (1.9 / 4.1 - 0.2) = 89.02
    EXPECT_EQ(cube->Project({-0.1, 0.1, 0.1}), (Point{89, 139}));
    // 20 + 300 * (2/3 - 0.2 / 4.9) = 207.8, 10 + 300 * (2.7 / 4.9 - 0.2) = 115.3
    EXPECT_EQ(cube->Project({0.8, -0.7, 0.9}), (Point{115, 207}));
}

TEST_F(ThreeDPaneTest, TurnedByAQuarterXGoesAwayAndZGoesToTheLeft) {
    // Across -z / (x + 3), down -y / (x + 3).
    Cube *const cube = Made({0, 0, 200, 200}, 90.0, {0.0, 0.0, -3.0});
    // 100 - 200 * 0.5 / 3.2 = 68.75, 100 - 200 * 0.3 / 3.2 = 81.25
    EXPECT_EQ(cube->Project({0.2, 0.3, 0.5}), (Point{81, 68}));
    // 100 + 200 * 0.7 / 2.5 = 156, a little less; 100 + 200 * 0.41 / 2.5 = 132.8
    EXPECT_EQ(cube->Project({-0.5, -0.41, -0.705}), (Point{132, 156}));
}

TEST_F(ThreeDPaneTest, MarginsAreKeptFree) {
    Cube *const cube = Made({0, 0, 220, 230}, 0.0, {0.0, 0.0, -3.0}, 0.0, {20, 30, 0, 0});
    // As from the front in 200 pixels, 30 further right and 20 further down.
    EXPECT_EQ(cube->Project({0.5, -0.25, 0.0}), (Point{136, 163}));
}

TEST_F(ThreeDPaneTest, MarginsAtTheRightAndBelowMakeItSmaller) {
    Cube *const right = Made({0, 0, 400, 230}, 0.0, {0.0, 0.0, -3.0}, 0.0, {0, 0, 0, 30});
    EXPECT_EQ(right->Project({0.5, -0.25, 0.0}), (Point{116, 133})) << "as in 200 pixels";
    Cube *const below = Made({0, 0, 240, 400}, 0.0, {0.0, 0.0, -3.0}, 0.0, {0, 0, 40, 0});
    EXPECT_EQ(below->Project({0.5, -0.25, 0.0}), (Point{116, 133})) << "what is left over is at the right";
}

TEST_F(ThreeDPaneTest, TheBallHasRoomAtTheCorners) {
    Cube *const cube = FromTheFront(0.5);
    // The cube is seen as if it went from -1.5 to 1.5: 200 pixels for 1.5 / 1.5 to either side, from z -1.5.
    // 100 + 100 * 0.5 / 3 = 116.7
    EXPECT_EQ(cube->Project({0.5, 0.5, 0.0}), (Point{83, 116}));
    cube->SetValue({-1.0, 1.0, -1.0});
    EXPECT_GE(BallOf(*cube).left, 0);
    EXPECT_GE(BallOf(*cube).top, 0);
}

TEST_F(ThreeDPaneTest, TheBoxIsTheOneThatTheGlogHasForTheNumber) {
    Cube *const cube = Made({10, 20, 210, 220}, 0.0, {0.0, 0.0, -3.0});
    EXPECT_EQ(cube->GetID(), kNumber);
    EXPECT_EQ(cube->Project({0.5, -0.25, 0.0}), (Point{126, 153}));
}

TEST_F(ThreeDPaneTest, LinesRunFromOneEndOfTheCubeToTheOther) {
    Cube *const cube = FromTheFront();
    cube->SetValue({0.3, -0.25, 0.0});
    Point a, b;
    cube->ProjectLine(kAxisX, &a, &b);
    EXPECT_EQ(a, cube->Project({-1.0, -0.25, 0.0}));
    EXPECT_EQ(b, cube->Project({1.0, -0.25, 0.0}));
    cube->ProjectLine(kAxisZ, &a, &b);
    EXPECT_EQ(a, cube->Project({0.3, -0.25, -1.0}));
    EXPECT_EQ(b, cube->Project({0.3, -0.25, 1.0}));
    EXPECT_EQ(cube->AxisZeroPoint(kAxisX), cube->Project({0.0, -0.25, 0.0}));
    EXPECT_EQ(cube->AxisZeroPoint(kAxisY), cube->Project({0.3, 0.0, 0.0}));
}

TEST_F(ThreeDPaneTest, PathsGoThroughThePixelsOfTheirPoints) {
    Cube *const cube = FromTheFront();
    Show();
    EXPECT_EQ(Traced(*cube,
                     [&] {
                         OSPath path;
                         cube->MoveTo3D(path, {0.5, -0.25, 0.0});
                         cube->LineTo3D(path, {0.53, -0.25, 1.0});
                         OSPort::Current().StrokePath(path);
                     }),
              Traced(*cube, [] {
                  OSPath path;
                  path.CreateSubpath(133, 116);
                  path.AddLine(126, 112);
                  OSPort::Current().StrokePath(path);
              }));
}

TEST_F(ThreeDPaneTest, AWallIsAFrameOfThreeCopiesSideBySide) {
    Cube *const cube = FromTheFront();
    Show();
    struct Case {
        Axis3D axis;
        Point3D corners[5];
    };
    for (Case const &c :
         {Case{kAxisX, {{0.5, -1, -1}, {0.5, 1, -1}, {0.5, 1, 1}, {0.5, -1, 1}, {0.5, -1, -1}}},
          Case{kAxisY, {{-1, 0.5, -1}, {-1, 0.5, 1}, {1, 0.5, 1}, {1, 0.5, -1}, {-1, 0.5, -1}}},
          Case{kAxisZ, {{-1, -1, 0.5}, {1, -1, 0.5}, {1, 1, 0.5}, {-1, 1, 0.5}, {-1, -1, 0.5}}}}) {
        EXPECT_EQ(Traced(*cube,
                         [&] {
                             OSPath wall;
                             cube->AddWallToPath(c.axis, 0.5, wall);
                             OSPort::Current().StrokePath(wall);
                         }),
                  Traced(*cube,
                         [&] {
                             OSPath outline, wall;
                             cube->MoveTo3D(outline, c.corners[0]);
                             for (int i = 1; i < 5; ++i)
                                 cube->LineTo3D(outline, c.corners[i]);
                             wall.AddPath(outline, 0.0, 0.0);
                             wall.AddPath(outline, 1.0, 0.0);
                             wall.AddPath(outline, -1.0, 1.0);
                             OSPort::Current().StrokePath(wall);
                         }))
            << "axis " << c.axis;
    }
}

// Distances and directions

TEST_F(ThreeDPaneTest, DistancesFromALineAreThoseToItsNearestPoint) {
    Cube *const cube = FromTheFront();
    Point a, b;
    cube->ProjectLine(kAxisX, &a, &b); // level, from 33 to 166 at 100
    EXPECT_DOUBLE_EQ(cube->DistanceFromAxis({110, 100}, kAxisX), 10.0);
    EXPECT_DOUBLE_EQ(
        cube->DistanceFromAxis({static_cast<short>(a.v + 4), static_cast<short>(a.h - 3)}, kAxisX), 5.0);
    EXPECT_DOUBLE_EQ(
        cube->DistanceFromAxis({static_cast<short>(b.v - 12), static_cast<short>(b.h + 5)}, kAxisX), 13.0);
    EXPECT_DOUBLE_EQ(cube->DistanceFromAxis({50, 107}, kAxisY), 7.0);
}

TEST_F(ThreeDPaneTest, DistancesFromLinesAtFortyFiveDegreesAreLongerThanTheyAre) {
    Cube *const cube = FromTheFront();
    cube->SetValue({1.0, -1.0, 0.0}); // the z line falls to the right
    Point a, b;
    cube->ProjectLine(kAxisZ, &a, &b);
    ASSERT_EQ(a.h - b.h, a.v - b.v);
    EXPECT_DOUBLE_EQ(cube->DistanceFromAxis({static_cast<short>(a.v + 10), a.h}, kAxisZ), 10.0);
    cube->SetValue({1.0, 1.0, 0.0}); // and now it rises
    cube->ProjectLine(kAxisZ, &a, &b);
    ASSERT_EQ(a.h - b.h, b.v - a.v);
    EXPECT_DOUBLE_EQ(cube->DistanceFromAxis({static_cast<short>(a.v + 10), a.h}, kAxisZ), 10.0);
}

TEST_F(ThreeDPaneTest, ALineSeenEndOnIsAPoint) {
    Cube *const cube = FromTheFront();
    EXPECT_DOUBLE_EQ(cube->DistanceFromAxis({103, 110}, kAxisZ), 7.0) << "by the short cut";
}

TEST_F(ThreeDPaneTest, TheBallReachesItsRadiusToEachSide) {
    Cube *const cube = FromTheFront(0.2);
    // A pixel is 2.2 / 200 wide at z -1.2, so that 1 at z 0 is 200 * 1.8 / 2.4 / 3 = 50 pixels.
    Rect const ball = BallOf(*cube);
    EXPECT_EQ(ball, (Rect{90, 90, 110, 110}));
    cube->SetValue({0.5, 0.5, 0.9});
    EXPECT_LT(BallOf(*cube).right - BallOf(*cube).left, 20) << "further away it is smaller";
}

TEST_F(ThreeDPaneTest, TheDirectionOfZIsThatOfItsLine) {
    Cube *const cube = FromTheFront();
    cube->SetValue({0.9, 0.0, 0.5}); // its line is level, to the left
    EXPECT_EQ(cube->ZAxisAngle(), 90);
    cube->SetValue({0.0, 0.9, 0.5}); // upright
    EXPECT_EQ(cube->ZAxisAngle(), 0);
    Cube *const usual = AsInDialogs();
    EXPECT_GT(usual->ZAxisAngle(), 0);
    EXPECT_LE(usual->ZAxisAngle(), 90) << "rises to the right";
}

// From pixels to coordinates

TEST_F(ThreeDPaneTest, EveryPixelOfALineLeadsToACoordinateThatIsDrawnThere) {
    for (Cube *cube : {FromTheFront(), AsInDialogs(), Made({0, 0, 238, 224}, 35.0, {-1.0, 1.5, -4.5}, 0.1)}) {
        cube->SetValue({0.31, -0.47, 0.13});
        for (Axis3D axis : kAxes) {
            Point a, b;
            cube->ProjectLine(axis, &a, &b);
            bool const useH = std::abs(b.h - a.h) >= std::abs(b.v - a.v);
            int const from = useH ? a.h : a.v, to = useH ? b.h : b.v;
            for (int c = std::min(from, to) + 1; c < std::max(from, to); ++c) {
                Point const pixel = {static_cast<short>(c), static_cast<short>(c)};
                Point3D found = cube->GetValue();
                found[axis] = cube->SearchForPoint(pixel, useH, axis);
                Point const drawn = cube->Project(found);
                ASSERT_EQ(useH ? drawn.h : drawn.v, c) << "axis " << axis;
            }
        }
    }
}

TEST_F(ThreeDPaneTest, ThePixelThatHoldsZeroLeadsToExactlyZero) {
    for (Cube *cube : {FromTheFront(), AsInDialogs()}) {
        cube->SetValue({0.31, -0.47, 0.13});
        for (Axis3D axis : kAxes) {
            Point const zero = cube->AxisZeroPoint(axis);
            Point a, b;
            cube->ProjectLine(axis, &a, &b);
            bool const useH = std::abs(b.h - a.h) >= std::abs(b.v - a.v);
            EXPECT_EQ(cube->SearchForPoint(zero, useH, axis), 0.0) << "axis " << axis;
        }
    }
}

TEST_F(ThreeDPaneTest, PixelsBeyondTheEndsLeadToTheEnds) {
    Cube *const cube = FromTheFront();
    Point a, b;
    cube->ProjectLine(kAxisX, &a, &b);
    EXPECT_EQ(cube->SearchForPoint(a, true, kAxisX), -1.0);
    EXPECT_EQ(cube->SearchForPoint({0, -500}, true, kAxisX), -1.0);
    EXPECT_EQ(cube->SearchForPoint(b, true, kAxisX), 1.0);
    EXPECT_EQ(cube->SearchForPoint({0, 32767}, true, kAxisX), 1.0);
    cube->ProjectLine(kAxisY, &a, &b); // goes up
    EXPECT_EQ(cube->SearchForPoint(a, false, kAxisY), -1.0);
    EXPECT_EQ(cube->SearchForPoint({500, 0}, false, kAxisY), -1.0);
    EXPECT_EQ(cube->SearchForPoint(b, false, kAxisY), 1.0);
    EXPECT_EQ(cube->SearchForPoint({-500, 0}, false, kAxisY), 1.0);
}

// Value and hook

TEST_F(ThreeDPaneTest, BeginsInTheMiddle) { EXPECT_EQ(FromTheFront()->GetValue(), (Point3D{0.0, 0.0, 0.0})); }

TEST_F(ThreeDPaneTest, AnotherValueIsToldAndRepainted) {
    Cube *const cube = FromTheFront();
    Show();
    Hooked const hooked(cube);
    EXPECT_EQ(hooked.count, 0) << "not when it is installed";
    cube->SetValue({0.25, 0.5, -0.75});
    EXPECT_EQ(hooked.count, 1);
    EXPECT_EQ(Repainted(), (std::vector<Rect>{{0, 0, 200, 200}}));
    EXPECT_EQ(cube->GetOneCoordinate(kAxisX), 0.25);
    EXPECT_EQ(cube->GetOneCoordinate(kAxisY), 0.5);
    EXPECT_EQ(cube->GetOneCoordinate(kAxisZ), -0.75);
    cube->SetOneCoordinate(kAxisY, -0.5);
    EXPECT_EQ(hooked.count, 2);
    EXPECT_FALSE(Repainted().empty());
    EXPECT_EQ(cube->GetValue(), (Point3D{0.25, -0.5, -0.75}));
}

TEST_F(ThreeDPaneTest, TheSameValueIsNotTold) {
    Cube *const cube = FromTheFront();
    cube->SetValue({0.25, 0.5, -0.75});
    Show();
    Hooked const hooked(cube);
    cube->SetValue({0.25, 0.5, -0.75});
    cube->SetOneCoordinate(kAxisZ, -0.75);
    EXPECT_EQ(hooked.count, 0);
    EXPECT_TRUE(Repainted().empty());
}

TEST_F(ThreeDPaneTest, WhatIsNoNumberCountsAsAnotherValue) {
    Cube *const cube = FromTheFront();
    Hooked const hooked(cube);
    cube->SetValue({kNoNumber, 0.0, 0.0});
    cube->SetValue({kNoNumber, 0.0, 0.0});
    EXPECT_EQ(hooked.count, 2);
    cube->SetOneCoordinate(kAxisY, 0.0);
    EXPECT_EQ(hooked.count, 2) << "y is what it was";
}

TEST_F(ThreeDPaneTest, TheHookMayDeleteThePane) {
    Cube *const cube = FromTheFront();
    Show();
    cube->InstallHook([](void *pane) { delete static_cast<Cube *>(pane); }, cube);
    cube->SetValue({0.5, 0.0, 0.0});
    EXPECT_EQ(GetGlogItem(glog, kNumber), nullptr);
}

TEST_F(ThreeDPaneTest, ValuesOutsideOfTheCubeAreTakenAsTheyAre) {
    Cube *const cube = FromTheFront();
    cube->SetValue({7.0, -8.0, 9.0});
    EXPECT_EQ(cube->GetValue(), (Point3D{7.0, -8.0, 9.0}));
}

// Bad numbers

TEST_F(ThreeDPaneTest, WhatCannotBeProjectedHarmsNothing) {
    Rect const huge = {-32768, -32768, 32767, 32767};
    for (Cube *cube :
         {FromTheFront(), Made({0, 0, 0, 0}, 0.0, {0.0, 0.0, -3.0}), Made(huge, 30.0, {0.0, 0.0, -3.0}),
          Made({0, 0, 200, 200}, 0.0, {0.0, 0.0, 0.0}), // the eye is in the middle of the cube
          Made({0, 0, 200, 200}, kNoNumber, {0.0, 0.0, -3.0}),
          Made({0, 0, 200, 200}, 0.0, {kInfinity, 0.0, -3.0}),
          Made({0, 0, 200, 200}, 0.0, {0.0, 0.0, -3.0}, 5.0), // larger than the cube
          Made({0, 0, 200, 200}, 0.0, {0.0, 0.0, -3.0}, kNoNumber),
          Made({0, 0, 200, 200}, 0.0, {0.0, 0.0, -3.0}, 0.0, {300, 300, 300, 300})}) {
        for (double number : {0.3, -1.0, 1e300, kInfinity, -kInfinity, kNoNumber}) {
            cube->SetValue({number, 0.5, -number});
            cube->SetOneCoordinate(kAxisY, number);
            DrawingOf(*cube);
            for (Axis3D axis : kAxes) {
                for (bool useH : {false, true})
                    for (short c = -300; c < 300; c = static_cast<short>(c + 7)) {
                        double const found = cube->SearchForPoint({c, c}, useH, axis);
                        ASSERT_TRUE(found >= -1.0 && found <= 1.0) << found;
                    }
            }
        }
        delete cube;
    }
}

TEST_F(ThreeDPaneTest, WithoutAGlogThereIsNoPane) {
    EXPECT_EQ(ThreeDPane::NewThreeDPane(nullptr, 1, 0.0, {0.0, 0.0, -3.0}, 0.1, kNoMargins), nullptr);
}

TEST_F(ThreeDPaneTest, IsMadeInTheMiddle) {
    Glog::From(glog).DescribeItem(3, {0, 0, 200, 200});
    ThreeDPane *const pane = ThreeDPane::NewThreeDPane(glog, 3, 0.0, {0.0, 0.0, -3.0}, 0.0, kNoMargins);
    ASSERT_NE(pane, nullptr);
    EXPECT_EQ(pane->GetID(), 3);
    EXPECT_EQ(pane->GetValue(), (Point3D{0.0, 0.0, 0.0}));
    EXPECT_EQ(pane->Project({0.5, -0.25, 0.0}), (Point{116, 133}));
}
