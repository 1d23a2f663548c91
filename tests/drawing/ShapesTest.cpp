#include "Canvas.h"
#include "host/OSPath.h"
#include <algorithm>
#include <limits>

namespace {

void Paint(Rect const &r) { VelaDrawing::PaintRect(&r); }
void Frame(Rect const &r) { VelaDrawing::FrameRect(&r); }

void Line(short fromH, short fromV, short toH, short toV) {
    VelaDrawing::MoveTo(fromH, fromV);
    VelaDrawing::LineTo(toH, toV);
}

} // namespace

TEST(Shapes, PaintFillsUpToTheRightAndBottomEdges) {
    Canvas canvas(5, 4);
    Paint({1, 1, 3, 4});
    EXPECT_EQ(canvas.Picture(), (Rows{".....", ".###.", ".###.", "....."}));
}

TEST(Shapes, FrameIsOnePixelInsideTheEdges) {
    Canvas canvas(6, 5);
    Frame({0, 1, 5, 6});
    EXPECT_EQ(canvas.Picture(), (Rows{".#####", ".#...#", ".#...#", ".#...#", ".#####"}));
}

TEST(Shapes, ThinFramesAreFilled) {
    Canvas canvas(6, 4);
    Frame({0, 0, 2, 5});
    Frame({3, 0, 4, 3});
    EXPECT_EQ(canvas.Picture(), (Rows{"#####.", "#####.", "......", "###..."}));
}

TEST(Shapes, EmptyAndInvertedRectanglesDrawNothing) {
    Canvas canvas(6, 6);
    Paint({3, 3, 3, 5});
    Paint({5, 5, 1, 1});
    Frame({5, 5, 1, 1});
    Frame({2, 2, 2, 4});
    EXPECT_EQ(canvas.Count(Canvas::kWhite), 36);
}

TEST(Shapes, EraseUsesTheBackgroundColour) {
    Canvas canvas(3, 1);
    VelaDrawing::RGBBackColor({0xFFFF, 0, 0});
    Rect const r = {0, 1, 1, 2};
    VelaDrawing::EraseRect(&r);
    EXPECT_EQ(canvas.Picture(Canvas::kRed), (Rows{".#."}));
}

TEST(Shapes, AdjoiningRectanglesAdjoinAtEveryScale) {
    for (double factor : {0.5, 1.0, 1.25, 1.5, 1.75, 2.0, 3.0}) {
        Canvas canvas(40, 40, factor);
        for (short v = 0; v < 40; v = static_cast<short>(v + 3))
            for (short h = 0; h < 40; h = static_cast<short>(h + 3))
                Paint({v, h, static_cast<short>(v + 3), static_cast<short>(h + 3)});
        EXPECT_EQ(canvas.Count(Canvas::kWhite), 0) << factor;
    }
}

TEST(Shapes, EdgesAreRoundedAtFractionalScales) {
    Canvas canvas(6, 2, 1.5);
    Paint({0, 1, 1, 3});
    EXPECT_EQ(canvas.Picture(), (Rows{"..###....", "..###....", "........."}));
}

TEST(Shapes, TheOriginMovesLocalCoordinates) {
    Canvas canvas(5, 3, 2);
    canvas.port.SetOrigin(2, 1);
    Paint({0, 0, 1, 1});
    EXPECT_EQ(canvas.Picture(),
              (Rows{"..........", "..........", "....##....", "....##....", "..........", ".........."}));
}

TEST(Shapes, TransparentColoursMixWithWhatIsBeneath) {
    Canvas canvas(2, 1);
    SetForegroundColor(OS::RGBAColor(0, 0, 0, 0.5));
    Paint({0, 0, 1, 1});
    EXPECT_NEAR(canvas.At(0, 0) & 0xFF, 0x80, 1);
    EXPECT_EQ(canvas.At(0, 0) >> 24, 0xFFu);
    EXPECT_EQ(canvas.At(1, 0), Canvas::kWhite);
}

TEST(Shapes, HugeRectanglesAreCutWithoutOverflow) {
    Canvas canvas(4, 3, 4);
    canvas.port.SetOrigin(32767, 32767);
    Paint({-32768, -32768, 32767, 32767});
    EXPECT_EQ(canvas.Count(Canvas::kBlack), 4 * 3 * 16);
}

TEST(Lines, BothEndsBelongToALine) {
    Canvas canvas(6, 4);
    Line(1, 1, 4, 1);
    Line(0, 0, 0, 3);
    EXPECT_EQ(canvas.Picture(), (Rows{"#.....", "#####.", "#.....", "#....."}));
    Point pen;
    VelaDrawing::GetPen(&pen);
    EXPECT_EQ(pen.v, 3);
    EXPECT_EQ(pen.h, 0);
}

TEST(Lines, ALineOfNoLengthIsOnePixel) {
    Canvas canvas(3, 3, 2);
    Line(1, 1, 1, 1);
    EXPECT_EQ(canvas.Count(Canvas::kBlack), 4);
    EXPECT_EQ(canvas.At(2, 2), Canvas::kBlack);
}

TEST(Lines, AWidePenHangsBelowAndToTheRight) {
    Canvas canvas(6, 5);
    PenState pen;
    VelaDrawing::GetPenState(&pen);
    pen.size = {2, 3};
    VelaDrawing::SetPenState(&pen);
    Line(1, 1, 2, 1);
    EXPECT_EQ(canvas.Picture(), (Rows{"......", ".####.", ".####.", "......", "......"}));
    VelaDrawing::PenNormal();
    Line(0, 4, 5, 4);
    EXPECT_EQ(canvas.Picture()[4], "######");
}

TEST(Lines, AFrameIsAsThickAsThePen) {
    Canvas canvas(6, 5);
    PenState pen;
    VelaDrawing::GetPenState(&pen);
    pen.size = {1, 2};
    VelaDrawing::SetPenState(&pen);
    Frame({0, 0, 5, 6});
    EXPECT_EQ(canvas.Picture(), (Rows{"######", "##..##", "##..##", "##..##", "######"}));
}

TEST(Lines, APenWithoutSizeDrawsNothingButMoves) {
    Canvas canvas(4, 4);
    PenState pen;
    VelaDrawing::GetPenState(&pen);
    pen.size = {0, 1};
    VelaDrawing::SetPenState(&pen);
    Line(0, 0, 3, 3);
    Frame({0, 0, 4, 4});
    EXPECT_EQ(canvas.Count(Canvas::kBlack), 0);
    VelaDrawing::GetPen(&pen.location);
    EXPECT_EQ(pen.location.h, 3);
}

TEST(Lines, DiagonalsHaveOnePixelPerStep) {
    Canvas canvas(5, 5);
    Line(0, 0, 4, 4);
    EXPECT_EQ(canvas.Picture(), (Rows{"#....", ".#...", "..#..", "...#.", "....#"}));
    canvas.Wipe(Canvas::kWhite);
    Line(0, 0, 4, 2);
    Rows const shallow = canvas.Picture();
    EXPECT_EQ(canvas.Count(Canvas::kBlack), 5);
    EXPECT_EQ(shallow[0][0], '#');
    EXPECT_EQ(shallow[2][4], '#');
}

TEST(Lines, APixelOfADiagonalIsTheOneNearestToTheIdealLine) {
    Canvas canvas(7, 3);
    Line(0, 0, 6, 2);
    EXPECT_EQ(canvas.Picture(), (Rows{"##.....", "..###..", ".....##"}));
}

TEST(Lines, TheDirectionDoesNotMatter) {
    for (int i = 0; i < 200; ++i) {
        short const h = static_cast<short>(i * 7 % 23), v = static_cast<short>(i * 5 % 19);
        short const toH = static_cast<short>(i * 3 % 23), toV = static_cast<short>(i * 11 % 19);
        Canvas forth(24, 20);
        Line(h, v, toH, toV);
        std::vector<std::uint32_t> const pixels = forth.Pixels();
        EXPECT_EQ(forth.Count(Canvas::kBlack), std::max(std::abs(toH - h), std::abs(toV - v)) + 1);
        EXPECT_EQ(forth.At(h, v), Canvas::kBlack);
        EXPECT_EQ(forth.At(toH, toV), Canvas::kBlack);
        Canvas back(24, 20);
        Line(toH, toV, h, v);
        ASSERT_EQ(back.Pixels(), pixels) << h << ' ' << v << ' ' << toH << ' ' << toV;
    }
}

TEST(Lines, EveryStepOfADiagonalIsASquareOfDevicePixels) {
    Canvas canvas(3, 3, 2);
    Line(0, 0, 2, 2);
    EXPECT_EQ(canvas.Picture(), (Rows{"##....", "##....", "..##..", "..##..", "....##", "....##"}));
}

TEST(Lines, NoPixelOfATransparentLineIsDrawnTwice) {
    for (short penSize : {1, 3}) {
        Canvas canvas(20, 20);
        SetForegroundColor(OS::RGBAColor(0, 0, 0, 0.5));
        PenState pen;
        VelaDrawing::GetPenState(&pen);
        pen.size = {penSize, penSize};
        VelaDrawing::SetPenState(&pen);
        Line(2, 1, 14, 11);
        std::vector<std::uint32_t> pixels = canvas.Pixels();
        std::sort(pixels.begin(), pixels.end());
        pixels.erase(std::unique(pixels.begin(), pixels.end()), pixels.end());
        EXPECT_EQ(pixels.size(), 2u);
    }
}

TEST(Lines, EndsFarOutsideAreHarmless) {
    Canvas canvas(10, 10, 4);
    Line(-32768, -32768, 32767, 32767);
    for (int i = 0; i < 40; ++i)
        EXPECT_EQ(canvas.At(i, i), Canvas::kBlack);
    EXPECT_EQ(canvas.Count(Canvas::kBlack), 10 * 16);
}

TEST(Lines, MoveIsRelative) {
    Canvas canvas(10, 10);
    VelaDrawing::MoveTo(2, 3);
    VelaDrawing::Move(4, -1);
    Point pen;
    VelaDrawing::GetPen(&pen);
    EXPECT_EQ(pen.h, 6);
    EXPECT_EQ(pen.v, 2);
}

TEST(PortShapes, AFrameInDoublesIsRoundedToWholePixels) {
    Canvas canvas(6, 5);
    OSPort::Current().FrameRect({0.6, 0.4, 4.8, 4.0});
    EXPECT_EQ(canvas.Picture(), (Rows{".####.", ".#..#.", ".#..#.", ".####.", "......"}));
}

TEST(PortShapes, TheFrameIsAsWideAsTheLine) {
    Canvas canvas(6, 6, 2);
    OSPort::Current().SetLineWidth(2);
    OSPort::Current().FrameRect({0, 0, 6, 6});
    EXPECT_EQ(canvas.Count(Canvas::kWhite), 16);
    OSPort::Current().PenNormal();
    EXPECT_EQ(canvas.port.State().lineWidth, 1.0);
}

TEST(PortShapes, NotEvenNonsenseBreaksWhatFollows) {
    Canvas canvas(20, 20);
    double const nan = std::numeric_limits<double>::quiet_NaN(),
                 infinity = std::numeric_limits<double>::infinity();
    OSPort &port = OSPort::Current();
    port.SetLineWidth(nan);
    OSPath path;
    path.AddLine(nan, infinity);
    path.AddLine(-infinity, 1e300);
    path.CloseSubpath();
    port.StrokePath(path);
    port.NarrowClip(
        {-infinity, -infinity, infinity, infinity}); // infinities cancel out to what is not a number
    port.SetLineWidth(infinity);
    port.StrokePath(path);
    port.PaintOval({nan, 0, infinity, -infinity});
    port.FrameRoundRect({-1e9, -1e9, 2e9, 2e9}, {nan, infinity});
    port.PaintRoundRect({5, 5, -1e300, 3}, {-4, 0});
    port.ScrollRect({0, 0, 20, 20}, {nan, infinity});
    port.SetForeColor(OS::RGBAColor(nan, 9, -9, infinity));
    canvas.port.SetExtent(20, 20);
    canvas.Wipe(Canvas::kWhite);
    port.SetForeColor(OS::RGBAColor(1, 0, 0, 1));
    port.PaintOval({0, 0, 20, 20});
    EXPECT_EQ(canvas.At(10, 10), Canvas::kRed);
}

TEST(PortShapes, RoundRectanglesHaveSharpSidesAndOpenCorners) {
    for (double factor : {1.0, 1.5, 2.0}) {
        Canvas canvas(30, 20, factor);
        OSPort::Current().PaintRoundRect({2, 2, 26, 16}, {8, 8});
        DeviceRect const box = canvas.scale.ToDevice(2, 2, 28, 18);
        int const middleX = (box.left + box.right) / 2, middleY = (box.top + box.bottom) / 2;
        EXPECT_EQ(canvas.At(box.left, middleY), Canvas::kBlack) << factor;
        EXPECT_EQ(canvas.At(box.left - 1, middleY), Canvas::kWhite) << factor;
        EXPECT_EQ(canvas.At(box.right - 1, middleY), Canvas::kBlack) << factor;
        EXPECT_EQ(canvas.At(middleX, box.top), Canvas::kBlack) << factor;
        EXPECT_EQ(canvas.At(middleX, box.bottom), Canvas::kWhite) << factor;
        EXPECT_NE(canvas.At(box.left, box.top), Canvas::kBlack) << factor;
    }
}

TEST(PortShapes, ARoundFrameIsOnePixelWideWithSharpSides) {
    for (double factor : {1.0, 1.25, 1.5, 2.0}) {
        Canvas canvas(30, 20, factor);
        OSPort::Current().FrameRoundRect({2, 2, 26, 16}, {8, 8});
        DeviceRect const box = canvas.scale.ToDevice(2, 2, 28, 18);
        int const line = static_cast<int>(factor + 0.5), middleY = (box.top + box.bottom) / 2;
        for (int i = 0; i < line; ++i)
            EXPECT_EQ(canvas.At(box.left + i, middleY), Canvas::kBlack) << factor;
        EXPECT_EQ(canvas.At(box.left + line, middleY), Canvas::kWhite) << factor;
        EXPECT_EQ(canvas.At((box.left + box.right) / 2, middleY), Canvas::kWhite) << factor;
    }
}

TEST(PortShapes, APathIsStrokedWithTheLineOnBothSides) {
    Canvas canvas(10, 10, 2);
    OSPath path;
    path.CreateSubpath(1, 5);
    path.AddLine(9, 5);
    OSPort::Current().SetLineWidth(2);
    OSPort::Current().StrokePath(path);
    EXPECT_EQ(canvas.At(10, 8), Canvas::kBlack);
    EXPECT_EQ(canvas.At(10, 11), Canvas::kBlack);
    EXPECT_EQ(canvas.At(10, 7), Canvas::kWhite);
    EXPECT_EQ(canvas.At(10, 12), Canvas::kWhite);
}

TEST(PortShapes, AddedPathsAreMovedAndAPathMayBeAddedToItself) {
    Canvas canvas(12, 12);
    OSPath path;
    path.CreateSubpath(0, 1.5);
    path.AddLine(12, 1.5);
    path.AddPath(path, 0, 4);
    OSPort::Current().StrokePath(path);
    EXPECT_EQ(canvas.At(6, 1), Canvas::kBlack);
    EXPECT_EQ(canvas.At(6, 5), Canvas::kBlack);
    EXPECT_EQ(canvas.Count(Canvas::kBlack), 24);
}

TEST(PortShapes, WithoutAPortOrSurfaceNothingHappens) {
    DrawingPort::MakeCurrent(nullptr);
    Rect const r = {0, 0, 5, 5};
    VelaDrawing::PaintRect(&r);
    VelaDrawing::FrameRect(&r);
    VelaDrawing::MoveTo(1, 1);
    VelaDrawing::LineTo(3, 3);
    VelaDrawing::InvalRect(&r);
    ClearColors();
    EXPECT_EQ(OSPort::GetCurrent(), nullptr);

    DrawingPort port;
    port.SetExtent(10, 10);
    DrawingPort::MakeCurrent(&port);
    VelaDrawing::PaintRect(&r);
    port.PaintOval({0, 0, 5, 5});
    port.ScrollRect({0, 0, 5, 5}, {1, 0});
    EXPECT_EQ(Region::Area(port.GetDamage()), 25); // nothing to move: all of it has to be drawn
    DrawingPort::MakeCurrent(nullptr);
}
