#include "host/Icons.h"
#include "host/OSPort.h"
#include "host/OSRgn.h"
#include "host/VelaDrawing.h"
#include "tests/graphics/CubeTest.h"

namespace {

class ThreeDPaneDrawingTest : public CubeTest {
protected:
    // The calls of a line of half a pixel in black.
    static void Stroke(Point a, Point b) {
        OSPath path;
        path.CreateSubpath(a.h, a.v);
        path.AddLine(b.h, b.v);
        path.CloseSubpath();
        OSPort::Current().SetForeColor(OS::RGBAColor(0.0, 0.0, 0.0, 1.0));
        OSPort::Current().SetLineWidth(0.5);
        OSPort::Current().StrokePath(path);
    }
    static Rect BallOf(Cube const &cube) {
        Rect ball;
        cube.GetIndicatorBox(&ball);
        return ball;
    }
    // The whole line along z through a clip.
    Lines HalfOfZLine(Cube &cube, Rect const &clip) {
        return Traced(cube, [&] {
            TempRgn kept;
            VelaDrawing::GetClip(kept);
            VelaDrawing::ClipRect(&clip);
            Point a, b;
            cube.ProjectLine(kAxisZ, &a, &b);
            Stroke(a, b);
            VelaDrawing::SetClip(kept);
        });
    }
    static double AlphaOfShadow(Lines const &lines) {
        std::string const mark = "\"alpha\":";
        std::string const line = Only("SetForeColor", lines).front();
        return std::stod(line.substr(line.find(mark) + mark.size()));
    }
};

} // namespace

TEST_F(ThreeDPaneDrawingTest, IsDrawnFromTheBackToTheFront) {
    Cube *const cube = AsInDialogs();
    cube->SetValue({0.3, 0.2, 0.1});
    Show();
    Lines const drawn = DrawingOf(*cube);
    Lines const expected = Traced(*cube, [&] {
        Draw1Icon(1607, 0, 0, 0);
        cube->DrawShadow();
        Point a, b;
        for (Axis3D axis : {kAxisX, kAxisY}) {
            cube->ProjectLine(axis, &a, &b);
            Stroke(a, b);
        }
        cube->DrawBackHalfOfZLine();
        cube->DrawIndicator();
        cube->DrawFrontHalfOfZLine();
    });
    EXPECT_EQ(drawn, expected);
}

TEST_F(ThreeDPaneDrawingTest, TheBallIsTheIconOfItsLargerSide) {
    Cube *const cube = FromTheFront(0.2);
    Show();
    EXPECT_EQ(Traced(*cube, [&] { cube->DrawIndicator(); }),
              Traced(*cube, [] { Draw1Icon(1606, 7, 90, 90); }));
}

TEST_F(ThreeDPaneDrawingTest, InDialogsThereIsABallForEveryPlace) {
    Cube *const cube = AsInDialogs();
    for (double x = -1.0; x <= 1.0; x += 0.0625)
        for (double y = -1.0; y <= 1.0; y += 0.0625)
            for (double z = -1.0; z <= 1.0; z += 0.0625) {
                cube->SetValue({x, y, z});
                Rect const ball = BallOf(*cube);
                int const side = std::max(ball.right - ball.left, ball.bottom - ball.top);
                ASSERT_TRUE(side >= 13 && side <= 40) << side;
            }
}

TEST_F(ThreeDPaneDrawingTest, TheLineBehindTheBallEndsAtItsMiddle) {
    Cube *const cube = AsInDialogs();
    cube->SetValue({0.3, 0.2, 0.1});
    Show();
    Point const b = cube->Project({0.3, 0.2, 1.0}), ball = cube->Project({0.3, 0.2, 0.1});
    ASSERT_TRUE(b.h > ball.h && b.v < ball.v) << "the line rises to the right";
    Rect const clip = {static_cast<short>(b.v - 1), ball.h, static_cast<short>(ball.v + 2),
                       static_cast<short>(b.h + 1)};
    EXPECT_EQ(Traced(*cube, [&] { cube->DrawBackHalfOfZLine(); }), HalfOfZLine(*cube, clip));
}

TEST_F(ThreeDPaneDrawingTest, TheLineBeforeTheBallBeginsAtItsFront) {
    Cube *const cube = AsInDialogs();
    cube->SetValue({0.3, 0.2, 0.1});
    Show();
    Point const a = cube->Project({0.3, 0.2, -1.0}), front = cube->Project({0.3, 0.2, 0.1 - 0.16});
    Rect const clip = {static_cast<short>(front.v - 1), a.h, static_cast<short>(a.v + 2),
                       static_cast<short>(front.h + 1)};
    EXPECT_EQ(Traced(*cube, [&] { cube->DrawFrontHalfOfZLine(); }), HalfOfZLine(*cube, clip));
}

TEST_F(ThreeDPaneDrawingTest, ABallThatTouchesTheFrontHasNoLineBeforeIt) {
    Cube *const cube = FromTheFront(0.25);
    Show();
    cube->SetValue({0.0, 0.0, -0.75});
    EXPECT_TRUE(Traced(*cube, [&] { cube->DrawFrontHalfOfZLine(); }).empty());
    cube->SetValue({0.0, 0.0, -0.74});
    EXPECT_FALSE(Traced(*cube, [&] { cube->DrawFrontHalfOfZLine(); }).empty());
}

TEST_F(ThreeDPaneDrawingTest, TheShadowLiesOnTheFloorWithinTheWalls) {
    Cube *const cube = AsInDialogs();
    cube->SetValue({0.3, 0.0, 0.1});
    Show();
    // Half way up: 1.9 times the ball, 0.4 to the right and 0.3 to the back.
    double const spread = 1.9 * 0.16;
    Rect oval;
    VelaDrawing::Pt2Rect(cube->Project({0.7 + spread, -1.16, 0.4 + spread}),
                         cube->Project({0.7 - spread, -1.16, 0.4 - spread}), &oval);
    Lines const expected = Traced(*cube, [&] {
        OSPath walls;
        cube->AddWallToPath(kAxisX, -1.0, walls);
        cube->AddWallToPath(kAxisY, -1.0, walls);
        cube->AddWallToPath(kAxisZ, 1.0, walls);
        OSPort::Current().NarrowClipPath(walls);
        OSPort::Current().PaintOval(oval);
    });
    Lines const drawn = Traced(*cube, [&] { cube->DrawShadow(); });
    EXPECT_EQ(Only("NarrowClipPath", drawn), Only("NarrowClipPath", expected));
    EXPECT_EQ(Only("PaintOval", drawn), Only("PaintOval", expected));
}

TEST_F(ThreeDPaneDrawingTest, TheShadowFadesAsTheBallRises) {
    Cube *const cube = FromTheFront(0.2);
    Show();
    struct Case {
        double y, alpha;
    };
    for (Case c : {Case{-1.0, 0.4}, Case{0.0, 0.265}, Case{1.0, 0.13}}) {
        cube->SetValue({0.0, c.y, 0.0});
        EXPECT_NEAR(AlphaOfShadow(Traced(*cube, [&] { cube->DrawShadow(); })), c.alpha, 1e-7) << c.y;
    }
}

TEST_F(ThreeDPaneDrawingTest, PartsPutTheClipBack) {
    Cube *const cube = AsInDialogs();
    cube->SetValue({0.3, 0.2, 0.1});
    Show();
    cube->Prepare();
    OSRgn before, after;
    VelaDrawing::GetClip(&before);
    cube->DrawShadow();
    cube->DrawBackHalfOfZLine();
    cube->DrawFrontHalfOfZLine();
    VelaDrawing::GetClip(&after);
    EXPECT_EQ(CarbonUtils::GetRgnBounds(&after), CarbonUtils::GetRgnBounds(&before));
}

TEST_F(ThreeDPaneDrawingTest, TheGridOfAWallHasNineLinesEachWay) {
    Cube *const cube = AsInDialogs();
    Show();
    for (Axis3D axis : {kAxisX, kAxisY, kAxisZ}) {
        Lines const expected = Traced(*cube, [&] {
            OSPath path;
            VelaDrawing::RGBForeColor({0x4000, 0xCCCC, 0x4000});
            for (int i = -4; i <= 4; ++i)
                for (Axis3D step : {kAxisX, kAxisY, kAxisZ}) {
                    if (step == axis)
                        continue;
                    Point3D from{-1.0, -1.0, -1.0}, to{1.0, 1.0, 1.0};
                    from[axis] = to[axis] = 0.5;
                    from[step] = to[step] = i * 0.25;
                    cube->MoveTo3D(path, from);
                    cube->LineTo3D(path, to);
                }
            VelaDrawing::PenNormal();
            OSPort::Current().StrokePath(path);
        });
        EXPECT_EQ(Traced(*cube,
                         [&] {
                             OSPath path;
                             cube->DrawWall(path, axis, 0.5);
                             OSPort::Current().StrokePath(path);
                         }),
                  expected)
            << "axis " << axis;
    }
}
