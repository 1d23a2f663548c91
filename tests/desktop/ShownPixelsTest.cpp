#include "desktop/windows/ShownPixels.h"
#include "desktop/drawing/Surface.h"
#include <algorithm>
#include <gtest/gtest.h>

namespace {

// Neither side is a whole number of tiles.
int const kWidth = 200, kHeight = 70;

class ShownPixelsTest : public testing::Test {
protected:
    ShownPixelsTest()
        : surface(kWidth, kHeight)
        , memory(kWidth * kHeight, 0)
        , shown(memory.data(), kWidth, kHeight) {}

    std::vector<DeviceRect> Take(DeviceRect const &area) {
        std::vector<DeviceRect> changed;
        shown.Take(surface, area, changed);
        return changed;
    }
    std::vector<DeviceRect> TakeAll() { return Take({0, 0, kWidth, kHeight}); }
    bool IsTaken() const { return std::equal(memory.begin(), memory.end(), surface.Pixels()); }
    void Paint(DeviceRect const &r, std::uint32_t color) {
        for (int y = r.top; y < r.bottom; ++y)
            std::fill(surface.Row(y) + r.left, surface.Row(y) + r.right, color);
    }

    Surface surface;
    std::vector<std::uint32_t> memory;
    ShownPixels shown;
};

bool operator==(DeviceRect const &a, DeviceRect const &b) {
    return a.left == b.left && a.top == b.top && a.right == b.right && a.bottom == b.bottom;
}

void ExpectOnly(std::vector<DeviceRect> const &rects, DeviceRect const &wanted) {
    ASSERT_EQ(rects.size(), 1u);
    EXPECT_TRUE(rects.front() == wanted) << rects.front().left << ' ' << rects.front().top << ' '
                                         << rects.front().right << ' ' << rects.front().bottom;
}

TEST_F(ShownPixelsTest, AtFirstEverythingIsShownAsOneRectangle) {
    ExpectOnly(TakeAll(), {0, 0, kWidth, kHeight});
    EXPECT_TRUE(IsTaken());
}

TEST_F(ShownPixelsTest, AtFirstEverythingIsShownAlsoWhereTheMemoryHasItAlready) {
    memory.assign(surface.Pixels(), surface.Row(kHeight));
    ExpectOnly(TakeAll(), {0, 0, kWidth, kHeight});
}

TEST_F(ShownPixelsTest, WhatIsTheSameIsNotShownAgain) {
    TakeAll();
    EXPECT_TRUE(TakeAll().empty());
}

TEST_F(ShownPixelsTest, APixelIsShownWithTheRowOfItsTile) {
    TakeAll();
    Paint({70, 20, 71, 21}, 0xFFFF0000u);
    ExpectOnly(TakeAll(), {64, 20, 128, 21});
    EXPECT_TRUE(IsTaken());
}

TEST_F(ShownPixelsTest, NothingOutsideTheAreaIsTakenOrShown) {
    TakeAll();
    Paint({0, 0, kWidth, kHeight}, 0xFFFF0000u);
    ExpectOnly(Take({10, 5, 150, 40}), {10, 5, 150, 40});
    EXPECT_EQ(memory[0], 0xFF000000u);
    EXPECT_EQ(memory[5 * kWidth + 9], 0xFF000000u);
    EXPECT_EQ(memory[5 * kWidth + 10], 0xFFFF0000u);
    EXPECT_EQ(memory[39 * kWidth + 149], 0xFFFF0000u);
    EXPECT_EQ(memory[40 * kWidth + 149], 0xFF000000u);
    TakeAll();
    EXPECT_TRUE(IsTaken());
}

TEST_F(ShownPixelsTest, ChangesNearEachOtherInAColumnAreShownAtOnce) {
    TakeAll();
    Paint({5, 3, 6, 4}, 0xFFFF0000u);
    Paint({9, 30, 10, 31}, 0xFFFF0000u);
    ExpectOnly(TakeAll(), {0, 3, 64, 31});
}

TEST_F(ShownPixelsTest, ChangesFarFromEachOtherAreShownByThemselves) {
    TakeAll();
    Paint({5, 3, 6, 4}, 0xFFFF0000u);
    Paint({9, 65, 10, 66}, 0xFFFF0000u);
    Paint({199, 30, 200, 31}, 0xFFFF0000u);
    std::vector<DeviceRect> const changed = TakeAll();
    ASSERT_EQ(changed.size(), 3u);
    EXPECT_TRUE(changed[0] == (DeviceRect{0, 3, 64, 4}));
    EXPECT_TRUE(changed[1] == (DeviceRect{0, 65, 64, 66}));
    EXPECT_TRUE(changed[2] == (DeviceRect{192, 30, 200, 31}));
    EXPECT_TRUE(IsTaken());
}

TEST_F(ShownPixelsTest, ChangesOverSeveralTilesAreShownAsOneRectangle) {
    TakeAll();
    Paint({60, 10, 140, 50}, 0xFFFF0000u);
    ExpectOnly(TakeAll(), {0, 10, 192, 50});
    EXPECT_TRUE(IsTaken());
}

TEST_F(ShownPixelsTest, WhatWasForgottenIsShownAgain) {
    TakeAll();
    shown.ForgetAll();
    ExpectOnly(TakeAll(), {0, 0, kWidth, kHeight});
}

TEST_F(ShownPixelsTest, WhatIsKnownOfATileStaysSoBesideWhatWasForgotten) {
    TakeAll();
    shown.Forget({0, 0, 44, kHeight}); // a view that has scrolled; the bar beside it begins in the same tile
    EXPECT_TRUE(Take({44, 0, 60, kHeight}).empty());
    Paint({50, 20, 51, 21}, 0xFFFF0000u);
    ExpectOnly(Take({44, 0, 60, kHeight}), {44, 20, 60, 21});
    ExpectOnly(Take({0, 40, 44, 50}), {0, 40, 44, 50});
}

TEST_F(ShownPixelsTest, APartOfATileThatIsNotKnownIsShownEachTime) {
    ExpectOnly(Take({10, 5, 20, 9}), {10, 5, 20, 9});
    ExpectOnly(Take({10, 5, 20, 9}), {10, 5, 20, 9});
    TakeAll();
    EXPECT_TRUE(Take({10, 5, 20, 9}).empty());
    shown.Forget({12, 6, 13, 7});
    ExpectOnly(Take({10, 5, 20, 9}), {10, 5, 20, 9});
    EXPECT_TRUE(Take({64, 0, kWidth, kHeight}).empty());
}

TEST_F(ShownPixelsTest, AnEmptyAreaIsNothing) { EXPECT_TRUE(Take({10, 10, 10, 20}).empty()); }

TEST_F(ShownPixelsTest, WhatLiesBeyondThePictureIsForgottenWithoutHarm) {
    TakeAll();
    shown.Forget({-50, -50, -1, -1});
    shown.Forget({kWidth, 0, kWidth + 10, 10});
    EXPECT_TRUE(TakeAll().empty());
    shown.Forget({-50, -50, 1000, 1000});
    ExpectOnly(TakeAll(), {0, 0, kWidth, kHeight});
}

} // namespace
