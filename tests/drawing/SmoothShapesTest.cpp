// Smooth shapes have the same pixels under every clip.
#include "host/OSPath.h"
#include "tests/drawing/Canvas.h"
#include <algorithm>
#include <gtest/gtest.h>
#include <random>

namespace {

int const kWidth = 90, kHeight = 60;

struct Random {
    std::mt19937 numbers{11};
    double Between(double least, double greatest) {
        return std::uniform_real_distribution<double>(least, greatest)(numbers);
    }
    short Whole(int least, int greatest) {
        return static_cast<short>(least +
                                  static_cast<int>(numbers() % static_cast<unsigned>(greatest - least + 1)));
    }
};

typedef std::function<void()> Draw;

void DrawUnder(Canvas &canvas, OSRgn const &clip, Draw const &draw) {
    canvas.Wipe(Canvas::kWhite);
    canvas.port.SetClip(clip);
    draw();
}

// Whether the shape under the clip is the shape, cut.
bool IsCut(double factor, Rect const &clip, Draw const &draw) {
    Canvas canvas(kWidth, kHeight, factor);
    DrawUnder(canvas, OSRgn(Rect{0, 0, kHeight, kWidth}), draw);
    std::vector<std::uint32_t> const whole = canvas.Pixels();
    DrawUnder(canvas, OSRgn(clip), draw);
    DeviceRect const part = canvas.scale.ToDevice(clip.left, clip.top, clip.right, clip.bottom);
    for (int y = 0; y < canvas.surface.Height(); ++y) {
        for (int x = 0; x < canvas.surface.Width(); ++x) {
            bool const inside = x >= part.left && x < part.right && y >= part.top && y < part.bottom;
            std::size_t const at = static_cast<std::size_t>(y * canvas.surface.Width() + x);
            if (canvas.At(x, y) != (inside ? whole[at] : Canvas::kWhite))
                return false;
        }
    }
    return true;
}

Rect RandomRect(Random &random) {
    short const top = random.Whole(0, kHeight - 1), left = random.Whole(0, kWidth - 1);
    return {top, left, random.Whole(top + 1, kHeight), random.Whole(left + 1, kWidth)};
}

void ExpectCutUnderAnyClip(std::function<Draw(Random &)> const &makeShape) {
    Random random;
    for (double factor : {1.0, 1.25, 1.5, 2.0}) {
        for (int i = 0; i < 100; ++i) {
            Draw const draw = makeShape(random);
            Rect const clip = RandomRect(random);
            ASSERT_TRUE(IsCut(factor, clip, draw)) << "shape " << i << " at " << factor;
        }
    }
}

TEST(SmoothShapes, ARoundRectangleIsCutByTheClip) {
    ExpectCutUnderAnyClip([](Random &random) -> Draw {
        Rect const r = RandomRect(random);
        OS::Size const corner(random.Between(0, 40), random.Between(0, 40));
        return [=] { OSPort::Current().PaintRoundRect(r, corner); };
    });
}

TEST(SmoothShapes, ARoundFrameIsCutByTheClip) {
    ExpectCutUnderAnyClip([](Random &random) -> Draw {
        Rect const r = RandomRect(random);
        OS::Size const corner(random.Between(0, 40), random.Between(0, 40));
        double const line = random.Between(0.5, 6);
        return [=] {
            OSPort::Current().SetLineWidth(line);
            OSPort::Current().FrameRoundRect(r, corner);
        };
    });
}

TEST(SmoothShapes, AnOvalIsCutByTheClip) {
    ExpectCutUnderAnyClip([](Random &random) -> Draw {
        OS::RectBase<OS::RectTag> const r(random.Between(-20, 60), random.Between(-20, 40),
                                          random.Between(1, 80), random.Between(1, 60));
        return [=] { OSPort::Current().PaintOval(r); };
    });
}

TEST(SmoothShapes, APathIsCutByTheClip) {
    ExpectCutUnderAnyClip([](Random &random) -> Draw {
        double points[6];
        for (double &p : points)
            p = random.Between(-10, 90);
        double const line = random.Between(0.5, 5);
        return [=] {
            OSPath path;
            path.CreateSubpath(points[0], points[1]);
            path.AddLine(points[2], points[3]);
            path.AddLine(points[4], points[5]);
            OSPort::Current().SetLineWidth(line);
            OSPort::Current().StrokePath(path);
        };
    });
}

TEST(SmoothShapes, AFrameThatLeavesNothingInsideStaysInItsRectangle) {
    Canvas canvas(kWidth, kHeight);
    OSPort::Current().SetLineWidth(9);
    OSPort::Current().FrameRoundRect({20, 20, 10, 6}, {4, 4});
    EXPECT_EQ(canvas.At(25, 23), Canvas::kBlack);
    EXPECT_EQ(canvas.At(25, 19), Canvas::kWhite);
    EXPECT_EQ(canvas.At(25, 26), Canvas::kWhite);
    EXPECT_EQ(canvas.At(19, 23), Canvas::kWhite);
    EXPECT_EQ(canvas.At(30, 23), Canvas::kWhite);
}

// The corners are drawn once for all rectangles that share them.
TEST(SmoothShapes, CornersDoNotDependOnTheSizeOfTheRectangle) {
    Canvas canvas(kWidth, kHeight);
    OSPort::Current().PaintRoundRect({0, 0, 40, 40}, {16, 16});
    std::vector<std::uint32_t> const small = canvas.Pixels();
    canvas.Wipe(Canvas::kWhite);
    OSPort::Current().PaintRoundRect({0, 0, 80, 50}, {16, 16});
    for (int y = 0; y < 10; ++y)
        for (int x = 0; x < 10; ++x)
            EXPECT_EQ(canvas.At(x, y), small[static_cast<std::size_t>(y * kWidth + x)]);
}

TEST(SmoothShapes, ARectangleSmallerThanItsCornersIsAnOval) {
    Canvas canvas(kWidth, kHeight);
    OSPort::Current().PaintRoundRect({10, 10, 7, 5}, {40, 40});
    EXPECT_EQ(canvas.At(13, 12), Canvas::kBlack);
    EXPECT_NE(canvas.At(10, 10), Canvas::kBlack);
    EXPECT_EQ(canvas.At(9, 12), Canvas::kWhite);
    EXPECT_EQ(canvas.At(17, 12), Canvas::kWhite);
}

TEST(SmoothShapes, ATransparentRoundRectangleCoversEveryPixelOnce) {
    Canvas canvas(kWidth, kHeight);
    OSPort::Current().SetForeColor(OS::RGBAColor(0, 0, 0, 0.5));
    OSPort::Current().PaintRoundRect({0, 0, 40, 30}, {12, 12});
    std::uint32_t const middle = canvas.At(20, 15);
    EXPECT_NE(middle, Canvas::kBlack);
    EXPECT_NE(middle, Canvas::kWhite);
    for (int x = 7; x < 33; ++x)
        EXPECT_EQ(canvas.At(x, 0), middle) << x;
    for (int y = 7; y < 23; ++y)
        EXPECT_EQ(canvas.At(0, y), middle) << y;
}

} // namespace
