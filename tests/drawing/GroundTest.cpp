#include "desktop/drawing/Ground.h"
#include "desktop/drawing/PixelScope.h"
#include "host/OSPath.h"
#include "host/VelaDrawing.h"
#include "tests/drawing/Canvas.h"
#include <gtest/gtest.h>
#include <random>

namespace {

std::uint32_t const kOld = 0xFF123456u, kGround = 0xFFEEEEEEu;

class GroundTest : public testing::Test {
protected:
    GroundTest()
        : surface(8, 4) {
        surface.Fill({0, 0, 8, 4}, kOld);
        pixman_region32_init_rect(&all, 0, 0, 8, 4);
        ground.Begin(surface, all, kGround);
    }
    ~GroundTest() override { pixman_region32_fini(&all); }

    std::vector<std::string> Picture() const {
        std::vector<std::string> rows;
        for (int y = 0; y < surface.Height(); ++y) {
            rows.emplace_back();
            for (int x = 0; x < surface.Width(); ++x)
                rows.back() += surface.Row(y)[x] == kGround ? '#' : '.';
        }
        return rows;
    }

    Surface surface;
    pixman_region32_t all;
    Ground ground;
};

TEST_F(GroundTest, IsNotLaidBeforeAnythingIsDrawn) {
    EXPECT_TRUE(ground.Waits());
    EXPECT_EQ(Picture(), Rows(4, "........"));
}

TEST_F(GroundTest, IsLaidEverywhereInTheEnd) {
    ground.Finish();
    EXPECT_FALSE(ground.Waits());
    EXPECT_EQ(Picture(), Rows(4, "########"));
}

TEST_F(GroundTest, IsNeverLaidWhereSomethingCoversItFirst) {
    ground.Cover({2, 1, 6, 3}, all);
    ground.Finish();
    EXPECT_EQ(Picture(), (Rows{"########", "##....##", "##....##", "########"}));
}

TEST_F(GroundTest, OfWhatCoversItOnlyThePartInTheClipCounts) {
    pixman_region32_t clip;
    pixman_region32_init_rect(&clip, 4, 0, 4, 2);
    ground.Cover({2, 1, 6, 3}, clip);
    pixman_region32_fini(&clip);
    ground.Finish();
    EXPECT_EQ(Picture(), (Rows{"########", "####..##", "########", "########"}));
}

TEST_F(GroundTest, IsLaidInTheWholeClipBeforeSomethingIsDrawnOnIt) {
    pixman_region32_t clip;
    pixman_region32_init_rect(&clip, 4, 0, 4, 2);
    ground.Prepare({5, 1, 6, 2}, clip);
    pixman_region32_fini(&clip);
    EXPECT_EQ(Picture(), (Rows{"....####", "....####", "........", "........"}));
    EXPECT_TRUE(ground.Waits());
}

TEST_F(GroundTest, IsNotLaidForWhatIsDrawnWhereItDoesNotWait) {
    ground.Cover({0, 0, 4, 4}, all);
    ground.Prepare({1, 1, 3, 3}, all);
    EXPECT_EQ(Picture(), Rows(4, "........"));
}

TEST_F(GroundTest, IsLaidOnce) {
    ground.Prepare({1, 1, 2, 2}, all);
    surface.Fill({0, 0, 8, 4}, kOld);
    ground.Finish();
    EXPECT_EQ(Picture(), Rows(4, "........"));
}

TEST_F(GroundTest, ThatIsForgottenIsNotLaid) {
    ground.Forget();
    ground.Finish();
    EXPECT_EQ(Picture(), Rows(4, "........"));
}

TEST(PortGround, InManyPiecesIsTheSameAsOneLaidAtOnce) {
    Canvas canvas(60, 60);
    canvas.FillWithPattern();
    canvas.port.LayGround({1, 1, 1, 1});
    for (short v = 0; v < 60; v = static_cast<short>(v + 4))
        for (short h = 0; h < 60; h = static_cast<short>(h + 4)) {
            Rect const r = {v, h, static_cast<short>(v + 2), static_cast<short>(h + 2)};
            VelaDrawing::PaintRect(&r);
        }
    canvas.port.FinishGround();
    EXPECT_EQ(canvas.Count(Canvas::kBlack), 15 * 15 * 4);
    EXPECT_EQ(canvas.Count(Canvas::kWhite), 60 * 60 - 15 * 15 * 4);
}

TEST(PortGround, IsThereBeforePixelsMove) {
    Canvas canvas(10, 10);
    canvas.Wipe(Canvas::kRed);
    canvas.port.LayGround({1, 1, 1, 1});
    OSPort::Current().ScrollRect(Rect{0, 0, 10, 10}, OS::Size(0, 3));
    EXPECT_EQ(canvas.Count(Canvas::kWhite), 100);
}

TEST(PortGround, GoesWithItsSurface) {
    Surface other(10, 10);
    Canvas canvas(10, 10);
    canvas.port.LayGround({1, 1, 1, 1});
    canvas.port.SetSurface(&other, canvas.scale);
    canvas.port.FinishGround();
    EXPECT_EQ(other.Row(0)[0], 0xFF000000u);
    EXPECT_EQ(canvas.Count(Canvas::kWhite), 100);
}

// Draws a random thing, in a random clip.
void DrawSomething(std::mt19937 &random, DrawingPort &port) {
    auto const below = [&](int end) { return static_cast<short>(random() % static_cast<unsigned>(end)); };
    OSRgn clip(
        Rect{below(20), below(20), static_cast<short>(20 + below(40)), static_cast<short>(20 + below(40))});
    if (below(2) == 0)
        Region::UniteRect(clip, Rect{below(60), below(60), 60, 60});
    port.SetClip(clip);
    Rect const r = {below(40), below(40), static_cast<short>(10 + below(60)),
                    static_cast<short>(10 + below(60))};
    port.State().fore = {below(2) * 1.0, below(2) * 1.0, 0.5, below(3) == 0 ? 0.5 : 1.0};
    switch (below(6)) {
    case 0:
        VelaDrawing::PaintRect(&r);
        break;
    case 1:
        VelaDrawing::FrameRect(&r);
        break;
    case 2:
        port.PaintRoundRect(r, OS::Size(9, 9));
        break;
    case 3:
        port.PaintOval(r);
        break;
    case 4:
        VelaDrawing::EraseRect(&r);
        break;
    default:
        VelaDrawing::MoveTo(r.left, r.top);
        VelaDrawing::LineTo(r.right, r.top);
    }
}

TEST(PortGround, WhateverIsDrawnOnItLooksAsOnOneThatWasLaidBefore) {
    for (unsigned seed = 0; seed < 200; ++seed) {
        double const factor = seed % 2 == 0 ? 1.0 : 1.5;
        auto const draw = [&](bool waits) {
            Canvas canvas(60, 60, factor);
            canvas.FillWithPattern();
            if (waits)
                canvas.port.LayGround({1, 1, 1, 1});
            else
                canvas.Wipe(Canvas::kWhite);
            std::mt19937 random(seed);
            for (int i = 0; i < 12; ++i)
                DrawSomething(random, canvas.port);
            canvas.port.FinishGround();
            return canvas.Pixels();
        };
        ASSERT_EQ(draw(true), draw(false)) << "seed " << seed;
    }
}

} // namespace
