#include "desktop/drawing/RowRing.h"
#include "desktop/drawing/PixelMove.h"
#include "host/TextLayout.h"
#include "host/UString.h"
#include "host/VelaDrawing.h"
#include "tests/drawing/Canvas.h"
#include <gtest/gtest.h>
#include <pixman.h>
#include <random>

namespace {

int const kWidth = 12, kHeight = 20;

// What moving the pixels at once gives.
void MoveAtOnce(Surface &surface, DeviceRect const &box, int distance) {
    pixman_region32_t to;
    int const top = distance > 0 ? box.top + distance : box.top;
    int const bottom = distance > 0 ? box.bottom : box.bottom + distance;
    pixman_region32_init_rect(&to, box.left, top, static_cast<unsigned>(box.Width()),
                              static_cast<unsigned>(bottom - top));
    MovePixels(surface, to, 0, distance);
    pixman_region32_fini(&to);
}

class ScrolledSurface : public testing::Test {
protected:
    ScrolledSurface()
        : ring(kWidth, kHeight)
        , plain(kWidth, kHeight) {
        for (int y = 0; y < kHeight; ++y)
            for (int x = 0; x < kWidth; ++x)
                ring.Row(y)[x] = plain.Row(y)[x] = static_cast<std::uint32_t>(y * 100 + x);
    }
    void Scroll(DeviceRect const &box, int distance) {
        ring.Scroll(box, distance);
        MoveAtOnce(plain, box, distance);
    }
    static std::vector<std::uint32_t> PixelsOf(Surface const &surface) {
        return {surface.Pixels(), surface.Pixels() + kWidth * kHeight};
    }

    Surface ring, plain;
    DeviceRect const box{2, 3, 9, 17};
};

TEST_F(ScrolledSurface, HasThePixelsOfOneWhosePixelsWereMoved) {
    for (int distance : {-1, -3, 6, 2, -6, -6, -6, 5})
        Scroll(box, distance);
    EXPECT_EQ(PixelsOf(ring), PixelsOf(plain));
}

TEST_F(ScrolledSurface, CanBeLookedAtInPartsBeforeItIsPutInOrder) {
    Scroll(box, -5);
    Scroll(box, -4);
    DeviceRect const inside = {3, 4, 8, 16}, beside = {9, 0, kWidth, kHeight};
    for (DeviceRect const &part : {inside, beside}) {
        Surface::Rows const rows = ring.RowsOf(part);
        for (int y = part.top; y < part.bottom; ++y)
            for (int x = part.left; x < part.right; ++x)
                ASSERT_EQ(rows[y][x], plain.Row(y)[x]) << x << ' ' << y;
    }
}

TEST_F(ScrolledSurface, IsPutInOrderForAPartThatLiesHalfInWhatScrolled) {
    Scroll(box, -5);
    DeviceRect const part = {0, 0, 5, kHeight};
    Surface::Rows const rows = ring.RowsOf(part);
    for (int y = 0; y < kHeight; ++y)
        for (int x = 0; x < 5; ++x)
            ASSERT_EQ(rows[y][x], plain.Row(y)[x]) << x << ' ' << y;
}

TEST_F(ScrolledSurface, NeedsNoPartToDrawOnWhileNothingHasScrolled) { EXPECT_EQ(ring.PartOf(box), nullptr); }

TEST_F(ScrolledSurface, IsDrawnOnByAPartOfIt) {
    Scroll(box, -5);
    DeviceRect const strip = {2, 12, 9, 17}, bar = {9, 0, kWidth, kHeight};
    for (DeviceRect const &part : {strip, bar}) {
        std::unique_ptr<Surface> const on = ring.PartOf(part);
        ASSERT_TRUE(on);
        on->Fill(part, 77);
        plain.Fill(part, 77);
    }
    Scroll(box, -5);
    EXPECT_EQ(PixelsOf(ring), PixelsOf(plain));
}

TEST_F(ScrolledSurface, IsPutInOrderForAPartInTwoPieces) {
    Scroll(box, -5);
    EXPECT_EQ(ring.PartOf({2, 3, 9, 17}), nullptr);
    ring.Fill({2, 3, 9, 17}, 77);
    plain.Fill({2, 3, 9, 17}, 77);
    EXPECT_EQ(PixelsOf(ring), PixelsOf(plain));
}

TEST_F(ScrolledSurface, MayScrollInAnotherBoxNext) {
    Scroll(box, -5);
    Scroll({0, 0, kWidth, 10}, 3);
    Scroll({5, 5, 6, 20}, -3);
    EXPECT_EQ(PixelsOf(ring), PixelsOf(plain));
}

TEST_F(ScrolledSurface, IsTheSameWhateverIsDoneWithIt) {
    std::mt19937 random(1);
    auto const below = [&](int end) { return static_cast<int>(random() % static_cast<unsigned>(end)); };
    DeviceRect const boxes[] = {box, {0, 0, kWidth, kHeight}, {2, 3, 9, 16}};
    for (int i = 0; i < 5000; ++i) {
        DeviceRect const &view = boxes[below(10) == 0 ? below(3) : 0];
        if (below(2) == 0) {
            int const distance = 1 + below(view.Height() / 2 - 1);
            Scroll(view, below(2) == 0 ? distance : -distance);
            continue;
        }
        int const left = below(kWidth), top = below(kHeight);
        DeviceRect part = {left, top, left + 1 + below(kWidth - left), top + 1 + below(kHeight - top)};
        if (below(4) != 0)
            part = part.Intersected(view);
        if (part.Empty())
            continue;
        std::uint32_t const pixel = 0xFF000000u + static_cast<std::uint32_t>(i);
        if (std::unique_ptr<Surface> const on = ring.PartOf(part))
            on->Fill(part, pixel);
        else
            ring.Fill(part, pixel);
        plain.Fill(part, pixel);
        ASSERT_EQ(ring.RowsOf(part)[part.top][part.left], pixel);
        if (below(50) == 0) {
            ASSERT_EQ(PixelsOf(ring), PixelsOf(plain)) << i;
        }
    }
    EXPECT_EQ(PixelsOf(ring), PixelsOf(plain));
}

// A view large enough to be scrolled as a ring, and the same without.
TEST(ScrollRect, OfAViewThatScrollsInPlaceGivesTheSamePixels) {
    auto const draw = [](bool inPlace) {
        Canvas canvas(260, 240);
        canvas.FillWithPattern();
        canvas.surface.AllowScrolling(inPlace);
        for (short dv : {-10, -10, -7, 30, 30, 30, -100, -13}) {
            OSPort::Current().ScrollRect(Rect{5, 5, 235, 205}, OS::Size(0, dv));
            OSRgn const damage = canvas.port.TakeDamage();
            Rect const r = Region::Bounds(damage);
            canvas.port.SetClip(damage);
            VelaDrawing::FrameRect(&r);
            DrawStringAtPoint(UString("Row", UString::kByteEncoding1), {r.bottom, 20}, -1,
                              TextSettings::kTruncateNone);
            canvas.port.SetClip(OSRgn(canvas.port.Extent()));
        }
        return canvas.Pixels();
    };
    EXPECT_EQ(draw(true), draw(false));
}

} // namespace
