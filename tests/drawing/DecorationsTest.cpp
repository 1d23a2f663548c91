#include "Canvas.h"
#include "desktop/drawing/ThemeColors.h"

namespace {

// The kWindowBackgroundColor of a theme, for one test.
class WithTheme {
public:
    explicit WithTheme(unsigned short level)
        : kept(kWindowBackgroundColor) {
        SetNamedColor("kWindowBackgroundColor", {level, level, level});
    }
    ~WithTheme() { SetNamedColor("kWindowBackgroundColor", kept); }

private:
    RGBColor kept;
};

int Brightness(std::uint32_t pixel) { return static_cast<int>(pixel & 0xFF); }

unsigned short const kLightWindow = 0xE000, kDarkWindow = 0x2000;

} // namespace

TEST(Frame3DRect, ANegativeDepthIsSunkenAndAPositiveOneRaised) {
    for (unsigned short window : {kLightWindow, kDarkWindow}) {
        WithTheme theme(window);
        Canvas canvas(12, 10);
        Rect const r = {1, 1, 9, 11};
        Frame3DRect(&r, -1, 60);
        EXPECT_LT(Brightness(canvas.At(5, 1)), Brightness(canvas.At(5, 8)));
        EXPECT_LT(Brightness(canvas.At(1, 5)), Brightness(canvas.At(10, 5)));
        Frame3DRect(&r, 1, 60);
        EXPECT_GT(Brightness(canvas.At(5, 1)), Brightness(canvas.At(5, 8)));
    }
}

TEST(Frame3DRect, TheDepthIsTheThicknessAndTheInsideStays) {
    Canvas canvas(12, 10);
    Rect const r = {1, 1, 9, 11};
    Frame3DRect(&r, -2, 40);
    EXPECT_EQ(canvas.Count(Canvas::kWhite), 120 - (80 - 24));
    EXPECT_EQ(canvas.At(3, 3), Canvas::kWhite);
    EXPECT_NE(canvas.At(2, 2), Canvas::kWhite);
    canvas.Wipe(Canvas::kWhite);
    Frame3DRect(&r, 0, 40);
    EXPECT_EQ(canvas.Count(Canvas::kWhite), 120);
    Frame3DRect(&r, -32768, 40); // more than there is room for
    EXPECT_EQ(canvas.Count(Canvas::kWhite), 40);
}

TEST(Frame3DRect, StaysInsideARectangleOfAnySize) {
    for (short width = 0; width < 4; ++width)
        for (short height = 0; height < 4; ++height) {
            Canvas canvas(8, 8);
            Rect const r = {2, 2, static_cast<short>(2 + height), static_cast<short>(2 + width)};
            Frame3DRect(&r, -1, 40);
            for (int y = 0; y < 8; ++y)
                for (int x = 0; x < 8; ++x)
                    if (x < 2 || y < 2 || x >= 2 + width || y >= 2 + height) {
                        ASSERT_EQ(canvas.At(x, y), Canvas::kWhite) << width << " x " << height;
                    }
        }
}

TEST(DrawShadowLine, FadesInwardsFromTheEdge) {
    Canvas canvas(20, 20);
    DrawShadowLine({2, 5}, {2, 15});
    for (int v = 2; v < 5; ++v)
        EXPECT_LT(Brightness(canvas.At(8, v)), Brightness(canvas.At(8, v + 1)));
    EXPECT_EQ(canvas.At(8, 1), Canvas::kWhite);
    EXPECT_EQ(canvas.At(8, 6), Canvas::kWhite);
    EXPECT_EQ(canvas.At(4, 2), Canvas::kWhite);
    EXPECT_EQ(canvas.At(15, 2), Canvas::kWhite);
    EXPECT_NE(canvas.At(14, 2), Canvas::kWhite);
}

TEST(DrawShadowLine, IsTheSameUprightAndLying) {
    Canvas lying(20, 20), upright(20, 20);
    DrawingPort::MakeCurrent(&lying.port);
    DrawShadowLine({2, 5}, {2, 15});
    DrawingPort::MakeCurrent(&upright.port);
    DrawShadowLine({15, 2}, {5, 2});
    for (int y = 0; y < 20; ++y)
        for (int x = 0; x < 20; ++x)
            ASSERT_EQ(lying.At(x, y), upright.At(y, x));
}

TEST(DrawShadowLine, OtherLinesHaveNoShadow) {
    Canvas canvas(20, 20);
    DrawShadowLine({2, 5}, {3, 15});
    EXPECT_EQ(canvas.Count(Canvas::kWhite), 400);
}

TEST(FrameTextWell, OutlinesJustInsideTheRectangleWithAShadedTop) {
    Canvas canvas(20, 12);
    FrameTextWell({1, 2, 11, 18});
    EXPECT_EQ(canvas.At(1, 5), Canvas::kWhite);
    EXPECT_LT(Brightness(canvas.At(2, 5)), 255);
    EXPECT_LT(Brightness(canvas.At(8, 1)), Brightness(canvas.At(8, 10)));
    EXPECT_EQ(canvas.At(8, 5), Canvas::kWhite);
    EXPECT_EQ(canvas.At(18, 5), Canvas::kWhite);
    EXPECT_LT(Brightness(canvas.At(17, 10)), 255);
}

TEST(FrameTextWell, TheOutlineShowsOnDarkPaperToo) {
    WithTheme theme(kDarkWindow);
    Canvas canvas(20, 12);
    canvas.Wipe(0xFF202020u);
    FrameTextWell({1, 2, 11, 18});
    EXPECT_GT(Brightness(canvas.At(8, 10)), 0x20 + 40);
    EXPECT_GT(Brightness(canvas.At(8, 1)), 0x20 + 40);
}

TEST(FrameTextWell, TheOutlineIsAsThickOnEverySideAtEveryScale) {
    for (double scale : {1.0, 1.25, 1.5, 1.75, 2.0, 3.0})
        for (short shift = 0; shift < 4; ++shift) {
            Canvas canvas(30, 30, scale);
            FrameTextWell({static_cast<short>(4 + shift), static_cast<short>(5 + shift),
                           static_cast<short>(21 + shift), static_cast<short>(22 + shift)});
            int const middle = DeviceScale(scale).Edge(13 + shift);
            int left = 0, right = 0, bottom = 0;
            for (int i = 0; i < DeviceScale(scale).Edge(30); ++i) {
                bool const isOutlined = Brightness(canvas.At(i, middle)) < 200;
                left += isOutlined && i < middle;
                right += isOutlined && i > middle;
                bottom += Brightness(canvas.At(middle, i)) < 200 && i > middle;
            }
            EXPECT_EQ(left, right) << scale << ' ' << shift;
            EXPECT_EQ(left, bottom) << scale << ' ' << shift;
            EXPECT_GT(left, 0) << scale << ' ' << shift;
        }
}

TEST(FrameTextWell, SmallRectanglesAreHarmless) {
    for (short side = -1; side < 3; ++side) {
        Canvas canvas(6, 6);
        FrameTextWell({1, 1, static_cast<short>(1 + side), static_cast<short>(1 + side)});
        EXPECT_EQ(canvas.Count(Canvas::kWhite), 36 - (side > 0 ? side * side : 0));
    }
}
