#include "Canvas.h"
#include "host/OSPath.h"

namespace {

struct Scroll {
    double factor;
    int dh, dv;
};

// What the surface holds after the scroll when every pixel is copied from an untouched original.
std::vector<std::uint32_t> Expected(Canvas const &canvas, std::vector<std::uint32_t> const &before,
                                    OSRgn const &area, int dh, int dv) {
    std::vector<std::uint32_t> after = before;
    int const width = canvas.surface.Width();
    int const dx = canvas.scale.Edge(dh), dy = canvas.scale.Edge(dv);
    auto inArea = [&](int x, int y) {
        return area.Contains(
            {static_cast<short>(canvas.scale.ToLogical(y)), static_cast<short>(canvas.scale.ToLogical(x))});
    };
    for (int y = 0; y < canvas.surface.Height(); ++y)
        for (int x = 0; x < width; ++x)
            if (inArea(x, y) && inArea(x - dx, y - dy))
                after[static_cast<std::size_t>(y * width + x)] =
                    before[static_cast<std::size_t>((y - dy) * width + x - dx)];
    return after;
}

void ScrollBy(Rect const &r, int dh, int dv) {
    OSPort::Current().ScrollRect(OS::RectBase<OS::RectTag>(r), {double(dh), double(dv)});
}

} // namespace

class ScrollRectTest : public testing::TestWithParam<Scroll> {};

TEST_P(ScrollRectTest, MovesPixelsAndDamagesWhatWasUncovered) {
    Scroll const scroll = GetParam();
    Canvas canvas(48, 40, scroll.factor);
    canvas.FillWithPattern();
    std::vector<std::uint32_t> const before = canvas.Pixels();
    Rect const r = {4, 6, 36, 40};
    ScrollBy(r, scroll.dh, scroll.dv);
    EXPECT_EQ(canvas.Pixels(), Expected(canvas, before, OSRgn(r), scroll.dh, scroll.dv));

    OSRgn uncovered(r), moved(r);
    Region::Translate(moved, scroll.dh, scroll.dv);
    Region::Subtract(uncovered, moved);
    EXPECT_TRUE(Region::Equal(canvas.port.GetDamage(), uncovered));
}

TEST_P(ScrollRectTest, MovesPixelsThroughAClipWithHoles) {
    Scroll const scroll = GetParam();
    Canvas canvas(48, 40, scroll.factor);
    canvas.FillWithPattern();
    std::vector<std::uint32_t> const before = canvas.Pixels();
    OSRgn clip = RegionOf({{0, 0, 40, 12}, {0, 20, 40, 48}, {10, 0, 16, 48}, {30, 5, 40, 33}});
    Region::Subtract(clip, RegionOf({{22, 24, 28, 40}}));
    canvas.port.SetClip(clip);
    Rect const r = {2, 2, 38, 46};
    ScrollBy(r, scroll.dh, scroll.dv);
    OSRgn area(clip);
    Region::IntersectRect(area, r);
    EXPECT_EQ(canvas.Pixels(), Expected(canvas, before, area, scroll.dh, scroll.dv));

    OSRgn reached(area), uncovered(area);
    Region::Translate(reached, scroll.dh, scroll.dv);
    Region::Intersect(reached, area);
    Region::Subtract(uncovered, reached);
    EXPECT_TRUE(Region::Equal(canvas.port.GetDamage(), uncovered));
}

INSTANTIATE_TEST_SUITE_P(Everywhere, ScrollRectTest,
                         testing::Values(Scroll{1, 5, 0}, Scroll{1, -5, 0}, Scroll{1, 0, 5}, Scroll{1, 0, -5},
                                         Scroll{1, 1, 1}, Scroll{1, -3, 7}, Scroll{1, 3, -7},
                                         Scroll{1, 100, 0}, Scroll{1, 10, 0}, Scroll{1, -10, 0},
                                         Scroll{1, 10, 3}, Scroll{1.5, 4, 0}, Scroll{1.5, -4, 2},
                                         Scroll{1.5, 0, -6}, Scroll{1.25, 0, 4}, Scroll{1.25, -8, 0},
                                         Scroll{2, 3, 0}, Scroll{2, -1, 1}, Scroll{2, 0, -9},
                                         Scroll{2, 0, 9}));

TEST(ScrollRect, DamagesAllWhereTheMoveWouldNotLandOnPixels) {
    Canvas canvas(20, 20, 1.5);
    canvas.FillWithPattern();
    std::vector<std::uint32_t> const before = canvas.Pixels();
    ScrollBy({2, 2, 10, 10}, 0, 3);
    EXPECT_EQ(canvas.Pixels(), before);
    EXPECT_TRUE(Region::Equal(canvas.port.GetDamage(), OSRgn(Rect{2, 2, 10, 10})));
}

TEST(ScrollRect, PendingDamageInsideMovesAlongAndElsewhereStays) {
    Canvas canvas(20, 20);
    canvas.port.Damage({5, 5, 7, 7});
    canvas.port.Damage({0, 15, 2, 20});
    ScrollBy({0, 0, 20, 15}, 0, 4);
    EXPECT_TRUE(
        Region::Equal(canvas.port.GetDamage(), RegionOf({{9, 5, 11, 7}, {0, 15, 2, 20}, {0, 0, 4, 15}})));
}

TEST(ScrollRect, DamageThatMovesOutIsForgotten) {
    Canvas canvas(20, 20);
    canvas.port.Damage({17, 0, 20, 20});
    ScrollBy({0, 0, 20, 20}, 0, 3);
    EXPECT_TRUE(Region::Equal(canvas.port.GetDamage(), RegionOf({{0, 0, 3, 20}})));
}

TEST(ScrollRect, WorksInLocalCoordinates) {
    Canvas canvas(10, 10);
    canvas.FillWithPattern();
    std::uint32_t const pixel = canvas.At(5, 5);
    canvas.port.SetOrigin(5, 5);
    ScrollBy({0, 0, 4, 4}, 2, 2);
    EXPECT_EQ(canvas.At(7, 7), pixel);
    EXPECT_EQ(Region::Bounds(canvas.port.GetDamage()), (Rect{5, 5, 9, 9}));
}

TEST(ScrollRect, NoDistanceDoesNothing) {
    Canvas canvas(10, 10);
    ScrollBy({0, 0, 10, 10}, 0, 0);
    EXPECT_TRUE(Region::IsEmpty(canvas.port.GetDamage()));
    EXPECT_TRUE(canvas.port.TakeTouched().empty());
}

TEST(ScrollRect, MovedPixelsCountAsTouched) {
    Canvas canvas(300, 300, 2);
    ScrollBy({100, 100, 200, 200}, 0, 10);
    std::vector<DeviceRect> const touched = canvas.port.TakeTouched();
    ASSERT_EQ(touched.size(), 1u);
    EXPECT_TRUE(touched[0].Contains({200, 220, 400, 400}));
}

TEST(ScrollRect, AScrolledPictureIsTheSameAsADrawnOne) {
    for (double factor : {1.0, 1.5, 2.0}) {
        auto draw = [](int offset) {
            for (int i = 0; i < 40; ++i) {
                short const v = static_cast<short>(i * 5 - offset);
                Rect const r = {v, static_cast<short>(i % 7), static_cast<short>(v + 3),
                                static_cast<short>(30 + i % 4)};
                VelaDrawing::FrameRect(&r);
            }
        };
        Canvas scrolled(40, 60, factor);
        draw(10);
        ScrollBy({0, 0, 60, 40}, 0, -14);
        OSRgn const damage = scrolled.port.TakeDamage();
        scrolled.port.SetClip(damage);
        scrolled.port.LayGround({1, 1, 1, 1});
        draw(24);
        scrolled.port.FinishGround();
        Canvas drawn(40, 60, factor);
        draw(24);
        EXPECT_EQ(scrolled.Pixels(), drawn.Pixels()) << factor;
    }
}

TEST(ScrollRect, APathInTheClipMakesItDamageAll) {
    Canvas canvas(10, 10);
    OSPath path;
    path.CreateSubpath(0, 0);
    path.AddLine(10, 0);
    path.AddLine(0, 10);
    OSPort::Current().NarrowClipPath(path);
    ScrollBy({0, 0, 10, 10}, 1, 0);
    EXPECT_EQ(Region::Area(canvas.port.GetDamage()), 100);
}
TEST(ScrollRectMove, IsTakenInPlaceOfItsPixels) {
    Canvas canvas(100, 100);
    canvas.port.TakeTouched();
    ScrollBy({10, 10, 90, 90}, 0, -20);
    std::optional<PixelMove> const move = canvas.port.TakeMove();
    ASSERT_TRUE(move);
    EXPECT_EQ(move->dx, 0);
    EXPECT_EQ(move->dy, -20);
    EXPECT_EQ(move->to.top, 10);
    EXPECT_EQ(move->to.bottom, 70);
    EXPECT_EQ(move->From().top, 30);
    EXPECT_EQ(move->From().bottom, 90);
    EXPECT_TRUE(canvas.port.TakeTouched().empty());
    EXPECT_FALSE(canvas.port.TakeMove());
}

TEST(ScrollRectMove, ThatNobodyTakesIsTouched) {
    Canvas canvas(100, 100);
    canvas.port.TakeTouched();
    ScrollBy({10, 10, 90, 90}, 0, -20);
    std::vector<DeviceRect> const touched = canvas.port.TakeTouched();
    ASSERT_EQ(touched.size(), 1u);
    EXPECT_EQ(touched[0].top, 10);
    EXPECT_EQ(touched[0].bottom, 70);
    EXPECT_FALSE(canvas.port.TakeMove());
}

TEST(ScrollRectMove, OfWhatWasDrawnOnSinceIsTouched) {
    Canvas canvas(100, 100);
    canvas.port.TakeTouched();
    Rect const drawn = {40, 40, 50, 50};
    VelaDrawing::PaintRect(&drawn);
    ScrollBy({10, 10, 90, 90}, 0, -20);
    EXPECT_FALSE(canvas.port.TakeMove());
    EXPECT_FALSE(canvas.port.TakeTouched().empty());
}

TEST(ScrollRectMove, ASecondOneIsTouched) {
    Canvas canvas(100, 100);
    canvas.port.TakeTouched();
    ScrollBy({10, 10, 90, 90}, 0, -20);
    ScrollBy({10, 10, 90, 90}, 0, -5);
    std::optional<PixelMove> const move = canvas.port.TakeMove();
    ASSERT_TRUE(move);
    EXPECT_EQ(move->dy, -20);
    std::vector<DeviceRect> const touched = canvas.port.TakeTouched();
    ASSERT_EQ(touched.size(), 1u);
    EXPECT_EQ(touched[0].bottom, 85);
}
